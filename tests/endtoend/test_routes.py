# SPDX-License-Identifier: GPL-3.0-or-later
"""Static routes from the dialog to the client that installs them."""

import ipaddress

import machine
from commandtest import ROOT, routes, shown_in
from testcase import ProgramTest

MAC = "02:00:00:00:10:0a"
SITE = f"""\
authoritative;
ping-check false;
subnet 10.20.10.0 netmask 255.255.255.0 {{
    range 10.20.10.10 10.20.10.19;
    option routers 10.20.10.254;
}}
host desk {{
    hardware ethernet {MAC};
}}
"""
HOST = ROOT.below("Host: desk", "host desk")

# For each length of a prefix a network whose last bit counts, and a gateway on the client's wire. The shortest networks
# look like net masks.
BITS = 0b10101010_10101010_10101010_10101010


def network(length):
    host_bits = 32 - length
    last_bit = 1 << host_bits if length else 0
    return ipaddress.ip_network(((BITS >> host_bits << host_bits) | last_bit, length))


GATEWAYS = {network(length): f"10.20.10.{100 + length}" for length in range(33)}


class Routes(ProgramTest):
    def prepare(self):
        machine.CONFIGURATION.write_text(SITE)
        machine.DEFAULTS.write_text('INTERFACESv4="lan0"\n')

    def add(self, place, gateways, ms):
        """Adds routes, which the dialog shows when it is opened for them again."""
        rows = [(str(to.netmask), str(to.network_address), gateway) for to, gateway in gateways.items()]
        self.tree.row(*place.row).context_menu().choose("Add static route")
        dialog = self.program.window("Add static route")
        routes(*rows, ms=ms)(dialog)
        dialog.button("Yes").click()
        dialog.wait_closed()

        self.program.wait(lambda: self.route_row(place), lambda: "\n".join(self.tree.lines())).double_click()
        dialog = self.program.window("Edit static route")
        self.assertEqual(shown_in(dialog)["Static routes"], [": ".join(cells) for cells in rows])
        dialog.button("Cancel").click()
        dialog.wait_closed()

    def route_row(self, place):
        """The row of the routes of a place; that of their definition comes before."""
        routes_of_place = [row for row in self.tree.rows if row.depth == len(place.row) and "Static route" in row.label]
        return routes_of_place[-1] if routes_of_place else None

    def assert_installed(self, gateways):
        """The server gives the routes to a client that comes after a restart, which installs these and no others."""
        self.save()
        self.restart_server()
        desk = self.client(MAC, "lan0")
        self.wait_for_address(desk)
        self.program.wait(lambda: desk.routes == gateways, lambda: f"{gateways}; there are {desk.routes}: {desk.log}")

    def test_of_all_lengths_are_installed_by_a_client(self):
        self.add(ROOT, GATEWAYS, ms=False)
        self.assert_installed(GATEWAYS)

    def test_for_ms_systems_are_installed_by_the_host_that_they_are_for(self):
        gateways = {network(length): GATEWAYS[network(length)] for length in (0, 1, 8, 9, 24, 25, 32)}
        self.add(HOST, gateways, ms=True)
        self.assert_installed(gateways)
