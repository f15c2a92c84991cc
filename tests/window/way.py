"""Shared code of the tests that go through the wizard from start to end.

The last argument of each test program is the folder of a medium with the application on it. If the
application has the Cocoa front end under GNUstep, set the environment variable ONRAMP_GNUSTEP.
"""

import pathlib
import plistlib
import sys
import tempfile
import unittest

sys.dont_write_bytecode = True
TOOLS = pathlib.Path(__file__).resolve().parents[2] / "tools"
sys.path.insert(0, str(TOOLS))

import media  # noqa: E402
from onscreen import messages  # noqa: E402
from onscreen.desktop import Desktop  # noqa: E402

# Under GNUstep, the Cocoa front end lacks the accessibility bus, keys for menus, names of lists,
# and command-line options. Tests avoid these if ON_GNUSTEP is true.
from tours.person import ON_GNUSTEP, Person  # noqa: E402

BUILT = pathlib.Path(sys.argv.pop()).resolve()
TEXT = messages.read(BUILT, "en")
PRACTICE_NETWORK = TOOLS / "practice-network"
GEAR, GEAR_REFRESH = "Actions", 2
OPTIONS = {"PKG_WebLink": True, "PKG_KestrelOnline": False, "PKG_RemoteTool": False,
           "PKG_LabelTool": False, "PKG_FontSet": False}


class WayTest(unittest.TestCase):
    """start() starts the wizard on a new medium, and returns the Person who uses the wizard."""

    @classmethod
    def setUpClass(cls):
        cls.desktop = cls.enterClassContext(Desktop())
        cls.desktop.env["LANG"] = "en_US.UTF-8"

    def setUp(self):
        self.desktop.forget()

    def start(self, models, arguments=(), env=None, **details):
        folder = pathlib.Path(self.enterContext(tempfile.TemporaryDirectory()))
        self.medium = media.make(folder / "medium", BUILT, models, **details)
        program = self.medium / "Onramp OSX.app/Contents/Linux/Onramp OSX"
        return self.enterContext(Person(self.desktop, program, arguments, env))

    @staticmethod
    def open_application_menu(person):
        if ON_GNUSTEP:
            person.click("menu item", "Onramp OSX")
        else:
            person.press("F10")

    def files(self):
        """Returns the contents of the files that the wizard wrote for the package. The keys are short
        names such as "instmodel"."""
        found = {}
        for folder in (self.desktop.user_folder, self.desktop.local_folder):
            for path in folder.rglob("com.kestrelimaging.*"):
                found[path.name.split(".")[2]] = plistlib.loads(path.read_bytes())
        return found

    def assert_installer_opened(self, person, model_file):
        self.assertEqual(person.wait_for_end(), 0)
        expected = {"installpkginfo": OPTIONS}
        if model_file:
            expected["instmodel"] = model_file
        self.assertEqual(self.files(), expected)
        self.assertEqual(self.desktop.opened(), [str(self.medium / "Packages/Kestrel.pkg")])

    def assert_quit_without_a_trace(self, person):
        self.assertEqual(person.wait_for_end(), 0)
        self.assertEqual(self.files(), {})
        self.assertEqual(self.desktop.opened(), [])
