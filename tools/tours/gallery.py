"""Takes pictures of every page in several languages, sizes and colour schemes."""

import contextlib
import pathlib
import tempfile

from onscreen import messages
from onscreen.desktop import Desktop
from onscreen.processes import wait_for
from practice_network.names import shortened

from . import crowded
from .facts import Facts, Unsuitable
from .medium import Medium
from .person import Person
from .visit import GEAR_REFRESH, choose_model

LANGUAGES = ("en_US", "de_DE", "ja_JP", "ko_KR", "zh_CN")
DEVICES = 40
_ROWS = 8  # enough to show every kind of name
_ANSWER_SECONDS = 20
_PATIENCE = 120
_SEARCHES = 10
_LARGE, _USUAL = 18, 10  # points
_WIRELESS, _WIRED = 2, 1  # what a device answers about its interface

_DARK = {"Window": ("35,38,41", "252,252,252"), "View": ("27,30,32", "252,252,252"),
         "Button": ("49,54,59", "252,252,252"), "Selection": ("61,174,233", "252,252,252"),
         "Tooltip": ("49,54,59", "252,252,252")}
_CONTRAST = {"Window": ("0,0,0", "255,255,0"), "View": ("0,0,0", "255,255,0"),
             "Button": ("0,0,0", "255,255,0"), "Selection": ("255,255,0", "0,0,0"),
             "Tooltip": ("0,0,0", "255,255,0")}
_SCHEMES = {"light": {}, "dark": _DARK, "contrast": _CONTRAST}


def settings(scheme, points):
    """Returns a desktop's settings file for a colour scheme and a text size in points."""
    lines = ["[General]", f"font=Sans Serif,{points},-1,5,50,0,0,0,0,0"]
    for group, (background, text) in _SCHEMES[scheme].items():
        lines += [f"[Colors:{group}]", f"BackgroundNormal={background}",
                  f"BackgroundAlternate={background}", f"ForegroundNormal={text}",
                  f"ForegroundInactive={text}", f"ForegroundLink={text}",
                  f"ForegroundVisited={text}", f"DecorationFocus={text}",
                  f"DecorationHover={text}"]
    return "\n".join(lines) + "\n"


def all_looks(follows_desktop):
    """Returns (language, scale in per cent, scheme, points) for every set of pictures.

    The front end for macOS has one size and one colour scheme under GNUstep.
    """
    if not follows_desktop:
        return [(language, 100, "light", _USUAL) for language in (*LANGUAGES, crowded.LANGUAGE)]
    looks = [(language, scale, scheme, _USUAL) for language in LANGUAGES for scale in (100, 200)
             for scheme in ("light", "dark")]
    looks += [(language, scale, "light", _LARGE) for language in LANGUAGES for scale in (100, 200)]
    looks += [(crowded.LANGUAGE, 100, "light", points) for points in (_USUAL, _LARGE)]
    return looks + [("en_US", 100, "contrast", _USUAL)]


def take_all(folder, pictures, network):
    """Takes the pictures of a crowded copy of the medium in `folder`. `network` is a practice
    network without devices. Returns the exit status."""
    pictures = pathlib.Path(pictures)
    for old in pictures.glob("*pt-[1-7]-*.png"):
        old.unlink()
    with tempfile.TemporaryDirectory() as copies, Desktop() as desktop:
        copy = crowded.make(folder, pathlib.Path(copies) / "medium")
        medium = Medium(copy, Facts(copy))
        model = next((model.name for model in medium.facts.models
                      if model.wireless and " " in model.name), None)
        if not model:
            raise Unsuitable(f"{folder} has no wireless model whose name is a maker and a model, so "
                             "there is no device to list")
        Gallery(desktop, medium, pictures, network).take(
            model, medium.service_type, medium.too_old() or medium.too_new())
    return 0


class Gallery:
    """Takes the pictures. `medium` is a crowded copy; `network` has no devices yet."""

    def __init__(self, desktop, medium, pictures, network):
        self._desktop = desktop
        self._medium = medium
        self._pictures = pictures
        self._network = network

    def take(self, model, service_type, version):
        """Takes all pictures. The search finds devices of `model`. `version` is a version of
        macOS that the medium does not support, or None."""
        self._add_devices(model, service_type)
        with tempfile.TemporaryDirectory() as folder:
            for look in all_looks(Person.follows_desktop):
                language, scale, scheme, points = look
                (pathlib.Path(folder) / "kdeglobals").write_text(settings(scheme, points))
                self._look = f"{language}-{scale}-{scheme}-{points}pt"
                self._env = {"LANG": f"{language}.UTF-8", "QT_SCALE_FACTOR": str(scale / 100),
                             "XDG_CONFIG_HOME": folder, "XDG_CURRENT_DESKTOP": "KDE",
                             "KDE_FULL_SESSION": "true", "KDE_SESSION_VERSION": "5"}
                table = language if language == "zh_CN" else language.partition("_")[0]
                self._text = messages.read(self._medium.folder, table)
                print(self._look, flush=True)
                self._pages(model)
                if version:
                    self._alert(version)

    def _add_devices(self, model, service_type):
        maker, kind = model.split(" ", 1)
        for number in range(DEVICES):
            # The number comes first, so that the top of the sorted list, which the picture shows, has
            # every kind of name.
            name = shortened(f"{number:02} {crowded.LONG_NAMES[number % len(crowded.LONG_NAMES)]}",
                             service_type)
            self._network.add(name, maker=maker, model=kind, type=service_type)
        self._network.settle()

    def _let_devices_answer(self, interface):
        for device in self._network.list():
            self._network.set(device["name"], activeif=interface)
        self._network.settle()

    def _start(self, *arguments):
        self._desktop.forget()
        return Person(self._desktop, self._medium.program, arguments, env=self._env)

    def _pages(self, model):
        with self._start() as person:
            person.see("label", self._text["INST_TXT_MODEL"], _PATIENCE)
            self._take(person, "1-models")
            choose_model(person, self._medium.facts.names(), model)
            person.press("Return")
            person.see("label", self._text["INST_TXT_CONNECTIONTYPE"], _PATIENCE)
            self._take(person, "2-connection")
            self._search(person)
            # The list can show its devices while the search is still running.
            person.see_gone("label", self._text["INST_WAIT"], _PATIENCE)
            with contextlib.suppress(TimeoutError):  # on a busy machine, few devices answer in time
                wait_for(lambda: len(person.rows()) >= _ROWS, _ANSWER_SECONDS, "devices in the list")
            self._take(person, "4-devices")
            if Person.follows_desktop:
                person.press("Tab")  # from the list to the gear button
            person.open_menu()
            self._take(person, "5-gear")
            self._let_devices_answer(_WIRED)
            person.choose_from_open_menu(GEAR_REFRESH)
            person.see("label", self._text["INST_TXT_ALERT_DEVICENOTFOUND"], _PATIENCE)
            self._take(person, "6-not-found")
            self._let_devices_answer(_WIRELESS)

    def _search(self, person):
        """Searches until devices are listed. On a busy machine, the first search may find none."""
        title = self._text["INST_TXT_DEVLIST"]
        for _ in range(_SEARCHES):
            person.press("Return")
            person.see("label", self._text["INST_WAIT"], _PATIENCE)
            self._take(person, "3-search")
            wait_for(lambda: person.sees("label", title) or self._can_connect(person), _PATIENCE,
                     "the end of the search")
            if person.sees("label", title):
                return
        raise RuntimeError(f"{_SEARCHES} searches found none of the {DEVICES} devices")

    @staticmethod
    def _can_connect(person):
        """Returns whether the connection page accepts keys: no search and no set-up tool is running."""
        return any(role == "radio button" and person.has_state(control, "enabled") and
                   person.has_state(control, "focused")
                   for role, _, control in person.everything())

    def _alert(self, version):
        with self._start("--system-version", version) as person:
            person.see("push button", self._text["BTN_CLOSE"], _PATIENCE)
            self._take(person, "7-alert")

    def _take(self, person, page):
        person.picture(self._pictures / f"{self._look}-{page}.png")
