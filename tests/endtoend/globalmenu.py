# SPDX-License-Identifier: GPL-3.0-or-later
"""A desktop's global menu: the menu bar of the program's window as it is exported on the session's bus."""

import threading

from gi.repository import Gio, GLib

from desktop import PATIENCE

REGISTRAR = "com.canonical.AppMenu.Registrar"
REGISTRAR_PATH = "/com/canonical/AppMenu/Registrar"
MENU = "com.canonical.dbusmenu"

REGISTRAR_INTERFACE = f"""
<node>
  <interface name="{REGISTRAR}">
    <method name="RegisterWindow">
      <arg name="windowId" type="u" direction="in"/>
      <arg name="menuObjectPath" type="o" direction="in"/>
    </method>
    <method name="UnregisterWindow">
      <arg name="windowId" type="u" direction="in"/>
    </method>
  </interface>
</node>
"""


class GlobalMenu:
    """Takes the menu bars of windows, as the panel of a desktop does, and chooses entries in them.

    It answers from a thread of its own: a program that registers a window waits for the answer, and whoever looks at
    the program meanwhile waits for that.
    """

    def __init__(self):
        self.windows = {}  # where the menu bar of a window is, by the window's number
        self.context = GLib.MainContext()
        self.loop = GLib.MainLoop(self.context)
        self.is_known = threading.Event()
        self.thread = threading.Thread(target=self.serve, daemon=True)
        self.thread.start()
        if not self.is_known.wait(PATIENCE):
            raise AssertionError(f"no {REGISTRAR} on the session's bus")

    def serve(self):
        self.context.push_thread_default()
        self.bus = Gio.DBusConnection.new_for_address_sync(
            Gio.dbus_address_get_for_bus_sync(Gio.BusType.SESSION),
            Gio.DBusConnectionFlags.AUTHENTICATION_CLIENT | Gio.DBusConnectionFlags.MESSAGE_BUS_CONNECTION,
        )
        interface = Gio.DBusNodeInfo.new_for_xml(REGISTRAR_INTERFACE).interfaces[0]
        self.bus.register_object(REGISTRAR_PATH, interface, self.answer, None, None)
        Gio.bus_own_name_on_connection(
            self.bus, REGISTRAR, Gio.BusNameOwnerFlags.NONE, lambda *_: self.is_known.set(), None
        )
        self.loop.run()
        self.bus.close_sync()
        self.context.pop_thread_default()

    def end(self):
        self.loop.quit()
        self.thread.join()

    def answer(self, _bus, sender, _path, _interface, method, parameters, invocation):
        window, *path = parameters.unpack()
        if method == "RegisterWindow":
            self.windows[window] = (sender, *path)
        else:
            self.windows.pop(window, None)
        invocation.return_value(None)

    # --- Choosing

    def entries(self):
        """The numbers of the entries that can be chosen now, by their names."""
        found = {}

        def read(number, properties, children):
            if properties.get("enabled") and not children and properties.get("type") != "separator":
                found[properties["label"].replace("_", "")] = number
            for child in children:
                read(*child)

        _, layout = self.call("GetLayout", GLib.Variant("(iias)", (0, -1, []))).unpack()
        read(*layout)
        return found

    def choose(self, name):
        """Tells the program that an entry was clicked. It knows when it answers whatever it is asked next."""
        event = (self.entries()[name], "clicked", GLib.Variant("i", 0), 0)
        self.call("Event", GLib.Variant("(isvu)", event))

    def call(self, method, arguments):
        ((sender, path),) = self.windows.values()
        flags = Gio.DBusCallFlags.NONE
        return self.bus.call_sync(sender, path, MENU, method, arguments, None, flags, PATIENCE * 1000, None)
