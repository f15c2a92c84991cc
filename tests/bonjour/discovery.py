"""Helpers for the tests and benchmarks of device discovery."""

import os
import pathlib
import signal
import socket
import struct
import subprocess
import sys
import threading
import time

ROOT = pathlib.Path(__file__).resolve().parent.parent.parent
PRACTICE_NETWORK = ROOT / "tools" / "practice-network"
PATIENCE = 30  # seconds to wait for an event before the test fails


def enclose(description):
    """Unless this program is running on a practice network, restarts it on one with two hosts.

    `description` is the network's description file.
    """
    if "ONRAMP_PRACTICE_SOCKET" in os.environ:
        return
    os.execv(sys.executable, [sys.executable, "-B", str(PRACTICE_NETWORK), "--hosts", "2",
                              str(description), sys.executable, "-B", *sys.argv])


class Search:
    """A running `bonjour_probe search`. Each line of its output becomes an event, a list of fields:
    the time, a word such as "found", a name, and details. The name is the device's or, if the word
    is "start", the service type's."""

    def __init__(self, probe, service_type, **options):
        self._process = subprocess.Popen([probe, "search", service_type + "."], text=True,
                                         stdin=subprocess.PIPE, stdout=subprocess.PIPE, **options)
        self._events = []
        self._news = threading.Condition()
        self._reader = threading.Thread(target=self._read)
        self._reader.start()

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self.end()

    def _read(self):
        for line in self._process.stdout:
            with self._news:
                self._events.append(line.rstrip("\n").split("\t"))
                self._news.notify_all()

    def events(self, word, name=None):
        return [event for event in self._events
                if word in (None, event[1]) and name in (None, event[2])]

    def wait(self, condition):
        """Waits until `condition()` is true, and returns its value. Raises AssertionError
        if that takes longer than PATIENCE seconds."""
        with self._news:
            if not self._news.wait_for(condition, PATIENCE):
                raise AssertionError(f"the expected event is not among these: {self._events}")
            return condition()

    def wait_for(self, word, name, count=1):
        """Waits for at least `count` events with this word and name, and returns the latest one."""
        return self.wait(lambda: len(self.events(word, name)) >= count and
                         self.events(word, name)[-1])

    def end(self, patience=PATIENCE):
        """Ends the program by closing its input, and returns its exit status."""
        if not self._process.stdin.closed:
            self._process.stdin.close()
        status = self._process.wait(patience)
        self._reader.join()
        self._process.stdout.close()
        return status


class Avahi:
    """The Avahi daemon of this host, for tests that kill, freeze and restart it."""

    configuration = pathlib.Path("/run/practice-network/avahi-daemon.conf")
    pid_file = pathlib.Path("/run/avahi-daemon/pid")

    def kill(self):
        process = pathlib.Path("/proc", str(self._pid()))
        os.kill(self._pid(), signal.SIGKILL)
        # A new daemon does not start while the old process exists.
        deadline = time.monotonic() + PATIENCE
        while process.exists():
            if time.monotonic() > deadline:
                raise AssertionError("avahi-daemon does not exit")
            time.sleep(0.01)

    def freeze(self):
        os.kill(self._pid(), signal.SIGSTOP)

    def thaw(self):
        os.kill(self._pid(), signal.SIGCONT)

    def start(self, **settings):
        """Starts the daemon with a copy of its configuration file, in which each of `settings`
        replaces a setting. An argument's name has "_" where the setting's name has "-"."""
        text = self.configuration.read_text()
        for name, value in settings.items():
            key = name.replace("_", "-") + "="
            text = "\n".join(key + value if line.startswith(key) else line
                             for line in text.split("\n"))
        configuration = self.configuration.with_name("changed.conf")
        configuration.write_text(text)
        subprocess.run(["avahi-daemon", "-f", configuration, "--no-drop-root", "--no-chroot",
                        "--no-rlimits", "--daemonize"], check=True, stderr=subprocess.DEVNULL)

    def restart(self, **settings):
        self.kill()
        self.start(**settings)

    def wait_for_interfaces(self, service_type, names):
        """Waits until Avahi sees services of the type on exactly the interfaces in `names`."""
        deadline = time.monotonic() + PATIENCE
        seen = None
        while seen != names:
            if time.monotonic() > deadline:
                raise AssertionError(f"services are seen on {seen}, not on {names}")
            output = subprocess.run(["avahi-browse", "-pc", service_type], text=True, check=True,
                                    stdout=subprocess.PIPE).stdout
            seen = {line.split(";")[1] for line in output.splitlines()}

    def _pid(self):
        return int(self.pid_file.read_text())


def announce_pointer(service_type, target_labels, seconds=4500):
    """Announces a single PTR record (RFC 6762 section 8.3). The record points from `service_type`
    in the domain "local" to the name with the labels `target_labels`. `seconds` is the record's
    time to live; 0 withdraws the record."""
    name = _labels(*service_type.encode().split(b"."), b"local")
    target = _labels(*target_labels)
    packet = (struct.pack("!6H", 0, 0x8400, 0, 1, 0, 0) + name
              + struct.pack("!HHIH", 12, 1, seconds, len(target)) + target)
    with socket.socket(socket.AF_INET, socket.SOCK_DGRAM) as sender:
        sender.setsockopt(socket.SOL_SOCKET, socket.SO_REUSEADDR, 1)
        sender.setsockopt(socket.SOL_SOCKET, socket.SO_REUSEPORT, 1)
        sender.setsockopt(socket.IPPROTO_IP, socket.IP_MULTICAST_TTL, 255)
        sender.bind(("", 5353))
        sender.sendto(packet, ("224.0.0.251", 5353))


def _labels(*labels):
    return b"".join(bytes([len(label)]) + label for label in labels) + b"\0"
