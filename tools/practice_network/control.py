"""Controls a running network over a Unix socket, with one line of JSON per request and answer."""

import json
import os
import socket
import time

from practice_network.description import DescriptionError

SOCKET_VARIABLE = "ONRAMP_PRACTICE_SOCKET"


class ControlError(Exception):
    """The network refused a request, or there is no network. The text says why."""


class PracticeNetwork:
    """The network that this process runs in, for tests and for `practice-network ctl`.

    A device is identified by its name. Entries are those of the description file: `maker`, `model`,
    `note`, `type`, `domain`, `port`, `addresses`, `activeif`, `delay`, `txt`. Every operation
    returns when the network has carried it out. Avahi then takes another second to publish a new
    device; settle() waits for that. A refused operation raises ControlError.
    """

    def __init__(self, path=None):
        self._path = path or os.environ.get(SOCKET_VARIABLE)
        if not self._path:
            raise ControlError(f"{SOCKET_VARIABLE} is not set: this is not a practice network; "
                               "start one with: practice-network DESCRIPTION")

    def add(self, name, **entries):
        """Switches on a known device, changed by `entries`, or adds a new one made from them."""
        self._ask("add", name, entries)

    def remove(self, name):
        """Switches a device off: Avahi announces its departure, and its agents end.

        Browsers see the device leave up to a second later, because mDNS caches keep it that long.
        """
        self._ask("remove", name)

    def rename(self, name, new_name):
        self._ask("rename", name, new_name)

    def set(self, name, **entries):
        """Changes a device. A new text or address is published as a change, not as a new device."""
        self._ask("set", name, entries)

    def list(self):
        """Returns a dictionary per device: its entries and its "state", such as "established"."""
        return self._ask("list")

    def unplug(self, interface):
        """Takes an interface down for the devices and the command; plug() brings it back."""
        self._ask("unplug", interface)

    def plug(self, interface):
        self._ask("plug", interface)

    def stop_daemon(self):
        self._ask("stop_daemon")

    def start_daemon(self):
        self._ask("start_daemon")

    def restart_daemon(self):
        self.stop_daemon()
        self.start_daemon()

    def settle(self, seconds=30):
        """Waits until Avahi has published every device that is present."""
        deadline = time.monotonic() + seconds
        while waiting := [one for one in self.list()
                          if one["present"] and one["state"] != "established"]:
            if time.monotonic() > deadline:
                raise ControlError(f'device "{waiting[0]["name"]}" is still not published: it is '
                                   f'{waiting[0]["state"]}')
            time.sleep(0.02)

    def _ask(self, operation, *arguments):
        try:
            with socket.socket(socket.AF_UNIX) as connection:
                connection.connect(self._path)
                with connection.makefile("rwb") as stream:
                    stream.write(json.dumps([operation, *arguments]).encode() + b"\n")
                    stream.flush()
                    answer = json.loads(stream.readline() or b'{"error": "the network ended"}')
        except OSError as error:
            raise ControlError(f"{self._path}: {error.strerror}; is the network running?") from None
        if "error" in answer:
            raise ControlError(answer["error"])
        return answer["result"]


OPERATIONS = ("add", "remove", "rename", "set", "list", "unplug", "plug", "stop_daemon",
              "start_daemon")


def serve(network, listener):
    """Carries out requests, one after another, until the process is ended."""
    while True:
        connection, _ = listener.accept()
        connection.settimeout(5)
        with connection, connection.makefile("rwb") as stream:
            try:
                answer = _answer(network, stream.readline())
                stream.write(json.dumps(answer).encode() + b"\n")
                stream.flush()
            except OSError:
                pass  # The client is gone.


def _answer(network, line):
    try:
        operation, *arguments = json.loads(line)
        if operation not in OPERATIONS:
            return {"error": f'unknown request "{operation}"'}
        return {"result": getattr(network, operation)(*arguments)}
    except (ValueError, TypeError) as error:
        return {"error": f"not a request: {error}"}
    except DescriptionError as error:
        return {"error": str(error)}
    except Exception as error:  # One failed request must not end the network.
        return {"error": f"{type(error).__name__}: {error}"}
