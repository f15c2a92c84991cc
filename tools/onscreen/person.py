"""A person at the screen: sees the controls by their roles and names, has a mouse and a keyboard."""

import os
import time

from .processes import start, stop, wait_for

_LOOK_SECONDS = 20


class Person:
    """Starts a program on a desktop and uses it. Use it in a `with` statement."""

    def __init__(self, desktop, program, arguments=(), env=None):
        self.desktop = desktop
        # The library takes the bus from the environment of this process, once.
        os.environ.update({name: desktop.env[name]
                           for name in ("DBUS_SESSION_BUS_ADDRESS", "DISPLAY", "XDG_RUNTIME_DIR")})
        import gi
        gi.require_version("Atspi", "2.0")
        from gi.repository import Atspi
        self._atspi = Atspi
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
        wait_for(lambda: not self.sees(role, name), seconds, f"the end of {role} {name!r}")

    def everything(self):
        """(role, name, control) of all that is on the screen."""
        found = []
        self._visit(self._application(), lambda c: found.append(
            (c.get_role_name(), c.get_name(), c)))
        return found

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
        box = control.get_component_iface().get_extents(self._atspi.CoordType.SCREEN)
        self.desktop.run(["xdotool", "mousemove", str(box.x + box.width // 2),
                          str(box.y + box.height // 2), "click", "1"])

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

    def _application(self):
        screen = self._atspi.get_desktop(0)
        for index in range(screen.get_child_count()):
            application = screen.get_child_at_index(index)
            if application and application.get_process_id() == self.process.pid:
                return application
        return None

    def _look(self, role, name):
        match = []

        def visit(control):
            if control.get_role_name() == role and name in (None, control.get_name()):
                match.append(control)
            return not match

        self._visit(self._application(), visit)
        return match[0] if match else None

    def _visit(self, control, visit):
        """Shows `visit` what is on the screen, depth first; objects that vanish are passed over."""
        if control is None:
            return True
        try:
            is_application = control.get_role_name() == "application"
            if not is_application and not self.has_state(control, "showing"):
                return True
            if not is_application and visit(control) is False:
                return False
            children = [control.get_child_at_index(i) for i in range(control.get_child_count())]
        except self._gone():
            return True
        return all(self._visit(child, visit) for child in children)

    @staticmethod
    def _gone():
        from gi.repository import GLib
        return GLib.Error
