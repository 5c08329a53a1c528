"""Tests of the program that builds the city database: world_data_test.py PROGRAM"""

import glob
import json
import os
import re
import sqlite3
import stat
import struct
import subprocess
import sys
import tempfile
import unittest

PROGRAM = "build-world-data"

# A country of states, a city state, a country without cities, one without an entry in the standard,
# and one that is no more.
PLACES = """<?xml version="1.0" encoding="utf-8"?>
<gweather format="1.0"><region><_name>World</_name>
<country><_name>Freeland</_name><iso-code>FR</iso-code>
  <timezones><timezone id="Zone/East"/><timezone id="Zone/West"/></timezones>
  <location><name>An airport</name><code>XXXX</code></location>
  <city><_name>Nowhere</_name></city>
  <state><_name>Maine</_name><tz-hint>Zone/East</tz-hint>
    <city><_name msgctxt="City in Maine">Portland</_name></city>
    <city><_name>Évreux</_name></city>
    <city><_name>Évreux</_name></city>
    <city><_name>Border</_name><tz-hint>Zone/West</tz-hint></city>
  </state>
  <state><_name>Oregon</_name><tz-hint>Zone/West</tz-hint>
    <city><_name msgctxt="City in Oregon">Portland</_name></city>
    <city><_name>Left &amp; Right</_name></city>
  </state>
</country>
<country><_name msgctxt="Country">Singapore</_name><iso-code>SG</iso-code>
  <timezones><timezone id="Zone/East"/></timezones>
  <city><_name msgctxt="City in Singapore">Singapore</_name></city>
</country>
<country><_name>Kosovo</_name><iso-code>XK</iso-code><tz-hint>Zone/Old_Name</tz-hint>
  <city><name>Pristina</name></city>
</country>
<country><_name>Antilles</_name><iso-code>AN</iso-code><tz-hint>Zone/East</tz-hint>
  <city><_name>Gone</_name></city>
</country>
<country><_name>Atlantis</_name><iso-code>AT</iso-code><tz-hint>Zone/Drowned</tz-hint>
  <city><_name>Sunken</_name></city>
</country>
</region></gweather>
"""
COUNTRIES = {"3166-1": [{"alpha_2": "FR", "name": "Freeland, Republic of", "common_name": "Freeland"},
                        {"alpha_2": "SG", "name": "Singapore"}, {"alpha_2": "AT", "name": "Atlantis"},
                        {"alpha_2": "EM", "name": "Emptyland"}]}
WITHDRAWN = {"3166-3": [{"alpha_2": "AN", "name": "Antilles"}]}
PROVIDERS = """<serviceproviders format="2.0">
<country code="fr"><provider><gsm><network-id mcc="311" mnc="1"/><network-id mcc="310" mnc="2"/></gsm></provider>
<provider><gsm><network-id mcc="310" mnc="4"/><network-id mcc="31" mnc="4"/></gsm></provider></country>
<country code="sg"><provider><gsm><network-id mcc="525" mnc="1"/></gsm></provider></country>
</serviceproviders>
"""
ZONE_TABLE = "# codes\nFR\t+1+1\tZone/East\nEM\t+1+1\tZone/Sao_Joao\tcomments\nEM\t+1+1\tZone/Unknown\n"


def catalogue(messages):
    """A compiled catalogue."""
    messages = {"": "Content-Type: text/plain; charset=UTF-8\n", **messages}
    keys = sorted(messages, key=lambda key: key.encode())
    tables, pool, start = [b"", b""], b"", 28 + 16 * len(keys)
    for index, texts in enumerate((keys, [messages[key] for key in keys])):
        for text in texts:
            tables[index] += struct.pack("<2I", len(text.encode()), start + len(pool))
            pool += text.encode() + b"\0"
    return struct.pack("<7I", 0x950412DE, 0, len(keys), 28, 28 + 8 * len(keys), 0, start) + tables[0] + tables[1] + pool


class WorldDataTest(unittest.TestCase):
    def setUp(self):
        self._folder = tempfile.TemporaryDirectory()
        self.addCleanup(self._folder.cleanup)
        self.write("libgweather-4/Locations.xml", PLACES)
        self.write("iso-codes/json/iso_3166-1.json", json.dumps(COUNTRIES))
        self.write("iso-codes/json/iso_3166-3.json", json.dumps(WITHDRAWN))
        self.write("mobile-broadband-provider-info/serviceproviders.xml", PROVIDERS)
        self.write("zoneinfo/zone.tab", ZONE_TABLE)
        self.write("zoneinfo/tzdata.zi", "# version\nL Zone/New_Name Zone/Old_Name\nL Zone/East Zone/West\n")
        for zone in ("East", "West", "New_Name", "Sao_Joao"):
            self.write(f"zoneinfo/Zone/{zone}", "TZif2")
        self.write("zoneinfo/Zone/Drowned", "no zone")

    def path(self, *names):
        return os.path.join(self._folder.name, *names)

    def write(self, name, contents):
        os.makedirs(os.path.dirname(self.path("share", name)), exist_ok=True)
        with open(self.path("share", name), "wb") as file:
            file.write(contents if isinstance(contents, bytes) else contents.encode())

    def translate(self, language, places=None, countries=None):
        for domain, messages in (("libgweather-4.0-locations", places), ("iso_3166-1", countries)):
            if messages is not None:
                self.write(f"locale/{language}/LC_MESSAGES/{domain}.mo", catalogue(messages))

    def run_program(self, *arguments):
        return subprocess.run([sys.executable, "-B", PROGRAM, "--packages", self.path("share"), *arguments],
                              capture_output=True, encoding="utf-8", check=False)

    def build(self, *arguments, to="out"):
        return self.run_program("--database", self.path(to, "w.db"), "--texts", self.path(to, "texts"), *arguments)

    def rows(self):
        """What was built, by message identifier: (key, country, zone, codes, city only)."""
        answer = self.build()
        self.assertEqual((answer.returncode, answer.stderr), (0, ""))
        with sqlite3.connect(self.path("out", "w.db")) as database:
            return {row[0]: row[1:] for row in
                    database.execute("SELECT city, key, country, tz_path, mcc, city_only FROM city")}

    def texts(self, language):
        self.rows()
        with open(self.path("out", "texts", language + ".po"), encoding="utf-8") as file:
            pairs = re.findall(r'msgid "(.+)"\nmsgstr "(.*)"', file.read())
        return dict(pairs)

    def test_a_city_has_its_country_zone_and_mobile_codes(self):
        self.assertEqual(self.rows()["IDS_CITY_SG_SINGAPORE"][1:], ("IDS_COUNTRY_SG", "Zone/East", "525", 1))

    def test_the_nearest_zone_counts(self):
        rows = self.rows()
        self.assertEqual(rows["IDS_CITY_FR_MAINE_PORTLAND"][2], "Zone/East")
        self.assertEqual(rows["IDS_CITY_FR_MAINE_BORDER"][2], "Zone/West")

    def test_cities_without_a_zone_are_left_out_and_noted(self):
        rows = self.rows()
        self.assertFalse([city for city in rows if "NOWHERE" in city or "SUNKEN" in city])
        notes = self.build("--verbose").stdout
        self.assertIn("FR 'Nowhere': no time zone", notes)
        self.assertIn("AT 'Sunken': no time zone", notes)

    def test_a_zone_that_was_renamed_is_found_under_its_new_name(self):
        self.assertEqual(self.rows()["IDS_CITY_XK_PRISTINA"][2], "Zone/New_Name")

    def test_a_zone_that_still_has_its_old_name_keeps_it(self):
        self.assertEqual(self.rows()["IDS_CITY_FR_OREGON_PORTLAND"][2], "Zone/West")

    def test_mobile_codes_are_three_digits_each_once_and_sorted(self):
        self.assertEqual(self.rows()["IDS_CITY_FR_MAINE_PORTLAND"][3], "310 311")

    def test_a_country_without_networks_has_no_codes(self):
        self.assertEqual(self.rows()["IDS_CITY_XK_PRISTINA"][3], "")

    def test_a_city_that_is_listed_twice_is_there_once(self):
        self.assertEqual(len([city for city in self.rows() if "EVREUX" in city]), 1)

    def test_cities_of_one_name_show_their_state(self):
        texts = self.texts("en")
        self.assertEqual(texts["IDS_CITY_FR_MAINE_PORTLAND"], "Portland (Maine)")
        self.assertEqual(texts["IDS_CITY_FR_OREGON_PORTLAND"], "Portland (Oregon)")
        self.assertEqual(texts["IDS_CITY_FR_MAINE_BORDER"], "Border")

    def test_a_country_without_cities_has_those_of_its_zones(self):
        rows = self.rows()
        self.assertEqual(rows["IDS_CITY_EM_SAO_JOAO"][1:3], ("IDS_COUNTRY_EM", "Zone/Sao_Joao"))
        self.assertEqual(self.texts("en")["IDS_CITY_EM_SAO_JOAO"], "Sao Joao")
        self.assertNotIn("IDS_CITY_FR_EAST", rows)

    def test_names_of_zones_come_from_the_program_that_knows_them(self):
        self.translate("pt", countries={"Emptyland": "Vazio"})
        program = self.path("names")
        with open(program, "w", encoding="utf-8") as file:
            file.write("#!/bin/sh\nwhile read -r language; do printf '%s\\t%s\\t%s\\n' "
                       "$language $1 \"São João ($language)\"; done\n")
        os.chmod(program, stat.S_IRWXU)
        self.build("--zone-names", program)
        for language in ("en", "pt"):
            with open(self.path("out", "texts", language + ".po"), encoding="utf-8") as file:
                self.assertIn(f'msgid "IDS_CITY_EM_SAO_JOAO"\nmsgstr "São João ({language})"', file.read())

    def test_a_withdrawn_country_is_left_out_and_one_without_an_entry_is_not(self):
        rows = self.rows()
        self.assertFalse([city for city in rows if "GONE" in city])
        self.assertEqual(self.texts("en")["IDS_COUNTRY_XK"], "Kosovo")

    def test_the_common_name_of_a_country_is_shown(self):
        self.assertEqual(self.texts("en")["IDS_COUNTRY_FR"], "Freeland")

    def test_names_that_would_be_read_as_mark_up_are_not_used(self):
        self.translate("xx", {"Évreux": "<b>E</b>", "Border": "Grenze"}, {"Singapore": "A\nB"})
        self.assertFalse([city for city in self.rows() if "LEFT" in city])
        self.assertEqual(self.texts("xx"), {"IDS_CITY_FR_MAINE_BORDER": "Grenze"})

    def test_translations_come_from_both_packages(self):
        self.translate("de", {"City in Singapore\4Singapore": "Singapur", "Singapore": "wrong"},
                       {"Singapore": "Republik Singapur"})
        self.assertEqual(self.texts("de"), {"IDS_CITY_SG_SINGAPORE": "Singapur",
                                            "IDS_COUNTRY_SG": "Republik Singapur"})

    def test_a_country_name_is_looked_for_in_its_forms_and_then_among_places(self):
        self.translate("aa", countries={"Freeland, Republic of": "formal"})
        self.translate("bb", {"Freeland": "place"}, {"Freeland, Republic of": "formal"})
        self.translate("cc", {"Freeland": "place"}, {"Freeland": "common", "Freeland, Republic of": "formal"})
        self.translate("dd", {"Country\4Singapore": "place"})
        self.assertEqual(self.texts("aa"), {"IDS_COUNTRY_FR": "formal"})
        self.assertEqual(self.texts("bb"), {"IDS_COUNTRY_FR": "place"})
        self.assertEqual(self.texts("cc"), {"IDS_COUNTRY_FR": "common"})
        self.assertEqual(self.texts("dd"), {"IDS_COUNTRY_SG": "place"})

    def test_a_state_is_translated_with_its_city(self):
        self.translate("fr", {"Maine": "le Maine"})
        self.assertEqual(self.texts("fr"), {"IDS_CITY_FR_MAINE_PORTLAND": "Portland (le Maine)"})

    def test_translations_that_make_two_cities_look_the_same_are_not_used(self):
        self.translate("ru", {"Border": "Evr", "Évreux": "Evr"}, {"Singapore": "S"})
        self.assertEqual(self.texts("ru"), {"IDS_COUNTRY_SG": "S"})

    def test_a_translation_that_looks_like_another_citys_english_name_is_not_used(self):
        self.translate("ru", {"Border": "Évreux"}, {"Singapore": "S"})
        self.assertEqual(self.texts("ru"), {"IDS_COUNTRY_SG": "S"})

    def test_the_english_name_that_remains_is_compared_again(self):
        self.write("libgweather-4/Locations.xml",
                   PLACES.replace("<city><_name>Border", "<city><_name>Town</_name></city><city><_name>Border"))
        self.translate("ru", {"Border": "Evr", "Évreux": "Evr", "Town": "Border"}, {"Singapore": "S"})
        self.assertEqual(self.texts("ru"), {"IDS_COUNTRY_SG": "S"})

    def test_a_translation_that_does_not_fit_a_row_is_not_used(self):
        self.translate("ml", {"Border": "ഘ" * 80, "Évreux": "E"}, {"Freeland": "F" * 20})
        self.assertEqual(self.texts("ml"), {"IDS_CITY_FR_MAINE_EVREUX": "E", "IDS_COUNTRY_FR": "F" * 20})
        self.translate("ml", {"Border": "ഘ" * 77}, {"Freeland": "F" * 20})
        self.assertIn("IDS_CITY_FR_MAINE_BORDER", self.texts("ml"))

    def test_screens_have_no_texts_of_that_name(self):
        catalogues = glob.glob(os.path.join(os.path.dirname(PROGRAM), "..", "po", "*.po"))
        self.assertTrue(catalogues)
        for name in catalogues:
            with open(name, encoding="utf-8") as file:
                self.assertNotRegex(file.read(), "IDS_(CITY|COUNTRY)_")

    def test_languages_without_a_text_are_not_listed(self):
        self.translate("de", countries={"Singapore": "Singapur"})
        self.translate("xx", places={"Elsewhere": "Anderswo"})
        self.assertEqual(self.run_program("--list-languages").stdout.split(), ["en", "de"])
        self.rows()
        self.assertEqual(sorted(os.listdir(self.path("out", "texts"))), ["de.po", "en.po"])

    def test_the_same_packages_give_the_same_files(self):
        self.translate("de", countries={"Singapore": "Singapur"})
        self.build(to="one")
        self.build(to="two")
        self.build(to="two")
        for name in ("w.db", "texts/en.po", "texts/de.po"):
            with open(self.path("one", name), "rb") as one, open(self.path("two", name), "rb") as two:
                self.assertEqual(one.read(), two.read(), name)

    def test_keys_and_identifiers_do_not_depend_on_the_other_cities(self):
        before = self.rows()
        self.write("libgweather-4/Locations.xml",
                   PLACES.replace("<city><_name>Border</_name>", "<city><_name>Portland</_name></city>"
                                  "<city><_name>Aachen</_name></city><city><_name>Border</_name>"))
        after = self.rows()
        self.assertIn("IDS_CITY_FR_MAINE_AACHEN", after)
        self.assertEqual(before, {city: after[city] for city in before})

    def test_long_names_give_identifiers_of_63_bytes_that_differ(self):
        names = ["Llanfair " * 10 + end for end in ("north", "south")]
        cities = "".join(f"<city><_name>{name}</_name></city>" for name in names)
        self.write("libgweather-4/Locations.xml", PLACES.replace("<city><_name>Border", cities + "<city><_name>Border"))
        long = [city for city in self.rows() if "LLANFAIR" in city]
        self.assertEqual([len(city) for city in long], [63, 63])

    def test_missing_or_broken_packages_stop_the_build_with_a_sentence(self):
        for name, contents in (("libgweather-4/Locations.xml", "<gweather>"), ("iso-codes/json/iso_3166-1.json", "{}"),
                               ("locale/de/LC_MESSAGES/iso_3166-1.mo", b"\xde\x12\x04\x95 cut off"),
                               ("zoneinfo/zone.tab", None)):
            with self.subTest(name):
                self.setUp()
                if contents is None:
                    os.remove(self.path("share", name))
                else:
                    self.write(name, contents)
                answer = self.build()
                self.assertEqual(answer.returncode, 1)
                self.assertRegex(answer.stderr, r"\Abuild-world-data: .+\n\Z")
                self.assertFalse(os.path.exists(self.path("out", "w.db")))


if __name__ == "__main__":
    PROGRAM = sys.argv.pop(1)
    unittest.main()
