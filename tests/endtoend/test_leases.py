# SPDX-License-Identifier: GPL-3.0-or-later
"""The table of leases, which follows the server's file, and the search in it."""

import datetime
import ipaddress
import re

import pyatspi

import machine
from testcase import ProgramTest


def lease(address, mac, host_name, state="active", ends="2036/02/03 04:05:06"):
    """A block of the lease file, laid out as by the server."""
    return f"""\
lease {address} {{
  starts 5 2026/11/20 07:08:09;
  ends 6 {ends};
  cltt 5 2026/11/20 07:08:09;
  binding state {state};
  next binding state free;
  rewind binding state free;
  hardware ethernet {mac};
  client-hostname "{host_name}";
}}
"""


def shown_time(word):
    """What the table says for a time of the file."""
    time = datetime.datetime.strptime(word, "%Y/%m/%d %H:%M:%S")
    return f"{time:%H:%M:%S} UTC {time.day} {time:%b %Y}"


def as_it_stands(word):
    return word


# What the table shows of a lease besides its address: what is before it in a line of the file, and how it is shown.
FIELDS = [
    ("hardware ethernet ", as_it_stands),
    ("client-hostname ", lambda word: word.strip('"')),
    ("binding state ", as_it_stands),
    (r"starts \d ", shown_time),
    (r"ends \d ", shown_time),
]


def rows_of_file():
    """What the table must show of the file: the last block of each address, in the order of the addresses.

    What a block lacks is shown as in the block before.
    """
    rows, fields = {}, [""] * len(FIELDS)
    blocks = re.findall(r"^lease (\S+) \{$(.*?)^\}$", machine.LEASES.read_text(), re.DOTALL | re.MULTILINE)
    for address, block in blocks:
        for i, (key, shown) in enumerate(FIELDS):
            if match := re.search(f"^  {key}(.*);$", block, re.MULTILINE):
                fields[i] = shown(match[1])
        rows[address] = [address, *fields]
    return [rows[address] for address in sorted(rows, key=ipaddress.ip_address)]


def is_red(red, green, blue):
    return red > 200 and max(green, blue) < 90


class LeasesTest(ProgramTest):
    def show_leases(self):
        self.main.find(pyatspi.ROLE_PAGE_TAB, "Leases").click()
        self.table = self.main.find(pyatspi.ROLE_TABLE, "Leases")
        self.search = self.main.find(pyatspi.ROLE_TEXT, "Search")
        self.previous = self.main.button("Previous match")
        self.next = self.main.button("Next match")

    def addresses(self):
        return [row.texts[0] for row in self.table.rows]

    def current(self):
        """The address of the current row and the text of its current cell; None when no row is current."""
        cells = [(row.texts[0], cell.name) for row in self.table.rows for cell in row.cells if cell.has("focused")]
        return cells[0] if cells else None

    def selected(self):
        return [cell.name for row in self.table.rows for cell in row.cells if cell.has("selected")]

    def wait_for_addresses(self, *addresses):
        self.wait(lambda: self.addresses() == list(addresses), f"only {addresses}")


class LeaseFile(LeasesTest):
    """A server that is stopped leaves its file to the tests."""

    LEASES = {
        "192.0.2.9": ("00:00:5e:00:53:09", "Phone-anna"),
        "192.0.2.10": ("00:00:5e:00:53:0a", "phone-boris"),
        "192.0.2.101": ("00:00:5e:00:53:65", "door"),
        "198.51.100.1": ("00:00:5e:00:53:f1", "phone-192.0.2.10", "free"),
        "198.51.100.20": ("00:00:5e:00:53:f2", "scanner phone", "backup", "2036/02/28 04:05:06"),
    }

    def prepare(self):
        blocks = [lease(address, *rest) for address, rest in self.LEASES.items()]
        blocks = [lease("192.0.2.9", "00:00:5e:00:53:ff", "former", "expired"), *reversed(blocks)]
        machine.LEASES.write_text("".join(blocks))

    def start(self):
        super().start()
        self.show_leases()

    # --- What is shown

    def test_is_shown_in_the_order_of_the_addresses(self):
        self.assertEqual(
            self.table.headers,
            ["IP address", "MAC address", "Host name", "Binding state", "Rental start", "Rental end"],
        )
        self.assertEqual([row.texts for row in self.table.rows], rows_of_file())
        self.assertEqual(self.addresses(), list(self.LEASES))
        self.assertEqual(
            self.table.rows[0].texts,
            [
                "192.0.2.9",
                "00:00:5e:00:53:09",
                "Phone-anna",
                "active",
                "07:08:09 UTC 20 Nov 2026",
                "04:05:06 UTC 3 Feb 2036",
            ],
        )

    def test_is_followed_when_it_is_appended_to_replaced_and_taken_away(self):
        with machine.LEASES.open("a") as file:
            file.write(lease("192.0.2.50", "00:00:5e:00:53:50", "appended"))
        self.wait(lambda: self.table.row("appended"), "the new lease")
        self.assertEqual([row.texts for row in self.table.rows], rows_of_file())

        self.replace_file(lease("203.0.113.1", "00:00:5e:00:53:01", "replaced"))
        self.wait_for_addresses("203.0.113.1")

        with machine.LEASES.open("a") as file:
            file.write(lease("203.0.113.2", "00:00:5e:00:53:02", "appended"))
        self.wait_for_addresses("203.0.113.1", "203.0.113.2")

        machine.LEASES.unlink()
        self.wait_for_addresses()

        machine.LEASES.write_text(lease("203.0.113.3", "00:00:5e:00:53:03", "again"))
        self.wait_for_addresses("203.0.113.3")

    def test_is_read_again_by_command_without_a_question(self):
        commands = {
            "F5": lambda: self.main.press("F5"),
            "menu": lambda: self.main.choose("File", "Reload"),
            "tool bar": lambda: self.main.button("Reload").click(),
            "tab": lambda: (self.main.find(pyatspi.ROLE_PAGE_TAB, "Topology").click(), self.show_leases()),
        }
        for name, command in commands.items():
            with self.case(command=name):
                self.table.row("door").click()
                self.wait(lambda: self.current() == ("192.0.2.101", "192.0.2.101"), "the chosen row")
                command()
                self.wait(lambda: not self.current(), "a table that has been filled anew")
                self.assertEqual(self.addresses(), list(self.LEASES))

    # --- Searching

    def test_is_searched_in_every_column(self):
        for text, shown, current, has_matches in [
            ("192.0.2.10", ["192.0.2.10", "192.0.2.101", "198.51.100.1"], ("192.0.2.10", "192.0.2.10"), True),
            ("53:f", ["198.51.100.1", "198.51.100.20"], ("198.51.100.1", "00:00:5e:00:53:f1"), True),
            ("phone", ["192.0.2.10", "198.51.100.1", "198.51.100.20"], ("192.0.2.10", "phone-boris"), True),
            ("Phone", ["192.0.2.9"], ("192.0.2.9", "Phone-anna"), True),
            ("scanner p", ["198.51.100.20"], ("198.51.100.20", "scanner phone"), True),
            ("backup", ["198.51.100.20"], ("198.51.100.20", "backup"), True),
            ("28 Feb", ["198.51.100.20"], ("198.51.100.20", "04:05:06 UTC 28 Feb 2036"), True),
            ("former", [], None, False),
            ("PHONE", [], None, False),
            (".*", [], None, False),
        ]:
            with self.case(text=text):
                self.search.enter(text)
                self.wait_for_addresses(*shown)
                self.assertEqual(self.current(), current)
                self.assertEqual(self.selected(), [current[1]] if current else [])
                self.assert_steps(has_matches)
                self.wait_for_red(not has_matches)

    def test_is_stepped_through_without_a_turn(self):
        first = "192.0.2.10", "phone-boris"
        second = "198.51.100.1", "phone-192.0.2.10"
        third = "198.51.100.20", "scanner phone"
        self.search.enter("phone")
        self.step_through(
            first,
            (self.previous, first),
            (self.next, second),
            (self.next, third),
            (self.next, third),
            (self.previous, second),
            (self.previous, first),
            (self.previous, first),
            (self.next, second),
        )

    def test_is_stepped_through_in_the_first_column_with_the_text(self):
        first, second = ("192.0.2.10", "192.0.2.10"), ("192.0.2.101", "192.0.2.101")
        self.search.enter("192.0.2.10")
        self.wait_for_addresses("192.0.2.10", "192.0.2.101", "198.51.100.1")
        self.step_through(first, (self.next, second), (self.next, second), (self.previous, first))

    def step_through(self, first, *steps):
        """Clicks the buttons of the steps; each must lead to the match that is with it."""
        self.assertEqual(self.current(), first)
        for button, match in steps:
            button.click()
            self.wait(lambda: self.current() == match, f"{match} after {button}")
            self.assertEqual(self.selected(), [match[1]])

    def test_is_shown_whole_when_the_search_is_cleared(self):
        def by_keys():
            self.search.focus()
            self.program.keys("ctrl+a", "BackSpace")

        def by_the_button():
            self.search.find(pyatspi.ROLE_PUSH_BUTTON, "Clear the search").click()

        for clear in (by_keys, by_the_button):
            for text in ("door", "nothing"):
                with self.case(clear=clear.__name__, text=text):
                    self.search.enter(text)
                    self.wait_for_addresses(*(["192.0.2.101"] if text == "door" else []))
                    clear()
                    self.wait_for_addresses(*self.LEASES)
                    self.assertEqual(self.search.text, "")
                    self.assert_steps(False)

    def test_keeps_the_search_while_it_is_followed(self):
        self.search.enter("phone")
        self.next.click()
        self.wait(lambda: self.current() == ("198.51.100.1", "phone-192.0.2.10"), "the second match")
        with machine.LEASES.open("a") as file:
            file.write(lease("192.0.2.2", "00:00:5e:00:53:02", "phone-of-a-guest"))
            file.write(lease("192.0.2.3", "00:00:5e:00:53:03", "display"))
        self.wait_for_addresses("192.0.2.2", "192.0.2.10", "198.51.100.1", "198.51.100.20")
        self.assertEqual(self.current(), ("198.51.100.1", "phone-192.0.2.10"))
        self.assertEqual(self.search.text, "phone")
        self.wait_for_red(False)

    def test_keeps_the_search_when_it_is_replaced(self):
        self.search.enter("phone")
        self.next.click()
        self.wait(lambda: self.current() == ("198.51.100.1", "phone-192.0.2.10"), "the second match")
        self.replace_file(
            lease("192.0.2.1", "00:00:5e:00:53:01", "display"),
            lease("192.0.2.2", "00:00:5e:00:53:02", "phone-of-a-guest"),
            lease("192.0.2.3", "00:00:5e:00:53:03", "scales"),
            lease("198.51.100.1", "00:00:5e:00:53:f1", "phone-192.0.2.10"),
        )
        self.wait_for_addresses("192.0.2.2", "198.51.100.1")
        self.assertEqual(self.current(), ("198.51.100.1", "phone-192.0.2.10"))

    def test_keeps_a_search_without_matches_while_it_is_followed(self):
        self.search.enter("guest")
        self.wait_for_red(True)
        with machine.LEASES.open("a") as file:
            file.write(lease("192.0.2.2", "00:00:5e:00:53:02", "phone-of-a-guest"))
        self.wait_for_addresses("192.0.2.2")
        self.wait_for_red(True)  # a new search is made by typing only
        self.assert_steps(False)

    def assert_steps(self, enabled):
        self.assertEqual([button.is_enabled for button in (self.previous, self.next)], [enabled] * 2)

    def replace_file(self, *blocks):
        """Does it as the server does, which keeps the old file under another name."""
        machine.LEASES.rename(machine.LEASES.with_name("dhcpd.leases~"))
        machine.LEASES.write_text("".join(blocks))

    def wait_for_red(self, expected):
        """Whether what stands in the search field, between its buttons, is red."""
        x, y, width, height = self.search.box
        margin = 30
        text = (x + margin, y, width - 2 * margin, height)
        self.wait(
            lambda: any(is_red(*pixel) for pixel in self.program.display.pixels(text)) == expected,
            "a red text" if expected else "a text that is not red",
        )


class Server(LeasesTest):
    """The leases that a running server gives."""

    CLIENTS = [
        ("02:00:00:00:30:01", "lab0", "node-01"),
        ("02:00:00:00:30:02", "lab0", "node-02"),
        ("02:00:00:00:64:01", "wlan0", "annas-phone"),
    ]

    def prepare(self):
        machine.systemctl("start")

    def test_leases_come_and_go_in_the_table(self):
        self.show_leases()
        clients = [self.client(*client) for client in self.CLIENTS]
        for client in clients:
            self.wait_for_address(client)
        self.wait(lambda: [row.texts for row in self.table.rows] == rows_of_file(), "the leases of the file")
        self.assertEqual(
            sorted(row.texts[:4] for row in self.table.rows),
            sorted([client.address, client.mac, client.host_name, "active"] for client in clients),
        )

        clients[1].leave()
        self.wait(lambda: self.table.row(clients[1].mac).texts[3] == "free", "the lease given back")
        self.assertEqual([row.texts for row in self.table.rows], rows_of_file())

    def test_leases_leave_the_search_and_the_current_row_alone(self):
        clients = [self.client(*client) for client in self.CLIENTS]
        for client in clients:
            self.wait_for_address(client)
        self.show_leases()
        self.search.enter("node-")
        self.wait(lambda: len(self.addresses()) == 2, "the two nodes")
        self.next.click()
        current = self.table.rows[1].texts[0], self.table.rows[1].texts[2]
        self.wait(lambda: self.current() == current, "the second node")

        # Their addresses come before those.
        node = self.client("02:00:00:00:10:03", "lan0", "node-03")
        printer = self.client("02:00:00:00:10:04", "lan0", "printer")
        self.wait_for_address(printer)
        self.wait_for_address(node)
        self.wait(lambda: len(self.addresses()) == 3, "the third node")
        self.assertEqual(self.addresses()[0], node.address)
        self.assertEqual(self.current(), current)
        self.search.enter("printer")
        self.wait_for_addresses(printer.address)

    def test_leases_are_followed_when_the_server_replaces_its_file(self):
        first = self.client(*self.CLIENTS[0])
        self.wait_for_address(first)
        self.show_leases()
        self.wait_for_addresses(first.address)
        self.table.row(first.address).click()
        current = first.address, first.address
        self.wait(lambda: self.current() == current, "the first lease as the current one")
        before = machine.LEASES.stat().st_ino
        self.main.button("Restart DHCP-server").click()
        self.wait(lambda: machine.LEASES.stat().st_ino != before, "another file")
        self.wait_for_server("running")
        second = self.client(*self.CLIENTS[1])
        self.wait_for_address(second)
        self.wait(lambda: sorted(self.addresses()) == sorted([first.address, second.address]), "both leases")
        self.assertEqual(self.current(), current)
        self.assertEqual([row.texts for row in self.table.rows], rows_of_file())
