"""Tests device discovery with real daemons: network_test.py PROBE CHOOSER_PROBE MEDIUM [CLASS]

Two cables, each with IPv4 and IPv6, connect two hosts. The tests run on one of them. On the other
host, Avahi announces devices. One test also announces a device from the tests' own host, with
zeroconf, another mDNS implementation."""

import os
import pathlib
import socket
import subprocess
import sys
import time
import unittest

HERE = pathlib.Path(__file__).resolve().parent
sys.path[:0] = [str(HERE), str(HERE.parent.parent / "tools")]

import discovery
from practice_network.control import PracticeNetwork
from discovery import Avahi, Search
from zeroconf import ServiceInfo, Zeroconf

PROBE, CHOOSER, MEDIUM = map(os.path.abspath, sys.argv[1:4])
TYPE = "_ipp._tcp"
WIZARDS_TYPE = "_pdl-datastream._tcp"
ETH_P_ALL = 3


def packets():
    """Returns a socket that receives every packet on all interfaces of this host."""
    opened = socket.socket(socket.AF_PACKET, socket.SOCK_DGRAM, socket.htons(ETH_P_ALL))
    opened.settimeout(discovery.PATIENCE)
    return opened


def asked(seen, last):
    """Reads from the socket `seen` until an SNMP request goes to the address `last`. Returns the
    destinations of all SNMP requests up to and including this one."""
    addresses = []
    while last not in addresses:
        packet = seen.recv(100)
        if packet[0] == 0x45 and packet[9] == socket.IPPROTO_UDP and packet[22:24] == b"\0\xa1":
            addresses.append(socket.inet_ntoa(packet[16:20]))
    return addresses


class Network(unittest.TestCase):
    def setUp(self):
        self.network = PracticeNetwork()
        self.avahi = Avahi()

    def add(self, name, **entries):
        self.network.add(name, **{"type": TYPE, "activeif": "closed", "maker": "Kestrel",
                                  "model": "Model 100"} | entries)
        self.addCleanup(self.network.remove, name)

    def assert_leads_to(self, uri, address):
        answer = subprocess.run([PROBE, "addresses", uri, "20"], text=True, check=True,
                                stdout=subprocess.PIPE).stdout
        self.assertEqual(answer.strip().split("\t")[1:], ["addresses", address])


class Devices(Network):
    def test_devices_with_unusual_names_are_found_and_those_without_dots_also_by_uri(self):
        names = ["Bldg. 2, 3rd floor", "A B (1)", "Büro – 会議室", "🖨️ Drucker", "100% & more?",
                 "Osprey #2", "x" * 63]
        for name in names:
            self.add(name, note=f"at {name}"[:40])
        with Search(PROBE, TYPE) as search:
            for name in names:
                _, _, _, model, _, uri, address = search.wait_for("update", name)
                self.assertEqual(model, "Kestrel Model 100")
                if "." in name:  # Dots are not escaped in a URI, so the name may be misread.
                    continue
                self.assert_leads_to(uri, address)

    def test_a_device_has_all_its_ipv4_addresses_and_no_others(self):
        self.add("Three", addresses=3)
        self.add("Mixed", addresses=["fd00::7", "192.0.2.77"])
        self.add("Six", addresses=["fd00::8"])
        with Search(PROBE, TYPE) as search:
            self.assertEqual(len(search.wait_for("update", "Three")[6].split(",")), 3)
            self.assertEqual(search.wait_for("update", "Mixed")[6], "192.0.2.77")
            self.assertEqual(search.wait_for("update", "Six")[6], "")

    def test_a_second_mdns_implementation_is_understood(self):
        def service(model):
            # The value of the first "usb_MDL" counts.
            texts = (b"usb_MFG=Harrier", b"note=Attic", b"usb_MDL=" + model, b"usb_MDL=Other")
            return ServiceInfo(f"{TYPE}.local.", f"Harrier (2).{TYPE}.local.", port=631,
                               addresses=[socket.inet_aton("192.0.2.1")], server="second.local.",
                               properties=b"".join(bytes([len(text)]) + text for text in texts))

        responder = Zeroconf(interfaces=["192.0.2.1"])
        self.addCleanup(responder.close)
        responder.register_service(service(b"Jet 7"))
        with Search(PROBE, TYPE) as search:
            self.assertEqual(search.wait_for("update", "Harrier (2)")[3:7:3],
                             ["Harrier Jet 7", "192.0.2.1"])
            responder.update_service(service(b"Jet 8"))
            # Avahi notices the change after a while, but reports it only to new searches.
            model = None
            deadline = time.monotonic() + discovery.PATIENCE
            while model != "Harrier Jet 8" and time.monotonic() < deadline:
                with Search(PROBE, TYPE) as again:
                    model = again.wait_for("update", "Harrier (2)")[3]
            self.assertEqual(model, "Harrier Jet 8")
            responder.close()
            search.wait_for("remove", "Harrier (2)")

    def test_a_device_is_found_once_however_often_it_is_seen(self):
        self.addCleanup(self.avahi.restart)
        for interfaces in ("practice0", "practice0,practice1"):
            for ipv4, ipv6 in (("yes", "no"), ("yes", "yes"), ("no", "yes")):
                with self.subTest(interfaces=interfaces, ipv4=ipv4, ipv6=ipv6):
                    self.avahi.restart(allow_interfaces=interfaces, use_ipv4=ipv4, use_ipv6=ipv6)
                    self.network.add("Dual", type=TYPE, addresses=["192.0.2.66"])
                    with Search(PROBE, TYPE) as search:
                        self.assertEqual(search.wait_for("update", "Dual")[6], "192.0.2.66")
                        self.network.remove("Dual")
                        search.wait_for("remove", "Dual")
                        # Before Avahi announces a new device, it checks that the name is free.
                        # Meanwhile, the removed device disappears on all interfaces and protocols.
                        self.add("Next")
                        search.wait_for("update", "Next")
                        self.assertEqual([event[1] for event in search.events(None, "Dual")],
                                         ["found", "update", "gone", "remove"])

    def test_a_device_on_two_interfaces_is_gone_only_when_both_are_unplugged(self):
        for interface in ("practice0", "practice1"):
            self.addCleanup(self.network.plug, interface)
        uri = "dnssd://Kestrel._ipp._tcp.local."
        with Search(PROBE, TYPE) as search:
            address = search.wait_for("update", "Kestrel")[6]
            for lost, left in (("practice0", "practice1"), ("practice1", "practice0")):
                self.network.unplug(lost)
                # The daemon of this host notices the loss a little later.
                self.avahi.wait_for_interfaces(TYPE, {left})
                self.assert_leads_to(uri, address)
                self.assertEqual(search.events("gone"), [])
                self.network.plug(lost)
                self.avahi.wait_for_interfaces(TYPE, {lost, left})
            self.network.unplug("practice0")
            self.network.unplug("practice1")
            search.wait_for("remove", "Kestrel")
            self.network.plug("practice1")
            search.wait_for("update", "Kestrel", 2)
            self.assertEqual(len(search.events("found", "Kestrel")), 2)

    def test_the_wizard_does_not_ask_a_device_that_leaves(self):
        self.network.add("Leaving", maker="Kestrel", model="Model 100", addresses=["192.0.2.91"])
        self.network.settle()
        self.avahi.wait_for_interfaces(WIZARDS_TYPE, {"practice0", "practice1"})
        with packets() as seen:
            chooser = subprocess.Popen([CHOOSER, f"{MEDIUM}/Onramp OSX.app", "600", "Kestrel Model 100"])
            self.addCleanup(chooser.wait)
            self.addCleanup(chooser.kill)
            asked(seen, "192.0.2.91")
        with Search(PROBE, WIZARDS_TYPE) as search:
            search.wait_for("update", "Leaving")
            with packets() as seen:
                self.network.remove("Leaving")
                search.wait_for("remove", "Leaving")
                self.add("Next", type=WIZARDS_TYPE, activeif=2, addresses=["192.0.2.92"])
                self.assertEqual(asked(seen, "192.0.2.92"), ["192.0.2.92"])

    def test_all_domains_that_the_computer_browses_are_searched(self):
        self.add("Far", domain="annex.local")
        self.add("Farther", domain="attic.local")
        with Search(PROBE, TYPE) as search:
            self.assertEqual(search.wait_for("update", "Far")[5],
                             "dnssd://Far._ipp._tcp.annex.local.")
            search.wait_for("update", "Kestrel")
            discovery.announce_pointer("b._dns-sd._udp", [b"attic", b"local"])
            search.wait_for("update", "Farther")
            discovery.announce_pointer("b._dns-sd._udp", [b"attic", b"local"], seconds=0)
            search.wait_for("remove", "Farther")
            self.assertEqual(search.events("remove", "Far"), [])


class Daemons(Network):
    def test_many_devices_are_found_even_by_a_daemon_with_a_low_limit(self):
        self.addCleanup(self.avahi.restart)
        for limit, count in (("5", 6), ("1024", 200)):
            names = {f"Flock {number} of {count}" for number in range(count)}
            for name in names:
                self.add(name, addresses=["192.0.2.100"])
            self.avahi.restart(objects_per_client_max=limit)
            with self.subTest(limit=limit), Search(PROBE, TYPE) as search:
                search.wait(lambda: names <= {event[2] for event in search.events("update")})

    def test_the_daemon_may_be_absent_at_the_start_and_restart_later(self):
        self.avahi.kill()
        with Search(PROBE, TYPE) as search:
            for count in (1, 2, 3):
                self.assertEqual(len(search.events("found")), count - 1)
                self.avahi.start()
                search.wait_for("update", "Kestrel", count)
                self.avahi.kill()
                search.wait_for("remove", "Kestrel", count)
            self.avahi.start()
            self.assertEqual(search.end(), 0)

    def test_the_message_bus_may_start_late(self):
        late = pathlib.Path("/run/late_bus")
        self.addCleanup(late.unlink)
        with socket.socket(socket.AF_UNIX) as refusing:
            refusing.bind(str(late))
            refusing.listen()
            refusing.settimeout(discovery.PATIENCE)
            search = Search(PROBE, TYPE, env=os.environ | {
                "DBUS_SYSTEM_BUS_ADDRESS": f"unix:path={late}"})
            refusing.accept()[0].close()
        late.unlink()
        late.symlink_to("/run/dbus/system_bus_socket")
        with search:
            search.wait_for("update", "Kestrel")

    def test_a_daemon_that_hangs_does_not_block_the_program(self):
        with Search(PROBE, TYPE) as search:
            search.wait_for("update", "Kestrel")
            self.avahi.freeze()
            self.addCleanup(self.avahi.thaw)
            # Calls on the message bus time out after 25 seconds. The probe must finish sooner.
            self.assertEqual(subprocess.run(
                [PROBE, "addresses", "dnssd://Kestrel._ipp._tcp.local.", "1"], check=False,
                stdout=subprocess.DEVNULL, timeout=20).returncode, 1)
            self.assertEqual(search.end(20), 0)

    def test_odd_announcements_do_no_harm(self):
        instance = [b"Ghost", *TYPE.encode().split(b"."), b"local"]
        with Search(PROBE, TYPE) as search:
            for labels in (instance, [b"Odd", b"_no type", b"tcp", b"local"], [b"\xff\x00\x1b"],
                           [b"local"], [b"Two", b"Names", *instance[1:]]):
                discovery.announce_pointer(TYPE, labels)
            search.wait_for("found", "Ghost")
            self.add("Merlin")
            search.wait_for("update", "Merlin")
            self.assertEqual(search.events("update", "Ghost"), [])
            # The daemon gives up resolving after five seconds. The program must ask the daemon
            # again.
            time.sleep(6)
            self.add("Ghost")
            search.wait_for("update", "Ghost")
            self.assertEqual(search.end(), 0)


if __name__ == "__main__":
    discovery.enclose(HERE / "network.toml")
    unittest.main(argv=sys.argv[:1] + sys.argv[4:], verbosity=2)
