"""The devices of a running network, and the operations that change them."""

import collections
import dataclasses
import ipaddress
import itertools
import time

from practice_network import description
from practice_network.agents import Agents
from practice_network.description import DescriptionError
from practice_network.host import BUS_ADDRESS, RUN
from practice_network.publisher import Publisher, PublishError


class Network:
    """All known devices. While a device is present, that is, switched on, it is published and its
    agents run."""

    def __init__(self, host, subnet):
        self._host = host
        self._subnet = ipaddress.ip_network(subnet)
        self._agents = Agents(RUN / "agents")
        self._publisher = None
        self._devices = {}
        # A device keeps its host name when it is switched off and on again.
        numbers = itertools.count(1)
        self._host_names = collections.defaultdict(lambda: f"device-{next(numbers)}.local")

    def load(self, devices):
        """Makes `devices` the known devices, and publishes the devices that are present."""
        self._devices = {device.name: device for device in devices}
        # Devices with fixed addresses come first, so that other devices do not get these addresses.
        for device in sorted(devices, key=lambda one: isinstance(one.addresses, int)):
            self._devices[device.name] = self._with_addresses(device)
        present = [device for device in self._devices.values() if device.present]
        self._agents.start(present)
        if not self._subnet.is_loopback:
            self._agents.relay_broadcasts(str(self._subnet.broadcast_address))
        self.start_daemon()

    def start_daemon(self):
        self._host.start_avahi()
        if not self._publisher:
            self._publisher = Publisher(BUS_ADDRESS)
            for device in self._devices.values():
                if device.present:
                    self._publish(device)

    def unplug(self, interface):
        """Takes an interface down, both for the devices and for the command that practice-network
        runs. plug() brings it back."""
        self._plug(interface, False)

    def plug(self, interface):
        self._plug(interface, True)

    def _plug(self, interface, plugged):
        if interface not in self._host.interfaces:
            raise DescriptionError(f'interface "{interface}" is unknown; the interfaces are '
                                   + ", ".join(self._host.interfaces))
        self._host.plug(interface, plugged)

    def settle(self, seconds=30):
        """Waits until Avahi has published every device that is present. Raises PublishError
        if that takes longer than `seconds`."""
        deadline = time.monotonic() + seconds
        for device in self._devices.values():
            while device.present and (state := self._state(device)) != "established":
                if time.monotonic() > deadline:
                    raise PublishError(f'device "{device.name}" is still not published: it is '
                                       f'{state}')
                time.sleep(0.01)

    def stop_daemon(self):
        if self._publisher:
            self._publisher.close()
            self._publisher = None
        self._host.stop_avahi()

    def add(self, name, entries):
        """Updates the given entries of a known device and switches the device on. If the device is
        unknown, adds it with these entries."""
        if name in self._devices:
            self.set(name, entries | {"present": True})
            return
        device = description.device({"name": name} | entries, f'device "{name}"')
        self._devices[name] = device = self._with_addresses(device)
        if device.present:
            self._appear(device)

    def remove(self, name):
        self.set(name, {"present": False})

    def rename(self, name, new_name):
        self.set(name, {"name": new_name})

    def set(self, name, entries):
        """Updates the given entries of a device, and publishes the changes."""
        before = self._devices.get(name)
        if not before:
            raise DescriptionError(f'device "{name}" is unknown; "list" shows the known devices')
        after = description.change(before, entries, f'device "{name}"')
        if after.name != name and after.name in self._devices:
            raise DescriptionError(f'device "{after.name}" exists already; choose another name')
        after = self._with_addresses(after, name)
        if after.name != name:
            self._devices = {after.name if key == name else key: value
                             for key, value in self._devices.items()}
            self._host_names[after.name] = self._host_names[name]
            del self._host_names[name]
        self._devices[after.name] = after
        if not (before.present and after.present) or after.name != name:
            self._vanish(before)
            if after.present:
                self._appear(after)
            return

        if _agent_part(before) != _agent_part(after):
            self._agents.stop(before)
            self._agents.start([after])
        if not self._publisher:
            return
        if before.addresses != after.addresses:
            self._publisher.publish_addresses(after)
        if _service_part(before) != _service_part(after):
            self._publisher.await_probed(before)
            if _where(before) == _where(after):
                self._publisher.publish_txt(after)
            else:
                self._publisher.withdraw(before)
                self._publish(after)

    def list(self):
        """Returns a list of dictionaries, one for each device. Each has the device's entries and its
        "state", such as "established"."""
        return [{key: value for key, value in dataclasses.asdict(device).items()
                 if value is not None}
                | {"txt": dict(device.txt), "state": self._state(device)}
                for device in self._devices.values()]

    def _state(self, device):
        if not device.present or not self._publisher:
            return "withdrawn"
        return self._publisher.state(device)

    def _appear(self, device):
        self._agents.start([device])
        if self._publisher:
            self._publish(device)

    def _publish(self, device):
        self._publisher.publish(device, self._host_names[device.name])

    def _vanish(self, device):
        if self._publisher:
            self._publisher.withdraw(device)
        self._agents.stop(device)

    def _with_addresses(self, device, known_as=None):
        """Returns the device with its addresses. Chooses free addresses if `device.addresses` is a
        number. Adds the IPv4 addresses to the host, except loopback addresses. `known_as` is the
        device's old name if its name changes."""
        name = known_as or device.name
        used = {address for key, other in self._devices.items() if key != name
                for address, behaviour in zip(_list(other.addresses), other.behaviour())
                if behaviour != description.CLOSED}
        if isinstance(device.addresses, int):
            # The network's first addresses are reserved for the hosts.
            hosts = itertools.islice(self._subnet.hosts(), 256 if self._subnet.is_loopback else 9,
                                     None)
            avoided = used if device.is_closed() else used | self._addresses_of_others(name)
            free = (str(address) for address in hosts if str(address) not in avoided)
            addresses = tuple(itertools.islice(free, device.addresses))
            if len(addresses) < device.addresses:
                raise DescriptionError(f'device "{device.name}": no address of {self._subnet} is '
                                       "left; closed devices can share an address")
            device = dataclasses.replace(device, addresses=addresses)
        for address, behaviour in zip(device.addresses, device.behaviour()):
            if address in used and behaviour != description.CLOSED:
                raise DescriptionError(f'device "{device.name}": {address} is another device\'s '
                                       "address; use a free one, or leave addresses out")
            self._admit(device, ipaddress.ip_address(address))
        return device

    def _addresses_of_others(self, name):
        return {address for key, other in self._devices.items() if key != name
                for address in _list(other.addresses)}

    def _admit(self, device, address):
        if address.version == 6 or self._subnet.is_loopback and address.is_loopback:
            return
        if not self._subnet.is_loopback and address not in self._subnet:
            raise DescriptionError(f'device "{device.name}": {address} is not in {self._subnet}, '
                                   "the network of two hosts; take one from there")
        self._host.add_address(f"{address}/{32 if self._subnet.is_loopback else 24}")


def _list(addresses):
    return () if isinstance(addresses, int) else addresses


def _agent_part(device):
    return device.addresses, device.behaviour(), device.delay


def _service_part(device):
    return [(one, device.txt_of(one)) for one in device.type], _where(device)


def _where(device):
    return device.type, device.domain, device.port
