"""Shortens the names of devices so that Avahi can publish them."""

import re

_LONGEST_LABEL = 63  # bytes (RFC 1035)
# Avahi 0.8 ignores every question about a service whose full name is longer than this. Such a service
# cannot be resolved once its announcement has expired, which is after two minutes. The full name
# includes the type and domain. Each byte that Avahi escapes counts as four characters.
_LONGEST_QUESTION = 255


def shortened(name, service_type):
    """Returns `name`, cut to the longest name that a device of this type can have."""
    while len(name.encode()) > _LONGEST_LABEL or _question(name, service_type) > _LONGEST_QUESTION:
        name = name[:-1]
    return name


def _question(name, service_type):
    escaped = re.sub(rb"[^\w-]", b"\\\\000", name.encode())
    return len(escaped) + len(f".{service_type.rstrip('.')}.local")
