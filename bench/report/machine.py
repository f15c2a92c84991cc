"""Measures how busy the machine is, and how much the time of the same work varies."""

import hashlib
import os
import pathlib
import time

from .cases import Case

_ROUNDS = 25
_BLOCK = bytes(4_000_000)
_WATCH_SECONDS = 2


def describe():
    """Returns the number of processors and their name."""
    lines = pathlib.Path("/proc/cpuinfo").read_text().splitlines()
    names = [line.split(":", 1)[1].strip() for line in lines if line.startswith("model name")]
    return f"{os.cpu_count()} × {names[0] if names else 'processor'}"


def busy_share():
    """Watches the machine for two seconds. Returns the share of the processors' time that was not
    idle, from 0 to 1. Call this while no benchmark is running."""
    before = _times()
    time.sleep(_WATCH_SECONDS)
    spent = [after - earlier for earlier, after in zip(before, _times())]
    return 1 - (spent[3] + spent[4]) / max(1, sum(spent))


def _times():
    """Returns the clock ticks that the processors spent in each state. States 3 and 4 are idle."""
    first_line = pathlib.Path("/proc/stat").read_text().split("\n")[0]
    return [int(field) for field in first_line.split()[1:9]]


def noise():
    """Returns a case whose `ours` and `peer` are times of the same work, and differ only by noise."""
    def work():
        began = time.perf_counter()
        hashlib.sha256(_BLOCK).digest()
        return time.perf_counter() - began

    work()
    pairs = [(work(), work()) for _ in range(_ROUNDS)]
    return Case("The machine", "the same work twice", "itself", "s", *map(list, zip(*pairs)))
