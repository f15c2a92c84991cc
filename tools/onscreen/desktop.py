"""A virtual desktop: a display, a window manager, a session bus and a separate home folder."""

import os
import pathlib
import random
import shutil
import subprocess
import tempfile

from .processes import Missing, start, stop, wait_for

_SIZE = "1366x768"  # the smallest screen that the wizard must fit on
_TWICE_THE_DENSITY = "2732x1536"
# Each program that a desktop needs, and the Debian package that contains it.
_PROGRAMS = {"Xvfb": "xvfb", "openbox": "openbox", "xprop": "x11-utils", "xdotool": "xdotool",
             "import": "imagemagick", "mogrify": "imagemagick", "dbus-daemon": "dbus"}
_ACCESSIBILITY_BUS = pathlib.Path("/usr/share/dbus-1/services/org.a11y.Bus.service")


def check_packages():
    """Raises Missing if something that Desktop or Person needs is not installed. The error names
    the Debian packages."""
    packages = {package for name, package in _PROGRAMS.items() if not shutil.which(name)}
    if not _ACCESSIBILITY_BUS.exists():
        packages.add("at-spi2-core")
    try:
        import gi
        gi.require_version("Atspi", "2.0")
    except (ImportError, ValueError):
        packages |= {"python3-gi", "gir1.2-atspi-2.0"}
    if packages:
        raise Missing("the virtual display needs more packages; install them: apt-get install "
                      + " ".join(sorted(packages)))


def _free_display():
    """Returns a random display number that no X server uses.

    An X server cannot detect a server with the same number in another network namespace, and would
    remove that server's socket. So this function looks for the socket.
    """
    while True:
        number = random.randrange(100, 50000)
        if not pathlib.Path(f"/tmp/.X11-unix/X{number}").exists():
            return number


class Desktop:
    """A context manager that starts a desktop, and stops its programs at the end.

    On the desktop, xdg-open only records the path or address that it should open. A process can use
    only one desktop, because its accessibility library stays connected to the first desktop's bus.
    If `window_manager` is false, the desktop has no window manager. If `dense` is true, the screen
    is large enough for the wizard at a scale of 200 %.
    """

    def __init__(self, window_manager=True, dense=True):
        self._window_manager = window_manager
        self._size = _TWICE_THE_DENSITY if dense else _SIZE
        self._processes = []
        self._folder = None
        self.env = {}

    def __enter__(self):
        self._folder = pathlib.Path(tempfile.mkdtemp(prefix="onramp-desktop-"))
        try:
            self._make_home()
            self._start_bus()
            self._start_display()
        except BaseException:
            self.__exit__()
            raise
        return self

    def __exit__(self, *_):
        for process in reversed(self._processes):
            stop(process)
        shutil.rmtree(self._folder, ignore_errors=True)

    @property
    def user_folder(self):
        """The folder of the user's own application-support files."""
        return self._folder / "user"

    @property
    def local_folder(self):
        """The folder of the application-support files for all users."""
        return self._folder / "local"

    def opened(self):
        """Returns the paths and addresses that xdg-open has recorded."""
        record = self._folder / "opened"
        return record.read_text().splitlines() if record.exists() else []

    def forget(self):
        """Removes the application-support files and the record of opened paths and addresses."""
        for folder in (self.user_folder, self.local_folder):
            shutil.rmtree(folder, ignore_errors=True)
        (self._folder / "opened").unlink(missing_ok=True)

    def run(self, arguments, **options):
        """Runs a program to its end and returns its output. Raises CalledProcessError if the
        program fails."""
        done = subprocess.run(arguments, env=self.env, check=True, stdout=subprocess.PIPE,
                              text=True, **options)
        return done.stdout

    def picture(self, path):
        """Saves a picture of the windows on the screen, without the empty desktop around them."""
        path.parent.mkdir(parents=True, exist_ok=True)
        self.run(["import", "-silent", "-window", "root", str(path)])
        self.run(["mogrify", "-bordercolor", "white", "-border", "1", "-trim", "+repage",
                  str(path)])

    def _make_home(self):
        for name in ("home", "run", "bin", "user", "local"):
            (self._folder / name).mkdir(mode=0o700)
        opener = self._folder / "bin" / "xdg-open"
        opener.write_text(f"#!/bin/sh\nprintf '%s\\n' \"$1\" >> '{self._folder}/opened'\n")
        opener.chmod(0o755)
        kept = ("LANG", "LANGUAGE", "LC_ALL", "LC_MESSAGES", "ONRAMP_SYSTEM_VERSION")
        self.env = {name: os.environ[name] for name in kept if name in os.environ}
        self.env |= {
            "HOME": str(self._folder / "home"),
            "PATH": f"{self._folder}/bin:{os.environ['PATH']}",
            "XDG_RUNTIME_DIR": str(self._folder / "run"),
            "XDG_DATA_HOME": str(self.user_folder),
            "XDG_DATA_DIRS": f"{self.local_folder}:/usr/local/share:/usr/share",
            "QT_LINUX_ACCESSIBILITY_ALWAYS_ON": "1",
            "NO_AT_BRIDGE": "0",
        }
        for name in ("DBUS_SYSTEM_BUS_ADDRESS", "ONRAMP_PRACTICE_SOCKET"):
            if name in os.environ:
                self.env[name] = os.environ[name]

    def _start(self, arguments, **options):
        process = start(arguments, _PROGRAMS[arguments[0]], env=self.env, stderr=subprocess.DEVNULL, **options)
        self._processes.append(process)
        return process

    def _start_bus(self):
        bus = self._start(["dbus-daemon", "--session", "--nofork", "--print-address"],
                          stdout=subprocess.PIPE, text=True)
        address = bus.stdout.readline().strip()
        if not address:
            raise Missing("dbus-daemon printed no address of a session bus")
        self.env["DBUS_SESSION_BUS_ADDRESS"] = address

    def _start_display(self):
        display = self._start(
            ["Xvfb", f":{_free_display()}", "-displayfd", "1", "-screen", "0", f"{self._size}x24",
             "-noreset", "-wr", "-nolisten", "tcp"],
            stdout=subprocess.PIPE, text=True)
        number = display.stdout.readline().strip()
        if not number:
            raise Missing("Xvfb did not start a display")
        self.env["DISPLAY"] = f":{number}"
        if not self._window_manager:
            return
        self._start(["openbox", "--sm-disable"], stdout=subprocess.DEVNULL)
        wait_for(lambda: "_NET_SUPPORTING_WM_CHECK(WINDOW)" in
                 self.run(["xprop", "-root", "_NET_SUPPORTING_WM_CHECK"]), 10, "openbox to start")
