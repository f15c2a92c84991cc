#!/usr/bin/env python3
"""Compares onramp-devices with avahi-browse on a large network.

In each round, measures the time until onramp-devices has explained every device, and the time in
which avahi-browse resolves the same devices. Adds the time of the slowest SNMP answer to the second
time, and prints the ratio of the two.

    bench/tools/explain_devices.py [--devices 500] [--rounds 5]
"""

import argparse
import pathlib
import shutil
import subprocess
import sys
import tempfile
import time

SOURCE = pathlib.Path(__file__).resolve().parents[2]
TYPE = "_pdl-datastream._tcp"
OBJECT = "1.3.6.1.4.1.4242.2.4.4.1240.1.2.0"
ANSWERING = 50  # the other devices have the setting activeif = "closed", so they have no agent
AGENTS = [f"127.0.5.{number + 1}" for number in range(ANSWERING)]


def description(count):
    lines = []
    for number in range(count):
        answers = number < ANSWERING
        addresses = f'["{AGENTS[number]}"]' if answers else '["127.0.6.1"]'
        lines.append(f'[[device]]\nname = "Device {number}"\nmaker = "Kestrel"\n'
                     f'model = "Model 100"\naddresses = {addresses}\n'
                     f'activeif = {1 + number % 2 if answers else chr(34) + "closed" + chr(34)}\n')
    return "".join(lines)


def avahi_seconds(count):
    start = time.perf_counter()
    output = subprocess.run(["avahi-browse", "-rpt", TYPE], capture_output=True, text=True).stdout
    seconds = time.perf_counter() - start
    resolved = {line.split(";")[3] for line in output.splitlines() if line.startswith("=")}
    assert len(resolved) == count, f"avahi-browse resolved {len(resolved)} of {count}"
    return seconds


def slowest_answer():
    slowest = 0
    for address in AGENTS:
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


def measure(program, medium, count, rounds):
    answer = slowest_answer()
    avahi_seconds(count)
    for _ in range(rounds):
        peer, ours = avahi_seconds(count), explained_seconds(program, medium, count)
        print(f"{count} devices: avahi-browse {peer:.2f} s, slowest answer {answer:.3f} s, "
              f"explained {ours:.2f} s: {ours / (peer + answer):.2f} x", flush=True)


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--devices", type=int, default=500)
    parser.add_argument("--rounds", type=int, default=5)
    parser.add_argument("--build", default=SOURCE / "build" / "release")
    parser.add_argument("--inside", help=argparse.SUPPRESS)
    options = parser.parse_args()
    build = pathlib.Path(options.build).resolve()
    if options.inside:
        measure(str(build / "tools" / "onramp-devices"), options.inside, options.devices,
                options.rounds)
        return
    with tempfile.TemporaryDirectory() as folder:
        medium = pathlib.Path(folder, "medium")
        shutil.copytree(SOURCE / "examples" / "medium", medium)
        contents = medium / "Onramp OSX.app" / "Contents"
        contents.mkdir(parents=True)
        shutil.copy(build / "Info.plist", contents)
        devices = pathlib.Path(folder, "devices.toml")
        devices.write_text(description(options.devices))
        sys.exit(subprocess.run(
            [SOURCE / "tools" / "practice-network", devices, sys.executable, "-B", __file__,
             "--devices", str(options.devices), "--rounds", str(options.rounds),
             "--build", build, "--inside", medium]).returncode)


if __name__ == "__main__":
    main()
