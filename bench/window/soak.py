#!/usr/bin/python3
"""Lets the wizard search again and again while devices come and go.

Usage: soak.py [--seconds 3600] [--seed 1] [--memory] [MEDIUM]

MEDIUM is a built medium (default: build/medium of this source tree).

After every search, the program counts the rows of the list. The list must have a row for each
wireless device that was present all the time. It may also have rows for devices that came or left.

At every checkpoint, no device comes or goes while the wizard searches up to three times. One of
these searches must list exactly the wireless devices that are present, and none may list any other
device.

The program prints the wizard's memory at each checkpoint, and how the memory grew. It also prints
the longest silences, the periods in which the main loop did not answer requests. The exit status is 1
if a list was wrong.

With --memory, the program checks no list and measures no silence, because both need the
accessibility bus. With that bus, Qt creates objects for cells and never frees them, so the memory
grows.
"""

import argparse
import pathlib
import sys
import tempfile
import time

from blind import BlindChooser
from chooser import MAKER, MODEL, ROOT, Chooser, enter_network, require_medium
from churn import REST, Devices
from ear import Ear

import media
from onscreen import messages
from onscreen.desktop import Desktop
from practice_network import PracticeNetwork

CHECKPOINT_EVERY = 10  # searches
SEARCHES_AT_CHECKPOINT = 3  # at most
WARM_UP = 0.1          # the fraction of the run, from its start, that the growth leaves out


def memory(process):
    """Returns a process's resident memory in KiB and its numbers of descriptors and threads."""
    lines = pathlib.Path(f"/proc/{process}/status").read_text().splitlines()
    status = dict(line.split(":", 1) for line in lines)
    descriptors = len(list(pathlib.Path(f"/proc/{process}/fd").iterdir()))
    return int(status["VmRSS"].split()[0]), descriptors, int(status["Threads"])


def slope(points):
    """Returns the slope of the line that best fits `points`, which are pairs of x and y."""
    middle_x, middle_y = (sum(values) / len(points) for values in zip(*points))
    square = sum((x - middle_x) ** 2 for x, _ in points)
    return sum((x - middle_x) * (y - middle_y) for x, y in points) / square if square else 0


class Record:
    """The wizard's memory over time."""

    def __init__(self, person, devices):
        self._person, self._devices = person, devices
        self.began = time.monotonic()
        self._memory = []  # (seconds, searches, KiB)
        self.searches = 0

    def seconds(self):
        return time.monotonic() - self.began

    def checkpoint(self, *more):
        """Records the memory, and prints a line that ends with `more`."""
        kibibytes, descriptors, threads = memory(self._person.process.pid)
        self._memory.append((self.seconds(), self.searches, kibibytes))
        print(f"{self.seconds():6.0f} s", f"{self.searches:4} searches",
              f"{kibibytes / 1024:6.2f} MiB", f"{descriptors} descriptors", f"{threads} threads",
              *more, sep="  ", flush=True)

    def report(self):
        print(f"{self.seconds():.0f} s, {self.searches} searches, {len(self._devices.changes)} "
              "network changes")
        counted = [one for one in self._memory if one[0] >= WARM_UP * self.seconds()]
        if len(counted) > 1:
            hourly = slope([(seconds / 3600, kibibytes) for seconds, _, kibibytes in counted])
            each = slope([(searches, kibibytes) for _, searches, kibibytes in counted])
            print(f"memory: {counted[0][2] / 1024:.2f} MiB, at the end "
                  f"{counted[-1][2] / 1024:.2f} MiB; growth {hourly:.0f} KiB an hour, "
                  f"{each:.2f} KiB a search")


class Soak:
    def __init__(self, person, ear, devices):
        self._person, self._ear, self._devices = person, ear, devices
        self.record = Record(person, devices)
        self._checkpoints = self._incomplete = self.wrong = 0

    def search(self):
        """Searches while devices come and go, and checks the number of rows in the list."""
        moment = time.monotonic() - REST
        self._person.refresh()
        self._person.wait()
        count = self._person.table().get_n_rows()
        self.record.searches += 1
        least, most = self._devices.bounds(moment)
        if not least <= count <= most:
            self._complain(f"{count} devices are listed, not {least} to {most}")

    def check(self):
        """Searches while no device comes or goes, and compares the list with the wireless
        devices that are present.

        The wizard ends a search after three seconds if the list has a device by then. On a busy
        machine, other devices may be missing. So the search is repeated if the list is incomplete,
        and only the last list must be complete.
        """
        self._devices.rest()
        try:
            for _ in range(SEARCHES_AT_CHECKPOINT):
                self._person.refresh()
                self._person.wait()
                self.record.searches += 1
                listed, there = sorted(self._person.names()), self._devices.wireless()
                if listed == there or not set(listed) < set(there):
                    break
                self._incomplete += 1
                print(f"search {self.record.searches}: only {len(listed)} of {len(there)} devices "
                      "are listed", flush=True)
        finally:
            self._devices.resume()
        self._checkpoints += 1
        if listed != there:
            self._complain(f"missing: {sorted(set(there) - set(listed))}, "
                           f"too many: {sorted(set(listed) - set(there))}, {len(listed)} rows")
        self.record.checkpoint(f"{len(listed):3} listed", f"longest silence {self._ear.longest()}")

    def report(self):
        self.record.report()
        print(f"lists: {self._checkpoints} checkpoints, {self.wrong} wrong lists, "
              f"{self._incomplete} incomplete ones")
        silences = self._ear.silences()
        print(f"silences of the main loop: {len(silences)}, the longest:")
        for silence in sorted(silences, key=lambda one: -one.seconds)[:3]:
            print(f"  {silence}, {silence.began - self.record.began:.0f} s after the start; "
                  f"{self._devices.near(silence) or 'no device came or left'}")

    def _complain(self, what):
        self.wrong += 1
        print(f"search {self.record.searches}: {what}", flush=True)


def soak(desktop, medium, text, devices, seconds):
    """Searches again and again for `seconds` seconds. Returns whether all lists were right."""
    with Chooser(desktop, medium, text) as person:
        person.go_there()
        with Ear(person) as ear:
            run = Soak(person, ear, devices)
            devices.start()
            while run.record.seconds() < seconds:
                for _ in range(CHECKPOINT_EVERY - 1):
                    run.search()
                run.check()
                devices.raise_failure()
            run.report()
    return run.wrong == 0


def soak_blindly(desktop, medium, text, devices, seconds):
    with BlindChooser(desktop, medium, text) as person:
        person.go_there()
        record = Record(person, devices)
        devices.start()
        while record.seconds() < seconds:
            for _ in range(CHECKPOINT_EVERY):
                person.refresh()
                person.wait()
                record.searches += 1
            record.checkpoint()
            devices.raise_failure()
        record.report()
    return True


def main():
    parser = argparse.ArgumentParser(description=__doc__.split("\n\nUsage")[0] + __doc__.split(
        "MEDIUM]")[1], formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--seconds", type=float, default=3600)
    parser.add_argument("--seed", type=int, default=1)
    parser.add_argument("--memory", action="store_true")
    parser.add_argument("medium", nargs="?", default=ROOT / "build/medium")
    options = parser.parse_args()
    built = require_medium(options.medium)
    enter_network()
    run = soak_blindly if options.memory else soak
    with Desktop() as desktop, tempfile.TemporaryDirectory() as folder:
        medium = media.make(pathlib.Path(folder) / "medium", built,
                            {f"{MAKER} {MODEL}": media.model(usb=True, wireless=True)})
        devices = Devices(PracticeNetwork(), options.seed)
        return not run(desktop, medium, messages.read(built, "en"), devices, options.seconds)


if __name__ == "__main__":
    sys.exit(main())
