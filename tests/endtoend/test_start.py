# SPDX-License-Identifier: GPL-3.0-or-later
"""The program's start."""

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

    def test_offers_commands_on_the_network(self):
        menu = self.tree.row("All network").context_menu()
        self.assertEqual(menu.entries[:2], ["Add shared network", "Add subnet"])
        options = menu.submenu("Add parameter").submenu("Add option")
        self.assertIn("Add DNS servers", options.entries)
        self.main.press("Escape", "Escape", "Escape")

    def test_asks_before_it_reads_the_file_again(self):
        self.main.choose("File", "Reload")
        question = self.message(
            "Information", "Do you want to reload configuration from file?", buttons=["Yes", "No"], default="Yes"
        )
        question.answer("No")
