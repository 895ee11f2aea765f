"""A network manager of the tour's own: in a network namespace with two cards of its own and on a bus of its own, so that
this machine's network and its manager, where it has one, stay as they are."""

import configparser
import contextlib
import os
import shutil
import subprocess
import time

import stage

ENTRY_DATA = "quendra.entry."
CARDS = {"eth0": "192.168.7.2/24", "eth1": "192.168.8.2/24"}
BUS = """<!DOCTYPE busconfig PUBLIC "-//freedesktop//DTD D-Bus Bus Configuration 1.0//EN"
 "http://www.freedesktop.org/standards/dbus/1.0/busconfig.dtd">
<busconfig>
  <type>system</type>
  <listen>unix:path={directory}/system-bus</listen>
  <auth>EXTERNAL</auth>
  <policy context="default">
    <allow user="*"/>
    <allow own="*"/>
    <allow send_destination="*" eavesdrop="false"/>
    <allow receive_sender="*"/>
  </policy>
</busconfig>
"""
SETTINGS = """[main]
plugins=keyfile
auth-polkit=false
no-auto-default=*
dns=none
rc-manager=unmanaged
[keyfile]
path={directory}/connections
[logging]
level=INFO
"""
CARD = """[connection]
id={name}
type=ethernet
interface-name={name}
[ipv4]
method=manual
address1={address}
[ipv6]
method=disabled
"""
# The manager waits for the device manager unless it can't write to the tree of devices.
START = """
set -e
mount --make-rprivate /
mount -o remount,ro /sys
mkdir -p /run/NetworkManager /var/lib/NetworkManager
mount -t tmpfs tmpfs /run/NetworkManager
mount --bind {directory}/state /var/lib/NetworkManager
exec NetworkManager --no-daemon --config={directory}/settings --config-dir={directory}/none --system-config-dir={directory}/none
"""


class NetworkManager:
    """As its own tool shows it."""

    cards = tuple(CARDS)

    def __init__(self, space, directory):
        self.space = space
        self.directory = directory

    def nmcli(self, *words):
        return stage.run("nmcli", *words)

    def add_entry(self, name):
        """A connection that is not the program's."""
        self.nmcli("connection", "add", "type", "pppoe", "con-name", name, "ifname", "eth1", "username", "clerk")

    def entries(self):
        """The connections by which one dials, with their kinds."""
        lines = self.nmcli("-t", "-f", "NAME,TYPE", "connection", "show").splitlines()
        pairs = (line.rsplit(":", 1) for line in lines if line.endswith((":pppoe", ":vpn")))
        return {name.replace("\\:", ":"): kind for name, kind in pairs}

    def fields(self, name):
        """What a connection holds, its secrets too: by the manager's own tool, and what it keeps of an entry beside that, by
        the manager's file."""
        words = "pppoe.username", "pppoe.password", "pppoe.service", "vpn.data", "vpn.secrets", "connection.type"
        lines = self.nmcli("--show-secrets", "-t", "connection", "show", name).splitlines()
        told = dict(line.split(":", 1) for line in lines if line.split(":")[0] in words)
        return self.user_data(name) | (vpn_fields(told) if told["connection.type"] == "vpn" else pppoe_fields(told))

    def user_data(self, name):
        reader = configparser.ConfigParser(delimiters=("=",), interpolation=None)
        reader.read(f"{self.directory}/connections/{name}.nmconnection")
        own = reader["user"] if reader.has_section("user") else {}
        kept = {key.removeprefix(ENTRY_DATA): value for key, value in own.items() if key.startswith(ENTRY_DATA)}
        return {key: value for key, value in kept.items() if key != "version"}

    def addresses(self, card):
        return stage.run("ip", "-n", self.space, "-4", "-o", "address", "show", "dev", card)


def pppoe_fields(told):
    return {
        "type": "pppoe",
        "number": told.get("pppoe.service", ""),
        "user": told.get("pppoe.username", ""),
        "password": told.get("pppoe.password", ""),
    }


def vpn_fields(told):
    """Of values that are lists themselves: name = value, name = value."""
    data, secrets = (
        dict(pair.split(" = ", 1) for pair in told.get(words, "").split(", ") if " = " in pair)
        for words in ("vpn.data", "vpn.secrets")
    )
    return {
        "type": "vpn",
        "number": data.get("gateway", ""),
        "user": data.get("user", ""),
        "password": secrets.get("password", ""),
    }


def write(path, text):
    descriptor = os.open(path, os.O_WRONLY | os.O_CREAT, 0o600)
    with os.fdopen(descriptor, "w") as file:
        file.write(text)


def prepare(directory, space):
    for folder in ("connections", "state", "none"):
        os.mkdir(f"{directory}/{folder}")
    write(f"{directory}/bus.conf", BUS.format(directory=directory))
    write(f"{directory}/settings", SETTINGS.format(directory=directory))
    stage.run("ip", "-n", space, "link", "set", "lo", "up")
    for name, address in CARDS.items():
        write(f"{directory}/connections/{name}.nmconnection", CARD.format(name=name, address=address))
        stage.run("ip", "-n", space, "link", "add", name, "type", "veth", "peer", "name", f"far-{name}")
        stage.run("ip", "-n", space, "link", "set", f"far-{name}", "up")


@contextlib.contextmanager
def space():
    name = f"quendra-dial-{os.getpid()}"
    stage.run("ip", "netns", "add", name)
    try:
        yield name
    finally:
        stage.end_processes_of(name)
        subprocess.run(["ip", "netns", "delete", name])


def missing():
    """Why there is none; empty when there can be one."""
    if os.geteuid() != 0:
        return "not root"
    return "" if shutil.which("NetworkManager") else "it isn't installed"


def await_cards(manager):
    for _ in range(100):
        if all(address in manager.addresses(card) for card, address in CARDS.items()):
            return
        time.sleep(0.1)
    raise RuntimeError("the network manager gives its cards no addresses")


def start(stack):
    """Its bus becomes the system's bus of the program and of this script."""
    directory = stack.enter_context(stage.private_directory())
    own = stack.enter_context(space())
    prepare(directory, own)
    log = stack.enter_context(open(f"{directory}/log", "w"))
    bus = ["dbus-daemon", "--nofork", f"--config-file={directory}/bus.conf", "--print-address"]
    daemon = stack.enter_context(stage.started(bus, stdout=subprocess.PIPE, stderr=log, text=True))
    os.environ["DBUS_SYSTEM_BUS_ADDRESS"] = daemon.stdout.readline().strip()
    script = START.format(directory=directory)
    command = stage.in_namespace(own, "unshare", "-m", "bash", "-c", script)
    stack.enter_context(stage.started(command, stdout=log, stderr=log))
    manager = NetworkManager(own, directory)
    await_cards(manager)
    return manager
