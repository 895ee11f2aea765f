"""The page for surf problems and the dialog of port checks as a user opens them, with stand-in mail servers."""

import os
import subprocess
import sys
import time

import stage
from accessible import below, wait_for
from gi.repository import Atspi

GREETER = f"{os.path.dirname(os.path.abspath(__file__))}/../../tests/standins/mail_greeter.py"
LIST = "surf_ListView1"
DETAILS, CHECK, DIAGNOSIS = 1, 2, 3
END = "הסתיים"
TICK, CROSS = "ico_check", "ico_x"
# The rows that the servers of loopback answer, and all of them.
NETWORK_CHECKS, CHECKS = 4, 8
PORTS = {80: "Label3", 25: "Label4", 110: "Label6"}


def start_mail_servers(stack, spaces, seconds):
    """On loopback, in the first of the network namespaces when there are any. Gives why some are missing, a sentence each."""
    missing = []
    for protocol, port in (("pop3", "110"), ("smtp", "25")):
        command = [sys.executable, GREETER, protocol, "--seconds", str(seconds)]
        if spaces:
            command = stage.in_namespace(spaces[0], *command)
        greeter = stack.enter_context(
            stage.started(command, stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True)
        )
        if greeter.stdout.readline().strip() != port:
            missing.append(greeter.stderr.read().strip() or f"the {protocol} server doesn't come up")
    return missing


class SurfStep:
    """Opens the page, waits for the end of its list and says what each row says."""

    def __init__(self, walk):
        self.walk = walk
        self.program = walk.program

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
        self.program.control(LIST)
        wait_for("the end of the surf checks", lambda: self.rows() and self.rows()[-1][1] == END, 60)
        time.sleep(0.4)
        self.walk.picture("surf")
        rows = self.rows()
        return rows, self.wrong(rows, servers_are_there)

    @staticmethod
    def wrong(rows, servers_are_there):
        wrong = []
        if len(rows) != CHECKS + 2:
            wrong.append(f"the surf page has {len(rows)} rows")
        for details, caption, icon in rows[:CHECKS]:
            if icon not in (TICK, CROSS):
                wrong.append(f"the check {caption!r} ended without a tick or a cross")
        for details, caption, icon in rows[:NETWORK_CHECKS] if servers_are_there else ():
            if icon != TICK:
                wrong.append(f"the check {caption!r} has no tick: {details!r}")
        return wrong


class PortsStep:
    """Opens the dialog of port checks, waits for its three answers, and closes it."""

    def __init__(self, walk):
        self.walk = walk
        self.program = walk.program

    def answers(self):
        """By port; empty while one is missing."""
        answers = {port: self.program.control(label).get_name() for port, label in PORTS.items()}
        return answers if all(answers.values()) else {}

    def take(self, servers_are_there):
        before = len(self.program.windows())
        self.walk.click("main_cmdChecks")
        wait_for("the dialog of port checks", lambda: len(self.program.windows()) > before)
        answers = wait_for("the answers of three ports", self.answers, 30)
        time.sleep(0.3)
        self.walk.picture("ports")
        self.walk.click("Command2")
        wait_for("the dialog to close", lambda: len(self.program.windows()) == before)
        wrong = [
            f"port {port} says {answer!r}"
            for port, answer in answers.items()
            if servers_are_there and not answer.startswith("OK! (")
        ]
        return answers, wrong


class TraceStep:
    """Opens the advanced panel of the page for surf problems, traces the route to a host and answers the question."""

    QUESTION = "המעקב הסתיים"

    def __init__(self, walk):
        self.walk = walk
        self.program = walk.program

    def question(self):
        """The box at the end of a trace."""
        for window in self.program.windows():
            if any(self.QUESTION in text for text in self.program.texts(window)):
                return window
        return None

    def report(self):
        return Atspi.Text.get_text(self.program.control("frmSurf_txtPingResult").get_text_iface(), 0, -1)

    def take(self, target):
        """Gives the report and what is wrong with it."""
        self.walk.click("frmSurf_cmdAdvanced")
        self.walk.click("frmSurf_txtping")
        self.walk.xdotool("type", "--delay", 40, target)
        self.walk.click("frmSurf_cmdStart")
        box = wait_for("the question at the end of the trace", self.question, 60)
        time.sleep(0.3)
        self.walk.picture("trace")
        button = next(control for control in below(box) if control.get_role() == Atspi.Role.PUSH_BUTTON)
        self.walk.point_at(button)
        self.walk.xdotool("click", 1)
        wait_for("the question to close", lambda: not self.question())
        report = self.report()
        self.walk.click("surf_lblBack")
        wanted = (f"Tracing to {target} ({target})...", "Hop #\t1\t", "Trace Route Complete")
        return report, [f"the trace's report lacks {words!r}" for words in wanted if words not in report]
