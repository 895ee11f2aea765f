"""What the tour needs of the machine that Wine makes, and reads of it afterwards by other means than the program's: the
libraries that stand in for what Wine lacks, the phone book, the registry, the profile file, the browser's cache."""

import configparser
import os
import re
import struct
import subprocess

import mail
import stage
from bed import ROOT, SYSTEM_FOLDER

STANDINS = f"{ROOT}/build/windows/standins"
PROGRAM = f"{ROOT}/build/windows/quendra.exe"
FRAMES = f"{ROOT}/build/windows-frames"
BOOK, DIALS = "/tmp/phone-book.ini", "/tmp/dials"
# A line without a port to dial by, as where the kernel of the other edition has none, and one whose other side doesn't
# know the user.
NO_PORT, REFUSED = b"*: 0 1 2 633\n", b"*: 0 1 2 3 4 5 691\n"
OVERRIDES = "WINEDLLOVERRIDES=rasapi32=n;mscoree=;mshtml=;winemenubuilder.exe="
# Products of three families that have a mail program, as the machine's list of installed products names them.
PRODUCTS = (
    "{90110409-6000-11D3-8CFE-0050048383C9}",
    "{00160409-78E1-11D2-B60F-006097C998E7}",
    "{90110409-6000-11D3-8CFE-0150048383C9}",
)
PRODUCTS_KEY = r"HKLM\Software\Classes\Installer\Products"
ACCOUNTS_KEY = r"HKCU\Software\Microsoft\Internet Account Manager\Accounts"
PROFILE = "/root/.wine/drive_c/windows/bi.prf"
SECOND_CARD = (
    "ip link add qcard0 type veth peer name qcard1 && ip address add 10.8.0.1/24 dev qcard0 && "
    "ip link set qcard0 up && ip link set qcard1 up"
)


def packed(code):
    """A product's code as the registry writes it: its first three parts from behind, the others by turned pairs."""
    parts = code.strip("{}").split("-")
    rest = "".join(parts[3:])
    return "".join(part[::-1] for part in parts[:3]) + "".join(rest[at + 1] + rest[at] for at in range(0, len(rest), 2))


def furnish(bed):
    """Before the first program of Windows runs there."""
    for library in ("rasapi32", "wpcap"):
        with open(f"{STANDINS}/standin_{library}.dll", "rb") as file:
            bed.put(file.read(), f"{SYSTEM_FOLDER}/{library}.dll")
    script_dials(bed, NO_PORT)
    # Like the office's own line: the troubleshooter has nothing to list where there is a single entry.
    bed.put(b"[Office]\r\nProperties=\r\n", BOOK)
    for product in PRODUCTS:
        bed.run("wine", "reg", "add", rf"{PRODUCTS_KEY}\{packed(product)}", "/f")


def script_dials(bed, script):
    bed.put(script, DIALS)


def command(bed):
    """By which the program is started."""
    settings = [OVERRIDES, f"QUENDRA_PHONE_BOOK=Z:{BOOK}", f"QUENDRA_DIALS_FILE=Z:{DIALS}", f"QUENDRA_FRAMES=Z:{FRAMES}"]
    return bed.command("env", *settings, "wine", PROGRAM)


def record_frames(stack, space):
    """What passes the link goes to a file, from which the capture library takes it."""
    os.makedirs(FRAMES, exist_ok=True)
    for old in os.listdir(FRAMES):
        os.remove(f"{FRAMES}/{old}")
    link = f"qh{os.getpid()}"
    words = ["tcpdump", "-i", link, "-U", "-Z", "root", "-w", f"{FRAMES}/{link}.pcap", "tcp"]
    log = stack.enter_context(open(f"{FRAMES}/log", "w"))
    stack.callback(forget_frames)
    stack.enter_context(stage.started(stage.in_namespace(space, *words), stdout=log, stderr=log))


def forget_frames():
    for old in os.listdir(FRAMES):
        os.remove(f"{FRAMES}/{old}")


def fill_cache(bed, count):
    bed.run("wine", f"{STANDINS}/cache_filler.exe", str(count))


def processes(bed):
    """The command lines of what runs under Wine."""
    lines = bed.run("ps", "-eo", "args", "--no-headers").decode("utf-8", "replace").splitlines()
    return [line for line in lines if re.match(r"\S*\.exe\b", line, re.IGNORECASE)]


def registry_of(content):
    """Keys with their values by name, of a file that the registry editor has exported."""
    keys, values = {}, {}
    for line in content.decode("utf-16").replace("\\\r\n  ", "").splitlines():
        if line.startswith("["):
            values = keys[line.strip("[]")] = {}
        elif found := re.fullmatch(r'"((?:[^"\\]|\\.)*)"=(?:"((?:[^"\\]|\\.)*)"|dword:([0-9a-f]{8}))', line):
            name, text, number = found.groups()
            values[unescaped(name)] = unescaped(text) if number is None else int(number, 16)
        elif line.startswith('"'):
            raise ValueError(f"a value of another kind: {line}")
    return keys


def unescaped(text):
    return re.sub(r"\\(.)", r"\1", text)


def left(bed):
    """What the program has left for mail programs."""
    bed.run("sh", "-c", f"wine reg export '{ACCOUNTS_KEY}' 'Z:\\tmp\\accounts.reg' /y || true")
    found = bed.take("/tmp/accounts.reg")
    keys = registry_of(found) if found else {}
    accounts = {key.rsplit("\\", 1)[1]: dict(sorted(values.items())) for key, values in sorted(keys.items()) if values}
    return mail.Left(accounts, bed.take(PROFILE))


# Of the records that the program hands to remote access: where each field stands, and how long a text may be.
ENTRY_NUMBERS = {
    "options": 4, "country-id": 8, "country-code": 12, "frame-size": 180, "net-protocols": 184, "framing-protocol": 188,
    "sub-entries": 1768, "dial-mode": 1772, "dial-extra-percent": 1776, "dial-extra-sample-seconds": 1780,
    "hang-up-extra-percent": 1784, "hang-up-extra-sample-seconds": 1788, "idle-disconnect-seconds": 1792,
    "entry-type": 1796, "encryption-type": 1800, "custom-auth-key": 1804, "vpn-strategy": 2084,
}  # fmt: skip
ENTRY_TEXTS = {"area-code": (16, 11), "script": (192, 260), "device-name": (989, 129)}
NUMBER_TEXT, TYPE_TEXT = (27, 129), (972, 17)
USER_TEXT, PASSWORD_TEXT = (519, 257), (776, 257)


def text_in(image, place):
    at, width = place
    return image[at : at + width].split(b"\0")[0].decode("cp1255")


class PhoneBook:
    """As its file has it."""

    cards = ()  # Wine's management of network cards can't give them addresses

    def __init__(self, bed):
        self.bed = bed

    def images(self):
        reader = configparser.ConfigParser(delimiters=("=",), interpolation=None)
        reader.read_string((self.bed.take(BOOK) or b"").decode("latin-1"))
        return {name: {key: bytes.fromhex(value) for key, value in reader[name].items()} for name in reader.sections()}

    def entries(self):
        return {name: text_in(found["properties"], TYPE_TEXT) for name, found in self.images().items()}

    def fields(self, name):
        """What the program wrote for an entry, by the names of network_manager.py."""
        found = self.images()[name]
        entry, dial = found["properties"], found.get("dialparams", b"")
        fields = {"type": text_in(entry, TYPE_TEXT), "number": text_in(entry, NUMBER_TEXT)}
        fields |= {field: text_in(entry, place) for field, place in ENTRY_TEXTS.items()}
        fields |= {field: str(struct.unpack_from("<I", entry, at)[0]) for field, at in ENTRY_NUMBERS.items()}
        return fields | {"user": text_in(dial, USER_TEXT), "password": text_in(dial, PASSWORD_TEXT)}


def windows_of(program):
    """Those that a program of Wine's own has on the screen, by its file's name."""
    words = ["xdotool", "search", "--onlyvisible", "--class", f"^{re.escape(program)}$"]
    return subprocess.run(words, capture_output=True, text=True).stdout.split()
