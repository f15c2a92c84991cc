"""Takes the tours of several languages in parallel, each on a separate practice network if networks
can be created."""

import concurrent.futures
import json
import pathlib
import subprocess
import sys
import tempfile
import time

from onscreen import messages
from practice_network.command import NO_NAMESPACE

from . import index
from .facts import Facts, Unsuitable

INSIDE = "--inside"
_TOOLS = pathlib.Path(__file__).resolve().parents[1]
_AT_A_TIME = 3  # a tour mostly waits, so three at once take little longer than one


def run(arguments, on_network=True, **options):
    """Runs the tour with `arguments`. With `on_network`, runs it on a practice network without
    devices. Returns the finished process."""
    network = [sys.executable, _TOOLS / "practice-network", "/dev/null"] if on_network else []
    return subprocess.run([*network, sys.executable, _TOOLS / "tour", *arguments], **options)


def take_tours(medium, original, pictures, languages, options):
    """Takes the tours and writes the index. Returns the exit status.

    First removes all pictures from the folder `pictures`. Raises Unsuitable if that folder has
    pictures but no index.html.

    `original` is the folder that onramp-check reads: `medium`, or the folder to which the links in
    `medium` lead.
    """
    began = time.monotonic()
    facts = Facts(original)
    wanted = _chosen(languages, medium)
    folder = pathlib.Path(pictures)
    try:
        folder.mkdir(parents=True, exist_ok=True)
    except OSError as error:
        raise Unsuitable(f"{folder} cannot hold the pictures ({error.strerror}); "
                         "give another folder") from error
    if any(folder.glob("*.png")) and not (folder / "index.html").exists():
        raise Unsuitable(f"{folder} has pictures, but no index.html of an earlier tour; "
                         "empty the folder, or give another one")
    status = subprocess.run([sys.executable, _TOOLS / "practice-network", "/dev/null", "true"]).returncode
    if status not in (0, NO_NAMESPACE):
        return status
    if status == NO_NAMESPACE:
        print("A network of made-up devices cannot be created here (see above), "
              "so the tour chooses only a cable.", flush=True)
    # Even if this tour is interrupted, the next tour then accepts the folder.
    (folder / "index.html").touch()
    for old in folder.glob("*.png"):
        old.unlink()
    print("Walking through one language." if len(wanted) == 1 else
          f"Walking through {len(wanted)} languages, at most {_AT_A_TIME} at a time.", flush=True)
    with tempfile.TemporaryDirectory() as results:
        orders = [{"medium": medium, "original": original, "pictures": pictures, "language": language,
                   "options": options, "has_network": status == 0,
                   "result": f"{results}/{number}"} for number, language in enumerate(wanted)]
        statuses = []
        with concurrent.futures.ThreadPoolExecutor(_AT_A_TIME) as pool:
            # The tours' outputs are printed whole and in the order of the index.
            for done in pool.map(_take_one, orders):
                print(f"\n{done.stdout}", end="", flush=True)
                statuses.append(done.returncode)
        files = [pathlib.Path(order["result"]) for order in orders]
        albums = [json.loads(file.read_text(encoding="utf-8")) for file in files if file.exists()]
    index.write(folder, original, facts.findings, albums)
    print(f"\n{len(list(folder.glob('*.png')))} pictures in {time.monotonic() - began:.0f} s: "
          f"{folder / 'index.html'}")
    return max(statuses)


def _chosen(languages, medium):
    """Returns the languages in which to take the tour. None means the user's own language."""
    offered = messages.languages(medium)
    wanted = offered if languages == "all" else filter(None, languages.split(","))
    wanted = list(wanted) or [None]
    for language in wanted:
        if language and language not in offered:
            raise Unsuitable(f"{medium} has no texts in the language {language!r}; "
                             f"it has {', '.join(offered) or 'no texts at all'}")
    return wanted


def _take_one(order):
    """Runs one tour in a separate process. Returns that process, with its output."""
    return run([INSIDE, json.dumps(order)], order["has_network"],
               stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True)
