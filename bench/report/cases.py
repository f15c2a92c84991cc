"""The results of a benchmark, as JSON for bench/compare and as text for people."""

import argparse
import dataclasses
import json
import statistics
import sys

_SCALES = {"s": ((1, "s"), (1e-3, "ms"), (1e-6, "µs"), (1e-9, "ns")), "MiB": ((1, "MiB"),)}


@dataclasses.dataclass(frozen=True)
class Case:
    """Repeated measurements of Onramp and of a peer under the same conditions.

    `ours[i]` and `peer[i]` were measured in the same round.
    """

    benchmark: str      # such as "Time from start to first page"
    name: str           # what distinguishes this case, such as "100 models"
    peer_name: str      # what Onramp is compared with, such as "avahi-browse"
    unit: str           # the unit of `ours` and `peer`: "s" or "MiB"
    ours: list[float]
    peer: list[float]
    axis: str = ""      # what `size` counts, such as "models"; if empty, there is no plot of cost
    size: int = 0       # the number on the x axis

    def ratio(self):
        """Returns the quartiles of ours / peer, over all rounds."""
        return quartiles([one / other for one, other in zip(self.ours, self.peer, strict=True)])


def quartiles(values):
    """Returns the lower quartile, the median and the upper quartile."""
    return statistics.quantiles(values, method="inclusive") if len(values) > 1 else values * 3


def spread(values):
    """Returns the interquartile range divided by the median, or 0 if the median is 0."""
    low, middle, high = quartiles(values)
    return (high - low) / middle if middle else 0


def with_unit(value, unit):
    """Returns `value` with a unit and at most three significant digits, such as "12.3 ms"."""
    for factor, name in _SCALES[unit]:
        if abs(value) >= factor:
            break
    return f"{float(f'{value / factor:.3g}'):g} {name}"


def line(case):
    """Returns a line of text about a case."""
    low, middle, high = case.ratio()
    ours, peer = (with_unit(statistics.median(values), case.unit)
                  for values in (case.ours, case.peer))
    return (f"{case.benchmark}, {case.name}: {ours}, {case.peer_name} {peer}, "
            f"ratio {middle:.2f} (quartiles {low:.2f} to {high:.2f}, {len(case.ours)} rounds)")


class Report:
    """Prints each case of a benchmark as a line of text or, with --json, as a line of JSON."""

    def __init__(self, as_json):
        self._as_json = as_json

    def add(self, case):
        print(json.dumps(dataclasses.asdict(case)) if self._as_json else line(case), flush=True)

    def remark(self, text):
        """Prints `text`, unless the option --json is set."""
        if not self._as_json:
            print(text, flush=True)


def read(text):
    """Returns the cases in the output of a benchmark that was run with --json."""
    return [Case(**json.loads(one)) for one in text.splitlines() if one.startswith("{")]


def parser(description, usage=None):
    """Returns a parser with the options --json and --quick."""
    result = argparse.ArgumentParser(description=description, usage=usage,
                                     formatter_class=argparse.RawDescriptionHelpFormatter)
    result.add_argument("--json", action="store_true", help="print the cases as JSON")
    result.add_argument("--quick", action="store_true", help="fewer rounds and sizes")
    return result


def require(paths, remedy):
    """Exits if one of `paths` is missing, with a message that ends in `remedy`."""
    for path in paths:
        if not path.exists():
            sys.exit(f"{sys.argv[0]}: {path} is missing; {remedy}")
