"""Child processes that end when this process does."""

import ctypes
import signal
import subprocess
import time

_PR_SET_PDEATHSIG = 1
_libc = ctypes.CDLL(None, use_errno=True)


class Missing(Exception):
    """A program is not installed or does not start. The text says which one."""


class InVain(TimeoutError):
    """A wait in vain. `what` says for what."""

    def __init__(self, seconds, what):
        super().__init__(f"waited {seconds} s for {what}, in vain")
        self.what = what


def _die_with_parent():
    _libc.prctl(_PR_SET_PDEATHSIG, signal.SIGKILL)


def start(arguments, package=None, **options):
    """Starts a program; `package` is the Debian package that contains it."""
    try:
        return subprocess.Popen(arguments, preexec_fn=_die_with_parent, **options)
    except FileNotFoundError as error:
        hint = f"; install it with: apt-get install {package}" if package else ""
        raise Missing(f"{arguments[0]} was not found{hint}") from error
    except OSError as error:
        raise Missing(f"{arguments[0]} cannot be started: {error.strerror}") from error


def stop(process):
    """Ends a program that start() returned, by force if it does not end within five seconds."""
    if process.poll() is None:
        process.terminate()
        try:
            process.wait(5)
        except subprocess.TimeoutExpired:
            process.kill()
            process.wait()


def wait_for(condition, seconds, what):
    """Calls condition() until it returns a true value, and returns that.

    Raises InVain when there is none within `seconds`.
    """
    deadline = time.monotonic() + seconds
    while True:
        value = condition()
        if value:
            return value
        if time.monotonic() > deadline:
            raise InVain(seconds, what)
        time.sleep(0.02)
