"""Simulates a device that answers one SNMP request: broadcast_device.py KIND

KIND is the number to answer with, or "stutter" or "flood". Devices of these two kinds answer many
times. Some of the replies of "stutter" are malformed."""

import socket
import sys
import time

from replies import reply

IDENTIFIER = b"\x63"
SEVEN = reply(IDENTIFIER, 7)
TEXT = SEVEN.replace(b"\2\2\0\7", b"\4\2\0\7")
NO_BINDINGS = SEVEN[:27] + b"\0"

# For each kind that answers many times: its datagrams, each with the seconds between the request and
# the datagram. A search listens for 5 to 8 seconds, so it must hear the datagram of "stutter" that
# comes after 4.5 seconds, and miss the last one.
REPLIES = {
    "stutter": [(0, b""), (0, b"no message"), (0, SEVEN[:-1]), (0, reply(IDENTIFIER, 7, status=2)),
                (0, TEXT), (0, SEVEN), (0, NO_BINDINGS), (0, SEVEN), (4.5, SEVEN),
                (9, reply(IDENTIFIER, 9))],
    "flood": [(0, reply(IDENTIFIER, number)) for number in range(300)],
}

device = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
device.bind(("", 161))
_, asker = device.recvfrom(1500)
asked = time.monotonic()
kind = sys.argv[1]
for seconds, datagram in REPLIES.get(kind) or [(0, reply(IDENTIFIER, int(kind)))]:
    time.sleep(max(0, asked + seconds - time.monotonic()))
    device.sendto(datagram, asker)
