"""With this folder in PYTHONPATH, every test of tests/window uses the Cocoa front end under GNUstep.

Python imports this module when it starts, also in the processes that a test starts.
"""

import pathlib
import sys

sys.path.append(str(pathlib.Path(__file__).resolve().parents[2] / "tools"))

import gnustep_person  # noqa: E402
import onscreen.person  # noqa: E402

onscreen.person.Person = gnustep_person.GNUstepPerson
