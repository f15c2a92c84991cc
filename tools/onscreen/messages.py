"""Reads the texts that a medium has for the user."""

import pathlib
import re

_ENTRY = re.compile(r'"((?:[^"\\]|\\.)*)"\s*=\s*"((?:[^"\\]|\\.)*)"\s*;')
_RESOURCES = "MacResources/CDCommonMessage.bundle/Contents/Resources"


class _Texts(dict):
    """Texts by their keys. A missing text is replaced by its key, as in the wizard."""

    def __missing__(self, key):
        return key


def language(medium, wanted):
    """Returns `wanted` if the medium has that language, else the first language that it has."""
    folders = (pathlib.Path(medium) / _RESOURCES).glob("*.lproj")
    languages = sorted(folder.stem for folder in folders)
    return languages[0] if languages and wanted not in languages else wanted


def read(medium, language):
    """Returns the texts of one language. The table may be UTF-8 or UTF-16."""
    table = pathlib.Path(medium) / _RESOURCES / f"{language}.lproj/Localizable.strings"
    data = table.read_bytes() if table.exists() else b""
    wide = data[:2] in (b"\xff\xfe", b"\xfe\xff")
    entries = _ENTRY.findall(data.decode("utf-16" if wide else "utf-8"))
    return _Texts((key, text.replace("\\n", "\n").replace('\\"', '"')) for key, text in entries)
