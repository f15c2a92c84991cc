"""A network of made-up printers and scanners, inside namespaces.

PracticeNetwork is what a test inside the network steers it with.
"""

from practice_network.control import ControlError, PracticeNetwork

__all__ = ["ControlError", "PracticeNetwork"]
