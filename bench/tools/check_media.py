#!/usr/bin/python3
"""Compares the time that onramp-check takes for a medium of 1,000 models with the times for larger
media.

Usage: check_media.py [BUILD]

BUILD is the folder of a release build (default: build/release).
"""

import pathlib
import plistlib
import shutil
import statistics
import subprocess
import sys
import tempfile
import time

ROOT = pathlib.Path(__file__).resolve().parents[2]
ROUNDS = 7
COUNTS = (1000, 2500, 5000, 10000)


def make(folder, count, every_name_differs):
    shutil.copytree(ROOT / "examples/medium", folder)
    models = {f"Kestrel Model {i:05}": {"KSCID": "x", "Interfaces": {
        "USB": True, "WiredLAN": i % 2 == 0, "WirelessLAN": True}} for i in range(count)}
    names = {name.replace("Model", "Modle") if every_name_differs else name: True
             for name in models}
    (folder / "MacResources/ModelInfo.plist").write_bytes(plistlib.dumps({"Model": models}))
    (folder / "MacResources/CDInfo.plist").write_bytes(
        plistlib.dumps({"ContainedModel": names, "KSCSeriesCode": "KS7"}))
    return folder


def seconds(program, medium):
    start = time.monotonic()
    subprocess.run([program, medium], stdout=subprocess.DEVNULL, check=False)
    return time.monotonic() - start


def main():
    build = pathlib.Path(sys.argv[1] if len(sys.argv) > 1 else ROOT / "build/release").resolve()
    program = build / "tools/onramp-check"
    with tempfile.TemporaryDirectory() as folder:
        for differs in (False, True):
            media = {count: make(pathlib.Path(folder) / f"{count}-{differs}", count, differs)
                     for count in COUNTS}
            times = {count: [] for count in COUNTS}
            for _ in range(ROUNDS):
                for count, medium in media.items():
                    times[count].append(seconds(program, medium))
            print("every name misspelt" if differs else "clean lists")
            base = statistics.median(times[COUNTS[0]]) / COUNTS[0]
            for count, runs in times.items():
                median = statistics.median(runs)
                print(f"{count:6} models {median:7.3f} s (fastest {min(runs):.3f})"
                      f"  per model {median / count / base:5.2f} × that of {COUNTS[0]}")


main()
