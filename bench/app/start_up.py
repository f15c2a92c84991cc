#!/usr/bin/python3
"""Compares the wizard's start-up with that of an empty window and of a similar page in plain Qt.

The wizard starts from media with 10 to 10,000 models. Each time is measured from the start of a
program until it first draws something. The peak memory is read 0.3 seconds later.
"""

import pathlib
import subprocess
import sys
import tempfile

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.dont_write_bytecode = True
sys.path[:0] = [str(ROOT / "bench"), str(ROOT / "tools"), str(ROOT / "tests/window")]

import media  # noqa: E402
from onscreen.desktop import Desktop  # noqa: E402
from report.cases import Case, Report, parser, require  # noqa: E402

ROUNDS, QUICK_ROUNDS = 15, 7
COUNTS = (10, 100, 1000, 10000)
EMPTY, PLAIN = "empty Qt window", "the page in plain Qt"
TIME, MEMORY = "Time from start to first page", "Peak memory at the first page"


def measure(build, env, program):
    """Returns how many seconds `program` takes to draw something, and its peak memory in MiB."""
    line = subprocess.run([build / "bench/app/time_to_window", program], env=env, check=True,
                          stdout=subprocess.PIPE, text=True).stdout
    milliseconds, kibibytes = line.split()
    return float(milliseconds) / 1000, int(kibibytes) / 1024


def medium_with(folder, count):
    """Makes a medium with `count` models and returns the path of its wizard. Only the last model
    has different connections, so the wizard must read all models to choose the first page."""
    models = {f"Kestrel Model {i:05}": media.model(usb=True, wired=i + 1 < count, wireless=True)
              for i in range(count)}
    medium = media.make(pathlib.Path(folder) / str(count), ROOT / "build/medium", models)
    return medium / "Onramp OSX.app/Contents/Linux/Onramp OSX"


def run_all(build, rounds):
    """Returns a dictionary with the times and the peak memories of each program. Its keys are EMPTY
    and PLAIN and, for the wizard, the numbers of models."""
    with Desktop(window_manager=False) as desktop, tempfile.TemporaryDirectory() as folder:
        env = desktop.env | {"LANG": "en_US.UTF-8"}
        del env["QT_LINUX_ACCESSIBILITY_ALWAYS_ON"]
        programs = {EMPTY: build / "bench/app/empty_window", PLAIN: build / "bench/app/plain_page"}
        programs |= {count: medium_with(folder, count) for count in COUNTS}
        runs = {name: [] for name in programs}
        for round_ in range(rounds + 1):
            for name, program in programs.items():
                result = measure(build, env, program)
                if round_ > 0:  # the first round only fills the file cache
                    runs[name].append(result)
    return {name: list(zip(*results)) for name, results in runs.items()}


def main():
    arguments = parser(__doc__)
    arguments.add_argument("--build", type=pathlib.Path, default=ROOT / "build/release")
    options = arguments.parse_args()
    build = options.build.resolve()
    helpers = ("time_to_window", "empty_window", "plain_page")
    require([*(build / "bench/app" / name for name in helpers),
             ROOT / "build/medium/Onramp OSX.app"],
            "build it: cmake --preset release && cmake --build --preset release")
    runs = run_all(build, QUICK_ROUNDS if options.quick else ROUNDS)
    report = Report(options.json)
    for count in COUNTS:
        report.add(Case(TIME, f"{count:,} models", EMPTY, "s", runs[count][0], runs[EMPTY][0],
                        axis="models", size=count))
    report.add(Case(TIME, "100 models", PLAIN, "s", runs[100][0], runs[PLAIN][0]))
    report.add(Case(TIME, f"{COUNTS[-1]:,} models", "100 models", "s", runs[COUNTS[-1]][0],
                    runs[100][0]))
    for count in COUNTS:
        report.add(Case(MEMORY, f"{count:,} models", EMPTY, "MiB", runs[count][1], runs[EMPTY][1],
                        axis="models", size=count))
    report.add(Case(MEMORY, "100 models", PLAIN, "MiB", runs[100][1], runs[PLAIN][1]))


if __name__ == "__main__":
    main()
