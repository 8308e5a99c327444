# SPDX-License-Identifier: GPL-3.0-or-later
"""Starting, stopping and restarting the server."""

import contextlib
import fcntl
import os
import signal

import pyatspi

import machine
from testcase import ProgramTest

START = "Start DHCP-server"
STOP = "Stop DHCP-server"
RESTART = "Restart DHCP-server"

FAILURE = """\
Operation with DHCP-server failed
Job for isc-dhcp-server.service failed because the control process exited with error code.
See "systemctl status isc-dhcp-server.service" and "journalctl -xeu isc-dhcp-server.service" for details.
"""


@contextlib.contextmanager
def occupied_service_manager():
    """Meanwhile it tells the state of the service, and everything else has to wait."""
    machine.systemctl("stop")  # the lock is there from the first operation on
    with open(machine.SERVICE_RECORD / "lock", "w") as lock:
        fcntl.flock(lock, fcntl.LOCK_EX)
        yield


class ServiceTest(ProgramTest):
    def assert_runs(self):
        """The server runs, and every place of the window says so."""
        self.wait_for_server("running")
        self.assertTrue(machine.server_is_running())
        self.assertEqual(machine.server_command()[1:5], ["-4", "-d", "-cf", "/etc/dhcp/dhcpd.conf"])
        self.assert_offers(STOP, RESTART)

    def assert_stopped(self):
        self.wait_for_server("stopped")
        self.assertFalse(machine.server_is_running())
        self.assertEqual(machine.server_command(), [])
        self.assert_offers(START, RESTART)

    def assert_offers(self, *commands):
        """The commands on the server are these, in the tool bar and in the menu."""
        buttons = [button.name for button in self.main.find(pyatspi.ROLE_TOOL_BAR).all(pyatspi.ROLE_PUSH_BUTTON)]
        self.assertEqual(buttons[:2], list(commands))
        menu = self.main.find(pyatspi.ROLE_MENU_ITEM, "Server").open_menu()
        self.assertEqual(menu.entries, [*commands, None, "Select interfaces"])
        self.main.press("Escape", "Escape")


class StoppedServer(ServiceTest):
    def test_is_started_and_stopped_by_the_tool_bar(self):
        self.assert_stopped()
        self.main.button(START).click()
        self.assert_runs()
        self.main.button(STOP).click()
        self.assert_stopped()

    def test_is_started_and_stopped_by_the_menu(self):
        self.main.choose("Server", START)
        self.assert_runs()
        self.main.choose("Server", STOP)
        self.assert_stopped()

    def test_is_started_and_stopped_by_keys(self):
        self.main.press("ctrl+r")
        self.assert_runs()
        self.main.press("ctrl+r")
        self.assert_stopped()

    def test_is_started_by_a_restart(self):
        self.main.button(RESTART).click()
        self.assert_runs()

    def test_that_somebody_else_started_is_left_running(self):
        machine.systemctl("start")
        pid = machine.server_pid()
        self.main.button(START).click()
        self.message("Information", "DHCP-server already running").answer("OK")
        self.assert_runs()
        self.assertEqual(machine.server_pid(), pid)

    def test_takes_one_command_at_a_time(self):
        with occupied_service_manager():
            self.main.button(START).click()
            self.wait(lambda: self.server_state == "Updating DHCP-server status...", "the start under way")
            self.assertFalse(self.main.button(START).is_enabled)
            self.main.press("ctrl+r")  # which does nothing while the command is disabled
            self.main.button(RESTART).click()
            self.message("Error", "Some operation with DHCP-server already executes").answer("OK")
            self.assertEqual(machine.server_command(), [])
        self.assert_runs()

    def test_that_refuses_the_configuration_can_be_started_when_that_is_mended(self):
        content = machine.CONFIGURATION.read_text()
        machine.CONFIGURATION.write_text(content + "subnet;\n")
        self.main.button(START).click()
        self.message("Error", FAILURE).answer("OK")
        self.assertIn("Active: failed", machine.systemctl("status").stdout)
        self.assert_stopped()

        machine.CONFIGURATION.write_text(content)
        self.main.button(START).click()
        self.assert_runs()

    def test_that_lacks_its_interface_is_not_started(self):
        machine.DEFAULTS.write_text('INTERFACESv4="eth9"\n')
        self.main.button(START).click()
        self.message("Error", FAILURE).answer("OK")
        self.assert_stopped()


class RunningServer(ServiceTest):
    def prepare(self):
        machine.systemctl("start")
        self.pid = machine.server_pid()

    def test_is_found(self):
        self.assert_runs()
        self.assertEqual(machine.server_pid(), self.pid)

    def test_is_restarted_by_the_tool_bar(self):
        self.main.button(RESTART).click()
        self.wait_for_other_server(self.pid)
        self.assert_runs()

    def test_is_restarted_by_the_menu(self):
        self.main.choose("Server", RESTART)
        self.wait_for_other_server(self.pid)
        self.assert_runs()

    def test_that_somebody_else_stopped_is_left_stopped(self):
        machine.systemctl("stop")
        self.main.button(STOP).click()
        self.message("Information", "DHCP-server already stopped").answer("OK")
        self.assert_stopped()

    def test_stops_when_it_refuses_the_configuration_in_a_restart(self):
        machine.CONFIGURATION.write_text("option domain-name;\n")
        self.main.button(RESTART).click()
        self.message("Error", FAILURE).answer("OK")
        self.assert_stopped()

    def test_that_died_can_be_started_again(self):
        os.kill(self.pid, signal.SIGKILL)
        self.wait(lambda: "active (running)" not in machine.systemctl("status").stdout, "a server that has died")
        self.main.button(STOP).click()
        self.message("Information", "DHCP-server already stopped").answer("OK")
        self.wait_for_server("stopped")  # although the service manager takes the service for active still
        self.assert_offers(START, RESTART)
        self.main.button(START).click()
        self.assert_runs()
