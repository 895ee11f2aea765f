#!/usr/bin/python3
"""Prints the process table of a running program as text, read through the accessibility interface.

    read_table.py PROCESS-ID        (the program started with QT_LINUX_ACCESSIBILITY_ALWAYS_ON=1)
"""

import sys
import unicodedata

from accessible import Program


def width(text):
    return sum(not unicodedata.combining(letter) for letter in text)


def as_text(captions, rows, limit=None):
    """Columns side by side. A mark after each cell keeps Hebrew ones from changing places with their neighbours."""
    lines = [captions, *rows[:limit]]
    widths = [max(width(line[column]) for line in lines) for column in range(len(captions))]
    mark = "\u200e"
    shown = [f"{mark}  ".join(cell + " " * (size - width(cell)) for cell, size in zip(line, widths)) for line in lines]
    shown.insert(1, "-" * (sum(widths) + 2 * len(widths)))
    if limit is not None and len(rows) > limit:
        shown.append(f"... and {len(rows) - limit} more rows")
    return "\n".join(shown)


def main():
    table = Program(int(sys.argv[1])).table()
    print(as_text(table.captions(), table.rows()))


if __name__ == "__main__":
    main()
