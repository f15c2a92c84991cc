"""The wireless part of the tour, on a network of made-up devices."""

from onscreen.processes import wait_for
from practice_network.names import shortened

from .visit import CONNECTION, DEVICES, GEAR_REFRESH, WentWrong

_SEARCHES = 3  # on a busy machine, the first search may find nothing
_LONGEST_SEARCH = 75  # seconds; a search takes at most 15, except on a busy machine


class Devices:
    """Adds made-up devices of the medium's models to the practice network `network`. A device's
    name contains the model's name, and is cut if it is too long for a device."""

    def __init__(self, network, service_type):
        self._network = network
        self._type = service_type
        self._entries = {}

    def make(self, models):
        """Makes two wireless devices of each model, and a wired device of the first model."""
        for number, model in enumerate(models):
            self._add(model, model)
            self._add(model, second_of(model, self._type))
            if number == 0:
                self._add(model, f"{model} on a cable", activeif=1)
        self._network.settle()

    def _add(self, model, name, **entries):
        maker, kind = model.split(" ", 1)
        name = shortened(name, self._type)
        self._entries[name] = {"maker": maker, "model": kind, "type": self._type} | entries
        self._network.add(name, **self._entries[name])

    def leave(self):
        for name in self._entries:
            self._network.remove(name)

    def come_back(self):
        for name in self._entries:
            self._network.add(name)
        self._network.settle()


def second_of(model, service_type):
    """Returns the name of the second device of `model`."""
    return shortened(f"(2) {model}", service_type)


def matches_devices(model):
    """Returns whether a device can announce the name `model`. The name must consist of a maker, a
    space and a model."""
    maker, space, kind = model.partition(" ")
    return bool(maker and space and kind)


def find_devices(visit, medium, step=None):
    """Searches from the connection page until devices are listed. Raises WentWrong if several
    searches find no device. If `step` is set, takes a picture of the first search as step `step`."""
    for number in range(_SEARCHES):
        visit.next()
        wait_for(lambda: visit.person.sees("progress bar"), 20, "the search to begin")
        if step and number == 0:
            visit.picture(step, "The search")
        wait_for(lambda: not _is_searching(visit) and (visit.shows(DEVICES) or _can_connect(visit)),
                 _LONGEST_SEARCH, "the search to end")
        if visit.shows(DEVICES):
            visit.see(DEVICES)
            return
    raise WentWrong(f"the {DEVICES} did not appear: {_SEARCHES} searches found none of the made-up "
                    f"devices of the service type \"{medium.service_type}\". "
                    + medium.facts.about("BonjourNetwork"))


def _is_searching(visit):
    return visit.person.sees("progress bar")


def _can_connect(visit):
    """Returns whether the connection page accepts keys, that is, whether no set-up tool is running."""
    return visit.shows(CONNECTION) and any(
        visit.person.has_state(control, "focused")
        for role, _, control in visit.person.everything() if role == "radio button")


def search_in_vain(visit, devices, gear):
    """Shows the menu of the device list, a search that finds nothing, and a search that finds
    devices."""
    person = visit.person
    devices.leave()
    person.open_menu(gear)
    visit.picture("6-gear", "The menu of the device list")
    person.press("Escape")
    person.choose_from_menu(gear, GEAR_REFRESH)
    wait_for(lambda: _is_searching(visit), 20, "a new search to begin")
    wait_for(lambda: person.sees("alert"), _LONGEST_SEARCH, "the alert that no device was found")
    visit.picture("7-not-found", "A search that found no device: the alert")
    person.press("Return")
    person.see_gone("alert")
    visit.picture("8-nothing", "The device list after a search that found no device")
    devices.come_back()
    person.choose_from_menu(gear, GEAR_REFRESH)
    wait_for(lambda: _is_searching(visit), 20, "a new search to begin")
    person.see_gone("progress bar", seconds=_LONGEST_SEARCH)
