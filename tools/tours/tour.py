"""The tour through the wizard of one medium in one language."""

from onscreen.processes import InVain
from practice_network.names import shortened

from .album import file_names
from .search import Devices, find_devices, matches_devices, search_in_vain, second_of
from .visit import ALERT, CONNECTION, MODELS, Visit, WentWrong


_MODELS_AT_ONCE = 3  # how many models get made-up devices when the wizard has no model list
_UNMATCHED = ("No device can announce the name of this model, because the name is not a maker, a space "
              "and a model. The tour leaves out the wireless way.")

_FAILED_BEFORE = "The tour leaves out the wireless way, because it went wrong with an earlier model."


class Tour:
    """Takes pictures for `album`. `network` is a practice network without devices, or None.

    `options` are passed to the wizard at each start.
    """

    def __init__(self, desktop, medium, album, network, options=()):
        self._desktop = desktop
        self._medium = medium
        self._facts = medium.facts
        self._album = album
        self._network = network
        self._options = list(options)

    def take(self):
        """Takes the whole tour. When one section goes wrong, the tour continues with the next."""
        self._section("Menu and About", "menu", self._menu)
        if self._first in (CONNECTION, MODELS):
            self._models()
        self._section("Alerts on unsupported systems", "alert", self._alerts)

    def _section(self, title, name, take):
        self._album.begin(title, name)
        try:
            take()
        except WentWrong as error:
            self._album.problem(str(error))

    def _visit(self, *options):
        return Visit(self._desktop, self._medium, self._album, [*self._options, *options])

    # The menu, shown on the first page.

    _first = None

    def _menu(self):
        with self._visit() as visit:
            self._first = visit.first_page()
            if self._first is None:
                mistakes = " See the mistakes that onramp-check found." * bool(self._facts.findings)
                self._album.note("There is no page, because no model on the medium supports "
                                 f"wireless, so the package opens at once.{mistakes}")
                visit.see_package_open(1, "At once")
            elif self._first == ALERT:
                visit.picture("0-refused", "The alert, instead of a first page")
            else:
                self._open_menu(visit)
        if self._first == ALERT:
            self._take_a_supported_system()

    def _open_menu(self, visit):
        person = visit.person
        person.press("F10")
        person.see("popup menu")
        visit.picture("1-menu", "The application's menu")
        bar, about, *_ = (control for role, _, control in person.everything()
                          if role == "menu item")
        person.click_control(about)
        person.see("alert")
        visit.picture("2-about", "The About panel")

    def _take_a_supported_system(self):
        """Continues with the oldest system that the medium names. If the options name a
        system or the medium names none, adds a note instead."""
        oldest = self._medium.oldest_system()
        if any(option.startswith("--system-version") for option in self._options) or not oldest:
            self._album.note("The medium does not support this system, so there is no page.")
            return
        self._album.note("The medium does not support the version of macOS that the preview "
                         f"assumes, so the tour continues with macOS {oldest}.")
        self._options += ["--system-version", oldest]
        with self._visit() as visit:
            self._first = visit.first_page()
            if self._first in (CONNECTION, MODELS):
                self._open_menu(visit)
            else:
                self._album.problem(f"macOS {oldest} is refused, too, so there is no page. "
                                    + self._facts.about("SystemMax"))

    # The pages.

    def _models(self):
        wireless = [model for model in self._facts.models if model.wireless]
        if self._first == CONNECTION:
            self._make_devices([model.name for model in wireless[:_MODELS_AT_ONCE]])
            model = next((one for one in wireless if matches_devices(one.name)), wireless[0])
            title = f"All models ({model.connections()})"
            self._section(title, "all-models", lambda: self._walk(model))
            return
        kinds = self._facts.kinds()
        self._make_devices([model.name for model in kinds if model.wireless])
        names = file_names([model.name for model in kinds])
        for model in kinds:
            title, name = f"{model.name} ({model.connections()})", names[model.name]
            self._section(title, name, lambda: self._walk(model))

    def _make_devices(self, models):
        """Makes up devices, or sets `_no_devices` to the reason why there are none."""
        self._searched = [model for model in models if matches_devices(model)]
        self._devices = None
        self._no_devices = ""
        if not self._network:
            self._no_devices = ("There is no network of made-up devices here, so the tour leaves "
                                "out the wireless way.")
        elif not self._medium.service_type:
            self._no_devices = ("The medium names no service type (BonjourNetwork), so the wizard "
                                "finds no device. The tour leaves out the wireless way.")
        elif not self._searched:
            self._no_devices = _UNMATCHED
        else:
            self._devices = Devices(self._network, self._medium.service_type)
            self._devices.make(self._searched)

    def _walk(self, model):
        files = 2 if self._first == MODELS else 1
        with self._visit() as visit:
            self._go_to_list(visit, model, pictures=True)
            if not model.wireless:
                visit.next()
                visit.see_package_open(files, "After the model list, because this model does not "
                                       "support wireless")
                return
            self._go_to_connection(visit)
            visit.picture("2-connection", "Wireless is chosen at first")
            visit.choose_cable()
            visit.picture("3-cable", "The cable is chosen")
            if not model.usb:
                self._album.note("The wizard offers \"USB\" here, although the model has none. It "
                                 "names the wired network only for models that have USB, too.")
            visit.next()
            visit.see_package_open(files, "By cable")
        if self._devices and model.name in self._searched:
            # Searches that fail take minutes, so they are not repeated for the next model.
            devices, self._devices = self._devices, None
            self._no_devices = _FAILED_BEFORE
            self._walk_wireless(model, devices)
            self._devices = devices
        else:
            self._album.note(self._no_devices or _UNMATCHED)

    def _go_to_list(self, visit, model, pictures=False):
        """Waits for the first page and, if it is the model list, chooses the model there."""
        page = visit.first_page()
        if page == MODELS:
            visit.choose_model(model.name)
            if pictures:
                visit.picture("1-models", "The model is chosen")
        elif pictures:
            self._album.note("There is no model list, because all models of the medium are "
                             "connected in the same way. The devices of every model are listed.")

    def _go_to_connection(self, visit):
        if self._first == MODELS:
            visit.next()
        visit.see(CONNECTION)

    def _walk_wireless(self, model, devices):
        is_first = model.name == self._searched[0]
        with self._visit() as visit:
            self._go_to_list(visit, model)
            self._go_to_connection(visit)
            find_devices(visit, self._medium, "4-search" if is_first else None)
            visit.person.see("table cell", shortened(model.name, self._medium.service_type))
            visit.picture("5-devices", "The devices that were found")
            if not is_first:
                self._album.note(f"The search and the rest of the way are shown for {self._searched[0]}.")
                return
            if effect := self._facts.without_tool():
                self._album.note(f"The medium has no wireless set-up tool. Effect: {effect}.")
            search_in_vain(visit, devices, self._medium.gear)
            visit.person.click("table cell", second_of(model.name, self._medium.service_type))
            visit.picture("9-choice", "A device is chosen")
            visit.next()
            visit.see_package_open(2, "By wireless")

    # The alerts.

    def _alerts(self):
        for version, step, bound, system in (
                (self._medium.too_old(), "1-too-old", "SystemMin", "an older"),
                (self._medium.too_new(), "2-too-new", "SystemMax", "a newer")):
            if not version:
                self._album.note(f"The medium has no limit {bound}, so there is no alert on {system} "
                                 "system.")
                continue
            with self._visit("--system-version", version) as visit:
                visit.see(ALERT)
                visit.picture(step, f"The alert on {system} system, macOS {version}")
                visit.next()
                if not visit.left_nothing():
                    self._album.problem("after the alert, the wizard did not exit cleanly, or it "
                                        "wrote files")
