"""A network of made-up printers and scanners, inside namespaces.

A test inside the network controls it with PracticeNetwork.
"""

from practice_network.control import ControlError, PracticeNetwork

__all__ = ["ControlError", "PracticeNetwork"]
