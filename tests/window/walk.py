#!/usr/bin/python3
"""Takes random walks through the wizard's real window while devices come and go.

Usage: walk.py [--seed S] [--count N] MEDIUM

MEDIUM is the folder of a medium with the application on it. The seeds of the N walks are S, S + 1 and so
on, so `--seed S --count 1` repeats the choices of the walk with the seed S. A walk fails, for example,
when the program exits with an error, when the main loop hangs, when the window cannot be closed at the
end, or when the wizard writes an incomplete file for the installer package. A failed walk prints its seed
and its steps.
"""

import argparse
import multiprocessing
import os
import pathlib
import plistlib
import random
import sys
import tempfile
import time

import media
from media import model
from way import BUILT, PRACTICE_NETWORK, Person
from onscreen.desktop import Desktop
from practice_network import PracticeNetwork

AT_A_TIME = 4
STEPS = 14
PATIENCE = 60
HANG = 10  # seconds; the devices answer at once, so the main loop should never be busy that long
CLICKABLE = ("push button", "list item", "radio button", "table cell", "menu item")
KEYS = {"Tab": 1, "shift+Tab": 1, "Return": 3, "space": 1, "Up": 1, "Down": 1, "Home": 1, "End": 1,
        "F10": 0.5, "Escape": 0.2}
PRINTER = "_pdl-datastream._tcp"
# The weights of the controls in random clicks. A control that is not listed has the weight 1. With
# equal weights, most walks would end early. Hide is never clicked, because the desktop has no task
# bar that could bring the window back.
WEIGHTS = {"Hide": 0, "Cancel": 0.1, "USB": 0.3, "Kestrel Cable": 0.2, "Onramp OSX": 0.2,
           "Quit": 0.1, "Next": 4, "Actions": 2}
# Values for a device's `activeif`. With each of them, the device answers at once, so the wizard
# never waits for an answer.
ANSWERS = (2, 2, 2, 1, "missing", "text")


class Wrong(Exception):
    pass


class Walk:
    def __init__(self, desktop, network, seed):
        self.desktop, self.network = desktop, network
        self.kind = f"Walk {seed}"
        self.dice = random.Random(seed)
        self.steps = []
        self.devices = {}

    def take(self):
        self.desktop.forget()
        with tempfile.TemporaryDirectory() as folder:
            models = {f"Kestrel {self.kind}": model(usb=True, wireless=True)}
            if self.dice.random() < 0.5:
                models["Kestrel Cable"] = model(usb=True)
            medium = media.make(pathlib.Path(folder) / "medium", BUILT, models,
                                tool_status=self.dice.choice((0, 1, 1, 2, 9)))
            program = medium / "Onramp OSX.app/Contents/Linux/Onramp OSX"
            with Person(self.desktop, program, env={"LANG": "en_US.UTF-8"}) as person:
                try:
                    person.see("push button", "Next", PATIENCE)
                    for _ in range(2):
                        self.change_devices(person)
                    self.walk(person)
                    self.leave(person)
                finally:
                    for name in self.devices:
                        self.network.remove(name)
        self.check_files()

    def walk(self, person):
        for _ in range(STEPS):
            step = self.dice.choices((self.click, self.press, self.change_devices, self.close),
                                     (8, 5, 5, 0.3))[0]
            try:
                step(person)
            except person.errors:
                pass  # The control is gone.
            self.listen(person, self.dice.choice((0, 0.1, 1)))
            self.check_files()
            if not person.is_running():
                return

    def click(self, person):
        shown = person.everything()
        controls = [one for one in shown if one[0] in CLICKABLE and one[1]]
        if not controls:
            return
        weights = [WEIGHTS.get(name, 1) for _, name, _ in controls]
        role, name, control = self.dice.choices(controls, weights)[0]
        self.steps.append(f"click {role} {name!r}")
        person.click_control(control)

    def press(self, person):
        keys = self.dice.choices(tuple(KEYS), tuple(KEYS.values()), k=self.dice.randint(1, 3))
        self.steps.append(f"press {keys}")
        person.press(*keys)

    def close(self, person):
        self.steps.append("close")
        person.close_window()

    def change_devices(self, _):
        name = f"{self.kind} no. {self.dice.randint(1, 4)}"
        self.steps.append(f"change {name!r}")
        if name not in self.devices:
            self.network.add(name, maker="Kestrel", model=self.kind,
                             activeif=self.dice.choice(ANSWERS))
            self.devices[name] = True
        elif self.dice.random() < 0.5:
            # Switches between the wizard's service type and another one, so the device leaves or
            # returns. A removed device could not answer, but the wizard may still ask it.
            self.devices[name] = not self.devices[name]
            self.network.set(name, type=PRINTER if self.devices[name] else "_ipp._tcp")
        else:
            self.network.set(name, note=f"after step {len(self.steps)}")

    def listen(self, person, seconds):
        """Waits for `seconds`, or until the program exits. Raises Wrong if the main loop hangs."""
        until = time.monotonic() + seconds
        while True:
            silent = person.round_trip()
            if silent is None:
                return
            if silent > HANG:
                raise Wrong(f"the main loop was silent for {silent:.2f} s")
            if time.monotonic() >= until:
                return
            time.sleep(0.05)

    def leave(self, person):
        """Closes the program. Retries, because the window cannot be closed during a search."""
        until = time.monotonic() + PATIENCE
        while person.is_running():
            if time.monotonic() > until:
                raise Wrong("the window cannot be closed")
            person.press("Escape")  # closes a sheet or a menu
            person.close_window()
            time.sleep(0.3)
        if person.wait_for_end() != 0:
            raise Wrong(f"the program exited with status {person.wait_for_end()}")

    def check_files(self):
        for folder in (self.desktop.user_folder, self.desktop.local_folder):
            for file in folder.rglob("com.kestrelimaging.*.plist"):
                try:
                    content = plistlib.loads(file.read_bytes())
                except FileNotFoundError:
                    continue
                except Exception as error:
                    raise Wrong(f"{file.name} cannot be read: {error}") from error
                if not {"Model", "Interface"} <= content.keys() and "PKG_FontSet" not in content:
                    raise Wrong(f"{file.name} lacks keys: {content}")


def take_walks(seeds):
    """Takes walks one after another. Returns whether all of them passed."""
    network = PracticeNetwork()
    passed = True
    with Desktop() as desktop:
        for seed in seeds:
            walk = Walk(desktop, network, seed)
            try:
                walk.take()
                print(f"walk {seed}: ok, {len(walk.steps)} steps", flush=True)
            except (Wrong, RuntimeError, TimeoutError) as error:
                passed = False
                print(f"walk {seed}: {error}, after:\n  " + "\n  ".join(walk.steps), flush=True)
    return passed


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--seed", type=int, default=1)
    parser.add_argument("--count", type=int, default=4)
    options = parser.parse_args()
    if "ONRAMP_PRACTICE_SOCKET" not in os.environ:
        os.execv(sys.executable, [sys.executable, PRACTICE_NETWORK, "/dev/null", sys.executable,
                                  *sys.argv, BUILT])
    shares = [range(options.seed + first, options.seed + options.count, AT_A_TIME)
              for first in range(AT_A_TIME)]
    sys.argv.append(str(BUILT))  # in each new process, way.py takes the medium from here
    with multiprocessing.get_context("spawn").Pool(AT_A_TIME) as pool:
        return all(pool.map(take_walks, shares))


if __name__ == "__main__":
    sys.exit(not main())
