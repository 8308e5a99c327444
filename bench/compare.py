#!/usr/bin/env python3
# SPDX-License-Identifier: GPL-3.0-or-later
"""Measures the program beside the programs that it is compared with, on the same files, and prints the ratios.

Usage: bench/compare.py BUILD_FOLDER [--hosts N] [--leases N] [--rounds N]

BUILD_FOLDER is a build of the preset "bench". The DHCP server and dhcpd-pools are found in $ORV_TOOLS_DIR, where
scripts/fetch-tools puts them, or in PATH. Both sides of a ratio run in turn, and the medians are compared. The start
can be measured by the superuser only, as the program starts for nobody else.
"""
import argparse
import contextlib
import json
import os
import pathlib
import random
import shutil
import statistics
import subprocess
import sys
import tempfile
import time


def write_configuration(path, hosts):
    with open(path, "w", encoding="ascii") as file:
        file.write(
            "default-lease-time 600;\nmax-lease-time 7200;\n"
            "subnet 10.0.0.0 netmask 255.0.0.0 {\n    range 10.200.0.1 10.200.255.254;\n"
            "    option routers 10.0.0.1;\n}\n"
        )
        for number in range(hosts):
            low = f"{number >> 16 & 255:02x}:{number >> 8 & 255:02x}:{number & 255:02x}"
            file.write(
                f"host host-{number:06} {{\n    hardware ethernet 02:00:00:{low};\n"
                f"    fixed-address 10.{1 + (number >> 16)}.{number >> 8 & 255}.{number & 255};\n"
                f'    option host-name "host-{number:06}.campus.example";\n}}\n'
            )


def write_leases(path, blocks):
    numbers = list(range(blocks))
    random.Random(1).shuffle(numbers)
    with open(path, "w", encoding="ascii") as file:
        file.write(
            "# The format of this file is documented in the dhcpd.leases(5) manual page.\n"
            "authoring-byte-order little-endian;\n\n"
        )
        for number in numbers:
            start = number % 43200
            clock = "{:02}:{:02}:{:02}".format
            begin = clock(start // 3600, start // 60 % 60, start % 60)
            end = clock(start // 3600 + 10, start // 60 % 60, start % 60)
            low = f"{number >> 16 & 255:02x}:{number >> 8 & 255:02x}:{number & 255:02x}"
            file.write(
                f"lease 10.{1 + (number >> 16)}.{number >> 8 & 255}.{number & 255} {{\n"
                f"  starts 6 2026/11/21 {begin};\n  ends 6 2026/11/21 {end};\n  cltt 6 2026/11/21 {begin};\n"
                "  binding state active;\n  next binding state free;\n  rewind binding state free;\n"
                f"  hardware ethernet 02:00:00:{low};\n"
                f'  uid "\\001\\002\\000\\000\\{number >> 16 & 7:03o}\\001\\{number & 63:03o}";\n'
                f'  client-hostname "host-{number:07}";\n}}\n'
            )


def find(package, program):
    tools = os.environ.get("ORV_TOOLS_DIR")
    if tools:
        for folder in ("usr/sbin", "usr/bin"):
            path = pathlib.Path(tools, package, folder, program)
            if path.exists():
                return str(path)
    return shutil.which(program, path=os.environ["PATH"] + ":/usr/sbin")


def seconds(command):
    began = time.perf_counter()
    subprocess.run(command, check=True, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
    return time.perf_counter() - began


def benchmark(build, name):
    """The milliseconds and counters of one benchmark; a short run, since it is repeated in turn with the other side."""
    output = subprocess.run(
        [
            build / "bench/orv_bench",
            f"--benchmark_filter=^{name}(/manual_time|$|/min)",
            "--benchmark_format=json",
            "--benchmark_min_time=0.01",
        ],
        check=True,
        stdout=subprocess.PIPE,
        stderr=subprocess.DEVNULL,
    ).stdout
    return json.loads(output)["benchmarks"][0]


def row(what, measured, goal, met):
    print(f"| {what} | {measured} | {goal} | {'yes' if met else 'NO'} |")
    return met


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build", type=pathlib.Path)
    parser.add_argument("--hosts", type=int, default=100_000)
    parser.add_argument("--leases", type=int, default=1_000_000)
    parser.add_argument("--rounds", type=int, default=5)
    arguments = parser.parse_args()
    build = arguments.build.resolve()

    with tempfile.TemporaryDirectory() as folder:
        configuration = os.path.join(folder, "dhcpd.conf")
        leases = os.path.join(folder, "dhcpd.leases")
        pools = os.path.join(folder, "pools.conf")
        write_configuration(configuration, arguments.hosts)
        write_leases(leases, arguments.leases)
        pathlib.Path(pools).write_text(
            "subnet 10.0.0.0 netmask 255.0.0.0 { range 10.0.0.1 10.255.255.254; }\n", encoding="ascii"
        )
        os.environ.update(
            ORV_BENCH_CONFIGURATION=configuration,
            ORV_BENCH_LEASES=leases,
            QT_QPA_PLATFORM="offscreen",
            XDG_CONFIG_HOME=folder,
            XDG_RUNTIME_DIR=folder,
        )
        return 0 if compare(build, arguments.rounds, configuration, leases, pools) else 1


def compare(build, rounds, configuration, leases, pools):
    print(
        f"Configuration: {os.path.getsize(configuration) / 1e6:.1f} MB; "
        f"leases: {os.path.getsize(leases) / 1e6:.1f} MB; medians of {rounds} rounds\n"
    )
    print("| what | measured | goal | met |\n|---|---|---|---|")

    def in_turn(name, command):
        runs = [(benchmark(build, name), seconds(command) * 1e3) for _ in range(rounds)]
        mine = statistics.median(run[0]["real_time"] for run in runs)
        other = statistics.median(run[1] for run in runs)
        return mine, other, runs[-1][0].get("bytes_per_byte")

    met = []
    dhcpd = find("isc-dhcp-server", "dhcpd")
    reading, checking, tree = in_turn("readConfiguration", [dhcpd, "-t", "-cf", configuration])
    met.append(
        row(
            "read the configuration",
            f"{reading:.0f} ms, dhcpd -t {checking:.0f} ms: 1/{checking / reading:.1f}",
            "1/10",
            checking >= 10 * reading,
        )
    )
    met.append(row("memory of the tree", f"{tree:.2f} bytes per byte", "6", tree <= 6))
    writing = statistics.median(benchmark(build, "serializeConfiguration")["real_time"] for _ in range(rounds))
    met.append(
        row("write it back", f"{writing:.0f} ms: {writing / reading:.2f} of the read", "0.5", writing <= reading / 2)
    )
    adding = statistics.median(benchmark(build, "addHost")["real_time"] for _ in range(rounds))
    met.append(row("add a host, tree shown again", f"{adding:.0f} ms", "400 ms", adding <= 400))

    loading, listing, table = in_turn(
        "loadLeases", [find("dhcpd-pools", "dhcpd-pools"), "-c", pools, "-l", leases, "-f", "j", "-o", "/dev/null"]
    )
    met.append(
        row(
            "load the leases",
            f"{loading:.0f} ms, dhcpd-pools {listing:.0f} ms: 1/{listing / loading:.1f}",
            "1/6",
            listing >= 6 * loading,
        )
    )
    met.append(row("memory of the lease table", f"{table:.2f} bytes per byte", "0.4", table <= 0.4))
    appending = benchmark(build, "appendBlock")["real_time"]
    met.append(row("one block appended, table up to date", f"{appending:.1f} ms", "20 ms", appending <= 20))
    for kind in ("scattered", "dense", "digit", "none", "cleared"):
        search = statistics.median(benchmark(build, f"searchKey/{kind}")["real_time"] for _ in range(rounds))
        met.append(row(f"a key in the search field ({kind})", f"{search:.0f} ms", "150 ms", search <= 150))

    met.append(start_row(build, rounds))
    return all(met)


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


def start_row(build, rounds):
    with tempfile.TemporaryDirectory() as root, display(root) as (kind, variables):
        for path, content in (
            ("etc/dhcp/dhcpd.conf", "authoritative;\n"),
            ("var/lib/dhcp/dhcpd.leases", ""),
            ("etc/default/isc-dhcp-server", 'INTERFACESv4=""\n'),
        ):
            file = pathlib.Path(root, path)
            file.parent.mkdir(parents=True)
            file.write_text(content, encoding="ascii")
        # Without programs to start: the time of child processes does not count.
        environment = dict(os.environ, ORV_TEST_ROOT=root, PATH=root, **variables)

        def start(program):
            """The milliseconds of processor time, which the program tells, and of the clock on the wall."""
            began = time.perf_counter()
            with subprocess.Popen(
                [build / "bench" / program], env=environment, stdout=subprocess.PIPE, stderr=subprocess.DEVNULL
            ) as process:
                processor = process.stdout.readline()
                wall = (time.perf_counter() - began) * 1e3
            if process.returncode:
                raise subprocess.CalledProcessError(process.returncode, program)
            return float(processor), wall

        runs = [start("orv_bench_start") + start("orv_bench_start_empty") for _ in range(4 * rounds)]
    processor, wall, empty_processor, empty_wall = map(statistics.median, zip(*runs))
    return row(
        f"start to the first painted window ({kind})",
        f"{processor:.1f} ms of processor time, empty window {empty_processor:.1f} ms: "
        f"{processor / empty_processor:.2f}; {wall:.0f} and {empty_wall:.0f} ms by the clock: "
        f"{wall / empty_wall:.2f}",
        "1.3",
        processor <= 1.3 * empty_processor and wall <= 1.3 * empty_wall,
    )


if __name__ == "__main__":
    sys.exit(main())
