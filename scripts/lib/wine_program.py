"""The running Windows edition by its windows: each that stands for a control has the control's name as a property, and
what is spoken as its text. A reader in the bed asks them; see tests/standins/windows/reader."""

import contextlib
import json
import subprocess

import seen
from bed import ROOT
from seen import SHOWN_COLUMNS, TABLE

READER = f"{ROOT}/build/windows/standins/window_reader.exe"
TOP_WINDOW, BOX = "QuendraForm", "box"
KINDS = ("Edit", "ComboBox", "ListBox", "SysListView32")  # of the system, one in the window of its control
SECRET = 0x20  # ES_PASSWORD
ICONS = ("ico_check", "ico_x")


class Reader:
    """Speaks with the reader, a line a question."""

    def __init__(self, process):
        self.process = process

    def ask(self, question, subject):
        try:
            self.process.stdin.write(f"{question} {subject}\n")
            self.process.stdin.flush()
            answer = json.loads(self.process.stdout.readline())
        except (OSError, ValueError) as fault:
            raise seen.Busy("the reader of windows is gone") from fault
        if answer is None:
            raise seen.Busy(f"{question} {subject}")
        return answer


@contextlib.contextmanager
def reader(bed):
    command = bed.wine(READER)
    with subprocess.Popen(command, stdin=subprocess.PIPE, stdout=subprocess.PIPE, text=True) as process:
        try:
            yield Reader(process)
        finally:
            with contextlib.suppress(OSError):
                process.stdin.close()
            process.wait(20)


class Node:
    """A window with those in it."""

    def __init__(self, told):
        self.told = told
        self.children = []

    def below(self):
        yield self
        for child in self.children:
            yield from child.below()


class Control:
    def __init__(self, node, reader):
        self.node = node
        self.reader = reader

    @property
    def code(self):
        return self.node.told["name"]

    @property
    def name(self):
        return self.node.told["text"]

    @property
    def window(self):
        return self.node.told["window"]

    def inner(self):
        """The window of the system's kind that a field holds."""
        return next((child for child in self.node.children if child.told["class"] in KINDS), self.node)

    def ask(self, question):
        return self.reader.ask(question, self.inner().told["window"])

    def text(self):
        return self.ask("field").get("text", "").replace("\r\n", "\n")

    def length(self):
        return self.ask("field")["length"]

    def chosen(self):
        told = self.ask("items")
        return told["items"][told["chosen"]] if told["chosen"] >= 0 else ""

    @property
    def is_secret(self):
        return self.inner().told["class"] == "Edit" and bool(self.inner().told["style"] & SECRET)

    @property
    def is_enabled(self):
        return self.node.told["enabled"]

    @property
    def has_focus(self):
        """In its own window or in the system's inside it."""
        return any(node.told["focus"] for node in (self.node, *(n for n in self.node.children if not n.told["name"])))

    def centre(self):
        left, top, width, height = self.node.told["place"]
        return left + width // 2, top + height // 2


class Program(seen.Program):
    """The one program of this kind that runs in the bed."""

    def __init__(self, bed, reader):
        self.bed = bed
        self.reader = reader

    def tops(self):
        """The windows of the screen, the highest last."""
        nodes, tops = {}, []
        for told in self.reader.ask("tree", TOP_WINDOW):
            node = nodes[told["window"]] = Node(told)
            if told["parent"]:
                nodes[told["parent"]].children.append(node)
            else:
                tops.insert(0, node)
        return tops

    def controls(self):
        return [Control(node, self.reader) for top in self.tops() for node in top.below() if node.told["name"]]

    def find(self, name):
        return next((control for control in self.controls() if control.code == name), None)

    def focused(self):
        return next((control for control in reversed(self.controls()) if control.has_focus), None)

    def windows(self):
        return [Control(top, self.reader) for top in self.tops()]

    def texts(self, window):
        return [node.told["text"] for node in window.node.below() if node.told["text"]]

    def button(self, window):
        """Those of a box have numbers for names."""
        return next(Control(node, self.reader) for node in window.node.below() if node.told["name"].isdigit())

    def table(self, name=TABLE):
        return Table(self.control(name).ask("table"))

    def frames(self):
        command = ["xdotool", "search", "--onlyvisible", "--class", "^quendra"]
        return subprocess.run(command, capture_output=True, text=True).stdout.split()

    def owns(self, process):
        """Stops with whatever the bed has in common with it."""
        return self.bed.has(process)


class Table:
    """A list as it was read at once."""

    def __init__(self, told):
        self.headers = told["headers"]
        self.told = told

    def captions(self):
        return [header["caption"] for header in self.headers[:SHOWN_COLUMNS]]

    def place_of_header(self, column):
        return self.headers[column]["place"]

    def cell(self, row, column):
        """A cell with an icon alone tells the icon's name, which is no text of it."""
        text = self.told["rows"][row][column]
        return "" if text in ICONS else text

    def column(self, column, rows):
        return [self.cell(row, column) for row in range(min(rows, len(self.told["rows"])))]

    def selected(self):
        return self.told["selected"]

    def rows(self):
        columns = range(min(SHOWN_COLUMNS, len(self.headers)))
        return [[self.cell(row, column) for column in columns] for row in range(len(self.told["rows"]))]

    def description(self, row, column):
        text = self.told["rows"][row][column]
        return text if text in ICONS else ""
