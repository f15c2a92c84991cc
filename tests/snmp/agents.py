#!/usr/bin/python3
"""Runs a command where SNMP agents answer on loopback: agents.py COMMAND [ARGUMENT ...].

127.0.1.x are net-snmp's agents, 127.0.2.x misbehave. All of it lives in namespaces of its own (see
tests/in_namespace) and ends with the command. Exit status: the command's, or 77 where there are no
such namespaces."""

import os
import pathlib
import selectors
import socket
import subprocess
import sys
import threading
import time
import types

HERE = pathlib.Path(__file__).resolve().parent
sys.dont_write_bytecode = True
sys.path.insert(0, str(HERE.parent.parent / "tools"))

from practice_network.agents import COMMUNITY, PORT, Agents, listens
from replies import SHORT_NAME, binding, identifier_of, integer, reply

# What they answer, and after how many seconds.
REAL = {"127.0.1.1": (2, 0), "127.0.1.2": (1, 0), "127.0.1.3": ("missing", 0),
        "127.0.1.4": ("text", 0), "127.0.1.6": ("silent", 0), "127.0.1.7": (2, 1),
        "127.0.1.8": (2, 2.5)}
WRITABLE = "127.0.1.5"

ONE, TWO = binding(integer(1)), binding(integer(2))


def always(answer):
    return lambda send, request: send(answer(identifier_of(request)))


def bound_to(address, port=0):
    bound = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
    bound.bind((address, port))
    return bound


def from_other_port(send, request):
    with bound_to("127.0.2.2") as other_port:
        send(reply(identifier_of(request), TWO), other_port)


def with_strangers(send, request):
    identifier = identifier_of(request)
    with bound_to("127.0.2.3") as other_port, bound_to("127.0.2.250", PORT) as other_address:
        send(reply(identifier, ONE), other_port)
        send(reply(identifier, ONE), other_address)
    for _ in range(2):
        send(reply(identifier, TWO))


ODD = {
    "127.0.2.1": always(lambda _: reply(integer(1 << 30), TWO)),
    "127.0.2.2": from_other_port,
    "127.0.2.3": with_strangers,
    "127.0.2.4": always(lambda _: bytes.fromhex("30 07 02 84 DE AD BA BE 00")),
    "127.0.2.5": always(lambda identifier: reply(identifier, b"")),
    "127.0.2.6": always(lambda identifier: reply(identifier, TWO + TWO)),
    "127.0.2.7": always(lambda identifier: reply(identifier, binding(integer(2), SHORT_NAME))),
    "127.0.2.8": always(lambda _: b""),
    "127.0.2.9": always(lambda identifier: reply(identifier, TWO) + bytes(1600)),
}


def start_odd_agents():
    selector = selectors.DefaultSelector()
    for address, behaviour in ODD.items():
        selector.register(bound_to(address, PORT), selectors.EVENT_READ, behaviour)

    def serve():
        while True:
            for key, _ in selector.select():
                request, sender = key.fileobj.recvfrom(2000)
                key.data(lambda data, by=key.fileobj, to=sender: by.sendto(data, to), request)

    threading.Thread(target=serve, daemon=True).start()


def start_writable_agent():
    folder = pathlib.Path("/run/writable")
    folder.mkdir()
    configuration = folder / "snmpd.conf"
    configuration.write_text(f"rwcommunity {COMMUNITY}\nagentAddress udp:{WRITABLE}:{PORT}\n")
    subprocess.Popen(
        ["snmpd", "-f", "-C", "-c", configuration, "-I", "system_mib,vacm_conf,vacm_context",
         "-Lf", folder / "log"],
        env=os.environ | {"MIBS": "", "SNMPCONFPATH": folder, "SNMP_PERSISTENT_DIR": folder})
    deadline = time.monotonic() + 20
    while not listens(WRITABLE):
        if time.monotonic() > deadline:
            sys.exit(f"agents.py: snmpd at {WRITABLE} does not listen")
        time.sleep(0.005)


def main(arguments):
    if arguments[:1] != ["--inside"]:
        program = str(HERE.parent / "in_namespace")
        os.execv(program, [program, sys.executable, __file__, "--inside", *arguments])
    os.environ["PATH"] += ":/usr/sbin:/sbin"
    subprocess.run(["ip", "link", "set", "lo", "up"], check=True)
    agents = Agents("/run/agents")
    agents.start([
        types.SimpleNamespace(name=address, addresses=[address], behaviour=lambda one=answer: [one],
                              delay=delay)
        for address, (answer, delay) in REAL.items()])
    start_writable_agent()
    start_odd_agents()
    return subprocess.run(arguments[1:]).returncode


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))
