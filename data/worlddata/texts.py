"""The names of cities and countries in every language that the packages translate."""

import os
import struct

from .rows import ROW_BYTES, usable, with_state

PLACES_DOMAIN = "libgweather-4.0-locations"
COUNTRIES_DOMAIN = "iso_3166-1"
CONTEXT_END = "\4"


def read_catalogue(path):
    """The messages of a compiled catalogue."""
    with open(path, "rb") as file:
        data = file.read()
    try:
        order = {b"\xde\x12\x04\x95": "<", b"\x95\x04\x12\xde": ">"}[data[:4]]
        _, count, sources, targets = struct.unpack_from(order + "4I", data, 4)

        def text(table, index):
            size, offset = struct.unpack_from(order + "2I", data, table + 8 * index)
            if offset + size > len(data):
                raise ValueError("cut off")
            return data[offset:offset + size].decode("utf-8").split("\0")[0]

        return {text(sources, i): text(targets, i) for i in range(count)}
    except (KeyError, ValueError, struct.error) as error:
        raise ValueError(f"{path}: not a message catalogue: {error}") from None


def catalogue_files(packages):
    """The catalogues of the packages by language and domain."""
    found = {}
    folder = os.path.join(packages, "locale")
    for language in sorted(os.listdir(folder)) if os.path.isdir(folder) else ():
        for domain in (PLACES_DOMAIN, COUNTRIES_DOMAIN):
            path = os.path.join(folder, language, "LC_MESSAGES", domain + ".mo")
            if os.path.exists(path):
                found.setdefault(language, {})[domain] = path
    # The names themselves are English.
    found.pop("en", None)
    return found


class Language:
    """One language's names."""

    def __init__(self, files=None, zone_names=None):
        messages = {domain: read_catalogue(path) for domain, path in (files or {}).items()}
        self._places = messages.get(PLACES_DOMAIN, {})
        self._countries = messages.get(COUNTRIES_DOMAIN, {})
        self._zones = zone_names or {}

    def _place(self, name):
        key = name.context + CONTEXT_END + name.text if name.context else name.text
        return usable(self._places.get(key))

    def country(self, country):
        """The usual name, that of the places package, the formal one; nothing when none is translated."""
        candidates = [usable(self._countries.get(name)) for name in country.standard_names]
        candidates.insert(1, self._place(country.place_name) if country.place_name else "")
        return next((name for name in candidates if name), "")

    def city(self, city):
        name = usable(self._zones.get(city.zone)) if city.from_zone else self._place(city.name)
        if not city.show_state:
            return name
        state = self._place(city.state)
        return with_state(name or city.name.text, state or city.state.text) if name or state else ""


def english_city(city):
    name = usable(city.name.text)
    return with_state(name, usable(city.state.text)) if city.show_state else name


def countries_of(cities):
    return {city.country.identifier: city.country for city in cities}.values()


def english_texts(cities):
    texts = {country.identifier: usable(country.name.text) for country in countries_of(cities)}
    texts.update({city.identifier: english_city(city) for city in cities})
    return texts


def drop_confusions(texts, cities, english):
    """Takes away translations that make two cities of one country look the same."""
    confused = True
    while confused:
        rows = {}
        for city in cities:
            text = texts.get(city.identifier) or english[city.identifier]
            rows.setdefault((city.country.code, text), []).append(city.identifier)
        confused = [identifier for same in rows.values() if len(same) > 1 for identifier in same if identifier in texts]
        for identifier in confused:
            # Its English name may be another city's translation: look again.
            del texts[identifier]


def drop_what_does_not_fit(texts, cities, english):
    """Takes away the longest translations where a row would be cut."""
    for city in cities:
        names = (city.identifier, city.country.identifier)
        size = {name: len((texts.get(name) or english[name]).encode()) for name in names}
        for name in sorted(names, key=size.get, reverse=True):
            if sum(size.values()) + len(", ") > ROW_BYTES and name in texts:
                del texts[name]
                size[name] = len(english[name].encode())


def language_texts(language, cities, english):
    """The translations that rows can show; the other names are shown in English."""
    texts = {country.identifier: language.country(country) for country in countries_of(cities)}
    texts.update({city.identifier: language.city(city) for city in cities})
    texts = {identifier: text for identifier, text in texts.items() if text}
    drop_what_does_not_fit(texts, cities, english)
    drop_confusions(texts, cities, english)
    return texts


def write_catalogue(path, language, texts):
    """Writes the source of a message catalogue."""

    def quoted(text):
        return '"' + text.replace("\\", "\\\\").replace('"', '\\"') + '"'

    header = ("Project-Id-Version: clock-ui", f"Language: {language}", "MIME-Version: 1.0",
              "Content-Type: text/plain; charset=UTF-8", "Content-Transfer-Encoding: 8bit")
    lines = ['msgid ""', 'msgstr ""'] + [f'"{line}\\n"' for line in header]
    for identifier in sorted(texts):
        lines += ["", f"msgid {quoted(identifier)}", f"msgstr {quoted(texts[identifier])}"]
    with open(path, "w", encoding="utf-8") as file:
        file.write("\n".join(lines) + "\n")
