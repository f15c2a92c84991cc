"""Makes SNMPv1 replies as devices send them."""

_ACTIVE_IF = bytes.fromhex("06 0f 2b 06 01 04 01 a1 12 02 04 04 89 58 01 02 00")


def _element(tag, *parts):
    return bytes((tag, sum(map(len, parts)))) + b"".join(parts)


def reply(identifier, number, status=0):
    """Returns the bytes of a reply. `identifier` holds the bytes of the request's identifier.
    `number`, from 0 to 32767, is the device's answer: the number of its active interface."""
    value = _element(2, number.to_bytes(2, "big"))
    pdu = _element(0xA2, _element(2, identifier), _element(2, bytes([status])), _element(2, b"\0"),
                   _element(0x30, _element(0x30, _ACTIVE_IF, value)))
    return _element(0x30, _element(2, b"\0"), _element(4, b"corridor"), pdu)


def identifier_of(request):
    """Returns the bytes of the request's identifier."""
    return request[19:19 + request[18]]
