#!/usr/bin/python3
"""Packs PNG pictures of an icon into an .icns file.

Usage: icns.py ICON.icns PICTURE.png…

Every PICTURE is square, with a side of 16, 32, 64, 128, 256, 512 or 1024 pixels.
"""

import pathlib
import struct
import sys

# The entry types for a picture, by the length of its side in pixels. Some pictures get two entries:
# one for an icon with the same number of points per side, and one for an icon with half as many, on a
# display with two pixels per point.
TYPES = {16: ["icp4"], 32: ["icp5", "ic11"], 64: ["ic12"], 128: ["ic07"], 256: ["ic08", "ic13"],
         512: ["ic09", "ic14"], 1024: ["ic10"]}


def main(icon, *pictures):
    entries = b""
    for picture in pictures:
        try:
            data = pathlib.Path(picture).read_bytes()
        except OSError as error:
            sys.exit(f"icns.py: {picture}: {error.strerror}")
        width, height = struct.unpack(">II", data[16:24].ljust(8, b"\0"))
        if data[:8] != b"\x89PNG\r\n\x1a\n" or width != height or width not in TYPES:
            sys.exit(f"icns.py: {picture}: not a square PNG picture with a side of "
                     f"{', '.join(map(str, TYPES))} pixels")
        for kind in TYPES[width]:
            entries += kind.encode("ascii") + struct.pack(">I", 8 + len(data)) + data
    pathlib.Path(icon).write_bytes(b"icns" + struct.pack(">I", 8 + len(entries)) + entries)


if len(sys.argv) < 3:
    sys.exit(__doc__)
main(*sys.argv[1:])
