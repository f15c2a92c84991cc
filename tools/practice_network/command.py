"""The command line, which starts a network or, with `ctl`, controls the network that it runs in."""

import argparse
import importlib.util
import json
import os
import shutil
import sys
import textwrap
import tomllib

from practice_network import agents, description
from practice_network.control import ControlError, PracticeNetwork
from practice_network.description import DescriptionError

BAD_INPUT = 2
NO_NAMESPACE = 77
NETWORK_FAILED = 125
PACKAGES = {"unshare": "util-linux", "setpriv": "util-linux", "nsenter": "util-linux",
            "mount": "mount", "ip": "iproute2", "dbus-daemon": "dbus-daemon",
            "avahi-daemon": "avahi-daemon", "snmpd": "snmpd"}

HELP = """
Runs COMMAND (default: a shell) on a network of made-up printers and scanners, and returns the exit
status of COMMAND. Real Avahi and net-snmp daemons play the devices, in namespaces of the kernel. No
packet leaves this machine, and no hardware is needed. The network disappears when COMMAND or this
tool exits or is killed.

This command runs the wizard of MEDIUM, a medium's folder, with the twenty devices of the example
practice-network.toml. The example is in examples/ of the source tree and in lib/onramp/examples/ of
an installation:
    practice-network practice-network.toml "MEDIUM/Onramp OSX.app/Contents/Linux/Onramp OSX"
This command starts a shell on the network. The commands after it show the devices there:
    practice-network practice-network.toml
    avahi-browse -rpt _pdl-datastream._tcp
    snmpget -v1 -c corridor 127.0.1.1 1.3.6.1.4.1.4242.2.4.4.1240.1.2.0

The tool needs root or sudo. COMMAND runs as the user who started the tool.
"""

DETAILS = """
the description is a TOML file. An optional table is for the network:
    [network]
    ipv6 = true                    false: IPv4 only; default true
    interfaces = 2                 1 or 2; default 1. Each sees all devices, as Ethernet and Wi-Fi do
                                   in one network. With --hosts 2, their names are practice0 and
                                   practice1, otherwise lo and practice1.
    domains = ["annex.local"]      domains to browse besides "local"; default none
there is one table for each device:
    [[device]]
    name = "Kestrel Model 100"     the name in the wizard's list; only this entry is required. A
                                   name in a script such as Japanese should have at most 57 bytes,
                                   because Avahi loses devices with longer names after two minutes.
    maker = "Kestrel"              maker and model; the wizard lists the device only if the two
    model = "Model 100"            together, "Kestrel Model 100", are a model's name on the medium
    note = "2nd floor"             the device's location
    type = "_ipp._tcp"             or a list of types; default "_pdl-datastream._tcp"
    domain = "annex.local"         default "local"; other domains must end in ".local"
    port = 631                     default: the type's usual port, or 9100
    addresses = ["127.0.1.9"]      or a number: the network chooses that many; default 1
    activeif = 1                   the number that the device answers, or a word. The default,
                                   "wireless", is the maker's number for wireless. "silent":
                                   receives the request and never answers. "closed": has no agent.
                                   "missing": has an agent without the object. "text": answers with
                                   a string. A list gives each address its own value. IPv6
                                   addresses have no agent.
    delay = 1.5                    seconds before each SNMP answer; default 0
    present = false                false: switched off at the start; default true
    txt = {rp = "auto"}            more TXT entries

inside the network, these commands show and change the devices while COMMAND runs. KEY=VALUE is an
entry as in the file, but a string needs no quotes:
    practice-network ctl list                         prints the devices, with their states
    practice-network ctl add NAME [KEY=VALUE ...]     switches on a known device, or adds a new one
    practice-network ctl set NAME KEY=VALUE ...       changes a device, such as: activeif=silent
    practice-network ctl rename NAME NEW-NAME         gives a device another name
    practice-network ctl remove NAME                  switches a device off
    practice-network ctl unplug INTERFACE             takes an interface down
    practice-network ctl plug INTERFACE               brings the interface back
    practice-network ctl stop-daemon | start-daemon | restart-daemon      controls Avahi
    practice-network ctl settle                       waits until the devices are published
PracticeNetwork in tools/practice_network offers these commands to Python tests. ctl and
PracticeNetwork find the network through the environment variable ONRAMP_PRACTICE_SOCKET.

programs with windows: DISPLAY works if the X server has its socket in /tmp/.X11-unix, as X servers
do by default. Abstract sockets and TCP connections to the X server do not work.
XDG_RUNTIME_DIR is a new folder. The session bus, Wayland and the accessibility bus of your
desktop cannot be reached. Start what you need inside, for instance with "dbus-run-session -- COMMAND".

exit status: the status of COMMAND, or 128 + n if signal n killed COMMAND or the tool; 2 for a bad
description or command line, 77 if namespaces cannot be created, 125 if the network did not start or
stopped before COMMAND, 126 or 127 if COMMAND could not be run. ctl returns 0 if the network did what
was asked, 1 if not, and 2 for a bad command line.
"""


def main(arguments):
    program, *arguments = arguments
    match arguments:
        case ["ctl", *request]:
            return _steer(request)
        case ["--inside", options]:
            from practice_network import namespace
            return namespace.inside(json.loads(options))
        case ["--devices", options]:
            from practice_network import namespace
            return namespace.devices(json.loads(options))
    return _run(program, arguments)


def _run(program, arguments):
    parser = argparse.ArgumentParser(
        prog="practice-network", formatter_class=argparse.RawDescriptionHelpFormatter,
        usage="practice-network [--hosts 2] DESCRIPTION [COMMAND [ARGUMENT ...]]\n"
              "       practice-network ctl REQUEST [ARGUMENT ...]",
        description=textwrap.dedent(HELP), epilog=DETAILS)
    parser.add_argument("--hosts", type=int, choices=(1, 2), default=1,
                        help="2: devices and COMMAND are on two hosts in the network "
                             "192.0.2.0/24, joined by a cable for each interface. Each host has "
                             "its own Avahi; ctl controls the Avahi of the devices")
    parser.add_argument("--invoker", help=argparse.SUPPRESS)
    parser.add_argument("description", metavar="DESCRIPTION", nargs="?")
    parser.add_argument("command", metavar="COMMAND", nargs=argparse.REMAINDER)
    options = parser.parse_args(arguments)
    if options.description is None:
        parser.error("DESCRIPTION is missing; give a TOML file, or /dev/null for a network without devices")

    try:
        description.load(options.description)
        agents.maker_settings()
    except DescriptionError as error:
        return _complain(error, BAD_INPUT)
    if os.getuid() != 0:
        return _become_root(program, arguments)
    return _enclose(options)


def _enclose(options):
    os.environ["PATH"] += ":/usr/sbin:/sbin"
    for name, package in PACKAGES.items():
        if not shutil.which(name):
            return _complain(f"{name} is missing; install it: apt-get install {package}",
                             NETWORK_FAILED)
    if not importlib.util.find_spec("dbus"):
        return _complain(f"{sys.executable} has no module dbus; use /usr/bin/python3, and install "
                         "the module: apt-get install python3-dbus", NETWORK_FAILED)

    from practice_network import namespace
    reason = namespace.why_not_enclosed()
    if reason:
        return _complain(f"this machine cannot create namespaces: {reason}", NO_NAMESPACE)
    user, group, path = json.loads(options.invoker) if options.invoker else (0, 0, "")
    command = options.command[1:] if options.command[:1] == ["--"] else options.command
    return namespace.enclose({
        "description": os.path.abspath(options.description), "hosts": options.hosts,
        "command": command or [os.environ.get("SHELL", "/bin/sh")],
        "user": [user, group], "path": path})


def _become_root(program, arguments):
    if not shutil.which("sudo"):
        return _complain("namespaces need root: you are not root, and there is no sudo",
                         NO_NAMESPACE)
    ask = [] if sys.stdin.isatty() else ["-n"]
    if os.spawnvp(os.P_WAIT, "sudo", ["sudo", *ask, "-v"]):
        return _complain("namespaces need root: you are not root, and sudo refuses",
                         NO_NAMESPACE)
    invoker = json.dumps([os.getuid(), os.getgid(), os.environ.get("PATH", "")])
    os.execvp("sudo", ["sudo", "-E", *ask, "--", "setpriv", "--pdeathsig", "KILL", sys.executable,
                       os.path.abspath(program), "--invoker", invoker, *arguments])


def _steer(request):
    parser = argparse.ArgumentParser(prog="practice-network ctl")
    requests = parser.add_subparsers(dest="operation", required=True, metavar="REQUEST")
    for name, operands in (("add", ["name", "entries"]), ("remove", ["name"]),
                           ("rename", ["name", "new_name"]), ("set", ["name", "entries"]),
                           ("list", []), ("unplug", ["interface"]), ("plug", ["interface"]),
                           ("settle", []), ("stop-daemon", []),
                           ("start-daemon", []), ("restart-daemon", [])):
        one = requests.add_parser(name)
        for operand in operands:
            one.add_argument(operand, nargs="*" if operand == "entries" else None)
    operands = vars(parser.parse_args(request))
    operation = operands.pop("operation").replace("-", "_")
    try:
        entries = dict(_entry(text) for text in operands.pop("entries", ()))
        result = getattr(PracticeNetwork(), operation)(**operands, **entries)
    except ControlError as error:
        return _complain(error, 1)
    for device in result or ():
        print(json.dumps(device, ensure_ascii=False))
    return 0


def _entry(text):
    """Returns the key and the value of KEY=VALUE. The value is written as in a description file,
    except that a string needs no quotes."""
    key, equals, value = text.partition("=")
    if not equals:
        raise ControlError(f'"{text}": write an entry as KEY=VALUE')
    try:
        return key, tomllib.loads(f"value = {value}")["value"]
    except tomllib.TOMLDecodeError:
        return key, value


def _complain(message, status):
    print(f"practice-network: {message}", file=sys.stderr)
    return status
