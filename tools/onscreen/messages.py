"""The texts that a medium has for the user."""

import pathlib
import re

_ENTRY = re.compile(r'"((?:[^"\\]|\\.)*)"\s*=\s*"((?:[^"\\]|\\.)*)"\s*;')


def read(medium, language):
    """The texts of one language by their keys, from a table in UTF-8."""
    table = (pathlib.Path(medium) / "MacResources/CDCommonMessage.bundle/Contents/Resources" /
             f"{language}.lproj/Localizable.strings")
    entries = _ENTRY.findall(table.read_text(encoding="utf-8"))
    return {key: text.replace("\\n", "\n").replace('\\"', '"') for key, text in entries}
