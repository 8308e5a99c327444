# SPDX-License-Identifier: GPL-3.0-or-later
"""What the tests of the program in a private network have in common."""

import contextlib
import functools
import unittest

import pyatspi

import desktop
import machine

CANCELLATIONS = {
    "button": lambda window: window.button("Cancel").click(),
    "key": lambda window: window.press("Escape"),
    "frame": lambda window: window.close(),
}
SAVE_QUESTION = "Current configuration in file will be rewrited.\nDo you want to save changes?"


def keeping_picture(test):
    @functools.wraps(test)
    def run(self):
        try:
            test(self)
            self.finish()
        except BaseException:
            desktop.keep_picture(self.id())
            raise

    return run


class DesktopTest(unittest.TestCase):
    """Starts the program. Keeps a picture of the display when a test fails."""

    def __init_subclass__(cls, **options):
        super().__init_subclass__(**options)
        for name, test in list(vars(cls).items()):
            if name.startswith("test"):
                setattr(cls, name, keeping_picture(test))

    def launch(self, **environment):
        """Starts the program for as long as the test."""
        self.program = desktop.Program(environment=environment)
        self.addCleanup(self.program.end)

    def finish(self):
        """What is checked at the end of every test."""
        self.assertEqual([self.program.describe(window) for window in self.program.unknown()], [])

    def wait(self, condition, what):
        """Waits until the condition holds; WHAT names it where that does not happen."""
        return self.program.wait(condition, lambda: what)

    @contextlib.contextmanager
    def case(self, **parameters):
        """Tells of a failure in which case it was.

        Other than after a failed subtest, the cases that follow are not run: what is on the display is in their way.
        """
        try:
            yield
        except Exception as error:
            error.add_note(", ".join(f"{name}: {value}" for name, value in parameters.items()))
            raise

    def message(self, title, text, *, informative_text="", buttons=("OK",), default="OK"):
        """A message box that has opened, which must be as described."""
        box = self.program.window(title)
        self.assertEqual(box.role, pyatspi.ROLE_ALERT)
        self.assertEqual(box.text, text)
        self.assertEqual(box.informative_text, informative_text)
        self.assertEqual(box.buttons, list(buttons))
        self.assertEqual(box.default_button, default)
        return box


def told_comments(content):
    """What the save question says of a file whose only signs for comments stand before comments."""
    count = content.count("#")
    if count == 0:
        return ""
    return "The " + (f"{count} comments" if count > 1 else "comment") + " of the file will not be kept."


class ProgramTest(DesktopTest):
    """Each test has the machine as it was at first, and the program freshly started on it.

    A class or test that needs the machine otherwise than at first changes it in prepare().
    """

    def setUp(self):
        machine.reset()
        self.prepare()
        self.start()

    def prepare(self):
        """What happens to the machine before the program starts."""

    def start(self):
        self.launch()
        self.main = self.program.window(desktop.MAIN_TITLE)

    @property
    def tree(self):
        return self.main.find(pyatspi.ROLE_TREE, "Topology")

    def reload_question(self):
        question = "Do you want to reload configuration from file?"
        return self.message("Information", question, buttons=["Yes", "No"], default="Yes")

    def save_question(self, text=SAVE_QUESTION):
        """Asks before a save, and tells of the comments that it drops, unless the file is another than was read."""
        lost = told_comments(machine.CONFIGURATION.read_text()) if text == SAVE_QUESTION else ""
        return self.rewrite_question(text, lost)

    def rewrite_question(self, text=SAVE_QUESTION, lost=""):
        return self.message("Information", text, informative_text=lost, buttons=["Save", "Cancel"], default="Save")

    def save(self, text=SAVE_QUESTION):
        """Saves the configuration, which the server accepts."""
        self.main.press("ctrl+s")
        self.save_question(text).answer("Save")
        self.wait_for_save()
        self.assertEqual(machine.verdict(), "")

    def wait_for_save(self):
        self.wait(lambda: not self.main.button("Save").is_enabled, "a saved configuration")

    @property
    def server_state(self):
        """What the status bar says of the server."""
        return self.main.find(pyatspi.ROLE_STATUS_BAR).find(pyatspi.ROLE_LABEL).name

    def wait_for_server(self, state):
        self.wait(lambda: self.server_state == f"DHCP-server is {state}", f"a server that is {state}")

    def wait_for_other_server(self, pid):
        """Waits until the server runs as another process than that of before."""
        self.wait(lambda: machine.server_pid() not in (None, pid), "another process of the server")
        self.wait_for_server("running")

    def restart_server(self):
        pid = machine.server_pid()
        self.main.button("Restart DHCP-server").click()
        self.wait_for_other_server(pid)

    def client(self, mac, interface, host_name=None):
        """A machine that has newly come onto a wire, where it is for as long as the test."""
        client = machine.Client(mac, interface, host_name)
        self.addCleanup(client.leave)
        return client

    def wait_for_address(self, client):
        """The address that the server gives to a client."""
        return self.wait(lambda: client.address, f"an address for {client.mac}: {client.log}")
