#!/usr/bin/python3
"""Compares the wizard's discovery with avahi-browse on the same network in the same run.

Usage: discovery_bench.py [BUILD]

BUILD is the folder of a release build (default: build/release).

Measures 1, 20 and 200 services on dual-stack networks with one interface and with two. Each time is
that from the start of a program until the program prints the line about the last service that it
resolves. The warm part has one host, whose Avahi daemon has all services in its cache. The cold
part has two hosts joined by virtual cables. In that part, the Avahi daemon of the searching host is
restarted before every search, so that its cache is empty. The warm part also prints the processor
time of a search that keeps running after it has found everything.
"""

import pathlib
import resource
import statistics
import subprocess
import sys
import tempfile
import time

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.path[:0] = [str(ROOT / "tests/bonjour"), str(ROOT / "tools")]

import discovery  # noqa: E402
from practice_network.control import PracticeNetwork  # noqa: E402

TYPE = "_ipp._tcp"
COUNTS = (1, 20, 200)
ROUNDS = {"warm": 15, "cold": 5}
HOSTS = {"warm": 1, "cold": 2}
IDLE_SECONDS = 30


def seconds_until(count, command, name_of):
    """Returns the seconds from the start of `command` until it has named `count` services.
    `name_of` returns the service that an output line names, or None."""
    started = time.monotonic()
    with subprocess.Popen(command, stdin=subprocess.PIPE, stdout=subprocess.PIPE,
                          stderr=subprocess.DEVNULL, text=True) as process:
        names = set()
        for line in process.stdout:
            names.add(name_of(line))
            if len(names - {None}) == count:
                break
        needed = time.monotonic() - started
        process.terminate()
    return needed


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
    # For a while, Avahi repeats the announcements of new services. These would fill the empty
    # cache.
    time.sleep(14 + 0.1 * count)


def empty_cache():
    avahi = discovery.Avahi()
    avahi.restart()
    time.sleep(3)


def compare(state, interfaces, probe):
    network = PracticeNetwork()
    for count in COUNTS:
        grow_to(network, count)
        samples = {peer: [], ours: []}
        for round_number in range(ROUNDS[state] + 1):
            for program, arguments in ((peer, (count,)), (ours, (count, probe))):
                if state == "cold":
                    empty_cache()
                seconds = program(*arguments)
                if round_number:  # The first round is only a warm-up.
                    samples[program].append(seconds)
        ratios = [one / other for one, other in zip(samples[ours], samples[peer])]
        low, middle, high = statistics.quantiles(ratios)
        print(f"{state}, {interfaces} interface(s), {count:3} services: "
              f"{statistics.median(samples[ours]):.3f} s, avahi-browse "
              f"{statistics.median(samples[peer]):.3f} s, ratio {middle:.2f} "
              f"(quartiles {low:.2f} to {high:.2f})", flush=True)


def idle(interfaces, probe):
    def processor_seconds():
        usage = resource.getrusage(resource.RUSAGE_CHILDREN)
        return usage.ru_utime + usage.ru_stime

    before = processor_seconds()
    with discovery.Search(probe, TYPE) as search:
        search.wait_for("update", "Kestrel 1")
        time.sleep(IDLE_SECONDS)
        search.end()
        print(f"search of {COUNTS[-1]} services, left idle for {IDLE_SECONDS} s, "
              f"{interfaces} interface(s): {processor_seconds() - before:.3f} s of processor time, "
              "including start and discovery", flush=True)


def run_inside(state, interfaces, probe):
    """Runs this program on a practice network, with --inside, and returns the exit status."""
    with tempfile.NamedTemporaryFile("w", suffix=".toml") as description:
        description.write(f"[network]\ninterfaces = {interfaces}\n")
        description.flush()
        return subprocess.run([sys.executable, "-B", discovery.PRACTICE_NETWORK,
                               "--hosts", str(HOSTS[state]), description.name,
                               sys.executable, "-B", __file__, "--inside", state, str(interfaces),
                               probe], check=False).returncode


def main():
    match sys.argv[1:]:
        case ["--inside", state, interfaces, probe]:
            compare(state, interfaces, probe)
            if state == "warm":
                idle(interfaces, probe)
            return 0
    build = pathlib.Path(sys.argv[1] if len(sys.argv) > 1 else ROOT / "build/release").resolve()
    probe = build / "tests/bonjour/bonjour_probe"
    if not probe.exists():
        print(f"{probe} is missing; build it: cmake --preset release && "
              "cmake --build --preset release --target bonjour_probe", file=sys.stderr)
        return 2
    for state in HOSTS:
        for interfaces in (1, 2):
            if status := run_inside(state, interfaces, probe):
                return status
    return 0


if __name__ == "__main__":
    sys.exit(main())
