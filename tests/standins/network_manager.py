#!/usr/bin/env python3
"""Stands in for NetworkManager on the system's bus that the environment names, with one Ethernet device.

    network_manager.py LOG

LOG gets the line "ready" once it can be asked, and a line for each question that changes something or tells secrets:
never a secret. It dials as it is told: org.quendra.Script.Play at /script takes steps, separated by commas, each
"device STATE REASON", "vpn STATE REASON" or "active STATE REASON" of the latest connection, or "forget". Other
steps change its answers: "refuse METHOD ERROR" until "allow METHOD", and "hold METHOD", after which it does what it
is asked, writes "held METHOD" into LOG, and answers at "release". "change NUMBER SETTING KEY TEXT" is what another
program changes in a connection.
"""

import signal
import sys

import gi

gi.require_version("Gio", "2.0")
from gi.repository import Gio, GLib

NAME = "org.freedesktop.NetworkManager"
ROOT = "/org/freedesktop/NetworkManager"
DEVICE = ROOT + "/Devices/1"
NOT_ACTIVE = NAME + ".ConnectionNotActive"

INTERFACES = Gio.DBusNodeInfo.new_for_xml("""<node>
<interface name="org.freedesktop.NetworkManager">
<method name="GetDevices"><arg type="ao" direction="out"/></method>
<method name="ActivateConnection"><arg type="o" direction="in"/><arg type="o" direction="in"/>
<arg type="o" direction="in"/><arg type="o" direction="out"/></method>
<method name="AddAndActivateConnection"><arg type="a{sa{sv}}" direction="in"/><arg type="o" direction="in"/>
<arg type="o" direction="in"/><arg type="o" direction="out"/><arg type="o" direction="out"/></method>
<method name="DeactivateConnection"><arg type="o" direction="in"/></method>
<property name="ActiveConnections" type="ao" access="read"/>
</interface>
<interface name="org.freedesktop.NetworkManager.Settings">
<method name="ListConnections"><arg type="ao" direction="out"/></method>
<method name="AddConnection"><arg type="a{sa{sv}}" direction="in"/><arg type="o" direction="out"/></method>
<property name="CanModify" type="b" access="read"/>
</interface>
<interface name="org.freedesktop.NetworkManager.Settings.Connection">
<method name="GetSettings"><arg type="a{sa{sv}}" direction="out"/></method>
<method name="GetSecrets"><arg type="s" direction="in"/><arg type="a{sa{sv}}" direction="out"/></method>
<method name="Update"><arg type="a{sa{sv}}" direction="in"/></method>
<method name="ClearSecrets"/><method name="Delete"/><signal name="Updated"/>
</interface>
<interface name="org.freedesktop.NetworkManager.Device">
<property name="DeviceType" type="u" access="read"/><property name="State" type="u" access="read"/>
<property name="Interface" type="s" access="read"/><property name="ActiveConnection" type="o" access="read"/>
<signal name="StateChanged"><arg type="u"/><arg type="u"/><arg type="u"/></signal>
</interface>
<interface name="org.freedesktop.NetworkManager.Connection.Active">
<property name="Connection" type="o" access="read"/><property name="Devices" type="ao" access="read"/>
<property name="State" type="u" access="read"/><property name="Vpn" type="b" access="read"/>
<signal name="StateChanged"><arg type="u"/><arg type="u"/></signal>
</interface>
<interface name="org.freedesktop.NetworkManager.VPN.Connection">
<signal name="VpnStateChanged"><arg type="u"/><arg type="u"/></signal>
</interface>
<interface name="org.quendra.Script"><method name="Play"><arg type="s" direction="in"/></method></interface>
</node>""")


class Refusal(Exception):
    pass


class Manager:
    def __init__(self, log):
        self.log = log
        self.refusals, self.held, self.waiting = {}, set(), []
        self.settings, self.secrets, self.active, self.ids = {}, {}, {}, {}
        self.made = 0
        self.device_state = 30

    def tell(self, line):
        with open(self.log, "a") as file:
            file.write(line + "\n")

    def start(self, bus):
        self.bus = bus
        self.export(ROOT, NAME)
        self.export(ROOT + "/Settings", NAME + ".Settings")
        self.export(DEVICE, NAME + ".Device")
        self.export("/script", "org.quendra.Script")

    def export(self, path, name):
        # Without a function for properties, the questions for them come as any others.
        self.ids.setdefault(path, []).append(
            self.bus.register_object(path, INTERFACES.lookup_interface(name), self.on_call, None, None))

    def drop(self, path):
        for number in self.ids.pop(path, []):
            self.bus.unregister_object(number)

    def emit(self, path, interface, member, types, *values):
        self.bus.emit_signal(None, path, NAME + interface, member, GLib.Variant(types, values))

    def on_call(self, _bus, _sender, path, _interface, method, parameters, invocation):
        try:
            if method in self.refusals:
                raise Refusal(self.refusals[method])
            answer = getattr(self, "do_" + method)(path, parameters)
            if method in self.held:
                self.tell("held " + method)
                self.waiting.append((invocation, answer))
            else:
                invocation.return_value(answer)
        except Refusal as refusal:
            invocation.return_dbus_error(str(refusal), "refused")

    def value_of(self, path, name):
        active = self.active.get(path, {})
        return {
            "ActiveConnections": lambda: GLib.Variant("ao", list(self.active)),
            "CanModify": lambda: GLib.Variant("b", True),
            "DeviceType": lambda: GLib.Variant("u", 1),
            "Interface": lambda: GLib.Variant("s", "eth0"),
            "ActiveConnection": lambda: GLib.Variant("o", "/"),
            "Connection": lambda: GLib.Variant("o", active["connection"]),
            "Devices": lambda: GLib.Variant("ao", [DEVICE]),
            "Vpn": lambda: GLib.Variant("b", active["vpn"]),
            "State": lambda: GLib.Variant("u", active.get("state", self.device_state)),
        }[name]()

    def do_Get(self, path, parameters):
        return GLib.Variant("(v)", (self.value_of(path, parameters.unpack()[1]),))

    def do_GetAll(self, path, parameters):
        properties = INTERFACES.lookup_interface(parameters.unpack()[0]).properties
        return GLib.Variant("(a{sv})", ({one.name: self.value_of(path, one.name) for one in properties},))

    # Settings.

    def do_ListConnections(self, _path, _parameters):
        return GLib.Variant("(ao)", (list(self.settings),))

    def keep(self, path, parameters):
        """Takes the secrets out, as those are told to nobody who doesn't ask for them."""
        given = parameters.get_child_value(0)
        kept, secrets = {}, {}
        for i in range(given.n_children()):
            name = given.get_child_value(i).get_child_value(0).get_string()
            values = given.get_child_value(i).get_child_value(1)
            kept[name], secrets[name] = {}, {}
            for j in range(values.n_children()):
                key = values.get_child_value(j).get_child_value(0).get_string()
                value = values.get_child_value(j).get_child_value(1).get_variant()
                (secrets if key in ("password", "secrets") else kept)[name][key] = value
        self.settings[path] = kept
        if any(secrets.values()):
            self.secrets[path] = secrets

    def do_AddConnection(self, _path, parameters):
        self.made += 1
        path = ROOT + "/Settings/" + str(self.made)
        self.keep(path, parameters)
        self.export(path, NAME + ".Settings.Connection")
        self.tell("AddConnection " + self.settings[path]["connection"]["id"].get_string())
        return GLib.Variant("(o)", (path,))

    def do_GetSettings(self, path, _parameters):
        return GLib.Variant("(a{sa{sv}})", (self.settings[path],))

    def do_GetSecrets(self, path, _parameters):
        self.tell("GetSecrets " + self.settings[path]["connection"]["id"].get_string())
        return GLib.Variant("(a{sa{sv}})", (self.secrets.get(path, {}),))

    def do_Update(self, path, parameters):
        self.keep(path, parameters)
        self.tell("Update " + self.settings[path]["connection"]["id"].get_string())
        self.emit(path, ".Settings.Connection", "Updated", "()")

    def do_ClearSecrets(self, path, _parameters):
        self.secrets.pop(path, None)

    def do_Delete(self, path, _parameters):
        for active in [path_ for path_, one in self.active.items() if one["connection"] == path]:
            self.end(active, 38, 11)
        self.tell("Delete " + self.settings.pop(path)["connection"]["id"].get_string())
        self.drop(path)

    # Connections.

    def do_GetDevices(self, _path, _parameters):
        return GLib.Variant("(ao)", ([DEVICE],))

    def do_ActivateConnection(self, _path, parameters):
        connection = parameters.unpack()[0]
        settings = self.settings[connection]["connection"]
        self.made += 1
        path = ROOT + "/ActiveConnection/" + str(self.made)
        is_vpn = settings["type"].get_string() == "vpn"
        self.active[path] = {"connection": connection, "state": 1, "vpn": is_vpn}
        self.export(path, NAME + ".Connection.Active")
        self.export(path, NAME + ".VPN.Connection")
        self.tell("ActivateConnection " + settings["id"].get_string())
        return GLib.Variant("(o)", (path,))

    def do_DeactivateConnection(self, _path, parameters):
        path = parameters.unpack()[0]
        if path not in self.active:
            raise Refusal(NOT_ACTIVE)
        connection = self.settings.get(self.active[path]["connection"])
        self.tell("DeactivateConnection " + (connection["connection"]["id"].get_string() if connection else ""))
        self.end(path, 39, 2)

    def end(self, path, device_reason, reason):
        is_vpn = self.active[path]["vpn"]
        self.play(path, f"vpn 7 {reason}" if is_vpn else f"device 110 {device_reason}")
        self.play(path, f"active 4 {reason}")
        self.play(path, "forget")

    def do_Play(self, _path, parameters):
        path = list(self.active)[-1] if self.active else None
        for step in parameters.unpack()[0].split(","):
            self.play(path, step.strip())

    def play(self, path, step):
        kind, *words = step.split()
        numbers = [int(word) for word in words if word.isdigit()]
        if kind == "refuse":
            self.refusals[words[0]] = words[1]
        elif kind == "allow":
            self.refusals.pop(words[0])
        elif kind == "hold":
            self.held.add(words[0])
        elif kind == "release":
            waiting, self.waiting, self.held = self.waiting, [], set()
            for invocation, answer in waiting:
                invocation.return_value(answer)
        elif kind == "change":
            self.settings[ROOT + "/Settings/" + words[0]][words[1]][words[2]] = GLib.Variant("s", words[3])
        elif kind == "device":
            old, self.device_state = self.device_state, numbers[0]
            self.emit(DEVICE, ".Device", "StateChanged", "(uuu)", numbers[0], old, numbers[1])
        elif kind == "vpn":
            self.emit(path, ".VPN.Connection", "VpnStateChanged", "(uu)", *numbers)
        elif kind == "active":
            self.active[path]["state"] = numbers[0]
            self.emit(path, ".Connection.Active", "StateChanged", "(uu)", *numbers)
        elif kind == "forget":
            self.active.pop(path)
            self.drop(path)


def main(log):
    signal.alarm(60)
    manager = Manager(log)
    Gio.bus_own_name(Gio.BusType.SYSTEM, NAME, 0, lambda bus, _name: manager.start(bus),
                     lambda *_: manager.tell("ready"), None)
    GLib.MainLoop().run()


main(*sys.argv[1:])
