# SPDX-License-Identifier: GPL-3.0-or-later
"""The start by the superuser: what the window shows, and what it keeps to itself."""

import os
import pathlib

import pyatspi

import desktop
import machine
from testcase import ProgramTest

SITE = """\
All network
    authoritative
    Default lease time: 2 minutes
    min-lease-time: 30 seconds
    Max lease time: 10 minutes
    ddns-update-style: standard
    update-static-leases: on
    Domain name: "example.org"
    DNS servers: 10.20.0.2, 10.20.0.3
    NTP servers: 10.20.0.2
    Subnet: 10.20.10.0 / 255.255.255.0
        Gateways: 10.20.10.1
        Domain name: "office.example.org"
        ddns-domainname: "office.example.org."
        Range: 10.20.10.100 - 10.20.10.199
        Group
            Default lease time: 5 minutes
            Domain name: "print.example.org"
            Host: printer-ground-floor
                MAC address: 00:80:92:4a:10:01
                Fixed address: 10.20.10.20
            Host: printer-first-floor
                MAC address: 00:80:92:4a:10:02
                Fixed address: 10.20.10.21
            Host: plotter
                MAC address: 00:80:92:4a:10:03
                Fixed address: 10.20.10.22
        Host: reception
            MAC address: 3c:52:82:61:0a:11
            Fixed address: 10.20.10.30
    Subnet: 10.20.30.0 / 255.255.255.0
        Gateways: 10.20.30.1
        Domain name: "lab.example.org"
        Default lease time: 1 minutes
        Range: 10.20.30.50 - 10.20.30.99
        Range: 10.20.30.150 - 10.20.30.199
        Host: oscilloscope
            MAC address: 00:1b:21:3c:44:01
            Fixed address: 10.20.30.10
        Host: build-server
            MAC address: 52:54:00:7a:1e:02
            filename: "pxelinux.0"
            next-server: 10.20.0.4
            Fixed address: 10.20.30.11
    Shared network: wireless
        Domain name: "wifi.example.org"
        Subnet: 10.20.64.0 / 255.255.254.0
            Gateways: 10.20.64.1
            Max lease time: 4 minutes
            Range: 10.20.64.10 - 10.20.65.250
        Subnet: 192.168.80.0 / 255.255.255.0
            Gateways: 192.168.80.1
            DNS servers: 192.168.80.1
            Default lease time: 1 minutes 30 seconds
            Max lease time: 3 minutes
            Range: 192.168.80.20 - 192.168.80.220
    Key information: office-update
        Key generation algorithm: hmac-sha256
        Generated secret: RGVtb25zdHJhdGlvbktleU9mVGhlT2ZmaWNlWm9uZTE=
    Zone served by DNS server: office.example.org.
        Master DNS Server: 127.0.0.1
        Key: office-update
"""


class Start(ProgramTest):
    def test_shows_the_configuration(self):
        self.assertEqual(self.tree.headers, ["Topology", "Value"])
        self.assertEqual("\n".join(self.tree.lines()) + "\n", SITE)
        self.assertTrue(self.tree.row("All network").is_current)

    def test_shows_the_window(self):
        self.assertEqual([window.title for window in self.program.windows()], [desktop.MAIN_TITLE])
        self.assertEqual([tab.name for tab in self.main.all(pyatspi.ROLE_PAGE_TAB)], ["Topology", "Leases"])
        self.assertEqual(
            [entry.name for entry in self.main.find(pyatspi.ROLE_MENU_BAR).children], ["File", "Server", "Help"]
        )
        self.assertEqual(
            [button.name for button in self.main.find(pyatspi.ROLE_TOOL_BAR).all(pyatspi.ROLE_PUSH_BUTTON)],
            [
                "Start DHCP-server",
                "Restart DHCP-server",
                "Save",
                "Reload",
                "Add shared network",
                "Add subnet",
                "Add host",
            ],
        )
        self.wait_for_server("stopped")

    def test_has_these_menus(self):
        for name, entries in {
            "File": ["Reload", "Save", None, "Exit"],
            "Server": ["Start DHCP-server", "Restart DHCP-server", None, "Select interfaces"],
            "Help": ["Manual", "Handbook", None, "About orv-admin-dhcp", "About Qt"],
        }.items():
            self.assertEqual(self.main.find(pyatspi.ROLE_MENU_ITEM, name).open_menu().entries, entries)
            self.main.press("Escape")

    def test_gives_the_window_its_last_size(self):
        size = 1001, 555
        self.assertNotEqual(self.main.box[2:], size)
        self.program.display.resize(self.program.display.window_at(self.main.box), *size)
        self.wait(lambda: self.main.box[2:] == size, "a window of another size")
        self.main.close()
        self.assertEqual(self.program.wait_ended(), 0)
        self.start()
        self.assertEqual(self.main.box[2:], size)


class SecondStart(ProgramTest):
    def test_brings_the_first_window_back_and_ends(self):
        display = self.program.display
        self.main.find(pyatspi.ROLE_STATUS_BAR).reach()
        display.cover(self.main.box)
        self.assertNotEqual(display.box_below_mouse(), self.main.box)
        self.assertFalse(display.has_keyboard(display.window_at(self.main.box)))
        second = desktop.Program()
        self.addCleanup(second.end)
        self.assertEqual(second.wait_ended(), 1)
        self.assertEqual(second.output(), "")
        self.wait(lambda: display.box_below_mouse() == self.main.box, "the first window in front")
        self.wait(lambda: display.has_keyboard(display.window_at(self.main.box)), "the first window with the keyboard")
        self.assertEqual(len(self.tree.rows), len(SITE.splitlines()))


class SecondStartInAFolderThatWasClosed(SecondStart):
    """The folder in which the first start leaves word of itself is the superuser's, but lacks a right of his."""

    FOLDER = pathlib.Path("/run/orv-admin-dhcp")

    def prepare(self):
        self.FOLDER.mkdir(exist_ok=True)
        self.FOLDER.chmod(0o500)


class StartInGerman(ProgramTest):
    def start(self):
        self.launch(LC_ALL="de_DE.UTF-8")
        self.main = self.program.window("DHCP-Server konfigurieren")

    def test_speaks_german_throughout(self):
        self.main.press("F5")
        question = "Möchten Sie die Konfiguration neu aus der Datei laden?"
        # The texts of the buttons are not the program's own but Qt's.
        self.message("Information", question, buttons=["Ja", "Nein"], default="Ja").answer("Nein")


class StartWithoutSession(ProgramTest):
    def start(self):
        self.launch(XDG_RUNTIME_DIR="")
        self.main = self.program.window(desktop.MAIN_TITLE)

    def test_leaves_no_folder_among_the_temporary_files(self):
        self.assertEqual(list(pathlib.Path(os.environ["TMPDIR"]).glob("runtime-*")), [])


class StartWithoutConfiguration(ProgramTest):
    def prepare(self):
        machine.CONFIGURATION.unlink()

    def start(self):
        self.launch()
        reason = "No such file or directory"
        box = self.message("Error", "Unable to open file '/etc/dhcp/dhcpd.conf' for read", informative_text=reason)
        box.answer("OK")
        self.main = self.program.window(desktop.MAIN_TITLE)

    def test_shows_an_empty_tree(self):
        self.assertEqual(self.tree.lines(), [])


class StartWithRunningServer(ProgramTest):
    def prepare(self):
        self.assertEqual(machine.systemctl("start").returncode, 0)

    def test_tells_that_it_runs(self):
        self.wait_for_server("running")
        self.main.button("Stop DHCP-server")
