"""One host of the practice network: its interface, its /run, its system bus and its Avahi."""

import os
import pathlib
import subprocess
import time

RUN = pathlib.Path("/run/practice-network")
BUS_SOCKET = "/run/dbus/system_bus_socket"
BUS_ADDRESS = f"unix:path={BUS_SOCKET}"

MULTICAST = "224.0.0.0/4"

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
use-ipv6=no
allow-interfaces={interface}
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
    """A part of the host did not come up; says which and why."""


def run(*command):
    result = subprocess.run(command, capture_output=True, text=True)
    if result.returncode:
        raise HostError(f"{' '.join(command)}: {result.stderr.strip()}")


def take_over_run():
    """Puts an empty /run into this process's mount namespace."""
    # A machine's own static services must not show up among the made-up devices.
    if pathlib.Path("/etc/avahi/services").is_dir():
        run("mount", "-t", "tmpfs", "none", "/etc/avahi/services")
    run("mount", "-t", "tmpfs", "-o", "mode=755", "none", "/run")
    RUN.mkdir()


def loop_back():
    """Makes the loopback interface of this network namespace the network."""
    run("ip", "link", "set", "lo", "up", "multicast", "on")
    run("ip", "route", "add", MULTICAST, "dev", "lo")


def plug_in_cable(name, own_address, first_address):
    """Joins this network namespace and that of the first process by a virtual cable."""
    first = ("nsenter", "--target", "1", "--net")
    run("ip", "link", "add", name, "type", "veth", "peer", "name", name, "netns", "1")
    for enter, address in (((), own_address), (first, first_address)):
        run(*enter, "ip", "link", "set", "lo", "up")
        run(*enter, "ip", "address", "add", address, "dev", name)
        run(*enter, "ip", "link", "set", name, "up")
        run(*enter, "ip", "route", "add", MULTICAST, "dev", name)


class Host:
    """The host that this process's namespaces are, with its system bus, and Avahi once started."""

    def __init__(self, name, interface):
        self._name = name
        self._interface = interface
        self._avahi = None
        self._start_bus()

    def add_address(self, address):
        run("ip", "address", "replace", address, "dev", self._interface)

    def start_avahi(self):
        if self._avahi and self._avahi.poll() is None:
            return
        configuration = RUN / "avahi-daemon.conf"
        configuration.write_text(
            AVAHI_CONFIGURATION.format(host_name=self._name, interface=self._interface))
        self._avahi = _start("avahi-daemon", "-f", configuration, "--no-drop-root", "--no-chroot",
                             "--no-rlimits")

    def stop_avahi(self):
        """Ends the daemon as a system does: it says goodbye for all its services."""
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
                raise HostError(f"dbus-daemon does not come up:\n{log('dbus-daemon')}")
            time.sleep(0.005)


def log(program):
    return (RUN / f"{program}.log").read_text(errors="replace").strip()


def _start(program, *arguments):
    # In a session of its own, so that Ctrl-C at the command does not reach it.
    with open(RUN / f"{program}.log", "ab") as output:
        return subprocess.Popen([program, *arguments], stdin=subprocess.DEVNULL, stdout=output,
                                stderr=output, start_new_session=True)
