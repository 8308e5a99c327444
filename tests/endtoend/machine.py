# SPDX-License-Identifier: GPL-3.0-or-later
"""The DHCP server's machine that the program runs on: the private network."""

import os
import pathlib
import shutil
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
    return int(pathlib.Path("/run/dhcpd.pid").read_text())


# --- Its clients


def network_client(verb, mac, *arguments):
    """Has a machine on a wire join, ask, leave or tell its address; what it prints."""
    result = run("network-client", verb, mac, *arguments)
    if result.returncode:
        raise AssertionError(f"network-client {verb} {mac}: {result.stdout}")
    return result.stdout.strip()


# --- Files


def verdict(path=CONFIGURATION):
    """What the server finds wrong with a configuration; empty when it accepts it."""
    result = run("dhcpd", "-t", "-4", "-cf", path)
    return result.stdout if result.returncode else ""


def backups():
    """The files of the kept versions, the oldest first."""
    return sorted(BACKUPS.iterdir()) if BACKUPS.is_dir() else []
