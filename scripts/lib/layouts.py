#!/usr/bin/python3
"""Types every key of the keyboard, plain and with Shift, into the boxes of the first connection whose keys are mended, on a
virtual display, once with the English and once with the Hebrew layout, and compares what arrives with what shall. Ends
non-zero when a key differs.

    layouts.py PROGRAM"""

import contextlib
import subprocess
import sys
import time

from gi.repository import GLib

import stage
import tour
from accessible import Program
from seen import wait_for
from walk import Walk

FIELD, MARK = "frsCon_txtUsername", "frsCon_lblError(0)"
PASSWORD, MAIL_NAME = "frsCon_txtPassword", "frsCon_txtEmailUN"
MENU, CONNECTION_STEP, MAIL_STEP = "lblCaption(2)", "frsCon_lblCaption(1)", "frsCon_lblCaption(0)"

# Keys by the codes of the X server, row by row, named by what they bear on a Latin keyboard.
ROWS = ((10, "1234567890-="), (24, "qwertyuiop[]"), (38, "asdfghjkl;'`"), (51, "\\zxcvbnm,./"), (65, " "))
KEYS = {key: first + place for first, row in ROWS for place, key in enumerate(row)}
LETTERS = "abcdefghijklmnopqrstuvwxyz"

# What a key types besides a letter and a digit, which each give themselves; all else is refused. With Shift a letter gives
# its small form, and of the digits two give a mark that an address may hold.
PLAIN = {"us": {"-": "-", ".": "."}, "il": {"-": "-", "/": "."}}
SHIFTED = {"-": "_", "2": "@", "3": "#"}


def expected(layout, key, shift):
    """What shall arrive, nothing for a key that is refused."""
    if key in LETTERS:
        return key
    if shift:
        return SHIFTED.get(key, "")
    return key if key.isdigit() else PLAIN[layout].get(key, "")


class Typist:
    """At a field, which is empty between one press and the next, and the user name without a mark too."""

    def __init__(self, program, name=FIELD):
        self.program = program
        self.field = program.control(name)
        self.is_secret = name == PASSWORD

    def press(self, *strokes):
        stage.run("xdotool", "key", *strokes)

    def typed(self):
        """Of a password nobody learns more than its length."""
        return "*" * self.field.length() if self.is_secret else self.field.text()

    def is_marked(self):
        return self.program.find(MARK) is not None

    def empty(self):
        self.press(*["BackSpace"] * (len(self.typed()) + 1))
        wait_for("an empty field without a mark", lambda: self.typed() == "" and not self.is_marked())

    def type_all(self, strokes, wanted):
        """Every key in a row; gives what is wrong, a sentence or nothing."""
        wanted = "*" * len(wanted) if self.is_secret else wanted
        self.press(*strokes)
        right = soon(lambda: self.typed() == wanted)
        said = self.typed()
        self.empty()
        return [] if right else [f"all keys give {said!r} in place of {wanted!r}"]

    def type_refused(self, stroke, key):
        self.press(stroke)
        right = soon(self.is_marked) and self.typed() == ""
        self.empty()
        return [] if right else [f"{key!r} is not refused with a mark"]


def soon(question):
    try:
        return wait_for("the key", question, 3)
    except RuntimeError:
        return False


def stroke(key, shift):
    return f"shift+{KEYS[key]}" if shift else str(KEYS[key])


def set_layout(layout):
    stage.run("setxkbmap", "-layout", layout)
    time.sleep(0.5)  # until the program has heard of it


def type_all(program, layout, field):
    """All keys into that field, where the focus is."""
    wrong = []
    for shift in (False, True):
        wanted = "".join(expected(layout, key, shift) for key in KEYS)
        wrong += Typist(program, field).type_all([stroke(key, shift) for key in KEYS], wanted)
    return [f"layout {layout}, {field}: {sentence}" for sentence in wrong]


def type_refused(program, layout):
    """Each key that the user name refuses by itself, for its mark."""
    typist = Typist(program)
    wrong = []
    for shift in (False, True):
        for key in (key for key in KEYS if not expected(layout, key, shift)):
            wrong += typist.type_refused(stroke(key, shift), key)
    return [f"layout {layout}: {sentence}" for sentence in wrong]


def go_to(program, walk, *controls):
    for control in controls:
        program.control(control)
        time.sleep(0.5)  # a window that has just come up loses the first click
        walk.click(control)


def type_into_each(program, walk):
    wrong = []
    for step, field in ((CONNECTION_STEP, FIELD), (CONNECTION_STEP, PASSWORD), (MAIL_STEP, MAIL_NAME)):
        go_to(program, walk, step, field)
        for layout in PLAIN:
            set_layout(layout)
            wrong += type_all(program, layout, field)
            wrong += type_refused(program, layout) if field == FIELD else []
        go_to(program, walk, "frsCon_lblBack")
    return wrong


def perform(command):
    with contextlib.ExitStack() as stack:
        tour.set_scene(stack, 1280, 860)
        child = stack.enter_context(stage.started([command]))
        program = Program(child.pid)
        walk = Walk(program, None)
        go_to(program, walk, "Label2", MENU)
        return type_into_each(program, walk)


def main():
    try:
        wrong = perform(sys.argv[1])
    except (RuntimeError, subprocess.SubprocessError, GLib.Error) as fault:
        wrong = [str(fault)]
    for sentence in wrong:
        print(f"layouts: WRONG: {sentence}")
    print(f"layouts: {len(KEYS)} keys, plain and with Shift, in two layouts and three boxes: {'failed' if wrong else 'all as they shall be'}")
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
