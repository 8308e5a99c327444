# SPDX-License-Identifier: GPL-3.0-or-later
"""Writes the files that bench/compare.py measures with. The same numbers give the same bytes."""
import datetime
import random

LEASES_HEAD = (
    "# The format of this file is documented in the dhcpd.leases(5) manual page.\n"
    "# This lease file was written by isc-dhcp-4.4.3-P1\n\n"
    "# authoring-byte-order entry is generated, DO NOT DELETE\n"
    "authoring-byte-order little-endian;\n\n"
)


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
    """The plain file: all blocks alike, each of an address of its own."""
    numbers = list(range(blocks))
    random.Random(1).shuffle(numbers)
    with open(path, "w", encoding="ascii") as file:
        file.write(LEASES_HEAD)
        for number in numbers:
            file.write(plain_block(number, number % 43200))


def plain_block(number, start):
    """The block of the client of that number, whose lease begins at that second of the day."""
    clock = "{:02}:{:02}:{:02}".format
    begin = clock(start // 3600, start // 60 % 60, start % 60)
    end = clock(start // 3600 + 10, start // 60 % 60, start % 60)
    low = f"{number >> 16 & 255:02x}:{number >> 8 & 255:02x}:{number & 255:02x}"
    return (
        f"lease 10.{1 + (number >> 16)}.{number >> 8 & 255}.{number & 255} {{\n"
        f"  starts 6 2026/11/21 {begin};\n  ends 6 2026/11/21 {end};\n  cltt 6 2026/11/21 {begin};\n"
        "  binding state active;\n  next binding state free;\n  rewind binding state free;\n"
        f"  hardware ethernet 02:00:00:{low};\n"
        f'  uid "\\001\\002\\000\\000\\{number >> 16 & 7:03o}\\001\\{number & 63:03o}";\n'
        f'  client-hostname "host-{number % 100:02}{number // 100:05}";\n}}\n'
    )


def appended_blocks(blocks):
    """What a server appends without end to the plain file of that many blocks: nine renewals, then a new lease."""
    choose = random.Random(3)
    new = blocks
    while True:
        for _ in range(9):
            yield plain_block(choose.randrange(new), choose.randrange(43200))
        yield plain_block(new, choose.randrange(43200))
        new += choose.randrange(1, 5)


def write_server_leases(path, blocks):
    """As servers write them: clients of many kinds over three days, a fifth of the blocks renewals of a lease."""
    choose = random.Random(2)
    clients = [Client(number, choose) for number in range(blocks - blocks // 5)]
    order = clients + choose.sample(clients, blocks - len(clients))
    choose.shuffle(order)
    begin = datetime.datetime(2026, 11, 19)
    with open(path, "w", encoding="ascii") as file:
        file.write(LEASES_HEAD)
        file.write('server-duid "\\000\\001\\000\\0012\\223\\252\\331N\\266\\361R\\257\\334";\n\n')
        for peer in ("north", "south"):
            file.write(
                f'failover peer "{peer}" state {{\n  my state normal at 4 2026/11/19 00:00:00;\n'
                "  partner state normal at 4 2026/11/19 00:00:00;\n  mclt 1800;\n}\n"
            )
        for number, client in enumerate(order):
            seconds = number * 3 * 86400 // blocks
            file.write(client.block(begin + datetime.timedelta(seconds=seconds), choose))


class Client:
    """What a server knows of a client, and writes again with each of its leases."""

    # Each kind's vendor of network cards, class, and beginning of its name.
    kinds = (
        ("3c:52:82", "MSFT 5.0", "DESKTOP-"),
        ("f8:b1:56", "MSFT 5.0", "laptop-"),
        ("00:50:56", "dhcpcd-9.4.1:Linux-5.10.0", "host-"),
        ("be:7a:13", "android-dhcp-14", ""),
        ("d0:67:e5", "PXEClient:Arch:00007:UNDI:003016", "lab-"),
        ("00:1b:a9", "Hewlett-Packard LaserJet", "NPI"),
        ("b8:27:eb", "udhcp 1.36.1", "sensor-"),
        ("84:2b:2b", "MSFT 5.0", "Office-"),
        ("a4:83:e7", None, "Anna-MacBook-"),
        ("ac:bc:32", None, "iPhone-"),
    )

    def __init__(self, number, choose):
        vendor, vendor_class, name = choose.choice(self.kinds)
        low = choose.getrandbits(24)
        mac = f"{vendor}:{low >> 16:02x}:{low >> 8 & 255:02x}:{low & 255:02x}"
        octets = (10, 1 + (number >> 16), number >> 8 & 255, number & 255)
        self.address = ".".join(map(str, octets))
        self.is_in_failover = choose.random() < 0.1
        identifier = b"\x01" + bytes.fromhex(mac.replace(":", ""))
        if choose.random() < 0.1:  # made by RFC 4361, of an interface's number and a DUID
            identifier = b"\xff" + identifier[3:] + b"\0\1\0\1" + choose.randbytes(4) + identifier[1:]
        lines = [f"  hardware ethernet {mac};\n"]
        if choose.random() < 0.95:
            lines.append(f'  uid "{quoted(identifier)}";\n')
        host = f"{name}{low:06X}"
        if vendor_class:
            lines.append(f'  set vendor-class-identifier = "{vendor_class}";\n')
        if choose.random() < 0.05:
            reverse = ".".join(map(str, reversed(octets)))
            lines.append(f'  set ddns-rev-name = "{reverse}.in-addr.arpa.";\n')
            lines.append(f'  set ddns-dhcid = "{quoted(choose.randbytes(35))}";\n')
            lines.append(f'  set ddns-fwd-name = "{host}.campus.example";\n')
        if choose.random() < 0.05:
            lines.append(f"  option agent.circuit-id 0:4:0:{number & 15:x}:1:{number & 31:x};\n")
            lines.append("  option agent.remote-id 0:6:0:1a:a1:2b:3c:4d;\n")
        if name:
            lines.append(f'  client-hostname "{host}";\n')
        self.lines = "".join(lines)

    def block(self, start, choose):
        end = start + datetime.timedelta(hours=10)
        times = [("starts", start), ("ends", end)]
        if self.is_in_failover:
            times += [("tstp", end), ("tsfp", end), ("atsfp", end)]
        times.append(("cltt", start))
        state = choose.choices(("active", "free", "expired", "backup"), (80, 12, 6, 2))[0]
        states = [f"  binding state {state};\n"]
        if state in ("active", "expired"):
            states.append("  next binding state free;\n  rewind binding state free;\n")
        return (
            f"lease {self.address} {{\n"
            + "".join(f"  {keyword} {time.isoweekday() % 7} {time:%Y/%m/%d %H:%M:%S};\n" for keyword, time in times)
            + "".join(states)
            + self.lines
            + "}\n"
        )


def quoted(data):
    """Bytes between quotes as the server writes them."""
    return "".join(f"\\{byte:03o}" if byte < 32 or byte > 126 else "\\" * (byte in b'"\\') + chr(byte) for byte in data)
