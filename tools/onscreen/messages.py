"""Reads the texts in a medium's message bundle."""

import pathlib
import plistlib
import re

_ENTRY = re.compile(r'"((?:[^"\\]|\\.)*)"\s*=\s*"((?:[^"\\]|\\.)*)"\s*;')
_RESOURCES = "MacResources/CDCommonMessage.bundle/Contents/Resources"
_TRADITIONAL_CHINESE = ("zh_hant", "zh_tw", "zh_hk", "zh_mo")


class Texts(dict):
    """A dictionary of texts by their keys. As in the wizard, the text of an unknown key is the key
    itself."""

    def __missing__(self, key):
        return key


def _fitness(offered, wanted):
    """Returns how well the language `offered` suits a user who wants `wanted`.

    3 means the same name, and 2 the same language without a region in `offered`. 1 means the same
    language with a region in `offered`. 0 means a different language, or the other Chinese script.
    """
    offered, wanted = (re.split(r"[.@]", name)[0].replace("-", "_").lower()
                       for name in (offered, wanted))
    if offered == wanted:
        return 3
    if offered.split("_")[0] != wanted.split("_")[0]:
        return 0
    if (offered.startswith(_TRADITIONAL_CHINESE)) != (wanted.startswith(_TRADITIONAL_CHINESE)):
        return 0
    return 1 if "_" in offered else 2


def languages(medium):
    """Returns the sorted names of the languages in which the medium has texts."""
    folders = (pathlib.Path(medium) / _RESOURCES).glob("*.lproj")
    return sorted(folder.stem for folder in folders)


def language(medium, locales):
    """Returns the language in which the wizard shows the medium's texts to a user.

    `locales` are the user's locales, the preferred one first. If none of them suits, returns the
    first of languages(), or "en" if the medium has no texts.
    """
    offered = languages(medium)
    for wanted in locales:
        best = max(offered, key=lambda name: _fitness(name, wanted), default="")
        if best and _fitness(best, wanted):
            return best
    return offered[0] if offered else "en"


def read(medium, language):
    """Returns the medium's texts in one language."""
    return read_table(pathlib.Path(medium) / _RESOURCES / f"{language}.lproj/Localizable.strings")


def read_table(table):
    """Returns the texts of a strings file: text in UTF-8 or UTF-16, or a property list.
    Returns no texts if the file is missing or is a damaged property list."""
    data = table.read_bytes() if table.exists() else b""
    if data.startswith((b"<?xml", b"bplist")):
        try:
            content = plistlib.loads(data)
        except Exception:  # plistlib's errors have no other common class
            content = {}
        entries = content.items() if isinstance(content, dict) else ()
        return Texts((key, text) for key, text in entries if isinstance(text, str))
    wide = data[:2] in (b"\xff\xfe", b"\xfe\xff")
    entries = _ENTRY.findall(data.decode("utf-16" if wide else "utf-8", errors="replace"))
    return Texts((key, text.replace("\\n", "\n").replace('\\"', '"')) for key, text in entries)
