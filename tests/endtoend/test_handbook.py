# SPDX-License-Identifier: GPL-3.0-or-later
"""The handbook: its commands and examples, each in the situation that its page speaks of, and its window."""

import pathlib
import re
import shutil
import socket
import subprocess
import tempfile
import unittest

import pyatspi

import machine
from testcase import ProgramTest

PAGES = sorted((machine.ROOT / "docs" / "handbook" / "en").glob("*.md"))  # the code of the German ones is the same
CODE = {"sh", "dhcpd", "named"}  # what it is written in
UNNAMED_VERSION = "etc+dhcp+dhcpd.conf.20261121T014800.123456Z"  # which readers replace by that of theirs


def blocks(language, text):
    return re.findall(rf"^```{language}\n(.*?)^```$", text, re.MULTILINE | re.DOTALL)


def commands(block):
    """The results of the commands, which are one a line."""
    return [machine.run("bash", "-c", line) for line in block.splitlines()]


class PageTest:
    """A test of each page with code is called like it: test_first_start is that of 1-first-start.md."""

    @property
    def page(self):
        name = self._testMethodName.removeprefix("test_").replace("_", "-")
        (page,) = (page for page in PAGES if page.stem.partition("-")[2] == name)
        return page.read_text()

    def blocks(self, language):
        return blocks(language, self.page)

    def outputs(self, block, expected=()):
        """What the commands print. They succeed, or end with the expected status."""
        results = commands(block)
        status = [result.returncode for result in results]
        self.assertEqual(status, list(expected) or [0] * len(results), results)
        return [result.stdout for result in results]

    def quoted(self, text):
        """A text that the page quotes word for word."""
        self.assertIn(text, re.sub(r"\s+", " ", self.page))
        return text


class Commands(PageTest, unittest.TestCase):
    """On the machine alone."""

    def setUp(self):
        machine.reset()

    def assert_accepted(self, content):
        machine.CONFIGURATION.write_text(content)
        self.assertEqual(machine.verdict(), "")

    def status(self, block):
        """What the command for the status prints, which fails for a server that is stopped."""
        (output,) = self.outputs(block, [3])
        return output

    def test_first_start(self):
        machine.systemctl("start")
        (block,) = self.blocks("sh")
        _, status = self.outputs(block)
        self.assertIn("Active: active (running)", status)

    def test_new_subnet(self):
        (example,) = self.blocks("dhcpd")
        self.assert_accepted(example)

    def test_interfaces(self):
        machine.DEFAULTS.write_text('INTERFACESv4="lan0 lab0"\n')
        (block,) = self.blocks("sh")
        addresses, choice = self.outputs(block)
        self.assertRegex(addresses, r"(?m)^lan0@?\S* +UP +10\.20\.10\.1/24")
        self.assertEqual(choice, 'INTERFACESv4="lan0 lab0"\n')

    def test_server_does_not_start(self):
        self.refused_configuration()
        machine.reset()
        self.no_interface()
        machine.reset()
        self.other_server()

    def refused_configuration(self):
        check, _, _, status = self.blocks("sh")
        machine.CONFIGURATION.write_text(8 * "#\n" + "colour green;\n")
        self.assertEqual(machine.systemctl("start").returncode, 1)
        complaint = self.quoted("line 9: semicolon expected")
        self.assertIn(complaint, *self.outputs(check, [1]))
        self.assertIn(complaint, self.status(status))

    def no_interface(self):
        _, compare, _, status = self.blocks("sh")
        machine.DEFAULTS.write_text('INTERFACESv4="dmz0"\n')
        self.assertEqual(machine.systemctl("start").returncode, 1)
        addresses, subnets, choice = self.outputs(compare)
        self.assertIn("10.20.0.1/24", addresses)
        self.assertEqual(len(subnets.splitlines()), 4, subnets)
        self.assertIn("dmz0", choice)
        self.assertIn(self.quoted("Not configured to listen on any interfaces!"), self.status(status))

    def other_server(self):
        _, _, find, status = self.blocks("sh")
        with socket.socket(socket.AF_INET, socket.SOCK_DGRAM) as other:
            other.bind(("", 67))
            self.assertEqual(machine.systemctl("start").returncode, 1)
            self.assertIn(self.quoted("Can't bind to dhcp address: Address already in use"), self.status(status))
            self.assertRegex(*self.outputs(find), r":67 .*python")


class Restoring(PageTest, ProgramTest):
    """While the program is open."""

    def prepare(self):
        machine.systemctl("start")

    def test_earlier_version(self):
        before = machine.CONFIGURATION.read_text()
        self.tree.row("All network", "Default lease time: 2 minutes").double_click()
        dialog = self.program.window("Edit default lease time")
        dialog.field("Minutes").enter("3")
        dialog.button("Save").click()
        dialog.wait_closed()
        self.save()
        after = machine.CONFIGURATION.read_text()
        pid = machine.server_pid()

        (version,) = machine.backups()
        find, restore = (block.replace(UNNAMED_VERSION, version.name) for block in self.blocks("sh"))
        listing, difference = self.outputs(find, [0, 1])
        self.assertEqual(listing, version.name + "\n")
        self.assertIn("\n< default-lease-time 180;\n", difference)
        self.assertIn("\n> default-lease-time 120;\n", difference)
        self.outputs(restore)
        self.assertEqual(machine.CONFIGURATION.read_text(), before)
        self.assertEqual(machine.CONFIGURATION.with_name("dhcpd.conf.before").read_text(), after)
        self.assertTrue(machine.server_is_running())
        self.assertNotEqual(machine.server_pid(), pid)

        self.tree.row("All network", "Default lease time: 3 minutes")
        self.main.press("F5")
        self.reload_question().answer("Yes")
        self.tree.row("All network", "Default lease time: 2 minutes")


@unittest.skipUnless(
    shutil.which("named") and shutil.which("named-checkconf"),
    "bind9 is not there (scripts/fetch-tools, package bind9-utils)",
)
class DynamicDns(PageTest, ProgramTest):
    """With the real bind9, whose files and port are those of the private network."""

    SUBNET = "subnet 10.20.30.0 netmask 255.255.255.0 {\n    range 10.20.30.50 10.20.30.99;\n}\n"
    OPTIONS = """\
options {{
    directory "{folder}";
    pid-file none;
    session-keyfile none;
    listen-on {{ 127.0.0.1; }};
    listen-on-v6 {{ none; }};
    recursion no;
}};
include "{local}";
"""
    ZONE = "@ 300 SOA ns.example.org. root.example.org. 1 300 300 300 300\n@ 300 NS ns.example.org.\n"

    def prepare(self):
        machine.CONFIGURATION.write_text(self.SUBNET)
        machine.DEFAULTS.write_text('INTERFACESv4="lab0"\n')

    def configure_bind9(self):
        """As the page has it, but for the folder of the zones, which a private network does not have."""
        make_key, check = self.blocks("sh")
        (zones,) = self.blocks("named")
        (key,) = self.outputs(make_key)
        folder = pathlib.Path(tempfile.mkdtemp())
        local = pathlib.Path("/etc/bind/named.conf.local")
        local.write_text(key + zones.replace(";", "", 1))
        self.outputs(check, [1])
        local.write_text(key + zones.replace("/var/lib/bind", str(folder)))
        self.assertEqual(self.outputs(check), [""])

        for name in re.findall('file "/var/lib/bind/(.*)"', zones):
            (folder / name).write_text(self.ZONE)
        (folder / "named.conf").write_text(self.OPTIONS.format(folder=folder, local=local))
        return folder

    def start_bind9(self, folder):
        log = folder / "log"
        command = ["named", "-g", "-c", str(folder / "named.conf")]
        with log.open("w") as output:
            bind9 = subprocess.Popen(command, stdin=subprocess.DEVNULL, stdout=output, stderr=output)
        self.addCleanup(bind9.wait)
        self.addCleanup(bind9.terminate)
        self.program.wait(lambda: re.search(r" running$", log.read_text(), re.MULTILINE), log.read_text)

    def test_dynamic_dns(self):
        self.start_bind9(self.configure_bind9())

        menu = self.tree.row("All network").context_menu()
        menu.choose("Add parameter", "Add option", "Add DHCP dynamic zone update")
        self.program.window("Information").answer("Yes")
        dialog = self.program.window("Choose the bind9 configuration with the update key")
        self.program.type("named.conf.local")
        dialog.press("Return")
        dialog.wait_closed()
        self.tree.row("All network", "Zone served by DNS server: 30.20.10.in-addr.arpa.")

        (parameters,) = self.blocks("dhcpd")
        for parameter in parameters.splitlines():
            self.tree.row("All network").context_menu().choose("Add parameter", "Add arbitrary parameter")
            self.program.window("Warning!").answer("Yes")
            dialog = self.program.window("Add arbitrary parameter")
            dialog.field("Parameter:").enter(parameter.rstrip(";"))
            dialog.button("Save").click()
            dialog.wait_closed()
        self.save()
        self.main.button("Restart DHCP-server").click()
        self.wait_for_server("running")

        address = self.wait_for_address(self.client("02:00:00:00:30:0a", "lab0", "desk"))
        name, number = "desk.lab.example.org.", address.rpartition(".")[2]
        for added in (
            f"Added new forward map from {name} to {address}",
            f"Added reverse map from {number}.30.20.10.in-addr.arpa. to {name}",
        ):
            self.program.wait(lambda text=added: text in machine.server_log(), machine.server_log)


class Pages(unittest.TestCase):
    def test_have_their_code_tested(self):
        tests = {name for kind in (Commands, Restoring, DynamicDns) for name in vars(kind)}
        with_code = [page for page in PAGES if "```" in page.read_text()]
        self.assertGreaterEqual(len(with_code), 6)
        for page in with_code:
            self.assertIn("test_" + page.stem.partition("-")[2].replace("-", "_"), tests)

    def test_have_code_in_known_languages(self):
        for page in PAGES:
            languages = re.findall(r"^```(.*)$", page.read_text(), re.MULTILINE)
            self.assertLessEqual(set(languages[::2]), CODE, page)
            self.assertEqual(set(languages[1::2]) - {""}, set(), page)

    def test_have_commands_in_blocks_only(self):
        """So that none is missed here."""
        for page in PAGES:
            text = page.read_text()
            for code in re.findall(r"`([^`\n]+)`", re.sub(r"(?ms)^```.*?^```$", "", text)):
                is_command = " " in code and shutil.which(code.split()[0])
                self.assertFalse(is_command, f"{page.name}: {code}")


class WindowTest(ProgramTest):
    def open(self, menu, title):
        self.main.choose(menu, title)
        return self.program.window(title)

    def assert_shows(self, handbook, title):
        page = handbook.find(pyatspi.ROLE_LABEL, title)
        self.assertTrue(page.text.startswith(title + "\n"), page.text)


class Window(WindowTest):
    def test_leads_through_the_pages(self):
        handbook = self.open("Help", "Handbook")
        self.assert_shows(handbook, "First start")
        (entry,) = (item for item in handbook.find(pyatspi.ROLE_LIST, "Contents").children if item.name == "Interfaces")
        entry.click()
        self.assert_shows(handbook, "Interfaces")
        handbook.button("Back").click()
        self.assert_shows(handbook, "First start")
        handbook.field("Search").enter("hmac-sha256")
        handbook.press("Return")
        self.assert_shows(handbook, "Dynamic DNS with bind9")
        handbook.button("Close").click()
        handbook.wait_closed()

    def test_leaves_the_main_window_in_use(self):
        self.open("Help", "Handbook")
        self.main.press("ctrl+Tab")
        self.main.find(pyatspi.ROLE_TABLE, "Leases")


class GermanWindow(WindowTest):
    def start(self):
        self.launch(LANGUAGE="de")
        self.main = self.program.window("DHCP-Server konfigurieren")

    def test_is_in_german(self):
        self.assert_shows(self.open("Hilfe", "Handbuch"), "Der erste Start")
