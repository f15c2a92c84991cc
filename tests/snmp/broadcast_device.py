"""broadcast_device.py KIND: a device that takes the first request on port 161 and answers it as no
decent agent does."""

import socket
import sys

NAME = bytes.fromhex("2b06010401a112020404895801" "0200")


def tlv(tag, *contents):
    content = b"".join(contents)
    length = len(content)
    return (bytes([tag, length]) if length < 128
            else bytes([tag, 0x82]) + length.to_bytes(2, "big")) + content


def reply(value, status=0, value_tag=2, community=b"corridor"):
    binding = tlv(0x30, tlv(6, NAME), tlv(value_tag, value.to_bytes(2, "big")))
    pdu = tlv(0xA2, tlv(2, b"\x63"), tlv(2, bytes([status])), tlv(2, b"\0"), tlv(0x30, binding))
    return tlv(0x30, tlv(2, b"\0"), tlv(4, community), pdu)


REPLIES = {
    # Only the last two are proper ones.
    "stutter": [b"", b"no message", reply(7)[:-1], reply(7, status=2), reply(7, value_tag=4),
                reply(7), reply(7)],
    # Together they take more room than a socket has by default.
    "flood": [reply(number, community=b"corridor" * 80) for number in range(300)],
}

device = socket.socket(socket.AF_INET, socket.SOCK_DGRAM)
device.bind(("", 161))
_, asker = device.recvfrom(1500)
for datagram in REPLIES[sys.argv[1]]:
    device.sendto(datagram, asker)
