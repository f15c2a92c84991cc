"""Holds the example medium and the application's own resources against what the sources read."""

import ast
import itertools
import os
import plistlib
import re
import subprocess
import unittest
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
MEDIUM = ROOT / "examples/medium"
MESSAGES = MEDIUM / "MacResources/CDCommonMessage.bundle/Contents"
TOOL = MEDIUM / "Utilities/Kestrel Wireless Setup.app/Contents"
RESOURCES = ROOT / "resources"
LANGUAGES = ("en", "de", "ja", "ko", "zh_CN")

# What the chooser's rows are labelled with.
ROW_LABEL = {"INST_TXT_CONNECTION_NETWORK"}

KEY = r'"((?:INST|BTN|APP_MENU)_\w+)"'
TEXT = r'"(?:[^"\\]|\\.)*"'


def strings_table(path):
    """The key/text pairs of a text strings table; anything else in it is an error."""
    rest = re.sub(r"/\*.*?\*/", "", path.read_text(encoding="utf-8"), flags=re.DOTALL)
    table = {}
    entry = re.compile(rf'\s*({TEXT}|\w+)\s*=\s*({TEXT})\s*;\s*')
    at = 0
    while at < len(rest):
        match = entry.match(rest, at)
        if not match:
            raise ValueError(f"{path}: not an entry: {rest[at:at + 60]!r}")
        key, text = match[1].strip('"'), ast.literal_eval(match[2])
        if key in table:
            raise ValueError(f"{path}: {key} stands there twice")
        table[key] = text
        at = match.end()
    return table


def messages(language):
    return strings_table(MESSAGES / f"Resources/{language}.lproj/Localizable.strings")


def sources():
    files = [file for room in ("app", "pages") for file in sorted((ROOT / room).glob("*.[ch]*"))]
    return "\n".join(file.read_text(encoding="utf-8") for file in files)


def medium_list(name):
    return plistlib.loads((MEDIUM / name).read_bytes())


def application_information():
    return plistlib.loads((RESOURCES / "Info.plist.in").read_bytes())


def common_info():
    return medium_list(application_information()["CommonResourcePath"])


class Messages(unittest.TestCase):
    def test_every_key_that_is_asked_for_has_a_text_in_every_language_and_no_other_key_has(self):
        asked = set(re.findall(KEY, sources())) | ROW_LABEL
        self.assertGreater(len(asked), len(ROW_LABEL))
        for language in LANGUAGES:
            with self.subTest(language):
                table = messages(language)
                self.assertEqual(asked, set(table))
                self.assertEqual([], [key for key, text in table.items() if not text.strip()])

    def test_texts_are_filled_like_the_english_ones_and_hold_no_other_percent_sign(self):
        english = messages("en")
        for language in LANGUAGES:
            for key, text in messages(language).items():
                with self.subTest(language, key=key):
                    self.assertEqual(english[key].count("%@"), text.count("%@"))
                    self.assertNotIn("%", text.replace("%@", ""))

    def test_the_fallbacks_in_the_sources_are_filled_like_the_texts(self):
        calls = re.findall(rf"localized\(\s*{KEY},\s*((?:{TEXT}\s*)+)\)", sources())
        fallbacks = {key: ast.literal_eval(f"({text})") for key, text in calls}
        self.assertIn("INST_TXT_ALERT_OSMIN", fallbacks)
        english = messages("en")
        self.assertEqual({key: english[key].count("%@") for key in fallbacks},
                         {key: text.count("%@") for key, text in fallbacks.items()})

    def test_descriptions_name_the_next_button_as_it_is_titled(self):
        for language in LANGUAGES:
            table = messages(language)
            for key in ("INST_TXT_MODEL_DESC", "INST_TXT_CONNECTIONTYPE_DESC"):
                self.assertIn(table["BTN_NEXT"], table[key], language)

    def test_the_bundle_offers_exactly_these_languages_and_falls_back_to_one_of_them(self):
        folders = {folder.name for folder in (MESSAGES / "Resources").iterdir()}
        self.assertEqual({f"{language}.lproj" for language in LANGUAGES}, folders)
        information = plistlib.loads((MESSAGES / "Info.plist").read_bytes())
        self.assertIn(information["CFBundleDevelopmentRegion"], LANGUAGES)


class Medium(unittest.TestCase):
    def test_every_property_list_and_strings_table_parses(self):
        lists = [*MEDIUM.rglob("*.plist"), *RESOURCES.glob("*.plist"), RESOURCES / "Info.plist.in"]
        for path in lists:
            with self.subTest(path.name):
                self.assertIsInstance(plistlib.loads(path.read_bytes()), dict)
        for path in [*MEDIUM.rglob("*.strings"), *RESOURCES.rglob("*.strings")]:
            with self.subTest(path.name):
                self.assertTrue(strings_table(path))

    def test_every_place_that_the_resource_dictionary_names_exists(self):
        common = common_info()
        package = common["PkgInfo"]
        places = [common["CDInfo"], common["ModelInfo"], common["WLANtool"],
                  f"{package['PkgLocation']}/{package['PkgName']}"]
        for place in places:
            with self.subTest(place):
                self.assertFalse(place.startswith("/"))
                self.assertTrue((MEDIUM / place).exists())

    def test_the_models_agree_and_cover_every_mix_of_connections(self):
        common = common_info()
        models = medium_list(common["ModelInfo"])["Model"]
        self.assertEqual(set(medium_list(common["CDInfo"])["ContainedModel"]), set(models))
        kinds = ("USB", "WiredLAN", "WirelessLAN")
        mixes = {tuple(model["Interfaces"][kind] for kind in kinds) for model in models.values()}
        self.assertEqual(set(itertools.product((False, True), repeat=3)) - {(False,) * 3}, mixes)
        # A model without an identifier offers no connection at all.
        self.assertEqual([], [name for name, model in models.items() if not model.get("KSCID")])

    def test_the_set_up_tool_ends_with_the_status_it_is_told(self):
        information = plistlib.loads((TOOL / "Info.plist").read_bytes())
        program = TOOL / "MacOS" / information["CFBundleExecutable"]
        for told, status in (("", 1), ("0", 0), ("2", 2), ("255", 255), ("256", 64), ("x", 64)):
            with self.subTest(told):
                run = subprocess.run([program, "-installer"], timeout=30, capture_output=True,
                                     env=os.environ | {"ONRAMP_EXAMPLE_TOOL_STATUS": told},
                                     text=True, check=False)
                self.assertEqual(status, run.returncode)
                self.assertIn("-installer", run.stderr)


class ApplicationResources(unittest.TestCase):
    def test_the_service_type_of_the_medium_may_be_browsed_for(self):
        information = application_information()
        self.assertIn(common_info()["BonjourNetwork"].rstrip("."), information["NSBonjourServices"])

    def test_countries_are_keyed_by_codes_in_capitals(self):
        countries = plistlib.loads((RESOURCES / "SupportedKOL.plist").read_bytes())["Country"]
        self.assertEqual([], [code for code in countries if not re.fullmatch("[A-Z]{2}", code)])


if __name__ == "__main__":
    unittest.main()
