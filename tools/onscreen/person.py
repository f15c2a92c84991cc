"""A person at the screen: sees the controls by their roles and names, has a mouse and a keyboard."""

import os
import pathlib
import time

from .processes import start, stop, wait_for

_LOOK_SECONDS = 20
# Qt keeps an object for each look at each cell of a table and never frees it, so cells are looked at
# only when one is wanted.
_TABLES = ("list", "table", "tree", "tree table")
_IN_TABLES = ("list item", "table cell", "table column header")
_COLUMNS = 3


def _is(control, role, name):
    """A heading is a label, too, and a row's first cell may be called "name, address"."""
    own_role = control.get_role_name()
    if own_role != role and (own_role, role) != ("heading", "label"):
        return False
    own_name = control.get_name()
    return name in (None, own_name) or (
        role == "table cell" and own_name.startswith(f"{name}, "))


class Person:
    """Starts a program on a desktop and uses it. Use it in a `with` statement."""

    def __init__(self, desktop, program, arguments=(), env=None):
        self.desktop = desktop
        # The library takes the bus from the environment of this process, once.
        os.environ.update({name: desktop.env[name]
                           for name in ("DBUS_SESSION_BUS_ADDRESS", "DISPLAY", "XDG_RUNTIME_DIR")})
        import gi
        gi.require_version("Atspi", "2.0")
        from gi.repository import Atspi, GLib
        self._atspi = Atspi
        self.errors = GLib.Error, AttributeError  # what the use of a control raises that is gone
        self._overlooked = False
        self.process = start([str(program), *arguments], env=desktop.env | (env or {}))

    def __enter__(self):
        return self

    def __exit__(self, *_):
        stop(self.process)

    # Eyes.

    def see(self, role, name=None, seconds=_LOOK_SECONDS):
        """The control of that role and name, once it is on the screen."""
        return wait_for(lambda: self._alive() and self._look(role, name), seconds,
                        f"a {role} named {name!r}")

    def sees(self, role, name=None):
        """Whether such a control is on the screen now."""
        return self._look(role, name) is not None

    def see_gone(self, role, name=None, seconds=_LOOK_SECONDS):
        """Waits until no such control is on the screen."""
        wait_for(lambda: self._certainly_gone(role, name), seconds, f"the end of {role} {name!r}")

    def everything(self):
        """(role, name, control) of all that is on the screen."""
        found = []
        self._visit(self._application(), lambda c: found.append(
            (c.get_role_name(), c.get_name(), c)))
        return found

    def rows(self):
        """The texts of the table on the screen, row by row."""
        cells = [name for role, name, _ in self.everything() if role == "table cell"]
        rows = zip(*(cells[column::_COLUMNS] for column in range(_COLUMNS)))
        return [(row[0].removesuffix(f", {row[-1]}"), *row[1:]) for row in rows]

    def has_state(self, control, state):
        """Whether the control has a state, such as "enabled", "focused" or "selected"."""
        return control.get_state_set().contains(getattr(self._atspi.StateType, state.upper()))

    def picture(self, path):
        """Saves the screen as it is when it has come to rest."""
        time.sleep(0.3)
        self.desktop.picture(path)

    # Hands.

    def click(self, role, name=None):
        """Clicks the middle of a control once it can be clicked."""
        control = self.see(role, name)
        wait_for(lambda: self.has_state(control, "enabled"), _LOOK_SECONDS, f"{name!r} enabled")
        self.click_control(control)

    def click_control(self, control):
        """Clicks the middle of a control, whatever it is and whether or not that does anything."""
        box = self._resting_place(control)
        self.desktop.run(["xdotool", "mousemove", str(box.x + box.width // 2),
                          str(box.y + box.height // 2), "click", "1"])

    def double_click(self, role, name):
        self.click(role, name)
        self.desktop.run(["xdotool", "click", "1"])

    def open_menu(self, button=None):
        """Opens the menu of that button, or else of the button with the focus.

        Qt keeps the menu from the accessibility bus: use it with keys.
        """
        windows = self._window_count()
        if button:
            self.click("push button", button)
        else:
            self.press("space")
        wait_for(lambda: self._window_count() > windows, _LOOK_SECONDS,
                 f"the menu of {button or 'the focused button'!r}")

    def choose_from_menu(self, button, item):
        """Opens a button's menu and takes its `item`th entry."""
        self.open_menu(button)
        self.press(*["Down"] * item, "Return")

    def press(self, *keys):
        """Presses keys by their X names, such as "Return" or "alt+F4"."""
        self.desktop.run(["xdotool", "key", "--clearmodifiers", *keys])

    def close_window(self):
        """Asks the window manager to close the window in use."""
        self.press("alt+F4")

    def wait_for_end(self, seconds=_LOOK_SECONDS):
        """The program's exit status once it has ended."""
        return self.process.wait(seconds)

    def is_running(self):
        return self.process.poll() is None

    # How it looks.

    def _alive(self):
        if self.process.poll() is not None:
            raise RuntimeError(f"the program has ended with status {self.process.returncode}")
        return True

    def _resting_place(self, control):
        """Where a control is when it no longer moves: a new window is put in its place late."""
        place = None

        def rests():
            nonlocal place
            time.sleep(0.05)
            box = control.get_component_iface().get_extents(self._atspi.CoordType.SCREEN)
            before, place = place, (box.x, box.y, box.width, box.height)
            return place == before and box

        return wait_for(rests, _LOOK_SECONDS, f"{control.get_name()!r} at rest")

    def round_trip(self):
        """The seconds in which the program answers; those of waiting for a processor are taken off.

        None when it does not answer, having ended.
        """
        waits = [pathlib.Path(f"/proc/{pid}/schedstat") for pid in (self.process.pid, "self")]

        def waited():
            return sum(int(file.read_text().split()[1]) for file in waits) / 1e9

        try:
            began, waited_before = time.monotonic(), waited()
            self._ask()
            return time.monotonic() - began - (waited() - waited_before)
        except (OSError, *self.errors):
            return time.monotonic() - began if self.is_running() else None

    def _ask(self):
        """Asks the program something small and waits for the answer."""
        frame = self._application().get_child_at_index(0)
        frame.get_component_iface().get_extents(self._atspi.CoordType.SCREEN)

    def _window_count(self):
        return len(self.desktop.run(["xdotool", "search", "--onlyvisible", "--pid",
                                     str(self.process.pid)]).split())

    def _application(self):
        screen = self._atspi.get_desktop(0)
        try:
            for index in range(screen.get_child_count()):
                application = screen.get_child_at_index(index)
                if application and application.get_process_id() == self.process.pid:
                    return application
        except self.errors:
            pass
        return None

    def _certainly_gone(self, role, name):
        """A program that is busy answers nothing, which must not pass for nothing there."""
        self._overlooked = False
        found = self.sees(role, name)
        return not found and (not self._overlooked or not self.is_running())

    def _look(self, role, name):
        match = []

        def visit(control):
            if _is(control, role, name):
                match.append(control)
            return not match

        self._visit(self._application(), visit, tables=role in _IN_TABLES)
        return match[0] if match else None

    def _visit(self, control, visit, tables=True):
        """Shows `visit` what is on the screen, depth first; objects that vanish are passed over."""
        if control is None:
            self._overlooked = True
            return True
        try:
            role = control.get_role_name()
            is_application = role == "application"
            if not is_application and not self.has_state(control, "showing"):
                return True
            if not is_application and visit(control) is False:
                return False
            if role in _TABLES and not tables:
                return True
            children = [control.get_child_at_index(i) for i in range(control.get_child_count())]
        except self.errors:
            self._overlooked = True
            return True
        return all(self._visit(child, visit, tables) for child in children)
