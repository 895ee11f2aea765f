#!/usr/bin/env python3
"""Stands in for a service of a desktop's session, on the bus that the environment names.

    session_service.py LOG file-manager shows|refuses|silent
    session_service.py LOG keyboard INDEX CODE...

LOG gets the line "ready" once the service can be asked, and a line for each question. The layouts of the
keyboard are told by their codes; INDEX is the active one.
"""

import signal
import sys

import gi

gi.require_version("Gio", "2.0")
from gi.repository import Gio, GLib

FILE_MANAGER = """<node><interface name="org.freedesktop.FileManager1"><method name="ShowItems">
<arg name="URIs" type="as" direction="in"/><arg name="StartupId" type="s" direction="in"/>
</method></interface></node>"""
KEYBOARD = """<node><interface name="org.kde.KeyboardLayouts">
<method name="getLayout"><arg type="u" direction="out"/></method>
<method name="getLayoutsList"><arg type="a(sss)" direction="out"/></method>
</interface></node>"""


class FileManager:
    name, path, interface = "org.freedesktop.FileManager1", "/org/freedesktop/FileManager1", FILE_MANAGER

    def __init__(self, mode):
        self.mode = mode

    def answer(self, _method, invocation):
        if self.mode == "refuses":
            invocation.return_dbus_error("org.freedesktop.DBus.Error.Failed", "cannot show that")
        elif self.mode == "shows":
            invocation.return_value(None)


class Keyboard:
    name, path, interface = "org.kde.keyboard", "/Layouts", KEYBOARD

    def __init__(self, index, *codes):
        self.index, self.codes = int(index), codes

    def answer(self, method, invocation):
        if method == "getLayout":
            invocation.return_value(GLib.Variant("(u)", (self.index,)))
        else:
            layouts = [(code, code.upper(), "the layout " + code) for code in self.codes]
            invocation.return_value(GLib.Variant("(a(sss))", (layouts,)))


def main(log, kind, *arguments):
    signal.alarm(60)
    service = {"file-manager": FileManager, "keyboard": Keyboard}[kind](*arguments)

    def tell(line):
        with open(log, "a") as file:
            file.write(line + "\n")

    def on_call(_bus, _sender, _path, _interface, method, parameters, invocation):
        tell(" ".join([method] + [item for words in parameters.unpack() for item in words]))
        service.answer(method, invocation)

    def on_bus(bus, _name):
        interface = Gio.DBusNodeInfo.new_for_xml(service.interface).interfaces[0]
        bus.register_object(service.path, interface, on_call)

    Gio.bus_own_name(Gio.BusType.SESSION, service.name, 0, on_bus, lambda *_: tell("ready"), None)
    GLib.MainLoop().run()


main(*sys.argv[1:])
