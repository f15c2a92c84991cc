"""Tests "onramp-devices hosts". Must run under tests/in_namespace. Arguments: the program, and the
script that sets up a network to search."""

import socket
import subprocess
import sys
import unittest

PROGRAM, NETWORK = sys.argv[1:]

NO_NETWORK = """primary interface: none
local addresses: none
"""

SEARCHED = """primary interface: wire
local addresses:
  address 198.51.100.1  mask 255.255.255.0  broadcast 198.51.100.255
  address 127.0.0.1  mask 255.0.0.0  broadcast 127.255.255.255
  address 203.0.113.1  mask 255.255.255.255  broadcast -
  address 192.0.2.1,192.0.2.2  mask 255.255.255.0,255.255.255.0  broadcast 192.0.2.255
"""


def run(*arguments, **options):
    return subprocess.run((PROGRAM, "hosts") + arguments, stderr=subprocess.PIPE, text=True, timeout=60,
                          **{"stdout": subprocess.PIPE, **options})


def answer(address, number):
    return f"  address {address}  ActiveIF {number} ({'wireless' if number == 2 else 'not wireless'})"


class Hosts(unittest.TestCase):
    def test_shows_the_addresses_and_the_devices_that_answer(self):
        self.assertEqual(run("-n").stdout, NO_NETWORK)
        self.assertEqual(run().stdout, NO_NETWORK + "devices that answer: none\n")

        subprocess.check_call("ip link set lo up && ip addr flush dev lo &&"
                              " ip addr add 127.0.0.1/8 brd + dev lo", shell=True)
        with socket.socket(socket.AF_INET, socket.SOCK_DGRAM) as listener:
            listener.bind(("", 161))
            self.assertIn("devices that answer: none\n", run().stdout)
            self.assertRaises(BlockingIOError, listener.recv, 1500, socket.MSG_DONTWAIT)

        subprocess.check_call([NETWORK])
        subprocess.check_call("ip addr add 192.0.2.2/24 dev wire &&"
                              " ip route add default via 192.0.2.254", shell=True)
        result = run()
        self.assertEqual((result.returncode, result.stderr), (0, ""))
        network, devices = result.stdout.split("devices that answer:\n")
        self.assertEqual(network, SEARCHED)
        devices = devices.splitlines()
        self.assertEqual(devices[:256], [answer("198.51.100.99", number) for number in range(256)])
        self.assertEqual(sorted(devices[256:]),
                         [answer("192.0.2.11", 1), answer("192.0.2.12", 2)] + [answer("192.0.2.13", 7)] * 3)

    def test_reports_that_its_output_cannot_be_written(self):
        with open("/dev/full", "w", encoding="utf-8") as full:
            result = run("-n", stdout=full)
        self.assertEqual(result.returncode, 2)
        self.assertIn("could not be written", result.stderr)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
