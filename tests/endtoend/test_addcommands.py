# SPDX-License-Identifier: GPL-3.0-or-later
"""The context menus of the topology tree, and those of their commands that add."""

import dataclasses

from commandtest import (
    CHANGES,
    CommandTest,
    Dialog,
    GROUP,
    Lines,
    Question,
    ROOT,
    SUBNET,
    addresses,
    file,
    form,
    routes,
    time_form,
    words_form,
)


@dataclasses.dataclass(frozen=True)
class Add:
    """A command that adds LINES to each of the places, or is refused there."""

    places: tuple
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
EVERYWHERE = (ROOT, SUBNET, NETWORK, GROUP, HOST)


def parameter(*entries):
    return ("Add parameter", *entries)


def option(*entries):
    return parameter("Add option", *entries)


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

ADDS = (
    Add(
        (ROOT,),
        ("Add shared network",),
        form("Add shared network", {"Name:": ""}, {"Name:": "lab"}),
        Lines("Shared network: lab", "shared-network lab {\n}"),
    ),
    Add(
        (ROOT,),
        ("Add subnet",),
        new_subnet({"Address:": "10.3.0.7/16"}),
        Lines("Subnet: 10.3.0.0 / 255.255.0.0", "subnet 10.3.0.0 netmask 255.255.0.0 {\n}"),
    ),
    Add(
        (NETWORK, NEW_NETWORK),
        ("Add subnet",),
        new_subnet({"Address:": "10.4.0.0", "Netmask:": "255.255.254.0"}),
        Lines("Subnet: 10.4.0.0 / 255.255.254.0", "subnet 10.4.0.0 netmask 255.255.254.0 {\n}"),
    ),
    Add(
        (SUBNET,),
        ("Add range",),
        form(
            "Add range",
            {"Start IP:": "10.1.0.1", "End IP:": "10.1.0.254"},
            {"Start IP:": "10.1.0.30", "End IP:": "10.1.0.40"},
        ),
        Lines("Range: 10.1.0.30 - 10.1.0.40", "range 10.1.0.30 10.1.0.40;"),
    ),
    Add(
        (ROOT,),
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
        (HOST,),
        ("Add fixed IP",),
        form("Add fixed address", {"IP:": ""}, {"IP:": "10.1.0.8"}),
        Lines("Fixed address: 10.1.0.8", "fixed-address 10.1.0.8;"),
    ),
    Add(
        (ROOT,),
        ("Add static route",),
        new_routes(
            routes(("255.255.255.0", "192.168.1.0", "10.1.0.1"), ("255.255.0.0", "172.16.0.0", "10.1.0.2"), ms=True)
        ),
        Lines(
            """\
Static route MS: code 249 = array of unsigned integer 8
Static route MS: 24, 192,168,1,0, 10,1,0,1, 16, 172,16,0,0, 10,1,0,2""",
            """\
option ms-classless-static-routes code 249 = array of unsigned integer 8;
option ms-classless-static-routes 24, 192,168,1,0, 10,1,0,1, 16, 172,16,0,0, 10,1,0,2;""",
        ),
    ),
    Add(
        (HOST,),
        ("Add static route",),
        new_routes(routes(("255.255.128.0", "192.168.0.0", "10.1.0.3"))),
        Lines("Static route: 17, 192,168,0,0, 10,1,0,3", "option classless-static-routes 17, 192,168,0,0, 10,1,0,3;"),
    ),
    Add(
        EVERYWHERE,
        ("Add arbitrary declaration",),
        words_form("Add arbitrary declaration", "Declaration:", "", "on release"),
        Lines("on: release", "on release {\n}"),
    ),
    Add(
        EVERYWHERE,
        parameter("Add arbitrary parameter"),
        words_form("Add arbitrary parameter", "Parameter:", "", "option time-offset 3600"),
        Lines("time-offset: 3600", "option time-offset 3600;"),
    ),
    Add(
        EVERYWHERE,
        parameter("Add default lease time"),
        time_form("Add default lease time", NO_TIME, {"Days:": "1", "Hours": "2", "Minutes": "3", "Seconds": "4"}),
        Lines("Default lease time: 1 days 2 hours 3 minutes 4 seconds", "default-lease-time 93784;"),
    ),
    Add(
        EVERYWHERE,
        parameter("Add max lease time"),
        time_form("Add max lease time", NO_TIME, {"Mounth:": "2", "Days:": "1"}),
        Lines("Max lease time: 2 mounth 1 days", "max-lease-time 5270400;"),
    ),
    Add(
        EVERYWHERE,
        option("Add gateways"),
        new_addresses("Add gateways", "Gateways:", "10.1.0.1", "10.1.0.2"),
        Lines("Gateways: 10.1.0.1, 10.1.0.2", "option routers 10.1.0.1, 10.1.0.2;"),
    ),
    Add(
        EVERYWHERE,
        option("Add DNS servers"),
        new_addresses("Add DNS servers", "DNS servers:", "10.1.0.3"),
        Lines("DNS servers: 10.1.0.3", "option domain-name-servers 10.1.0.3;"),
    ),
    Add(
        EVERYWHERE,
        option("Add NTP servers"),
        new_addresses("Add NTP servers", "NTP servers:", "10.1.0.4"),
        Lines("NTP servers: 10.1.0.4", "option ntp-servers 10.1.0.4;"),
    ),
    Add(
        EVERYWHERE,
        option("Add domain name"),
        form("Add domain name", {"Domain name:": "example.org"}, {"Domain name:": "lab.example.org"}),
        Lines('Domain name: "lab.example.org"', 'option domain-name "lab.example.org";'),
    ),
    Add(
        (ROOT, GROUP),
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
        (SUBNET, NETWORK, HOST),
        option("Add DHCP dynamic zone update"),
        BIND9_FILE,
        refusal="Error adding bind9. Can not add bind9 to '{}'",
    ),
)


class Adds(CommandTest):
    SITE = SITE

    def add_to(self, *places):
        """Runs all commands of the places' menus."""
        lines = []
        for add in ADDS:
            for place in add.places:
                if place in places:
                    with self.case(command=add, place=place.row):
                        lines += self.add(add, place)
        saved = self.save()
        self.assertEqual([line for line in saved if line in self.file], self.file)
        self.assertCountEqual([line for line in saved if line not in self.file], lines)

    def add(self, add, place):
        """What the command adds to the file."""

        def choose():
            self.topology.row(*place.row).context_menu().choose(*add.entries)

        if place is add.places[0]:
            self.cancel(add.dialog, choose)
        choose()
        self.accept(add.dialog)
        if add.refusal:
            text = add.refusal.format(place.block[-1].split()[0])
            self.message("Error", text).answer("OK")
            self.assertEqual(self.shown_lines(), self.lines)
            return []
        self.expect_added(place.tree_lines(add.lines))
        return place.file_lines(add.lines)

    def test_all_entries_of_the_menus_are_run(self):
        for place in EVERYWHERE:
            run = {add.entries for add in ADDS if place in add.places} | (CHANGES if place != ROOT else set())
            with self.case(command="the menu", place=place.row):
                self.assertEqual(self.offered(self.topology.row(*place.row).context_menu()), run)

    def test_all_network(self):
        self.add_to(ROOT, NEW_NETWORK)

    def test_subnet(self):
        self.add_to(SUBNET)

    def test_shared_network(self):
        self.add_to(NETWORK)

    def test_group(self):
        self.add_to(GROUP)

    def test_host(self):
        self.add_to(HOST)
