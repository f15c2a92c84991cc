#!/usr/bin/python3
"""Compares the wizard's search with avahi-browse and snmpget on the same practice network.

The wizard's time runs from the key press that starts a search until the list shows all devices. The
tools' time is how long avahi-browse takes to resolve the same devices, plus how long snmpget takes
to ask each of them.

The network grows in steps, to 200 devices at most. The wizard ends a search after three seconds if
the list has a device by then, so slower devices can be missing. This program stops at the first
network size for which a list is incomplete.
"""

import os
import pathlib
import subprocess
import tempfile
import time

from chooser import MAKER, MODEL, ROOT, Chooser, enter_network, require_medium

import media
from onscreen import messages
from onscreen.desktop import Desktop
from onscreen.processes import start, stop
from practice_network import PracticeNetwork
from practice_network.agents import maker_settings
from report.cases import Case, Report, parser

COUNTS, QUICK_COUNTS = (1, 10, 50, 100, 200), (1, 50, 100)
ROUNDS, QUICK_ROUNDS = 9, 5
PATIENCE = 10  # seconds; a search that lists a device within nine seconds has ended by then
TYPE = "_pdl-datastream._tcp"


def time_of_tools(count):
    """Returns how many seconds it takes in all to resolve `count` devices with avahi-browse and
    then ask each of them with snmpget."""
    began = time.monotonic()
    browser = start(["avahi-browse", "-rp", TYPE], "avahi-utils", stdout=subprocess.PIPE,
                    stderr=subprocess.DEVNULL, text=True)
    addresses = {}
    while len(addresses) < count:
        fields = browser.stdout.readline().split(";")
        if fields[0] == "=":
            addresses[fields[3]] = fields[7]
    community, snmp_object, _ = maker_settings()
    for address in addresses.values():
        subprocess.run(["snmpget", "-v1", "-c", community, address, snmp_object], check=True,
                       stdout=subprocess.DEVNULL, env=os.environ | {"MIBS": ""})
    passed = time.monotonic() - began
    stop(browser)
    browser.stdout.close()
    return passed


def time_of_wizard(person, count):
    """Makes the wizard empty the list and search again. Returns the seconds until the list has
    `count` rows again, or None if this takes longer than PATIENCE seconds."""
    table = person.table()
    began = person.refresh()
    emptied = False
    while not emptied or table.get_n_rows() < count:
        emptied = emptied or table.get_n_rows() < count
        if time.monotonic() - began > PATIENCE:
            return None
        time.sleep(0.002)  # the wizard spends some time on each look at the table
    passed = time.monotonic() - began
    person.wait()
    return passed


def rounds(desktop, medium, text, count, number):
    """Returns the times of the wizard and of the tools, or None if a list was incomplete."""
    times = [], []
    with Chooser(desktop, medium, text) as person:
        person.go_there()
        for _ in range(number):
            passed = time_of_wizard(person, count)
            if passed is None:
                return None
            times[0].append(passed)
            times[1].append(time_of_tools(count))
    return times


def main():
    arguments = parser(__doc__)
    arguments.add_argument("--medium", type=pathlib.Path, default=ROOT / "build/medium")
    options = arguments.parse_args()
    built = require_medium(options.medium)
    enter_network()
    network, report, text = PracticeNetwork(), Report(options.json), messages.read(built, "en")
    counts, number = (QUICK_COUNTS, QUICK_ROUNDS) if options.quick else (COUNTS, ROUNDS)
    with Desktop() as desktop, tempfile.TemporaryDirectory() as folder:
        medium = media.make(pathlib.Path(folder) / "medium", built,
                            {f"{MAKER} {MODEL}": media.model(usb=True, wireless=True)})
        there = 0
        for count in counts:
            for there in range(there + 1, count + 1):
                network.add(f"Device {there}", maker=MAKER, model=MODEL)
            network.settle(60)
            times = rounds(desktop, medium, text, count, number)
            if times is None:
                report.remark(f"{count} devices: the search ended before all were listed")
                break
            report.add(Case("List of wireless devices", f"{count} device{'s' * (count > 1)}",
                            "avahi-browse -rp and an snmpget each", "s", *times, axis="devices",
                            size=count))


if __name__ == "__main__":
    main()
