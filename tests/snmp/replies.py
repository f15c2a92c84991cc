"""SNMPv1 replies of devices, as bytes."""


def reply(identifier, number, status=0):
    """Returns a reply whose value of ActiveIF is `number`, from 0 to 32767."""
    return (bytes.fromhex("30 31 02 01 00 04 08 63 6f 72 72 69 64 6f 72 a2 22 02 01") +
            bytes([identifier, 2, 1, status]) + bytes.fromhex(
                "02 01 00 30 17 30 15 06 0f 2b 06 01 04 01 a1 12 02 04 04 89 58 01 02 00 02 02") +
            number.to_bytes(2, "big"))


def identifier_of(request):
    """Returns the request's identifier, which must be below 128."""
    return request[19]
