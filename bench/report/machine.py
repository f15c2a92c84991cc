"""How quiet the machine is: what else it does, and how much the same work differs in time."""

import hashlib
import os
import pathlib
import time

from .cases import Case

_ROUNDS = 25
_BLOCK = bytes(4_000_000)
_WATCH_SECONDS = 2


def describe():
    """Returns the processor's name and how many of them there are."""
    lines = pathlib.Path("/proc/cpuinfo").read_text().splitlines()
    names = [line.split(":", 1)[1].strip() for line in lines if line.startswith("model name")]
    return f"{os.cpu_count()} × {names[0] if names else 'processor'}"


def busy_share():
    """Watches the machine for two seconds, in which no benchmark may run. Returns the share of the
    processors that other programs use, from 0 to 1."""
    before = _times()
    time.sleep(_WATCH_SECONDS)
    spent = [after - earlier for earlier, after in zip(before, _times())]
    return 1 - (spent[3] + spent[4]) / max(1, sum(spent))


def _times():
    """Returns how long the processors did each kind of work. The fourth and fifth are idleness."""
    first_line = pathlib.Path("/proc/stat").read_text().split("\n")[0]
    return [int(field) for field in first_line.split()[1:9]]


def noise():
    """Returns a case in which ours and the peer are the same work. What differs is noise."""
    def work():
        began = time.perf_counter()
        hashlib.sha256(_BLOCK).digest()
        return time.perf_counter() - began

    work()
    pairs = [(work(), work()) for _ in range(_ROUNDS)]
    return Case("The machine", "the same work twice", "itself", "s", *map(list, zip(*pairs)))
