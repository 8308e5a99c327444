# SPDX-License-Identifier: GPL-3.0-or-later
"""Commands that come past an open dialog: from a desktop's global menu, and from a screen reader.

The mouse and the keyboard cannot reach the window then, but these two can. Nothing may come of it.
"""

import dataclasses

import pyatspi

import desktop
import globalmenu
import machine
from commandtest import file, option, parameter
from testcase import ProgramTest

SITE = """\
authoritative;
default-lease-time 600;
max-lease-time 7200;
min-lease-time 300;
option domain-name "example.org";
option domain-name-servers 10.20.10.2;
option routers 10.20.10.1;
option ntp-servers 10.20.10.2;
option classless-static-routes code 121 = array of unsigned integer 8;
option classless-static-routes 24, 192,168,1, 10,20,10,1;
option time-offset 3600;
shared-network office {
    subnet 10.20.30.0 netmask 255.255.255.0 {
    }
}
subnet 10.20.10.0 netmask 255.255.255.0 {
    range 10.20.10.10 10.20.10.20;
}
group servers {
}
host full {
    hardware ethernet 00:11:22:33:44:55;
    fixed-address 10.20.10.5;
}
"""
MAC = "02:00:00:00:10:0a"
LEASES = f"""\
lease 10.20.10.11 {{
  starts 6 2026/11/21 10:00:00;
  ends never;
  binding state active;
  hardware ethernet {MAC};
  client-hostname "desk";
}}
"""

NETWORK = ("All network",)
SUBNET = (*NETWORK, "Subnet: 10.20.10.0 / 255.255.255.0")
GROUP = (*NETWORK, "Group: servers")
HOST = (*NETWORK, "Host: full")
REMOVED = (*NETWORK, "time-offset: 3600")
ADVANCED = "Warning!"  # the title of the question before an editor of free text


@dataclasses.dataclass(frozen=True)
class Command:
    """A command on a row of the tree: the entries of its menu, none for a double click, and the windows that it opens.

    Each window but the last is a question before the next one.
    """

    row: tuple
    entries: tuple
    titles: tuple

    def __str__(self):
        return f"{self.row[-1]} > {' > '.join(self.entries)}"


def add(row, *titles, by=None):
    return Command(row, by or titles[-1:], titles)


def edit(row, *titles):
    return Command((*NETWORK, *row), (), titles)


COMMANDS = (
    add(NETWORK, "Add shared network"),
    add(NETWORK, "Add subnet"),
    add(NETWORK, "Add host"),
    add(NETWORK, "Add static route"),
    add(SUBNET, "Add range"),
    add(HOST, "Add fixed address", by=("Add fixed IP",)),
    add(SUBNET, "Add gateways", by=option("Add gateways")),
    add(SUBNET, "Add DNS servers", by=option("Add DNS servers")),
    add(SUBNET, "Add NTP servers", by=option("Add NTP servers")),
    add(SUBNET, "Add domain name", by=option("Add domain name")),
    add(SUBNET, "Add default lease time", by=parameter("Add default lease time")),
    add(SUBNET, "Add max lease time", by=parameter("Add max lease time")),
    add(GROUP, ADVANCED, "Add arbitrary declaration"),
    add(GROUP, ADVANCED, "Add arbitrary parameter", by=parameter("Add arbitrary parameter")),
    add(
        GROUP,
        "Information",
        "Choose the bind9 configuration with the update key",
        by=option("Add DHCP dynamic zone update"),
    ),
    edit(["Shared network: office"], "Edit shared network"),
    edit(SUBNET[1:], "Edit subnet"),
    edit([*SUBNET[1:], "Range: 10.20.10.10 - 10.20.10.20"], "Edit range"),
    edit(HOST[1:], "Edit host"),
    edit([*HOST[1:], "MAC address: 00:11:22:33:44:55"], "Edit MAC address"),
    edit([*HOST[1:], "Fixed address: 10.20.10.5"], "Edit fixed address"),
    edit(["Gateways: 10.20.10.1"], "Edit gateways"),
    edit(["DNS servers: 10.20.10.2"], "Edit DNS servers"),
    edit(["NTP servers: 10.20.10.2"], "Edit NTP servers"),
    edit(['Domain name: "example.org"'], "Edit domain name"),
    edit(["Default lease time: 10 minutes"], "Edit default lease time"),
    edit(["Max lease time: 2 hours"], "Edit max lease time"),
    edit(["min-lease-time: 5 minutes"], "Edit time"),
    edit(["Static route: 24, 192,168,1, 10,20,10,1"], "Edit static route"),
    edit(["Static route: code 121 = array of unsigned integer 8"], ADVANCED, "Edit static route"),
    edit(GROUP[1:], ADVANCED, "Edit arbitrary declaration"),
    edit(["authoritative"], ADVANCED, "Edit arbitrary parameter"),
)

# What can be reached past a dialog, by its kind: the entries of the menu bar, the tabs, and of the tool bar what can
# always be used while something is unsaved.
ENTRIES = {
    "Reload",
    "Save",
    "Exit",
    "Start DHCP-server",
    "Restart DHCP-server",
    "Select interfaces",
    "Manual",
    "Handbook",
    "About orv-admin-dhcp",
    "About Qt",
}
TABS = {"Leases", "Topology"}
TOOLS = {"Start DHCP-server", "Restart DHCP-server", "Save", "Reload"}


def everything_below(control):
    """What is in a control, whether or not it can be seen."""
    for child in control.children:
        yield child
        yield from everything_below(child)


class Modality(ProgramTest):
    def prepare(self):
        machine.CONFIGURATION.write_text(SITE)
        machine.LEASES.write_text(LEASES)

    def start(self):
        """The program with something unsaved, so that every command can be used."""
        self.global_menu = globalmenu.GlobalMenu()
        self.addCleanup(self.global_menu.end)
        # Qt leaves the entries of an exported menu behind when the program ends, which a check for leaks would report.
        self.launch(LSAN_OPTIONS="detect_leaks=0")
        self.main = self.program.window(desktop.MAIN_TITLE)
        self.tree.row(*REMOVED).context_menu().choose("Remove")
        self.wait(lambda: self.main.button("Save").is_enabled, "a command to save")
        self.lines = self.tree.lines()

    def finish(self):
        super().finish()
        self.assertEqual(machine.server_log(), "")

    # --- What comes past a dialog

    def assert_alone(self, window):
        """Nothing comes of any command while the window is open."""
        open_windows = [other.title for other in self.program.windows()]

        def assert_nothing_opened(command):
            with self.case(over=window.title, command=command):
                self.assertTrue(self.program.is_running)
                self.assertEqual([other.title for other in self.program.windows()], open_windows)

        entries = self.global_menu.entries()
        self.assertEqual(set(entries), ENTRIES)
        for name in entries:
            self.global_menu.choose(name)
            assert_nothing_opened(f"{name!r} of the global menu")
        for control in self.pressable():
            control.press_aloud()
            assert_nothing_opened(f"{control} by a screen reader")

        self.assertEqual(machine.CONFIGURATION.read_text(), SITE)
        self.assertEqual(self.server_state, "DHCP-server is stopped")
        self.assertTrue(self.main.button("Save").is_enabled)

    def pressable(self):
        """What a screen reader can press in the window: the menu bar, which it has even if the desktop shows it, the
        tool bar, and the tabs, of which the current one comes last.
        """
        (bar,) = [child for child in self.main.children if child.role == pyatspi.ROLE_MENU_BAR]
        entries = [entry for entry in everything_below(bar) if entry.can_be_pressed]
        tools = [
            tool for tool in self.main.find(pyatspi.ROLE_TOOL_BAR).all(pyatspi.ROLE_PUSH_BUTTON) if tool.is_enabled
        ]
        is_topology = bool(self.main.all(pyatspi.ROLE_TREE, "Topology"))
        tabs = sorted(self.main.all(pyatspi.ROLE_PAGE_TAB), key=lambda tab: (tab.name == "Topology") == is_topology)
        self.assertEqual({entry.name for entry in entries}, ENTRIES)
        self.assertLessEqual(TOOLS, {tool.name for tool in tools})
        self.assertEqual({tab.name for tab in tabs}, TABS)
        return [*entries, *tools, *tabs]

    def walk_through(self, *answers):
        """Answers one window after the other, each given by its title and button, when nothing else has come of any."""
        for title, button in answers:
            window = self.program.window(title)
            self.assert_alone(window)
            window.button(button).click()
            window.wait_closed()

    def choose(self, row, *entries):
        self.tree.row(*row).context_menu().choose(*entries)

    # --- The dialogs

    def test_is_kept_by_every_command_on_the_topology(self):
        for command in COMMANDS:
            with self.case(command=command):
                if command.entries:
                    self.choose(command.row, *command.entries)
                else:
                    self.tree.row(*command.row).double_click()
                *questions, dialog = command.titles
                self.walk_through(*((question, "Yes") for question in questions), (dialog, "Cancel"))
                self.assertEqual(self.tree.lines(), self.lines)

    def test_is_kept_by_a_dialog_in_a_dialog(self):
        self.choose(SUBNET, *option("Add gateways"))
        dialog = self.program.window("Add gateways")
        dialog.button("Add").click()
        self.walk_through(("Add IP", "Cancel"))
        dialog.button("Cancel").click()
        dialog.wait_closed()

    def test_is_kept_by_a_refusal(self):
        self.choose(HOST, *option("Add DHCP dynamic zone update"))
        self.walk_through(("Information", "Yes"))
        dialog = self.program.window("Choose the bind9 configuration with the update key")
        file("/etc/bind", "named.conf.local")(dialog)
        dialog.button("Open").click()
        dialog.wait_closed()
        self.walk_through(("Error", "OK"))
        self.assertEqual(self.tree.lines(), self.lines)

    def test_is_kept_by_the_windows_own_commands(self):
        for name, start, *answers in [
            ("reload", lambda: self.main.press("F5"), ("Information", "No")),
            ("save", lambda: self.main.press("ctrl+s"), ("Information", "Cancel")),
            ("close", lambda: self.main.close(), ("Confirmation", "Cancel")),
            (
                "interfaces",
                lambda: self.global_menu.choose("Select interfaces"),
                ("Select interfaces", "Save"),
                ("Information", "Cancel"),
            ),
            ("about", lambda: self.global_menu.choose("About orv-admin-dhcp"), ("About orv-admin-dhcp", "OK")),
            ("about Qt", lambda: self.global_menu.choose("About Qt"), ("About Qt", "OK")),
        ]:
            with self.case(command=name):
                start()
                self.walk_through(*answers)
                self.assertEqual(self.tree.lines(), self.lines)

    def test_is_kept_by_a_reservation(self):
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
        self.main.find(pyatspi.ROLE_TABLE, "Leases").row(MAC).double_click()
        self.walk_through(("Reserve an IP address", "Save"), ("Information", "Yes"))
        self.assertEqual(
            [line.strip() for line in self.tree.lines() if line not in self.lines],
            ["Host: desk", f"MAC address: {MAC}", "Fixed address: 10.20.10.11"],
        )

    # --- What goes on

    def test_lets_a_command_and_the_program_go_on(self):
        self.tree.row(*HOST).double_click()
        dialog = self.program.window("Edit host")
        self.assert_alone(dialog)
        dialog.field("Name:").enter("other")
        dialog.button("Save").click()
        dialog.wait_closed()
        self.tree.row(*NETWORK, "Host: other")

        self.global_menu.choose("Save")
        self.save_question().answer("Save")
        self.wait_for_save()
        saved = machine.CONFIGURATION.read_text()
        self.assertIn("host other {", saved)
        self.assertEqual(machine.verdict(), "")
        self.global_menu.choose("Exit")
        self.assertEqual(self.program.wait_ended(), 0)

    def test_is_not_kept_by_a_menu(self):
        # A menu gives way to whatever opens a window, as it does to a click.
        menu = self.tree.row(*HOST).context_menu()
        self.global_menu.choose("Reload")
        question = self.reload_question()
        self.wait(lambda: not menu.is_showing, "a closed menu")
        question.answer("Yes")
        self.tree.row(*REMOVED)

        menu = self.tree.row(*HOST).context_menu()
        menu.entry("Edit").press_aloud()
        dialog = self.program.window("Edit host")
        self.wait(lambda: not menu.is_showing, "a closed menu")
        dialog.button("Cancel").click()
        dialog.wait_closed()

    def test_has_no_keys_of_the_window_in_an_open_menu(self):
        def topology(*submenu):
            menu = self.tree.row(*HOST).context_menu()
            for entry in submenu:
                menu.submenu(entry)
            return menu

        def leases():
            self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
            return self.main.find(pyatspi.ROLE_TABLE, "Leases").row(MAC).context_menu()

        keys = "F5", "ctrl+s", "ctrl+r", "F1", "F2", "shift+F10", "ctrl+f", "ctrl+c"
        for opened, entry, title in [
            (topology, "Edit", "Edit host"),
            (lambda: topology("Add parameter"), "Edit", "Edit host"),
            (leases, "Reserve an IP address", "Reserve an IP address"),
        ]:
            for key in keys:
                with self.case(key=key, title=title):
                    menu = opened()
                    self.program.keys(key)
                    menu.choose(entry)
                    dialog = self.program.window(title)
                    dialog.button("Cancel").click()
                    dialog.wait_closed()
        self.assertEqual(self.server_state, "DHCP-server is stopped")
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Topology").click()
        self.main.press("F5")  # without a menu
        self.reload_question().answer("No")

    def test_lets_the_menu_of_a_lease_be_used_after_a_reload(self):
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
        menu = self.main.find(pyatspi.ROLE_TABLE, "Leases").row(MAC).context_menu()
        machine.LEASES.write_text("")
        self.global_menu.choose("Reload")
        self.wait(lambda: not self.main.find(pyatspi.ROLE_TABLE, "Leases").rows, "a table without leases")
        menu.choose("Reserve an IP address")
        dialog = self.program.window("Reserve an IP address")
        self.assertEqual(dialog.field("MAC address:").text, MAC)
        dialog.button("Cancel").click()
        dialog.wait_closed()
