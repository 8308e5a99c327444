# SPDX-License-Identifier: GPL-3.0-or-later
"""Closing the window with and without unsaved changes."""

import machine
from test_saving import CANNOT_WRITE, CONFIGURATION, NEW_LEASE_TIME, READ_ONLY, SAVED, SavingTest
from testcase import CANCELLATIONS


class Closing(SavingTest):
    def confirmation(self):
        return self.message(
            "Confirmation", "There are unsaved changes, save?", buttons=["Yes", "No", "Cancel"], default="Yes"
        )

    def assert_ended(self):
        self.assertEqual(self.program.wait_ended(), 0)

    def test_asks_nothing_without_changes(self):
        commands = {"frame": lambda: self.main.close(), "menu": lambda: self.main.choose("File", "Exit")}
        for name, close in commands.items():
            with self.case(by=name):
                close()
                self.assert_ended()
                self.start()
        self.assert_not_saved()

    def test_without_saving(self):
        self.edit()
        self.main.choose("File", "Exit")
        self.confirmation().answer("No")
        self.assert_ended()
        self.assert_not_saved()

    def test_can_be_cancelled(self):
        self.edit()
        for name, cancel in CANCELLATIONS.items():
            with self.case(by=name):
                self.main.close()
                box = self.confirmation()
                cancel(box)
                box.wait_closed()
                self.tree.row(*NEW_LEASE_TIME)
        self.assert_not_saved()
        self.save()

    def test_with_saving(self):
        self.edit()
        self.main.close()
        self.confirmation().answer("Yes")
        self.save_question().answer("Save")
        self.assert_ended()
        self.assert_saved()

    def test_with_saving_that_is_cancelled(self):
        self.edit()
        self.main.choose("File", "Exit")
        self.confirmation().answer("Yes")
        self.save_question().answer("Cancel")
        self.assert_ended()
        self.assert_not_saved()

    def test_keeps_a_copy_of_what_could_not_be_written(self):
        self.edit()
        with self.read_only_folder():
            self.main.close()
            self.confirmation().answer("Yes")
            self.save_question().answer("Save")
            self.message("Error", CANNOT_WRITE, informative_text=READ_ONLY).answer("OK")
            self.assert_ended()
        self.assertEqual(machine.CONFIGURATION.read_text(), CONFIGURATION)
        self.assertIn(SAVED, [backup.read_text() for backup in machine.backups()])

    def test_after_a_save_asks_nothing(self):
        self.edit()
        self.save()
        self.main.close()
        self.assert_ended()
