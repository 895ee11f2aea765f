"""The page for surf problems as a user opens it, with stand-in mail servers and a browser cache to clean."""

import os
import subprocess
import sys
import time

import stage
from seen import wait_for

GREETER = f"{os.path.dirname(os.path.abspath(__file__))}/../../tests/standins/mail_greeter.py"
LIST = "surf_ListView1"
DETAILS, CHECK, DIAGNOSIS = 1, 2, 3
END = "הסתיים"
TICK, CROSS = "ico_check", "ico_x"
# The rows that the servers of loopback answer, and all of them.
NETWORK_CHECKS, CHECKS = 4, 8
CACHE_CHECK, CACHED = 4, 7


def start_mail_servers(stack, spaces, seconds, logs=None):
    """On loopback, in the first of the network namespaces when there are any. Gives why some are missing, a sentence each.
    What visitors say goes to files in the folder of logs."""
    missing = []
    for protocol, port in (("pop3", "110"), ("smtp", "25")):
        log = f"{logs}/{protocol}.log" if logs else os.devnull
        command = [sys.executable, GREETER, protocol, "--seconds", str(seconds), "--log", log]
        if spaces:
            command = stage.in_namespace(spaces[0], *command)
        greeter = stack.enter_context(
            stage.started(command, stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True)
        )
        if greeter.stdout.readline().strip() != port:
            missing.append(greeter.stderr.read().strip() or f"the {protocol} server doesn't come up")
    return missing


def cache():
    """Where the tour's own browser has its cache, below the folder that the program takes for this user's."""
    return f"{os.environ['XDG_CACHE_HOME']}/mozilla/firefox/tour.default/cache2/entries"


def fill_cache():
    os.makedirs(cache())
    for number in range(CACHED):
        with open(f"{cache()}/{number:040X}", "wb") as entry:
            entry.write(bytes(1000))


def as_lines(rows):
    """A line a row: caption, icon and details."""
    return [f"{caption}: {icon or '-'}: {details}" for details, caption, icon in rows]


class SurfStep:
    """Opens the page, waits for the end of its list and says what each row says."""

    def __init__(self, walk, cached=lambda: len(os.listdir(cache()))):
        self.walk = walk
        self.program = walk.program
        self.cached = cached

    def rows(self):
        """Details, caption and icon of each row."""
        table = self.program.table(LIST)
        return [
            (row[DETAILS], row[CHECK], table.description(number, DIAGNOSIS))
            for number, row in enumerate(table.rows())
        ]

    def take(self, servers_are_there):
        """Gives the rows and what is wrong with them."""
        self.walk.click("lblCaption(1)")
        time.sleep(2)  # the measurements hold the program for some seconds, so nothing else can be asked meanwhile
        self.walk.picture("surf-running")
        self.program.control(LIST)
        wait_for("the end of the surf checks", lambda: self.rows() and self.rows()[-1][1] == END, 60)
        time.sleep(0.4)
        self.walk.picture("surf")
        rows = self.rows()
        return rows, self.wrong(rows, servers_are_there)

    def wrong(self, rows, servers_are_there):
        wrong = []
        if len(rows) != CHECKS + 2:
            wrong.append(f"the surf page has {len(rows)} rows")
        for details, caption, icon in rows[:CHECKS]:
            if icon not in (TICK, CROSS):
                wrong.append(f"the check {caption!r} ended without a tick or a cross")
        for details, caption, icon in rows[:NETWORK_CHECKS] if servers_are_there else ():
            if icon != TICK:
                wrong.append(f"the check {caption!r} has no tick: {details!r}")
        if rows[CACHE_CHECK][0] != f"{CACHED}/{CACHED}" or self.cached():
            wrong.append(f"the cache had {CACHED} entries, has {self.cached()}, and its row says {rows[CACHE_CHECK]}")
        return wrong
