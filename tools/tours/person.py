"""The person who uses the wizard.

With ONRAMP_GNUSTEP in the environment, the wizard is the Cocoa front end under GNUstep.
"""

import os
import pathlib
import sys

ON_GNUSTEP = "ONRAMP_GNUSTEP" in os.environ
if ON_GNUSTEP:
    sys.path.append(str(pathlib.Path(__file__).resolve().parents[2] / "tests/cocoa"))
    from gnustep_person import GNUstepPerson as Person
else:
    from onscreen.person import Person
