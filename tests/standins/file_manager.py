#!/usr/bin/python3
"""A stand-in for the session's file manager: answers on the session bus in its name and shows nothing.

    file_manager.py [--seconds N]

Prints "ready" once it has the name, then a line for each address that it is asked to show. Ends after N seconds or on
SIGTERM."""

import argparse
import signal
import sys

from gi.repository import Gio, GLib

NAME = "org.freedesktop.FileManager1"
PATH = "/org/freedesktop/FileManager1"
METHODS = ("ShowFolders", "ShowItems", "ShowItemProperties")
INTERFACE = f"""<node><interface name="{NAME}">{"".join(
    f'<method name="{method}"><arg type="as" direction="in"/><arg type="s" direction="in"/></method>'
    for method in METHODS)}</interface></node>"""


def answer(_connection, _sender, _path, _interface, method, arguments, invocation):
    addresses, _startup = arguments.unpack()
    for address in addresses:
        print(f"{method} {address}", flush=True)
    invocation.return_value(None)


def main():
    parser = argparse.ArgumentParser(description="stand-in file manager on the session bus")
    parser.add_argument("--seconds", type=float, default=3600)
    arguments = parser.parse_args()
    for end in (signal.SIGTERM, signal.SIGINT, signal.SIGALRM):
        signal.signal(end, signal.SIG_DFL)
    signal.setitimer(signal.ITIMER_REAL, arguments.seconds)
    try:
        bus = Gio.bus_get_sync(Gio.BusType.SESSION)
    except GLib.Error as fault:
        sys.exit(f"file manager: no session bus: {fault.message}")
    bus.register_object(PATH, Gio.DBusNodeInfo.new_for_xml(INTERFACE).interfaces[0], answer)
    Gio.bus_own_name_on_connection(
        bus,
        NAME,
        Gio.BusNameOwnerFlags.DO_NOT_QUEUE,
        lambda *_: print("ready", flush=True),
        lambda *_: sys.exit("file manager: another one has the name"),
    )
    GLib.MainLoop().run()


if __name__ == "__main__":
    main()
