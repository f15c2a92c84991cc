"""Tests that choose wireless in the wizard's real window, on a practice network.

Usage: wireless_test.py [TEST] MEDIUM

MEDIUM is the folder of a medium with the application on it. TEST is a name such as
WirelessWays.test_back_and_forth_keeps_list_and_choice. Without TEST, all tests run, each with its own
process, desktop and devices. Several tests run at a time, because a test mostly waits.
"""

import concurrent.futures
import itertools
import os
import subprocess
import sys
import unittest

import media
from media import model
from way import BUILT, GEAR, GEAR_REFRESH, ON_GNUSTEP, PRACTICE_NETWORK, TEXT, WayTest, messages
from onscreen.processes import wait_for
from practice_network import PracticeNetwork

AT_A_TIME = 4
PATIENCE = 60  # seconds; on an idle machine, 15 are enough
GEAR_TOOL = 1
SUPPORT_PAGE = "http://support.kestrel.example/g/d/c2f2/KS7/en/us/"


class WirelessWays(WayTest):
    def setUp(self):
        super().setUp()
        self.network = PracticeNetwork()
        self.kind = self.id().rpartition("test_")[2][:30]
        self.model = f"Kestrel {self.kind}"
        self.models = {self.model: model(usb=True, wired=True, wireless=True),
                       "Kestrel Cable": model(usb=True)}

    def add(self, name, **entries):
        self.network.add(name, **{"maker": "Kestrel", "model": self.kind} | entries)
        self.addCleanup(self.network.remove, name)

    def add_devices(self, *names):
        """Adds devices that use wireless, waits until all are announced, and returns their names."""
        whole = [f"{name} of {self.kind}" for name in names]
        for name in whole:
            self.add(name)
        self.network.settle()
        return whole

    def search(self, **details):
        """Starts the wizard and clicks through it until a search begins."""
        person = self.start(self.models, **details)
        person.click("list item", self.model)
        wait_for(lambda: person.has_state(person.see("list item", self.model), "selected"),
                 PATIENCE, f"{self.model!r} to be selected")
        person.click("push button", TEXT["BTN_NEXT"])
        person.click("radio button", TEXT["INST_TXT_WIFI"])
        person.click("push button", TEXT["BTN_NEXT"])
        return person

    def see_chooser(self, person, text=TEXT):
        person.see("label", text["INST_TXT_DEVLIST"], PATIENCE)
        person.see_gone("label", text["INST_WAIT"], PATIENCE)

    def see_tool_run(self):
        called = self.medium / "tool"
        arguments = wait_for(lambda: called.exists() and called.read_text(), PATIENCE,
                             "the tool to run")
        self.assertEqual(arguments, "-installer")

    def is_enabled(self, person, button):
        return person.has_state(person.see("push button", TEXT[button]), "enabled")

    @staticmethod
    def names(person):
        return [name for name, _, _ in person.rows()]

    def assert_handed_on(self, person, name, address):
        self.assert_installer_opened(person, {
            "Model": self.model, "Interface": "WiFi", "Network": {
                "Bonjour": {"name": name, "type": "_pdl-datastream._tcp.", "domain": "local."},
                "IP address": address}})

    def test_keyboard_alone_or_accessible_tree_alone_can_choose_a_device_despite_closed_ports(self):
        for number in (1, 2, 3):
            self.add(f"closed {number} of {self.kind}", activeif="closed")
        self.add("Büro – 会議室", addresses=["127.0.90.1"], note="2nd floor")
        self.network.settle()
        ways = (self.use_keyboard,) if ON_GNUSTEP else (self.use_keyboard, self.use_accessible_tree)
        for language, use in itertools.product(("en_US", "ja_JP"), ways):
            with self.subTest(language=language, use=use.__name__):
                self.desktop.forget()
                person = self.start(self.models, env={"LANG": f"{language}.UTF-8"})
                use(person, messages.read(BUILT, language[:2]))
                self.assert_handed_on(person, "Büro – 会議室", "127.0.90.1")

    def use_keyboard(self, person, text):
        person.see("list item", "Kestrel Cable")
        person.press("Down", "Return")
        person.see("radio button", text["INST_TXT_WIFI"])
        person.press("Return")
        self.see_chooser(person, text)
        self.assertEqual(person.rows(), [
            ("Büro – 会議室", text["INST_TXT_CONNECTION_NETWORK"], "127.0.90.1")])
        # If the search had found no device in time, the wizard would have run the set-up tool and
        # then hidden Back.
        self.assertTrue(person.sees("push button", text["BTN_BACK"]))
        if not ON_GNUSTEP:
            person.press("Tab")
            person.open_menu()  # Tab leads from the list to the gear button
            person.press("Escape", "shift+Tab")
        person.press("Return")

    def use_accessible_tree(self, person, text):
        person.act("list item", self.model)
        person.act("push button", text["BTN_NEXT"])
        person.act("radio button", text["INST_TXT_WIFI"])
        person.act("push button", text["BTN_NEXT"])
        self.see_chooser(person, text)
        person.act("table cell", "Büro – 会議室")
        person.act("push button", text["BTN_NEXT"])

    def test_the_search_runs_again_after_tool_status_3_and_after_refresh(self):
        person = self.search(tool_status=3)
        self.see_tool_run()
        person.see("label", TEXT["INST_TXT_DEVLIST"])
        person.see("label", TEXT["INST_WAIT"])
        person.see("label", TEXT["INST_TXT_ALERT_DEVICENOTFOUND"], PATIENCE)
        person.see("label", TEXT["INST_TXT_ALERT_WIFI_DEVICENOTFOUND"] + "\n\n" +
                   TEXT["INST_TXT_ALERT_CONFIRM_DEVICENOTFOUND_WIFI"])
        self.assertFalse(person.sees("push button", TEXT["BTN_BACK"]))
        person.click("push button", TEXT["BTN_WEB"])
        wait_for(self.desktop.opened, PATIENCE, "the support page to open")
        self.assertEqual(self.desktop.opened(), [SUPPORT_PAGE])
        self.desktop.forget()
        person.see_gone("alert")
        self.assertFalse(self.is_enabled(person, "BTN_NEXT"))
        name, = self.add_devices("Late")
        person.choose_from_menu(GEAR, GEAR_REFRESH)
        person.see("label", TEXT["INST_WAIT"])
        self.see_chooser(person)
        address = person.rows()[0][2]
        person.click("push button", TEXT["BTN_NEXT"])
        self.assert_handed_on(person, name, address)

    def test_the_window_cannot_be_closed_during_the_search(self):
        person = self.search()
        person.see("label", TEXT["INST_WAIT"])
        person.close_window()
        person.press("Escape")
        self.open_application_menu(person)
        person.click("menu item", TEXT["APP_MENU_QUIT"])
        self.add_devices("One")
        self.see_chooser(person)
        person.close_window()
        self.assert_quit_without_a_trace(person)

    def test_back_and_forth_keeps_list_and_choice(self):
        names = self.add_devices("A", "B", "C")
        person = self.search()
        self.see_chooser(person)
        for chosen in names:
            person.click("table cell", chosen)
            person.click("push button", TEXT["BTN_BACK"])
            person.see("radio button", TEXT["INST_TXT_WIFI"])
            person.press("Return")
            self.see_chooser(person)
            self.assertEqual(self.names(person), names)
            cell = person.see("table cell", chosen)
            self.assertTrue(person.has_state(cell, "selected"), chosen)
        person.press("Return")
        self.assertEqual(person.wait_for_end(), 0)
        self.assertEqual(self.files()["instmodel"]["Network"]["Bonjour"]["name"], names[-1])

    def test_the_exit_status_of_the_tool_from_the_menu_decides_what_follows(self):
        name, = self.add_devices("One")
        person = self.search(tool_status=1)
        self.see_chooser(person)
        for status in (1, 0, 2):
            media.make_tool(self.medium, status)
            (self.medium / "tool").unlink(missing_ok=True)
            person.choose_from_menu(GEAR, GEAR_TOOL)
            self.see_tool_run()
            if status == 2:
                break
            if status == 0:
                person.see("label", TEXT["INST_WAIT"])
            self.see_chooser(person)
            self.assertEqual(self.names(person), [name])
            self.assertTrue(self.is_enabled(person, "BTN_NEXT"))
        self.assert_quit_without_a_trace(person)


def run_all():
    """Runs every test in its own process and returns whether all tests passed."""
    names = unittest.defaultTestLoader.getTestCaseNames(WirelessWays)
    with concurrent.futures.ThreadPoolExecutor(AT_A_TIME) as pool:
        runs = pool.map(lambda name: subprocess.run(
            [sys.executable, __file__, f"WirelessWays.{name}", BUILT], stderr=subprocess.PIPE,
            text=True), names)
        passed = True
        for name, run in zip(names, runs):
            print(f"{name}: {'failed' if run.returncode else 'ok'}", flush=True)
            if run.returncode:
                print(run.stderr)
                passed = False
    return passed


if __name__ == "__main__":
    if "ONRAMP_PRACTICE_SOCKET" not in os.environ:
        os.execv(sys.executable, [sys.executable, PRACTICE_NETWORK, "/dev/null", sys.executable,
                                  *sys.argv, BUILT])
    if len(sys.argv) > 1:
        unittest.main(warnings="ignore")
    sys.exit(not run_all())
