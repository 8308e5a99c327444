# SPDX-License-Identifier: GPL-3.0-or-later
"""The program on the desktop, as a person and a screen reader have it.

What is shown is found and read through the accessibility bus; whatever is done is done by real events of the mouse and
the keyboard. Nothing waits for a fixed time: every step waits until it can be taken, and fails the test with what was
seen instead when that does not happen. A window that nobody expected fails it at once.
"""

import contextlib
import functools
import os
import pathlib
import re
import signal
import subprocess
import tempfile
import time

import pyatspi
import Xlib.display
import Xlib.error
import Xlib.ext.xtest
import Xlib.protocol.event
from gi.repository import Atspi, Gio, GLib

MAIN_TITLE = "Configure DHCP server"
PATIENCE = 90  # seconds until what never comes fails the test
POLL = 0.02  # seconds between two looks
DOUBLE_CLICK = 0.5  # seconds within which a second click at the same place would be one

# The roles of menus, of what is typed into, and of what is never searched for controls since it may have a million.
# Roles are compared as numbers everywhere: what they are called depends on the version of the accessibility libraries.
MENU = pyatspi.ROLE_POPUP_MENU
FIELDS = (pyatspi.ROLE_TEXT, pyatspi.ROLE_SPIN_BUTTON)
VIEWS = (pyatspi.ROLE_TREE, pyatspi.ROLE_TABLE)

PRESS = "Press"  # the name of the action of whatever does something when it is pressed

# What is raised by looking at something that has just gone, or is not there yet. What has gone has no interfaces.
GONE = (GLib.Error, LookupError, NotImplementedError, subprocess.CalledProcessError, Xlib.error.XError)


def xdotool(*arguments):
    """Its output; a failure is an exception."""
    command = ["xdotool", *map(str, arguments)]
    return subprocess.run(command, check=True, stdin=subprocess.DEVNULL, capture_output=True, text=True).stdout


def wait_for_answers(seconds=PATIENCE):
    """For how long an answer is waited for; what does not come in time is read as nothing, without a word."""
    Atspi.set_timeout(seconds * 1000, -1)  # a program that has just started gets no more


wait_for_answers()


def accessibility_bus():
    """Its address. The session's bus starts it when it is asked for."""
    session = Gio.bus_get_sync(Gio.BusType.SESSION)
    service = "org.a11y.Bus", "/org/a11y/bus", "org.a11y.Bus"
    answer = session.call_sync(*service, "GetAddress", None, None, Gio.DBusCallFlags.NONE, PATIENCE * 1000, None)
    return answer.unpack()[0]


class Box(tuple):
    """A place on the display: x, y, width and height."""

    @property
    def middle(self):
        x, y, width, height = self
        return x + width // 2, y + height // 2

    def contains(self, other):
        x, y, width, height = self
        other_x, other_y, other_width, other_height = other
        return (
            x <= other_x
            and other_x + other_width <= x + width
            and y <= other_y
            and other_y + other_height <= y + height
        )


class Display:
    """The display, where the windows are as others than the program see them."""

    def __init__(self):
        self.connection = Xlib.display.Display()
        self.root = self.connection.screen().root

    def advertise(self, bus):
        """Tells programs the accessibility bus. One that asks the session's bus may register there too early."""
        name, kind = (self.connection.intern_atom(name) for name in ("AT_SPI_BUS", "STRING"))
        self.root.change_property(name, kind, 8, bus.encode())
        self.connection.sync()

    def set_density(self, dpi):
        """Tells programs that start from now on how many pixels the display has to the inch."""
        resources, kind = (self.connection.intern_atom(name) for name in ("RESOURCE_MANAGER", "STRING"))
        self.root.change_property(resources, kind, 8, f"Xft.dpi:\t{dpi}\n".encode())
        self.connection.sync()

    def largest_window(self):
        """Its place; None when there is no window."""
        windows = self.root.query_tree().children
        boxes = [self.box_of(window) for window in windows if window.get_attributes().map_state == Xlib.X.IsViewable]
        return max(boxes, key=lambda box: box[2] * box[3], default=None)

    def window_at(self, box):
        """The uppermost window that has just this place."""
        for window in reversed(self.root.query_tree().children):
            if window.get_attributes().map_state == Xlib.X.IsViewable and self.box_of(window) == box:
                return window
        raise LookupError(f"no window at {box}")

    def box_below_mouse(self):
        """The place of the window that the mouse is over; None when it is over none."""
        window = self.root.query_pointer().child
        return self.box_of(window) if window else None

    def pixels(self, box):
        """The colours there, row by row: red, green and blue from 0 to 255."""
        x, y, width, height = box
        image = self.root.get_image(x, y, width, height, Xlib.X.ZPixmap, 0xFFFFFFFF)
        return [(red, green, blue) for blue, green, red, _ in zip(*[iter(image.data)] * 4)]

    def mouse(self):
        """Where it is."""
        pointer = self.root.query_pointer()
        return pointer.root_x, pointer.root_y

    def move_mouse(self, x, y):
        Xlib.ext.xtest.fake_input(self.connection, Xlib.X.MotionNotify, x=x, y=y)
        self.connection.sync()

    def click(self, button):
        for event in (Xlib.X.ButtonPress, Xlib.X.ButtonRelease):
            Xlib.ext.xtest.fake_input(self.connection, event, button)
        self.connection.sync()

    def has_keyboard(self, window):
        return self.connection.get_input_focus().focus == window

    def cover(self, box):
        """Puts an empty window over everything there, for as long as this is connected."""
        x, y, width, height = box
        self.root.create_window(x, y, width + 1, height + 1, 0, Xlib.X.CopyFromParent).map()
        self.connection.sync()

    def resize(self, window, width, height):
        window.configure(width=width, height=height)
        self.connection.sync()

    def ask_to_close(self, window):
        """What the button of the frame that a window manager puts around a window does."""
        protocols, deletion = (self.connection.intern_atom(name) for name in ("WM_PROTOCOLS", "WM_DELETE_WINDOW"))
        message = (32, [deletion, Xlib.X.CurrentTime, 0, 0, 0])
        window.send_event(Xlib.protocol.event.ClientMessage(window=window, client_type=protocols, data=message))
        self.connection.sync()

    @staticmethod
    def box_of(window):
        shape = window.get_geometry()
        return Box((shape.x, shape.y, shape.width, shape.height))


class Control:
    """Anything that a screen reader can speak of."""

    def __init__(self, program, accessible):
        self.program = program
        self.accessible = accessible

    def __repr__(self):
        return f"{self.role.value_nick} {self.name!r}"

    # --- Reading

    @functools.cached_property
    def role(self):
        return self.accessible.getRole()

    @property
    def name(self):
        return self.accessible.name

    @property
    def path(self):
        return self.accessible.path

    @property
    def text(self):
        """What stands in a field."""
        return self.accessible.queryText().getText(0, -1)

    @property
    def value(self):
        """What is typed to have the field hold what it holds."""
        return self.text

    @property
    def states(self):
        return {state.value_nick for state in self.accessible.getState().getStates()}

    def has(self, state):
        return state in self.states

    @property
    def is_showing(self):
        return self.has("showing")

    @property
    def is_enabled(self):
        return self.has("enabled")

    @property
    def is_checked(self):
        return self.has("checked")

    @property
    def box(self):
        extents = self.accessible.queryComponent().getExtents(pyatspi.DESKTOP_COORDS)
        return Box((extents.x, extents.y, extents.width, extents.height))

    @property
    def parent(self):
        return self.wrap(self.accessible.parent)

    @property
    def children(self):
        count = self.accessible.childCount
        found = (self.accessible.getChildAtIndex(i) for i in range(count))
        return [self.wrap(child) for child in found if child]

    @property
    def window(self):
        """The window or menu that it is in."""
        control, parent = self, self.parent
        while control.role != MENU and parent.role != pyatspi.ROLE_APPLICATION:
            control, parent = parent, parent.parent
        return control

    def wrap(self, accessible):
        role = accessible.getRole()
        control = CLASSES.get(role, Control)(self.program, accessible)
        control.role = role
        return control

    def below(self):
        """All controls in it that can be seen, views with their cells left out."""
        for child in self.children:
            if child.is_showing:
                yield child
                if child.role not in VIEWS and child.role != MENU:
                    yield from child.below()

    def all(self, role, name=None):
        return [control for control in self.below() if control.role == role and (name is None or control.name == name)]

    def find(self, role, name=None):
        """The one control of the role, and with the name, in it. Waits for it."""

        def found():
            controls = self.all(role, name)
            return controls[0] if len(controls) == 1 else None

        return self.program.wait(found, lambda: f"one {role} {name or ''!r} in {self}; there are {list(self.below())}")

    # --- Acting

    def reach(self):
        """Lets the mouse be over its middle, with nothing in between."""

        def reached():
            box, window = self.box, self.window
            if not self.is_showing or min(box[2:]) <= 0:
                return False
            self.program.display.move_mouse(*box.middle)
            return self.program.display.box_below_mouse() == window.box and self.box == box

        self.program.wait(reached, lambda: f"the mouse over {self} at {self.box}")

    def click(self, button=1, count=1):
        if not self.is_enabled:
            self.program.wait(lambda: self.is_enabled, lambda: f"{self} enabled")
        self.program.hand.click(self, button, count)

    def double_click(self):
        self.click(count=2)

    def focus(self):
        """Gives a field the keyboard by a click."""
        self.click()
        self.program.wait(lambda: self.has("focused"), lambda: f"{self} with the keyboard")

    def enter(self, text):
        """Replaces what stands in a field by typing."""
        self.focus()
        if self.text:
            self.program.keys("ctrl+a", "Delete")
        self.program.type(text)
        self.program.wait(lambda: self.value == text, lambda: f"{self} with {text!r}; it has {self.text!r}")

    @property
    def can_be_pressed(self):
        """Whether a screen reader can press it."""
        return PRESS in self.actions

    @property
    def actions(self):
        """What a screen reader can do with it."""
        try:
            actions = self.accessible.queryAction()
        except NotImplementedError:
            return []
        return [actions.getName(i) for i in range(actions.nActions)]

    def press_aloud(self):
        """What a screen reader does, which heeds neither the mouse nor what is in front."""
        # That it was done is said only when the windows are closed that it opens.
        wait_for_answers(1)
        with contextlib.suppress(GLib.Error):
            self.accessible.queryAction().doAction(self.actions.index(PRESS))
        wait_for_answers()
        # A button is released a moment later.
        self.program.wait(lambda: not self.has("pressed"), lambda: f"{self} released", alone=False)

    def open_menu(self):
        """The menu of an entry that has one, opened by a click."""
        self.click()

        def opened():
            menus = [child for child in self.children if child.role == MENU and child.is_showing]
            return Menu(self.program, menus[0].accessible) if menus else None

        return self.program.wait(opened, lambda: f"the menu of {self}")

    def context_menu(self):
        """The menu that a click with the right button opens."""
        self.program.menus.clear()
        self.click(button=3)
        return self.program.menu()


class SpinBox(Control):
    """A field for a number, which may show a unit behind it."""

    @property
    def value(self):
        return str(int(self.accessible.queryValue().currentValue))


class Window(Control):
    """A main window or dialog."""

    @property
    def title(self):
        return self.name

    @property
    def is_open(self):
        return self.path in {window.path for window in self.program.windows()}

    def wait_closed(self):
        self.program.wait(lambda: not self.is_open, lambda: f"{self} closed", alive=False, alone=False)

    def take_keyboard(self):
        """There is no window manager that would give the window the keyboard at first or when a dialog has closed."""
        display = self.program.display

        def taken():
            window = display.window_at(self.box)
            if not display.has_keyboard(window):
                xdotool("windowfocus", "--sync", window.id)
            return True

        self.program.wait(taken, lambda: f"{self} with the keyboard")

    def press(self, *keys):
        """Presses keys or combinations, such as "ctrl+s"."""
        self.take_keyboard()
        self.program.keys(*keys)

    def close(self):
        display = self.program.display
        display.ask_to_close(self.program.wait(lambda: display.window_at(self.box), lambda: f"{self} on the display"))

    def button(self, name):
        return self.find(pyatspi.ROLE_PUSH_BUTTON, name)

    def field(self, name):
        """The field for a text or number with the name."""

        def found():
            fields = [control for control in self.below() if control.role in FIELDS and control.name == name]
            return fields[0] if len(fields) == 1 else None

        return self.program.wait(found, lambda: f"one field {name!r} in {self}; there are {list(self.below())}")

    def choose(self, *entries):
        """Walks through the menu bar with the mouse: choose("File", "Save")."""
        first, *others = entries
        self.find(pyatspi.ROLE_MENU_ITEM, first).open_menu().choose(*others)


class MessageBox(Window):
    """A box with a question or message."""

    @property
    def labels(self):
        return [label.name for label in self.all(pyatspi.ROLE_LABEL)]

    @property
    def text(self):
        return self.labels[0]

    @property
    def informative_text(self):
        """The smaller text under the other; empty when there is none."""
        return "\n".join(self.labels[1:])

    @property
    def buttons(self):
        return [button.name for button in self.all(pyatspi.ROLE_PUSH_BUTTON)]

    @property
    def default_button(self):
        """The name of the button that Return presses; None when there is none."""
        defaults = [button.name for button in self.all(pyatspi.ROLE_PUSH_BUTTON) if button.has("is-default")]
        return defaults[0] if defaults else None

    def answer(self, button):
        self.button(button).click()
        self.wait_closed()


class Menu(Control):
    """A menu that is open."""

    @property
    def entries(self):
        """The names of the entries from top to bottom; None stands for a line."""
        return [None if entry.role == pyatspi.ROLE_SEPARATOR else entry.name for entry in self.children]

    def entry(self, name):
        """The entry of the name. Waits for it."""

        def found():
            entries, top = self.children, self.box[1]
            for entry in entries:
                height = entry.box[3]
                if entry.name == name:
                    return MenuEntry(self, entry.accessible, top, height)
                top += height
            return None

        return self.program.wait(found, lambda: f"the entry {name!r} in {self.entries}")

    def choose(self, *entries):
        """Walks into submenus with the mouse and clicks the last entry."""
        first, *others = entries
        if others:
            self.submenu(first).choose(*others)
        else:
            self.entry(first).click()

    def submenu(self, name):
        return self.entry(name).open_menu()


class MenuEntry(Control):
    """An entry of an open menu.

    The toolkit has one object for an action that is in several menus, whose state and place are those in the first.
    """

    def __init__(self, menu, accessible, top, height):
        super().__init__(menu.program, accessible)
        self.menu, self.top, self.height = menu, top, height

    @property
    def is_showing(self):
        return self.menu.is_showing

    @property
    def box(self):
        x, _, width, _ = self.menu.box
        return Box((x, self.top, width, self.height))

    @property
    def window(self):
        return self.menu


class Row:
    """A row of a view: its cells, and in a tree its depth."""

    def __init__(self, view, cells, depth=0):
        self.view = view
        self.cells = cells
        self.depth = depth
        self.texts = [cell.name for cell in cells]

    def __repr__(self):
        return "    " * self.depth + self.label

    @property
    def label(self):
        """The texts of its cells, as they are named in tests: "Default lease time: 2 minutes"."""
        return ": ".join(text.strip() for text in self.texts if text.strip())

    @property
    def is_current(self):
        return self.cells[0].has("focused")

    @property
    def is_selected(self):
        return self.cells[0].has("selected")

    @property
    def is_expanded(self):
        return self.cells[0].has("expanded")

    def click(self, **options):
        self.view.program.hand.bring_in_sight(self.cells[0], self.view)
        self.cells[0].click(**options)

    def double_click(self):
        self.click(count=2)

    def context_menu(self):
        self.view.program.hand.bring_in_sight(self.cells[0], self.view)
        return self.cells[0].context_menu()


class View(Control):
    """A tree or a table."""

    @property
    def headers(self):
        return [child.name for child in self.children if child.role == pyatspi.ROLE_TABLE_COLUMN_HEADER]

    def cells(self):
        return [child for child in self.children if child.role == pyatspi.ROLE_TABLE_CELL]

    def cell_rows(self):
        children = self.children
        cells = [child for child in children if child.role == pyatspi.ROLE_TABLE_CELL]
        columns = [child.role for child in children].count(pyatspi.ROLE_TABLE_COLUMN_HEADER)
        return [cells[i : i + columns] for i in range(0, len(cells), columns)]

    @property
    def rows(self):
        return [Row(self, cells) for cells in self.cell_rows()]

    def labels(self):
        return [row.label for row in self.rows]

    def scroll_to(self, cell):
        """Turns the mouse's wheel until the cell is in sight."""

        def in_sight():
            seen, box = self.box, cell.box
            if seen.contains((*box.middle, 1, 1)) and box[1] >= seen[1] and box[1] + box[3] <= seen[1] + seen[3]:
                return True
            self.reach()
            self.program.display.click(4 if box[1] < seen[1] else 5)
            return False

        self.program.wait(in_sight, lambda: f"{cell} at {cell.box} in sight of {self} at {self.box}")


class Table(View):
    def row(self, text):
        """The row in which a cell has the text. Waits for it."""

        def found():
            rows = [row for row in self.rows if text in row.texts]
            return rows[0] if len(rows) == 1 else None

        return self.program.wait(found, lambda: f"one row with {text!r}; there are {self.labels()}")


class Tree(View):
    """A tree; its rows are those of open branches."""

    @property
    def rows(self):
        rows = self.cell_rows()
        lefts = [cells[0].box[0] for cells in rows]
        steps = sorted(set(lefts))  # how far a row is indented tells its depth
        return [Row(self, cells, steps.index(left)) for cells, left in zip(rows, lefts)]

    def lines(self):
        """The labels, indented by four spaces a level."""
        return [repr(row) for row in self.rows]

    def row(self, *labels):
        """The one row that the labels lead to, each the label of a row below the one before. Waits for it."""

        def found():
            rows = self.rows_at(labels)
            return rows[0] if len(rows) == 1 else None

        return self.program.wait(found, lambda: "\n".join([f"one row {labels} in", *self.lines()]))

    def has_row(self, *labels):
        return bool(self.rows_at(labels))

    def rows_at(self, labels):
        found, way = [], []
        for row in self.rows:
            way[row.depth :] = [row.label]
            if tuple(way) == labels:
                found.append(row)
        return found


# The controls of some roles.
CLASSES = {pyatspi.ROLE_TREE: Tree, pyatspi.ROLE_TABLE: Table, pyatspi.ROLE_SPIN_BUTTON: SpinBox}


class Mouse:
    """The hand on the mouse, by which everything is used unless a test takes another."""

    @staticmethod
    def bring_in_sight(cell, view):
        view.scroll_to(cell)

    @staticmethod
    def click(control, button, count):
        control.reach()
        control.program.click(button, count)


class Program:
    """The program as a process, and its windows."""

    def __init__(self, *command, environment=None):
        self.display = Display()
        self.display.advertise(accessibility_bus())
        self.command = command or (os.environ["ORV_PROGRAM"],)
        self.errors = tempfile.TemporaryFile("w+")
        self.process = subprocess.Popen(
            self.command,
            stdin=subprocess.DEVNULL,
            stdout=self.errors,
            stderr=self.errors,
            env={**os.environ, **(environment or {})},
        )
        self.known = set()  # the paths of windows that the test knows of
        self.menus = []  # the menus that have been opened, the last one last
        self.last_click = (None, 0.0)
        self.hand = Mouse()
        pyatspi.Registry.registerEventListener(self.note_menu, "object:state-changed:showing")

    # --- Its life

    def output(self):
        """What it has written so far."""
        self.errors.seek(0)
        return self.errors.read()

    @property
    def is_running(self):
        return self.process.poll() is None

    def child_processes(self):
        """The numbers of the processes that it has started and that have not ended."""
        return subprocess.run(
            ["pgrep", "--parent", str(self.process.pid)], check=False, capture_output=True, text=True
        ).stdout.split()

    def watches(self, path):
        """The numbers of its watches on a file or folder; it gets a new one whenever it watches anew."""
        kept = pathlib.Path(f"/proc/{self.process.pid}/fdinfo")
        watch = re.compile(rf"^inotify wd:(\w+) ino:{os.stat(path).st_ino:x} ", re.MULTILINE)
        return {number for info in kept.iterdir() for number in watch.findall(info.read_text())}

    def wait_ended(self):
        """Its exit status."""
        self.wait(lambda: not self.is_running, lambda: "the end of the program", alive=False, alone=False)
        return self.process.returncode

    def end(self):
        pyatspi.Registry.deregisterEventListener(self.note_menu, "object:state-changed:showing")
        if self.is_running:
            self.process.send_signal(signal.SIGTERM)
        self.process.wait()
        self.errors.close()
        self.display.connection.close()

    # --- Looking

    def wait(self, condition, what, alive=True, alone=True):
        """What CONDITION returns as soon as that is true. WHAT tells what was not seen otherwise.

        ALIVE: the program must not end before. ALONE: no new window may open before.
        """
        deadline = time.monotonic() + PATIENCE
        while True:
            self.listen()
            try:
                result = condition()
                unknown = self.unknown() if alone else []
            except GONE:
                result, unknown = None, []
            if unknown:
                raise AssertionError(self.report(lambda: f"nobody expected {self.describe(unknown[0])}", what))
            if result:
                return result
            if alive and not self.is_running:
                raise AssertionError(self.report(lambda: f"the program ended with {self.process.returncode}", what))
            if time.monotonic() > deadline:
                raise AssertionError(self.report(lambda: f"nothing came but {self.windows()}", what))
            time.sleep(POLL)

    def report(self, seen, what):
        lines = []
        for label, part in (("seen", seen), ("waiting for", what), ("output", self.output)):
            try:
                lines.append(f"{label}: {part()}")
            except GONE:
                lines.append(f"{label}: something that has gone")
        return "\n".join(lines)

    def listen(self):
        while GLib.MainContext.default().iteration(False):
            pass

    def note_menu(self, event):
        source = event.source
        with contextlib.suppress(*GONE):
            if event.detail1 and source and source.getRole() == MENU:
                self.menus = [menu for menu in self.menus if menu.path != source.path] + [source]

    def accessible(self):
        desktop = pyatspi.Registry.getDesktop(0)
        for i in range(desktop.childCount):
            application = desktop.getChildAtIndex(i)
            if application and application.get_process_id() == self.process.pid:
                return application
        return None

    def windows(self):
        """The windows that can be seen, the newest last."""
        application = self.accessible()
        if not application:
            return []
        found = (application.getChildAtIndex(i) for i in range(application.childCount))
        kinds = {pyatspi.ROLE_ALERT: MessageBox}
        windows = [kinds.get(child.getRole(), Window)(self, child) for child in found if child]
        return [window for window in windows if window.is_showing]

    def unknown(self):
        return [window for window in self.windows() if window.path not in self.known]

    def window(self, title):
        """A window that has newly opened."""

        def found():
            windows = self.unknown()
            if not windows:
                return None
            for window in windows:
                if window.title != title:
                    raise AssertionError(f"instead of {title!r} there is {self.describe(window)}")
            return windows[0]

        window = self.wait(found, lambda: f"window {title!r}", alone=False)
        self.known.add(window.path)
        return window

    def describe(self, window):
        return f"{window}: {[control for control in window.below() if control.name]}"

    def menu(self):
        """The menu that opened last."""

        def found():
            return Menu(self, self.menus[-1]) if self.menus and Menu(self, self.menus[-1]).is_showing else None

        return self.wait(found, lambda: "an open menu")

    # --- Acting

    def click(self, button, count):
        place = (button, self.display.mouse())
        if place == self.last_click[0]:
            time.sleep(max(0.0, self.last_click[1] + DOUBLE_CLICK - time.monotonic()))
        for _ in range(count):
            self.display.click(button)
        self.last_click = (place, time.monotonic())

    def keys(self, *keys):
        """Presses keys wherever the keyboard is."""
        xdotool("key", "--delay", 20, *keys)

    def type(self, text):
        xdotool("type", "--delay", 10, "--", text)


def keep_picture(name):
    """Keeps a picture of the display, if somebody wants it."""
    folder = os.environ.get("ORV_PICTURES")
    if folder:
        os.makedirs(folder, exist_ok=True)
        subprocess.run(["maim", os.path.join(folder, f"{name}.png")], check=False)
