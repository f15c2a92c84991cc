#!/usr/bin/python3
"""Runs a command on a loopback network with SNMP agents: agents.py COMMAND [ARGUMENT ...].

The agents at 127.0.1.x are net-snmp's. At 127.0.2.1, other senders answer before the agent does.
All of them run in new namespaces (see tests/in_namespace) and end with the command. The exit status
is the command's, or 77 when no such namespaces can be created."""

import os
import pathlib
import socket
import subprocess
import sys
import threading
import types

HERE = pathlib.Path(__file__).resolve().parent
sys.dont_write_bytecode = True
sys.path.insert(0, str(HERE.parent.parent / "tools"))

from practice_network.agents import PORT, Agents
from replies import identifier_of, reply

# net-snmp's agents by address: the value that each answers, and its delay in seconds.
REAL = {"127.0.1.1": (2, 0), "127.0.1.2": (1, 0), "127.0.1.7": (2, 1), "127.0.1.8": (2, 2.5)}
OUTSHOUTED = "127.0.2.1"


def bound_to(address, port=0):
    bound = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
    bound.bind((address, port))
    return bound


def start_outshouted_agent():
    agent = bound_to(OUTSHOUTED, PORT)
    strangers = bound_to(OUTSHOUTED), bound_to("127.0.2.250", PORT)

    def serve():
        while True:
            request, sender = agent.recvfrom(2000)
            for stranger in strangers:
                stranger.sendto(reply(identifier_of(request), 1), sender)
            agent.sendto(reply(identifier_of(request), 2), sender)

    threading.Thread(target=serve, daemon=True).start()


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
    start_outshouted_agent()
    return subprocess.run(arguments[1:]).returncode


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))
