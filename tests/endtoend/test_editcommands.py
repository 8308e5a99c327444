# SPDX-License-Identifier: GPL-3.0-or-later
"""The commands of the topology tree's context menus that change statements or take them away.

Every kind of dialog is run once. That the other statements are treated the same is for the tests of the window.
"""

import dataclasses

import pyatspi

from commandtest import (
    CHANGES,
    CommandTest,
    Dialog,
    GROUP,
    Lines,
    NOTHING,
    Place,
    ROOT,
    SUBNET,
    addresses,
    cell,
    form,
    steps,
    time_form,
    with_block,
    without_first,
    words_form,
)


@dataclasses.dataclass(frozen=True)
class Edit:
    """Statements that a dialog makes out of others."""

    place: Place
    before: Lines
    dialog: Dialog
    after: Lines

    def __str__(self):
        return self.before.tree

    @property
    def row(self):
        return self.place.tree_lines(self.before)[0]


SITE = """\
min-lease-time 30;
option classless-static-routes code 121 = array of unsigned integer 8;
option ms-classless-static-routes code 249 = array of unsigned integer 8;
shared-network attic {
    subnet 10.2.0.0 netmask 255.255.255.0 {
    }
}
subnet 10.1.0.0 netmask 255.255.255.0 {
    range 10.1.0.10 10.1.0.19;
    range dynamic-bootp 10.1.0.30 10.1.0.39;
}
subnet 10.3.0.0 netmask 255.255.255.0 {
}
group printers {
    default-lease-time 600;
    max-lease-time 7200;
    option routers 10.1.0.1, 10.1.0.2;
    option domain-name-servers 10.1.0.3;
    option ntp-servers 10.1.0.4;
    option domain-name "example.org";
    option classless-static-routes 24, 192,168,1,0, 10,1,0,1, 16, 172,17,0,0, 10,1,0,1;
    option ms-classless-static-routes 16, 172,16,0,0, 10,1,0,2;
    option time-offset 3600;
}
class "phones" {
    match hardware;
}
subclass "phones" 1:00:11:22:33:44:55;
host plotter {
    hardware ethernet 00:11:22:33:44:55;
    fixed-address 10.1.0.5;
}
host scanner {
    hardware ethernet 00:11:22:33:44:66;
}
host camera {
    hardware ethernet 00:11:22:33:44:77;
    fixed-address 10.1.0.7;
}
"""

CAMERA = ROOT.below("Host: camera", "host camera")
CANCELLED_FIRST = ("Shared network", "class")
REMOVED = ("Shared network: attic", "Range: 10.1.0.10", "Gateways", "MAC address: 00:11:22:33:44:77")
BLOCKS = (
    "All network",
    "Shared network",
    "Subnet",
    "Group",
    "class",
    "Host",
)  # their menus have commands that add as well


def edited(title, name, text, becomes):
    return form(title, {name: text}, {name: becomes})


def routes_edited(shown, ms, fill):
    shown = {"Static routes": shown, "Route for MS systems": {"checked"} if ms else set()}
    return Dialog("Edit static route", shown, fill, button="Yes")


def host_edited(shown, texts):
    return form("Edit host", dict(zip(("Name:", "MAC address:", "Fixed IP:"), shown)), texts)


EDITS = (
    Edit(
        ROOT,
        Lines(
            "Static route MS: code 249 = array of unsigned integer 8",
            "option ms-classless-static-routes code 249 = array of unsigned integer 8;",
        ),
        words_form(
            "Edit static route",
            "Parameter:",
            "option ms-classless-static-routes code 249 = array of unsigned integer 8",
            "option ms-classless-static-routes code 250 = array of unsigned integer 8",
        ),
        Lines(
            "Static route MS: code 250 = array of unsigned integer 8",
            "option ms-classless-static-routes code 250 = array of unsigned integer 8;",
        ),
    ),
    Edit(
        ROOT,
        Lines(
            """\
Shared network: attic
    Subnet: 10.2.0.0 / 255.255.255.0""",
            """\
shared-network attic {
    subnet 10.2.0.0 netmask 255.255.255.0 {
    }
}""",
        ),
        edited("Edit shared network", "Name:", "attic", "big lab"),
        Lines(
            """\
Shared network: "big lab"
    Subnet: 10.2.0.0 / 255.255.255.0""",
            """\
shared-network "big lab" {
    subnet 10.2.0.0 netmask 255.255.255.0 {
    }
}""",
        ),
    ),
    Edit(
        SUBNET,
        Lines("Range: 10.1.0.10 - 10.1.0.19", "range 10.1.0.10 10.1.0.19;"),
        form(
            "Edit range",
            {"Start IP:": "10.1.0.10", "End IP:": "10.1.0.19"},
            {"Start IP:": "10.1.0.11", "End IP:": "10.1.0.12"},
        ),
        Lines("Range: 10.1.0.11 - 10.1.0.12", "range 10.1.0.11 10.1.0.12;"),
    ),
    Edit(
        ROOT,
        Lines("Subnet: 10.3.0.0 / 255.255.255.0", "subnet 10.3.0.0 netmask 255.255.255.0 {\n}"),
        form(
            "Edit subnet",
            {"Address:": "10.3.0.0", "Netmask:": "255.255.255.0"},
            {"Address:": "10.4.0.0", "Netmask:": "255.255.128.0"},
        ),
        Lines("Subnet: 10.4.0.0 / 255.255.128.0", "subnet 10.4.0.0 netmask 255.255.128.0 {\n}"),
    ),
    Edit(
        GROUP,
        Lines("Default lease time: 10 minutes", "default-lease-time 600;"),
        time_form("Edit default lease time", ("0", "0", "0 h", "10 m", "0 s"), {"Hours": "1"}),
        Lines("Default lease time: 1 hours 10 minutes", "default-lease-time 4200;"),
    ),
    Edit(
        GROUP,
        Lines("Gateways: 10.1.0.1, 10.1.0.2", "option routers 10.1.0.1, 10.1.0.2;"),
        Dialog(
            "Edit gateways",
            {"Gateways:": ["10.1.0.1", "10.1.0.2"]},
            steps(without_first(pyatspi.ROLE_LIST), addresses("10.1.0.9")),
        ),
        Lines("Gateways: 10.1.0.2, 10.1.0.9", "option routers 10.1.0.2, 10.1.0.9;"),
    ),
    Edit(
        GROUP,
        Lines('Domain name: "example.org"', 'option domain-name "example.org";'),
        edited("Edit domain name", "Domain name:", "example.org", "print.example.org"),
        Lines('Domain name: "print.example.org"', 'option domain-name "print.example.org";'),
    ),
    Edit(
        GROUP,
        Lines(
            "Static route: 24, 192,168,1,0, 10,1,0,1, 16, 172,17,0,0, 10,1,0,1",
            "option classless-static-routes 24, 192,168,1,0, 10,1,0,1, 16, 172,17,0,0, 10,1,0,1;",
        ),
        routes_edited(
            ["255.255.255.0: 192.168.1.0: 10.1.0.1", "255.255.0.0: 172.17.0.0: 10.1.0.1"],
            False,
            steps(without_first(pyatspi.ROLE_TABLE), cell(0, 2, "10.1.0.9")),
        ),
        Lines("Static route: 16, 172,17, 10,1,0,9", "option classless-static-routes 16, 172,17, 10,1,0,9;"),
    ),
    Edit(
        ROOT,
        Lines(
            """\
class: "phones"
    match: hardware""",
            """\
class "phones" {
    match hardware;
}""",
        ),
        words_form("Edit arbitrary declaration", "Declaration:", 'class "phones"', 'class "voip"'),
        Lines(
            """\
class: "voip"
    match: hardware""",
            """\
class "voip" {
    match hardware;
}""",
        ),
    ),
    Edit(
        ROOT,
        Lines('subclass: "phones" 1:00:11:22:33:44:55', 'subclass "phones" 1:00:11:22:33:44:55;'),
        words_form(
            "Edit arbitrary declaration",
            "Declaration:",
            'subclass "phones" 1:00:11:22:33:44:55',
            'subclass "voip" 1:00:11:22:33:44:66',
        ),
        Lines('subclass: "voip" 1:00:11:22:33:44:66', 'subclass "voip" 1:00:11:22:33:44:66;'),
    ),
    Edit(
        ROOT,
        Lines(
            """\
Host: plotter
    MAC address: 00:11:22:33:44:55
    Fixed address: 10.1.0.5""",
            """\
host plotter {
    hardware ethernet 00:11:22:33:44:55;
    fixed-address 10.1.0.5;
}""",
        ),
        host_edited(
            ("plotter", "00:11:22:33:44:55", "10.1.0.5"),
            {"Name:": "plotter.lan", "MAC address:": "00:11:22:33:44:88", "Fixed IP:": "10.1.0.15"},
        ),
        Lines(
            """\
Host: plotter.lan
    MAC address: 00:11:22:33:44:88
    Fixed address: 10.1.0.15""",
            """\
host plotter.lan {
    hardware ethernet 00:11:22:33:44:88;
    fixed-address 10.1.0.15;
}""",
        ),
    ),
    Edit(
        CAMERA,
        Lines("MAC address: 00:11:22:33:44:77", "hardware ethernet 00:11:22:33:44:77;"),
        edited("Edit MAC address", "MAC address:", "00:11:22:33:44:77", "aa:bb:cc:dd:ee:ff"),
        Lines("MAC address: aa:bb:cc:dd:ee:ff", "hardware ethernet aa:bb:cc:dd:ee:ff;"),
    ),
    Edit(
        CAMERA,
        Lines("Fixed address: 10.1.0.7", "fixed-address 10.1.0.7;"),
        edited("Edit fixed address", "IP:", "10.1.0.7", "10.1.0.8"),
        Lines("Fixed address: 10.1.0.8", "fixed-address 10.1.0.8;"),
    ),
)


class Menus(CommandTest):
    SITE = SITE

    def test_have_these_entries(self):
        read = set(BLOCKS)
        for line in self.lines:
            kind = line[-1].split(":")[0]
            if kind not in read:
                read.add(kind)
                with self.case(command="the menu", row=line):
                    self.assertEqual(self.offered(self.topology.row(*line).context_menu()), CHANGES)


class Changes(CommandTest):
    SITE = SITE

    def change(self, edits, change):
        """Runs CHANGE for the edits, which returns what becomes of the statements."""
        file = self.file
        for edit in edits:
            with self.case(command=edit, place=edit.place.row):
                becomes = change(edit, self.topology.row(*edit.row))
                self.expect_instead(edit, becomes)
                file = with_block(file, edit.place.file_lines(edit.before), edit.place.file_lines(becomes))
        self.assertEqual(self.save(), file)

    def expect_instead(self, edit, becomes):
        lines = with_block(self.lines, edit.place.tree_lines(edit.before), edit.place.tree_lines(becomes))
        self.expect(lambda shown: shown == lines)

    def edit(self, edit, row):
        if edit.row[-1].startswith(CANCELLED_FIRST):
            self.cancel(edit.dialog, row.double_click)
        row.context_menu().choose("Edit")
        self.accept(edit.dialog)
        return edit.after

    def remove(self, edit, row):
        row.context_menu().choose("Remove")
        self.wait(lambda: self.topology.row(*edit.place.row).is_current, f"{edit.place} current")
        return NOTHING

    def test_edit(self):
        self.change(EDITS, self.edit)

    def test_remove(self):
        subnet = self.topology.row(*SUBNET.row)
        subnet.click()
        self.main.press("Left")
        self.wait(lambda: not subnet.is_expanded, "a closed branch")
        removed = [edit for edit in EDITS if edit.row[-1].startswith(REMOVED)]
        self.assertEqual(len(removed), len(REMOVED))
        self.change(removed, self.remove)
        self.assertTrue(self.topology.row(*SUBNET.row).is_expanded)
