#!/usr/bin/python3
"""Compares the start-up of the wizard, an empty window and the wizard's first page in plain Qt.

Usage: start_up.py [BUILD]

BUILD is the folder of a release build (default: build/release).
"""

import pathlib
import statistics
import subprocess
import sys
import tempfile

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.path[:0] = [str(ROOT / "tools"), str(ROOT / "tests/window")]

import media  # noqa: E402
from onscreen.desktop import Desktop  # noqa: E402

ROUNDS = 15


def measure(build, env, program):
    line = subprocess.run([build / "bench/app/time_to_window", program], env=env, check=True,
                          stdout=subprocess.PIPE, text=True).stdout
    milliseconds, kibibytes = line.split()
    return float(milliseconds), int(kibibytes) / 1024


def medium_with(folder, count):
    """Makes a medium of `count` models and returns its wizard. The last model differs from the
    others, so that the wizard has to read all of them to choose the first page."""
    models = {f"Kestrel Model {i:05}": media.model(usb=True, wired=i + 1 < count, wireless=True)
              for i in range(count)}
    medium = media.make(pathlib.Path(folder) / str(count), ROOT / "build/medium", models)
    return medium / "Onramp OSX.app/Contents/Linux/Onramp OSX"


def main():
    build = pathlib.Path(sys.argv[1] if len(sys.argv) > 1 else ROOT / "build/release").resolve()
    with Desktop(window_manager=False) as desktop, tempfile.TemporaryDirectory() as folder:
        env = desktop.env | {"LANG": "en_US.UTF-8"}
        del env["QT_LINUX_ACCESSIBILITY_ALWAYS_ON"]
        programs = {"empty window": build / "bench/app/empty_window",
                    "plain page": build / "bench/app/plain_page",
                    "100 models": medium_with(folder, 100),
                    "1,000 models": medium_with(folder, 1000),
                    "5,000 models": medium_with(folder, 5000)}
        runs = {name: [] for name in programs}
        for round_ in range(ROUNDS + 1):
            for name, program in programs.items():
                result = measure(build, env, program)
                if round_ > 0:  # the first round only fills the file cache
                    runs[name].append(result)
    (empty_time, empty_memory), (plain_time, plain_memory) = (
        [statistics.median(column) for column in zip(*runs[name])]
        for name in ("empty window", "plain page"))
    hundred_time = statistics.median(r[0] for r in runs["100 models"])
    print(f"medians of {ROUNDS} rounds; noise is the spread of the middle half")
    for name, results in runs.items():
        times = sorted(r[0] for r in results)
        time, memory = statistics.median(times), statistics.median(r[1] for r in results)
        noise = (times[-len(times) // 4] - times[len(times) // 4]) / time
        print(f"{name:13} {time:7.1f} ms (noise {noise:4.0%})  {time / empty_time:5.2f} × empty  "
              f"{time / plain_time:5.2f} × plain  {time / hundred_time:5.2f} × 100 models   "
              f"peak {memory:6.1f} MiB ({memory - empty_memory:+.1f} beside empty, "
              f"{memory - plain_memory:+.1f} beside plain)")


main()
