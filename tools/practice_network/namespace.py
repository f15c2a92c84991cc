"""Runs the network in namespaces that disappear when practice-network exits."""

import json
import os
import pathlib
import pwd
import signal
import socket
import subprocess
import sys

from practice_network import description
from practice_network.agents import AgentError
from practice_network.command import BAD_INPUT, NETWORK_FAILED
from practice_network.control import SOCKET_VARIABLE, serve
from practice_network.description import DescriptionError
from practice_network.host import (BUS_ADDRESS, RUN, Host, HostError, log, loop_back,
                                   plug_in_cables, take_over_run)
from practice_network.network import Network
from practice_network.publisher import PublishError, connect

ENCLOSE = ["unshare", "--net", "--mount", "--pid", "--fork", "--kill-child", "--mount-proc"]
LAUNCHER = str(pathlib.Path(__file__).resolve().parent.parent / "practice-network")
CABLES = ("practice0", "practice1")


def why_not_enclosed():
    """Returns None if this process can create the namespaces, otherwise the reason why it
    cannot."""
    probe = subprocess.run([*ENCLOSE, "mount", "-t", "tmpfs", "none", "/run"],
                           capture_output=True, text=True)
    if probe.returncode:
        return probe.stderr.strip() or "unshare failed"
    user = pwd.getpwnam("avahi").pw_uid
    ranges = (map(int, line.split())
              for line in pathlib.Path("/proc/self/uid_map").read_text().splitlines())
    if not any(first <= user < first + count for first, _, count in ranges):
        return "avahi-daemon's user does not exist in this user namespace"
    return None


def enclose(options):
    """Runs the network and the command in new namespaces. Returns the tool's exit status, which is
    the command's unless the network fails or a signal ends the tool."""
    # Ctrl-C is meant for the command, which also receives SIGINT from the terminal. SIGTERM and
    # SIGHUP stop everything.
    signal.signal(signal.SIGINT, lambda *_: None)
    process = subprocess.Popen(
        ["setpriv", "--pdeathsig", "KILL", *ENCLOSE,
         sys.executable, LAUNCHER, "--inside", json.dumps(options)])

    ended_by = []

    def end(number, _):
        ended_by.append(number)
        os.kill(process.pid, signal.SIGKILL)

    signal.signal(signal.SIGTERM, end)
    signal.signal(signal.SIGHUP, end)
    status = _status(process.wait())
    return 128 + ended_by[0] if ended_by else status


def inside(options):
    """Runs as the first process in the namespaces. Starts the network and then the command. Returns
    the exit status of the tool."""
    # SIG_IGN is unsuitable, because the command would inherit it.
    signal.signal(signal.SIGINT, lambda *_: None)
    try:
        environment = _own_run(options["user"])
        devices = _start_devices(options)
        if devices.stdout.readline() != b"ready\n":
            return devices.wait()
        if options["hosts"] == 2:
            settings, _ = description.load(options["description"])
            Host("wizard", CABLES[:settings.interfaces], settings).start_avahi()
            connect(BUS_ADDRESS)
    except (HostError, PublishError) as error:
        return _fail(error)

    try:
        command = _start_command(options, environment)
    except OSError as error:
        print(f"practice-network: {options['command'][0]}: {error.strerror}", file=sys.stderr)
        return 127 if isinstance(error, FileNotFoundError) else 126
    # The first process in a PID namespace must reap all orphans.
    while True:
        pid, status = os.wait()
        if pid == command.pid:
            return _status(os.waitstatus_to_exitcode(status))
        if pid == devices.pid:
            return _fail("the process that ran the made-up devices has exited")


def devices(options):
    """Runs as a separate process, on the command's host or on a second host. Starts the devices and
    carries out requests. Returns only after a failure, with the tool's exit status."""
    try:
        settings, described = description.load(options["description"])
        if options["hosts"] == 2:
            take_over_run()
            interfaces = CABLES[:settings.interfaces]
            plug_in_cables(interfaces)
            network = Network(Host("devices", interfaces, settings), "192.0.2.0/24")
        else:
            interfaces = ("lo", CABLES[1])[:settings.interfaces]
            loop_back(*interfaces[1:] or (None,))
            network = Network(Host("practice", interfaces, settings), "127.0.0.0/8")
        network.load(described)
        network.settle()
    except DescriptionError as error:
        print(f"practice-network: {options['description']}: {error}", file=sys.stderr)
        return BAD_INPUT
    except (HostError, AgentError) as error:
        return _fail(error)
    except PublishError as error:
        return _fail(f"{error}\n{log('avahi-daemon')}")
    print("ready", flush=True)
    serve(network, socket.socket(fileno=options["listener"]))


def _own_run(user):
    """Mounts a new /run. Returns the command's environment, which refers to the new /run."""
    variables = {SOCKET_VARIABLE: str(RUN / "socket"), "DBUS_SYSTEM_BUS_ADDRESS": BUS_ADDRESS,
                 "XDG_RUNTIME_DIR": str(RUN / "user")}
    authority = pathlib.Path(os.environ.get("XAUTHORITY", "/nowhere"))
    cookies = authority.read_bytes() if authority.is_file() else b""
    take_over_run()
    folder = pathlib.Path(variables["XDG_RUNTIME_DIR"])
    folder.mkdir(mode=0o700)
    os.chown(folder, *user)
    if cookies and not authority.exists():  # The new /run hides the file.
        copy = folder / "Xauthority"
        copy.touch(mode=0o600)
        copy.write_bytes(cookies)
        os.chown(copy, *user)
        variables["XAUTHORITY"] = str(copy)
    # These variables name sockets that may be in the old /run.
    gone = ("DBUS_SESSION_BUS_ADDRESS", "WAYLAND_DISPLAY")
    return {key: value for key, value in os.environ.items() if key not in gone} | variables


def _start_devices(options):
    with socket.socket(socket.AF_UNIX) as listener:
        path = str(RUN / "socket")
        listener.bind(path)
        os.chmod(path, 0o666)
        listener.listen(64)
        own_host = ["unshare", "--net", "--mount"] if options["hosts"] == 2 else []
        number = listener.fileno()
        return subprocess.Popen(
            [*own_host, sys.executable, LAUNCHER, "--devices",
             json.dumps(options | {"listener": number})],
            stdin=subprocess.DEVNULL, stdout=subprocess.PIPE, pass_fds=[number],
            start_new_session=True)


def _start_command(options, environment):
    user, group = options["user"]
    identity = {}
    if user != os.getuid():
        account = pwd.getpwuid(user)
        identity = {"user": user, "group": group,
                    "extra_groups": os.getgrouplist(account.pw_name, group)}
        environment |= {"HOME": account.pw_dir, "USER": account.pw_name,
                        "LOGNAME": account.pw_name, "PATH": options["path"]}
    return subprocess.Popen(options["command"], env=environment, **identity)


def _status(code):
    """Returns the exit status that a shell would report for a child's return code."""
    return code if code >= 0 else 128 - code


def _fail(message):
    print(f"practice-network: {message}", file=sys.stderr)
    return NETWORK_FAILED
