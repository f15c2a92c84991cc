"""The facts about a medium.

They come from onramp-check, which reads media with the wizard's own code. The environment variable
ONRAMP_CHECK names that program. Without the variable, the release build's onramp-check is used.
"""

import dataclasses
import json
import os
import pathlib
import subprocess

_BUILT = pathlib.Path(__file__).resolve().parents[2] / "build/release/tools/onramp-check"


class Unsuitable(Exception):
    """Raised when the tour cannot begin. The message says why."""


@dataclasses.dataclass(frozen=True)
class Model:
    """A model, and its connections as the medium gives them."""

    name: str
    usb: bool
    wired: bool
    wireless: bool

    @property
    def kind(self):
        return self.usb, self.wired, self.wireless

    def connections(self):
        """Returns the connections in words."""
        words = [word for word, has in zip(("USB", "wired network", "wireless network"), self.kind)
                 if has]
        return ", ".join(words) or "no connection"


class Facts:
    """The models and languages of the medium in `folder`, and the mistakes on it."""

    def __init__(self, folder):
        program = os.environ.get("ONRAMP_CHECK", str(_BUILT))
        try:
            done = subprocess.run([program, "--json", folder], capture_output=True, text=True)
        except OSError as error:
            raise Unsuitable(f"{program} cannot be run ({error.strerror}); build the target "
                             "\"onramp-check\" of the preset \"release\"") from error
        if done.returncode not in (0, 1):
            raise Unsuitable(done.stderr.strip())
        said = json.loads(done.stdout)
        self.start = said["start"]  # "package", "connection type" or "model list"
        self.models = [Model(**model) for model in said["models"]]
        # The number of texts in each language.
        self.texts = {one["name"]: one["texts"] for one in said["languages"]}
        self.findings = said["findings"]

    def names(self):
        return [model.name for model in self.models]

    def kinds(self):
        """Returns one model for each combination of connections. Prefers models whose name has a
        space, because a device announces a maker and a model."""
        chosen = {}
        for model in self.models:
            known = chosen.get(model.kind)
            if not known or (" " not in known.name and " " in model.name):
                chosen[model.kind] = model
        return list(chosen.values())

    def about(self, key):
        """Returns what is wrong with the value of a key, in sentences; "" if nothing is
        wrong."""
        said = [f"{finding['file']}: {key}: {finding['found']}. Effect: {finding['effect']}."
                for finding in self.findings if key in finding["key"]]
        return " ".join(said)

    def without_tool(self):
        """If the medium names no wireless set-up tool, or names a file instead of an application's
        folder, returns the effect that users see. Returns "" otherwise."""
        return next((finding["effect"] for finding in self.findings
                     if finding["id"] in ("tool-none", "tool-no-bundle")), "")
