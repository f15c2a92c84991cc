"""Controls a running network over a Unix socket. Requests and answers are lines of JSON."""

import json
import os
import socket
import time

from practice_network.description import DescriptionError

SOCKET_VARIABLE = "ONRAMP_PRACTICE_SOCKET"


class ControlError(Exception):
    """Raised when the network refuses a request, and when there is no network. The message
    says why."""


class PracticeNetwork:
    """The practice network in which this process runs, for tests and for `practice-network ctl`.

    A device is identified by its name. Its entries are those of the description file: `maker`,
    `model`, `note`, `type`, `domain`, `port`, `addresses`, `activeif`, `delay`, `present`, `txt`.
    An operation returns when the network has carried it out, and raises ControlError if the network
    refuses it. Avahi may take another second to publish a new device; settle() waits for Avahi.
    """

    def __init__(self, path=None):
        self._path = path or os.environ.get(SOCKET_VARIABLE)
        if not self._path:
            raise ControlError(f"{SOCKET_VARIABLE} is not set: this is not a practice network; "
                               "start one with: practice-network DESCRIPTION")

    def add(self, name, **entries):
        """Updates the given entries of a known device and switches the device on. If the device is
        unknown, adds it with these entries."""
        self._ask("add", name, entries)

    def remove(self, name):
        """Switches a device off. Avahi announces that the device is gone, and the device's
        agents exit.

        A browser reports the device as gone when the device leaves the browser's mDNS cache, up to a
        second later.
        """
        self._ask("remove", name)

    def rename(self, name, new_name):
        self._ask("rename", name, new_name)

    def set(self, name, **entries):
        """Updates the given entries of a device. Avahi announces a new TXT entry or address as an
        update. For a new name, type, domain or port, Avahi withdraws the services and publishes
        them again."""
        self._ask("set", name, entries)

    def list(self):
        """Returns a list of dictionaries, one for each device. Each has the device's entries and
        its "state", such as "established"."""
        return self._ask("list")

    def unplug(self, interface):
        """Takes an interface down, both for the devices and for the command that practice-network
        runs. plug() brings it back."""
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
        """Waits until Avahi has published every device that is switched on. Raises ControlError
        if that takes longer than `seconds`."""
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
                    answer = json.loads(stream.readline() or
                                        b'{"error": "the network has shut down"}')
        except OSError as error:
            raise ControlError(f"{self._path}: {error.strerror}; is the network running?") from None
        if "error" in answer:
            raise ControlError(answer["error"])
        return answer["result"]


OPERATIONS = ("add", "remove", "rename", "set", "list", "unplug", "plug", "stop_daemon",
              "start_daemon")


def serve(network, listener):
    """Carries out the requests that arrive on `listener`, one after another. Never returns."""
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
    except Exception as error:  # A failed request must not stop the network.
        return {"error": f"{type(error).__name__}: {error}"}
