"""Runs a command on a loopback network with SNMP agents: agents.py COMMAND [ARGUMENT ...]

Must run as root in a new network namespace; see tests/in_namespace. The agents at 127.0.1.1 and
127.0.2.1 answer at once, and the agent at 127.0.1.8 after four seconds. Two other sockets answer
each request to 127.0.2.1 before the agent does. The exit status is that of the command."""

import socket
import subprocess
import sys
import threading
import time

from replies import identifier_of, reply


def bound_to(address, port=161):
    bound = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
    bound.bind((address, port))
    return bound


def serve(address, number, seconds=0, strangers=()):
    """Starts an agent at `address` that answers each request with `number` after `seconds`. Just
    before each of these answers, each socket in `strangers` answers with 1."""
    agent = bound_to(address)

    def answer():
        while True:
            request, sender = agent.recvfrom(2000)
            time.sleep(seconds)
            for stranger in strangers:
                stranger.sendto(reply(identifier_of(request), 1), sender)
            agent.sendto(reply(identifier_of(request), number), sender)

    threading.Thread(target=answer, daemon=True).start()


if __name__ == "__main__":
    subprocess.run(["ip", "link", "set", "lo", "up"], check=True)
    serve("127.0.1.1", 2)
    serve("127.0.1.8", 2, seconds=4)
    serve("127.0.2.1", 2, strangers=(bound_to("127.0.2.1", 0), bound_to("127.0.2.250")))
    sys.exit(subprocess.run(sys.argv[1:], check=False).returncode)
