# SPDX-License-Identifier: GPL-3.0-or-later
"""The start by an ordinary user, who gets neither a window nor anything read or written."""

import os
import pathlib

from testcase import DesktopTest


class Refusal(DesktopTest):
    def test_is_all_that_an_ordinary_user_gets(self):
        self.assertNotEqual(os.getuid(), 0)
        self.launch()
        box = self.message("Error", "Must be superuser")
        self.assertEqual([window.title for window in self.program.windows()], ["Error"])
        box.answer("OK")
        self.assertEqual(self.program.wait_ended(), 1)
        self.assertEqual(list(pathlib.Path(os.environ["XDG_CONFIG_HOME"]).iterdir()), [])
