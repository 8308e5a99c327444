#!/usr/bin/env python3
# SPDX-License-Identifier: GPL-3.0-or-later
"""Measures the program beside the programs that it is compared with, on the same files, and prints the ratios.

Usage: bench/compare.py BUILD_FOLDER [--hosts N] [--leases N] [--rounds N] [--seconds N] [--only TABLE...]

BUILD_FOLDER is a build of the preset "bench". The DHCP server and dhcpd-pools are found in $ORV_TOOLS_DIR, where
scripts/fetch-tools puts them, or in PATH. All sides of a ratio run in turn, once a round, and the minima of their
processor time are compared; times by the clock are shown beside them. The start can be measured by the superuser only,
as the program starts for nobody else.
"""
import argparse
import contextlib
import itertools
import json
import os
import pathlib
import resource
import shutil
import subprocess
import sys
import tempfile
import time
from typing import NamedTuple

from inputs import appended_blocks, write_configuration, write_leases, write_server_leases


class Key(NamedTuple):
    """What is typed into the search field: a text and the one before it. grep looks for the same, or for `sought`."""

    kind: str
    before: str
    text: str
    sought: str = ""


KEYS = (
    Key("address", "10.3.12", "10.3.12."),
    Key("octet", "25", "255"),
    Key("digit", "", "1"),
    Key("letter", "", "e"),
    Key("rare letter", "", "q"),
    Key("hardware", "02:00", "02:00:"),
    Key("name", "lapto", "laptop"),
    Key("scattered names", "host-1", "host-10"),
    Key("state", "activ", "active"),
    Key("another state", "fre", "free"),
    Key("hour", "01", "01:"),
    Key("time of day", "01:0", "01:05"),
    Key("date", "21 No", "21 Nov", "2026"),
    Key("another date", "19 No", "19 Nov", "2026"),
    Key("month", "No", "Nov", "2026"),
    Key("year", "202", "2026"),
    Key("every row", "10", "10."),
    Key("none", "host", "hostx"),
    Key("none, short", "zz", "zzz"),
    Key("none, rare", "qq", "qqq"),
    Key("cleared", "host-10", ""),
    Key("cleared after none", "hostx", ""),
)


class Time(NamedTuple):
    """Milliseconds of processor time, by which times are compared, and by the clock on the wall."""

    cpu: float
    wall: float

    def __str__(self):
        return f"{self.cpu:.1f} ms (by the clock {self.wall:.1f})"


class Row(NamedTuple):
    what: str
    measured: str
    goal: str
    is_met: bool

    def __str__(self):
        return f"| {self.what} | {self.measured} | {self.goal} | {'yes' if self.is_met else 'NO'} |"


def ratio_row(what, mine, name, other, share):
    """A row whose goal is at most `share` of the time of another program."""
    measured = f"{mine}, {name} {other}: 1/{other.cpu / mine.cpu:.1f}"
    return Row(what, measured, f"1/{1 / share:.0f}", mine.cpu <= share * other.cpu)


def limit_row(what, time, limit):
    return Row(what, str(time), f"{limit} ms", time.cpu <= limit)


def memory_row(what, measured, limit):
    return Row(what, f"{measured:.2f} bytes per byte", str(limit), measured <= limit)


def find(package, program):
    tools = os.environ.get("ORV_TOOLS_DIR")
    if tools:
        for folder in ("usr/sbin", "usr/bin"):
            path = pathlib.Path(tools, package, folder, program)
            if path.exists():
                return str(path)
    return shutil.which(program, path=os.environ["PATH"] + ":/usr/sbin") or sys.exit(f"{program} is not installed")


def run(command):
    """The time of a program. One that finds nothing, as grep may, is no failure.

    Its output is read: grep stops at the first match when nobody does.
    """

    def processor():
        usage = resource.getrusage(resource.RUSAGE_CHILDREN)
        return usage.ru_utime + usage.ru_stime

    began, began_processor = time.perf_counter(), processor()
    status = subprocess.run(command, check=False, stdout=subprocess.PIPE, stderr=subprocess.DEVNULL).returncode
    if status not in (0, 1):
        raise subprocess.CalledProcessError(status, command)
    return Time((processor() - began_processor) * 1e3, (time.perf_counter() - began) * 1e3)


def shortest(times):
    return Time(*map(min, zip(*times)))


class Bench:
    """The benchmarks of a build, as often as there are rounds."""

    def __init__(self, build, rounds):
        self.build = build
        self.rounds = range(rounds)

    def counters(self, name):
        output = subprocess.run(
            [self.build / "bench/orv_bench", f"--benchmark_filter=^{name}/", "--benchmark_format=json"],
            check=True,
            stdout=subprocess.PIPE,
            stderr=subprocess.DEVNULL,
        ).stdout
        return json.loads(output)["benchmarks"][0]

    def once(self, name):
        return time_in(self.counters(name))

    def in_turn(self, name, command):
        """The shortest times of a benchmark and a program, and the benchmark's memory in bytes for each of the file."""
        runs = [(self.counters(name), run(command)) for _ in self.rounds]
        mine = shortest(time_in(counters) for counters, _ in runs)
        return mine, shortest(other for _, other in runs), runs[-1][0]["bytes_per_byte"]


def time_in(counters, suffix=""):
    return Time(counters["cpu_ms" + suffix], counters["wall_ms" + suffix])


def configuration_rows(bench, folder, arguments):
    path = os.path.join(folder, "dhcpd.conf")
    write_configuration(path, arguments.hosts)
    os.environ["ORV_BENCH_CONFIGURATION"] = path
    on_file = f" ({os.path.getsize(path) / 1e6:.1f} MB)"
    checker = [find("isc-dhcp-server", "dhcpd"), "-t", "-cf", path]
    reading, checking, memory = bench.in_turn("readConfiguration", checker)
    yield ratio_row("read the configuration" + on_file, reading, "dhcpd -t", checking, 1 / 12)
    yield memory_row("memory of the tree", memory, 4)
    writing = shortest(bench.once("serializeConfiguration") for _ in bench.rounds)
    yield ratio_row("write it back", writing, "reading", reading, 1 / 2)
    adding = shortest(bench.once("addHost") for _ in bench.rounds)
    yield limit_row("add a host, tree shown again", adding, 200)


def lease_rows(bench, folder, arguments):
    pools = os.path.join(folder, "pools.conf")
    pathlib.Path(pools).write_text("subnet 10.0.0.0 netmask 255.0.0.0 { range 10.0.0.1 10.255.255.254; }\n", "ascii")
    for kind, write in (("plain", write_leases), ("of a server", write_server_leases)):
        path = os.path.join(folder, "dhcpd.leases")
        write(path, arguments.leases)
        os.environ["ORV_BENCH_LEASES"] = path
        on_file = f", {kind} ({os.path.getsize(path) / 1e6:.0f} MB)"
        lister = [find("dhcpd-pools", "dhcpd-pools"), "-c", pools, "-l", path, "-f", "j", "-o", "/dev/null"]
        loading, listing, memory = bench.in_turn("loadLeases", lister)
        yield ratio_row("load the leases" + on_file, loading, "dhcpd-pools", listing, 1 / 8)
        yield memory_row("memory of the lease table" + on_file, memory, 0.3)
        yield limit_row("one block appended" + on_file, bench.once("appendBlock"), 10)
        yield from key_rows(bench, path, on_file)


def key_rows(bench, path, on_file):
    os.environ["ORV_BENCH_KEYS"] = "\n".join(f"{key.before}\t{key.text}" for key in KEYS)
    sought = {key.sought or key.text for key in KEYS} - {""}
    mine, greps = [], []
    for _ in bench.rounds:
        mine.append(bench.counters("searchKeys"))
        greps.append({text: run(["grep", "-cF", text, path]) for text in sought})
    others = {text: shortest(grep[text] for grep in greps) for text in sought}
    least = min(others, key=others.get)
    for number, key in enumerate(KEYS):
        time = shortest(time_in(counters, f"_{number}") for counters in mine)
        text = key.sought or key.text or least
        what = f'key "{key.text}" after "{key.before}" ({key.kind}){on_file}'
        yield ratio_row(what, time, f"grep -cF {text}", others[text], 1 / 2)


@contextlib.contextmanager
def display(folder):
    """Where windows are drawn: an X server of our own where Xvfb is installed, else memory (offscreen)."""
    xvfb = shutil.which("Xvfb")
    if not xvfb:
        yield "offscreen", {"QT_QPA_PLATFORM": "offscreen"}
        return
    read_end, write_end = os.pipe()
    command = [xvfb, "-displayfd", str(write_end), "-screen", "0", "1280x900x24", "-noreset", "-nolisten", "tcp"]
    with open(os.path.join(folder, "Xvfb.log"), "wb") as log, subprocess.Popen(
        command, pass_fds=[write_end], stdout=log, stderr=log
    ) as server:
        os.close(write_end)
        try:
            with open(read_end, encoding="ascii") as numbers:
                yield "X", {"QT_QPA_PLATFORM": "xcb", "DISPLAY": f":{int(numbers.readline())}"}
        finally:
            server.terminate()


@contextlib.contextmanager
def site():
    """A root folder with small files for the window: the platform, the folder and an environment to start it in."""
    with tempfile.TemporaryDirectory() as root, display(root) as (platform, variables):
        for path, content in (
            ("etc/dhcp/dhcpd.conf", "authoritative;\n"),
            ("var/lib/dhcp/dhcpd.leases", ""),
            ("etc/default/isc-dhcp-server", 'INTERFACESv4=""\n'),
        ):
            file = pathlib.Path(root, path)
            file.parent.mkdir(parents=True)
            file.write_text(content, encoding="ascii")
        # Without programs to start: the time of child processes does not count.
        yield platform, root, dict(os.environ, ORV_TEST_ROOT=root, PATH=root, **variables)


def start_rows(bench, _folder, _arguments):
    with site() as (platform, _, environment):

        def start(program):
            """The milliseconds of processor time, which the program tells, and of the clock on the wall."""
            began = time.perf_counter()
            with subprocess.Popen(
                [bench.build / "bench" / program], env=environment, stdout=subprocess.PIPE, stderr=subprocess.DEVNULL
            ) as process:
                processor = process.stdout.readline()
                wall = (time.perf_counter() - began) * 1e3
            if process.returncode:
                raise subprocess.CalledProcessError(process.returncode, program)
            return float(processor), wall

        runs = [start("orv_bench_start") + start("orv_bench_start_empty") for _ in bench.rounds for _ in range(4)]
    processor, wall, empty_processor, empty_wall = map(min, zip(*runs))
    yield Row(
        f"start to the first painted window ({platform})",
        f"{processor:.1f} ms of processor time, empty window {empty_processor:.1f} ms: "
        f"{processor / empty_processor:.2f}; {wall:.0f} and {empty_wall:.0f} ms by the clock: "
        f"{wall / empty_wall:.2f}",
        "1.6",
        processor <= 1.6 * empty_processor,
    )


BLOCKS_A_SECOND = 500
WRITES_A_SECOND = 50


def busy_rows(bench, _folder, arguments):
    """The window while a server appends blocks to the lease file, without and with a filter."""
    for text, kind in (("", "no filter"), ("10.3.", "a filter"), ("e", "a filter of every row")):
        with site() as (platform, root, environment):
            path = pathlib.Path(root, "var/lib/dhcp/dhcpd.leases")
            write_leases(path, arguments.leases)
            command = [bench.build / "bench/orv_bench_busy", str(arguments.seconds), text]
            with subprocess.Popen(command, env=environment, stdout=subprocess.PIPE, encoding="ascii") as window, open(
                path, "a", encoding="ascii"
            ) as leases:
                window.stdout.readline()
                blocks = appended_blocks(arguments.leases)
                while window.poll() is None:
                    leases.write("".join(itertools.islice(blocks, BLOCKS_A_SECOND // WRITES_A_SECOND)))
                    leases.flush()
                    time.sleep(1 / WRITES_A_SECOND)
                share, stall = map(float, window.stdout.read().split())
        yield Row(
            f"{BLOCKS_A_SECOND} blocks a second, {kind} ({platform})",
            f"{100 * share:.0f} % of a core, longest stall {stall:.0f} ms",
            "33 %, 100 ms",
            share <= 1 / 3 and stall <= 100,
        )


# The parts of the table: each writes what it needs into the folder, and yields rows.
TABLES = {"configuration": configuration_rows, "leases": lease_rows, "busy": busy_rows, "start": start_rows}


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build", type=pathlib.Path)
    parser.add_argument("--hosts", type=int, default=100_000)
    parser.add_argument("--leases", type=int, default=1_000_000)
    parser.add_argument("--rounds", type=int, default=5)
    parser.add_argument("--seconds", type=int, default=60, help="of the busy server")
    parser.add_argument("--only", nargs="+", choices=TABLES, default=list(TABLES))
    arguments = parser.parse_args()
    bench = Bench(arguments.build.resolve(), arguments.rounds)
    print(f"Minima of {arguments.rounds} rounds.\n\n| what | measured | goal | met |\n|---|---|---|---|")
    are_met = True
    with tempfile.TemporaryDirectory() as folder:
        os.environ.update(
            QT_QPA_PLATFORM="offscreen",
            XDG_CONFIG_HOME=folder,
            XDG_RUNTIME_DIR=folder,
            LC_ALL="C.UTF-8",  # in which dates are shown as in the keys
        )
        for table in arguments.only:
            for row in TABLES[table](bench, folder, arguments):
                print(row, flush=True)
                are_met = are_met and row.is_met
    return 0 if are_met else 1


if __name__ == "__main__":
    sys.exit(main())
