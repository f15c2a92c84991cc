"""Detects silences, the periods in which a program's main loop does not answer requests."""

import dataclasses
import multiprocessing
import os
import pathlib
import time

PERIOD = 0.02  # seconds between two requests
NOTED = 0.05   # seconds; shorter silences are not recorded
PATIENCE = 120  # seconds until a request fails; every expected silence is shorter


@dataclasses.dataclass(frozen=True)
class Silence:
    """A period in which the main loop did not answer a request."""

    began: float      # time.monotonic()
    seconds: float    # excludes waits for a free processor
    processor: float  # seconds that the main thread spent computing

    def __str__(self):
        return (f"{self.seconds:.2f} s, of which {self.processor:.2f} s computing and "
                f"{max(0, self.seconds - self.processor):.2f} s waiting for an answer")


class Ear:
    """A context manager that records the silences of the program that `person` uses. A separate
    process sends the requests. The program's window must already be visible."""

    def __init__(self, person):
        context = multiprocessing.get_context("spawn")
        self._heard, writer = context.Pipe(duplex=False)
        self._silences = []
        # The process finds the accessibility bus through the environment that Person has set.
        self._process = context.Process(target=_listen, args=(person.process.pid, writer),
                                        daemon=True)

    def __enter__(self):
        self._process.start()
        return self

    def __exit__(self, *_):
        self._process.terminate()
        self._process.join()

    def silences(self, since=0):
        """Returns the silences that began at or after `since` and have ended."""
        while self._heard.poll():
            self._silences.append(self._heard.recv())
        if not self._process.is_alive():
            raise RuntimeError("the process that listens to the wizard's main loop has exited")
        return [one for one in self._silences if one.began >= since]

    def longest(self, since=0):
        """Returns the longest of silences(since), or None if there is none."""
        return max(self.silences(since), key=lambda one: one.seconds, default=None)


def _listen(process, heard):
    import gi
    gi.require_version("Atspi", "2.0")
    from gi.repository import Atspi
    Atspi.set_timeout(PATIENCE * 1000, PATIENCE * 1000)
    component = _application(Atspi, process).get_child_at_index(0).get_component_iface()
    schedules = [pathlib.Path(f"/proc/{pid}/schedstat") for pid in (process, os.getpid())]
    while True:
        began = time.monotonic()
        computed_before, waited_before = _schedule(schedules)
        component.get_extents(Atspi.CoordType.SCREEN)
        took = time.monotonic() - began
        if took > NOTED:
            computed, waited = _schedule(schedules)
            silent = took - (waited - waited_before)
            if silent > NOTED:
                heard.send(Silence(began, silent, computed - computed_before))
        time.sleep(PERIOD)


def _application(atspi, process):
    screen = atspi.get_desktop(0)
    for index in range(screen.get_child_count()):
        application = screen.get_child_at_index(index)
        if application and application.get_process_id() == process:
            return application
    raise RuntimeError(f"process {process} is not on the accessibility bus")


def _schedule(files):
    """Reads schedstat files, each of which describes one thread. Returns two times in seconds: how
    long the first thread has computed, and how long all threads together have waited for a
    processor."""
    times = [[int(field) / 1e9 for field in file.read_text().split()[:2]] for file in files]
    return times[0][0], sum(waited for _, waited in times)
