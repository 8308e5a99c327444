# SPDX-License-Identifier: GPL-3.0-or-later
"""Saving the configuration: what is asked, what is written and kept, and what becomes of changes by others."""

import contextlib
import os
import pathlib
import signal
import stat
import tempfile

import pyatspi

import desktop
import machine
from testcase import CANCELLATIONS, SAVE_QUESTION, ProgramTest, told_comments

CONFIGURATION = """\
# The laboratory
default-lease-time 120; # two minutes
subnet 10.20.30.0 netmask 255.255.255.0 { range 10.20.30.50 10.20.30.99; }
"""
SAVED = """\
default-lease-time 180;
subnet 10.20.30.0 netmask 255.255.255.0 {
    range 10.20.30.50 10.20.30.99;
}
"""
REFUSED = "colour green;\n"
SAVED_REFUSED = SAVED.replace("subnet", REFUSED + "subnet", 1)
COMPLAINT = "line 2: semicolon expected."
CHANGED_OUTSIDE = "default-lease-time 99;\n"

QUESTION_IF_CHANGED = "The configuration has been changed.\nDo you want to overwrite the configuration?"
CANNOT_WRITE = "Unable to open file '/etc/dhcp/dhcpd.conf' for write"
READ_ONLY = "Read-only file system"

LEASE_TIME = ("All network", "Default lease time: 2 minutes")
NEW_LEASE_TIME = ("All network", "Default lease time: 3 minutes")


class SavingTest(ProgramTest):
    def prepare(self):
        machine.CONFIGURATION.write_text(CONFIGURATION)

    @contextlib.contextmanager
    def read_only_folder(self):
        """Meanwhile nobody can write where the configuration is, not even the superuser."""
        self.remount_folder("ro")
        try:
            yield
        finally:
            self.remount_folder("rw")

    def remount_folder(self, access):
        # Of the place alone: the superuser of a user namespace may not say again who owns the folder in memory.
        result = machine.run("mount", "--no-mtab", "-o", f"remount,bind,{access}", machine.CONFIGURATION.parent)
        self.assertEqual(result.returncode, 0, result.stdout)

    def edit(self):
        """Makes the lease time longer by a minute."""
        self.tree.row(*LEASE_TIME).double_click()
        dialog = self.program.window("Edit default lease time")
        dialog.field("Minutes").enter("3")
        dialog.button("Save").click()
        dialog.wait_closed()
        self.tree.row(*NEW_LEASE_TIME)

    def save_question(self, text=SAVE_QUESTION):
        """As ever, and the server has nothing to say against it."""
        box = super().save_question(text)
        self.wait(lambda: not self.program.child_processes(), "the end of the server's check")
        self.assertNotIn("server", box.informative_text)
        return box

    @property
    def is_offered(self):
        return self.main.button("Save").is_enabled

    def wait_until_offered(self):
        self.wait(lambda: self.is_offered, "a command to save")

    def assert_saved(self):
        self.assertEqual(machine.CONFIGURATION.read_text(), SAVED)
        self.assertEqual(machine.verdict(), "")

    def assert_not_saved(self):
        self.assertEqual(machine.CONFIGURATION.read_text(), CONFIGURATION)
        self.assertEqual(machine.backups(), [])


class Saving(SavingTest):
    def test_is_offered_while_something_is_unsaved(self):
        file_menu = self.main.find(pyatspi.ROLE_MENU_ITEM, "File").open_menu()
        self.assertFalse(file_menu.entry("Save").is_enabled)
        self.main.press("Escape")
        self.assertFalse(self.is_offered)
        self.edit()
        self.wait_until_offered()
        self.save()
        self.assertEqual(self.tree.lines()[1].strip(), NEW_LEASE_TIME[1])

    def test_from_the_menu_writes_what_the_server_accepts(self):
        self.edit()
        self.main.choose("File", "Save")
        self.save_question().answer("Save")
        self.wait_for_save()
        self.assert_saved()

    def test_by_keys_writes_what_the_server_accepts(self):
        self.edit()
        self.main.press("ctrl+s")
        box = self.save_question()
        box.press("Return")
        box.wait_closed()
        self.wait_for_save()
        self.assert_saved()

    def test_can_be_cancelled(self):
        self.edit()
        for name, cancel in CANCELLATIONS.items():
            with self.case(by=name):
                self.main.press("ctrl+s")
                box = self.save_question()
                cancel(box)
                box.wait_closed()
                self.assertTrue(self.is_offered)
                self.assert_not_saved()
        self.tree.row(*NEW_LEASE_TIME)

    def test_keeps_the_replaced_version(self):
        self.edit()
        self.save()
        (backup,) = machine.backups()
        self.assertRegex(backup.name, r"^etc\+dhcp\+dhcpd\.conf\.\d{8}T\d{6}\.\d{6}Z$")
        self.assertEqual(backup.read_text(), CONFIGURATION)
        for kept in (backup, machine.BACKUPS):
            self.assertEqual(stat.S_IMODE(kept.stat().st_mode) & 0o077, 0)

    def test_opens_all_branches_and_goes_to_the_top(self):
        self.edit()
        subnet = self.tree.row("All network", "Subnet: 10.20.30.0 / 255.255.255.0")
        subnet.click()
        self.main.press("Left")
        self.wait(lambda: len(self.tree.rows) == 3, "a closed branch")
        self.save()
        self.wait(lambda: len(self.tree.rows) == 4, "an open branch")
        self.assertTrue(self.tree.row("All network").is_current)

    def test_serves_a_restarted_server(self):
        self.assertEqual(machine.systemctl("start").returncode, 0)
        range_row = "All network", "Subnet: 10.20.30.0 / 255.255.255.0", "Range: 10.20.30.50 - 10.20.30.99"
        self.tree.row(*range_row).double_click()
        dialog = self.program.window("Edit range")
        for field in ("Start IP:", "End IP:"):
            dialog.field(field).enter("10.20.30.77")
        dialog.button("Save").click()
        dialog.wait_closed()
        self.save()
        self.assertEqual(machine.verdict(), "")
        self.restart_server()
        self.assertEqual(self.wait_for_address(self.client("02:00:00:00:00:0a", "lab0")), "10.20.30.77")


class SavingAFileOfFewReaders(SavingTest):
    def prepare(self):
        super().prepare()
        machine.CONFIGURATION.chmod(0o640)
        self.names = sorted(os.listdir(machine.CONFIGURATION.parent))

    def test_keeps_its_rights_and_leaves_nothing_beside_it(self):
        self.edit()
        self.save()
        self.assert_saved()
        self.assertEqual(stat.S_IMODE(machine.CONFIGURATION.stat().st_mode), 0o640)
        self.assertEqual(sorted(os.listdir(machine.CONFIGURATION.parent)), self.names)


class SavingWhereThatFails(SavingTest):
    def test_leaves_everything_as_it_was(self):
        self.edit()
        with self.read_only_folder():
            self.main.press("ctrl+s")
            self.save_question().answer("Save")
            self.message("Error", CANNOT_WRITE, informative_text=READ_ONLY).answer("OK")
        self.assertTrue(self.is_offered)
        self.tree.row(*NEW_LEASE_TIME)
        self.assertEqual(machine.CONFIGURATION.read_text(), CONFIGURATION)
        self.save()
        self.assert_saved()


class SavingWhatTheServerRefuses(SavingTest):
    def prepare(self):
        machine.CONFIGURATION.write_text(CONFIGURATION + REFUSED)

    def test_tells_its_complaint(self):
        self.edit()
        self.main.press("ctrl+s")
        box = self.program.window("Information")
        self.wait(lambda: COMPLAINT in box.informative_text, "the server's verdict")
        self.assertEqual(box.text, SAVE_QUESTION)
        verdict = "The DHCP server refuses this configuration:\n" + COMPLAINT
        self.assertEqual(box.informative_text, told_comments(CONFIGURATION) + "\n" + verdict)
        self.assertEqual(box.buttons, ["Save", "Cancel", "Show Details..."])
        self.assertEqual(box.default_button, "Save")
        box.button("Show Details...").click()
        details = box.find(pyatspi.ROLE_TEXT, "Answer of the DHCP server").text
        self.assertIn(COMPLAINT, details)
        self.assertIn("colour green", details)
        self.assertIn("exiting", details)
        box.answer("Save")
        self.wait_for_save()
        self.assertEqual(machine.CONFIGURATION.read_text(), SAVED_REFUSED)

    def test_need_not_wait_for_the_verdict(self):
        self.edit()
        self.main.press("ctrl+s")
        self.program.window("Information").answer("Save")
        self.wait_for_save()
        self.assertEqual(machine.CONFIGURATION.read_text(), SAVED_REFUSED)


class SavingWhileTheServersCheckHangs(SavingTest):
    """The server that checks what would be written comes to no end, and says nothing."""

    SERVER = "#!/bin/sh\nexec sleep infinity\n"

    def start(self):
        folder = pathlib.Path(self.enterContext(tempfile.TemporaryDirectory()))
        server = folder / "dhcpd"
        server.write_text(self.SERVER)
        server.chmod(0o755)
        self.launch(PATH=f"{folder}:{os.environ['PATH']}")
        self.main = self.program.window(desktop.MAIN_TITLE)

    def open_question(self):
        """The question of a save, and the number of the process that checks meanwhile."""
        self.edit()
        self.main.press("ctrl+s")
        question = self.program.window("Information")

        def hanging():
            return [pid for pid in self.program.child_processes() if machine.process_name(pid) == "sleep"]

        (check,) = self.wait(hanging, "the check")
        return question, check

    def wait_for_end_of(self, check):
        self.program.wait(
            lambda: machine.process_name(check) is None,
            lambda: f"the end of the check {check}",
            alive=False,
            alone=False,
        )

    def test_ends_the_check_when_the_question_is_answered(self):
        question, check = self.open_question()
        question.answer("Save")
        self.wait_for_end_of(check)
        self.wait_for_save()
        self.assert_saved()

    def test_leaves_no_check_behind_when_the_program_is_killed(self):
        _, check = self.open_question()
        self.program.process.kill()
        self.assertEqual(self.program.wait_ended(), -signal.SIGKILL)
        self.wait_for_end_of(check)
        self.assert_not_saved()


class SavingAfterOthersChangedTheFile(SavingTest):
    def change_outside(self):
        """Somebody changes the file, and the program notices: it watches the new file then, by another number."""
        before = self.watches()
        machine.CONFIGURATION.write_text(CHANGED_OUTSIDE)
        self.wait(lambda: self.watches() and self.watches().isdisjoint(before), "a noticed change")

    def watches(self):
        return self.program.watches(machine.CONFIGURATION)

    def test_asks_whether_to_overwrite_it(self):
        self.edit()
        self.change_outside()
        self.main.press("ctrl+s")
        self.save_question(QUESTION_IF_CHANGED).answer("Cancel")
        self.assertEqual(machine.CONFIGURATION.read_text(), CHANGED_OUTSIDE)
        self.save(QUESTION_IF_CHANGED)
        self.assert_saved()
        self.assertEqual([backup.read_text() for backup in machine.backups()], [CHANGED_OUTSIDE])

    def test_asks_as_ever_after_that(self):
        self.edit()
        self.change_outside()
        self.save(QUESTION_IF_CHANGED)
        self.tree.row(*NEW_LEASE_TIME).context_menu().choose("Remove")
        self.wait_until_offered()
        self.save()

    def test_asks_so_even_if_the_file_was_read_again(self):
        self.change_outside()
        self.main.press("F5")
        self.reload_question().answer("Yes")
        self.tree.row("All network", "Default lease time: 1 minutes 39 seconds").context_menu().choose("Remove")
        self.wait_until_offered()
        self.save(QUESTION_IF_CHANGED)
        self.assertEqual(machine.CONFIGURATION.read_text(), "")
