"""Checks two things on the example medium that onramp-check does not check: texts that name a
button, and the exit status of the set-up tool.
"""

import os
import plistlib
import subprocess
import sys
import unittest
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
MEDIUM = ROOT / "examples/medium"
TOOL = MEDIUM / "Utilities/Kestrel Wireless Setup.app/Contents"
LANGUAGES = ("en", "de", "ja", "ko", "zh_CN")
sys.path.insert(0, str(ROOT / "tools"))

from onscreen import messages  # noqa: E402


class Messages(unittest.TestCase):
    def test_descriptions_call_the_next_button_by_its_title(self):
        for language in LANGUAGES:
            table = messages.read(MEDIUM, language)
            for key in ("INST_TXT_MODEL_DESC", "INST_TXT_CONNECTIONTYPE_DESC"):
                self.assertIn(table["BTN_NEXT"], table[key], language)


class Medium(unittest.TestCase):
    def test_an_environment_variable_sets_the_exit_status_of_the_set_up_tool(self):
        information = plistlib.loads((TOOL / "Info.plist").read_bytes())
        program = TOOL / "MacOS" / information["CFBundleExecutable"]
        for told, status in (("", 1), ("0", 0), ("2", 2), ("255", 255), ("256", 64), ("x", 64)):
            with self.subTest(told):
                run = subprocess.run([program, "-installer"], timeout=30, capture_output=True,
                                     env=os.environ | {"ONRAMP_EXAMPLE_TOOL_STATUS": told},
                                     text=True, check=False)
                self.assertEqual(status, run.returncode)
                self.assertIn("-installer", run.stderr)


if __name__ == "__main__":
    unittest.main()
