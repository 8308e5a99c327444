# SPDX-License-Identifier: GPL-3.0-or-later
"""Choosing the interfaces that the server serves."""

import pyatspi

import machine
from testcase import ProgramTest

INTERFACES = ["dmz0", "lab0", "lan0", "wlan0"]  # those of the private network

BEFORE = """\
# Hand-written: do not lose me.
OPTIONS="-q"\t# and me
"""
AFTER = """\

  INTERFACESv6="eth9"
DHCPDv4_CONF=/etc/dhcp/dhcpd.conf
"""


def defaults(interfaces):
    """A defaults file with some interfaces."""
    return f'{BEFORE}INTERFACESv4="{interfaces}"\n{AFTER}'


def version(path):
    """What tells whether a file has been written since."""
    status = path.stat()
    return status.st_ino, status.st_mtime_ns


class InterfacesTest(ProgramTest):
    def prepare(self):
        machine.DEFAULTS.write_text(defaults("lan0"))

    def open_dialog(self):
        self.main.choose("Server", "Select interfaces")
        return self.program.window("Select interfaces")

    def offered(self, dialog):
        """Each interface that can be chosen, and whether it is."""
        boxes = dialog.find(pyatspi.ROLE_PANEL, "Available interfaces").all(pyatspi.ROLE_CHECK_BOX)
        return {box.name: box.is_checked for box in boxes}

    def toggle(self, dialog, *names):
        for name in names:
            box = dialog.find(pyatspi.ROLE_CHECK_BOX, name)
            checked = box.is_checked
            box.click()
            self.wait(lambda: box.is_checked != checked, f"another state of {box}")

    def save(self, dialog):
        """Saves the choice of a dialog up to the question."""
        dialog.button("Save").click()
        dialog.wait_closed()
        return self.rewrite_question()

    def choose(self, *names):
        """Changes whether these are served."""
        dialog = self.open_dialog()
        self.toggle(dialog, *names)
        self.save(dialog).answer("Save")


class Interfaces(InterfacesTest):
    def test_are_those_of_the_machine(self):
        dialog = self.open_dialog()
        self.assertEqual(list(self.offered(dialog)), INTERFACES)
        self.assertEqual(self.offered(dialog), {name: name == "lan0" for name in INTERFACES})
        dialog.close()
        dialog.wait_closed()

    def test_include_one_that_only_the_file_has(self):
        machine.DEFAULTS.write_text(defaults("old0 wlan0"))
        dialog = self.open_dialog()
        self.assertEqual(self.offered(dialog), {**{name: name == "wlan0" for name in INTERFACES}, "old0": True})
        self.toggle(dialog, "old0")
        self.save(dialog).answer("Save")
        self.assertEqual(machine.DEFAULTS.read_text(), defaults("wlan0"))

    def test_are_written_among_the_other_lines(self):
        for toggled, line in [
            (["dmz0", "wlan0"], "dmz0 lan0 wlan0"),
            (["dmz0", "lan0", "wlan0"], ""),
            (["wlan0"], "wlan0"),
            (["lab0", "wlan0"], "lab0 "),  # a space follows each name but that of the machine's last interface
        ]:
            with self.case(toggled=toggled):
                self.choose(*toggled)
                self.assertEqual(machine.DEFAULTS.read_text(), defaults(line))

    def test_are_chosen_by_keys(self):
        dialog = self.open_dialog()
        dialog.press("space", "Tab", "space", "Return")  # the first box has the keyboard, Save is the default
        dialog.wait_closed()
        self.program.window("Information").press("Return")
        self.wait(lambda: machine.DEFAULTS.read_text() == defaults("dmz0 lab0 lan0 "), "the file with the choice")

    def test_stay_when_the_choice_is_given_up(self):
        before = version(machine.DEFAULTS)
        dialog = self.open_dialog()
        self.toggle(dialog, "lan0", "lab0")
        dialog.button("Cancel").click()
        dialog.wait_closed()

        dialog = self.open_dialog()
        self.assertEqual(self.offered(dialog), {name: name == "lan0" for name in INTERFACES})
        self.toggle(dialog, "lan0", "lab0")
        self.save(dialog).answer("Cancel")

        self.save(self.open_dialog()).answer("Save")  # which is no other choice
        self.assertEqual(version(machine.DEFAULTS), before)

    def test_are_those_that_the_file_names_by_now(self):
        machine.DEFAULTS.write_text(defaults("lab0 wlan0"))
        dialog = self.open_dialog()
        self.assertEqual(self.offered(dialog), {name: name in ("lab0", "wlan0") for name in INTERFACES})
        dialog.press("Escape")
        dialog.wait_closed()

    def test_are_not_known_without_the_file(self):
        machine.DEFAULTS.unlink()
        self.main.choose("Server", "Select interfaces")
        reason = "No such file or directory"
        text = "Unable to open file '/etc/default/isc-dhcp-server' for read"
        self.message("Error", text, informative_text=reason).answer("OK")
        dialog = self.program.window("Select interfaces")
        self.assertEqual(self.offered(dialog), dict.fromkeys(INTERFACES, False))
        dialog.press("Escape")
        dialog.wait_closed()


class ServedInterfaces(InterfacesTest):
    def prepare(self):
        super().prepare()
        machine.systemctl("start")

    def test_are_another_after_a_restart(self):
        at_desk = self.client("02:00:00:00:10:01", "lan0", "desk")
        at_bench = self.client("02:00:00:00:30:01", "lab0", "bench")
        self.assertRegex(self.wait_for_address(at_desk), r"^10\.20\.10\.")
        self.assert_served("lan0")
        self.assert_unheard(at_bench, helped=at_desk)

        pid = machine.server_pid()
        self.choose("lan0", "lab0")
        self.assertEqual(machine.server_pid(), pid)
        self.restart_server()
        self.assert_served("lab0")
        at_desk.ask()
        self.assertRegex(self.wait_for_address(at_bench), r"^10\.20\.30\.")
        self.assert_unheard(at_desk, helped=at_bench)

    def assert_served(self, *interfaces):
        self.assertEqual(machine.server_command()[5:], list(interfaces))
        self.assertEqual(machine.interfaces_listened_on(), sorted(interfaces))

    def assert_unheard(self, client, helped):
        """The server hears nothing of a client that asks, although it goes on to answer another one."""
        asked = client.log.count("DHCPDISCOVER")
        self.wait(lambda: client.log.count("DHCPDISCOVER") > asked, f"{client.mac} asking")
        answer = f"DHCPACK on {helped.address} to {helped.mac}"
        answers = machine.server_log().count(answer)
        helped.ask()
        self.wait(lambda: machine.server_log().count(answer) > answers, f"another answer for {helped.mac}")
        self.assertNotIn(client.mac, machine.server_log())
        self.assertEqual(client.address, "")
