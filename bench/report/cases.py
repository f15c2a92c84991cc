"""The form in which the parts of bench/compare report what they measured."""

import argparse
import dataclasses
import json
import statistics
import sys

_SCALES = {"s": ((1, "s"), (1e-3, "ms"), (1e-6, "µs"), (1e-9, "ns")), "MiB": ((1, "MiB"),)}


@dataclasses.dataclass(frozen=True)
class Case:
    """What was measured again and again under the same conditions, each time beside a peer.

    A pair of values with the same index was measured in the same round.
    """

    benchmark: str      # such as "Time from start to first page"
    name: str           # what distinguishes this case, such as "100 models"
    peer_name: str      # what `peer` was measured with
    unit: str           # of all values: "s" or "MiB"
    ours: list[float]
    peer: list[float]
    axis: str = ""      # what the plot of the benchmark has below its x axis, such as "models"
    size: int = 0       # the place of this case on that axis

    def ratio(self):
        """Returns the quartiles of ours / peer, over all rounds."""
        return quartiles([one / other for one, other in zip(self.ours, self.peer, strict=True)])


def quartiles(values):
    """Returns the lower quartile, the median and the upper quartile."""
    return statistics.quantiles(values, method="inclusive") if len(values) > 1 else values * 3


def spread(values):
    """Returns the noise: the distance between the quartiles as a part of the median."""
    low, middle, high = quartiles(values)
    return (high - low) / middle if middle else 0


def with_unit(value, unit):
    """Returns a value of "s" or "MiB" as a text with at most three significant digits."""
    for factor, name in _SCALES[unit]:
        if abs(value) >= factor:
            break
    return f"{float(f'{value / factor:.3g}'):g} {name}"


def line(case):
    """Returns one line about a case, for people."""
    low, middle, high = case.ratio()
    ours, peer = (with_unit(statistics.median(values), case.unit)
                  for values in (case.ours, case.peer))
    return (f"{case.benchmark}, {case.name}: {ours}, {case.peer_name} {peer}, "
            f"ratio {middle:.2f} (quartiles {low:.2f} to {high:.2f}, {len(case.ours)} rounds)")


class Report:
    """Prints each case of a benchmark as a line for people or, with --json, as a line of JSON."""

    def __init__(self, as_json):
        self._as_json = as_json

    def add(self, case):
        print(json.dumps(dataclasses.asdict(case)) if self._as_json else line(case), flush=True)

    def remark(self, text):
        """Prints a line for people. Prints nothing with --json."""
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
    """Ends the program with a message if one of `paths` is missing."""
    for path in paths:
        if not path.exists():
            sys.exit(f"{sys.argv[0]}: {path} is missing; {remedy}")
