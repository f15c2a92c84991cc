"""Controls the wizard's chooser (its list of devices) without the accessibility bus.

This is necessary to measure the wizard's memory. While the accessibility bus is in use, Qt creates
an object for a table cell whenever the selected row changes, and never frees it.
"""

import pathlib
import time

from chooser import GEAR, GEAR_REFRESH, PROGRAM, WAIT_SECONDS, Chooser

from onscreen.processes import start, stop, wait_for

_ALWAYS_ON = "QT_LINUX_ACCESSIBILITY_ALWAYS_ON"
_TRIES = 5


def descriptors(process):
    return len(list(pathlib.Path(f"/proc/{process}/fd").iterdir()))


class BlindChooser:
    """A context manager that starts the wizard and controls it without reading the screen.

    The constructor first runs the wizard once with the accessibility bus, to find out where the gear
    button is. The wizard has more open descriptors while it searches, so their number shows whether
    a search is running.
    """

    def __init__(self, desktop, medium, text):
        with Chooser(desktop, medium, text) as person:
            person.go_there()
            box = person.see("push button", GEAR).get_component_iface().get_extents(
                person.screen_coordinates())
            self._gear = str(box.x + box.width // 2), str(box.y + box.height // 2)
        self._desktop = desktop
        environment = desktop.env | {"LANG": "en_US.UTF-8"}
        del environment[_ALWAYS_ON]
        self.process = start([str(medium / PROGRAM)], env=environment)
        self._idle = None

    def __enter__(self):
        return self

    def __exit__(self, *_):
        stop(self.process)

    def go_there(self):
        """Presses Return on the first page, which must be the connection page with wireless
        selected. Returns when the first search has ended."""
        self._desktop.run(["xdotool", "search", "--sync", "--onlyvisible", "--pid",
                           str(self.process.pid)], timeout=WAIT_SECONDS)
        time.sleep(2)
        before = descriptors(self.process.pid)
        self._try(lambda: self._press("Return"), lambda: descriptors(self.process.pid) > before)
        time.sleep(20)  # longer than a search
        self._idle = descriptors(self.process.pid)

    def refresh(self):
        def choose():
            self._desktop.run(["xdotool", "mousemove", *self._gear, "click", "1"])
            time.sleep(0.5)  # until the menu is open
            self._press(*["Down"] * GEAR_REFRESH, "Return")

        self._try(choose, lambda: descriptors(self.process.pid) > self._idle)

    def wait(self):
        """Waits until no search is running."""
        wait_for(lambda: descriptors(self.process.pid) <= self._idle, WAIT_SECONDS,
                 "the search to end")
        time.sleep(0.5)

    def _press(self, *keys):
        self._desktop.run(["xdotool", "key", "--clearmodifiers", *keys])

    @staticmethod
    def _try(act, has_begun):
        """Calls `act` until a search begins, because input that comes too early is lost. Raises
        TimeoutError if no search begins after several calls."""
        for _ in range(_TRIES):
            act()
            try:
                return wait_for(has_begun, 3, "a search")
            except TimeoutError:
                pass
        raise TimeoutError(f"no search began in {_TRIES} tries")
