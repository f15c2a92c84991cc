"""broadcast_device.py KIND: a device that takes the first request on port 161 and answers it as no
decent agent does."""

import socket
import sys

from replies import binding, element, integer, reply

IDENTIFIER = integer(99)
SEVEN = reply(IDENTIFIER, binding(integer(7)))
REPLIES = {
    # Only the last two are proper ones.
    "stutter": [b"", b"no message", SEVEN[:-1], reply(IDENTIFIER, binding(integer(7)), status=2),
                reply(IDENTIFIER, binding(element(4, b"\7"))), SEVEN, SEVEN],
    # Together they take more room than a socket has by default.
    "flood": [reply(IDENTIFIER, binding(integer(number)), community=b"corridor" * 80)
              for number in range(300)],
}

device = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
device.bind(("", 161))
_, asker = device.recvfrom(1500)
for datagram in REPLIES[sys.argv[1]]:
    device.sendto(datagram, asker)
