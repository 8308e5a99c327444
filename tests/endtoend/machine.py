# SPDX-License-Identifier: GPL-3.0-or-later
"""The DHCP server's machine that the program runs on: the private network."""

import ipaddress
import os
import pathlib
import shutil
import socket
import subprocess

ROOT = pathlib.Path(__file__).resolve().parents[2]
SITE = ROOT / "demo" / "etc"  # what the folders hold at first

CONFIGURATION = pathlib.Path("/etc/dhcp/dhcpd.conf")
DEFAULTS = pathlib.Path("/etc/default/isc-dhcp-server")
LEASES = pathlib.Path("/var/lib/dhcp/dhcpd.leases")
BACKUPS = pathlib.Path("/var/backups/orv-admin-dhcp")

SERVICE = "isc-dhcp-server"
SERVICE_RECORD = pathlib.Path("/run/private-network/service")


def run(*command):
    """The finished command, with its output."""
    return subprocess.run(
        list(map(str, command)),
        stdin=subprocess.DEVNULL,
        stdout=subprocess.PIPE,
        stderr=subprocess.STDOUT,
        text=True,
        check=False,
    )


def process_name(pid):
    """The name of a process's program; None when it has ended, even if nobody has asked for its exit status yet."""
    try:
        before, _, state = pathlib.Path(f"/proc/{pid}/stat").read_text().rpartition(") ")
    except (FileNotFoundError, ProcessLookupError):
        return None
    return None if state[0] in "ZX" else before.partition(" (")[2]


def reset():
    """Makes the machine as it was when the private network began: the site's files, a stopped server, no settings."""
    systemctl("stop")
    for folder in ("/etc/bind", "/etc/default", "/etc/dhcp", "/var/backups", "/var/lib/dhcp"):
        empty(pathlib.Path(folder))
    shutil.copytree(SITE, "/etc", dirs_exist_ok=True, copy_function=shutil.copyfile)
    empty(pathlib.Path(os.environ["XDG_CONFIG_HOME"]))
    shutil.rmtree(SERVICE_RECORD, ignore_errors=True)


def empty(folder):
    for entry in folder.iterdir():
        if entry.is_dir() and not entry.is_symlink():
            shutil.rmtree(entry)
        else:
            entry.unlink()


# --- The service


def systemctl(verb):
    return run("systemctl", verb, SERVICE)


def server_is_running():
    return systemctl("status").returncode == 0


def server_pid():
    """None while there is none."""
    try:
        return int(pathlib.Path("/run/dhcpd.pid").read_text())
    except (FileNotFoundError, ValueError):
        return None


def server_command():
    """The words that the server was started with; none when it is not there."""
    try:
        return pathlib.Path(f"/proc/{server_pid()}/cmdline").read_text().split("\0")[:-1]
    except FileNotFoundError:
        return []


def interfaces_listened_on():
    """Those on which the server, which alone does this here, gets what comes from the wire."""
    sockets = pathlib.Path("/proc/net/packet").read_text().splitlines()[1:]
    return sorted(socket.if_indextoname(int(line.split()[4])) for line in sockets)


def server_log():
    """What the server has logged since it was started last. A line may come later than what it tells."""
    path = SERVICE_RECORD / "journal"
    return path.read_text().split(f"Starting {SERVICE}.service")[-1] if path.exists() else ""


# --- Its clients


class Client:
    """A machine on the wire of one of the server's interfaces. It asks for an address as soon as it is there."""

    def __init__(self, mac, interface, host_name=None):
        self.mac = mac
        self.host_name = host_name
        self.has_left = False
        self.tell("join", interface, *([host_name] if host_name else []))

    def tell(self, verb, *arguments):
        result = run("network-client", verb, self.mac, *arguments)
        if result.returncode:
            raise AssertionError(f"network-client {verb} {self.mac}: {result.stdout}")
        return result.stdout.strip()

    def ask(self):
        """Asks anew, for the address that it last had."""
        self.tell("ask")

    def leave(self):
        """Gives its address back and goes, unless it has left before."""
        if not self.has_left:
            self.tell("leave")
        self.has_left = True

    @property
    def address(self):
        """Its address; empty while it has none."""
        return self.tell("address")

    @property
    def routes(self):
        """The gateways of the networks that it was given routes to."""
        lines = map(str.split, self.tell("routes").splitlines())
        return {ipaddress.ip_network("0.0.0.0/0" if to == "default" else to): via for to, _, via, *_ in lines}

    @property
    def log(self):
        return self.tell("log")


# --- Files


def verdict(path=CONFIGURATION):
    """What the server finds wrong with a configuration; empty when it accepts it."""
    result = run("dhcpd", "-t", "-4", "-cf", path)
    return result.stdout if result.returncode else ""


def backups():
    """The files of the kept versions, the oldest first."""
    return sorted(BACKUPS.iterdir()) if BACKUPS.is_dir() else []
