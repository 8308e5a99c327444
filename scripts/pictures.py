# SPDX-License-Identifier: GPL-3.0-or-later
"""pictures.py LANGUAGE: takes the pictures of the handbook in a language, and with the English ones that of README.md.

Runs for scripts/pictures on the demonstration site, with what the end-to-end tests know the program by.
"""

import io
import pathlib
import subprocess
import sys
import time
import xml.etree.ElementTree

import desktop
import machine
import PIL.Image
import pyatspi
import Xlib.X

ROOT = pathlib.Path(__file__).resolve().parents[1]
DOCS = ROOT / "docs"
LOCALES = {"en": "C.UTF-8", "de": "de_DE.UTF-8"}  # whose dates are shown
SIZE = 820, 540  # of the main window; the handbook's window shows pictures of it whole
COLOURS = 255  # of a picture; one more is left for what is transparent
LAST_GUEST = "raspberrypi"  # of the clients that are searched for the last one to come
SETTLING = 0.5  # seconds in which a picture must not change
OFFSET = 250, 270  # of the second window in the picture of README.md


class Display(desktop.Display):
    """One where a window manager puts windows into frames."""

    def box_of(self, window):
        shape, place = window.get_geometry(), self.root.translate_coords(window, 0, 0)
        return desktop.Box((place.x, place.y, shape.width, shape.height))

    def window_at(self, box):
        for frame in reversed(self.root.query_tree().children):
            window = self.window_in(frame)
            if window.get_attributes().map_state == Xlib.X.IsViewable and self.box_of(window) == box:
                return window
        raise LookupError(f"no window at {box}")

    def box_below_mouse(self):
        frame = self.root.query_pointer().child
        return self.box_of(self.window_in(frame)) if frame else None

    def window_in(self, frame):
        """The program's window in a frame. What has none, such as a menu, stands for itself."""
        return next((window for window in self.all_in(frame) if self.is_managed(window)), frame)

    def all_in(self, window):
        yield window
        for child in window.query_tree().children:
            yield from self.all_in(child)

    def corner(self):
        """The place of the last pixel."""
        shape = self.root.get_geometry()
        return shape.width - 1, shape.height - 1

    def is_managed(self, window):
        return bool(window.get_full_property(self.connection.intern_atom("WM_STATE"), Xlib.X.AnyPropertyType))

    def frame_of(self, window):
        while (parent := window.query_tree().parent) != self.root:
            window = parent
        return window

    def outer_box_of(self, frame):
        """Its place with the line around it."""
        (x, y, width, height), line = self.box_of(frame), frame.get_geometry().border_width
        return desktop.Box((x - line, y - line, width + 2 * line, height + 2 * line))

    def menus(self):
        """The windows that a program shows without a frame."""
        for window in self.root.query_tree().children:
            is_seen = window.get_attributes().map_state == Xlib.X.IsViewable
            if is_seen and window.get_wm_class() and not self.is_managed(window):
                yield window


class Language:
    """The texts of the program in a language."""

    def __init__(self, name):
        self.name = name
        self.texts = {}
        if name != "en":
            messages = xml.etree.ElementTree.parse(ROOT / "translations" / f"orv-admin-dhcp_{name}.ts").iter("message")
            pairs = ((message.findtext("source"), message.findtext("translation")) for message in messages)
            self.texts = {source.replace("&", ""): translation.replace("&", "") for source, translation in pairs}

    def __call__(self, text):
        """What the program says for an English text of its own, or for the first part of "Subnet: 10.20.30.0"."""
        if text in self.texts or not self.texts:
            return self.texts.get(text, text)
        label, colon, value = text.partition(": ")
        return self.texts[label] + colon + value


class Site:
    """The program on the demonstration site, and the pictures of it."""

    def __init__(self, language):
        self.said = Language(language)
        self.folder = DOCS / "handbook" / language
        self.program = desktop.Program(environment={"LANGUAGE": language, "LC_ALL": LOCALES[language]})
        self.program.display = Display()
        self.main = self.window(desktop.MAIN_TITLE)
        display = self.program.display
        display.resize(self.wait(lambda: display.window_at(self.main.box), "the window on the display"), *SIZE)
        self.wait(lambda: self.main.box[2:] == SIZE, "the size of the window")

    # --- Finding

    def wait(self, condition, what):
        return self.program.wait(condition, lambda: what)

    def window(self, title):
        return self.program.window(self.said(title))

    def row(self, *labels):
        """The row below that of the whole network."""
        tree = self.main.find(pyatspi.ROLE_TREE, self.said("Topology"))
        return tree.row(*(self.said(label) for label in ("All network", *labels)))

    def entry(self, row, *entries):
        """Chooses an entry of a row's menu."""
        row.context_menu().choose(*(self.said(entry) for entry in entries))

    def fill(self, dialog, **texts):
        for label, text in texts.items():
            dialog.field(self.said(label.replace("_", " ") + ":")).enter(text)

    def accept(self, window):
        """Presses the button that Return presses."""
        window.press("Return")
        window.wait_closed()

    def save(self, dialog):
        dialog.button(self.said("Save")).click()
        dialog.wait_closed()

    def dismiss(self, window):
        window.press("Escape")
        window.wait_closed()

    def is_idle(self):
        return not self.program.child_processes()

    def tab(self, name):
        self.main.find(pyatspi.ROLE_PAGE_TAB, self.said(name)).click()

    # --- Photographing

    def photograph(self, window):
        """A picture of the window with its frame and its menus, as soon as nothing moves any more."""
        display = self.program.display
        if not any(display.menus()):  # which may close when it leaves
            display.move_mouse(*display.corner())  # away from what would light up under it
        self.wait(self.is_idle, "the end of what the program asks the server")
        last = []

        def settled():
            frame = display.frame_of(display.window_at(window.box))
            boxes = [display.outer_box_of(shown) for shown in (frame, *display.menus())]
            now = subprocess.run(["maim", "--hidecursor"], check=True, stdout=subprocess.PIPE).stdout
            if last == [now, boxes]:
                return True
            last[:] = now, boxes
            time.sleep(SETTLING)
            return False

        self.wait(settled, f"a picture of {window} that stays as it is")
        picture, boxes = last
        return cut_out(PIL.Image.open(io.BytesIO(picture)), boxes)

    def picture(self, name, window=None):
        """The picture NAME of the handbook, of the main window unless another one is given."""
        picture = self.photograph(window or self.main)
        keep(picture, self.folder / f"{name}.png")
        return picture


# --- Pictures


def cut_out(display, boxes):
    """What is in the boxes, with nothing around it."""
    picture = PIL.Image.new("RGBA", display.size)
    for x, y, width, height in boxes:
        corners = x, y, x + width, y + height
        picture.paste(display.crop(corners).convert("RGBA"), corners)
    return picture.crop(picture.getbbox())


def overlap(below, above):
    """A picture of two windows, one before the other."""
    both = PIL.Image.new("RGBA", tuple(max(a, b + offset) for a, b, offset in zip(below.size, above.size, OFFSET)))
    both.paste(below)
    both.paste(above, OFFSET)
    return both


def keep(picture, path):
    """Saves a picture in few colours, and one more for where there is nothing."""
    few = picture.convert("RGB").quantize(COLOURS, PIL.Image.Quantize.MAXCOVERAGE, 3, dither=PIL.Image.Dither.NONE)
    nothing = PIL.Image.eval(picture.getchannel("A"), lambda alpha: 255 - alpha)
    options = {}
    if nothing.getbbox():
        few.putpalette(few.getpalette()[: 3 * COLOURS] + [0, 0, 0])
        few.paste(COLOURS, mask=nothing)
        options["transparency"] = COLOURS
    few.save(path, optimize=True, **options)
    print(f"{path.relative_to(ROOT)}: {path.stat().st_size} bytes", flush=True)


# --- The pages of the handbook


def first_start(site):
    return site.picture("window")


def new_subnet(site):
    site.main.button(site.said("Add subnet")).click()
    dialog = site.window("Add subnet")
    site.fill(dialog, Address="10.20.0.0", Netmask="255.255.255.0")
    site.picture("subnet", dialog)
    site.save(dialog)

    subnet = site.row("Subnet: 10.20.0.0 / 255.255.255.0")
    menu = subnet.context_menu()
    menu.submenu(site.said("Add parameter"))
    site.picture("subnet-menu")
    site.program.keys("Escape", "Escape")
    site.wait(lambda: not menu.is_showing, "no menu")

    site.entry(subnet, "Add range")
    dialog = site.window("Add range")
    site.fill(dialog, Start_IP="10.20.0.100", End_IP="10.20.0.199")
    site.picture("range", dialog)
    site.save(dialog)
    site.row("Subnet: 10.20.0.0 / 255.255.255.0", "Range: 10.20.0.100 - 10.20.0.199")


def saving(site):
    site.main.press("ctrl+s")
    question = site.window("Information")
    site.picture("save-question", question)
    site.accept(question)


def leases(site):
    site.tab("Leases")
    site.wait(lambda: f'client-hostname "{LAST_GUEST}"' in machine.LEASES.read_text(), f"a lease of {LAST_GUEST}")
    whole = site.photograph(site.main)
    site.main.find(pyatspi.ROLE_TEXT, site.said("Search")).enter("10.20.10.")
    site.picture("leases")
    site.main.find(pyatspi.ROLE_TABLE, site.said("Leases")).rows[0].double_click()
    dialog = site.window("Reserve an IP address")
    site.picture("reservation", dialog)
    site.dismiss(dialog)
    site.tab("Topology")
    return whole


def interfaces(site):
    site.main.choose(site.said("Server"), site.said("Select interfaces"))
    dialog = site.window("Select interfaces")
    site.picture("interfaces", dialog)
    site.dismiss(dialog)


def zones(site):
    site.entry(site.row(), "Add parameter", "Add option", "Add DHCP dynamic zone update")
    site.accept(site.window("Information"))
    choice = site.window("Choose the bind9 configuration with the update key")
    site.program.type("named.conf.local")
    site.accept(choice)
    site.row("Zone served by DNS server: 30.20.10.in-addr.arpa.", 'Key: "lab-update"').click()
    site.picture("zones")


def earlier_version(site):
    site.main.press("F5")
    question = site.window("Information")
    site.picture("reload-question", question)
    site.accept(question)


def refusal(site):
    site.entry(site.row(), "Add parameter", "Add arbitrary parameter")
    site.accept(site.window("Warning!"))
    dialog = site.window("Add arbitrary parameter")
    site.fill(dialog, Parameter="colour green")
    site.save(dialog)
    site.main.press("ctrl+s")
    question = site.window("Information")
    site.wait(site.is_idle, "the verdict of the server")
    site.picture("refusal", question)
    site.accept(question)
    site.main.button(site.said("Restart DHCP-server")).click()
    failure = site.window("Error")
    site.picture("failure", failure)
    site.accept(failure)


def main():
    site = Site(sys.argv[1])
    try:
        topology = first_start(site)
        new_subnet(site)
        saving(site)
        table = leases(site)
        interfaces(site)
        zones(site)
        earlier_version(site)
        refusal(site)
        if site.said.name == "en":
            keep(overlap(topology, table), DOCS / "screenshot.png")
    finally:
        desktop.keep_picture("pics")
        site.program.end()


if __name__ == "__main__":
    main()
