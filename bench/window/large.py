#!/usr/bin/python3
"""Tries the wizard on large media, on large networks, and with a device that never answers.

Usage: large.py [--medium MEDIUM] [devices] [models] [silent]

MEDIUM is a built medium (default: build/medium of this source tree).

devices  1,000 models and 500 devices
models   10,000 models: the list of models, and then a search with 50 devices
silent   a device that never answers SNMP questions; by design, the window waits for it

For each trial, the program prints whether the lists are right, the times and the peak memory. It
also prints the longest silence, a period in which the main loop did not answer requests. The exit
status is 1 if a list is wrong.
"""

import argparse
import itertools
import pathlib
import sys
import tempfile
import time

from chooser import MAKER, ROOT, WAIT_SECONDS, Chooser, enter_network, require_medium
from ear import Ear

import media
from onscreen import messages
from onscreen.desktop import Desktop
from onscreen.processes import wait_for
from practice_network import PracticeNetwork

SEARCHES = 3
LOOKS_AT_ALL = 25  # one look in this many reads the whole window; the others only count the rows


class Trial:
    """A medium with `models` models, and devices that add() puts on the network."""

    def __init__(self, desktop, built, folder, models, last_differs=False):
        self._desktop, self._text = desktop, messages.read(built, "en")
        self._network = PracticeNetwork()
        self._devices = {}
        self._medium = media.make(folder, built, {
            f"{MAKER} Model {number:05}": media.model(
                usb=True, wired=last_differs and number + 1 < models, wireless=True)
            for number in range(models)})

    def person(self):
        return Chooser(self._desktop, self._medium, self._text)

    def add(self, name, number, answer=2):
        self._devices[name] = answer
        self._network.add(name, maker=MAKER, model=f"Model {number:05}", activeif=answer)

    def settle(self):
        self._network.settle(120)

    def remove_all(self):
        for name in self._devices:
            self._network.remove(name)

    def search(self, what):
        """Searches a few times. Returns whether every list had only expected devices, each at most
        once.

        A list may be incomplete: the wizard ends a search after three seconds if the list has a
        device by then.
        """
        expected = sorted(name for name, answer in self._devices.items() if answer == 2)
        right = True
        with self.person() as person:
            person.go_there()
            table = person.table()
            with Ear(person) as ear:
                for _ in range(SEARCHES):
                    began = person.refresh()
                    complete = _seconds_until_listed(person, table, len(expected), began)
                    person.wait()
                    listed = person.names()
                    right &= len(set(listed)) == len(listed) and set(listed) <= set(expected)
                    report(what, f"{len(listed)} of {len(expected)} listed after {complete:.2f} s",
                           person, ear, began)
        print(f"{what}: the lists are {'right' if right else 'WRONG'}", flush=True)
        return right


def _seconds_until_listed(person, table, count, began):
    """Waits until the list, once emptied, has `count` rows again or the search has ended. Returns
    the seconds from `began` to the last change that was seen in the list."""
    emptied = False
    last, changed = table.get_n_rows(), began
    for look in itertools.count():
        looks_at_all = look % LOOKS_AT_ALL == 0
        searching = looks_at_all and person.is_searching()
        rows = table.get_n_rows()
        if rows != last or searching and not emptied:
            changed = time.monotonic()
        # A running search is proof enough, because the list may be refilled between two looks.
        emptied = emptied or searching or rows < last or rows == 0
        last = rows
        if emptied and (rows == count or looks_at_all and not searching):
            return changed - began
        if time.monotonic() - began > WAIT_SECONDS:
            raise TimeoutError("the search did not end")
        time.sleep(0.02)  # the wizard spends some time on each look at the table


def report(what, figures, person, ear, since=0):
    status = pathlib.Path(f"/proc/{person.process.pid}/status").read_text()
    peak = int(status.split("VmHWM:")[1].split()[0]) / 1024
    time.sleep(0.3)  # until the Ear has recorded a silence that has just ended
    silence = ear.longest(since)
    print(f"{what}: {figures}; longest silence {silence or 'less than 0.05 s'}; "
          f"peak memory {peak:.1f} MiB", flush=True)


def try_devices(desktop, built, folder):
    trial = Trial(desktop, built, folder, models=1000)
    for number in range(500):
        trial.add(f"Device {number:03}", 2 * number)
    trial.settle()
    right = trial.search("1,000 models, 500 devices")
    trial.remove_all()
    return right


def try_models(desktop, built, folder):
    what = "10,000 models"
    trial = Trial(desktop, built, folder / "list", models=10000, last_differs=True)
    with trial.person() as person:
        began = time.monotonic()
        person.see("push button", "Next", WAIT_SECONDS)
        shown = time.monotonic() - began
        with Ear(person) as ear:
            last = person.see("list").get_child_at_index(9999)
            since = time.monotonic()
            person.press("End")
            wait_for(lambda: person.has_state(last, "selected"), 20,
                     "the last model to be selected")
            report(what, f"list of models after {shown:.2f} s, End key to the last model "
                   f"{time.monotonic() - since:.2f} s", person, ear, since)
    trial = Trial(desktop, built, folder / "search", models=10000)
    for number in range(50):
        trial.add(f"Device {number:03}", 200 * number)
    trial.settle()
    right = trial.search(f"{what}, 50 devices")
    trial.remove_all()
    return right


def try_silent(desktop, built, folder):
    trial = Trial(desktop, built, folder, models=100)
    trial.add("Answers", 1)
    trial.add("Swallows", 2, "silent")
    trial.settle()
    right = trial.search("2 devices, one of which never answers")
    trial.remove_all()
    return right


TRIALS = {"devices": try_devices, "models": try_models, "silent": try_silent}


def main():
    parser = argparse.ArgumentParser(
        usage="large.py [--medium MEDIUM] [devices] [models] [silent]",
        description=__doc__[__doc__.index("devices  "):],
        formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--medium", default=ROOT / "build/medium")
    parser.add_argument("trials", nargs="*", metavar="TRIAL")
    options = parser.parse_args()
    for name in options.trials:
        if name not in TRIALS:
            parser.error(f"there is no trial {name!r}; the trials are {', '.join(TRIALS)}")
    built = require_medium(options.medium)
    enter_network()
    right = True
    with Desktop() as desktop, tempfile.TemporaryDirectory() as folder:
        for name in options.trials or TRIALS:
            right &= TRIALS[name](desktop, built, pathlib.Path(folder) / name)
    return not right


if __name__ == "__main__":
    sys.exit(main())
