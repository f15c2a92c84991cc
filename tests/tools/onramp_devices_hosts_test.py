"""Runs "onramp-devices hosts" in a network namespace of its own; see tests/in_namespace.
Arguments: the program, and the script that makes a network to search."""

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
  address 127.0.0.1  mask 255.0.0.0  broadcast -
  address 203.0.113.1  mask 255.255.255.255  broadcast -
  address 192.0.2.1,192.0.2.2  mask 255.255.255.0,255.255.255.0  broadcast 192.0.2.255
devices that answer:
"""


def run(*arguments, **options):
    return subprocess.run((PROGRAM, "hosts") + arguments, stderr=subprocess.PIPE, text=True, timeout=60,
                          **{"stdout": subprocess.PIPE, **options})


class Hosts(unittest.TestCase):
    def test_shows_what_there_is_and_who_answers(self):
        self.assertEqual(run("-n").stdout, NO_NETWORK)
        self.assertEqual(run().stdout, NO_NETWORK + "devices that answer: none\n")

        subprocess.check_call([NETWORK])
        subprocess.check_call("ip link set lo up && ip addr add 192.0.2.2/24 dev wire &&"
                              " ip route add default via 192.0.2.254", shell=True)
        result = run()
        self.assertEqual((result.returncode, result.stderr), (0, ""))
        self.assertTrue(result.stdout.startswith(SEARCHED), result.stdout)
        for line in ("  address 192.0.2.11  ActiveIF 1 (not wireless)\n",
                     "  address 192.0.2.12  ActiveIF 2 (wireless)\n"):
            self.assertEqual(result.stdout.count(line), 1, result.stdout)

    def test_tells_when_its_output_is_lost(self):
        with open("/dev/full", "w", encoding="utf-8") as full:
            result = run("-n", stdout=full)
        self.assertEqual(result.returncode, 2)
        self.assertIn("could not be written", result.stderr)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
