"""Controls the wizard's chooser, the page that lists devices, on a practice network."""

import os
import pathlib
import subprocess
import sys
import time

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.dont_write_bytecode = True
sys.path[:0] = [str(ROOT / "bench"), str(ROOT / "tools"), str(ROOT / "tests/window")]

from onscreen.person import Person  # noqa: E402
from report.cases import require  # noqa: E402

PROGRAM = "Onramp OSX.app/Contents/Linux/Onramp OSX"
MAKER, MODEL = "Kestrel", "Model 100"
GEAR, GEAR_REFRESH = "Actions", 2
WAIT_SECONDS = 90  # for a search to end
BEGIN_SECONDS = 5  # for a search to begin


def require_medium(folder):
    """Returns the medium's full path. Exits if the wizard is not on the medium."""
    medium = pathlib.Path(folder).resolve()
    require([medium / PROGRAM],
            "build it: cmake --preset release && cmake --build --preset release --target medium")
    return medium


def enter_network(description="/dev/null"):
    """Runs this program again on a practice network, unless it is already on one."""
    if "ONRAMP_PRACTICE_SOCKET" not in os.environ:
        os.execv(sys.executable, [sys.executable, str(ROOT / "tools/practice-network"),
                                  str(description), sys.executable, *sys.argv])


class Chooser(Person):
    """A simulated person who opens the wizard's chooser and searches for devices.

    `text` is a dictionary of the medium's English strings.
    """

    def __init__(self, desktop, medium, text):
        super().__init__(desktop, medium / PROGRAM, env={"LANG": "en_US.UTF-8"})
        self._text = text
        self._atspi.set_timeout(WAIT_SECONDS * 1000, WAIT_SECONDS * 1000)
        self._key = None

    def go_there(self):
        """Clicks Next on the first page, which must be the connection page with wireless selected.
        Returns when the first search has ended."""
        self.see("radio button", self._text["INST_TXT_WIFI"])
        self.click("push button", self._text["BTN_NEXT"])
        self.see("label", self._text["INST_TXT_DEVLIST"], WAIT_SECONDS)
        self.wait()

    def refresh(self):
        """Chooses the menu item that empties the list and searches again. Returns time.monotonic()
        at the key press. Does not wait until the wizard has received the key.
        """
        self.open_menu(GEAR)
        self.press(*["Down"] * GEAR_REFRESH)
        began = time.monotonic()
        self._key = subprocess.Popen(["xdotool", "key", "Return"], env=self.desktop.env)
        return began

    def is_searching(self):
        return self.sees("label", self._text["INST_WAIT"])

    def wait(self):
        """Waits for the end of the search that go_there() or refresh() has started."""
        if self._key:
            self._key.wait()
            until = time.monotonic() + BEGIN_SECONDS
            while not self.is_searching() and time.monotonic() < until:
                time.sleep(0.02)
        self._ask()  # returns once the wizard answers again
        self.see_gone("label", self._text["INST_WAIT"], WAIT_SECONDS)

    def screen_coordinates(self):
        return self._atspi.CoordType.SCREEN

    def table(self):
        """Returns the table of devices. Qt creates no cells when only the number of rows is
        read."""
        return self.see("tree").get_table_iface()

    def names(self):
        """Returns the names of all listed devices, including those scrolled out of view."""
        table = self.table()
        names = []
        for row in range(table.get_n_rows()):
            name, address = (table.get_accessible_at(row, column).get_name() for column in (0, 2))
            names.append(name.removesuffix(f", {address}"))
        return names
