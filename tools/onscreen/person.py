"""A simulated person at the screen, who finds controls by their accessible roles and names, and
uses mouse and keyboard."""

import os
import pathlib
import subprocess
import time

from .processes import InVain, start, stop, wait_for

_LOOK_SECONDS = 20
_KEYBOARD_SECONDS = 10
# Qt creates an object for each table cell that a search visits, and never frees the object. So a
# search for a control enters tables only if the control can be part of a table.
_TABLES = ("list", "table", "tree", "tree table")
_IN_TABLES = ("list item", "table cell", "table column header")
_COLUMNS = 3


def _is(control, role, name):
    """Returns whether the control has the role and the name. If `name` is None, any name will do.

    A heading also counts as a label. A table cell may have the accessible name "NAME, ADDRESS", which
    matches the name "NAME".
    """
    own_role = control.get_role_name()
    if own_role != role and (own_role, role) != ("heading", "label"):
        return False
    own_name = control.get_name()
    return name in (None, own_name) or (
        role == "table cell" and own_name.startswith(f"{name}, "))


def _words(role, name):
    return f"the {role} {name!r}" if name else f"a {role}"


class Person:
    """A person who uses one program. The constructor starts the program on a desktop, and leaving
    the object's context stops the program.
    """

    follows_desktop = True  # whether the program uses the desktop's text size, scale and colours

    def __init__(self, desktop, program, arguments=(), env=None):
        self.desktop = desktop
        # The accessibility library reads the bus's address once, from this process's environment.
        os.environ.update({name: desktop.env[name]
                           for name in ("DBUS_SESSION_BUS_ADDRESS", "DISPLAY", "XDG_RUNTIME_DIR")})
        import gi
        gi.require_version("Atspi", "2.0")
        from gi.repository import Atspi, GLib
        self._atspi = Atspi
        self.errors = GLib.Error, AttributeError  # raised by the use of a control that no longer exists
        self._overlooked = False
        self.process = start([str(program), *arguments], env=desktop.env | (env or {}))

    def __enter__(self):
        return self

    def __exit__(self, *_):
        stop(self.process)

    # Looking at the screen.

    def see(self, role, name=None, seconds=_LOOK_SECONDS):
        """Waits until a control with this role and name is on the screen, and returns the control.

        Raises TimeoutError if that takes longer than `seconds`, and RuntimeError when the program
        has exited.
        """
        return wait_for(lambda: self._alive() and self._look(role, name), seconds,
                        _words(role, name))

    def sees(self, role, name=None):
        """Returns whether a control with this role and name is on the screen now."""
        return self._look(role, name) is not None

    def see_gone(self, role, name=None, seconds=_LOOK_SECONDS):
        """Waits until no control with this role and name is on the screen."""
        wait_for(lambda: self._certainly_gone(role, name), seconds,
                 f"{_words(role, name)} to disappear")

    def everything(self):
        """Returns a tuple (role, name, control) for each control on the screen."""
        found = []
        self._visit(self._application(), lambda c: found.append(
            (c.get_role_name(), c.get_name(), c)))
        return found

    def rows(self):
        """Returns a tuple of texts for each row of the device table on the screen."""
        cells = [name for role, name, _ in self.everything() if role == "table cell"]
        rows = zip(*(cells[column::_COLUMNS] for column in range(_COLUMNS)))
        return [(row[0].removesuffix(f", {row[-1]}"), *row[1:]) for row in rows]

    def has_state(self, control, state):
        """Returns whether the control is in `state`, such as "enabled", "focused" or "selected"."""
        return control.get_state_set().contains(getattr(self._atspi.StateType, state.upper()))

    def picture(self, path):
        """Waits briefly for the screen to settle, then saves a picture of it."""
        time.sleep(0.3)
        self.desktop.picture(path)

    # Using the mouse and the keyboard.

    def click(self, role, name=None):
        """Waits until the control is enabled, and clicks its middle."""
        control = self.see(role, name)
        wait_for(lambda: self.has_state(control, "enabled"), _LOOK_SECONDS,
                 f"{_words(role, name)} to be enabled")
        self.click_control(control)

    def click_control(self, control):
        """Clicks the middle of a control, even if it is disabled."""
        box = self._resting_place(control)
        self.desktop.run(["xdotool", "mousemove", str(box.x + box.width // 2),
                          str(box.y + box.height // 2), "click", "1"])

    def double_click(self, role, name):
        self.click(role, name)
        self.desktop.run(["xdotool", "click", "1"])

    def act(self, role, name):
        """Performs the first action of a control over the accessibility bus, without mouse or
        keyboard."""
        def acts():
            control = self.see(role, name)
            return self.has_state(control, "enabled") and control.get_action_iface().do_action(0)

        wait_for(acts, _LOOK_SECONDS, f"the action of {role} {name!r}")

    def open_menu(self, button=None):
        """Opens the menu of the button named `button` or, if that is None, of the focused button.

        The menu does not appear on the accessibility bus, so only the keyboard can control it here.
        """
        windows = self._window_count()
        if button:
            self.click("push button", button)
        else:
            self.press("space")
        wait_for(lambda: self._window_count() > windows, _LOOK_SECONDS,
                 f"the menu of {repr(button) if button else 'the focused button'} to open")

    def choose_from_menu(self, button, item):
        """Opens a button's menu and chooses entry number `item`, counted from 1."""
        self.open_menu(button)
        self.choose_from_open_menu(item)

    def choose_from_open_menu(self, item):
        self.press(*["Down"] * item, "Return")

    def press(self, *keys):
        """Waits a while for the program to get the keyboard focus. Then presses the keys one after
        another. Each key is given by its X name, such as "Return" or "alt+F4"."""
        try:
            wait_for(self._has_keyboard, _KEYBOARD_SECONDS, "the program to get the keyboard")
        except InVain:
            pass  # pressed anyway, because it is not always possible to learn who has the keyboard
        self.desktop.run(["xdotool", "key", "--clearmodifiers", *keys])

    def close_window(self):
        """Asks the window manager to close the active window."""
        self.press("alt+F4")

    def wait_for_end(self, seconds=_LOOK_SECONDS):
        """Waits for the program to exit and returns its exit status."""
        return self.process.wait(seconds)

    def is_running(self):
        return self.process.poll() is None

    # Helpers, and a measurement of how fast the program answers.

    def _alive(self):
        if self.process.poll() is not None:
            raise RuntimeError(f"the program has exited with status {self.process.returncode}")
        return True

    def _has_keyboard(self):
        """Returns whether a window of the program has the X input focus. Also returns true when the
        program has exited, because then there is nothing to wait for."""
        owner = subprocess.run(["xdotool", "getwindowfocus", "getwindowpid"], env=self.desktop.env,
                               capture_output=True, text=True)
        return not self.is_running() or owner.stdout.strip() == str(self.process.pid)

    def _resting_place(self, control):
        """Waits until the control no longer moves, and returns its extents on the screen.

        The window manager may move a new window shortly after the window appears.
        """
        place = None

        def rests():
            nonlocal place
            time.sleep(0.05)
            box = control.get_component_iface().get_extents(self._atspi.CoordType.SCREEN)
            before, place = place, (box.x, box.y, box.width, box.height)
            return place == before and box

        return wait_for(rests, _LOOK_SECONDS, f"{control.get_name()!r} to stop moving")

    def round_trip(self):
        """Returns how many seconds the program takes to answer a small request on the accessibility
        bus, without the time that the program and this process wait for a processor.

        If the request fails, returns the time until the failure, or None if the program has exited.
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
        """Sends the program a small request and waits for the answer."""
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
        """Returns True only if it is certain that no control with this role and name is on the screen.

        A program that is too busy to answer may still show the control.
        """
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
        """Calls `visit` for `control` and all visible controls inside it, depth first, until a call
        returns False. Does not call `visit` for the application itself.

        Skips controls that disappear. Enters tables only if `tables` is true. Returns False if a call
        returned False, otherwise True.
        """
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
