"""Compares onramp-devices with net-snmp's snmpget and with the wizard's own device chooser, on
simulated networks. DEVICES has a simulated device for nearly every verdict. Arguments:
onramp-devices, chooser_probe, and a medium with the application on it."""

import json
import os
import pathlib
import plistlib
import re
import signal
import socketserver
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

# For most verdicts, a device that gets the verdict. The verdict is also the device's name.
DEVICES = {
    "listed": MAKER_AND_MODEL,
    "on-cable": MAKER_AND_MODEL + "activeif = 1",
    "other-interface": MAKER_AND_MODEL + "activeif = 7",
    "no-such-object": MAKER_AND_MODEL + 'activeif = "missing"',
    "wrong-type": MAKER_AND_MODEL + 'activeif = "text"',
    "refused": MAKER_AND_MODEL + 'activeif = "closed"',
    "no-answer": MAKER_AND_MODEL + 'activeif = "silent"',
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
DESCRIPTION += '[[device]]\nname = "two models"\nmaker = "Kestrel"\nmodel = "Model 200"\n' \
               '[[device]]\nname = "odd"\ntype = "_odd._tcp"\n'


def tlv(tag, *parts):
    return bytes((tag, sum(map(len, parts)))) + b"".join(parts)


def reply(value=tlv(2, b"\2"), status=0, arcs=14, number=0, binding=True, seconds=0):
    """Returns a function that waits `seconds` seconds and turns a request into a reply with the
    error status `status`. In the reply, the object's name has only its first `arcs` arcs, at most
    14, and the value is `value`. If `binding` is false, the reply has no name and no value. If
    `number` is not 0, the reply's identifier differs from the request's."""
    def answer(request):
        time.sleep(seconds)
        at = request.index(b"corridor") + 12
        end = at + request[at - 1]
        bound = tlv(0x30, tlv(6, request[-17:arcs - 16]), value) if binding else b""
        pdu = tlv(0xa2, tlv(2, request[at:end - 1], bytes((request[end - 1] ^ number,))),
                  tlv(2, bytes((status,))), tlv(2, bytes((status and 1,))), tlv(0x30, bound))
        return tlv(0x30, b"\x02\x01\x00\x04\x08corridor", pdu)
    return answer


# Each row has the function that answers (None for a closed port), the outcome and value that
# onramp-devices reports, and a part of what snmpget prints.
REPLIES = [
    *((reply(tlv(2, bytes((n & 255,)))), "value", n, f"INTEGER: {n}") for n in (2, 1, -1)),
    *((reply(value), "other-type", None, text) for value, text in (
        (tlv(4, b"two"), 'STRING: "two"'), (tlv(5), "NULL"), (tlv(0x40, b"\x7f\0\0\1"), "IpAddress: 127.0.0.1"),
        (tlv(0x41, b"\2"), "Counter32: 2"), (tlv(0x42, b"\2"), "Gauge32: 2"), (tlv(0x43, b"\2"), "Timeticks: "))),
    *((reply(tlv(5), status), "error", None, text) for status, text in ((2, "noSuchName"), (5, "genError"))),
    (reply(arcs=13), "value", 2, "INTEGER: 2"),
    (reply(binding=False), "other-type", None, ""),
    (reply(number=1), "other-request", None, "Timeout"),
    (reply(seconds=2.5), "late", None, "Timeout"),
    (lambda request: request[:-6].replace(b"\xa0", b"\xa2") + b"?", "unreadable", None, "Timeout"),
    (lambda request: b"", "unreadable", None, "Timeout"),
    (lambda request: time.sleep(60), "none", None, "Timeout"),
    (None, "refused", None, "Timeout"),
]


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
        serve("127.0.9.3", reply(seconds=2.5))

    def test_every_device_gets_its_verdict(self):
        ghost = start("avahi-publish-service", "-H", "nowhere.local", "unresolved",
                      "_pdl-datastream._tcp", "9100")
        self.addCleanup(ghost.communicate)
        self.addCleanup(ghost.terminate)
        result = run(*browse("--all-types"))
        devices = by_name(result.stdout)
        self.assertEqual({name: device["verdict"]["id"] for name, device in devices.items()},
                         {name: name for name in DEVICES} |
                         {"unresolved": "unresolved", "two models": "listed", "odd": "other-type"}, result.stderr)
        self.assertEqual({one["address"] for one in devices["listed"]["answer"]["exchanges"]},
                         set(devices["listed"]["record"]["IP address list"]))
        self.assertIn("lo IPv4", devices["listed"]["sightings"])
        notes = {(name, note["id"]) for name, device in devices.items() for note in device["notes"]}
        missed = {(name, note) for name, note in notes if note == "missed"}
        self.assertEqual(notes - missed, {("two models", "model-without-search")})
        self.assertEqual(len(missed), max(device["delay"]["hidden"] for device in devices.values()
                                          if "delay" in device))
        self.assertGreater(devices["no-answer"]["delay"]["seconds"], 11)
        self.assertGreater(devices["late"]["answer"]["exchanges"][0]["seconds"], 2.4)

    def test_ask_agrees_with_snmpget_about_every_reply(self):
        asked = []
        for number, (answer, *expected) in enumerate(REPLIES):
            address = f"127.0.8.{number + 1}"
            if answer:
                serve(address, answer)
            asked.append((start(PROGRAM, "ask", "--json", address), start(
                "snmpget", "-v1", "-Ov", "-r0", "-t2", "-c", "corridor", address, OBJECT), *expected))
        for number, (ours, theirs, outcome, value, text) in enumerate(asked):
            with self.subTest(number=number, outcome=outcome, text=text):
                answer = json.loads(ours.communicate()[0])
                exchange = answer["answer"]["exchanges"][0]
                self.assertEqual((exchange["outcome"], exchange["value"]), (outcome, value))
                self.assertEqual(answer["status"], {2: 0, None: 2}.get(value, 1))
                self.assertEqual(exchange["changedQuestion"], number == 11)
                self.assertIn(text, "".join(theirs.communicate()))
        result = run(PROGRAM, "ask", "-v", "127.0.8.16")
        self.assertRegex(result.stdout, r"unreadable after .*(?s:.*)no element: ")

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
        self.fail('the device "listed" did not get its verdict')

    def test_resolves_a_uri(self):
        result = run(PROGRAM, "uri", "dnssd://two%20models._pdl-datastream._tcp.local./?bidi")
        self.assertRegex(result.stdout, r"^127\.0\.1\.\d+\n$")
        result = run(PROGRAM, "uri", "usb://Kestrel/Model%20100")
        self.assertEqual((result.returncode, result.stdout), (1, ""))


class Wizard(unittest.TestCase):
    maxDiff = None

    @classmethod
    def setUpClass(cls):
        serve("127.0.9.3", reply(seconds=2.5))

    def test_lists_the_same_devices_as_the_wizard_for_every_model(self):
        with open(pathlib.Path(MEDIUM, "MacResources", "CDInfo.plist"), "rb") as file:
            models = list(plistlib.load(file)["ContainedModel"])
        searches = [[model] for model in models] + [models]
        for seconds in ("6", "40"):  # on a busy machine, the shorter search may miss a device
            explained = [start(*browse("-s", seconds, *(f"--model={model}" for model in wanted)))
                         for wanted in searches]
            shown = [start(PROBE, f"{MEDIUM}/Onramp OSX.app", seconds, *wanted) for wanted in searches]
            devices = [by_name(one.communicate()[0]) for one in explained]
            listed = [sorted(name for name, device in found.items() if device["listed"])
                      for found in devices]
            wizards = [sorted(one.communicate()[0].splitlines()) for one in shown]
            if listed == wizards and listed[-1]:
                break
        self.assertEqual(listed, wizards)
        self.assertEqual(listed[-1], ["listed", "two models"])
        self.assertEqual(devices[models.index("Kestrel Model 200")]["listed"]["verdict"]["id"],
                         "other-model")


class Nobody(unittest.TestCase):
    def problems(self):
        result = run(*browse("-s", "1"))
        self.assertEqual(result.returncode, 1)
        return [problem["id"] for problem in json.loads(result.stdout)["network"]]

    def test_says_what_is_wrong_with_the_network(self):
        self.assertEqual(self.problems(), ["nothing-announced"])
        subprocess.run("ip route del 224.0.0.0/4 dev lo", shell=True, check=True)
        self.assertEqual(self.problems(), ["no-network"])
        subprocess.run("ip link add here type veth peer name there && ip address add 192.0.2.7/24 dev here"
                       " && ip link set here up && ip link set there up", shell=True, check=True)
        self.assertEqual(self.problems(), ["multicast-blocked"])
        subprocess.run([TOOL, "ctl", "stop-daemon"], check=True)
        self.assertEqual(self.problems(), ["no-daemon"])


def serve(address, answer):
    class Handler(socketserver.BaseRequestHandler):
        def handle(self):
            self.request[1].sendto(answer(self.request[0]), self.client_address)
    threading.Thread(target=socketserver.UDPServer((address, 161), Handler).serve_forever, daemon=True).start()


class CommandLine(unittest.TestCase):
    def test_refuses_bad_arguments_with_a_remedy(self):
        for words, message in (("browse", "--medium is required"), ("browse -m /proc", "contains no application"),
                               ("ask", "ADDRESS is required"), ("ask no-such", "neither an IPv4 address"),
                               ("serch", 'no command "serch"'), ("browse --medum x", "--medum")):
            with self.subTest(words):
                result = run(PROGRAM, *words.split())
                self.assertEqual((result.returncode, message in result.stderr), (2, True), result.stderr)


class Networks(unittest.TestCase):
    def test_the_other_classes_pass_on_practice_networks(self):
        with tempfile.TemporaryDirectory() as folder:
            started = []
            for text, tests in ((DESCRIPTION, "Everybody"), (DESCRIPTION, "Wizard"), ("", "Nobody")):
                description = pathlib.Path(folder, tests)
                description.write_text(text)
                started.append((tests, start(TOOL, str(description), sys.executable, "-B", __file__,
                                             *sys.argv[1:4], tests)))
            for tests, process in started:
                with self.subTest(tests):
                    _, errors = process.communicate(timeout=240)
                    self.assertEqual(process.returncode, 0, errors)

    def test_devices_of_the_example_get_the_verdicts_that_its_comments_give(self):
        example = SOURCE / "examples/practice-network.toml"
        said = re.findall(r'^name = "(.+)"  # ([\w-]+)$', example.read_text(encoding="utf-8"), re.MULTILINE)
        devices = by_name(run(TOOL, str(example), *browse()).stdout)
        self.assertEqual({name: device["verdict"]["id"] for name, device in devices.items()}, dict(said))
        self.assertEqual(len(said), 19)

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
