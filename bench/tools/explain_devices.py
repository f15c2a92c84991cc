#!/usr/bin/python3
"""Compares onramp-devices with avahi-browse and snmpget on networks of several sizes.

Each round measures how long onramp-devices takes to find every device and say whether the wizard
lists it, and how long avahi-browse takes to resolve the same devices. Before the rounds, snmpget
queries each device that has an SNMP agent. The time of the slowest answer is added to every time of
avahi-browse.
"""

import os
import pathlib
import shutil
import subprocess
import sys
import tempfile
import time

SOURCE = pathlib.Path(__file__).resolve().parents[2]
sys.dont_write_bytecode = True
sys.path[:0] = [str(SOURCE / "bench"), str(SOURCE / "tools")]

from practice_network import PracticeNetwork  # noqa: E402
from report.cases import Case, Report, parser, require  # noqa: E402

COUNTS, QUICK_COUNTS = (1, 20, 100, 500), (1, 500)
ROUNDS, QUICK_ROUNDS = 7, 5
TYPE = "_pdl-datastream._tcp"
OBJECT = "1.3.6.1.4.1.4242.2.4.4.1240.1.2.0"
ANSWERING = 50  # the number of devices with an SNMP agent
AGENTS = [f"127.0.5.{number + 1}" for number in range(ANSWERING)]


def add_devices(network, numbers):
    for number in numbers:
        answers = number < ANSWERING
        network.add(f"Device {number}", maker="Kestrel", model="Model 100",
                    addresses=[AGENTS[number] if answers else "127.0.6.1"],
                    activeif=1 + number % 2 if answers else "closed")
    network.settle(120)


def avahi_seconds(count):
    start = time.perf_counter()
    process = subprocess.Popen(["avahi-browse", "-rp", TYPE], stdout=subprocess.PIPE,
                               stderr=subprocess.DEVNULL, text=True)
    resolved = set()
    for line in process.stdout:
        if line.startswith("="):
            resolved.add(line.split(";")[3])
        if len(resolved) == count:
            break
    seconds = time.perf_counter() - start
    process.kill()
    process.wait()
    assert len(resolved) == count, f"avahi-browse resolved {len(resolved)} of {count}"
    return seconds


def slowest_answer(count):
    slowest = 0
    for address in AGENTS[:count]:
        start = time.perf_counter()
        subprocess.run(["snmpget", "-v1", "-c", "corridor", address, OBJECT], capture_output=True,
                       check=True)
        slowest = max(slowest, time.perf_counter() - start)
    return slowest


def explained_seconds(program, medium, count):
    start = time.perf_counter()
    process = subprocess.Popen([program, "browse", "--medium", medium, "-s", "60"],
                               stdout=subprocess.PIPE, text=True)
    rows = 0
    for line in process.stdout:
        rows += line.startswith(("listed ", "not listed "))
        if rows == count:
            break
    seconds = time.perf_counter() - start
    process.kill()
    process.wait()
    assert rows == count, f"onramp-devices explained {rows} of {count}"
    return seconds


def measure(program, medium, counts, rounds, report):
    network = PracticeNetwork()
    there = 0
    for count in counts:
        add_devices(network, range(there, count))
        there = count
        avahi_seconds(count)
        answer = slowest_answer(count)
        ours, peer = [], []
        for _ in range(rounds):
            peer.append(avahi_seconds(count) + answer)
            ours.append(explained_seconds(program, medium, count))
        report.add(Case("Explanation of every device", f"{count} device{'s' * (count > 1)}",
                        "avahi-browse and snmpget", "s", ours, peer, axis="devices", size=count))


def make_medium(folder, build):
    medium = pathlib.Path(folder, "medium")
    shutil.copytree(SOURCE / "examples" / "medium", medium)
    contents = medium / "Onramp OSX.app" / "Contents"
    contents.mkdir(parents=True)
    shutil.copy(build / "Info.plist", contents)
    return medium


def main():
    arguments = parser(__doc__)
    arguments.add_argument("--devices", type=int, help="only a network of this size")
    arguments.add_argument("--rounds", type=int)
    arguments.add_argument("--build", type=pathlib.Path, default=SOURCE / "build/release")
    options = arguments.parse_args()
    build = options.build.resolve()
    program = build / "tools/onramp-devices"
    require([program, build / "Info.plist"],
            "build it: cmake --preset release && "
            "cmake --build --preset release --target onramp-devices")
    if "ONRAMP_PRACTICE_SOCKET" not in os.environ:
        os.execv(sys.executable, [sys.executable, str(SOURCE / "tools/practice-network"),
                                  "/dev/null", sys.executable, *sys.argv])
    counts, rounds = (QUICK_COUNTS, QUICK_ROUNDS) if options.quick else (COUNTS, ROUNDS)
    with tempfile.TemporaryDirectory() as folder:
        measure(str(program), make_medium(folder, build),
                (options.devices,) if options.devices else counts, options.rounds or rounds,
                Report(options.json))


if __name__ == "__main__":
    main()
