#!/usr/bin/python3
"""Copies a medium, and adds models and texts that barely fit on the wizard's pages.

Usage: crowded.py MEDIUM COPY

The copy has at least 500 models, some with long names, and a made-up language, "art", whose texts
are about 40 % longer than the German ones. An existing COPY is replaced.
"""

import pathlib
import plistlib
import re
import shutil
import sys

LANGUAGE = "art"
MODELS = 500
_MESSAGES = "MacResources/CDCommonMessage.bundle/Contents/Resources"
_SOURCE_LANGUAGE = "de"
_ENTRY = re.compile(r'^("\w+" = ")((?:[^"\\]|\\.)*)(";)$', re.MULTILINE)
_FILLER = "lorem ipsum dolor sit amet consetetur sadipscing elitr sed diam nonumy eirmod tempor "
# A DNS label holds at most 63 bytes.
LONG_NAMES = ("Kestrel Photo Printer beside the Window on the Second Floor 001",
              "会議室の複合機二階の窓際にある大型インクジェット",
              "Büro 🖨️ Erdgeschoß links", "회의실 프린터", "😀🖨️📠")


def longer(text):
    wanted = len(text) * 4 // 10 + 1
    filler = _FILLER * (wanted // len(_FILLER) + 1)
    return f"{text} {filler[:wanted]}".rstrip() if len(text) > 12 else text + filler[:wanted]


def _add_models(folder):
    for name, key, entry in (
            ("CDInfo", "ContainedModel", {}),
            ("ModelInfo", "Model", {"KSCID": "k", "Interfaces": {
                "USB": True, "WiredLAN": True, "WirelessLAN": True}})):
        path = folder / "MacResources" / f"{name}.plist"
        content = plistlib.loads(path.read_bytes())
        models = content[key]
        for number in range(MODELS - len(models)):
            kind = LONG_NAMES[number % 7] if number % 7 < 2 else "Model"
            models[f"Kestrel {1000 + number} {kind}"] = entry
        path.write_bytes(plistlib.dumps(content))


def _add_language(folder):
    source = folder / _MESSAGES / f"{_SOURCE_LANGUAGE}.lproj/Localizable.strings"
    table = folder / _MESSAGES / f"{LANGUAGE}.lproj/Localizable.strings"
    table.parent.mkdir()
    table.write_text(_ENTRY.sub(lambda entry: entry[1] + longer(entry[2]) + entry[3],
                                source.read_text(encoding="utf-8")), encoding="utf-8")


def make(medium, copy):
    medium, copy = pathlib.Path(medium), pathlib.Path(copy)
    shutil.rmtree(copy, ignore_errors=True)
    shutil.copytree(medium, copy)
    _add_models(copy)
    _add_language(copy)
    return copy


if __name__ == "__main__":
    if len(sys.argv) != 3:
        sys.exit(__doc__)
    make(*sys.argv[1:])
