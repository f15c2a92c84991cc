#!/usr/bin/python3
"""Compares the wizard's search with avahi-browse and snmpget on the same practice network.

Usage: find_devices.py [MEDIUM]

MEDIUM is a built medium (default: build/medium of this source tree).

The wizard's time is that from the key press that starts a search until the list has 1 or 50
wireless devices. The other time is that of avahi-browse, until it has resolved the same devices,
plus the times of one snmpget for each device. Neither time includes the pauses in which the wizard
waits for its search.
"""

import os
import pathlib
import statistics
import subprocess
import sys
import tempfile
import time

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.path[:0] = [str(ROOT / "tools"), str(ROOT / "tests/window")]

import media  # noqa: E402
from onscreen import messages  # noqa: E402
from onscreen.desktop import Desktop  # noqa: E402
from onscreen.person import Person  # noqa: E402
from onscreen.processes import start, stop  # noqa: E402
from practice_network import PracticeNetwork  # noqa: E402
from practice_network.agents import COMMUNITY, OBJECT  # noqa: E402

ROUNDS = 7
COUNTS = (1, 50)
TYPE = "_pdl-datastream._tcp"
GEAR, GEAR_REFRESH = "Actions", 2


def time_of_tools(count):
    """Returns the seconds until avahi-browse has resolved `count` devices and snmpget has asked
    each of them."""
    began = time.monotonic()
    browser = start(["avahi-browse", "-rp", TYPE], "avahi-utils", stdout=subprocess.PIPE,
                    stderr=subprocess.DEVNULL, text=True)
    addresses = {}
    while len(addresses) < count:
        fields = browser.stdout.readline().split(";")
        if fields[0] == "=":
            addresses[fields[3]] = fields[7]
    for address in addresses.values():
        subprocess.run(["snmpget", "-v1", "-c", COMMUNITY, address, OBJECT], check=True,
                       stdout=subprocess.DEVNULL, env=os.environ | {"MIBS": ""})
    passed = time.monotonic() - began
    stop(browser)
    browser.stdout.close()
    return passed


def time_of_wizard(person, text, count):
    """Returns the seconds from a refresh, which empties the list, until the list has `count` rows
    again."""
    person.see_gone("label", text["INST_WAIT"], 60)
    table = person.see("tree").get_table_iface()
    person.open_menu(GEAR)
    person.press(*["Down"] * GEAR_REFRESH)
    began = time.monotonic()
    key = subprocess.Popen(["xdotool", "key", "Return"], env=person.desktop.env)
    emptied = False
    while not emptied or table.get_n_rows() < count:
        emptied = emptied or table.get_n_rows() < count
        if time.monotonic() - began > 20:
            raise TimeoutError(f"the list has {table.get_n_rows()} rows instead of {count}")
    passed = time.monotonic() - began
    key.wait()
    return passed


def rounds(desktop, medium, text, count):
    program = medium / "Onramp OSX.app/Contents/Linux/Onramp OSX"
    times = {"wizard": [], "tools": []}
    with Person(desktop, program, env={"LANG": "en_US.UTF-8"}) as person:
        person.see("radio button", text["INST_TXT_WIFI"])
        person.press("Return")
        person.see("label", text["INST_TXT_DEVLIST"], 60)
        for _ in range(ROUNDS):
            times["wizard"].append(time_of_wizard(person, text, count))
            times["tools"].append(time_of_tools(count))
    return times


def main(built):
    network = PracticeNetwork()
    text = messages.read(built, "en")
    with Desktop() as desktop, tempfile.TemporaryDirectory() as folder:
        medium = media.make(pathlib.Path(folder) / "medium", built,
                            {"Kestrel Model 100": media.model(usb=True, wireless=True)})
        there = 0
        for count in COUNTS:
            for there in range(there + 1, count + 1):
                network.add(f"Device {there}", maker="Kestrel", model="Model 100")
            network.settle()
            times = rounds(desktop, medium, text, count)
            wizard, tools = (statistics.median(times[who]) for who in ("wizard", "tools"))
            spread = ", ".join(f"{who} {min(times[who]):.3f} to {max(times[who]):.3f} s"
                               for who in times)
            print(f"{count:2} device(s): wizard {wizard:.3f} s, tools {tools:.3f} s, "
                  f"{wizard / tools:.2f} × the tools ({ROUNDS} rounds: {spread})", flush=True)


if __name__ == "__main__":
    if "ONRAMP_PRACTICE_SOCKET" not in os.environ:
        os.execv(sys.executable, [sys.executable, str(ROOT / "tools/practice-network"), "/dev/null",
                                  sys.executable, *sys.argv])
    main(pathlib.Path(sys.argv[1] if len(sys.argv) > 1 else ROOT / "build/medium").resolve())
