"""Runs a command where SNMP agents answer on loopback: agents.py COMMAND [ARGUMENT ...].

127.0.1.x are net-snmp's agents, 127.0.2.x misbehave; 127.0.3.x says how many requests 127.0.2.x has
had. All of it lives in namespaces of its own and ends with the command. Exit status: the command's,
or 77 where there are no such namespaces."""

import os
import pathlib
import selectors
import shutil
import socket
import subprocess
import sys
import tempfile
import threading
import time
import types

HERE = pathlib.Path(__file__).resolve().parent
sys.dont_write_bytecode = True
sys.path.insert(0, str(HERE.parent.parent / "tools"))

from practice_network.agents import COMMUNITY, OBJECT, PORT, Agents

ENCLOSE = ["unshare", "--net", "--mount", "--pid", "--fork", "--kill-child", "--mount-proc"]
NO_NAMESPACE = 77

REAL = {"127.0.1.1": 2, "127.0.1.2": 1, "127.0.1.3": "missing", "127.0.1.4": "text"}
WRITABLE = "127.0.1.5"


def element(tag, content):
    length = len(content)
    size = bytes([length]) if length < 128 else bytes([0x82, length >> 8, length & 0xFF])
    return bytes([tag]) + size + content


def integer(number):
    return element(2, number.to_bytes(number.bit_length() // 8 + 1, "big", signed=True))


NAME = element(6, bytes([0x2B, 6, 1, 4, 1, 0xA1, 0x12, 2, 4, 4, 0x89, 0x58, 1, 2, 0]))
SHORT_NAME = element(6, bytes([0x2B, 6, 1, 4, 1]))


def binding(number, name=NAME):
    return element(0x30, name + integer(number))


def reply(request, bindings, identifier=None):
    """The answer to `request`, whose identifier lies at the same place in all of them."""
    at = 2 + 3 + 2 + len(COMMUNITY) + 2
    asked = request[at:at + 2 + request[at + 1]]
    identifier = asked if identifier is None else integer(identifier)
    pdu = element(0xA2, identifier + integer(0) + integer(0) + element(0x30, bindings))
    return element(0x30, integer(0) + element(4, COMMUNITY.encode()) + pdu)


def after_silence(requests):
    return lambda send, request, count: send(
        reply(request, binding(2))) if count > requests else None


def late(seconds):
    return lambda send, request, count: threading.Timer(
        seconds, send, [reply(request, binding(2))]).start()


def with_strangers(send, request, count):
    with socket.socket(socket.AF_INET, socket.SOCK_DGRAM) as other_port, \
         socket.socket(socket.AF_INET, socket.SOCK_DGRAM) as other_address:
        other_address.bind(("127.0.2.250", 0))
        send(reply(request, binding(1)), other_port)
        send(reply(request, binding(1)), other_address)
    send(reply(request, binding(2)))


def from_other_port(send, request, count):
    with socket.socket(socket.AF_INET, socket.SOCK_DGRAM) as other_port:
        send(reply(request, binding(2)), other_port)


def twice(send, request, count):
    for _ in range(2):
        send(reply(request, binding(2)))


def always(answer):
    return lambda send, request, count: send(answer(request))


ODD = {
    "127.0.2.1": after_silence(6),
    "127.0.2.2": after_silence(2),
    "127.0.2.3": late(1.5),
    "127.0.2.4": late(2.5),
    "127.0.2.5": always(lambda request: reply(request, binding(2), identifier=1 << 30)),
    "127.0.2.6": from_other_port,
    "127.0.2.7": with_strangers,
    "127.0.2.8": twice,
    "127.0.2.9": always(lambda request: bytes.fromhex("30 07 02 84 DE AD BA BE 00")),
    "127.0.2.10": always(lambda request: reply(request, b"")),
    "127.0.2.11": always(lambda request: reply(request, binding(2) + binding(2))),
    "127.0.2.12": always(lambda request: reply(request, binding(2, SHORT_NAME))),
    "127.0.2.13": always(lambda request: b""),
    "127.0.2.14": always(lambda request: reply(request, binding(2)) + bytes(1600)),
}


class OddAgents(threading.Thread):
    """Takes the requests to all addresses of ODD, and the questions about them."""

    def __init__(self):
        super().__init__(daemon=True)
        self._selector = selectors.DefaultSelector()
        self._counts = dict.fromkeys(ODD, 0)
        for address, behaviour in ODD.items():
            self._listen(address, lambda send, request, address=address, behaviour=behaviour:
                         self._serve(address, behaviour, send, request))
            self._listen(address.replace(".2.", ".3."), lambda send, request, address=address:
                         send(reply(request, binding(self._counts[address]))))

    def run(self):
        while True:
            for key, _ in self._selector.select():
                request, sender = key.fileobj.recvfrom(2000)
                key.data(lambda data, by=key.fileobj, to=sender: by.sendto(data, to), request)

    def _listen(self, address, serve):
        listener = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
        listener.bind((address, PORT))
        self._selector.register(listener, selectors.EVENT_READ, serve)

    def _serve(self, address, behaviour, send, request):
        self._counts[address] += 1
        behaviour(send, request, self._counts[address])


def start_writable_agent(folder):
    configuration = pathlib.Path(folder, "writable.conf")
    configuration.write_text(f"rwcommunity {COMMUNITY}\nagentAddress udp:{WRITABLE}:{PORT}\n")
    subprocess.Popen(
        ["snmpd", "-f", "-C", "-c", configuration, "-I", "system_mib,vacm_conf,vacm_context",
         "-Lf", pathlib.Path(folder, "writable.log")],
        env=os.environ | {"MIBS": "", "SNMPCONFPATH": folder, "SNMP_PERSISTENT_DIR": folder})
    deadline = time.monotonic() + 20
    while f" {socket.inet_aton(WRITABLE)[::-1].hex().upper()}:" not in \
            pathlib.Path("/proc/net/udp").read_text():
        if time.monotonic() > deadline:
            sys.exit(f"agents.py: snmpd at {WRITABLE} does not listen")
        time.sleep(0.005)


def inside(command):
    subprocess.run(["ip", "link", "set", "lo", "up"], check=True)
    with tempfile.TemporaryDirectory() as folder:
        Agents(folder).start([types.SimpleNamespace(
            name="real", addresses=list(REAL), behaviour=lambda: list(REAL.values()), delay=0)])
        start_writable_agent(folder)
        OddAgents().start()
        return subprocess.run(command).returncode


def main(arguments):
    if arguments[:1] == ["--inside"]:
        return inside(arguments[1:])
    os.environ["PATH"] += ":/usr/sbin:/sbin"
    root = [] if os.getuid() == 0 else ["sudo", "-n", f"PATH={os.environ['PATH']}"]
    if not shutil.which("sudo" if root else "unshare"):
        reason = "not root, and there is no sudo"
    else:
        probe = subprocess.run([*root, *ENCLOSE, "true"], capture_output=True, text=True)
        reason = probe.returncode and (probe.stderr.strip() or "unshare failed")
    if reason:
        print(f"agents.py: skipped, this machine gives no namespaces: {reason}", file=sys.stderr)
        return NO_NAMESPACE
    return subprocess.run(
        [*root, *ENCLOSE, sys.executable, __file__, "--inside", *arguments]).returncode


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))
