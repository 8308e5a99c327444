# SPDX-License-Identifier: GPL-3.0-or-later
"""The start from the menu by an ordinary user, whom polkit asks for the password of an administrator."""

import os
import unittest

import desktop
import gi

gi.require_version("Polkit", "1.0")
gi.require_version("PolkitAgent", "1.0")
from gi.repository import Gio, GLib, Polkit, PolkitAgent  # noqa: E402

ENTRY = "org.orv.admin.dhcp.desktop"
ACTION = "org.orv.admin.dhcp.run"
AUTHORITY = (
    "org.freedesktop.PolicyKit1",
    "/org/freedesktop/PolicyKit1/Authority",
    "org.freedesktop.PolicyKit1.Authority",
)
AGENT_PATH = "/agent"
AGENT = Gio.DBusNodeInfo.new_for_xml(
    """
<node>
  <interface name="org.freedesktop.PolicyKit1.AuthenticationAgent">
    <method name="BeginAuthentication">
      <arg type="s"/><arg type="s"/><arg type="s"/><arg type="a{ss}"/><arg type="s"/><arg type="a(sa{sv})"/>
    </method>
    <method name="CancelAuthentication"><arg type="s"/></method>
  </interface>
</node>"""
).interfaces[0]


class Agent:
    """The dialog for the password that a desktop has, and who sits before it: he types it, or dismisses the dialog."""

    def __init__(self, password):
        self.password = password
        self.asked = []  # the actions that a password was asked for
        self.bus = Gio.bus_get_sync(Gio.BusType.SYSTEM)
        self.object = self.bus.register_object(AGENT_PATH, AGENT, self.handle, None, None)
        session = ("unix-session", {"session-id": GLib.Variant("s", os.environ["XDG_SESSION_ID"])})
        self.subject = GLib.Variant("(sa{sv})", session)
        self.ask("RegisterAuthenticationAgent", "((sa{sv})ss)", (session, "C.UTF-8", AGENT_PATH))
        self.leave = lambda: self.ask("UnregisterAuthenticationAgent", "((sa{sv})s)", (session, AGENT_PATH))

    def ask(self, method, signature, arguments):
        arguments = GLib.Variant(signature, arguments)
        self.bus.call_sync(*AUTHORITY, method, arguments, None, Gio.DBusCallFlags.NONE, -1, None)

    def end(self):
        self.leave()
        self.bus.unregister_object(self.object)

    def handle(self, _bus, _sender, _path, _interface, method, arguments, call):
        if method == "BeginAuthentication":
            action, _, _, _, cookie, identities = arguments.unpack()
            self.asked.append(action)
            if self.password is None:
                call.return_dbus_error("org.freedesktop.PolicyKit1.Error.Cancelled", "dismissed")
            else:
                self.authenticate(identities[0][1]["uid"], cookie, call)
        else:
            call.return_value(None)

    def authenticate(self, user, cookie, call):
        session = PolkitAgent.Session.new(Polkit.UnixUser.new(user), cookie)
        session.connect("request", lambda *_: session.response(self.password))
        session.connect("completed", lambda *_: call.return_value(None))
        session.initiate()


class MenuEntry(desktop.Program):
    """What is started by a click on the entry, and the windows of the program that come of it."""

    def __init__(self):
        command = Gio.DesktopAppInfo.new(ENTRY).get_commandline()
        super().__init__(*GLib.shell_parse_argv(command)[1])

    def accessible(self):
        applications = desktop.pyatspi.Registry.getDesktop(0)
        found = [applications.getChildAtIndex(i) for i in range(applications.childCount)]
        return next(
            (application for application in found if application and application.name == "orv-admin-dhcp"), None
        )


def tree_of(window):
    return next((control for control in window.below() if isinstance(control, desktop.Tree)), None)


class Start(unittest.TestCase):
    def start(self, password):
        self.agent = Agent(password)
        self.addCleanup(self.agent.end)
        self.program = MenuEntry()
        self.addCleanup(self.program.end)

    def end(self):
        """The exit status of what the menu has started."""
        status = self.program.wait_ended()
        self.assertEqual(self.agent.asked, [ACTION])
        return status

    def test_with_the_password_shows_the_configuration(self):
        self.start("secret")
        window = self.program.window(desktop.MAIN_TITLE)
        tree = self.program.wait(lambda: tree_of(window), lambda: f"a tree in {window}")
        lines = self.program.wait(tree.lines, lambda: "a tree with rows")
        self.assertEqual(lines[0], "All network")
        self.assertIn("    Default lease time: 10 minutes", lines)
        window.close()
        self.assertEqual(self.end(), 0)

    def test_with_another_password_says_who_may(self):
        self.start("other")
        box = self.program.window("Error")
        self.assertEqual(box.text, "Must be superuser")
        box.answer("OK")
        self.assertEqual(self.end(), 1)

    def test_that_the_user_gives_up_is_none(self):
        self.start(None)
        self.assertEqual(self.end(), 0)
        self.assertEqual(self.program.windows(), [])
