# SPDX-License-Identifier: GPL-3.0-or-later
"""What a screen reader can say of the program: names, roles, states and values, and what changes while it listens."""

import contextlib

import pyatspi

import desktop
import machine
import test_leases
from keyboard import Keyboard
from testcase import SAVE_QUESTION, ProgramTest, told_comments

FOCUS = "object:state-changed:focused"
DESCRIPTION = "object:property-change:accessible-description"
NAME = "object:property-change:accessible-name"


class ScreenReaderTest(ProgramTest):
    def start(self):
        """Hears everything from the beginning."""
        self.heard = []
        for kind in (FOCUS, DESCRIPTION, NAME):
            pyatspi.Registry.registerEventListener(self.hear, kind)
            self.addCleanup(pyatspi.Registry.deregisterEventListener, self.hear, kind)
        super().start()
        self.program.hand = Keyboard()
        self.addCleanup(self.program.hand.leave)
        self.main.take_keyboard()
        self.wait(lambda: self.heard, "the first words")

    def hear(self, event):
        with contextlib.suppress(*desktop.GONE):
            if event.source and not (event.type == FOCUS and not event.detail1):
                source = event.source
                self.heard.append((str(event.type), source.getRole(), source.name, source.description))

    def wait_to_hear(self, *what):
        self.wait(lambda: what in self.heard, f"{what} to be said; heard: {self.heard[-8:]}")

    def wait_for_focus(self, role, name, description=""):
        self.wait_to_hear(FOCUS, role, name, description)

    def press(self, *keys):
        self.heard.clear()
        self.program.keys(*keys)

    def show_leases(self):
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
        return self.main.find(pyatspi.ROLE_TABLE, "Leases")


class Topology(ScreenReaderTest):
    def test_says_the_row_that_the_keyboard_comes_to(self):
        self.wait_for_focus(pyatspi.ROLE_PAGE_TAB_LIST, "Topology")
        self.press("Tab")
        self.wait_for_focus(pyatspi.ROLE_TABLE_CELL, "All network")
        self.press("Down")
        self.wait_for_focus(pyatspi.ROLE_TABLE_CELL, self.tree.rows[1].texts[0])

    def test_says_the_value_beside_a_name(self):
        """A screen reader reads the row of the cell that has the keyboard, by the tree's table."""
        self.tree.row("All network", "Default lease time: 2 minutes").click()
        (cell,) = [cell for cell in self.tree.cells() if cell.has("focused")]
        grid, place = self.tree.accessible.queryTable(), cell.accessible.getIndexInParent()
        row = grid.getRowAtIndex(place)
        self.assertEqual(grid.getColumnAtIndex(place), 0)
        self.assertEqual(
            [grid.getAccessibleAt(row, column).name.strip() for column in range(grid.nColumns)],
            ["Default lease time", "2 minutes"],
        )
        self.assertEqual([grid.getColumnDescription(column) for column in range(grid.nColumns)], ["Topology", "Value"])

    def test_says_which_branches_are_open(self):
        network = self.tree.row("All network", "Shared network: wireless")
        self.assertTrue(network.cells[0].has("expandable"))
        self.assertTrue(network.is_expanded)
        network.click()
        self.press("Left")
        self.wait(lambda: not network.is_expanded, "a closed branch")
        parameter = self.tree.row("All network", "Default lease time: 2 minutes")
        self.assertFalse(parameter.cells[0].has("expandable"))

    def test_says_the_state_of_the_server(self):
        self.main.choose("Server", "Start DHCP-server")
        self.wait_to_hear(NAME, pyatspi.ROLE_LABEL, "DHCP-server is running", "")


class Leases(ScreenReaderTest):
    def prepare(self):
        machine.LEASES.write_text(
            "".join(test_leases.lease(f"192.0.2.{i}", f"00:00:5e:00:53:{i:02}", f"pc-{i}") for i in range(1, 6))
        )

    def test_are_said_with_row_and_column(self):
        table = self.show_leases()
        table.row("192.0.2.2").click()
        self.press("Down", "Right")
        self.wait_for_focus(pyatspi.ROLE_TABLE_CELL, "00:00:5e:00:53:03")
        (cell,) = [cell for cell in table.cells() if cell.has("focused")]
        grid, place = table.accessible.queryTable(), cell.accessible.getIndexInParent()
        self.assertEqual((grid.nRows, grid.nColumns), (5, 6))
        self.assertEqual((grid.getRowAtIndex(place), grid.getColumnAtIndex(place)), (2, 1))
        self.assertEqual(grid.getAccessibleAt(2, 1).name, cell.name)
        self.assertEqual(grid.getColumnDescription(1), "MAC address")

    def test_are_counted_by_the_search(self):
        self.press("ctrl+f")
        self.wait_for_focus(pyatspi.ROLE_TEXT, "Search", "Search")
        search = self.main.find(pyatspi.ROLE_TEXT, "Search")
        self.program.type("pc-")
        self.wait_to_hear(DESCRIPTION, pyatspi.ROLE_TEXT, "Search", "Leases found: 5")
        self.program.type("3")
        self.wait_to_hear(DESCRIPTION, pyatspi.ROLE_TEXT, "Search", "Leases found: 1")
        self.program.type("3")
        self.wait_to_hear(DESCRIPTION, pyatspi.ROLE_TEXT, "Search", "No leases found")
        # While he types, the keyboard stays in the field, whatever the search makes current.
        said = [heard[1] for heard in self.heard if heard[0] == FOCUS]
        self.assertEqual(said[-1], pyatspi.ROLE_TEXT, self.heard)
        self.assertTrue(search.has("focused"))


class Dialogs(ScreenReaderTest):
    def open(self, *entries):
        self.tree.row("All network").context_menu().choose(*entries)
        return self.program.window(entries[-1])

    def test_say_their_fields_and_values(self):
        dialog = self.open("Add parameter", "Add max lease time")
        self.assertEqual(dialog.role, pyatspi.ROLE_DIALOG)
        for name in ("Mounth:", "Days:", "Hours", "Minutes", "Seconds"):
            with self.case(name=name):
                field = dialog.field(name)
                field.enter("7")
                value = field.accessible.queryValue()
                self.assertEqual((value.currentValue, value.minimumValue), (7, 0))
                self.assertGreaterEqual(value.maximumValue, 12)
        self.assertEqual([button.has("is-default") for button in map(dialog.button, ("Save", "Cancel"))], [True, False])

    def test_say_what_is_checked_and_what_cannot_be_used(self):
        dialog = self.open("Add static route")
        box = dialog.find(pyatspi.ROLE_CHECK_BOX, "Route for MS systems")
        self.assertFalse(box.is_checked)
        box.click()
        self.wait(lambda: box.is_checked, "a check mark")
        self.assertFalse(dialog.button("Remove").is_enabled)

    def test_say_which_cell_of_a_route_is_edited(self):
        dialog = self.open("Add static route")
        dialog.button("Add").click()
        table = dialog.find(pyatspi.ROLE_TABLE, "Static routes")
        self.wait(lambda: table.cell_rows(), "a row")
        self.assertTrue(dialog.button("Add").has("focused"))
        self.assertEqual(self.heard[-1][1:3], (pyatspi.ROLE_PUSH_BUTTON, "Add"))
        for column in table.headers:
            self.press("shift+Tab", "F2") if column == "Net mask" else self.press("Tab")
            self.wait_for_focus(pyatspi.ROLE_TEXT, column)


class Verdict(ScreenReaderTest):
    def prepare(self):
        machine.CONFIGURATION.write_text("default-lease-time 600;\nno-such-parameter 1;\n")

    def test_is_said_when_it_appears_in_the_question(self):
        self.tree.row("All network").context_menu().choose("Add host")
        dialog = self.program.window("Add host")
        dialog.field("Name:").enter("guest")
        dialog.press("Return")
        dialog.wait_closed()
        self.main.press("ctrl+s")
        question = self.program.window("Information")
        self.assertEqual(question.role, pyatspi.ROLE_ALERT)
        self.assertEqual(question.text, SAVE_QUESTION)
        self.assertEqual(told_comments(machine.CONFIGURATION.read_text()), "")
        question.take_keyboard()

        def said():
            return [
                description
                for kind, role, name, description in self.heard
                if (kind, role, name) == (DESCRIPTION, pyatspi.ROLE_PUSH_BUTTON, "Save")
            ]

        verdict = self.wait(said, f"the server's verdict; heard: {self.heard[-8:]}")[-1]
        self.assertTrue(verdict.startswith("The DHCP server refuses this configuration:\n"), verdict)
        self.assertEqual(question.informative_text, verdict)
        self.assertIn((NAME, pyatspi.ROLE_LABEL, verdict, ""), self.heard)
        question.answer("Cancel")
