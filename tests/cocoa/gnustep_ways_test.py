"""The ways of tests/window through the front end for Cocoa, on GNUstep.

Usage: gnustep_ways_test.py [unittest options] MEDIUM, a medium's folder with that application on it.
"""

import pathlib
import sys
import unittest

HERE = pathlib.Path(__file__).resolve().parent
sys.path[:0] = [str(HERE), str(HERE.parent / "window")]

import ways_test  # noqa: E402
from gnustep_person import GNUstepPerson  # noqa: E402

ways_test.Person = GNUstepPerson

if __name__ == "__main__":
    unittest.main(module=ways_test)
