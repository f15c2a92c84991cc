"""Checks the example medium against the sources, in ways that onramp-check does not."""

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

KEY = r'"((?:INST|BTN|APP_MENU)_\w+)"'
TEXT = r'"(?:[^"\\]|\\.)*"'


def strings_table(path):
    """Returns the key/text pairs of a strings table. Raises ValueError for anything else in it."""
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
            raise ValueError(f"{path}: {key} occurs twice")
        table[key] = text
        at = match.end()
    return table


def messages(language):
    return strings_table(MESSAGES / f"Resources/{language}.lproj/Localizable.strings")


def sources():
    files = [file for room in ("app", "pages") for file in sorted((ROOT / room).glob("*.[ch]*"))]
    return "\n".join(file.read_text(encoding="utf-8") for file in files)


class Messages(unittest.TestCase):
    def test_fallbacks_in_the_sources_have_the_placeholders_of_the_texts(self):
        calls = re.findall(rf"localized\(\s*{KEY},\s*((?:{TEXT}\s*)+)\)", sources())
        fallbacks = {key: ast.literal_eval(f"({text})") for key, text in calls}
        self.assertIn("INST_TXT_ALERT_OSMIN", fallbacks)
        english = messages("en")
        self.assertEqual({key: english[key].count("%@") for key in fallbacks},
                         {key: text.count("%@") for key, text in fallbacks.items()})

    def test_descriptions_call_the_next_button_by_its_title(self):
        for language in LANGUAGES:
            table = messages(language)
            for key in ("INST_TXT_MODEL_DESC", "INST_TXT_CONNECTIONTYPE_DESC"):
                self.assertIn(table["BTN_NEXT"], table[key], language)


class Medium(unittest.TestCase):
    def test_the_models_cover_every_mix_of_connections(self):
        models = plistlib.loads((MEDIUM / "MacResources/ModelInfo.plist").read_bytes())["Model"]
        kinds = ("USB", "WiredLAN", "WirelessLAN")
        mixes = {tuple(model["Interfaces"][kind] for kind in kinds) for model in models.values()}
        self.assertEqual(set(itertools.product((False, True), repeat=3)) - {(False,) * 3}, mixes)

    def test_the_set_up_tool_exits_with_the_status_that_it_is_given(self):
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
    def test_country_keys_are_codes_in_capitals(self):
        countries = plistlib.loads((RESOURCES / "SupportedKOL.plist").read_bytes())["Country"]
        self.assertEqual([], [code for code in countries if not re.fullmatch("[A-Z]{2}", code)])


if __name__ == "__main__":
    unittest.main()
