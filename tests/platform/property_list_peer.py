"""Reads and writes property lists with Python's own library. "write XML BINARY" writes a list with every
kind of value to the files XML and BINARY. "check FILE" fails with a message if FILE does not hold the
same list."""

import datetime
import math
import plistlib
import sys

EXPECTED = {
    "false": False,
    "true": True,
    "zero": 0,
    "negative": -1,
    "least": -(2**63),
    "greatest signed": 2**63 - 1,
    "unsigned": 2**63,
    "greatest": 2**64 - 1,
    "real": 0.1,
    "small": -5e-324,
    "large": 1.7976931348623157e308,
    "whole": 2.0,
    "infinite": math.inf,
    "empty text": "",
    "markup": "<key>&amp; \"quoted\" 'too' ]]> </key>",
    "blanks": "  a\tb\nc\n ",
    "carriage return": "a\rb\r\n",
    "Schlüssel 鍵 🖨": "Größe 大きさ 🖨",
    "<&>": "key with markup",
    "not for XML": "bell \ufffd, broken \ufffd\ufffd",
    "data": bytes(range(256)),
    "no data": b"",
    "day": datetime.datetime(2024, 2, 29, 12, 34, 56),
    "before": datetime.datetime(1999, 12, 31, 23, 59, 59),
    "far": datetime.datetime(4001, 1, 1),
    "first": datetime.datetime(1, 1, 1),
    "last": datetime.datetime(9999, 12, 31, 23, 59, 59),
    "empty list": [],
    "list": [1, [2, ["three"]], {"four": 4}],
    "empty dictionary": {},
}


def same(value, expected):
    if type(value) is not type(expected):
        return False
    if isinstance(expected, dict):
        return value.keys() == expected.keys() and all(same(value[k], expected[k]) for k in value)
    if isinstance(expected, list):
        return len(value) == len(expected) and all(map(same, value, expected))
    return value == expected


operation, path, *more = sys.argv[1:]
if operation == "write":
    for target, form in ((path, plistlib.FMT_XML), (more[0], plistlib.FMT_BINARY)):
        with open(target, "wb") as file:
            plistlib.dump(EXPECTED, file, fmt=form)
else:
    with open(path, "rb") as file:
        found = plistlib.load(file)
    for key in sorted(found.keys() | EXPECTED.keys()):
        if key not in found or key not in EXPECTED or not same(found[key], EXPECTED[key]):
            sys.exit(f"{path}: {key!r} is {found.get(key)!r}, not {EXPECTED.get(key)!r}")
