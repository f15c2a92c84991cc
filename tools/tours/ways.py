"""Routes through the wizard, with a picture of each page."""

import contextlib
import subprocess

from onscreen.processes import wait_for

from .person import Person

GEAR_REFRESH = 2
_ALERT = "BTN_CLOSE"
# The texts that tell the first pages apart: key, role, and what the wizard shows without the text.
_FIRST_PAGES = (("INST_TXT_CONNECTIONTYPE", "label", "INST_TXT_CONNECTIONTYPE"),
                ("INST_TXT_MODEL", "label", "INST_TXT_MODEL"), (_ALERT, "push button", "Close"))
_LONGEST_SEARCH = 60  # seconds; the wizard waits 15, but the machine may be busy


def choose_model(person, model):
    """Chooses a model with the keyboard, because it may be scrolled out of sight."""
    person.see("list item")
    while (selected := _selected_model(person)) != model:
        person.press("Down")
        wait_for(lambda: _selected_model(person) != selected, 10,
                 f"the selection to move from {selected!r} towards {model!r}")


def _selected_model(person):
    return wait_for(lambda: next(
        (name for role, name, item in person.everything()
         if role == "list item" and person.has_state(item, "selected")), None),
        10, "a selected model")


class WentWrong(Exception):
    """The wizard did not do what it should. The text says what."""


class Tour:
    """Uses a medium's wizard on a desktop. `network` is the practice network or None.

    Each start of the wizard gets `options`.
    """

    def __init__(self, desktop, medium, pictures, network, options=()):
        self._desktop = desktop
        self._medium = medium
        self._text = medium.text
        self._pictures = pictures
        self._network = network
        self._options = options

    def refuses(self):
        """Returns whether the wizard refuses the system that the options name; shows the alert."""
        with self._start() as person:
            if self._first_page(person) != _ALERT:
                return False
            self._picture(person, "alert")
            print("The medium does not support this system version, so the wizard shows only the "
                  "alert.")
            return True

    def alert(self):
        """Shows the alert on a system that the medium does not support."""
        version = self._medium.unsupported_version()
        if any(option.startswith("--system-version") for option in self._options):
            return
        if not version:
            print("The medium supports every system version, so there is no alert to show.")
            return
        with self._start("--system-version", version) as person:
            person.see("push button", self._text.get("BTN_CLOSE", "Close"))
            self._picture(person, "alert")
            person.press("Return")
            _expect(person.wait_for_end() == 0 and not self._files(),
                    "after the alert, the wizard did not end cleanly, or it wrote files")

    def usb(self):
        """Goes from the model list to the connection page and USB, until the package opens."""
        model = self._medium.wireless_models()[0]
        with self._start() as person:
            chosen = self._to_connection_page(person, model, "usb")
            cable = next(name for role, name, _ in person.everything()
                         if role == "radio button" and name != self._text["INST_TXT_WIFI"])
            person.click("radio button", cable)
            self._picture(person, "usb-3-cable")
            person.click("push button", self._text["BTN_NEXT"])
            self._see_package_open(person, 2 if chosen else 1)

    def wireless(self):
        """Takes the wireless route: devices are found, disappear, and are found again."""
        model = next((name for name in self._medium.wireless_models() if " " in name), None)
        if not model:
            print("No device can match a model whose name has no space, so "
                  "the tour leaves out the wireless route.")
            return
        self._make_up_devices(model)
        with self._start() as person:
            self._to_connection_page(person, model, "wireless")
            person.press("Return")
            self._wait_for_search(person, "wireless-3-search")
            person.see("table cell", model)
            self._picture(person, "wireless-4-devices")

            self._let_devices(self._network.remove)
            person.open_menu(self._medium.gear)
            self._picture(person, "wireless-5-gear")
            person.press("Escape")
            person.choose_from_menu(self._medium.gear, GEAR_REFRESH)
            self._wait_for_search(person, "wireless-6-search")
            person.see("label", self._text.get("INST_TXT_ALERT_DEVICENOTFOUND", "Device not found"))
            self._picture(person, "wireless-7-not-found")
            person.press("Return")
            person.see_gone("alert")
            self._picture(person, "wireless-8-nothing")

            self._let_devices(self._network.add)
            self._network.settle()
            person.choose_from_menu(self._medium.gear, GEAR_REFRESH)
            self._wait_for_search(person)
            person.click("table cell", _second_of(model))
            self._picture(person, "wireless-9-choice")
            person.click("push button", self._text["BTN_NEXT"])
            self._see_package_open(person, 2)

    def _make_up_devices(self, model):
        maker, kind = model.split(" ", 1)
        entries = {"maker": maker, "model": kind, "type": self._medium.service_type}
        for name in (model, _second_of(model), f"{model} (3)"):
            self._network.add(name, **entries)
        self._network.add(f"{model} on a cable", activeif=1, **entries)
        self._network.settle()

    def _let_devices(self, do):
        for device in self._network.list():
            do(device["name"])

    def _picture(self, person, name):
        """Saves a picture of the screen, and returns its path."""
        path = self._pictures / f"{self._medium.language}-{name}.png"
        person.picture(path)
        return path

    @contextlib.contextmanager
    def _start(self, *arguments):
        self._desktop.forget()
        with Person(self._desktop, self._medium.program, [*self._options, *arguments],
                    env={"LC_ALL": self._medium.locale, "LANG": self._medium.locale}) as person:
            try:
                yield person
            except TimeoutError as error:
                place = self._picture(person, "last")
                raise WentWrong(f"{error}. {place} shows the screen at that time.") from error
            except subprocess.CalledProcessError as error:
                raise WentWrong(f"the wizard's window is not there any more: {error}") from error

    def _first_page(self, person):
        """Waits for the wizard's first page or alert. Returns the key of the text that it is known by."""
        def shown():
            _expect(person.is_running(), f"no page appeared: the wizard ended with status "
                    f"{person.process.returncode}, and {self._what_was_opened()}")
            return next((page for page, role, default in _FIRST_PAGES
                         if person.sees(role, self._text.get(page, default))), None)
        try:
            return wait_for(shown, 20, "the first page")
        except TimeoutError as error:
            titles = " or ".join(f'"{self._text[page]}"' for page, *_ in _FIRST_PAGES[:2])
            raise TimeoutError(
                "the first page did not appear, because nothing on the screen has its title in "
                f"the language {self._medium.language!r}: {titles}") from error

    def _what_was_opened(self):
        opened = self._desktop.opened()
        return f"opened {', '.join(opened)}" if opened else "opened nothing"

    def _to_connection_page(self, person, model, way):
        """Goes to the connection page. Returns whether the model list was shown before it."""
        title = self._text["INST_TXT_CONNECTIONTYPE"]
        on_list = self._first_page(person) == "INST_TXT_MODEL"
        if on_list:
            choose_model(person, model)
            self._picture(person, f"{way}-1-models")
            person.press("Return")
            person.see("label", title)
        self._picture(person, f"{way}-2-connection")
        return on_list

    def _wait_for_search(self, person, picture=None):
        person.see("label", self._text["INST_WAIT"])
        if picture:
            self._picture(person, picture)
        person.see_gone("label", self._text["INST_WAIT"], _LONGEST_SEARCH)

    def _see_package_open(self, person, files):
        status = person.wait_for_end()
        _expect(status == 0, f"the wizard ended with status {status}")
        for file in self._files():
            print(f"\n{file.name}:\n{file.read_text(encoding='utf-8')}", end="")
        _expect(len(self._files()) == files,
                f"the wizard wrote {len(self._files())} files for the package instead of {files}")
        _expect(self._desktop.opened(), "the wizard did not open the package")
        print("\nopened: " + "\n".join(self._desktop.opened()))

    def _files(self):
        """Returns the files that the wizard wrote for the package, those for all users first."""
        return sorted(self._desktop.local_folder.glob("*/*.plist")) + sorted(
            self._desktop.user_folder.glob("*/*.plist"))


def _second_of(model):
    return f"{model} (2)"


def _expect(condition, what):
    if not condition:
        raise WentWrong(what)
