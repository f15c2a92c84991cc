"""Devices that come and go on a practice network."""

import random
import threading
import time

from chooser import MAKER, MODEL

REST = 3          # seconds after which no cache still has a device that left
STEADY = 4        # wireless devices that never leave
AT_ONCE = 24      # the most devices that are present at once, besides the steady ones
_PAUSES = (0.2, 1.0)  # the shortest and the longest time between two changes, in seconds
_BEHAVIOURS = (2, 2, 2, 2, 1, "missing", "text", "closed")


class Devices(threading.Thread):
    """A thread that adds and removes devices, except between rest() and resume()."""

    def __init__(self, network, seed):
        super().__init__(daemon=True)
        self._network = network
        self._dice = random.Random(seed)
        self._allowed = threading.Lock()
        self._present = {f"Steady {number}": 2 for number in range(STEADY)}
        self._left = {}
        self._number = 0
        self.changes = []  # (time, name, "came" or "left") of each change
        self._failure = None
        for name in self._present:
            network.add(name, maker=MAKER, model=MODEL)
        network.settle()

    def run(self):
        try:
            while True:
                with self._allowed:
                    self._change()
                time.sleep(self._dice.uniform(*_PAUSES))
        except Exception as error:
            self._failure = error

    def rest(self):
        """Stops the changes until resume() is called. Returns when all present devices are
        published and no cache still has a device that left."""
        self._allowed.acquire()
        self._network.settle(60)
        time.sleep(REST)

    def resume(self):
        self._allowed.release()

    def raise_failure(self):
        """Raises the exception that ended the thread, if there was one."""
        if self._failure:
            raise self._failure

    def wireless(self):
        """Returns the names of the wireless devices that are present. Call this only between
        rest() and resume()."""
        return sorted(name for name, answer in self._present.items() if answer == 2)

    def bounds(self, moment):
        """Returns a lower and an upper bound for how many devices a search from `moment` until now
        may list. Do not call this between rest() and resume()."""
        with self._allowed:
            changed = [name for when, name, _ in self.changes if when >= moment]
            there = sum(answer == 2 for name, answer in self._present.items()
                        if name not in changed)
        return there, there + len(changed)

    def _change(self):
        comers = [name for name in self._present if not name.startswith("Steady")]
        if comers and (len(comers) >= AT_ONCE or self._dice.random() < 0.5):
            name = self._dice.choice(comers)
            self._left[name] = self._present.pop(name)
            self._note(name, "left")
            self._network.remove(name)
        elif self._left and self._dice.random() < 0.7:
            name = self._dice.choice(list(self._left))
            self._present[name] = self._left.pop(name)
            self._note(name, "came")
            self._network.add(name)
        else:
            self._number += 1
            name = f"Comer {self._number}"
            self._present[name] = self._dice.choice(_BEHAVIOURS)
            self._note(name, "came")
            self._network.add(name, maker=MAKER, model=MODEL, activeif=self._present[name])

    def _note(self, name, change):
        self.changes.append((time.monotonic(), name, change))

    def near(self, silence):
        """Describes the devices that came or left during `silence` or in the second before it.
        Times in the description are relative to the start of the silence."""
        return ", ".join(f"{name} {change} at {when - silence.began:+.2f} s"
                         for when, name, change in self.changes
                         if -1 < when - silence.began < silence.seconds)
