"""Holds every outlet, action, bound title, column and menu item that the sources ask for against the
interface files of both front ends and the tests' own front end. At run time a missing one is ignored."""

import re
import unittest
import xml.etree.ElementTree as ElementTree
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
PAGES = ("ModelListView", "ConnectionTypeView", "ChooseDeviceView")
INTERFACES = ("MainMenu", *PAGES)

# What each kind of outlet is in the interface files of Qt and of Cocoa.
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


class Sources:
    """What the program asks for."""

    def __init__(self):
        self.navigation = text_of("app/navigation.cpp")
        self.start_up = text_of("app/start_up.cpp")

    def outlets(self, interface):
        text = self.start_up if interface == "MainMenu" else text_of(f"pages/{interface}.cpp")
        return {name: kind for kind, name in re.findall(r'outlet<(\w+)>\("(\w+)"\)', text)}

    def actions(self):
        return set(re.findall(r'\{"(\w+)", &OnrampOSXAppDelegate::\1\}', self.navigation))

    def titles(self):
        return set(re.findall(r'"(\w+Title)"', self.navigation + self.start_up))

    def menu_items(self):
        return (set(re.findall(r'\{"([\w ]+)", "APP_MENU_\w+"\}', self.start_up))
                | set(re.findall(r'itemWithTitle\("([^"]+)"\)', self.start_up)))

    @staticmethod
    def columns(page):
        text = text_of(f"pages/{page}.h") + text_of(f"pages/{page}.cpp")
        shown = re.findall(r"setColumnHeader\((k\w+)", text) or ["kModel"]
        constants = dict(re.findall(r'(k\w+) = "(\w+)";', text))
        return {constants[name] for name in shown}


class QtFile:
    def __init__(self, interface):
        self.root = ElementTree.fromstring(text_of(f"resources/qt/{interface}.ui"))
        self.page_class = self.root.find("widget").get("class")

    def outlets(self):
        return {widget.get("name"): QT.get(widget.get("class"))
                for widget in self.root.iter("widget")}

    def property(self, name):
        """The texts of that property by the names of their objects."""
        return {owner.get("name"): ["".join(text.itertext()) for text in found.iter("string")]
                for owner in self.root.iter() for found in owner.findall("property")
                if found.get("name") == name}

    def actions(self):
        buttons = {widget.get("name") for widget in self.root.iter("widget")}
        return {name: text for name, (text,) in self.property("action").items() if name in buttons}

    def titles(self):
        return {name: text for name, (text,) in self.property("titleBinding").items()}

    def columns(self):
        return {column for columns in self.property("columns").values() for column in columns}

    def menu_items(self):
        names = {"applicationMenu", *(action.get("name") for action in self.root.iter("action"))}
        texts = self.property("title") | self.property("text")
        return {text for name, (text,) in texts.items() if name in names}


class CocoaFile:
    def __init__(self, interface):
        self.root = ElementTree.fromstring(text_of(f"resources/cocoa/{interface}.xib"))
        first = next(iter(self.root.iter("customView")))
        self.page_class = first.get("identifier")
        outlets = {outlet.get("destination"): outlet.get("property")
                   for outlet in self.root.iter("outlet")}
        self.objects = [(each.get("identifier") or outlets.get(each.get("id")), each)
                        for each in self.root.iter()]

    def outlets(self):
        return {name: COCOA.get(each.tag) for name, each in self.objects if name}

    def connections(self, kind, attribute):
        return {name: found.get(attribute) for name, each in self.objects if name
                for found in each.findall(f"connections/{kind}")}

    def actions(self):
        return {name: selector.rstrip(":")
                for name, selector in self.connections("action", "selector").items()}

    def titles(self):
        return self.connections("binding", "keyPath")

    def columns(self):
        return {column.get("identifier") for column in self.root.iter("tableColumn")}

    def menu_items(self):
        return {item.get("title") for item in self.root.iter("menuItem")}


def recorded_outlets(interface):
    """What the tests' own front end has in place of the file."""
    text = text_of("tests/recording/interfaces.cpp")
    parts = re.search(rf'\{{"{interface}",\s*\{{(.*?)\}}\}}[,}}]', text, re.DOTALL)[1]
    return {name: kind for kind, name in re.findall(r'\{k(\w+), "(\w+)"', parts)}


class InterfaceFiles(unittest.TestCase):
    def setUp(self):
        self.sources = Sources()
        self.files = {(front, interface): made(interface) for interface in INTERFACES
                      for front, made in (("qt", QtFile), ("cocoa", CocoaFile))}

    def test_every_outlet_is_in_every_front_end_and_of_the_right_kind(self):
        for interface in INTERFACES:
            wanted = self.sources.outlets(interface)
            self.assertGreater(len(wanted), 2)
            for front in ("qt", "cocoa"):
                with self.subTest(interface, front=front):
                    there = self.files[front, interface].outlets()
                    self.assertEqual(wanted, {name: there.get(name) for name in wanted})
            with self.subTest(interface, front="recording"):
                self.assertEqual(wanted, recorded_outlets(interface))

    def test_every_page_has_its_class(self):
        for (front, interface), file in self.files.items():
            if interface in PAGES:
                with self.subTest(interface, front=front):
                    self.assertEqual(interface, file.page_class)

    def test_every_button_does_its_action_and_shows_its_title(self):
        buttons = {name for name, kind in self.sources.outlets("MainMenu").items()
                   if kind == "Button"}
        actions = {name: f"{name}Clicked" for name in buttons}
        titles = {name: f"{name}Title" for name in buttons} | {"window": "windowTitle"}
        self.assertEqual(set(actions.values()), self.sources.actions())
        self.assertLessEqual(self.sources.titles(), set(titles.values()))
        for front in ("qt", "cocoa"):
            with self.subTest(front):
                file = self.files[front, "MainMenu"]
                self.assertEqual(actions, file.actions())
                self.assertEqual(titles, file.titles())

    def test_every_column_has_its_identifier(self):
        for interface in ("ModelListView", "ChooseDeviceView"):
            for front in ("qt", "cocoa"):
                with self.subTest(interface, front=front):
                    self.assertEqual(self.sources.columns(interface),
                                     self.files[front, interface].columns())

    def test_every_menu_item_that_gets_another_title_is_found_by_its_own(self):
        wanted = self.sources.menu_items()
        self.assertEqual(6, len(wanted))
        for front in ("qt", "cocoa"):
            with self.subTest(front):
                self.assertLessEqual(wanted, self.files[front, "MainMenu"].menu_items())


if __name__ == "__main__":
    unittest.main()
