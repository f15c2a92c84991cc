"""One host of the practice network: its interfaces, its /run, its system bus and its Avahi."""

import os
import pathlib
import subprocess
import time

RUN = pathlib.Path("/run/practice-network")
BUS_SOCKET = "/run/dbus/system_bus_socket"
BUS_ADDRESS = f"unix:path={BUS_SOCKET}"

MULTICAST = "224.0.0.0/4"
IN_FIRST_HOST = ("nsenter", "--target", "1", "--net")

BUS_CONFIGURATION = f"""\
<busconfig>
  <type>system</type>
  <listen>{BUS_ADDRESS}</listen>
  <auth>EXTERNAL</auth>
  <policy context="default">
    <allow user="*"/>
    <allow own="*"/>
    <allow send_destination="*" eavesdrop="true"/>
    <allow eavesdrop="true"/>
  </policy>
  <limit name="max_connections_per_user">4096</limit>
  <limit name="max_completed_connections">8192</limit>
  <limit name="max_match_rules_per_connection">65536</limit>
  <limit name="max_replies_per_connection">65536</limit>
</busconfig>
"""

AVAHI_CONFIGURATION = """\
[server]
host-name={host_name}
use-ipv4=yes
use-ipv6={ipv6}
allow-interfaces={interfaces}
browse-domains={domains}
enable-dbus=yes
clients-max=4096
objects-per-client-max=65536
entries-per-entry-group-max=64
cache-entries-max=65536
ratelimit-burst=100000

[publish]
publish-addresses=no
publish-hinfo=no
publish-workstation=no
"""


class HostError(Exception):
    """Raised when a command fails or a daemon does not start. The message names the program and the
    reason."""


def run(*command):
    result = subprocess.run(command, capture_output=True, text=True)
    if result.returncode:
        raise HostError(f"{' '.join(command)}: {result.stderr.strip()}")


def take_over_run():
    """Mounts an empty /run in this process's mount namespace, and hides the services that this
    machine's Avahi configuration announces."""
    # These services would appear among the made-up devices.
    if pathlib.Path("/etc/avahi/services").is_dir():
        run("mount", "-t", "tmpfs", "none", "/etc/avahi/services")
    run("mount", "-t", "tmpfs", "-o", "mode=755", "none", "/run")
    RUN.mkdir()


def loop_back(second):
    """Sets up the loopback interface, which connects the devices and the user's command.

    `second` is the name of a second interface to create, or None.
    """
    _configure("lo")
    if second:
        run("ip", "link", "add", second, "type", "veth", "peer", "name", "far-end")
        run("ip", "link", "set", "far-end", "up")
        _configure(second, "192.0.2.1/24")


def plug_in_cables(names):
    """Connects this network namespace to that of process 1, with a virtual cable for each name.

    All cables are in the same network, as a computer's Ethernet and Wi-Fi can be. When a cable is
    unplugged, the next cable carries the traffic.
    """
    for number, name in enumerate(names):
        run("ip", "link", "add", name, "type", "veth", "peer", "name", name, "netns", "1")
        for enter, address in (((), f"192.0.2.{2 * number + 2}/24"),
                               (IN_FIRST_HOST, f"192.0.2.{2 * number + 1}/24")):
            if not number:
                run(*enter, "ip", "link", "set", "lo", "up")
                _set_kernel("ipv4/conf/all/ignore_routes_with_linkdown", 1, enter)
            _configure(name, address, number, enter)


def _configure(name, address=None, metric=0, enter=()):
    # No other host can use these addresses, so looking for duplicates would only cost a second.
    _set_kernel(f"ipv6/conf/{name}/accept_dad", 0, enter)
    if address:
        run(*enter, "ip", "address", "add", address, "brd", "+", "dev", name, "metric", str(metric))
    _bring_up(name, metric, enter)


def _bring_up(name, metric, enter):
    run(*enter, "ip", "link", "set", name, "up", "multicast", "on")
    run(*enter, "ip", "route", "replace", MULTICAST, "dev", name, "metric", str(metric))


def _set_kernel(key, value, enter):
    run(*enter, "sh", "-c", f"echo {value} > /proc/sys/net/{key}")


class Host:
    """The host that this process's namespaces form. The constructor starts the host's system bus."""

    def __init__(self, name, interfaces, settings):
        self._name = name
        self.interfaces = interfaces
        self._settings = settings
        self._avahi = None
        self._start_bus()

    def add_address(self, address):
        run("ip", "address", "replace", address, "dev", self.interfaces[0])

    def plug(self, interface, plugged):
        """Brings the interface up if `plugged` is true, otherwise down. With two hosts,
        brings both ends of the cable up or down."""
        for enter in ((), IN_FIRST_HOST):
            if plugged:
                _bring_up(interface, self.interfaces.index(interface), enter)
            else:
                run(*enter, "ip", "link", "set", interface, "down")

    def start_avahi(self):
        if self._avahi and self._avahi.poll() is None:
            return
        configuration = RUN / "avahi-daemon.conf"
        configuration.write_text(AVAHI_CONFIGURATION.format(
            host_name=self._name, interfaces=",".join(self.interfaces),
            domains=",".join(self._settings.domains),
            ipv6="yes" if self._settings.ipv6 else "no"))
        self._avahi = _start("avahi-daemon", "-f", configuration, "--no-drop-root", "--no-chroot",
                             "--no-rlimits")

    def stop_avahi(self):
        """Stops the daemon with SIGTERM, so that it announces that all its services are gone."""
        if self._avahi:
            self._avahi.terminate()
            self._avahi.wait()
            self._avahi = None

    def _start_bus(self):
        pathlib.Path(BUS_SOCKET).parent.mkdir()
        configuration = RUN / "bus.conf"
        configuration.write_text(BUS_CONFIGURATION)
        bus = _start("dbus-daemon", f"--config-file={configuration}", "--nofork", "--nopidfile")
        os.environ["DBUS_SYSTEM_BUS_ADDRESS"] = BUS_ADDRESS
        deadline = time.monotonic() + 10
        while not os.path.exists(BUS_SOCKET):
            if bus.poll() is not None or time.monotonic() > deadline:
                raise HostError(f"dbus-daemon did not start:\n{log('dbus-daemon')}")
            time.sleep(0.005)


def log(program):
    return (RUN / f"{program}.log").read_text(errors="replace").strip()


def _start(program, *arguments):
    # The new session keeps Ctrl-C, which is meant for the command, away from the daemon.
    with open(RUN / f"{program}.log", "ab") as output:
        return subprocess.Popen([program, *arguments], stdin=subprocess.DEVNULL, stdout=output,
                                stderr=output, start_new_session=True)
