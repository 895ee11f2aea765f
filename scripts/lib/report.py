"""The report button as a user presses it, and the report as the stand-in support server received it."""

import contextlib
import dataclasses
import glob
import os
import signal
import subprocess
import sys
import time

import stage
from seen import wait_for

SERVER = f"{os.path.dirname(os.path.abspath(__file__))}/../../tests/standins/support_server.py"
PORT = "80"
NUMBER_IS = 'מספר הדו"ח שלך הוא: '
SUCCESS = 'הדו"ח נשלח בהצלחה.'
TRIES = 4


@dataclasses.dataclass
class Support:
    """A support server: the folder of its reports or, without one, the reason; and the namespaces around it."""

    spaces: list
    folder: str = ""
    reason: str = ""


def start_server(stack, spaces, seconds, log=os.devnull):
    """On loopback, in the first of the network namespaces when there are any. The log gets the heads of all requests."""
    folder = stack.enter_context(stage.private_directory())
    command = [sys.executable, SERVER, PORT, "--reports", folder, "--seconds", str(seconds), "--log", log]
    if spaces:
        command = stage.in_namespace(spaces[0], *command)
    server = stack.enter_context(
        stage.started(command, stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True)
    )
    if server.stdout.readline().strip() == PORT:
        return Support(spaces, folder)
    return Support(spaces, reason=server.stderr.read().strip() or "the support server doesn't come up")


@contextlib.contextmanager
def silence(spaces, program):
    """Stops all but the program and the server in the namespaces for a while: without packets the table stays."""
    quiet = []
    for space in spaces:
        listed = subprocess.run(["ip", "netns", "pids", space], capture_output=True, text=True).stdout
        quiet += [int(process) for process in listed.split() if not program.owns(int(process))]
    quiet = [process for process in quiet if "support_server" not in command_line(process)]
    signal_all(quiet, signal.SIGSTOP)
    try:
        time.sleep(1.5)
        yield
    finally:
        signal_all(quiet, signal.SIGCONT)


def command_line(process):
    with contextlib.suppress(OSError), open(f"/proc/{process}/cmdline") as file:
        return file.read()
    return ""


def signal_all(processes, number):
    for process in processes:
        with contextlib.suppress(ProcessLookupError):
            os.kill(process, number)


class ReportStep:
    """Sends reports and compares what came of them with the table."""

    def __init__(self, walk, folder):
        self.walk = walk
        self.program = walk.program
        self.folder = folder

    def box(self, what):
        """The box that stands before the main window, once it says what is waited for; gives the window and its words."""

        def find():
            for window in self.program.windows():
                for text in self.program.texts(window):
                    if what in text:
                        return window, text
            return None

        return wait_for(f"the box that says {what}", find)

    def close(self, window, what):
        self.walk.point_at(self.program.button(window))
        self.walk.xdotool("click", 1)
        wait_for("the box to close", lambda: not any(what in text for w in self.program.windows() for text in self.program.texts(w)))

    def send(self):
        """A real click, both boxes; gives the number that the first one shows."""
        self.walk.click("main_cmdRpt")
        window, text = self.box(NUMBER_IS)
        number = text.split(NUMBER_IS)[1].strip()
        time.sleep(0.3)
        self.walk.picture("report-number")
        self.close(window, NUMBER_IS)
        window, _ = self.box(SUCCESS)
        time.sleep(0.3)
        self.walk.picture("report-sent")
        self.close(window, SUCCESS)
        return number

    def received(self):
        """Head and body of the newest report."""
        name = max(glob.glob(f"{self.folder}/*.body"))
        with open(name, "rb") as body, open(name[: -len("body")] + "head", "rb") as head:
            return head.read(), body.read()

    def take(self):
        """Reports until the table stood still during one of them. Gives the number, the report as the server has it, and
        what is wrong with it."""
        for _ in range(TRIES):
            before = self.program.table().rows()
            number = self.send()
            head, body = self.received()
            if self.program.table().rows() == before:
                return number, body, differences(number, before, head, body)
            time.sleep(1)
        return number, body, [f"the table never stood still during {TRIES} reports"]


def expected_body(number, rows):
    records = ("|".join([row[0], *(cell.replace(",", "~") for cell in row[1:])]) + "}" for row in rows)
    return f"id={number}&procs={''.join(records)}".encode("cp1255", "replace")


def differences(number, rows, head, body):
    """How the server's copy differs from the table, as sentences."""
    wrong = []
    expected = expected_body(number, rows)
    if f"\r\nContent-Length: {len(body)}\r\n".encode() not in head:
        wrong.append(f"{len(body)} bytes of body under a head that says otherwise: {head!r}")
    if body != expected:
        pairs = zip(expected.split(b"}"), body.split(b"}"))
        first = next((f"{mine!r} in the table, {theirs!r} in the report" for mine, theirs in pairs if mine != theirs), "")
        wrong.append(f"the report isn't the table ({len(body)} and {len(expected)} bytes): {first}")
    return wrong


def as_lines(body):
    """One record a line, fields apart by bars, kept from changing places by marks."""
    return body.decode("cp1255", "replace").replace("|", "\u200e|").replace("}", "\u200e}\n").rstrip()
