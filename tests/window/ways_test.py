"""Tests that go through the wizard in its real window from start to end.

Usage: ways_test.py [unittest options] MEDIUM

MEDIUM is the folder of a medium with the application on it.
"""

import subprocess
import unittest

from media import model
from way import BUILT, ON_GNUSTEP, TEXT, WayTest, messages
from onscreen.processes import wait_for

TWO_MODELS = {"Kestrel 1": model(usb=True, wired=True, wireless=True),
              "Kestrel 2": model(usb=True)}


class Ways(WayTest):
    def test_forward_by_keyboard_then_back_and_forward_again(self):
        person = self.start({name: model(usb=True, wired=wired, wireless=True)
                             for name, wired in (("A", True), ("B", False), ("C", True))})
        person.see("list item", "B")
        person.press("Down")
        person.press("Return")
        wireless = person.see("radio button", TEXT["INST_TXT_WIFI"])
        self.assertTrue(person.has_state(wireless, "checked"))
        person.click("push button", TEXT["BTN_BACK"])
        chosen = person.see("list item", "B")
        self.assertTrue(person.has_state(chosen, "selected"))
        person.press("Return")
        person.see("radio button", TEXT["INST_TXT_USB"])
        person.press("Down")
        person.press("space")
        person.press("Return")
        self.assert_installer_opened(person, {"Model": "B", "Interface": "Default"})

    def test_without_a_wireless_model_the_package_opens_at_once(self):
        person = self.start({"Cable": model(usb=True, wired=True)})
        self.assert_installer_opened(person, None)

    def test_escape_and_the_close_button_and_cancel_all_quit(self):
        for leave in (lambda p: p.press("Escape"), lambda p: p.close_window(),
                      lambda p: p.click("push button", TEXT["BTN_CANCEL"])):
            with self.subTest(leave=leave):
                person = self.start(TWO_MODELS)
                person.see("list item", "Kestrel 1")
                leave(person)
                self.assert_quit_without_a_trace(person)

    def test_on_a_system_above_the_mediums_range_an_alert_says_why_and_the_wizard_quits(self):
        person = self.start(TWO_MODELS, ["--system-version", "11.0.0"],
                            SystemMax={"Major": "10", "Minor": "15", "BugFix": "x"})
        person.see("label", TEXT["INST_TXT_ALERT_OS"])
        person.see("label", TEXT["INST_TXT_ALERT_OSMAX"])
        self.assertFalse(person.sees("list item", "Kestrel 1"))
        person.click("push button", TEXT["BTN_CLOSE"])
        self.assert_quit_without_a_trace(person)

    def test_the_application_menu_is_in_the_users_language(self):
        german = messages.read(BUILT, "de")
        person = self.start(TWO_MODELS, env={"LANG": "de_DE.UTF-8"})
        person.see("list item", "Kestrel 1")
        self.open_application_menu(person)
        for key in ("ABOUT", "HIDE", "HIDEOHTERS", "SHOWALL"):
            person.see("menu item", german["APP_MENU_" + key])
        person.click("menu item", german["APP_MENU_QUIT"])
        self.assert_quit_without_a_trace(person)

    @unittest.skipIf(ON_GNUSTEP, "lists have no names under GNUstep")
    def test_a_list_has_a_name_and_accepts_typed_words_and_double_clicks(self):
        person = self.start({"Kestrel Photo 1": model(usb=True, wireless=True),
                             "Kestrel Scan 2": model(usb=True, wired=True, wireless=True)})
        person.see("list", TEXT["INST_TXT_MODEL"])
        person.press("s", "c")
        wait_for(lambda: person.has_state(person.see("list item", "Kestrel Scan 2"), "selected"),
                 20, "a model to be selected by its second word")
        person.double_click("list item", "Kestrel Photo 1")
        person.see("heading", TEXT["INST_TXT_CONNECTIONTYPE"])
        person.see("panel", TEXT["INST_TXT_CONNECTIONTYPE"])
        person.click("radio button", TEXT["INST_TXT_USB"])
        person.click("push button", TEXT["BTN_NEXT"])
        self.assert_installer_opened(person, {"Model": "Kestrel Photo 1", "Interface": "Default"})

    @unittest.skipIf(ON_GNUSTEP, "the Cocoa front end has no options")
    def test_without_a_display_only_help_and_version_work(self):
        program = BUILT / "Onramp OSX.app/Contents/Linux/Onramp OSX"
        for arguments, status, start in ((["--help"], 0, "Usage: "), (["-v"], 0, "Onramp OSX "),
                                         ([], 2, "Onramp OSX: there is no display")):
            run = subprocess.run([program, *arguments], capture_output=True, text=True,
                                 env={"PATH": "/usr/bin"})
            output = run.stdout + run.stderr
            self.assertEqual((run.returncode, output[:len(start)]), (status, start))
            self.assertTrue(arguments or output.count("\n") == 1, output)


if __name__ == "__main__":
    unittest.main()
