"""The running program as a screen reader sees it: controls by the name they have in the code, their places on the
screen, and the rows of the process table. Needs DISPLAY and DBUS_SESSION_BUS_ADDRESS before the first question."""

import re
import time

import gi

gi.require_version("Atspi", "2.0")
from gi.repository import Atspi, GLib  # noqa: E402

TABLE = "main_ListView1"
SHOWN_COLUMNS = 7
APPLICATION, NAME, CLASS, PORTS, UPLOAD, DOWNLOAD, TOTAL = range(7)


def wait_for(what, question, seconds=15):
    """Asks until the answer is true; a program that is busy or gone meanwhile counts as no answer."""
    end = time.monotonic() + seconds
    while time.monotonic() < end:
        try:
            if answer := question():
                return answer
        except GLib.Error:
            pass
        time.sleep(0.1)
    raise RuntimeError(f"waited {seconds} s in vain for {what}")


def children(node):
    for index in range(node.get_child_count()):
        if child := node.get_child_at_index(index):
            yield child


def below(node, depth=12):
    yield node
    if depth and node.get_role() not in (Atspi.Role.TABLE, Atspi.Role.TREE_TABLE, Atspi.Role.TREE):
        for child in children(node):
            yield from below(child, depth - 1)


class Program:
    """The program with a process id, once it has said that it can be read."""

    def __init__(self, process):
        self.process = process

    def node(self):
        """Read afresh: what was asked before may be stale."""
        desktop = Atspi.get_desktop(0)
        for child in children(desktop):
            if child.get_process_id() == self.process:
                child.clear_cache()
                return child
        return None

    def find(self, name):
        """The showing control whose name in the code, its accessible description, is `name`; None when there is none."""
        node = self.node()
        for control in below(node) if node else ():
            if control.get_description() == name and control.get_state_set().contains(Atspi.StateType.SHOWING):
                return control
        return None

    def focused(self):
        """The control with the focus; None when none of the program's own has it."""
        node = self.node()
        for control in below(node) if node else ():
            if control.get_description() and control.get_state_set().contains(Atspi.StateType.FOCUSED):
                return control
        return None

    def control(self, name, seconds=15):
        return wait_for(name, lambda: self.find(name), seconds)

    def windows(self):
        node = self.node()
        return [child for child in children(node)] if node else []

    def texts(self, window):
        return [control.get_name() for control in below(window) if control.get_name()]

    def table(self, name=TABLE):
        return Table(self.control(name))


def centre_of(control):
    box = control.get_extents(Atspi.CoordType.SCREEN)
    return box.x + box.width // 2, box.y + box.height // 2


def text_of(field):
    """What stands in a field."""
    return Atspi.Text.get_text(field.get_text_iface(), 0, -1)


class Table:
    """A list, the process table most of all: captions and rows of texts, column by column as the table holds them."""

    def __init__(self, node):
        self.node = node
        self.table = node.get_table_iface()

    def captions(self):
        return [self.header(column) for column in range(min(SHOWN_COLUMNS, self.table.get_n_columns()))]

    def header(self, column):
        header = self.table.get_column_header(column)
        return header.get_name() if header else ""

    def place_of_header(self, column):
        """The toolkit gives headers of a table that reads from right to left the places that they would have from left to
        right, so the column's first cell says where it lies."""
        header = self.table.get_column_header(column)
        return centre_of(self.table.get_accessible_at(0, column))[0], centre_of(header)[1]

    def cell(self, row, column):
        cell = self.table.get_accessible_at(row, column)
        return cell.get_name() if cell else ""

    def column(self, column, rows):
        """The texts of a column's first rows, quick enough to be of one pass."""
        self.node.clear_cache()
        return [self.cell(row, column) for row in range(min(rows, self.table.get_n_rows()))]

    def selected(self):
        """The numbers of the selected rows."""
        self.node.clear_cache()
        return self.table.get_selected_rows()

    def rows(self):
        self.node.clear_cache()
        columns = range(min(SHOWN_COLUMNS, self.table.get_n_columns()))
        return [[self.cell(row, column) for column in columns] for row in range(self.table.get_n_rows())]

    def description(self, row, column):
        """What a cell without text shows: the name of its icon."""
        cell = self.table.get_accessible_at(row, column)
        return cell.get_description() if cell else ""


def number(text):
    """A rate as the table shows it; an empty cell is none."""
    return float(text) if re.fullmatch(r"\d+(\.\d+)?", text) else 0.0
