"""Cities and countries: where they are, which clock they keep, what they are called in English."""

import json
import os
import xml.etree.ElementTree as xml
from dataclasses import dataclass, field, replace

from . import ids
from .rows import usable

PLACES = "libgweather-4/Locations.xml"
COUNTRIES = "iso-codes/json/iso_3166-1.json"
WITHDRAWN = "iso-codes/json/iso_3166-3.json"
ZONES = "zoneinfo/zone.tab"
ZONE_RULES = "zoneinfo/tzdata.zi"


@dataclass(frozen=True)
class Name:
    """An English name, and what tells it from the same words elsewhere in the catalogues."""

    text: str
    context: str = ""


@dataclass(frozen=True)
class Country:
    identifier: str
    code: str
    name: Name
    # In order of preference; what the catalogues know the country by.
    standard_names: tuple = ()
    place_name: Name = None


@dataclass(frozen=True)
class City:
    country: Country
    state: Name
    name: Name
    zone: str
    # Known by its time zone alone.
    from_zone: bool = False
    # Shown behind the name, because the country has another city of that name.
    show_state: bool = False
    identifier: str = ""


@dataclass
class Notes:
    """What was left out, and why."""

    lines: list = field(default_factory=list)

    def add(self, text):
        self.lines.append(text)


class TimeZones:
    """The time zones of the system."""

    def __init__(self, packages):
        self._folder = os.path.join(packages, "zoneinfo")
        self._newer = {}
        try:
            with open(os.path.join(packages, ZONE_RULES), encoding="utf-8") as rules:
                for line in rules:
                    if line.startswith("L "):
                        _, zone, old = line.split()[:3]
                        self._newer[old] = zone
        except FileNotFoundError:
            pass

    def _exists(self, zone):
        try:
            with open(os.path.join(self._folder, zone), "rb") as file:
                return file.read(4) == b"TZif"
        except OSError:
            return False

    def find(self, zone):
        """The zone itself, its new name when it was renamed and the old name is gone, or None."""
        for candidate in (zone, self._newer.get(zone)):
            if candidate and self._exists(candidate):
                return candidate
        return None


def name_of(element):
    child = element.find("_name")
    if child is None:
        child = element.find("name")
    if child is None or not usable(child.text):
        return Name("")
    return Name(child.text, child.get("msgctxt") or "")


def read_countries(packages, root):
    """Every country by its code; a code that has been withdrawn is no country any more."""

    def entries(path, key):
        with open(os.path.join(packages, path), encoding="utf-8") as file:
            return json.load(file)[key]

    place_names = {c.findtext("iso-code"): name_of(c) for c in root.iter("country")}
    withdrawn = {e["alpha_2"] for e in entries(WITHDRAWN, "3166-3") if "alpha_2" in e}
    countries = {}
    for entry in entries(COUNTRIES, "3166-1"):
        code = entry["alpha_2"]
        names = tuple(entry[key] for key in ("common_name", "name") if key in entry)
        countries[code] = Country(ids.country_id(code), code, Name(names[0]), names, place_names.get(code))
    for code, name in place_names.items():
        if code and name.text and code not in countries and code not in withdrawn:
            countries[code] = Country(ids.country_id(code), code, name, (), name)
    return countries


def _cities_below(node, state, hint):
    for city in node.findall("city"):
        yield state, name_of(city), city.findtext("tz-hint") or hint
    for child in node.findall("state"):
        yield from _cities_below(child, name_of(child), child.findtext("tz-hint") or hint)


def _usual_zone(country):
    zones = [zone.get("id") for zone in country.findall("timezones/timezone")]
    return country.findtext("tz-hint") or (zones[0] if len(zones) == 1 else None)


def read_place_cities(root, countries, zones, notes):
    """The cities of the places package, with the zone of the city, its state or its country."""
    for element in root.iter("country"):
        country = countries.get(element.findtext("iso-code"))
        if not country:
            notes.add(f"country {element.findtext('iso-code')}: withdrawn")
            continue
        for state, name, hint in _cities_below(element, Name(""), _usual_zone(element)):
            zone = zones.find(hint) if hint else None
            if name.text and zone:
                yield City(country, state, name, zone)
            else:
                notes.add(f"{country.code} {name.text!r}: no time zone or no name")


def read_zone_cities(packages, countries, known, zones):
    """A city for each zone of the countries in which the places package knows none."""
    with open(os.path.join(packages, ZONES), encoding="utf-8") as table:
        rows = [line.split("\t") for line in table if not line.startswith("#")]
    for row in rows:
        code, zone = row[0], zones.find(row[2].strip())
        if code in countries and code not in known and zone:
            name = zone.rsplit("/", 1)[-1].replace("_", " ")
            yield City(countries[code], Name(""), Name(name), zone, from_zone=True)


def tell_apart(cities, notes):
    """Drops a city that is listed twice, and shows the state of cities with one name."""
    seen, same_name = {}, {}
    for city in cities:
        identifier = ids.city_id(city.country.code, city.state.text, city.name.text)
        if identifier in seen:
            notes.add(f"{city.country.code} {city.name.text!r}: listed twice")
            continue
        seen[identifier] = replace(city, identifier=identifier)
        without_state = ids.city_id(city.country.code, "", city.name.text)
        same_name.setdefault(without_state, []).append(identifier)
    for same in same_name.values():
        for identifier in same if len(same) > 1 else ():
            seen[identifier] = replace(seen[identifier], show_state=bool(seen[identifier].state.text))
    return [seen[identifier] for identifier in sorted(seen)]


def name_zone_cities(cities, names):
    """Calls the cities that are known by their zone alone by the zones' names."""
    return [replace(city, name=Name(names[city.zone])) if city.from_zone and city.zone in names else city
            for city in cities]


def read_root(packages):
    return xml.parse(os.path.join(packages, PLACES)).getroot()
