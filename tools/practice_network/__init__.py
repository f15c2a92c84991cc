"""A network of made-up printers and scanners, inside namespaces of the kernel.

Programs that run inside the network use PracticeNetwork to change its devices.
"""

from practice_network.control import ControlError, PracticeNetwork

__all__ = ["ControlError", "PracticeNetwork"]
