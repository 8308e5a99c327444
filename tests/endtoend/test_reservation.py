# SPDX-License-Identifier: GPL-3.0-or-later
"""Reserving the address of a lease."""

import pyatspi

import machine
from testcase import CANCELLATIONS, ProgramTest

COMMAND = "Reserve an IP address"
MAC = "02:00:00:00:10:0a"
OTHER_MAC = "02:00:00:00:10:0b"


def declarations(name, mac, address):
    """What the configuration has of a host, as single words."""
    return f"host {name} {{ hardware ethernet {mac}; fixed-address {address}; }}".split()


class ReservationTest(ProgramTest):
    HOST_NAME = None

    def prepare(self):
        machine.systemctl("start")

    def start(self):
        """The program on its tab of leases, with that of one client."""
        self.desk = self.client(MAC, "lan0", self.HOST_NAME)
        super().start()
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
        self.address = self.wait_for_address(self.desk)

    def row(self, client):
        return self.main.find(pyatspi.ROLE_TABLE, "Leases").row(client.mac)

    def dialog(self):
        """The dialog that has opened for a lease."""
        return self.program.window("Reserve an IP address")

    def fields(self, dialog):
        return [dialog.field(label).text for label in ("Name:", "MAC address:", "Fixed IP:")]

    def accept(self, dialog, go_to_topology):
        dialog.button("Save").click()
        dialog.wait_closed()
        question = self.message(
            "Information",
            "The IP address is reserved.\nGo to topology?",
            buttons=["Yes", "No"],
            default="Yes",
        )
        question.answer("Yes" if go_to_topology else "No")

    def assert_in_file(self, name, mac, address):
        words, wanted = machine.CONFIGURATION.read_text().split(), declarations(name, mac, address)
        self.assertEqual(words.count(name), 1, words)
        place = words.index(name) - 1
        self.assertEqual(words[place : place + len(wanted)], wanted)

    def assert_in_tree(self, name, mac, address):
        """There is such a host, which the whole site may use."""
        host = "All network", f"Host: {name}"
        self.tree.row(*host, f"MAC address: {mac}")
        self.tree.row(*host, f"Fixed address: {address}")

    def assert_nothing_reserved(self):
        self.assertFalse(self.main.button("Save").is_enabled)
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Topology").click()
        self.assertEqual([line for line in self.tree.lines() if MAC in line], [])


class Reservation(ReservationTest):
    HOST_NAME = "desk"

    def test_gives_the_client_another_address(self):
        menu = self.row(self.desk).context_menu()
        self.assertEqual(menu.entries, [COMMAND])
        menu.choose(COMMAND)
        dialog = self.dialog()
        self.assertEqual(self.fields(dialog), ["desk", MAC, self.address])
        dialog.field("Fixed IP:").enter("10.20.10.50")
        self.accept(dialog, go_to_topology=True)
        self.assert_in_tree("desk", MAC, "10.20.10.50")
        self.assertTrue(self.tree.row("All network", "Host: desk").is_current)

        self.save()
        self.assert_in_file("desk", MAC, "10.20.10.50")
        self.restart_server()
        self.desk.ask()
        self.assertEqual(self.wait_for_address(self.desk), "10.20.10.50")

    def test_gives_the_client_the_same_address_for_good(self):
        self.row(self.desk).double_click()
        self.accept(self.dialog(), go_to_topology=False)
        self.assertTrue(self.row(self.desk))  # on the same tab
        self.save()
        self.assert_in_file("desk", MAC, self.address)
        self.restart_server()
        self.desk.ask()
        self.assertEqual(self.wait_for_address(self.desk), self.address)
        granted = f"DHCPACK on {self.address} to {MAC}"
        self.wait(lambda: granted in machine.server_log(), f"the restarted server's {granted}")
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Topology").click()
        self.assert_in_tree("desk", MAC, self.address)

    def test_is_of_the_chosen_row(self):
        other = self.client(OTHER_MAC, "lan0", "other")
        address = self.wait_for_address(other)
        for client, name, leased in [(other, "other", address), (self.desk, "desk", self.address)]:
            self.row(client).context_menu().choose(COMMAND)
            dialog = self.dialog()
            self.assertEqual(self.fields(dialog), [name, client.mac, leased])
            dialog.button("Cancel").click()
            dialog.wait_closed()
        self.assert_nothing_reserved()

    def test_takes_what_is_typed(self):
        self.row(self.desk).double_click()
        dialog = self.dialog()
        dialog.field("Name:").enter("typed")
        dialog.field("MAC address:").focus()
        self.program.keys("Home")
        self.program.type(OTHER_MAC.replace(":", ""))
        dialog.field("Fixed IP:").enter("10.20.10.60")
        self.accept(dialog, go_to_topology=True)
        self.assert_in_tree("typed", OTHER_MAC, "10.20.10.60")
        # The name of the lease is what the tree goes to, not the one that was typed.
        self.assertFalse(self.tree.row("All network", "Host: typed").is_current)
        self.save()
        self.assert_in_file("typed", OTHER_MAC, "10.20.10.60")

    def test_can_be_cancelled(self):
        for name, cancel in CANCELLATIONS.items():
            with self.case(by=name):
                self.row(self.desk).double_click()
                dialog = self.dialog()
                dialog.field("Name:").enter("typed")
                cancel(dialog)
                dialog.wait_closed()
        self.assert_nothing_reserved()

    def test_goes_with_the_lease_that_the_menu_was_opened_for(self):
        menu = self.row(self.desk).context_menu()
        machine.LEASES.unlink()  # while the menu is open
        self.wait(lambda: not self.main.find(pyatspi.ROLE_TABLE, "Leases").rows, "a table without leases")
        menu.choose(COMMAND)
        dialog = self.dialog()
        self.assertEqual(self.fields(dialog), ["desk", MAC, self.address])
        dialog.press("Escape")
        dialog.wait_closed()


class ReservationWithoutName(ReservationTest):
    def test_needs_one(self):
        self.row(self.desk).double_click()
        dialog = self.dialog()
        self.assertEqual(self.fields(dialog), ["", MAC, self.address])
        dialog.button("Save").click()  # to no avail
        dialog.field("Name:").enter("nameless")
        self.accept(dialog, go_to_topology=False)
        self.save()
        self.assert_in_file("nameless", MAC, self.address)


class ReservationOfAnIntruder(ReservationTest):
    HOST_NAME = "pc;}option{x#"

    def test_adds_no_statements_of_his(self):
        row = self.row(self.desk)
        self.assertEqual(row.texts[2], self.HOST_NAME)
        row.double_click()
        dialog = self.dialog()
        self.assertEqual(self.fields(dialog), ["pc-option-x", MAC, self.address])
        self.accept(dialog, go_to_topology=False)
        self.save()
        self.assert_in_file("pc-option-x", MAC, self.address)
