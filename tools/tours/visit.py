"""One run of the wizard, page by page."""

import contextlib
import subprocess
import time

from onscreen.processes import InVain, wait_for

from .person import Person

GEAR_REFRESH = 2
MODELS, CONNECTION, DEVICES, ALERT = "model list", "connection page", "device list", "alert"
# The roles by which a page is recognised in any language. The page has a control with one of these
# roles, and no other page has one.
_ROLES = {MODELS: ("list",), CONNECTION: ("radio button",), DEVICES: ("tree", "tree table", "table"),
          ALERT: ("alert",)}
_TITLES = {MODELS: "INST_TXT_MODEL", CONNECTION: "INST_TXT_CONNECTIONTYPE",
           DEVICES: "INST_TXT_DEVLIST"}
_PATIENCE = 60  # seconds; one is enough on an idle machine
_TOLD = ("heading", "label", "push button", "radio button", "alert")


class WentWrong(Exception):
    """The wizard did not do what it should. The message says what, in terms of the medium."""


def choose_model(person, models, model):
    """Chooses a model with the keyboard. `models` are all models on the medium."""
    person.see("list item")
    # The list should be in the order of Unicode. If it is not, single steps lead to the model.
    steps = sorted(models).index(model) - sorted(models).index(_selected_model(person))
    if steps:
        person.press(*["Down" if steps > 0 else "Up"] * abs(steps))
    for key in ("Down", "Up"):
        while (before := _selected_model(person)) != model and _moves(person, key, before):
            pass
    if before != model:
        raise WentWrong(f"the model list has no {model!r}")


def _moves(person, key, before):
    """Presses a key and returns whether another model is selected then."""
    person.press(key)
    try:
        return wait_for(lambda: _selected_model(person) != before, 3, "another model")
    except InVain:
        return False


def _selected_model(person):
    return wait_for(lambda: next(
        (name for role, name, item in person.everything()
         if role == "list item" and person.has_state(item, "selected")), None),
        10, "a selected model")


class Visit:
    """Starts the wizard with `options`, and stops it at the end of the `with` statement.

    What goes wrong in between is raised as WentWrong.
    """

    def __init__(self, desktop, medium, album, options=()):
        self._desktop = desktop
        self._medium = medium
        self._album = album
        self._options = options
        self._stack = contextlib.ExitStack()
        self.text = medium.text

    def __enter__(self):
        self._desktop.forget()
        self.person = self._stack.enter_context(Person(
            self._desktop, self._medium.program, self._options,
            env={"LC_ALL": self._medium.locale, "LANG": self._medium.locale}))
        return self

    def __exit__(self, kind, error, _):
        try:
            if kind and issubclass(kind, (OSError, RuntimeError, subprocess.SubprocessError,
                                          *self.person.errors)):
                raise WentWrong(self._explained(error)) from error
        finally:
            self._stack.close()

    def picture(self, step, caption):
        self._album.picture(self.person, step, caption)

    def first_page(self):
        """Waits for the first page and returns its name, or None if the wizard exited without a
        page."""
        def shown():
            if not self.person.is_running():
                return "none"
            return next((page for page in (CONNECTION, MODELS, ALERT) if self.shows(page)), None)
        page = wait_for(shown, _PATIENCE, "the first page")
        self._compare_title(page)
        return None if page == "none" else page

    def shows(self, page):
        return any(self.person.sees(role) for role in _ROLES[page])

    def see(self, page):
        """Waits for a page."""
        wait_for(lambda: not self.person.is_running() or self.shows(page), _PATIENCE, f"the {page}")
        if not self.person.is_running():
            raise WentWrong(f"the {page} did not appear, because the wizard exited; "
                            f"it {self.opened_in_words()}")
        self._compare_title(page)

    def _compare_title(self, page):
        title = self.text[_TITLES[page]] if page in _TITLES else None
        if title and not self.person.sees("label", title):
            self._album.problem(f"the {page} does not have its title in the language "
                                f"{self._medium.language}, \"{title}\". {self._on_screen()}")

    def next(self):
        """Goes on with Next, which is the default button."""
        self.person.press("Return")

    def choose_model(self, model):
        choose_model(self.person, self._medium.facts.names(), model)

    def choose_cable(self):
        """Chooses the second way to connect, the one without wireless."""
        *_, cable = (control for role, _, control in self.person.everything()
                     if role == "radio button")
        self.person.click_control(cable)
        wait_for(lambda: self.person.has_state(cable, "checked"), 10, "the cable to be chosen")

    def see_package_open(self, files, way):
        """Waits for the wizard to exit, and checks how many files it wrote and what it opened. Raises
        WentWrong if the exit status is not 0.

        `files` is the number of files that the wizard should write for the package. `way` says how
        the user came here, such as "By cable".
        """
        status = self._end()
        if status:
            raise WentWrong(f"the wizard exited with status {status}")
        written = self._files()
        for file in written:
            self._album.file(f"{way}: {file.name}",
                             file.read_text(encoding="utf-8", errors="replace"))
        if len(written) != files:
            self._album.problem(f"{way}, the wizard wrote {len(written)} files for the package instead "
                                f"of {files}")
        opened = self._opened()
        missing = [path for path in opened if not (self._medium.folder / path).exists()]
        if missing:
            self._album.problem(f"{way}, users see nothing, because {missing[0]} is not on the medium")
        elif opened:
            self._album.note(f"{way}, the wizard {self.opened_in_words()}.")
        else:
            self._album.problem(f"{way}, users see nothing, because the medium names no package for "
                                f"this system. {self._medium.facts.about('PkgInfo')}")

    def left_nothing(self):
        """Waits for the wizard to exit. Returns whether it exited with status 0, and wrote no
        files."""
        return self._end() == 0 and not self._files()

    def _end(self):
        """Waits for the wizard to exit, and returns its status."""
        wait_for(lambda: not self.person.is_running(), _PATIENCE, "the wizard to exit")
        return self.person.process.returncode

    def opened_in_words(self):
        return f"opened {', '.join(self._opened())}" if self._opened() else "opened nothing"

    def _opened(self):
        """Returns what the wizard opened, relative to the medium."""
        return [path.removeprefix(f"{self._medium.folder}/") for path in self._desktop.opened()]

    def _files(self):
        """Returns the files that the wizard wrote for the package. The files for all users come
        first."""
        return sorted(self._desktop.local_folder.rglob("*.plist")) + sorted(
            self._desktop.user_folder.rglob("*.plist"))

    def _explained(self, error):
        if not self.person.is_running():
            return (f"the wizard exited with status {self.person.process.returncode}, "
                    f"and {self.opened_in_words()}")
        self.picture("last", "What the screen showed when the tour could not continue")
        wanted = getattr(error, "what", None)
        why = f"the tour expected {wanted}" if wanted else f"the window could not be used ({error})"
        return f"{why}. {self._on_screen()}"

    def _on_screen(self):
        time.sleep(0.2)
        seen = [f"\"{name}\"" for role, name, _ in self.person.everything()
                if role in _TOLD and name]
        if not seen:
            return ("The screen shows no window. The wizard hides its window while the wireless "
                    "set-up tool runs.")
        return "The screen shows " + ", ".join(" ".join(text.split()) for text in seen[:8]) + "."
