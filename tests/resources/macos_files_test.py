"""Checks that the macOS application's files have what Xcode writes and what current systems need.

No tool of Apple's reads the files on Linux, and a Mac would ignore most mistakes without a message.
"""

import plistlib
import re
import unittest
import xml.etree.ElementTree as ElementTree
from collections import Counter
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
RESOURCES = ROOT / "resources"
LANGUAGES = ("en", "de", "ja", "ko", "zh_CN")

REFERENCES = ("destination", "target", "headerView", "selectedItem", "firstResponder")
WITH_AN_ID = ("menu", "menuItem", "window", "view", "customView", "textField", "button", "imageView",
              "matrix", "popUpButton", "progressIndicator", "scrollView", "clipView", "scroller",
              "tableView", "tableColumn", "tableHeaderView", "textFieldCell", "buttonCell",
              "imageCell", "popUpButtonCell", "outlet", "action", "binding",
              "accessibilityConnection")
WITHOUT_AN_ID = ("tableHeaderCell", "rect", "size", "font", "color", "autoresizingMask", "behavior")
VIEWS = ("customView", "textField", "button", "imageView", "matrix", "popUpButton",
         "progressIndicator", "scrollView", "clipView", "scroller", "tableView", "tableHeaderView")

# ARCHITECTURE.md or a comment beside the key gives the reason for each key that needs one.
INFORMATION = {
    "CFBundleAllowMixedLocalizations": True,
    "CFBundleExecutable": "Onramp OSX",
    "CFBundleIconFile": "Onramp",
    "CFBundleInfoDictionaryVersion": "6.0",
    "CFBundlePackageType": "APPL",
    "NSHighResolutionCapable": True,
    "NSPrincipalClass": "NSApplication",
    "NSRequiresAquaSystemAppearance": True,
}
# The texts that the system shows when it asks the user for permission.
REASONS = {"NSLocalNetworkUsageDescription", "NSRemovableVolumesUsageDescription"}


def text_of(path):
    return (ROOT / path).read_text(encoding="utf-8")


def strings_table(language):
    text = text_of(f"resources/{language}.lproj/InfoPlist.strings")
    return dict(re.findall(r'^(\w+) = "([^"]+)";$', text, re.MULTILINE))


class InterfaceFiles(unittest.TestCase):
    def setUp(self):
        self.files = [ElementTree.parse(path).getroot()
                      for path in sorted((RESOURCES / "cocoa").glob("*.xib"))]
        self.assertEqual(4, len(self.files))

    def test_ids_are_unique_and_every_reference_resolves(self):
        for root in self.files:
            ids = Counter(element.get("id") for element in root.iter() if element.get("id"))
            self.assertEqual([], [name for name, count in ids.items() if count > 1])
            references = {element.get(name) for element in root.iter() for name in REFERENCES}
            self.assertLessEqual(references - {None}, set(ids))

    def test_elements_have_ids_frames_cells_and_fonts_as_xcode_writes_them(self):
        for root in self.files:
            self.assertEqual(["-2", "-1", "-3"],
                             [owner.get("id") for owner in root.iter("customObject")])
            for element in root.iter():
                name = f"{element.tag} {element.get('id')}"
                if element.tag in WITH_AN_ID:
                    self.assertTrue(element.get("id"), name)
                if element.tag in WITHOUT_AN_ID:
                    self.assertIsNone(element.get("id"), name)
                if element.tag in VIEWS:
                    self.assertIsNotNone(element.find("rect[@key='frame']"), name)
                    self.assertIsNotNone(element.find("autoresizingMask"), name)
                if element.tag in ("textField", "button", "imageView", "popUpButton"):
                    self.assertIsNotNone(element.find("*[@key='cell']"), name)
                if element.tag == "font":  # GNUstep uses its own size for a missing one
                    self.assertTrue(element.get("metaFont") and element.get("size"), name)

    def test_scroll_views_and_tables_have_scrollers_a_style_and_an_optional_selection(self):
        for root in self.files:
            for scroll in root.iter("scrollView"):
                self.assertEqual(["horizontalScroller", "verticalScroller"],
                                 [scroller.get("key") for scroller in scroll.findall("scroller")])
            for table in root.iter("tableView"):
                self.assertEqual("plain", table.get("tableStyle"))
                self.assertIsNone(table.get("emptySelection"))


class Information(unittest.TestCase):
    def setUp(self):
        self.information = plistlib.loads((RESOURCES / "Info.plist.in").read_bytes())

    def test_has_what_current_systems_look_for(self):
        self.assertEqual(INFORMATION, {key: self.information.get(key) for key in INFORMATION})
        self.assertRegex(self.information["CFBundleIdentifier"], r"^[a-z]+(\.[a-z]+){2}$")
        self.assertTrue((RESOURCES / f"cocoa/{self.information['NSMainNibFile']}.xib").exists())
        target = re.search(r"CMAKE_OSX_DEPLOYMENT_TARGET ([\d.]+)", text_of("CMakeLists.txt"))[1]
        self.assertEqual(target, self.information["LSMinimumSystemVersion"])

    def test_gives_a_reason_for_every_permission_in_every_language(self):
        asked = {key for key in self.information if key.endswith("UsageDescription")}
        self.assertEqual(REASONS, asked)
        for language in LANGUAGES:
            with self.subTest(language):
                self.assertEqual(asked, set(strings_table(language)) & asked)
        self.assertEqual({key: self.information[key] for key in asked}, strings_table("en"))

    def test_names_every_service_type_that_the_program_understands(self):
        sources = "".join(path.read_text() for path in (ROOT / "bonjour").glob("*.[ch]*"))
        understood = set(re.findall(r'"(_[\w-]+\._tcp)\."', sources))
        self.assertEqual(4, len(understood))
        self.assertEqual(understood, set(self.information["NSBonjourServices"]))

    def test_is_released_with_the_hardened_runtime_and_no_entitlements(self):
        self.assertRegex(text_of("tools/release-macos"), r"codesign .*--timestamp --options runtime")
        self.assertEqual([], [*RESOURCES.rglob("*.entitlements")])


if __name__ == "__main__":
    unittest.main()
