"""What the tour has to know about a medium to walk through its wizard."""

import os
import pathlib
import plistlib

from onscreen import messages

_RESOURCES = "MacResources/CDCommonInfo.plist"
_MESSAGES = "MacResources/CDCommonMessage.bundle/Contents/Info.plist"
_PROGRAM = "Contents/Linux/Onramp OSX"


class Unsuitable(Exception):
    """The tour cannot walk through this medium's wizard. The text says why."""


class Medium:
    """A medium's folder with the application on it, and its texts in one language.

    The language is `language`, or the one in which the user reads the medium.
    """

    def __init__(self, folder, language=None):
        self.folder = pathlib.Path(folder)
        application = self._application()
        self.program = application / _PROGRAM
        about = _read(application / "Contents/Info.plist")
        self._resources = _read(self.folder / about.get("CommonResourcePath", _RESOURCES))
        self.locale = language or self._locales()[0]
        self.language = messages.language(self.folder, [language] if language else self._locales())
        self.text = messages.read(self.folder, self.language)
        # The name of the menu's button comes from the application, not from the medium.
        self.gear = messages.read_table(
            application / f"Contents/Resources/{self.language}.lproj/ChooseDeviceView.strings")[
                "Actions"]

    def _application(self):
        programs = sorted(self.folder.glob(f"*.app/{_PROGRAM}"))
        if not programs:
            raise Unsuitable(f"{self.folder} has no application that runs on Linux")
        return programs[0].parents[2]

    def _locales(self):
        """Returns the locales that the user prefers, then those that stand in for them."""
        names = ("LC_ALL", "LC_MESSAGES", "LANG")
        locale = next((os.environ[name] for name in names if os.environ.get(name)), "C")
        preferred = []
        if locale.split(".")[0] not in ("C", "POSIX"):
            preferred = [*filter(None, os.environ.get("LANGUAGE", "").split(":")), locale]
        table = self.folder / _MESSAGES
        about = _read(table) if table.exists() else {}
        return [*(preferred or ["en"]), about.get("CFBundleDevelopmentRegion", "en"), "en"]

    @property
    def service_type(self):
        """The service type that the wizard looks for, without its closing dot."""
        return self._resources.get("BonjourNetwork", "").rstrip(".")

    def wireless_models(self):
        """Returns the models that support wireless, in the order of their names."""
        contained = _read(self._path("CDInfo")).get("ContainedModel", {})
        details = _read(self._path("ModelInfo")).get("Model", {})
        wireless = [name for name in contained
                    if details.get(name, {}).get("Interfaces", {}).get("WirelessLAN")]
        if not wireless:
            raise Unsuitable(f"{self._path('ModelInfo')} has no model with WirelessLAN: the wizard "
                             "opens the package and shows no page")
        return sorted(wireless, key=str.lower)

    def unsupported_version(self):
        """Returns a system version that the medium does not support; None if it supports all."""
        for bound, step in (("SystemMin", -1), ("SystemMax", 1)):
            try:
                major = int(self._resources[bound]["Major"])
            except (KeyError, ValueError):
                continue
            if major:
                return f"{major + step}.0.0"
        return None

    def _path(self, entry):
        return self.folder / self._resources.get(entry, "")


def _read(path):
    try:
        return plistlib.loads(path.read_bytes())
    except (OSError, plistlib.InvalidFileException, ValueError) as error:
        raise Unsuitable(f"{path} cannot be read as a property list: {error}") from error
