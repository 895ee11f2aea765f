"""The dialogs that the monitor page opens, as a user sees them: the checks of three ports, and the memory's figures."""

import re
import time

from seen import wait_for

PORTS = {80: "Label3", 25: "Label4", 110: "Label6"}
# Each with the line of /proc/meminfo that it follows; None where the figure is of another origin.
MEMORY = {
    "txtPhysicalMemory": "MemTotal",
    "txtAPhysicalMemory": None,
    "txtVirtualMemory": None,
    "txtAVirtualMemory": None,
    "txtPageFile": None,
    "txtAPageFile": None,
    "txtMemoryUsage": None,
}
MOST_KILOBYTES = 0x7FFFFFFF // 1024


class DialogStep:
    """Opens a dialog, and closes it."""

    def __init__(self, walk):
        self.walk = walk
        self.program = walk.program

    def open(self, button):
        self.before = len(self.program.windows())
        self.walk.click(button)
        wait_for(f"the dialog of {button}", lambda: len(self.program.windows()) > self.before)

    def await_end(self):
        wait_for("the dialog to close", lambda: len(self.program.windows()) == self.before)


class PortsStep(DialogStep):
    """Waits for the three answers and closes the dialog by its button."""

    def answers(self):
        """By port; empty while one is missing."""
        answers = {port: self.program.control(label).name for port, label in PORTS.items()}
        return answers if all(answers.values()) else {}

    def take(self, servers_are_there):
        """Gives the answers and what is wrong with them."""
        self.open("main_cmdChecks")
        answers = wait_for("the answers of three ports", self.answers, 30)
        time.sleep(0.3)
        self.walk.picture("ports")
        self.walk.click("Command2")
        self.await_end()
        wrong = [
            f"port {port} says {answer!r}"
            for port, answer in answers.items()
            if servers_are_there and not answer.startswith("OK! (")
        ]
        return answers, wrong


class MemoryStep(DialogStep):
    """Reads the figures and closes the dialog by a key."""

    def take(self):
        """Gives the figures by field, and what is wrong with them."""
        self.open("main_cmdMemInfo")
        figures = {field: wait_for(field, lambda: self.program.control(field).text()) for field in MEMORY}
        self.walk.picture("memory")
        self.walk.xdotool("key", "Escape")
        self.await_end()
        return figures, self.wrong(figures)

    @staticmethod
    def wrong(figures):
        wrong = []
        for field, origin in MEMORY.items():
            form = r"\d+ %" if field == "txtMemoryUsage" else r"\d{1,3}(,\d{3})* Kb"
            if not re.fullmatch(form, figures[field]):
                wrong.append(f"{field} shows {figures[field]!r}")
            elif origin and figures[field] != kilobytes(origin):
                wrong.append(f"{field} shows {figures[field]!r}, the system says {kilobytes(origin)!r}")
        return wrong


def kilobytes(line):
    """A figure of the system as the dialog must show it."""
    with open("/proc/meminfo") as lines:
        told = next(int(text.split()[1]) for text in lines if text.startswith(line + ":"))
    return f"{min(told, MOST_KILOBYTES):,} Kb"
