"""Lets tests use the Cocoa front end under GNUstep as a person would.

GNUstep does not support AT-SPI. So this module asks the program itself which controls are visible.
accessibility.mm describes the question file and the answer file.
"""

import itertools
import json
import os
import pathlib
import time

from onscreen.person import Person
from onscreen.processes import start, wait_for

_SYSTEM_CONFIGURATION = pathlib.Path("/etc/GNUstep/GNUstep.conf")
_LOOK_SECONDS = 60  # GNUstep is slow on a busy machine
_ANSWER_SECONDS = 60
_PRESS_SECONDS = 20
_MENU_PRESS_SECONDS = 3
_MENU_BAR_ITEM = "Onramp OSX"


class GNUstepPerson(Person):
    """A person who uses one program with the Cocoa front end.

    The constructor starts the program on a desktop, and leaving the `with` statement terminates it.
    """

    follows_desktop = False
    errors = ()  # using a control that is gone raises no error

    def __init__(self, desktop, program, arguments=(), env=None):
        self.desktop = desktop
        folder = pathlib.Path(desktop.env["HOME"])
        self._answer = folder / "accessibility.json"
        self._question = folder / "accessibility.json.question"
        variables = {
            "ONRAMP_ACCESSIBILITY_FILE": str(self._answer),
            "GNUSTEP_CONFIG_FILE": str(self._configure(folder)),
            # GNUstep reads string tables in the locale's encoding. Our tables are in UTF-8.
            "LC_CTYPE": "C.UTF-8",
        } | self._options_as_environment(list(arguments))
        self.process = start([str(program)], env=desktop.env | variables | (env or {}))

    def everything(self):
        return [(control["role"], control["name"], control) for control in self._read()]

    def has_state(self, control, state):
        return state in control["states"]

    def click(self, role, name=None):
        def clickable():
            control = self.see(role, name)
            return control if self.has_state(control, "enabled") else None

        self.click_control(wait_for(clickable, _LOOK_SECONDS, f"{role} {name!r} to be enabled"))

    def click_control(self, control):
        self._point_at(control)
        before = self._noticed_presses()
        self.desktop.run(["xdotool", "mousedown", "1"])
        # Holds the mouse button down until the application has counted the press, for at most
        # `patience` seconds. If the button were released sooner, it could be up when GNUstep
        # handles the press. The application cannot count a press inside an open menu, because the
        # menu grabs the mouse. So `patience` is short there.
        patience = _MENU_PRESS_SECONDS if control["role"] == "menu item" else _PRESS_SECONDS
        deadline = time.monotonic() + patience
        while self._noticed_presses() == before and time.monotonic() < deadline:
            pass
        self.desktop.run(["xdotool", "mouseup", "1"])

    def _has_keyboard(self):
        return True  # nothing tells which of GNUstep's windows has the focus

    def _noticed_presses(self):
        return self._read()[0]["presses"] if self.is_running() else 0

    def open_menu(self, button=None):
        """Opens a button's menu and holds the mouse button down, which keeps the menu open."""
        self._point_at(self.see("button menu", button))
        self.desktop.run(["xdotool", "mousedown", "1"])
        wait_for(self._menu_entries, _LOOK_SECONDS, f"the menu of {button!r}")

    def choose_from_open_menu(self, item):
        nudge = itertools.cycle((0, 1))

        def noticed():
            # The menu's window moves after the menu has opened, so every try looks up the entries
            # again. Every try also moves the pointer, because GNUstep ignores a pointer that has
            # not moved since the menu became ready.
            entries = self._menu_entries()
            if not entries:
                return False
            self._point_at(entries[item - 1], next(nudge))
            return self.has_state((self._menu_entries() or entries)[item - 1], "selected")

        wait_for(noticed, _LOOK_SECONDS, f"entry {item} of the menu to be selected")
        self.desktop.run(["xdotool", "mouseup", "1"])

    def _menu_entries(self):
        """Returns the entries of the open menu, or None when no menu is open."""
        items = [control for control in self._read() if control["role"] == "menu item"]
        return [item for item in items if item["name"] != _MENU_BAR_ITEM] if len(items) > 1 else None

    def _point_at(self, control, nudge=0):
        self.desktop.run(["xdotool", "mousemove", str(control["x"] + control["width"] // 2 + nudge),
                          str(control["y"] + control["height"] // 2), "sleep", "0.05"])

    def see(self, role, name=None, seconds=_LOOK_SECONDS):
        super().see(role, name, seconds)
        return self._at_rest(role, name)

    def _at_rest(self, role, name):
        """Returns the control once two looks in a row have found it unchanged.

        The first look may be too early, because the window manager moves a new window. If a look
        does not find the control, returns the result of the previous look.
        """
        seen = None
        while True:
            now = self._look(role, name)
            if now == seen or now is None:
                return seen
            seen = now
            time.sleep(0.12)

    def _look(self, role, name):
        return next((control for control in self._read()
                     if control["role"] == role and name in (None, control["name"])), None)

    def _ask(self):
        self._read()

    def _read(self):
        """Returns an entry for the application, then one for each visible window and control.

        Waits while the program's main loop is busy. Returns only the entry for the application if
        the program has exited. Fails if any text is cut off.
        """
        self._answer.unlink(missing_ok=True)
        self._question.touch()
        wait_for(lambda: self._answer.exists() or not self.is_running(), _ANSWER_SECONDS,
                 "an answer from the program")
        try:
            controls = json.loads(self._answer.read_text(encoding="utf-8"))
        except FileNotFoundError:
            return [{"role": "application", "name": "", "states": [], "presses": 0}]
        for control in controls:
            assert "cut off" not in control["states"], f"text is cut off: {control}"
        return controls

    def _configure(self, folder):
        """Writes a GNUstep configuration with this desktop's folders and returns its path."""
        own = {"GNUSTEP_USER_DIR_LIBRARY": os.path.relpath(self.desktop.user_folder, folder),
               "GNUSTEP_LOCAL_LIBRARY": str(self.desktop.local_folder)}
        lines = [line for line in _SYSTEM_CONFIGURATION.read_text(encoding="utf-8").splitlines()
                 if line.split("=")[0] not in own]
        file = folder / "GNUstep.conf"
        file.write_text("\n".join(lines + [f"{k}={v}" for k, v in own.items()]) + "\n",
                        encoding="utf-8")
        file.chmod(0o600)
        return file

    @staticmethod
    def _options_as_environment(arguments):
        """Turns an option into a variable, because the Cocoa front end has no options."""
        if not arguments:
            return {}
        option, value = arguments
        assert option == "--system-version"
        return {"ONRAMP_SYSTEM_VERSION": value}
