"""Reads and checks the description of the network and its devices."""

import dataclasses
import difflib
import ipaddress
import re
import tomllib

# The values of `activeif` that are not integers. Each says how the host at an address responds to
# an SNMP request.
WIRELESS = "wireless"  # answers with the maker's number for wireless
SILENT = "silent"      # receives the request and never answers
CLOSED = "closed"      # has no agent, so the host refuses the packet
MISSING = "missing"    # has an agent that lacks the object
TEXT = "text"          # answers with a string instead of an integer
WORDS = (WIRELESS, SILENT, CLOSED, MISSING, TEXT)

DEFAULT_TYPE = "_pdl-datastream._tcp"
DEFAULT_PORTS = {DEFAULT_TYPE: 9100, "_printer._tcp": 515, "_ipp._tcp": 631, "_scanner._tcp": 9500}
# The TXT keys for maker and model. Scanners and printers use different keys.
SCANNER_KEYS = ("mfg", "mdl")
PRINTER_KEYS = ("usb_MFG", "usb_MDL")


class DescriptionError(Exception):
    """Raised for a bad description or request. The message says what is wrong."""


@dataclasses.dataclass(frozen=True)
class Settings:
    """The description's settings for the network itself."""

    ipv6: bool = True
    interfaces: int = 1
    domains: tuple[str, ...] = ()


@dataclasses.dataclass(frozen=True)
class Device:
    """One made-up device. If `addresses` is a number, the network chooses that many addresses."""

    name: str
    maker: str | None = None
    model: str | None = None
    note: str | None = None
    type: tuple[str, ...] = (DEFAULT_TYPE,)
    domain: str = "local"
    port: int | None = None
    addresses: int | tuple[str, ...] = 1
    activeif: tuple[int | str, ...] = (WIRELESS,)
    delay: float = 0
    present: bool = True
    txt: tuple[tuple[str, str], ...] = ()

    def behaviour(self):
        """Returns the value of `activeif` for each address, in the order of the addresses."""
        count = address_count(self.addresses)
        return self.activeif * count if len(self.activeif) == 1 else self.activeif

    def is_closed(self):
        """Returns whether none of the device's addresses has an agent. Such devices may share
        addresses."""
        return set(self.activeif) == {CLOSED}

    def port_of(self, service_type):
        return self.port or DEFAULT_PORTS.get(service_type, 9100)

    def txt_of(self, service_type):
        """Returns the pairs of key and text in the TXT record of a service type."""
        keys = SCANNER_KEYS if service_type == "_scanner._tcp" else PRINTER_KEYS
        named = ((keys[0], self.maker), (keys[1], self.model), ("note", self.note))
        return tuple((key, value) for key, value in named if value is not None) + self.txt


def address_count(addresses):
    return addresses if isinstance(addresses, int) else len(addresses)


def load(path):
    """Returns the settings and the list of devices in a description file. Raises DescriptionError
    if the file cannot be read or has a mistake."""
    try:
        with open(path, "rb") as file:
            content = tomllib.load(file)
    except OSError as error:
        raise DescriptionError(f"{path}: cannot be read: {error.strerror}") from None
    except UnicodeDecodeError:
        raise DescriptionError(f"{path}: is not UTF-8 text; save it in that encoding") from None
    except tomllib.TOMLDecodeError as error:
        raise DescriptionError(f"{path}: is not valid TOML: {error}") from None

    settings = content.pop("network", {})
    if not isinstance(settings, dict):
        raise DescriptionError(f"{path}: write [network], in single brackets, before its entries")
    settings = Settings(**_read(settings, SETTING_READERS, f"{path}: network"))
    tables = content.pop("device", [])
    if content:
        raise DescriptionError(f'{path}: unknown entry "{next(iter(content))}"; a device starts '
                               "with the line [[device]], the network's settings with [network]")
    if not isinstance(tables, list) or not all(isinstance(table, dict) for table in tables):
        raise DescriptionError(f"{path}: write [[device]], in double brackets, before each device")
    devices = []
    for number, table in enumerate(tables, 1):
        place = f'"{table["name"]}"' if isinstance(table.get("name"), str) else f"number {number}"
        devices.append(device(table, f"{path}: device {place}"))
        if any(earlier.name == devices[-1].name for earlier in devices[:-1]):
            raise DescriptionError(f"{path}: device {place}: the name is used twice; "
                                   "give each device a different name")
    return settings, devices


def device(table, place):
    """Returns the device that `table` describes. An error message begins with `place`."""
    return change(None, table, place)


def change(before, table, place):
    """Returns a copy of `before` with the entries in `table`, or a new device if `before` is
    None."""
    values = _read(table, READERS, place)
    if before is None and "name" not in values:
        raise DescriptionError(f"{place}: name is missing; give {READERS['name'][1]}")

    result = dataclasses.replace(before, **values) if before else Device(**values)
    count = address_count(result.addresses)
    if len(result.activeif) not in (1, count):
        raise DescriptionError(f"{place}: activeif lists {len(result.activeif)} values for {count} "
                               "addresses; give one value for all, or one for each")
    for service_type in result.type:
        for key, value in result.txt_of(service_type):
            if len(f"{key}={value}".encode()) > 255:
                raise DescriptionError(f"{place}: the text of {key} is too long; "
                                       "key and text together may have at most 254 bytes")
    return result


def _read(table, readers, place):
    """Returns the checked and converted values of `table`. For each key, `readers` has a function
    that checks and converts a value, and a description of the valid values."""
    values = {}
    for key, value in table.items():
        if key not in readers:
            near = difflib.get_close_matches(key, readers, 1)
            known = (f'did you mean "{near[0]}"?' if near
                     else f"the known entries are {', '.join(readers)}")
            raise DescriptionError(f'{place}: unknown entry "{key}"; {known}')
        reader, wanted = readers[key]
        try:
            values[key] = reader(value)
        except (TypeError, ValueError):
            raise DescriptionError(f"{place}: {key} must be {wanted}, not {value!r}") from None
    return values


def _text(value):
    if not isinstance(value, str):
        raise TypeError
    return value


def _name(value):
    if not 1 <= len(_text(value).encode()) <= 63 or not value.isprintable():
        raise ValueError
    return value


def _types(value):
    types = tuple(value) if isinstance(value, list) else (value,)
    if not types or len(set(types)) != len(types):
        raise ValueError
    for service_type in types:
        if not re.fullmatch(r"_(?=.*[A-Za-z])[A-Za-z0-9-]{2,15}\._(tcp|udp)", _text(service_type)):
            raise ValueError
    return types


def _domain(value):
    if not re.fullmatch(r"([A-Za-z0-9-]{1,63}\.)*local", _text(value)):
        raise ValueError
    return value


def _domains(value):
    if not isinstance(value, list):
        raise TypeError
    return tuple(map(_domain, value))


def _whole(value, low, high):
    if type(value) is not int or not low <= value <= high:
        raise ValueError
    return value


def _addresses(value):
    if not isinstance(value, list):
        return _whole(value, 1, 32)
    addresses = tuple(ipaddress.ip_address(_text(text)) for text in value)
    if not addresses or len(set(addresses)) != len(addresses):
        raise ValueError
    if any(address.is_multicast or address.is_unspecified for address in addresses):
        raise ValueError
    return tuple(str(address) for address in addresses)


def _activeif(value):
    values = tuple(value) if isinstance(value, list) else (value,)
    if not values:
        raise ValueError
    return tuple(one if one in WORDS else _whole(one, -2**31, 2**31 - 1) for one in values)


def _delay(value):
    if type(value) not in (int, float) or not 0 <= value <= 3600:
        raise ValueError
    return value


def _truth(value):
    if type(value) is not bool:
        raise TypeError
    return value


def _txt(value):
    if not isinstance(value, dict):
        raise TypeError
    for key, text in value.items():
        if not re.fullmatch(r"[ -<>-~]+", key):
            raise ValueError
        _text(text)
    return tuple(value.items())


READERS = {
    "name": (_name, "a text of 1 to 63 bytes without control characters"),
    "maker": (_text, "a text"),
    "model": (_text, "a text"),
    "note": (_text, "a text"),
    "type": (_types, 'a service type such as "_ipp._tcp", or a list of different ones'),
    "domain": (_domain, 'a domain that ends in "local", such as "annex.local"'),
    "port": (lambda value: _whole(value, 1, 65535), "a whole number from 1 to 65535"),
    "addresses": (_addresses, 'a number from 1 to 32, or a list of different addresses of single '
                              'hosts, such as ["127.0.1.9"]'),
    "activeif": (_activeif, 'a whole number, "wireless", "silent", "closed", "missing" or "text", '
                            "or a list of these with one for each address"),
    "delay": (_delay, "a number of seconds from 0 to 3600"),
    "present": (_truth, "true or false"),
    "txt": (_txt, 'a table of strings such as {rp = "auto"}'),
}

SETTING_READERS = {
    "ipv6": (_truth, "true or false"),
    "interfaces": (lambda value: _whole(value, 1, 2), "1 or 2"),
    "domains": (_domains, 'a list of domains that end in "local", such as ["annex.local"]'),
}
