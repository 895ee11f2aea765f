"""What the tour's steps know of a program that they look at, whatever edition and whatever way of looking: accessible.py
reads the Linux edition as a screen reader does, wine_program.py the windows of the other one.

A program has find(name), control(name), focused(), windows(), texts(window), button(window), table(name) and frames(), a
control `code`, its name in the code, `name`, as it is spoken, text(), length(), chosen(), is_secret, is_enabled and
centre(), a table captions(), rows(), column(), cell(), description(), selected() and place_of_header()."""

import re
import time

from gi.repository import GLib

TABLE = "main_ListView1"
SHOWN_COLUMNS = 7
APPLICATION, NAME, CLASS, PORTS, UPLOAD, DOWNLOAD, TOTAL = range(7)
DIRECTION_MARKS = "\u200e\u200f\u2066\u2067\u2068\u2069"


class Busy(Exception):
    """The program doesn't answer now."""


def wait_for(what, question, seconds=15):
    """Asks until the answer is true; a program that is busy or gone meanwhile counts as no answer."""
    end = time.monotonic() + seconds
    while time.monotonic() < end:
        try:
            if answer := question():
                return answer
        except (GLib.Error, Busy):
            pass
        time.sleep(0.1)
    raise RuntimeError(f"waited {seconds} s in vain for {what}")


def number(text):
    """A rate as the table shows it; an empty cell is none."""
    return float(text) if re.fullmatch(r"\d+(\.\d+)?", text) else 0.0


class Program:
    """What both ways of looking have in common."""

    def control(self, name, seconds=15):
        return wait_for(name, lambda: self.find(name), seconds)
