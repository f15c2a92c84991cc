"""Child processes that are killed when this process exits."""

import ctypes
import signal
import subprocess
import time

_PR_SET_PDEATHSIG = 1
_libc = ctypes.CDLL(None, use_errno=True)


class Missing(Exception):
    """Raised when a program is not installed or does not start. The message says what is
    missing."""


class InVain(TimeoutError):
    """Raised when an awaited event does not happen in time. `what` describes the event."""

    def __init__(self, seconds, what):
        super().__init__(f"gave up after waiting {seconds} s for {what}")
        self.what = what


def _die_with_parent():
    _libc.prctl(_PR_SET_PDEATHSIG, signal.SIGKILL)


def start(arguments, package=None, **options):
    """Starts a program. Raises Missing if that fails. If the program is not installed, the error
    names `package`, the Debian package that contains it."""
    try:
        return subprocess.Popen(arguments, preexec_fn=_die_with_parent, **options)
    except FileNotFoundError as error:
        hint = f"; install it with: apt-get install {package}" if package else ""
        raise Missing(f"{arguments[0]} was not found{hint}") from error
    except OSError as error:
        raise Missing(f"{arguments[0]} cannot be started: {error.strerror}") from error


def stop(process):
    """Terminates a process that start() returned. Kills it if it is still running after five seconds."""
    if process.poll() is None:
        process.terminate()
        try:
            process.wait(5)
        except subprocess.TimeoutExpired:
            process.kill()
            process.wait()


def wait_for(condition, seconds, what):
    """Calls `condition` until it returns a true value, and returns this value.

    Raises InVain if that takes longer than `seconds`. The error's message contains `what`, which
    describes the event.
    """
    deadline = time.monotonic() + seconds
    while True:
        value = condition()
        if value:
            return value
        if time.monotonic() > deadline:
            raise InVain(seconds, what)
        time.sleep(0.02)
