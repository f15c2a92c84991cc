"""Names of devices that Avahi can publish."""

import re

_LONGEST_LABEL = 63  # bytes (RFC 1035)
# Avahi 0.8 ignores every question about a longer name. A service with such a name cannot be resolved
# once its announcement has expired, which is after two minutes. The length includes the service's
# type and domain, and counts each byte that Avahi escapes as four characters.
_LONGEST_QUESTION = 255


def shortened(name, service_type):
    """Returns `name`, cut to the longest name that a device of this type can have."""
    while len(name.encode()) > _LONGEST_LABEL or _question(name, service_type) > _LONGEST_QUESTION:
        name = name[:-1]
    return name


def _question(name, service_type):
    escaped = re.sub(rb"[^\w-]", b"\\\\000", name.encode())
    return len(escaped) + len(f".{service_type.rstrip('.')}.local")
