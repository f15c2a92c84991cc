"""Takes the tour in one language. Each tour has its own process, because a process can use only one
desktop."""

import json
import pathlib

from onscreen.desktop import Desktop
from practice_network import PracticeNetwork

from .album import Album
from .facts import Facts
from .medium import Medium
from .tour import Tour


def take(medium, original, pictures, language, options, has_network, result):
    """Takes the tour, and writes the album's content to the file `result`. Returns the exit status.

    `language` is None for the user's own language. With `has_network`, this process is on a practice
    network without devices.
    """
    met = Medium(medium, Facts(original), language)
    album = Album(pictures, met.language)
    try:
        with Desktop(dense=False) as desktop:
            Tour(desktop, met, album, PracticeNetwork() if has_network else None, options).take()
    finally:
        pathlib.Path(result).write_text(json.dumps(album.content), encoding="utf-8")
    return 1 if album.problems else 0
