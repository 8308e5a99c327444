# SPDX-License-Identifier: GPL-3.0-or-later
"""The window's own commands: reading the configuration again, the tabs, the tool bar, the help."""

import pyatspi

import machine
from testcase import ProgramTest

ADDING = ["Add shared network", "Add subnet", "Add host"]


class Reload(ProgramTest):
    """The configuration is changed by others, which the window does not show by itself."""

    def prepare(self):
        self.configure(3)

    def configure(self, minutes):
        machine.CONFIGURATION.write_text(f"default-lease-time {60 * minutes};\n")

    def lines(self, minutes):
        """The tree for such a configuration."""
        return ["All network", f"    Default lease time: {minutes} minutes"]

    def test_shows_what_is_in_the_file_by_now(self):
        commands = {
            "F5": lambda: self.main.press("F5"),
            "menu": lambda: self.main.choose("File", "Reload"),
            "tool bar": lambda: self.main.button("Reload").click(),
        }
        for minutes, (name, command) in enumerate(commands.items(), start=4):
            with self.case(command=name):
                self.configure(minutes)
                command()
                question = self.reload_question()
                self.assertNotEqual(self.tree.lines(), self.lines(minutes))
                question.answer("Yes")
                self.wait(lambda: self.tree.lines() == self.lines(minutes), f"a lease time of {minutes} minutes")
                self.assertTrue(self.tree.row("All network").is_current)

    def test_can_be_declined(self):
        def answer_no(question):
            question.answer("No")

        def press_escape(question):
            question.press("Escape")
            question.wait_closed()

        self.configure(4)
        for decline in (answer_no, press_escape):
            with self.case(decline=decline.__name__):
                self.main.press("F5")
                decline(self.reload_question())
                self.assertEqual(self.tree.lines(), self.lines(3))

    def test_gives_changes_up(self):
        self.main.button("Add host").click()
        dialog = self.program.window("Add host")
        dialog.field("Name:").enter("guest")
        dialog.button("Save").click()
        dialog.wait_closed()
        self.tree.row("All network", "Host: guest")
        self.main.press("F5")
        self.reload_question().answer("Yes")
        self.wait(lambda: self.tree.lines() == self.lines(3), "the configuration without the host")


class ToolBar(ProgramTest):
    def enabled(self):
        """Which of the commands that add something can be used."""
        return [name for name in ADDING if self.main.button(name).is_enabled]

    def wait_for(self, *names):
        self.wait(lambda: self.enabled() == list(names), f"only {names}")

    def test_offers_what_can_be_added_to_the_current_row(self):
        for path, names in [
            (["Shared network: wireless"], ["Add subnet"]),
            (["Subnet: 10.20.30.0 / 255.255.255.0"], []),
            ([], ADDING),
            (["Default lease time: 2 minutes"], []),
        ]:
            with self.case(path=path):
                self.tree.row("All network", *path).click()
                self.wait_for(*names)

    def test_offers_to_add_on_the_tab_of_the_topology_only(self):
        self.wait_for(*ADDING)
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
        self.wait_for()
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Topology").click()
        self.wait_for(*ADDING)


class Help(ProgramTest):
    def test_shows_the_manual(self):
        self.main.choose("Help", "Manual")
        manual = self.program.window("Manual")
        text = manual.find(pyatspi.ROLE_LABEL, "Manual").text
        self.assertTrue(text.startswith("NAME\norv-admin-dhcp - configure the ISC DHCP server"), text)
        self.assertIn("/etc/dhcp/dhcpd.conf", text)
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()  # the window can be used meanwhile
        self.main.find(pyatspi.ROLE_TABLE, "Leases")
        manual.button("Close").click()
        manual.wait_closed()

    def test_tells_what_the_program_is(self):
        self.main.choose("Help", "About orv-admin-dhcp")
        box = self.program.window("About orv-admin-dhcp")
        self.assertRegex(
            box.text,
            r"^orv-admin-dhcp \d\S*\nConfigure DHCP server\nFree software under the GNU General Public License",
        )
        box.answer("OK")

    def test_tells_what_the_toolkit_is(self):
        self.main.choose("Help", "About Qt")
        box = self.program.window("About Qt")
        self.assertRegex(box.labels[0], r"\AAbout Qt\nThis program uses Qt version [56]\.")
        box.button("OK").click()
        box.wait_closed()


class Names(ProgramTest):
    """Whatever can be used has a name that a screen reader can say."""

    USABLE = {
        pyatspi.ROLE_CHECK_BOX,
        pyatspi.ROLE_MENU_ITEM,
        pyatspi.ROLE_PAGE_TAB,
        pyatspi.ROLE_PUSH_BUTTON,
        pyatspi.ROLE_SPIN_BUTTON,
        pyatspi.ROLE_TABLE,
        pyatspi.ROLE_TEXT,
        pyatspi.ROLE_TREE,
    }

    def assert_named(self, window, *, least):
        usable = [control for control in window.below() if control.role in self.USABLE]
        self.assertGreaterEqual(len(usable), least)
        self.assertEqual([str(control) for control in usable if not control.name.strip(" .")], [])

    def test_are_in_the_window(self):
        self.assert_named(self.main, least=13)
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
        self.main.find(pyatspi.ROLE_TEXT, "Search").enter("text")  # shows the button that clears it
        self.main.find(pyatspi.ROLE_PUSH_BUTTON, "Clear the search")
        self.assert_named(self.main, least=18)

    def test_are_in_its_dialogs(self):
        self.main.choose("Server", "Select interfaces")
        self.assert_named(self.program.window("Select interfaces"), least=6)
