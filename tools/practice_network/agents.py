"""The SNMP side of the made-up devices: a net-snmp agent for each address that answers."""

import functools
import json
import os
import pathlib
import signal
import socket
import subprocess
import threading
import time

from practice_network.description import CLOSED, MISSING, SILENT, TEXT, WIRELESS, DescriptionError


@functools.cache
def maker_settings():
    """Returns the SNMP community, the object identifier and the value that means wireless. They are in
    maker.json, or in the file that the environment variable ONRAMP_MAKER names. Raises
    DescriptionError if the file does not have them."""
    path = os.environ.get("ONRAMP_MAKER") or pathlib.Path(__file__).parents[2] / "maker.json"
    try:
        maker = json.loads(pathlib.Path(path).read_text(encoding="utf-8"))
        return maker["snmpCommunity"], maker["activeIFObject"], int(maker["activeIFWireless"])
    except OSError as error:
        problem = f"cannot be read: {error.strerror}"
    except KeyError as error:
        problem = f"has no {error.args[0]!r}"
    except ValueError as error:
        problem = f"is not correct JSON: {error}"
    except TypeError:
        problem = 'has no JSON object, or its "activeIFWireless" is no number'
    raise DescriptionError(f"{path}: {problem}; set ONRAMP_MAKER to a copy of maker.json, or unset it")


PORT = 161
# With only these modules, an agent starts in about 15 ms and opens no socket for sub-agents.
MODULES = "override,pass,vacm_conf,vacm_context"


class AgentError(Exception):
    """Raised when an agent does not start. The message says why."""


def listens(address):
    """Returns whether a program on this host listens for SNMP requests at an IPv4 address."""
    number = socket.inet_aton(address)[::-1].hex().upper()
    return f" {number}:{PORT:04X} " in pathlib.Path("/proc/net/udp").read_text()


class Agents:
    """The SNMP agents of the devices that are switched on."""

    def __init__(self, folder):
        self._folder = pathlib.Path(folder)
        self._folder.mkdir(parents=True, exist_ok=True)
        self._by_device = {}

    def start(self, devices):
        """Starts the agents of `devices` in parallel, and returns when all of them listen. Raises
        AgentError if one does not. IPv6 addresses get no agent."""
        awaited = []
        for device in devices:
            handles = self._by_device[device.name] = []
            for address, activeif in zip(device.addresses, device.behaviour(), strict=True):
                if activeif == CLOSED or ":" in address:
                    continue
                if activeif == SILENT:
                    handles.append(_SilentAgent(address))
                else:
                    handles.append(_Agent(self._folder, address, activeif, device.delay))
                    awaited.append(handles[-1])
        deadline = time.monotonic() + 20
        while awaited := [agent for agent in awaited if not agent.is_listening()]:
            if time.monotonic() > deadline:
                raise AgentError(f"snmpd at {awaited[0].address} did not start listening:"
                                 f"\n{awaited[0].log()}")
            time.sleep(0.005)

    def relay_broadcasts(self, address):
        """Starts a thread that forwards each request that is sent to the broadcast address `address`
        to every net-snmp agent.

        The agents receive no broadcasts, because each listens only at its own address.
        """
        listener = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
        listener.bind((address, PORT))

        def relay():
            while True:
                request, sender = listener.recvfrom(1500)
                for handles in list(self._by_device.values()):
                    for agent in handles:
                        if isinstance(agent, _Agent):
                            threading.Thread(target=_relay, daemon=True,
                                             args=(agent.address, request, sender)).start()
        threading.Thread(target=relay, daemon=True).start()

    def stop(self, device):
        for handle in self._by_device.pop(device.name, []):
            handle.close()


def _relay(address, request, sender, seconds=5):
    """Sends `request` to the agent at `address`, and forwards the agent's answer to `sender`. The
    answer's source is `address`."""
    with socket.socket(socket.AF_INET, socket.SOCK_DGRAM) as own:
        own.settimeout(seconds)
        try:
            own.bind((address, 0))
            own.sendto(request, (address, PORT))
            own.sendto(own.recv(1500), sender)
        except OSError:
            pass  # The agent did not answer, or its address was removed.


class _SilentAgent:
    """Opens the SNMP port and never reads from it, so a sender gets neither an answer nor a
    refusal."""

    def __init__(self, address):
        self._socket = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
        self._socket.bind((address, PORT))

    def close(self):
        self._socket.close()


class _Agent:
    def __init__(self, folder, address, activeif, delay):
        self.address = address
        self._log = folder / f"{address}.log"
        configuration = folder / f"{address}.conf"
        community, snmp_object, wireless = maker_settings()
        if activeif == WIRELESS:
            activeif = wireless
        lines = [f"rocommunity {community}", f"agentAddress udp:{address}:{PORT}"]
        if delay:
            script = folder / f"{address}.sh"
            script.write_text(_slow_script(activeif, delay))
            script.chmod(0o755)
            lines.append(f"pass .{snmp_object.rsplit('.', 1)[0]} {script}")
        elif activeif != MISSING:
            lines.append(f"override {snmp_object} {_override(activeif)}")
        configuration.write_text("\n".join(lines) + "\n")
        self._process = subprocess.Popen(
            ["snmpd", "-f", "-C", "-c", configuration, "-I", MODULES, "-Lf", self._log],
            env=os.environ | {"MIBS": "", "SNMPCONFPATH": str(folder),
                              "SNMP_PERSISTENT_DIR": str(folder)},
            stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
            start_new_session=True)

    def is_listening(self):
        if self._process.poll() is not None:
            raise AgentError(f"snmpd at {self.address} exited at once:\n{self.log()}")
        return listens(self.address)

    def log(self):
        return self._log.read_text(errors="replace") if self._log.exists() else ""

    def close(self):
        # A script that delays an answer keeps the agent's socket open, so the script must be killed, too.
        if self._process.poll() is None:
            os.killpg(self._process.pid, signal.SIGKILL)
            self._process.wait()


def _override(activeif):
    return 'octet_str "two"' if activeif == TEXT else f"integer {activeif}"


def _slow_script(activeif, delay):
    """Returns a script that net-snmp runs for each request. After `delay` seconds, the script prints
    the object's identifier, type and value, or nothing if the agent lacks the object."""
    _, snmp_object, _ = maker_settings()
    answer = {MISSING: "", TEXT: f".{snmp_object}\nstring\ntwo"}.get(
        activeif, f".{snmp_object}\ninteger\n{activeif}")
    return f"#!/bin/sh\nsleep {delay}\n[ \"$1\" = -g ] && [ \"$2\" = .{snmp_object} ] || exit 0\n" \
           f"cat <<'END'\n{answer}\nEND\n"
