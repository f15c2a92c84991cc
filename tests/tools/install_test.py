"""Installs a build into a new folder, runs the installed preview, and checks that the documents
link only to installed files. Arguments: cmake, and the build folder."""

import os
import pathlib
import re
import subprocess
import sys
import tempfile
import unittest

CMAKE, BUILD = sys.argv[1:]


class Install(unittest.TestCase):
    def test_the_installed_preview_runs_and_the_documents_link_only_to_installed_files(self):
        with tempfile.TemporaryDirectory() as folder:
            subprocess.run([CMAKE, "--install", BUILD, "--prefix", folder], check=True, capture_output=True)
            prefix = pathlib.Path(folder)
            done = subprocess.run([prefix / "bin/onramp-preview", prefix / "lib/onramp/medium", "--version"],
                                  env=os.environ | {"DISPLAY": ":0", "QT_QPA_PLATFORM": "offscreen"},
                                  capture_output=True, text=True)
            self.assertEqual((done.returncode, done.stderr), (0, ""))
            self.assertRegex(done.stdout, r"\b0 errors, 0 warnings\b[\s\S]*the medium's own[\s\S]*\d\.\d\.\d")
            subprocess.run([sys.executable, "-Bc", "import practice_network.namespace"],
                           cwd=prefix / "lib/onramp/tools", check=True)
            documents = prefix / "share/doc/onramp"
            guide = (documents / "packaging/media-kit.md").read_text(encoding="utf-8")
            named = re.findall(r"\b(?:bin|lib/onramp|share/doc)/[-\w./]*\w", guide)
            self.assertGreater(len(named), 5)
            for page in documents.rglob("*.md"):
                named += [page.parent / link for link in re.findall(r"\]\(([\w./-]+)", page.read_text(encoding="utf-8"))]
            self.assertEqual([name for name in named if not (prefix / name).exists()], [])


unittest.main(argv=sys.argv[:1])
