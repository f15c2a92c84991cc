"""How the window is handled: by keyboard, mouse and assistive programs.

Usage: handling.py [unittest options] MEDIUM, a medium's folder with the application on it.
"""

import subprocess
import unittest

from media import model
from way import BUILT, TEXT, WayTest
from onscreen.processes import wait_for


class Handling(WayTest):
    def test_lists_are_named_searched_by_any_word_and_take_a_double_click(self):
        person = self.start({"Kestrel Photo 1": model(usb=True, wireless=True),
                             "Kestrel Scan 2": model(usb=True, wired=True, wireless=True)})
        person.see("list", TEXT["INST_TXT_MODEL"])
        person.press("s", "c")
        wait_for(lambda: person.has_state(person.see("list item", "Kestrel Scan 2"), "selected"),
                 20, "the model found by its second word")
        person.double_click("list item", "Kestrel Photo 1")
        person.see("heading", TEXT["INST_TXT_CONNECTIONTYPE"])
        person.see("panel", TEXT["INST_TXT_CONNECTIONTYPE"])
        person.press("F10", "Up", "Return")
        self.assert_quit_without_a_trace(person)

    def test_without_a_display_only_information_is_given(self):
        program = BUILT / "Onramp OSX.app/Contents/Linux/Onramp OSX"
        for arguments, status, start in ((["--help"], 0, "Usage: "), (["-v"], 0, "Onramp OSX "),
                                         ([], 2, "Onramp OSX: there is no display")):
            run = subprocess.run([program, *arguments], capture_output=True, text=True,
                                 env={"PATH": "/usr/bin"})
            output = run.stdout + run.stderr
            self.assertEqual((run.returncode, output[:len(start)]), (status, start))
            self.assertTrue(arguments == ["--help"] or output.count("\n") == 1, output)


if __name__ == "__main__":
    unittest.main()
