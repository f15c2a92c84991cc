"""The pictures of one language, in sections, with the tour's notes and problems."""

import pathlib
import re
import unicodedata


def file_names(names):
    """Returns a dictionary that has a part of a file name for each name. The parts differ even if
    case is ignored."""
    result, used = {}, set()
    for name in names:
        letters = unicodedata.normalize("NFKD", name).encode("ascii", "ignore").decode()
        plain = re.sub(r"[^A-Za-z0-9]+", "-", letters)[:60].strip("-") or "model"
        part, number = plain, 1
        while part.lower() in used:
            number += 1
            part = f"{plain}-{number}"
        used.add(part.lower())
        result[name] = part
    return result


class Album:
    """Saves the pictures of `language` in `folder`, and prints what happens.

    `content` is what the index shows: the language and its sections.
    """

    def __init__(self, folder, language):
        self._folder = pathlib.Path(folder)
        self._prefix = file_names([language])[language]
        self.content = {"language": language, "sections": []}
        self.problems = 0

    def begin(self, title, name):
        """Begins a section. The names of its pictures' files contain `name`."""
        self._name = name
        self._section = {"title": title, "pictures": [], "notes": [], "problems": [], "files": []}
        self.content["sections"].append(self._section)
        print(f"{self.content['language']}: {title}", flush=True)

    def picture(self, person, step, caption):
        """Takes a picture of the screen, and returns its file's name."""
        name = f"{self._prefix}-{self._name}-{step}.png"
        person.picture(self._folder / name)
        self._section["pictures"].append({"file": name, "caption": caption})
        return name

    def note(self, text):
        print(f"  {text}", flush=True)
        self._section["notes"].append(text)

    def problem(self, text):
        print(f"  WRONG: {text}", flush=True)
        self._section["problems"].append(text)
        self.problems += 1

    def file(self, name, text):
        """Keeps a file that the wizard wrote for the package."""
        self._section["files"].append({"name": name, "text": text})
