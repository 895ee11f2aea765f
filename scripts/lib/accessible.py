"""The running program as a screen reader sees it: controls by the name they have in the code, their places on the
screen, and the rows of the process table. Needs DISPLAY and DBUS_SESSION_BUS_ADDRESS before the first question."""

import subprocess

import gi

gi.require_version("Atspi", "2.0")
from gi.repository import Atspi  # noqa: E402

import seen  # noqa: E402
from seen import SHOWN_COLUMNS, TABLE  # noqa: E402


def children(node):
    for index in range(node.get_child_count()):
        if child := node.get_child_at_index(index):
            yield child


def below(node, depth=12):
    yield node
    if depth and node.get_role() not in (Atspi.Role.TABLE, Atspi.Role.TREE_TABLE, Atspi.Role.TREE):
        for child in children(node):
            yield from below(child, depth - 1)


class Control:
    """A control as assistive technology is told of it: its description is its name in the code."""

    def __init__(self, node):
        self.node = node

    @property
    def code(self):
        return self.node.get_description()

    @property
    def name(self):
        return self.node.get_name()

    def text(self):
        return Atspi.Text.get_text(self.node.get_text_iface(), 0, -1)

    def length(self):
        return Atspi.Text.get_character_count(self.node.get_text_iface())

    def chosen(self):
        """The chosen item of a list that hangs down, without the marks that keep Latin letters in their order."""
        return self.name.strip(seen.DIRECTION_MARKS)

    @property
    def is_secret(self):
        return self.node.get_role() == Atspi.Role.PASSWORD_TEXT

    @property
    def is_enabled(self):
        return self.node.get_state_set().contains(Atspi.StateType.ENABLED)

    def centre(self):
        return centre_of(self.node)


class Program(seen.Program):
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

    def controls(self):
        node = self.node()
        return map(Control, below(node)) if node else ()

    def find(self, name):
        """The showing control with a name in the code; None when there is none."""
        for control in self.controls():
            if control.code == name and control.node.get_state_set().contains(Atspi.StateType.SHOWING):
                return control
        return None

    def focused(self):
        """The control with the focus; None when none of the program's own has it."""
        for control in self.controls():
            if control.code and control.node.get_state_set().contains(Atspi.StateType.FOCUSED):
                return control
        return None

    def windows(self):
        """The newest last."""
        node = self.node()
        return list(map(Control, children(node))) if node else []

    def texts(self, window):
        return [control.get_name() for control in below(window.node) if control.get_name()]

    def button(self, window):
        """The first one in a window."""
        return next(Control(node) for node in below(window.node) if node.get_role() == Atspi.Role.PUSH_BUTTON)

    def table(self, name=TABLE):
        return Table(self.control(name).node)

    def frames(self):
        """The windows as the display knows them."""
        command = ["xdotool", "search", "--onlyvisible", "--pid", str(self.process)]
        return subprocess.run(command, capture_output=True, text=True).stdout.split()

    def owns(self, process):
        return process == self.process


def centre_of(node):
    box = node.get_extents(Atspi.CoordType.SCREEN)
    return box.x + box.width // 2, box.y + box.height // 2


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
