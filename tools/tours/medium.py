"""A medium, with its texts in one language."""

import os
import pathlib
import plistlib

from onscreen import messages

from .facts import Unsuitable

_MESSAGES = "MacResources/CDCommonMessage.bundle/Contents/Info.plist"
_PROGRAM = "Contents/Linux/Onramp OSX"


class Medium:
    """A medium's folder with the application on it, its `facts`, and its texts in one language.

    The language is `language` or, if that is None, the one that the wizard chooses for the user.
    """

    def __init__(self, folder, facts, language=None):
        self.folder = pathlib.Path(folder)
        self.facts = facts
        application = self._application()
        self.program = application / _PROGRAM
        about = _read(application / "Contents/Info.plist")
        self._resources = _read(self.folder / _text(about, "CommonResourcePath", ""))
        self.locale = language or self._locales()[0]
        self.language = messages.language(self.folder, [language] if language else self._locales())
        self.text = (messages.read(self.folder, self.language) if facts.texts.get(self.language)
                     else messages.Texts())
        # The name of the menu's button is not in the message bundle, but in the application.
        self.gear = messages.read_table(
            application / f"Contents/Resources/{self.language}.lproj/ChooseDeviceView.strings")[
                "Actions"]

    def _application(self):
        programs = sorted(self.folder.glob(f"*.app/{_PROGRAM}"))
        if not programs:
            raise Unsuitable(f"{self.folder} has no application that runs on Linux")
        return programs[0].parents[2]

    def _locales(self):
        """Returns the user's preferred locales, then the message bundle's language and English."""
        names = ("LC_ALL", "LC_MESSAGES", "LANG")
        locale = next((os.environ[name] for name in names if os.environ.get(name)), "C")
        preferred = []
        if locale.split(".")[0] not in ("C", "POSIX"):
            preferred = [*filter(None, os.environ.get("LANGUAGE", "").split(":")), locale]
        region = _text(_read(self.folder / _MESSAGES), "CFBundleDevelopmentRegion", "en")
        return [*(preferred or ["en"]), region, "en"]

    @property
    def service_type(self):
        """The service type that the wizard looks for, without the trailing dot; "" for none."""
        return _text(self._resources, "BonjourNetwork", "").rstrip(".")

    def oldest_system(self):
        """Returns the oldest supported version; None if there is no limit."""
        bound = self._bound("SystemMin")
        return bound and ".".join(map(str, bound))

    def too_old(self):
        """Returns a version that the medium refuses as too old; None if there is none."""
        bound = self._bound("SystemMin")
        if not bound:
            return None
        major, minor, bug_fix = bound
        if bug_fix:
            return f"{major}.{minor}.{bug_fix - 1}"
        return f"{major}.{minor - 1}.0" if minor else f"{major - 1}.0.0"

    def too_new(self):
        """Returns a version that the medium refuses as too new; None if there is none."""
        bound = self._bound("SystemMax")
        if not bound:
            return None
        major, minor, bug_fix = bound
        limit = self._resources["SystemMax"].get("BugFix")
        return f"{major}.{minor + 1}.0" if str(limit).lower() == "x" else f"{major}.{minor}.{bug_fix}"

    def _bound(self, name):
        """Returns a bound's three numbers; None where the wizard sees no limit."""
        bound = self._resources.get(name)
        if not isinstance(bound, dict):
            return None
        numbers = [_number(bound.get(key)) for key in ("Major", "Minor", "BugFix")]
        return numbers if numbers[0] > 0 else None


def _read(path):
    """Returns the dictionary in a property list, or an empty one if the list cannot be read or is not a
    dictionary."""
    try:
        content = plistlib.loads(path.read_bytes())
    except Exception:  # plistlib's errors have no other common class
        return {}
    return content if isinstance(content, dict) else {}


def _text(content, key, default):
    value = content.get(key)
    return value if isinstance(value, str) else default


def _number(value):
    """Returns the number that the wizard reads from `value`: an integer as it is, or the number
    that a text's leading digits form. Anything else counts as 0."""
    if isinstance(value, str):
        digits = len(value) - len(value.lstrip("0123456789"))
        return int(value[:digits] or 0)
    return value if isinstance(value, int) else 0
