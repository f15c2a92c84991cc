"""Publishes one service with an mDNS implementation that is not Avahi:

    second_responder.py ADDRESS NAME TYPE PORT KEY=VALUE...

A line of KEY=VALUE pairs, tab-separated, on standard input replaces the TXT record. At the end of
input it says goodbye. Prints "published" and "updated"."""

import socket
import sys

from zeroconf import ServiceInfo, Zeroconf

address, name, service_type, port, *texts = sys.argv[1:]


def service(pairs):
    return ServiceInfo(f"{service_type}.local.", f"{name}.{service_type}.local.", port=int(port),
                       addresses=[socket.inet_aton(address)], server="second.local.",
                       properties=dict(pair.split("=", 1) for pair in pairs))


responder = Zeroconf(interfaces=[address])
responder.register_service(service(texts))
print("published", flush=True)
for line in sys.stdin:
    responder.update_service(service(line.rstrip("\n").split("\t")))
    print("updated", flush=True)
responder.close()
