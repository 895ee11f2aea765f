"""The page of the first connection as a user goes through it, with the Hebrew layout on, once for each modem; and what
the network manager then holds, as its own tools tell."""

import time
from pathlib import Path

import stage
from seen import wait_for

MODEMS = ("Samsung AHT E300", "Alcatel 510", "Alcatel Speed Touch Home", "ECI B-FoCUS +270/312", "Aztech E600")
BY_VPN = 2
ENTRY, TEST_ENTRY = "097", "097tmp"
# What is typed, key by key on the Hebrew layout, and what arrives.
NAME_KEYS, NAME = "גשמש", "dana"
PASSWORD_KEYS, PASSWORD = "דנ'/6", "sbwq6"
CREATED = "החייגן נוצר בהצלחה."
TRIES_LINE = "מנסה חיבור לזלמר..."
ALREADY_OPEN = "There is currently already a connection open."
CARD_ADDRESS = "10.200.1.1/8"


def dial_failures():
    """The numbers by which a dial may fail that no line answers: without its part for PPP the kernel has no port to
    dial by; with it nobody answers, or the port is taken."""
    return ("633", "678") if Path("/sys/class/ppp").exists() else ("633",)


def as_lines(fields):
    """A line each for those of an entry that aren't empty."""
    return [f"{name}: {value}" for name, value in sorted(fields.items()) if value not in ("", "0")]


def set_layout(name):
    stage.run("setxkbmap", name)
    time.sleep(0.3)


class Boxes:
    """Message boxes of the program, which a user reads and closes."""

    def __init__(self, walk):
        self.walk = walk
        self.program = walk.program

    def find(self, text):
        for window in self.program.windows():
            if any(text in said for said in self.program.texts(window)):
                return window
        return None

    def press(self, text, picture):
        """Waits for the box with the text, and presses its only button."""
        box = wait_for(f"the box {text!r}", lambda: self.find(text), 30)
        time.sleep(0.3)
        self.walk.picture(picture)
        self.walk.point_at(self.program.button(box))
        self.walk.xdotool("click", 1)
        wait_for(f"the box {text!r} to close", lambda: not self.find(text))


class Typist:
    """Types into fields, and waits until what was typed has arrived."""

    def __init__(self, walk):
        self.walk = walk
        self.program = walk.program

    def has_focus(self, field):
        focused = self.program.focused()
        return focused and focused.code == field

    def type_into(self, field, keys, arrives):
        """In place of what the field holds."""
        self.walk.click(field)
        # The window manager may hold a click up, but no key.
        wait_for(f"the focus in {field}", lambda: self.has_focus(field))
        self.walk.xdotool("key", "End", "shift+Home", "BackSpace")
        self.walk.xdotool("type", "--delay", 60, keys)
        wait_for(f"{arrives!r} in {field}", lambda: self.holds(field, arrives))

    def holds(self, field, text):
        """A field for secrets tells no more than how long its text is."""
        control = self.program.control(field)
        return control.length() == len(text) if control.is_secret else control.text() == text


class ConnectionStep:
    """Makes the entry for every modem, one after the other, and stays on the page's mail step."""

    def __init__(self, walk, manager, keeper):
        self.walk = walk
        self.program = walk.program
        self.manager = manager
        self.keeper = keeper
        self.boxes = Boxes(walk)
        self.typist = Typist(walk)

    def fill(self):
        """With the keys of the Hebrew layout."""
        set_layout("il")
        self.typist.type_into("frsCon_txtUsername", NAME_KEYS, NAME)
        self.typist.type_into("frsCon_txtPassword", PASSWORD_KEYS, PASSWORD)
        set_layout("us")

    def choose_card(self):
        """The list of network cards that comes before the box for one of the modems."""
        self.program.control("lstNICs")
        time.sleep(0.3)
        self.walk.picture("network-cards")
        self.walk.click("lstNICs")
        self.walk.xdotool("key", "Home", "Down", "Up")
        self.walk.click("Command1")

    def create(self, modem):
        self.fill()
        self.walk.click(f"frsCon_lblModems({modem})")
        time.sleep(0.3)
        self.walk.picture(f"modem-{modem}")
        self.walk.click("frsCon_cmdCreate")
        if modem == BY_VPN:
            self.choose_card()
        self.boxes.press(CREATED, f"created-{modem}")
        mail_name = wait_for("the mail step", lambda: self.program.control("frsCon_txtEmailUN").text())
        wrong = [] if mail_name == NAME else [f"the mail step has the name {mail_name!r}"]
        return wrong + self.lacks(modem)

    def lacks(self, modem):
        """What the network manager holds other than it should."""
        kind = "vpn" if modem == BY_VPN else "pppoe"
        entries = self.manager.entries()
        wrong = [] if entries.get(ENTRY) == kind else [f"the modem {MODEMS[modem]} leaves the entries {entries}"]
        if "tmp097" in entries:
            wrong.append("the entry tmp097 is left")
        addresses = [self.manager.addresses(card) for card in self.manager.cards]
        if modem == BY_VPN and self.manager.cards and sum(CARD_ADDRESS in told for told in addresses) != 1:
            wrong.append(f"the cards have {addresses!r}")
        return wrong

    def take(self):
        """Gives what is wrong; what the phone book holds is told after each modem."""
        self.walk.click("lblCaption(2)")
        self.program.control("frsCon_lblCaption(1)")
        time.sleep(0.4)
        self.walk.picture("first-connection")
        wrong = []
        for modem in range(len(MODEMS)):
            self.walk.click("frsCon_lblCaption(1)")
            wrong += self.create(modem)
            self.keeper.tell(f"phone-book-{modem}.txt", as_lines(self.manager.fields(ENTRY)))
            self.walk.click("frsCon_lblBack")
        return wrong


class MailStep:
    """On the page's mail step: the account for every program that has a tile."""

    MADE = "חשבון דואר אלקטרוני נוצר בהצלחה."
    FULL_NAME = "דנה לוי"

    def __init__(self, walk):
        self.walk = walk
        self.program = walk.program
        self.boxes = Boxes(walk)

    def tiles(self):
        """Their numbers in the code."""
        return [number for number in range(5) if self.program.find(f"frsCon_lblMails({number})")]

    def take(self, wanted):
        """Gives what is wrong."""
        typist = Typist(self.walk)
        set_layout("il")
        typist.type_into("frsCon_txtFullName", self.FULL_NAME, self.FULL_NAME)
        set_layout("us")
        typist.type_into("frsCon_txtEmailUN", NAME, NAME)
        tiles = self.tiles()
        for tile in tiles:
            self.walk.click(f"frsCon_lblMails({tile})")
            time.sleep(0.3)
            self.walk.picture(f"mail-{tile}")
            self.walk.click("frsCon_cmdCreateEmail")
            self.boxes.press(self.MADE, f"mail-made-{tile}")
        return [] if tiles == list(wanted) else [f"the mail step has the tiles {tiles}, not {list(wanted)}"]


class TroubleStep:
    """Opens the troubleshooter, once with a number of an error and once with a real dial, which fails with one of some
    numbers."""

    def __init__(self, walk, failures=()):
        self.failures = failures or dial_failures()
        self.walk = walk
        self.program = walk.program
        self.boxes = Boxes(walk)

    def open(self):
        self.walk.click("frsCon_lblConnectProb")
        self.program.control("cmdCheck")
        time.sleep(0.3)

    def choose(self, name):
        """By the keyboard, as far down as the name stands."""
        self.walk.click("cmbDialups")
        self.walk.xdotool("key", "Escape")
        for _ in range(20):
            if self.chosen() == name:
                return
            self.walk.xdotool("key", "Down")
            time.sleep(0.1)
        raise RuntimeError(f"the troubleshooter has no connection {name}, but {self.chosen()!r}")

    def chosen(self):
        return self.program.control("cmbDialups").chosen()

    def status(self):
        return self.program.control("txtStatus").text()

    def refused(self, name):
        """A dial that ends in a refused login: the failed connection isn't hung up, so that the one that is to test the
        line finds it open. Gives the status and what is wrong."""
        said = self.check(name, "", TRIES_LINE, 60, self.find_open)
        wrong = [f"the refused dial tells {said!r}"] if "פעולה: 5 - " not in said else []
        self.close()
        return said, wrong

    def find_open(self):
        self.boxes.press(ALREADY_OPEN, "trouble-open")

    def check(self, name, number, end, seconds, meanwhile=lambda: None):
        """Gives what the status says once `end` stands in it. The form stays."""
        self.open()
        self.choose(name)
        if number:
            self.walk.click("txtEmunrateError")
            self.walk.xdotool("type", number)
        self.walk.picture(f"trouble-{number or 'dial'}-before")
        self.walk.click("cmdCheck")
        meanwhile()
        wait_for(f"{end!r} in the status", lambda: end in self.status(), seconds)
        time.sleep(1)
        self.walk.picture(f"trouble-{number or 'dial'}")
        return self.status()

    def close(self):
        self.walk.click("Command1")
        wait_for("the troubleshooter to close", lambda: not self.program.find("cmdCheck"))

    def simulate(self, name, manager):
        """A login that failed; gives the status and what is wrong."""
        said = self.check(name, "691", TRIES_LINE, 30)
        wrong = [] if TEST_ENTRY in manager.entries() else [f"no {TEST_ENTRY} among {manager.entries()}"]
        self.close()
        return said, wrong

    def can_check(self):
        """Whether the button can be pressed, as it can be again once a diagnosis has come to its end."""
        return self.program.control("cmdCheck").is_enabled

    def dial(self, name):
        """A real dial, which no line answers; gives the status and what is wrong."""
        said = self.check(name, "", "שגיאה: ", 60)
        wait_for("the button to check", self.can_check, 60)
        self.walk.picture("trouble-end")
        self.close()
        wrong = [] if "פעולה: 0 - " in said else [f"the dial tells {said!r}"]
        if not any(f"שגיאה: {number} - מטפל..." in said for number in self.failures):
            wrong.append(f"the dial ends in another error: {said!r}")
        return said, wrong
