"""Compares onramp-devices with the wizard's own chooser and net-snmp, on a practice network with one
device per verdict. Arguments: the program, chooser_probe, a medium with the application on it."""

import json
import os
import pathlib
import plistlib
import re
import signal
import socket
import subprocess
import sys
import tempfile
import threading
import time
import unittest

SOURCE = pathlib.Path(__file__).resolve().parents[2]
TOOL = str(SOURCE / "tools" / "practice-network")
PROGRAM, PROBE, MEDIUM = map(os.path.abspath, sys.argv[1:4])
OBJECT = "1.3.6.1.4.1.4242.2.4.4.1240.1.2.0"
MAKER_AND_MODEL = 'maker = "Kestrel"\nmodel = "Model 100"\n'

# Verdict → the entries of a device that gets it. The device's name is the verdict.
DEVICES = {
    "listed": MAKER_AND_MODEL,
    "on-cable": MAKER_AND_MODEL + "activeif = 1",
    "other-interface": MAKER_AND_MODEL + "activeif = 7",
    "no-such-object": MAKER_AND_MODEL + 'activeif = "missing"',
    "wrong-type": MAKER_AND_MODEL + 'activeif = "text"',
    "refused": MAKER_AND_MODEL + 'activeif = "closed"',
    "no-answer": MAKER_AND_MODEL + 'activeif = "silent"',
    # serve() answers at this address
    "late": MAKER_AND_MODEL + 'activeif = "closed"\naddresses = ["127.0.9.3"]',
    "other-subnet": MAKER_AND_MODEL + 'activeif = "silent"\naddresses = ["203.0.113.9"]',
    "ipv6-only": MAKER_AND_MODEL + 'addresses = ["fd00::9"]',
    "other-type": MAKER_AND_MODEL + 'type = "_ipp._tcp"',
    "blanks": 'maker = "Kestrel"\nmodel = " Model 100"',
    "capitals": 'maker = "kestrel"\nmodel = "Model 100"',
    "maker-twice": 'maker = "Kestrel"\nmodel = "Kestrel Model 100"',
    "other-key": 'txt = {mfg = "Kestrel", mdl = "Model 100"}',
    "no-model": 'maker = "Kestrel"',
    "no-maker": 'model = "Model 100"',
    "not-on-medium": 'maker = "Heron"\nmodel = "Jet 7"',
}
DESCRIPTION = "".join(f'[[device]]\nname = "{name}"\n{entries}\n'
                      for name, entries in DEVICES.items())
DESCRIPTION += '[[device]]\nname = "two models"\nmaker = "Kestrel"\nmodel = "Model 200"\n'


def run(*command, **options):
    return subprocess.run(command, capture_output=True, text=True, timeout=120, **options)


def start(*command):
    return subprocess.Popen(command, stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True)


def browse(*arguments):
    return (PROGRAM, "browse", "--medium", MEDIUM, "--json", *arguments)


def by_name(output):
    return {device["name"]: device for device in json.loads(output)["devices"]}


class Everybody(unittest.TestCase):
    maxDiff = None

    @classmethod
    def setUpClass(cls):
        serve("127.0.9.3", shortened, seconds=2.5)

    def test_every_device_gets_its_verdict(self):
        ghost = start("avahi-publish-service", "-H", "nowhere.local", "unresolved",
                      "_pdl-datastream._tcp", "9100")
        self.addCleanup(ghost.communicate)
        self.addCleanup(ghost.terminate)
        result = run(*browse())
        devices = by_name(result.stdout)
        self.assertEqual({name: device["verdict"]["id"] for name, device in devices.items()},
                         {name: name for name in DEVICES} |
                         {"unresolved": "unresolved", "two models": "listed"}, result.stderr)
        self.assertEqual({one["address"] for one in devices["listed"]["answer"]["exchanges"]},
                         set(devices["listed"]["record"]["IP address list"]))
        self.assertIn("lo IPv4", devices["listed"]["sightings"])
        self.assertGreater(devices["no-answer"]["delay"]["seconds"], 11)
        self.assertGreater(devices["late"]["answer"]["exchanges"][0]["seconds"], 2.4)

    def test_the_list_equals_the_wizards_for_every_model(self):
        with open(pathlib.Path(MEDIUM, "MacResources", "CDInfo.plist"), "rb") as file:
            models = list(plistlib.load(file)["ContainedModel"])
        searches = [[model] for model in models] + [models]
        for seconds in ("6", "40"):  # a busy machine needs the longer search
            explained = [start(*browse("-s", seconds, *(f"--model={model}" for model in wanted)))
                         for wanted in searches]
            shown = [start(PROBE, f"{MEDIUM}/Onramp OSX.app", seconds, *wanted) for wanted in searches]
            devices = [by_name(one.communicate()[0]) for one in explained]
            listed = [sorted(name for name, device in found.items() if device["listed"])
                      for found in devices]
            wizards = [sorted(one.communicate()[0].splitlines()) for one in shown]
            if listed == wizards:
                break
        self.assertEqual(listed, wizards)
        self.assertEqual(devices[models.index("Kestrel Model 200")]["listed"]["verdict"]["id"],
                         "other-model")

    def test_asks_as_net_snmp_does(self):
        known = by_name(run(*browse("-s", "4")).stdout)
        asked = {name: device["record"]["IP address list"][0] for name, device in known.items()
                 if "answer" in device and name != "late"}
        ours = {name: start(PROGRAM, "ask", "--json", address) for name, address in asked.items()}
        theirs = {name: start("snmpget", "-v1", "-Ov", "-r0", "-t5", "-c", "corridor", address, OBJECT)
                  for name, address in asked.items()}
        for name in asked:
            answer = json.loads(ours[name].communicate()[0])
            text = "".join(theirs[name].communicate())
            with self.subTest(name):
                last = answer["answer"]["exchanges"][-1]
                value = re.match(r"INTEGER: (-?\d+)", text)
                if value:
                    self.assertEqual(last["value"], int(value[1]))
                    self.assertEqual(answer["status"], 0 if last["value"] == 2 else 1)
                else:
                    self.assertIn(last["outcome"], {"noSuchName": ("error",), "STRING": ("other-type",),
                                                    "Timeout": ("none", "refused")}[
                        re.search("noSuchName|STRING|Timeout", text)[0]])
                    self.assertEqual(answer["status"], 2)

    def test_shows_what_a_malformed_reply_does(self):
        answers = {"127.0.9.1": lambda request: request[:-6].replace(b"\xa0", b"\xa2") + b"?",
                   "127.0.9.2": shortened}
        for address, reply in answers.items():
            serve(address, reply)
        result = run(PROGRAM, "ask", "-v", "127.0.9.1")
        self.assertEqual(result.returncode, 2)
        self.assertRegex(result.stdout, r"unreadable after .*(?s:.*)no element: ")
        result = run(PROGRAM, "ask", "--json", "127.0.9.2")
        self.assertEqual(result.returncode, 0)
        self.assertTrue(json.loads(result.stdout)["answer"]["exchanges"][0]["changedQuestion"])

    def test_an_interruption_shows_what_was_found(self):
        for seconds in (2, 4, 8, 16, 32):
            process = start(*browse("-s", "60"))
            time.sleep(seconds)
            process.send_signal(signal.SIGINT)
            output = process.communicate(timeout=60)[0]
            self.assertTrue(json.loads(output)["interrupted"])
            found = by_name(output).get("listed")
            if found and found["verdict"]["id"] == "listed":
                return
        self.fail("the device that is on the list was not found")

    def test_resolves_a_uri(self):
        result = run(PROGRAM, "uri", "dnssd://two%20models._pdl-datastream._tcp.local./?bidi")
        self.assertRegex(result.stdout, r"^127\.0\.1\.\d+\n$")
        result = run(PROGRAM, "uri", "usb://Kestrel/Model%20100")
        self.assertEqual((result.returncode, result.stdout), (1, ""))


class Nobody(unittest.TestCase):
    """Tests on a network without devices."""

    def problems(self):
        result = run(*browse("-s", "1"))
        return [problem["id"] for problem in json.loads(result.stdout)["network"]]

    def test_says_what_is_wrong_with_the_network(self):
        ip = lambda *words: subprocess.run(("ip",) + words, check=True)
        self.assertEqual(self.problems(), ["nothing-announced"])
        ip("route", "del", "224.0.0.0/4", "dev", "lo")
        self.assertEqual(self.problems(), ["no-network"])
        ip("link", "add", "here", "type", "veth", "peer", "name", "there")
        ip("address", "add", "192.0.2.7/24", "dev", "here")
        for interface in "here", "there":
            ip("link", "set", interface, "up")
        self.assertEqual(self.problems(), ["multicast-blocked"])
        subprocess.run([TOOL, "ctl", "stop-daemon"], check=True)
        self.assertEqual(self.problems(), ["no-daemon"])


def shortened(request):
    """Returns a reply of the same length: 2, under the requested name without its last arc."""
    reply = request.replace(b"\xa0", b"\xa2", 1)
    name = reply.index(b"\x06\x0f")
    return reply[:name] + b"\x06\x0e" + reply[name + 2:name + 16] + b"\x02\x01\x02"


def serve(address, reply, seconds=0):
    agent = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
    agent.bind((address, 161))

    def answer():
        while True:
            request, sender = agent.recvfrom(1500)
            time.sleep(seconds)
            agent.sendto(reply(request), sender)
    threading.Thread(target=answer, daemon=True).start()


class CommandLine(unittest.TestCase):
    def test_refuses_bad_arguments_with_a_remedy(self):
        with tempfile.TemporaryDirectory() as empty:
            for arguments, message in ((["browse"], "--medium is required"),
                                       (["browse", "-m", empty], "holds no application"),
                                       (["ask"], "ADDRESS is required"),
                                       (["ask", "no such host"], "neither an IPv4 address"),
                                       (["serch"], "--help")):
                with self.subTest(arguments):
                    result = run(PROGRAM, *arguments)
                    self.assertEqual(result.returncode, 2)
                    self.assertIn(message, result.stderr)


class Networks(unittest.TestCase):
    def test_on_practice_networks(self):
        with tempfile.TemporaryDirectory() as folder:
            description = pathlib.Path(folder, "devices.toml")
            for text, tests in ((DESCRIPTION, "Everybody"), ("", "Nobody")):
                with self.subTest(tests):
                    description.write_text(text)
                    result = run(TOOL, str(description), sys.executable, "-B", __file__,
                                 *sys.argv[1:4], tests)
                    self.assertEqual(result.returncode, 0, result.stderr)

    def test_a_broadcast_reaches_a_practice_network_of_two_hosts(self):
        with tempfile.NamedTemporaryFile("w", suffix=".toml") as description:
            description.write('[[device]]\nname = "Far"\n')
            description.flush()
            result = run(TOOL, "--hosts", "2", description.name, PROGRAM, "hosts")
        self.assertIn("  address 192.0.2.10  ActiveIF 2 (wireless)\n", result.stdout, result.stderr)


if __name__ == "__main__":
    inside = sys.argv[4:]
    if not inside:
        trial = run(TOOL, "/dev/null", "true")
        if trial.returncode == 77:
            print(trial.stderr, end="")
            sys.exit(77)
    unittest.main(argv=sys.argv[:1] + (inside or ["CommandLine", "Networks"]))
