# SPDX-License-Identifier: GPL-3.0-or-later
"""What the tests of the commands of the topology tree's context menus have in common.

A test is a table of commands: where each is chosen, what its dialog shows and what is typed there, and the result in
the tree and in the file.
"""

import dataclasses
import difflib
import typing

import pyatspi

import desktop
import machine
from testcase import ProgramTest

# --- What the tree and the file hold


def tree_lines(text):
    """The lines of the indented text of a tree, each as a tuple of those that it stands under and itself."""
    way, lines = [], []
    for line in text.splitlines():
        label = line.lstrip()
        way[(len(line) - len(label)) // 4 :] = [label]
        lines.append(tuple(way))
    return lines


def file_lines(text):
    """The statements of a configuration, each as a tuple of the headings of the blocks that it is in and itself."""
    way, lines = [], []
    for line in map(str.strip, text.splitlines()):
        if line == "}":
            way.pop()
            continue
        words = line.removesuffix("{").strip()
        lines.append((*way, words))
        if line.endswith("{"):
            way.append(words)
    return lines


class Lines(typing.NamedTuple):
    """Statements, as the texts that the tree shows and that are in the file."""

    tree: str
    file: str


NOTHING = Lines("", "")


@dataclasses.dataclass(frozen=True)
class Place:
    """A declaration: the labels of the rows that lead to it, and the headings of its block in the file."""

    row: tuple
    block: tuple = ()

    def below(self, label, heading):
        return Place((*self.row, label), (*self.block, heading))

    def tree_lines(self, lines):
        return [self.row + line for line in tree_lines(lines.tree)]

    def file_lines(self, lines):
        return [self.block + line for line in file_lines(lines.file)]


def with_block(lines, block, others):
    """LINES, in which OTHERS stand instead of the first of BLOCK and what is below it."""
    at = lines.index(block[0])
    end = at + 1
    while end < len(lines) and lines[end][: len(block[0])] == block[0]:
        end += 1
    return lines[:at] + others + lines[end:]


# --- What is done in dialogs


def shown_in(dialog):
    """What stands in the fields of a dialog, by their names."""
    read = {
        pyatspi.ROLE_TEXT: lambda field: field.text,
        pyatspi.ROLE_SPIN_BUTTON: lambda field: field.text,
        pyatspi.ROLE_CHECK_BOX: lambda box: box.states & {"checked", "enabled"},
        pyatspi.ROLE_LIST: lambda view: [item.name for item in view.children],
        pyatspi.ROLE_TABLE: lambda table: table.labels(),
    }
    return {control.name: read[control.role](control) for control in dialog.below() if control.role in read}


def steps(*fills):
    """Does one after the other."""

    def fill(dialog):
        for step in fills:
            step(dialog)

    return fill


def fields(texts):
    """Types texts into the fields of the names."""

    def fill(dialog):
        for name, text in texts.items():
            dialog.field(name).enter(text)

    return fill


def addresses(*texts):
    """Adds addresses to a list."""

    def fill(dialog):
        (view,) = dialog.all(pyatspi.ROLE_LIST)
        for text in texts:
            number = len(view.children)
            dialog.button("Add").click()
            ip = dialog.program.window("Add IP")
            ip.field("IP:").enter(text)
            ip.button("Save").click()
            ip.wait_closed()
            dialog.program.wait(lambda n=number: len(view.children) == n + 1, lambda: f"{text} in {view}")

    return fill


def without_first(role):
    """Takes the first address out of a list, or the first route out of a table."""

    def fill(dialog):
        (view,) = dialog.all(role)
        entries = view.cells if role == pyatspi.ROLE_TABLE else lambda: view.children
        number = len(entries())
        entries()[0].click()
        dialog.button("Remove").click()
        dialog.program.wait(lambda: len(entries()) < number, lambda: f"less in {view}")

    return fill


def routes(*rows, ms=False):
    """Adds routes to a table, each the texts of its cells."""

    def fill(dialog):
        table = dialog.find(pyatspi.ROLE_TABLE, "Static routes")
        for cells in rows:
            row = len(table.cell_rows())
            dialog.button("Add").click()
            dialog.program.wait(lambda n=row: len(table.cell_rows()) == n + 1, lambda: f"one more row in {table}")
            for column, text in enumerate(cells):
                cell(row, column, text)(dialog)
        if ms:
            dialog.find(pyatspi.ROLE_CHECK_BOX, "Route for MS systems").click()

    return fill


def cell(row, column, text):
    """Types into a cell of a table."""

    def fill(dialog):
        table = dialog.find(pyatspi.ROLE_TABLE, "Static routes")
        place = table.cell_rows()[row][column]
        place.double_click()
        dialog.program.keys("ctrl+a")
        dialog.program.type(text)
        dialog.program.keys("Return")
        dialog.program.wait(lambda: place.name == text, lambda: f"{text!r} in {table.labels()}")

    return fill


def file(folder, name):
    """Chooses a file in the folder that a file dialog shows at first."""

    def fill(dialog):
        dialog.find(pyatspi.ROLE_COMBO_BOX, folder)
        files = dialog.find(pyatspi.ROLE_TREE, "Files")

        def found():
            return [cell for cell in files.cells() if cell.name == name]

        dialog.program.wait(found, lambda: f"{name} among {files.cells()}")[0].click()
        dialog.program.wait(lambda: dialog.field("File name:").text == name, lambda: f"the name of {name}")

    return fill


# --- The commands


class Question(typing.NamedTuple):
    """What is asked before a dialog opens."""

    title: str
    text: str


ADVANCED = Question(
    "Warning!",
    "This editing mode for advanced users.\n"
    "After applying this changes configuration may be incorrect.\n"
    "Do you want to resume?",
)


@dataclasses.dataclass(frozen=True)
class Dialog:
    """A dialog: what it shows at first (none for one of the toolkit's), how it is filled, what accepts it."""

    title: str
    shown: dict
    fill: typing.Callable
    button: str = "Save"
    question: Question = None


def form(title, shown, texts, **options):
    """A dialog with fields only."""
    return Dialog(title, shown, fields(texts), **options)


def words_form(title, name, shown, text):
    """The form for a statement's words."""
    return form(title, {name: shown}, {name: text}, question=ADVANCED)


def time_form(title, shown, texts):
    """The form for times, which shows numbers with their units from months to seconds."""
    return form(title, dict(zip(("Mounth:", "Days:", "Hours", "Minutes", "Seconds"), shown)), texts)


def parameter(*entries):
    """The way to an entry of the submenu for parameters."""
    return ("Add parameter", *entries)


def option(*entries):
    """The way to an entry of the submenu for options, which is in that for parameters."""
    return parameter("Add option", *entries)


CHANGES = {("Edit",), ("Remove",)}  # what every menu but the network's offers

# --- Places in the sites of several tests

ROOT = Place(("All network",))
SUBNET = ROOT.below("Subnet: 10.1.0.0 / 255.255.255.0", "subnet 10.1.0.0 netmask 255.255.255.0")
GROUP = ROOT.below("Group: printers", "group printers")

# --- Running commands


def changes(before, after):
    """The lines that are gone and those that have come."""
    return "\n".join(
        difflib.unified_diff(*([" > ".join(line) for line in lines] for lines in (before, after)), lineterm="")
    )


class CommandTest(ProgramTest):
    """Runs commands one after the other in one program. The result is saved in the end and checked by the server."""

    SITE = ""

    def prepare(self):
        machine.CONFIGURATION.write_text(self.SITE)

    def start(self):
        super().start()
        self.topology = self.tree
        self.lines = self.shown_lines()
        self.file = file_lines(self.SITE)

    def shown_lines(self):
        return tree_lines("\n".join(self.topology.lines()))

    def offered(self, menu):
        """The entries of an open menu and its submenus, each with the way to it."""
        found = set()
        for entry in menu.children:
            if any(child.role == desktop.MENU for child in entry.children):
                found |= {(entry.name, *way) for way in self.offered(menu.submenu(entry.name))}
            elif entry.role != pyatspi.ROLE_SEPARATOR:
                found.add((entry.name,))
        self.program.keys("Escape")
        self.wait(lambda: not menu.is_showing, f"{menu} closed")
        return found

    def open(self, dialog):
        """The dialog, after the question that may come before it."""
        if dialog.question:
            self.question(dialog).answer("Yes")
        window = self.program.window(dialog.title)
        if dialog.shown is not None:
            self.assertEqual(shown_in(window), dialog.shown)
        return window

    def question(self, dialog):
        return self.message(*dialog.question, buttons=["Yes", "No"], default="Yes")

    def cancel(self, dialog, command):
        """Gives up what COMMAND opens, wherever that can be."""
        if dialog.question:
            command()
            self.question(dialog).answer("No")
        command()
        window = self.open(dialog)
        dialog.fill(window)
        window.button("Cancel").click()
        window.wait_closed()
        self.assertEqual(self.shown_lines(), self.lines)

    def accept(self, dialog):
        window = self.open(dialog)
        dialog.fill(window)
        window.button(dialog.button).click()
        window.wait_closed()

    def expect(self, fits):
        """The tree comes to hold lines that fit."""

        def fitting():
            lines = self.shown_lines()
            return lines if fits(lines) else None

        self.lines = self.program.wait(
            fitting, lambda: "lines that fit, of\n" + changes(self.lines, self.shown_lines())
        )

    def expect_added(self, lines):
        """The tree comes to hold these lines as well, in their order."""
        # What is below a new declaration is not shown before one opens its branch.
        for line, following in zip(lines, lines[1:]):
            if following[:-1] == line and not self.topology.row(*line).is_expanded:
                self.topology.row(*line).click()
                self.main.press("Right")

        def fits(shown):
            new = [line for line in shown if line not in self.lines]
            old = [line for line in shown if line in self.lines]
            return new == lines and old == self.lines

        self.expect(fits)

    def save(self):
        """Saves. What the file holds then, which the server must accept and the tree must show."""
        super().save()
        self.assertEqual(self.shown_lines(), self.lines)
        return file_lines(machine.CONFIGURATION.read_text())
