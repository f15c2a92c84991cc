"""Tests practice-network, which simulates a network of devices, with avahi-browse and snmpget."""

import os
import pathlib
import re
import signal
import subprocess
import sys
import tempfile
import time
import unittest

TOOLS = pathlib.Path(__file__).resolve().parents[2] / "tools"
TOOL = str(TOOLS / "practice-network")
sys.path.insert(0, str(TOOLS))

from practice_network import ControlError, PracticeNetwork

OBJECT = "1.3.6.1.4.1.4242.2.4.4.1240.1.2.0"
DEVICES = """
[[device]]
name = "Büro 北"
maker = "Kestrel"
model = "Model 100"
note = "2nd floor"
addresses = ["127.0.1.1", "127.0.1.2"]
[[device]]
name = "Scanner"
maker = "Kestrel"
model = "Scan 50"
type = ["_scanner._tcp", "_ipp._tcp"]
port = 4000
[[device]]
name = "Odd"
addresses = ["127.0.1.20"]
"""


def run(*command, **options):
    return subprocess.run(command, capture_output=True, text=True, timeout=90, **options)


def browse(service_type):
    """Returns the services of a type as a dictionary: name → (address, port, set of TXT entries)."""
    output = run("avahi-browse", "-rptk", service_type).stdout
    rows = [line.split(";", 9) for line in output.splitlines() if line.startswith("=")]
    unescape = lambda text: re.sub(rb"\\(\d{3})", lambda match: bytes([int(match[1])]),
                                   text.encode()).decode()
    return {unescape(row[3]): (row[7], row[8], set(re.findall(r'"(.*?)"', row[9])))
            for row in rows}


class FromInside(unittest.TestCase):
    """These tests run inside a practice network with DEVICES. FromOutside starts them."""

    def setUp(self):
        self.network = PracticeNetwork()

    def test_services_carry_the_keys_of_their_type(self):
        printers = browse("_pdl-datastream._tcp")
        self.assertEqual(set(printers), {"Büro 北", "Odd"})
        self.assertEqual(printers["Büro 北"][1:], (
            "9100", {"usb_MFG=Kestrel", "usb_MDL=Model 100", "note=2nd floor"}))
        self.assertEqual(browse("_scanner._tcp")["Scanner"][1:],
                         ("4000", {"mfg=Kestrel", "mdl=Scan 50"}))
        self.assertEqual(browse("_ipp._tcp")["Scanner"][1:],
                         ("4000", {"usb_MFG=Kestrel", "usb_MDL=Scan 50"}))

    def test_a_new_device_can_be_added_and_renamed(self):
        run(TOOL, "ctl", "add", "New one", "maker=Kestrel", "model=Model 300",
            'addresses=["10.1.2.3"]', "activeif=7", check=True)
        self.addCleanup(self.network.remove, "Newer")
        self.network.settle()
        expected = ("10.1.2.3", "9100", {"usb_MFG=Kestrel", "usb_MDL=Model 300"})
        self.assertEqual(browse("_pdl-datastream._tcp")["New one"], expected)
        self.assertIn("INTEGER: 7", run("snmpget", "-v1", "-Ov", "-c", "corridor", "10.1.2.3",
                                        OBJECT).stdout)
        with subprocess.Popen(["avahi-browse", "-p", "_pdl-datastream._tcp"], text=True,
                              stdout=subprocess.PIPE) as watch:
            self.addCleanup(watch.kill)
            self.network.rename("New one", "Newer")
            self.assertTrue(any(re.match(r"-;.*;New\\032one;", line) for line in watch.stdout))
            watch.kill()
        self.network.settle()
        self.assertEqual(browse("_pdl-datastream._tcp")["Newer"], expected)

    def test_devices_are_back_after_the_daemon_was_stopped_and_started(self):
        self.network.stop_daemon()
        self.assertNotEqual(run("avahi-browse", "-at").returncode, 0)
        self.network.start_daemon()
        self.network.settle()
        self.assertEqual(set(browse("_pdl-datastream._tcp")), {"Büro 北", "Odd"})

    def test_a_refused_request_changes_nothing(self):
        before = self.network.list()
        for message, request in (
                ("is unknown", lambda: self.network.set("Nobody", port=1)),
                ("port must be", lambda: self.network.set("Odd", port="x")),
                ("the interfaces are lo", lambda: self.network.unplug("eth7")),
                ("exists already", lambda: self.network.rename("Odd", "Scanner")),
                ("another device's", lambda: self.network.add("Twin", addresses=["127.0.1.2"]))):
            with self.subTest(message), self.assertRaisesRegex(ControlError, message):
                request()
        self.assertEqual(self.network.list(), before)


class FromOutside(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name)

    def describe(self, text):
        path = self.folder / "devices.toml"
        path.write_text(text)
        return str(path)

    def test_the_command_runs_on_a_network_with_the_described_devices(self):
        result = run(TOOL, self.describe(DEVICES), sys.executable, "-B", __file__, "FromInside")
        self.assertEqual(result.returncode, 0, result.stderr)

    def test_the_exit_status_is_that_of_the_command(self):
        description = self.describe("")
        for command, status in ((["sh", "-c", "exit 5"], 5), (["sh", "-c", "kill -9 $$"], 137),
                                (["/no/such/program"], 127)):
            with self.subTest(command):
                self.assertEqual(run(TOOL, description, *command).returncode, status)

    def test_no_process_is_left_after_the_tool_is_killed(self):
        for number, status in ((signal.SIGKILL, -9), (signal.SIGTERM, 143)):
            with self.subTest(number):
                tool = subprocess.Popen(
                    [TOOL, self.describe(DEVICES), "sh", "-c",
                     "(setsid sleep 600 &); readlink /proc/self/ns/pid; sleep 600"],
                    stdout=subprocess.PIPE, text=True)
                namespace = tool.stdout.readline().strip()
                self.assertGreater(len(processes_in(namespace)), 6)
                tool.send_signal(number)
                self.assertEqual(tool.wait(30), status)
                tool.stdout.close()
                deadline = time.monotonic() + 10
                while processes_in(namespace) and time.monotonic() < deadline:
                    time.sleep(0.05)
                self.assertEqual(processes_in(namespace), [])

    def test_a_bad_description_is_reported_with_its_remedy(self):
        for text, message in (
                ("[[device]]\nname = x\n", "not valid TOML.*line 2"),
                ('[[devices]]\nname = "A"', r'unknown entry "devices".*\[\[device\]\]'),
                ('[network]\nipv4 = true', 'network: unknown entry.*did you mean "ipv6"'),
                ('[device]\nname = "A"', "double brackets"),
                ("[[device]]\nport = 1", "device number 1: name is missing"),
                ('[[device]]\nname = "A"\nmodle = "x"', 'device "A".*did you mean "model"'),
                ('[[device]]\nname = "A"\n' * 2, 'device "A": the name is used twice'),
                (f'[[device]]\nname = "{"ü" * 32}"', "1 to 63 bytes"),
                ('[[device]]\nname = "A"\nactiveif = "quiet"', '"silent", "closed".*\'quiet\''),
                ('[[device]]\nname = "A"\nactiveif = [1, 2]', "2 values for 1 addresses"),
                ('[[device]]\nname = "A"\naddresses = ["127.0.1"]', "list of different addresses"),
                ('[[device]]\nname = "A"\naddresses = ["127.0.1.1"]\n'
                 '[[device]]\nname = "B"\naddresses = ["127.0.1.1"]', "another device's address")):
            with self.subTest(text):
                path = self.describe(text)
                result = run(TOOL, path, "true")
                self.assertEqual(result.returncode, 2)
                self.assertRegex(result.stderr, message)
                self.assertIn(path, result.stderr)
        result = run(TOOL, path, "true", env=os.environ | {"ONRAMP_MAKER": "/nowhere"})
        self.assertEqual(result.returncode, 2)
        self.assertRegex(result.stderr, "^practice-network: /nowhere: cannot be read.*ONRAMP_MAKER")

    @unittest.skipIf(os.getuid(), "needs root, because the test hides sudo")
    def test_a_missing_program_is_reported_with_its_package(self):
        for program in ("unshare", "setpriv", "mount", "ip"):
            (self.folder / program).symlink_to("/bin/true")
        result = run(TOOL, self.describe(""), "true", env={"PATH": str(self.folder)})
        self.assertEqual(result.returncode, 125)
        self.assertRegex(result.stderr, "is missing; install it: apt-get install ")


def processes_in(namespace):
    found = []
    for path in pathlib.Path("/proc").glob("[0-9]*/ns/pid"):
        try:
            if os.readlink(path) == namespace:
                found.append(path)
        except OSError:
            pass  # The process has exited, or belongs to another user.
    return found


if __name__ == "__main__":
    if "FromInside" not in sys.argv:
        probe = run(TOOL, "/dev/null", "true")
        if probe.returncode == 77:
            print(probe.stderr, end="")
            sys.exit(77)
    unittest.main(defaultTest="FromOutside")
