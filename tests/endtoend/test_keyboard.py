# SPDX-License-Identifier: GPL-3.0-or-later
"""The program with the keyboard alone: every command and every field, without the mouse."""

import pyatspi

import commandtest
import desktop
import machine
import test_addcommands
import test_editcommands
import test_leases
from keyboard import Keyboard
from testcase import ProgramTest

ASIDE = (1279, 1023)  # where the mouse lies
STOPS = (*desktop.FIELDS, pyatspi.ROLE_CHECK_BOX, pyatspi.ROLE_PUSH_BUTTON)  # where Tab leads to, beside views


def accept(window):
    """Presses the default button, wherever the keyboard is."""
    window.press("Return")
    window.wait_closed()


class WithoutMouse:
    """Starts the program for the keyboard. The mouse must be where it was in the end."""

    KEYBOARD = {}

    def start(self):
        super().start()
        self.program.display.move_mouse(*ASIDE)
        self.program.hand = Keyboard(**self.KEYBOARD)
        self.addCleanup(self.program.hand.leave)

    def finish(self):
        super().finish()
        self.assertEqual(self.program.display.mouse(), ASIDE)


class Adds(WithoutMouse, test_addcommands.Adds):
    """What the commands of the context menus add, entered by keys into every kind of dialog."""


class Edits(WithoutMouse, test_editcommands.Changes):
    KEYBOARD = {"menu_key": "shift+F10", "press_key": "space", "edit_key": "Return"}


class Menus(WithoutMouse, ProgramTest):
    """Context menus open at the current row, wherever the mouse is."""

    def assert_opens_at_current_row(self, view, row):
        cell, seen = row.cells[0], view.box
        for key in ("Menu", "shift+F10"):
            with self.case(key=key, row=row):
                self.program.menus.clear()
                self.program.keys(key)
                menu = self.program.menu()
                x, y = cell.box[0], cell.box[1] + cell.box[3]
                self.assertLessEqual(abs(menu.box[0] - x) + abs(menu.box[1] - y), 4, (menu.box, cell.box))
                self.assertTrue(seen.contains((*menu.box[:2], 1, 1)))
                self.program.keys("Escape")
                self.wait(lambda: not menu.is_showing, f"{menu} closed")

    def many_leases(self):
        machine.LEASES.write_text(
            "".join(test_leases.lease(f"192.0.2.{i}", "00:00:5e:00:53:01", "some") for i in range(100))
        )
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
        return self.main.find(pyatspi.ROLE_TABLE, "Leases")

    def test_of_the_topology_open_there(self):
        tree = self.tree
        for label in ("Default lease time: 2 minutes", "Shared network: wireless"):
            row = tree.row("All network", label)
            row.click()
            self.assert_opens_at_current_row(tree, row)

    def test_of_the_leases_open_there(self):
        table = self.many_leases()
        for address in ("192.0.2.3", "192.0.2.99"):
            row = table.row(address)
            row.click()
            self.assert_opens_at_current_row(table, row)

    def test_brings_a_row_into_sight(self):
        table = self.many_leases()
        row = table.row("192.0.2.3")
        row.click()
        cell, display = row.cells[0], self.program.display
        display.move_mouse(*table.box.middle)

        def out_of_sight():
            display.click(5)
            return cell.box[1] + cell.box[3] < table.box[1]

        self.wait(out_of_sight, f"{cell} out of sight of {table}")
        display.move_mouse(*ASIDE)
        self.assert_opens_at_current_row(table, row)


class Rows(WithoutMouse, ProgramTest):
    def test_are_edited_by_each_of_the_keys(self):
        self.tree.row("All network", "Shared network: wireless").click()
        for key in ("F2", "Return", "KP_Enter"):
            with self.case(key=key):
                self.main.press(key)
                dialog = self.program.window("Edit shared network")
                dialog.press("Escape")
                dialog.wait_closed()


class Order(WithoutMouse, ProgramTest):
    """Tab goes through a dialog as it is read: from line to line, and from left to right."""

    def way(self, dialog):
        """What has the keyboard at first and after each Tab, until that is the first one again."""
        dialog.take_keyboard()
        way = []

        def current():
            here = [control for control in dialog.below() if control.role in STOPS and control.has("focused")]
            return here if len(here) == 1 and not (way and here[0].path == way[-1].path) else None

        while True:
            (control,) = self.wait(current, f"the keyboard elsewhere than at the end of {way}")
            if way and control.path == way[0].path:
                return way
            way.append(control)
            self.program.keys("Tab")

    def test_is_that_of_reading(self):
        for entries in [
            ("Add shared network",),
            ("Add subnet",),
            ("Add host",),
            ("Add parameter", "Add max lease time"),
        ]:
            with self.case(entries=entries):
                self.tree.row("All network").context_menu().choose(*entries)
                dialog = self.program.window(entries[-1])
                way = self.way(dialog)
                stops = [control for control in dialog.below() if control.role in STOPS and control.is_enabled]
                self.assertEqual({control.path for control in way}, {control.path for control in stops}, (way, stops))
                for before, after in zip(way, way[1:]):
                    (left, top, width, height), (x, y, _, _) = before.box, after.box
                    self.assertTrue(y >= top + height or (y > top - height and x >= left + width), way)
                dialog.press("Escape")
                dialog.wait_closed()


class Lists(WithoutMouse, ProgramTest):
    def test_have_the_keyboard_when_the_last_address_is_removed(self):
        self.tree.row("All network").context_menu().choose("Add parameter", "Add option", "Add DNS servers")
        dialog = self.program.window("Add DNS servers")
        view = dialog.find(pyatspi.ROLE_LIST)
        commandtest.addresses("192.0.2.1")(dialog)
        commandtest.without_first(pyatspi.ROLE_LIST)(dialog)
        self.wait(lambda: self.program.hand.has_keyboard(view), f"{view} with the keyboard")
        dialog.press("Escape")
        dialog.wait_closed()

    def test_of_routes_have_the_keyboard_in_the_new_row(self):
        self.tree.row("All network").context_menu().choose("Add static route")
        dialog = self.program.window("Add static route")
        table = dialog.find(pyatspi.ROLE_TABLE, "Static routes")
        for rows in (1, 2):
            dialog.button("Add").click()
            self.wait(lambda n=rows: len(table.cell_rows()) == n, f"{rows} rows in {table}")
        self.program.hand.tab_to(table)
        self.wait(lambda: table.cell_rows()[-1][0].has("focused"), f"the keyboard in the last row of {table}")
        dialog.press("Escape")
        dialog.wait_closed()


class Leases(WithoutMouse, ProgramTest):
    def prepare(self):
        machine.LEASES.write_text(
            test_leases.lease("192.0.2.1", "00:00:5e:00:53:01", "phone-anna")
            + test_leases.lease("192.0.2.2", "00:00:5e:00:53:02", "printer")
            + test_leases.lease("192.0.2.3", "00:00:5e:00:53:03", "phone-boris")
        )

    def test_are_searched_copied_and_reserved(self):
        self.main.press("ctrl+f")
        search = self.main.find(pyatspi.ROLE_TEXT, "Search")
        self.wait(lambda: search.has("focused"), "the keyboard in the search")
        self.program.type("phone")
        table = self.main.find(pyatspi.ROLE_TABLE, "Leases")
        self.wait(lambda: len(table.rows) == 2, "only the phones")
        self.main.button("Next match").click()
        self.wait(lambda: table.row("192.0.2.3").cells[2].has("focused"), "the second match")

        # What was copied is seen where it is put in again, which makes blanks of the tabs.
        self.program.hand.tab_to(table)
        self.program.keys("ctrl+c")
        search.focus()
        self.program.keys("ctrl+a", "ctrl+v")
        cells = "192.0.2.3 00:00:5e:00:53:03 phone-boris active 07:08:09 UTC 20 Nov 2026 04:05:06 UTC 3 Feb 2036"
        self.wait(lambda: search.text.split() == cells.split(), f"{cells}, not {search.text}")

        # What is searched for next takes the place of that.
        self.program.hand.tab_to(table)
        self.program.keys("ctrl+f")
        self.wait(lambda: search.has("focused"), "the keyboard in the search again")
        self.program.type("printer")
        self.wait(lambda: search.text == "printer", f"the other text alone, not {search.text}")
        self.program.keys("ctrl+a", "Delete")
        self.wait(lambda: len(table.rows) == 3, "all leases")

        table.row("192.0.2.2").context_menu().choose("Reserve an IP address")
        dialog = self.program.window("Reserve an IP address")
        dialog.field("Fixed IP:").enter("192.0.2.20")
        accept(dialog)
        question = "The IP address is reserved.\nGo to topology?"
        accept(self.message("Information", question, buttons=["Yes", "No"], default="Yes"))
        self.tree.row("All network", "Host: printer", "Fixed address: 192.0.2.20")


class Window(WithoutMouse, ProgramTest):
    """The commands of the window itself."""

    def test_server_is_started_and_its_interfaces_are_chosen(self):
        self.main.choose("Server", "Start DHCP-server")
        self.wait_for_server("running")
        pid = machine.server_pid()
        self.main.choose("Server", "Restart DHCP-server")
        self.wait_for_other_server(pid)
        self.main.choose("Server", "Stop DHCP-server")
        self.wait_for_server("stopped")

        self.main.choose("Server", "Select interfaces")
        dialog = self.program.window("Select interfaces")
        box = dialog.find(pyatspi.ROLE_CHECK_BOX, "lab0")
        checked = box.is_checked
        box.click()
        self.wait(lambda: box.is_checked != checked, f"another state of {box}")
        accept(dialog)
        accept(self.rewrite_question())
        self.wait(lambda: ("lab0" in machine.DEFAULTS.read_text()) != checked, "a written defaults file")

    def test_configuration_is_reloaded_and_saved(self):
        self.main.choose("File", "Reload")
        accept(self.reload_question())
        self.tree.row("All network").context_menu().choose("Add host")
        dialog = self.program.window("Add host")
        dialog.field("Name:").enter("guest")
        accept(dialog)
        self.tree.row("All network", "Host: guest")
        self.main.choose("File", "Save")
        self.save_question().answer("Save")
        self.wait_for_save()
        self.assertIn("host guest {", machine.CONFIGURATION.read_text())

    def test_manual_is_read_and_left(self):
        self.main.press("F1")
        manual = self.program.window("Manual")
        self.assertIn("/etc/dhcp/dhcpd.conf", manual.find(pyatspi.ROLE_LABEL, "Manual").text)
        manual.press("Escape")
        manual.wait_closed()

    def test_is_closed(self):
        self.main.choose("File", "Exit")
        self.assertEqual(self.program.wait_ended(), 0)


class Escape(WithoutMouse, ProgramTest):
    """Escape leaves whatever has opened, and nothing has changed then."""

    def test_leaves_every_dialog_and_question(self):
        def choose(*entries):
            return lambda: self.tree.row("All network").context_menu().choose(*entries)

        parameter = "Add parameter"
        option = parameter, "Add option"
        lines = self.tree.lines()
        for command, title in [
            (choose("Add shared network"), "Add shared network"),
            (choose("Add subnet"), "Add subnet"),
            (choose("Add host"), "Add host"),
            (choose("Add static route"), "Add static route"),
            (choose("Add arbitrary declaration"), "Warning!"),
            (choose(parameter, "Add max lease time"), "Add max lease time"),
            (choose(*option, "Add DNS servers"), "Add DNS servers"),
            (choose(*option, "Add domain name"), "Add domain name"),
            (choose(*option, "Add DHCP dynamic zone update"), "Information"),
            (lambda: self.main.press("F5"), "Information"),
            (lambda: self.main.choose("Server", "Select interfaces"), "Select interfaces"),
            (lambda: self.main.choose("Help", "About orv-admin-dhcp"), "About orv-admin-dhcp"),
        ]:
            with self.case(title=title):
                command()
                window = self.program.window(title)
                window.press("Escape")
                window.wait_closed()
        self.assertEqual(self.tree.lines(), lines)
        self.assertFalse(self.main.button("Save").is_enabled)

    def test_leaves_a_list_before_its_dialog(self):
        self.tree.row("All network").context_menu().choose("Add parameter", "Add option", "Add NTP servers")
        dialog = self.program.window("Add NTP servers")
        dialog.button("Add").click()
        address = self.program.window("Add IP")
        address.press("Escape")
        address.wait_closed()
        self.assertTrue(dialog.is_open)
        dialog.press("Escape")
        dialog.wait_closed()
