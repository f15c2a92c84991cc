"""Checks that the documents for makers list exactly the keys, texts, settings, pictures and
verdicts that the sources have. Argument: the program onramp-check."""

import re
import subprocess
import sys
import unittest
from pathlib import Path

PROGRAM = sys.argv[1]
ROOT = Path(__file__).resolve().parents[2]
BOOK = "docs/mastering-a-medium.md"


def text_of(*patterns):
    return "\n".join(path.read_text(encoding="utf-8") for pattern in patterns
                     for path in sorted(ROOT.glob(pattern)))


def printed(option):
    output = subprocess.run([PROGRAM, option], capture_output=True, text=True, check=True).stdout
    return [tuple(re.split(" {2,}", line)) for line in output.splitlines()]


def rows(document, heading):
    """Returns the rows of the tables whose heading matches the regular expression `heading`. Each
    row is a tuple of the expression's groups and the row's cells."""
    text = text_of(document).replace("`", "")
    return [(*table.groups()[:-1], *line.strip("| ").split(" | "))
            for table in re.finditer(rf"^\| {heading} \|.*\n\|[-|]+\n((?:\|.*\n)+)", text, re.MULTILINE)
            for line in table[table.lastindex].splitlines()]


class Book(unittest.TestCase):
    maxDiff = None

    def test_has_every_key_with_its_type_and_whether_it_is_needed(self):
        told = []
        for name, keys, kind, need, *_ in rows(BOOK, r"Key in .*?(\w+\.plist)"):
            *path, last = keys.split(" / ")
            told += [(name, kind, need, "/".join([*path, key])) for key in last.split(", ")]
        self.assertCountEqual(told, printed("--keys"))
        read = re.findall(r'(?:string|boolean|dictionary|find|infoString|setDefault)\((?:options, )?"(\w+)"'
                          r'|view k\w+ = "(\w+)"|k(?:Major|Minor|BugFix) = "(\w+)"|\{0x\w+, "(\w+)"',
                          text_of("media/*.cpp", "media/medium.h", "app/*.cpp"))
        self.assertEqual({path.split("/")[-1] for *_, path in told},
                         {"".join(key) for key in read} - {"Country"})  # a key of SupportedKOL.plist

    def test_has_every_text_with_its_room_and_place(self):
        told = rows("docs/texts-and-languages.md", "Key")
        self.assertCountEqual(told, printed("--texts"))
        asked = re.findall(r'"((?:INST|BTN|APP_MENU)_\w+)"', text_of("app/*.[ch]*", "pages/*.[ch]*"))
        self.assertEqual({key for key, *_ in told}, set(asked))

    def test_has_every_setting_and_picture(self):
        self.assertEqual([row[0] for row in rows(BOOK, "Key in maker.json")],
                         re.findall(r'^ *"(\w+)":', text_of("maker.json"), re.MULTILINE))
        pictures = re.findall(r'\{"(\w+\.png)", (\d+), (\d+)', text_of("tools/check/pictures.cpp"))
        self.assertEqual([(name, f"{width} × {height}") for name, width, height in pictures],
                         [(file.split("/")[-1], size) for file, size, *_ in rows(BOOK, r"File \| Pixels")])

    def test_support_and_the_manual_page_have_every_verdict(self):
        sources = text_of("tools/devices/*.cpp")
        verdicts = {name for names in re.findall(r'\.id = (.*?),\s*\.|differs\(("[^"]+")', sources)
                    for name in re.findall(r'"([^"]+)"', "".join(names))}
        manual = text_of("tools/devices/onramp-devices.1").partition(".SH VERDICTS")[2].partition(".SH")[0]
        self.assertEqual(verdicts, set(re.findall(r"\\fB(.*?)\\fR", manual.replace("\\-", "-"))))
        named = re.findall(r"`((?!onramp|practice)[a-z][a-z\d-]+)`", text_of("docs/support.md"))
        self.assertEqual(verdicts, set(named))


unittest.main(argv=sys.argv[:1])
