# SPDX-License-Identifier: GPL-3.0-or-later
"""The context menus of the topology tree, and those of their commands that add.

Every kind of dialog is run once, and every menu that has such commands. That the others do the same is for the tests of
the window, which run each command in each place.
"""

import dataclasses

from commandtest import (
    CHANGES,
    CommandTest,
    Dialog,
    GROUP,
    Lines,
    Place,
    Question,
    ROOT,
    SUBNET,
    addresses,
    file,
    form,
    option,
    parameter,
    routes,
    time_form,
    words_form,
)


@dataclasses.dataclass(frozen=True)
class Add:
    """A command that adds LINES to a place, or is refused there."""

    place: Place
    entries: tuple
    dialog: Dialog
    lines: Lines = None
    refusal: str = ""

    def __str__(self):
        return " > ".join(self.entries)


SITE = """\
option classless-static-routes code 121 = array of unsigned integer 8;
subnet 10.1.0.0 netmask 255.255.255.0 {
}
shared-network office {
    subnet 10.2.0.0 netmask 255.255.255.0 {
    }
}
group printers {
    allow booting;
}
host plotter {
    hardware ethernet 00:11:22:33:44:55;
}
"""

NETWORK = ROOT.below("Shared network: office", "shared-network office")
NEW_NETWORK = ROOT.below("Shared network: lab", "shared-network lab")
HOST = ROOT.below("Host: plotter", "host plotter")


NO_TIME = ("0", "0", "0 h", "0 m", "0 s")


def new_addresses(title, name, *texts):
    return Dialog(title, {name: []}, addresses(*texts))


def new_subnet(texts):
    return form("Add subnet", {"Address:": "192.168.1.0/24", "Netmask:": "255.255.255.0"}, texts)


def new_routes(fill):
    shown = {"Static routes": [], "Route for MS systems": {"enabled"}}
    return Dialog("Add static route", shown, fill, button="Yes")


BIND9 = Question("Information", "Add configuration to automatically configure binding with bind9 DNS server?")
BIND9_FILE = Dialog(
    "Choose the bind9 configuration with the update key",
    None,
    file("/etc/bind", "named.conf.local"),
    button="Open",
    question=BIND9,
)

ADD_PARAMETER = {
    parameter("Add default lease time"),
    parameter("Add max lease time"),
    parameter("Add arbitrary parameter"),
    option("Add gateways"),
    option("Add DNS servers"),
    option("Add NTP servers"),
    option("Add domain name"),
    option("Add DHCP dynamic zone update"),
}
MENUS = {
    ROOT: {("Add shared network",), ("Add subnet",), ("Add host",), ("Add static route",)},
    SUBNET: {("Add range",)} | CHANGES,
    NETWORK: {("Add subnet",)} | CHANGES,
    HOST: {("Add fixed IP",), ("Add static route",)} | CHANGES,
    GROUP: CHANGES,
}

ADDS = (
    Add(
        ROOT,
        ("Add shared network",),
        form("Add shared network", {"Name:": ""}, {"Name:": "lab"}),
        Lines("Shared network: lab", "shared-network lab {\n}"),
    ),
    Add(
        NEW_NETWORK,
        ("Add subnet",),
        new_subnet({"Address:": "10.4.0.0", "Netmask:": "255.255.254.0"}),
        Lines("Subnet: 10.4.0.0 / 255.255.254.0", "subnet 10.4.0.0 netmask 255.255.254.0 {\n}"),
    ),
    Add(
        SUBNET,
        ("Add range",),
        form(
            "Add range",
            {"Start IP:": "10.1.0.1", "End IP:": "10.1.0.254"},
            {"Start IP:": "10.1.0.30", "End IP:": "10.1.0.40"},
        ),
        Lines("Range: 10.1.0.30 - 10.1.0.40", "range 10.1.0.30 10.1.0.40;"),
    ),
    Add(
        ROOT,
        ("Add host",),
        form(
            "Add host",
            {"Name:": "", "MAC address:": "00:00:00:00:00:00", "Fixed IP:": ""},
            {"Name:": "scanner.lan", "MAC address:": "00:11:22:33:44:66", "Fixed IP:": "10.1.0.7"},
        ),
        Lines(
            """\
Host: scanner.lan
    MAC address: 00:11:22:33:44:66
    Fixed address: 10.1.0.7""",
            """\
host scanner.lan {
    hardware ethernet 00:11:22:33:44:66;
    fixed-address 10.1.0.7;
}""",
        ),
    ),
    Add(
        HOST,
        ("Add fixed IP",),
        form("Add fixed address", {"IP:": ""}, {"IP:": "10.1.0.8"}),
        Lines("Fixed address: 10.1.0.8", "fixed-address 10.1.0.8;"),
    ),
    Add(
        ROOT,
        ("Add static route",),
        new_routes(
            routes(("255.255.255.0", "192.168.1.0", "10.1.0.1"), ("255.255.0.0", "172.16.0.0", "10.1.0.2"), ms=True)
        ),
        Lines(
            """\
Static route MS: code 249 = array of unsigned integer 8
Static route MS: 24, 192,168,1, 10,1,0,1, 16, 172,16, 10,1,0,2""",
            """\
option ms-classless-static-routes code 249 = array of unsigned integer 8;
option ms-classless-static-routes 24, 192,168,1, 10,1,0,1, 16, 172,16, 10,1,0,2;""",
        ),
    ),
    Add(
        NETWORK,
        ("Add arbitrary declaration",),
        words_form("Add arbitrary declaration", "Declaration:", "", "on release"),
        Lines("on: release", "on release {\n}"),
    ),
    Add(
        GROUP,
        parameter("Add arbitrary parameter"),
        words_form("Add arbitrary parameter", "Parameter:", "", "option time-offset 3600"),
        Lines("time-offset: 3600", "option time-offset 3600;"),
    ),
    Add(
        SUBNET,
        parameter("Add default lease time"),
        time_form("Add default lease time", NO_TIME, {"Days:": "1", "Hours": "2", "Minutes": "3", "Seconds": "4"}),
        Lines("Default lease time: 1 days 2 hours 3 minutes 4 seconds", "default-lease-time 93784;"),
    ),
    Add(
        SUBNET,
        option("Add gateways"),
        new_addresses("Add gateways", "Gateways:", "10.1.0.1", "10.1.0.2"),
        Lines("Gateways: 10.1.0.1, 10.1.0.2", "option routers 10.1.0.1, 10.1.0.2;"),
    ),
    Add(
        HOST,
        option("Add domain name"),
        form("Add domain name", {"Domain name:": "example.org"}, {"Domain name:": "lab.example.org"}),
        Lines('Domain name: "lab.example.org"', 'option domain-name "lab.example.org";'),
    ),
    Add(
        GROUP,
        option("Add DHCP dynamic zone update"),
        BIND9_FILE,
        Lines(
            """\
Key information: "lab-update"
    Key generation algorithm: hmac-sha256
    Generated secret: "RGVtb25zdHJhdGlvbktleU9mVGhlTGFiWm9uZXMwMDE="
Zone served by DNS server: lab.example.org.
    Master DNS Server: 127.0.0.1
    Key: "lab-update"
Zone served by DNS server: 30.20.10.in-addr.arpa.
    Master DNS Server: 127.0.0.1
    Key: "lab-update\"""",
            """\
key "lab-update" {
    algorithm hmac-sha256;
    secret "RGVtb25zdHJhdGlvbktleU9mVGhlTGFiWm9uZXMwMDE=";
}
zone lab.example.org. {
    primary 127.0.0.1;
    key "lab-update";
}
zone 30.20.10.in-addr.arpa. {
    primary 127.0.0.1;
    key "lab-update";
}""",
        ),
    ),
    Add(
        HOST,
        option("Add DHCP dynamic zone update"),
        BIND9_FILE,
        refusal="Error adding bind9. Can not add bind9 to 'host'",
    ),
)


CANCELLED_FIRST = (
    ("Add host",),
    ("Add arbitrary declaration",),
    option("Add DHCP dynamic zone update"),
)


class Menus(CommandTest):
    SITE = SITE

    def test_have_these_entries(self):
        for place, entries in MENUS.items():
            with self.case(command="the menu", place=place.row):
                menu = self.topology.row(*place.row).context_menu()
                self.assertEqual(self.offered(menu), entries | {("Add arbitrary declaration",)} | ADD_PARAMETER)


class Adds(CommandTest):
    SITE = SITE

    def add(self, add):
        """What the command adds to the file."""

        def choose():
            self.topology.row(*add.place.row).context_menu().choose(*add.entries)

        if add.entries in CANCELLED_FIRST:
            self.cancel(add.dialog, choose)
        choose()
        self.accept(add.dialog)
        if add.refusal:
            self.message("Error", add.refusal).answer("OK")
            self.assertEqual(self.shown_lines(), self.lines)
            return []
        self.expect_added(add.place.tree_lines(add.lines))
        return add.place.file_lines(add.lines)

    def test_commands_add_to_tree_and_file(self):
        lines = []
        for add in ADDS:
            with self.case(command=add, place=add.place.row):
                lines += self.add(add)
        saved = self.save()
        self.assertEqual([line for line in saved if line in self.file], self.file)
        self.assertCountEqual([line for line in saved if line not in self.file], lines)
