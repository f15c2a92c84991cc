"""SNMPv1 replies of devices, proper ones and others, put together from their elements."""

COMMUNITY = b"corridor"


def element(tag, content):
    length = len(content)
    size = bytes([length]) if length < 128 else bytes([0x82, length >> 8, length & 0xFF])
    return bytes([tag]) + size + content


def integer(number):
    return element(2, number.to_bytes(number.bit_length() // 8 + 1, "big", signed=True))


NAME = bytes.fromhex("2b 06 01 04 01 a1 12 02 04 04 89 58 01 02 00")


def binding(value):
    """A binding of the device interface object to an encoded value."""
    return element(0x30, element(6, NAME) + value)


def reply(identifier, bindings, status=0):
    pdu = element(0xA2, identifier + integer(status) + integer(0) + element(0x30, bindings))
    return element(0x30, integer(0) + element(4, COMMUNITY) + pdu)


def identifier_of(request):
    """The encoded identifier of a request, which lies at the same place in all of them."""
    at = 2 + 3 + 2 + len(COMMUNITY) + 2
    return request[at:at + 2 + request[at + 1]]
