"""Checks the application's resources, because the program and macOS ignore most mistakes in them.

The interface files of both front ends must have all outlets, actions, bound titles, columns and menu
items that the sources look up. The interface files for macOS must have the frames, cells and fonts that
Xcode writes, and the information dictionary must have the entries that current versions of macOS need.
"""

import plistlib
import re
import sys
import unittest
import xml.etree.ElementTree as ElementTree
from collections import Counter
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
INFORMATION = Path(sys.argv[1])
RESOURCES = ROOT / "resources"
PAGES = ("ModelListView", "ConnectionTypeView", "ChooseDeviceView")

LANGUAGES = ("en", "de", "ja", "ko", "zh_CN")

REFERENCES = ("destination", "target", "headerView", "selectedItem", "firstResponder")
VIEWS = ("customView", "textField", "button", "imageView", "matrix", "popUpButton",
         "progressIndicator", "scrollView", "clipView", "scroller", "tableView", "tableHeaderView")

# The keys of the strings that macOS shows when it asks the user for permission.
REASONS = {"NSLocalNetworkUsageDescription", "NSRemovableVolumesUsageDescription"}

# The kind of outlet for each class in Qt's interface files and for each tag in Cocoa's.
QT = {"QLabel": "TextField", "QPushButton": "Button", "QToolButton": "PopUpButton",
      "QListView": "TableView", "QTreeView": "TableView", "QMainWindow": "Window",
      "QWidget": "View", "ImageView": "ImageView", "Spinner": "ProgressIndicator",
      "RadioMatrix": "RadioMatrix"}
COCOA = {"textField": "TextField", "button": "Button", "popUpButton": "PopUpButton",
         "tableView": "TableView", "window": "Window", "customView": "View",
         "imageView": "ImageView", "progressIndicator": "ProgressIndicator",
         "matrix": "RadioMatrix"}


def text_of(path):
    return (ROOT / path).read_text(encoding="utf-8")


def strings_table(language):
    text = text_of(f"resources/{language}.lproj/InfoPlist.strings")
    return dict(re.findall(r'^(\w+) = "([^"]+)";$', text, re.MULTILINE))


NAVIGATION = text_of("app/navigation.cpp")
START_UP = text_of("app/start_up.cpp")


def wanted_outlets(interface):
    text = START_UP if interface == "MainMenu" else text_of(f"pages/{interface}.cpp")
    return {name: kind for kind, name in re.findall(r'outlet<(\w+)>\("(\w+)"\)', text)}


def wanted_columns(page):
    text = text_of(f"pages/{page}.h") + text_of(f"pages/{page}.cpp")
    constants = dict(re.findall(r'(k\w+) = "(\w+)";', text))
    shown = re.findall(r"setColumnHeader\((k\w+)", text)
    return {constants[name] for name in shown or ["kModel"]}


def recorded_outlets(interface):
    """Returns the names and kinds of the outlets that `interface` has in the tests' own front end."""
    text = text_of("tests/recording/interfaces.cpp")
    parts = re.search(rf'\{{"{interface}",\s*\{{(.*?)\}}\}}[,}}]', text, re.DOTALL)[1]
    return {name: kind for kind, name in re.findall(r'\{k(\w+), "(\w+)"', parts)}


class QtFile:
    def __init__(self, interface):
        root = ElementTree.fromstring(text_of(f"resources/qt/{interface}.ui"))
        widgets = list(root.iter("widget"))
        self.page_class = widgets[0].get("class")
        self.outlets = {each.get("name"): QT.get(each.get("class")) for each in widgets}
        texts = {}
        for owner in root.iter():
            for found in owner.findall("property"):
                texts.setdefault(found.get("name"), {})[owner.get("name")] = [
                    "".join(text.itertext()) for text in found.iter("string")]
        names = {each.get("name") for each in widgets}
        self.actions = {name: text for name, (text,) in texts.get("action", {}).items()
                        if name in names}
        self.titles = {name: text for name, (text,) in texts.get("titleBinding", {}).items()}
        self.columns = {each for columns in texts.get("columns", {}).values() for each in columns}
        self.menu_items = {"".join(text) for kind in ("title", "text")
                           for text in texts.get(kind, {}).values()}


class CocoaFile:
    def __init__(self, interface):
        root = ElementTree.fromstring(text_of(f"resources/cocoa/{interface}.xib"))
        named = {each.get("destination"): each.get("property") for each in root.iter("outlet")}
        objects = [(each.get("identifier") or named.get(each.get("id")), each)
                   for each in root.iter()]

        def connections(kind, attribute):
            return {name: found.get(attribute) for name, each in objects if name
                    for found in each.findall(f"connections/{kind}")}

        self.page_class = next(root.iter("customView")).get("identifier")
        self.outlets = {name: COCOA.get(each.tag) for name, each in objects if name}
        self.actions = {name: selector.rstrip(":")
                        for name, selector in connections("action", "selector").items()}
        self.titles = connections("binding", "keyPath")
        self.columns = {each.get("identifier") for each in root.iter("tableColumn")}
        self.menu_items = {each.get("title") for each in root.iter("menuItem")}


class InterfaceFiles(unittest.TestCase):
    def test_every_outlet_exists_and_has_the_right_kind(self):
        for interface in ("MainMenu", *PAGES):
            wanted = wanted_outlets(interface)
            self.assertGreater(len(wanted), 2)
            self.assertEqual(wanted, recorded_outlets(interface), interface)
            for made in (QtFile, CocoaFile):
                there = made(interface).outlets
                self.assertEqual(wanted, {name: there.get(name) for name in wanted},
                                 f"{made.__name__} {interface}")

    def test_every_page_has_its_class_and_every_list_its_columns(self):
        for page in PAGES:
            for made in (QtFile, CocoaFile):
                file = made(page)
                self.assertEqual(page, file.page_class, made.__name__)
                columns = set() if page == "ConnectionTypeView" else wanted_columns(page)
                self.assertEqual(columns, file.columns, f"{made.__name__} {page}")

    def test_every_button_has_its_action_and_its_title(self):
        buttons = {name for name, kind in wanted_outlets("MainMenu").items() if kind == "Button"}
        actions = {name: f"{name}Clicked" for name in buttons}
        titles = {name: f"{name}Title" for name in (*buttons, "window")}
        self.assertEqual(set(actions.values()), set(re.findall(
            r'\{"(\w+)", &OnrampOSXAppDelegate::\1\}', NAVIGATION)))
        self.assertLessEqual(set(re.findall(r'"(\w+Title)"', NAVIGATION + START_UP)),
                             set(titles.values()))
        for made in (QtFile, CocoaFile):
            file = made("MainMenu")
            self.assertEqual((actions, titles), (file.actions, file.titles), made.__name__)

    def test_every_menu_item_that_the_wizard_renames_is_in_the_menu(self):
        wanted = set(re.findall(r'\{"([\w ]+)", "APP_MENU_\w+"\}', START_UP)
                     + re.findall(r'itemWithTitle\("([^"]+)"\)', START_UP))
        self.assertEqual(6, len(wanted))
        for made in (QtFile, CocoaFile):
            self.assertLessEqual(wanted, made("MainMenu").menu_items, made.__name__)


class CocoaFiles(unittest.TestCase):
    def setUp(self):
        self.files = [ElementTree.parse(path).getroot()
                      for path in sorted((RESOURCES / "cocoa").glob("*.xib"))]
        self.assertEqual(4, len(self.files))

    def test_ids_are_unique_and_every_reference_names_an_element(self):
        for root in self.files:
            ids = Counter(element.get("id") for element in root.iter() if element.get("id"))
            self.assertEqual([], [name for name, count in ids.items() if count > 1])
            references = {element.get(name) for element in root.iter() for name in REFERENCES}
            self.assertLessEqual(references - {None}, set(ids))

    def test_elements_have_frames_cells_and_fonts_as_xcode_writes_them(self):
        for root in self.files:
            self.assertEqual(["-2", "-1", "-3"],
                             [owner.get("id") for owner in root.iter("customObject")])
            for element in root.iter():
                name = f"{element.tag} {element.get('id')}"
                if element.tag in VIEWS:
                    self.assertIsNotNone(element.find("rect[@key='frame']"), name)
                    self.assertIsNotNone(element.find("autoresizingMask"), name)
                if element.tag in ("textField", "button", "imageView", "popUpButton"):
                    self.assertIsNotNone(element.find("*[@key='cell']"), name)
                if element.tag == "font":  # GNUstep replaces a missing size with its default
                    self.assertTrue(element.get("metaFont") and element.get("size"), name)

    def test_scroll_views_and_tables_have_the_right_properties(self):
        for root in self.files:
            for scroll in root.iter("scrollView"):
                self.assertEqual(["horizontalScroller", "verticalScroller"],
                                 [scroller.get("key") for scroller in scroll.findall("scroller")])
            for table in root.iter("tableView"):
                self.assertEqual("plain", table.get("tableStyle"))
                self.assertIsNone(table.get("emptySelection"))


class Information(unittest.TestCase):
    def setUp(self):
        self.information = plistlib.loads(INFORMATION.read_bytes())

    def test_has_the_entries_that_current_versions_of_macos_need(self):
        self.assertTrue((RESOURCES / f"cocoa/{self.information['NSMainNibFile']}.xib").exists())
        target = re.search(r"CMAKE_OSX_DEPLOYMENT_TARGET ([\d.]+)", text_of("CMakeLists.txt"))[1]
        self.assertEqual(target, self.information["LSMinimumSystemVersion"])
        for key in ("CFBundleAllowMixedLocalizations", "NSHighResolutionCapable",
                    "NSRequiresAquaSystemAppearance", "UIDesignRequiresCompatibility"):
            self.assertIs(True, self.information.get(key), key)

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


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1] + sys.argv[2:])
