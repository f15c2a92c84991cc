"""broadcast_device.py KIND: a device that answers the first request on port 161 once with the number
KIND, or as no decent agent does."""

import socket
import sys
import time

from replies import binding, element, integer, reply

IDENTIFIER = integer(99)


def proper(number, **details):
    return reply(IDENTIFIER, binding(integer(number)), **details)


# What it sends, and after how many seconds. A search listens for 5 to 8 seconds.
REPLIES = {
    "stutter": [(0, b""), (0, b"no message"), (0, proper(7)[:-1]), (0, proper(7, status=2)),
                (0, reply(IDENTIFIER, binding(element(4, b"\7")))), (0, proper(7)),
                (0, reply(IDENTIFIER, b"")), (0, proper(7)), (4.5, proper(7)), (9, proper(9))],
    "flood": [(0, proper(number)) for number in range(300)],
}

device = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
device.bind(("", 161))
_, asker = device.recvfrom(1500)
asked = time.monotonic()
kind = sys.argv[1]
for seconds, datagram in REPLIES.get(kind) or [(0, proper(int(kind)))]:
    time.sleep(max(0, asked + seconds - time.monotonic()))
    device.sendto(datagram, asker)
