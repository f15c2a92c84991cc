#!/usr/bin/python3
"""The wizard's chooser while devices come, go and change for minutes on end.

Usage: soak.py [--seconds S] [--events N] [--seed N] MEDIUM

Searches again all the time, and tells how the wizard's memory and its waits have gone. Wrong is: an
end, a wait that outlives its five pauses, a list that in the end is not what is there, memory that
grows from the first fifth to the last by more than a few hundredths, and an exit status other than 0
when the window is closed, such as that of a build with a leak checker. With a sanitizer's options in
the environment, memory is not judged: that which a sanitizer keeps for itself grows.
"""

import argparse
import os
import pathlib
import random
import statistics
import sys
import tempfile
import time

import media
from media import model
from way import BUILT, GEAR, GEAR_REFRESH, PRACTICE_NETWORK, TEXT, WIRED, WIRELESS
from onscreen.desktop import Desktop
from onscreen.person import Person
from practice_network import PracticeNetwork

LONGEST_WAIT = 15 + 5  # seconds: five pauses, and what a loaded machine takes to show their end
MOST_GROWTH = 1.05
CHECKERS = {name: value for name, value in os.environ.items() if name.endswith("SAN_OPTIONS")}
PRINTER, OTHER = "_pdl-datastream._tcp", "_ipp._tcp"


class Crowd:
    """A dozen devices that answer all the time, and are there or not."""

    def __init__(self, seed):
        self.network = PracticeNetwork()
        self.dice = random.Random(seed)
        self.events = 0
        self.wireless = {}
        self.there = {}
        for number in range(12):
            name = f"Soak no. {number:02}"
            self.wireless[name] = number % 4 != 3
            self.there[name] = True
            self.network.add(name, maker="Kestrel", model="Soak",
                             activeif=WIRELESS if self.wireless[name] else WIRED)
        self.network.settle()

    def change(self):
        self.events += 1
        name = self.dice.choice(list(self.there))
        if self.dice.random() < 0.7:
            self.there[name] = not self.there[name]
            self.network.set(name, type=PRINTER if self.there[name] else OTHER)
        else:
            self.network.set(name, note=f"event {self.events}")

    def to_be_listed(self):
        return sorted(name for name, there in self.there.items() if there and self.wireless[name])


def memory(person):
    status = pathlib.Path(f"/proc/{person.process.pid}/status").read_text(encoding="ascii")
    return int(status.split("VmRSS:")[1].split()[0]) / 1024


def search_again(person):
    """The seconds that the search's wait took."""
    person.choose_from_menu(GEAR, GEAR_REFRESH)
    began = time.monotonic()
    person.see("label", TEXT["INST_WAIT"])
    person.see_gone("label", TEXT["INST_WAIT"], 60)
    waited = time.monotonic() - began
    if person.sees("label", TEXT["INST_TXT_ALERT_DEVICENOTFOUND"]):
        person.press("Return")
        person.see_gone("label", TEXT["INST_TXT_ALERT_DEVICENOTFOUND"])
    return waited


def soak(person, crowd, options):
    """The waits of all searches, and the wizard's memory after each."""
    waits, sizes = [], []
    began = time.monotonic()
    while (passed := time.monotonic() - began) < options.seconds or crowd.events < options.events:
        while crowd.events < options.events * passed / options.seconds:
            crowd.change()
        waits.append(search_again(person))
        sizes.append(memory(person))
    return waits, sizes


def judge(person, crowd, waits, sizes):
    crowd.network.settle()
    time.sleep(3)
    search_again(person)
    time.sleep(3)
    listed = [name for name, _, _ in person.rows()]
    fifth = max(1, len(sizes) // 5)
    first, last = statistics.median(sizes[:fifth]), statistics.median(sizes[-fifth:])
    print(f"{crowd.events} events, {len(waits)} searches; longest wait {max(waits):.1f} s; memory "
          f"{first:.1f} MiB in the first fifth, {last:.1f} MiB in the last; listed {len(listed)}")
    wrong = []
    if max(waits) > LONGEST_WAIT:
        wrong.append("a wait outlived its pauses")
    if last > first * MOST_GROWTH and not CHECKERS:
        wrong.append("memory grew")
    if listed != crowd.to_be_listed():
        wrong.append(f"listed {listed}, there {crowd.to_be_listed()}")
    person.close_window()
    if status := person.wait_for_end(60):
        wrong.append(f"it ended with status {status}")
    return wrong


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--seconds", type=float, default=600)
    parser.add_argument("--events", type=int, default=1000)
    parser.add_argument("--seed", type=int, default=1)
    options = parser.parse_args()
    if "ONRAMP_PRACTICE_SOCKET" not in os.environ:
        os.execv(sys.executable, [sys.executable, PRACTICE_NETWORK, "/dev/null", sys.executable,
                                  *sys.argv, BUILT])
    crowd = Crowd(options.seed)
    with Desktop() as desktop, tempfile.TemporaryDirectory() as folder:
        medium = media.make(pathlib.Path(folder) / "medium", BUILT,
                            {"Kestrel Soak": model(usb=True, wireless=True)})
        program = medium / "Onramp OSX.app/Contents/Linux/Onramp OSX"
        with Person(desktop, program, env={"LANG": "en_US.UTF-8"} | CHECKERS) as person:
            person.see("label", TEXT["INST_TXT_CONNECTIONTYPE"])
            person.press("Return")
            person.see("label", TEXT["INST_TXT_DEVLIST"], 60)
            waits, sizes = soak(person, crowd, options)
            wrong = judge(person, crowd, waits, sizes)
    sys.exit("; ".join(wrong) or None)


main()
