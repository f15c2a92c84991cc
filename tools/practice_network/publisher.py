"""The mDNS side of the devices. A real Avahi daemon publishes their host names and services."""

import dataclasses
import ipaddress
import time

import dbus
import dbus.bus

AVAHI = "org.freedesktop.Avahi"
ANY_INTERFACE = dbus.Int32(-1)
ANY_PROTOCOL = dbus.Int32(-1)
NO_FLAGS = dbus.UInt32(0)
# The flags mean: unique, no probes, several records for one name. Nobody else uses the host names,
# so probes are unnecessary. They would even do harm: on loopback, Avahi receives its own probes, and
# treats a probe as a conflict if the record has changed since the probe was sent.
ADDRESS_FLAGS = dbus.UInt32(1 | 2 | 8)
ADDRESS_SECONDS = dbus.UInt32(120)  # RFC 6762, section 10
CLASS_IN, TYPE_A, TYPE_AAAA = dbus.UInt16(1), dbus.UInt16(1), dbus.UInt16(28)
SERVER_RUNNING = 2
GROUP_STATES = {0: "withdrawn", 1: "probing", 2: "established", 3: "collision", 4: "failed"}


class PublishError(Exception):
    """Raised when Avahi does not start, and when it does not publish a device within a time limit.
    The message says which of these happened."""


def connect(bus_address, seconds=10):
    """Waits until Avahi runs. Returns a connection to the bus, and Avahi's server object on it.
    Raises PublishError if that takes longer than `seconds`."""
    bus = dbus.bus.BusConnection(bus_address)
    deadline = time.monotonic() + seconds
    while True:
        try:
            server = dbus.Interface(bus.get_object(AVAHI, "/", introspect=False),
                                    AVAHI + ".Server")
            state = server.GetState()
            if state == SERVER_RUNNING:
                return bus, server
        except dbus.DBusException as error:
            state = error
        if time.monotonic() > deadline:
            raise PublishError(f"avahi-daemon did not start: {state}")
        time.sleep(0.01)


@dataclasses.dataclass(frozen=True)
class _Entry:
    """The published records of a device. Addresses and services are in separate groups of Avahi, so
    that new addresses leave the services as they are."""

    host: str
    addresses: dbus.Interface
    services: dbus.Interface


class Publisher:
    """Publishes devices. close() withdraws all of them."""

    def __init__(self, bus_address):
        self._bus, self._server = connect(bus_address)
        self._entries = {}

    def close(self):
        self._bus.close()

    def publish(self, device, host):
        entry = _Entry(host, self._new_group(), self._new_group())
        self._entries[device.name] = entry
        self.publish_addresses(device)
        for service_type in device.type:
            entry.services.AddService(
                ANY_INTERFACE, ANY_PROTOCOL, NO_FLAGS, device.name, service_type, device.domain,
                entry.host, dbus.UInt16(device.port_of(service_type)), _txt(device, service_type))
        entry.services.Commit()

    def publish_addresses(self, device):
        """Replaces the published addresses with those in `device`."""
        entry = self._entries[device.name]
        entry.addresses.Reset()
        for address in map(ipaddress.ip_address, device.addresses):
            entry.addresses.AddRecord(
                ANY_INTERFACE, ANY_PROTOCOL, ADDRESS_FLAGS, entry.host, CLASS_IN,
                TYPE_A if address.version == 4 else TYPE_AAAA, ADDRESS_SECONDS,
                dbus.ByteArray(address.packed))
        entry.addresses.Commit()

    def publish_txt(self, device):
        """Replaces the published TXT records with those of `device`."""
        services = self._entries[device.name].services
        for service_type in device.type:
            services.UpdateServiceTxt(ANY_INTERFACE, ANY_PROTOCOL, NO_FLAGS, device.name,
                                      service_type, device.domain, _txt(device, service_type))

    def withdraw(self, device):
        if entry := self._entries.pop(device.name, None):
            entry.services.Free()
            entry.addresses.Free()

    def await_probed(self, device, seconds=5):
        """Waits until Avahi has finished probing for the device's name, for at most `seconds`.

        The device's records must not change during the probes. On loopback, Avahi receives its own
        probes, and treats a probe whose text differs from the record's as a conflict.
        """
        deadline = time.monotonic() + seconds
        while self.state(device) == "probing" and time.monotonic() < deadline:
            time.sleep(0.01)

    def state(self, device):
        """Returns "established" if both groups of the device are established, otherwise the state
        of a group that is not. Returns "withdrawn" if the device has no groups or Avahi has stopped."""
        entry = self._entries.get(device.name)
        if not entry:
            return "withdrawn"
        try:
            states = [int(group.GetState()) for group in (entry.addresses, entry.services)]
        except dbus.DBusException:
            return "withdrawn"
        return GROUP_STATES[next((state for state in states if state != 2), 2)]

    def _new_group(self):
        path = self._server.EntryGroupNew()
        return dbus.Interface(self._bus.get_object(AVAHI, path, introspect=False),
                              AVAHI + ".EntryGroup")


def _txt(device, service_type):
    pairs = (f"{key}={value}".encode() for key, value in device.txt_of(service_type))
    return dbus.Array([dbus.ByteArray(pair) for pair in pairs], signature="ay")
