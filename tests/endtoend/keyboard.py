# SPDX-License-Identifier: GPL-3.0-or-later
"""Using the program with the keyboard alone."""

import contextlib
import typing

import pyatspi

import desktop

RIGHT_BUTTON = 3
VIEWS = (*desktop.VIEWS, pyatspi.ROLE_LIST)
FOCUS = "object:state-changed:focused"
MOST_STEPS = 20  # more than any window has fields and buttons
CELLS = (pyatspi.ROLE_TABLE_CELL, pyatspi.ROLE_LIST_ITEM)


class Focused(typing.NamedTuple):
    """What had the keyboard, which may have gone since."""

    name: str
    path: str
    parent_path: str


class Keyboard:
    """The hands on the keyboard: does by keys what a click does, wherever the keyboard is at first.

    MENU_KEY opens context menus, PRESS_KEY presses buttons, and EDIT_KEY edits a row of a tree.
    """

    def __init__(self, menu_key="Menu", press_key="Return", edit_key="F2"):
        self.menu_key = menu_key
        self.press_key = press_key
        self.edit_key = edit_key
        self.context_menu = None  # the path of the last one opened, in which no entry is current at first
        self.focused = []  # what has got the keyboard, the last one last
        pyatspi.Registry.registerEventListener(self.note_focus, FOCUS)

    def leave(self):
        pyatspi.Registry.deregisterEventListener(self.note_focus, FOCUS)

    def note_focus(self, event):
        with contextlib.suppress(*desktop.GONE):
            if event.detail1 and event.source:
                self.focused.append(Focused(str(event.source), event.source.path, event.source.parent.path))

    def bring_in_sight(self, cell, view):
        """Views follow the keyboard by themselves."""

    def click(self, control, button, count):
        program = control.program
        if isinstance(control, desktop.MenuEntry):
            self.choose(control)
        elif control.role == pyatspi.ROLE_MENU_ITEM:
            self.open_from_bar(control)
        elif control.role == pyatspi.ROLE_PAGE_TAB:
            self.turn_to(control)
        elif control.role in CELLS:
            self.go_to_cell(control)
            if button == RIGHT_BUTTON:
                program.keys(self.menu_key)
                self.context_menu = program.menu().path
            elif count == 2:
                program.keys(self.edit_key if control.parent.role == pyatspi.ROLE_TREE else "F2")
        else:
            self.tab_to(control)
            if control.role == pyatspi.ROLE_PUSH_BUTTON:
                program.keys(self.press_key)
            elif control.role == pyatspi.ROLE_CHECK_BOX:
                program.keys("space")

    # --- Where the keyboard is

    @staticmethod
    def window(control):
        window = desktop.Window(control.program, control.window.accessible)
        window.take_keyboard()
        return window

    def has_keyboard(self, control):
        """Whether the control, or the current cell of a view, has it. The toolkit gives views themselves no states."""
        if control.role in VIEWS:
            return bool(self.focused) and control.path in self.focused[-1][1:]
        return control.has("focused")

    def tab_to(self, control):
        """Presses Tab until the control has the keyboard, once through the window at most."""
        program = control.program
        self.window(control)
        program.listen()
        steps = 0
        while not self.has_keyboard(control):
            if steps == MOST_STEPS:
                way = [focused.name for focused in self.focused[-steps:]]
                raise AssertionError(f"Tab does not lead to {control}, but through {way}")
            steps += 1
            before = len(self.focused)
            program.keys("Tab")
            program.wait(lambda n=before: len(self.focused) > n, lambda: f"a step by Tab on the way to {control}")

    def turn_to(self, tab):
        """Brings a tab to the front, of which the toolkit says that it has the keyboard then."""
        self.window(tab)
        if not tab.has("focused"):
            tab.program.keys("ctrl+Tab")
            tab.program.wait(lambda: tab.has("focused"), lambda: f"{tab} in front")

    # --- In views

    def go_to_cell(self, cell):
        """Makes the cell current and selects it, with the arrow keys."""
        program, view = cell.program, cell.parent
        self.tab_to(view)
        cells = view.cell_rows() if view.role in desktop.VIEWS else [[item] for item in view.children]
        for keys, axis in ((("Down", "Up"), 0), (("Right", "Left"), 1)):
            steps = self.place(cells, cell)[axis] - self.current(program, cells)[axis]
            if steps:
                program.keys(*[keys[0] if steps > 0 else keys[1]] * abs(steps))
        program.wait(lambda: cell.has("focused"), lambda: f"{cell} current in {view}")
        if not cell.has("selected"):
            self.select(cell, view)

    @staticmethod
    def select(cell, view):
        """Selects the current cell, which typing does not where it would begin an edit."""
        cell.program.keys(*["Right", "Left"] if view.role == pyatspi.ROLE_TABLE else ["space"])
        cell.program.wait(lambda: cell.has("selected"), lambda: f"{cell} selected in {view}")

    @staticmethod
    def place(cells, wanted):
        """The row and column of a cell. The toolkit has a new object for a cell each time, but always at its place."""
        box = wanted.box
        return next((y, x) for y, row in enumerate(cells) for x, cell in enumerate(row) if cell.box == box)

    def current(self, program, cells):
        def found():
            return [cell for row in cells for cell in row if cell.has("focused")]

        return self.place(cells, program.wait(found, lambda: f"a current one of {cells}")[0])

    # --- In menus

    @staticmethod
    def open_from_bar(entry):
        """Opens a menu of the menu bar; only the first needs an accelerator."""
        Keyboard.window(entry)
        entries = [child.path for child in entry.parent.children]
        entry.program.keys("alt+f", *["Right"] * entries.index(entry.path))

    def choose(self, entry):
        """Goes down to an entry and chooses it."""
        menu = entry.menu
        usable = [child for child in menu.children if child.role != pyatspi.ROLE_SEPARATOR and child.is_enabled]
        steps = [child.path for child in usable].index(entry.path) + (menu.path == self.context_menu)
        entry.program.keys(*["Down"] * steps, "Return")
