#!/usr/bin/python3
"""Compares the wizard's search for network services with avahi-browse on the same network.

The network has IPv4 and IPv6, up to 500 services, and one interface. Without --quick, a network
with two interfaces is measured, too. Each time is measured from the start of a program until the
program prints the last service that it resolves.

Full cache: both programs run on the host of the services, whose Avahi daemon knows all of them.
Empty cache: a second host searches. Its Avahi daemon is restarted before every search.

Without --json, the wizard's search also runs for another 30 seconds with a full cache. The benchmark
then prints the processor time that this search took, including its start and the discovery.
"""

import argparse
import pathlib
import resource
import subprocess
import sys
import tempfile
import time

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.dont_write_bytecode = True
sys.path[:0] = [str(ROOT / "bench"), str(ROOT / "tests/bonjour"), str(ROOT / "tools")]

import discovery  # noqa: E402
from practice_network.control import PracticeNetwork  # noqa: E402
from report.cases import Case, Report, parser, require  # noqa: E402

TYPE = "_ipp._tcp"
HOSTS = {"warm": 1, "cold": 2}
COUNTS = {"warm": (1, 20, 200, 500), "cold": (1, 20, 200)}
ROUNDS = {"warm": 15, "cold": 7}
INTERFACES = (1, 2)
QUICK_COUNTS = {"warm": (1, 20, 200), "cold": (20,)}
QUICK_ROUNDS = {"warm": 9, "cold": 3}
QUICK_INTERFACES = (1,)
IDLE_SECONDS = 30


def seconds_until(count, command, name_of):
    """Runs `command` until it has named `count` services, and returns the seconds that this took.
    `name_of` returns the service that a line of output names, or None. Ends this program with a
    message if the output ends first."""
    started = time.monotonic()
    with subprocess.Popen(command, stdin=subprocess.PIPE, stdout=subprocess.PIPE,
                          stderr=subprocess.DEVNULL, text=True) as process:
        names = set()
        for line in process.stdout:
            names.add(name_of(line))
            if len(names - {None}) == count:
                needed = time.monotonic() - started
                process.terminate()
                return needed
    sys.exit(f"{command[0]} ended with status {process.returncode} after it had named "
             f"{len(names - {None})} of {count} services, so there is nothing to compare")


def peer(count):
    return seconds_until(count, ["avahi-browse", "-rp", TYPE],
                         lambda line: line.split(";")[3] if line.startswith("=") else None)


def ours(count, probe):
    return seconds_until(count, [probe, "search", TYPE + "."],
                         lambda line: line.split("\t")[2] if "\tupdate\t" in line else None)


def grow_to(network, count):
    for number in range(len(network.list()), count):
        network.add(f"Kestrel {number}", type=TYPE, activeif="closed", maker="Kestrel",
                    model="Model 100")
    network.settle()
    # Avahi repeats the announcements of new services for a while. They would fill a cache that
    # empty_cache() has emptied.
    time.sleep(14 + 0.1 * count)


def empty_cache():
    avahi = discovery.Avahi()
    avahi.restart()
    time.sleep(3)


def compare(state, interfaces, probe, quick, report):
    network = PracticeNetwork()
    for count in (QUICK_COUNTS if quick else COUNTS)[state]:
        grow_to(network, count)
        samples = {peer: [], ours: []}
        for round_number in range((QUICK_ROUNDS if quick else ROUNDS)[state] + 1):
            for program, arguments in ((peer, (count,)), (ours, (count, probe))):
                if state == "cold":
                    empty_cache()
                seconds = program(*arguments)
                if round_number:  # the first round is only a warm-up
                    samples[program].append(seconds)
        report.add(Case(f"Discovery, {'full' if state == 'warm' else 'empty'} cache, {interfaces} "
                        f"interface{'s' * (interfaces > 1)}", f"{count} service{'s' * (count > 1)}",
                        "avahi-browse -rp", "s", samples[ours], samples[peer], axis="devices",
                        size=count))


def idle(interfaces, probe, report):
    def processor_seconds():
        usage = resource.getrusage(resource.RUSAGE_CHILDREN)
        return usage.ru_utime + usage.ru_stime

    before = processor_seconds()
    with discovery.Search(probe, TYPE) as search:
        search.wait_for("update", "Kestrel 1")
        time.sleep(IDLE_SECONDS)
        search.end()
        report.remark(f"search of all services, left idle for {IDLE_SECONDS} s, {interfaces} "
                      f"interface(s): {processor_seconds() - before:.3f} s of processor time, "
                      "including start and discovery")


def run_inside(state, interfaces, arguments):
    """Runs this program again inside a practice network and returns its exit status."""
    with tempfile.NamedTemporaryFile("w", suffix=".toml") as description:
        description.write(f"[network]\ninterfaces = {interfaces}\n")
        description.flush()
        return subprocess.run([sys.executable, "-B", discovery.PRACTICE_NETWORK,
                               "--hosts", str(HOSTS[state]), description.name,
                               sys.executable, "-B", __file__, "--inside", state, str(interfaces),
                               *arguments], check=False).returncode


def main():
    arguments = parser(__doc__)
    arguments.add_argument("--build", type=pathlib.Path, default=ROOT / "build/release")
    arguments.add_argument("--inside", nargs=2, help=argparse.SUPPRESS)
    options = arguments.parse_args()
    probe = options.build.resolve() / "tests/bonjour/bonjour_probe"
    require([probe], "build it: cmake --preset release && "
                     "cmake --build --preset release --target bonjour_probe")
    if options.inside:
        state, interfaces = options.inside[0], int(options.inside[1])
        report = Report(options.json)
        compare(state, interfaces, probe, options.quick, report)
        if state == "warm" and not options.json:
            idle(interfaces, probe, report)
        return 0
    for state in HOSTS:
        for interfaces in QUICK_INTERFACES if options.quick else INTERFACES:
            if status := run_inside(state, interfaces, sys.argv[1:]):
                return status
    return 0


if __name__ == "__main__":
    sys.exit(main())
