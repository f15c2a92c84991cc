"""Runs tools/tour on a medium with mistakes.

Usage: tour_test.py MEDIUM

MEDIUM is the folder of a medium with the application on it. The environment variable ONRAMP_CHECK may
hold the path of onramp-check. The default is the release build's program.
"""

import pathlib
import re
import shutil
import subprocess
import sys
import tempfile
import unittest

import media
from media import model

BUILT = pathlib.Path(sys.argv.pop()).resolve()
TOUR = pathlib.Path(__file__).resolve().parents[2] / "tools/tour"
# These names have no space, but the wizard joins a device's maker and model with a space. So no
# device matches these models, and the network makes no difference to the tour.
MODELS = {"Ä/1": model(usb=True, wireless=True), "a-1": model(wireless=True), "Cable": model(usb=True)}


class Tour(unittest.TestCase):
    def test_the_tour_takes_pictures_for_each_kind_of_model_and_language_despite_mistakes(self):
        with tempfile.TemporaryDirectory() as folder:
            medium = media.make(f"{folder}/medium", BUILT, MODELS,
                                SystemMin={"Major": "11", "Minor": "3"})
            (medium / "Packages/Kestrel.pkg").unlink()
            for shared in ("CDCommonMessage.bundle", "Images"):
                (medium / "MacResources" / shared).unlink()
                shutil.copytree(BUILT / "MacResources" / shared, medium / "MacResources" / shared)
            pictures = pathlib.Path(folder) / "pictures"
            done = subprocess.run([TOUR, "--languages", "de,zh_CN", medium, pictures],
                                  capture_output=True, text=True)
            self.assertEqual(done.returncode, 1, done.stdout + done.stderr)
            for said in ("continues with macOS 11.3.0", "the medium has no limit SystemMax",
                         "By cable, users see nothing, because Packages/Kestrel.pkg is not on"):
                self.assertEqual(done.stdout.lower().count(said.lower()) > 1, True, said)
            steps = ["1-models", "2-connection", "3-cable"]
            names = {*(f"{name}-{step}" for name in ("a-1", "A-1-2") for step in steps),
                     "Cable-1-models", "menu-0-refused", "menu-1-menu", "menu-2-about",
                     "alert-1-too-old"}
            expected = {f"{language}-{name}.png" for language in ("de", "zh-CN") for name in names}
            self.assertEqual({path.name for path in pictures.glob("*.png")}, expected)
            index = (pictures / "index.html").read_text(encoding="utf-8")
            self.assertEqual(set(re.findall(r'src="([^"]*)"', index)), expected)


unittest.main()
