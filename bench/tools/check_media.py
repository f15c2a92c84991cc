#!/usr/bin/python3
"""Measures how long onramp-check takes for media with 10 to 10,000 models.

A medium lists its models in ModelInfo.plist and in CDInfo.plist. On half of the media, both files
list the same model names. On the others, CDInfo.plist misspells every name. Each measurement is
compared with the time for 1,000 models, scaled in proportion to the number of models.
"""

import pathlib
import plistlib
import shutil
import subprocess
import sys
import tempfile
import time

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.dont_write_bytecode = True
sys.path.insert(0, str(ROOT / "bench"))

from report.cases import Case, Report, parser, require  # noqa: E402

ROUNDS, QUICK_ROUNDS = 7, 5
BASE = 1000
COUNTS = (10, 100, BASE, 2500, 5000, 10000)
QUICK_COUNTS = (10, 100, BASE, 10000)


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
    arguments = parser(__doc__)
    arguments.add_argument("--build", type=pathlib.Path, default=ROOT / "build/release")
    options = arguments.parse_args()
    program = options.build.resolve() / "tools/onramp-check"
    require([program], "build it: cmake --preset release && "
                       "cmake --build --preset release --target onramp-check")
    report = Report(options.json)
    counts, rounds = (QUICK_COUNTS, QUICK_ROUNDS) if options.quick else (COUNTS, ROUNDS)
    with tempfile.TemporaryDirectory() as folder:
        for differs in (False, True):
            media = {count: make(pathlib.Path(folder) / f"{count}-{differs}", count, differs)
                     for count in counts}
            times = {count: [] for count in counts}
            for _ in range(rounds):
                for count, medium in media.items():
                    times[count].append(seconds(program, medium))
            kind = "every name misspelt" if differs else "clean lists"
            for count, runs in times.items():
                report.add(Case(f"onramp-check, {kind}", f"{count:,} models",
                                f"{BASE:,} models, scaled", "s", runs,
                                [one * count / BASE for one in times[BASE]], axis="models",
                                size=count))


if __name__ == "__main__":
    main()
