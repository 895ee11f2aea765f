#!/usr/bin/python3
"""Walks through the Windows edition under Wine as tour.py does through the other one: the same clicks and keys on a virtual
display, the same stand-in servers, the same link with traffic on it. Leaves screenshots in build/windows-screens and what
servers received and files became in build/windows-tour, says which stations Wine can't show and why, and ends non-zero when
a station fails.

Frames are recorded on the link and handed to the program by a capture library of the tests; remote access is one, too, with
a phone book and dials by a script."""

import contextlib
import dataclasses
import glob
import os
import signal
import subprocess
import sys
import time

import actions
import bed
import cast
import connection
import dialogs
import keep
import keys
import mail
import report
import stage
import surf
import tour
import trace
import wine_machine
import wine_program
from checks import missing_rates
from read_table import as_text
from seen import APPLICATION, NAME, Busy, wait_for
from walk import Walk

EDITOR = "notepad.exe"  # a program of Wine's own with an icon
SCREENS = f"{bed.ROOT}/build/windows-screens"
SECONDS = 400
SERVERS = [
    ("there", "web-server", "serve-bulk", stage.THERE_ADDRESS, 80, 300_000),
    ("there", "backup-server", "serve-sink", stage.THERE_ADDRESS, 8873, 0),
    ("there", "chat-server", "serve-echo", stage.THERE_ADDRESS, 6667, 0),
]
CLIENTS = {"download": ("get", 80), "backup": ("put", 8873, 100_000), "chat": ("talk", 6667)}
# The least rates in kilobytes a second, half of what is sent.
LEAST = {"download": (0.1, 140), "backup": (45, 0.1), "chat": (0.3, 0.3)}
# What the resources of some programs say that they are; those of others say nothing.
KNOWN = {"quendra.exe": "Quendra", EDITOR: "", "explorer.exe": "Wine", "services.exe": ""}
MAIL_TILES = [0, 1, 2, 4]
NO_PORT = "633"
FOLDER = r"Z:\tmp"  # of the programs that are started, as Windows sees it


def say(text):
    print(f"windows tour: {text}", flush=True)


@dataclasses.dataclass
class Scene:
    bed: bed.Bed
    spaces: list
    keeper: keep.Keeper
    support: report.Support
    ports: dict = dataclasses.field(default_factory=dict)
    route: trace.Route | None = None
    victim: cast.Victim | None = None
    servers_are_there: bool = False


class WineActions(actions.ActionsStep):
    """What the program has the system show are windows of Wine's own programs, told by their command lines."""

    def __init__(self, walk, scene):
        super().__init__(walk, None, scene.victim)
        self.bed = scene.bed

    def started(self, word):
        """The command line of the program that was started with the word in it, once it runs."""
        found = wait_for(f"a program started with {word!r}", lambda: self.running_with(word))
        return found[0]

    def running_with(self, word):
        return [line for line in wine_machine.processes(self.bed) if word in line]

    def shown(self, program, picture):
        """Its window, which goes after its picture."""
        window = wait_for(f"a window of {program}", lambda: wine_machine.windows_of(program))[-1]
        time.sleep(1)
        self.walk.picture(picture)
        self.walk.xdotool("windowclose", window)

    def show_file(self):
        self.press("main_lblJumpToPath")
        request = self.started("/select")
        self.shown("explorer.exe", "shown-file")
        return request, [] if request.endswith(f"{FOLDER}\\{self.victim.name}") else [f"the file is shown by {request!r}"]

    def end(self):
        self.press("main_lblEndProcess")
        wait_for(f"the end of {self.victim.name}", lambda: self.victim.process.poll() is not None, 10)
        try:
            wait_for("the row to go", lambda: self.place() is None, 3)
        except RuntimeError:
            return "its row stays", ["the row of an ended process stays"]
        return "at once", []

    def add_or_remove_programs(self):
        self.walk.click("main_cmdAddRemove")
        request = self.started("appwiz.cpl")
        self.shown("rundll32.exe", "programs")
        return request


class Tour:
    """Station by station: one that fails is told and the next one is tried."""

    def __init__(self, walk, scene):
        self.walk = walk
        self.scene = scene
        self.wrong = []

    def station(self, name, take):
        begin = time.monotonic()
        try:
            wrong = take() or []
        except (RuntimeError, Busy, StopIteration, subprocess.SubprocessError, ValueError) as fault:
            self.walk.picture(f"where-{name.replace(' ', '-')}-failed")
            wrong = [f"{fault}"]
        say(f"{name}: {'failed' if wrong else 'done'} in {time.monotonic() - begin:.1f} s")
        self.wrong += [f"{name}: {sentence}" for sentence in wrong]

    def tell(self, name, content):
        self.scene.keeper.tell(name, content)

    def start(self):
        self.walk.splash()
        self.walk.home()
        self.walk.monitor()

    def monitor(self):
        program = self.walk.program
        for _ in range(25):
            time.sleep(1)
            rows = program.table().rows()
            wrong = missing_rates(rows, self.scene.ports, LEAST)
            if not wrong:
                break
        self.walk.picture("monitor")
        print(as_text(program.table().captions(), rows, limit=40))
        for label in ("main_lblUpload", "main_lblDownload"):
            print(f"{label}: {program.control(label).name}")
        alive = len(wine_machine.processes(self.scene.bed))
        if abs(len(rows) - alive) > 3:
            wrong.append(f"{len(rows)} rows for {alive} processes")
        named = {row[NAME]: row[APPLICATION] for row in rows}
        for name, application in KNOWN.items():
            if named.get(name) != application:
                wrong.append(f"the application of {name} is {named.get(name)!r}")
        return wrong

    def look_round(self):
        self.walk.column()
        self.walk.about()
        said = self.walk.addresses()
        self.tell("addresses.txt", said)

    def report(self):
        if not self.scene.support.folder:
            return [self.scene.support.reason]
        with report.silence(self.scene.spaces, self.walk.program):
            number, body, wrong = report.ReportStep(self.walk, self.scene.support.folder).take()
        say(f"report {number}, as the support server received it, {len(body)} bytes:")
        print(report.as_lines(body))
        self.scene.keeper.report(self.scene.support.folder)
        return wrong

    def act(self):
        with report.silence(self.scene.spaces, self.walk.program):
            lines, wrong = WineActions(self.walk, self.scene).take()
        print("\n".join(lines))
        return wrong

    def ports(self):
        answers, wrong = dialogs.PortsStep(self.walk).take(self.scene.servers_are_there)
        self.tell("ports.txt", [f"{port}: {answer}" for port, answer in answers.items()])
        return wrong

    def memory(self):
        figures, wrong = dialogs.MemoryStep(self.walk).take()
        self.tell("memory.txt", [f"{field}: {figure}" for field, figure in figures.items()])
        return wrong

    def go_round(self, *wanted):
        stops, wrong = keys.KeysStep(self.walk).take(wanted)
        print("keys: " + ", ".join(stops))
        return wrong

    def surf(self):
        wine_machine.fill_cache(self.scene.bed, surf.CACHED)
        rows, wrong = surf.SurfStep(self.walk, lambda: 0).take(self.scene.servers_are_there)
        self.tell("surf.txt", surf.as_lines(rows))
        return wrong

    def trace(self):
        said, wrong = trace.TraceStep(self.walk).take(self.scene.route)
        self.tell("trace.txt", said)
        return wrong

    def leave_surfing(self):
        self.walk.click("surf_lblBack")

    def connect(self):
        book = wine_machine.PhoneBook(self.scene.bed)
        return connection.ConnectionStep(self.walk, book, self.scene.keeper).take()

    def trouble(self):
        step = connection.TroubleStep(self.walk, (NO_PORT,))
        said, wrong = step.simulate(connection.ENTRY, wine_machine.PhoneBook(self.scene.bed))
        self.tell("trouble-691.txt", said)
        said, lacks = step.dial(connection.ENTRY)
        self.tell("trouble-dial.txt", said)
        return wrong + lacks

    def refused(self):
        wine_machine.script_dials(self.scene.bed, wine_machine.REFUSED)
        said, wrong = connection.TroubleStep(self.walk).refused(connection.ENTRY)
        self.tell("trouble-refused.txt", said)
        return wrong

    def mail(self):
        self.walk.click("frsCon_lblCaption(0)")
        step = connection.MailStep(self.walk)
        wrong = step.take(MAIL_TILES)
        found = wine_machine.left(self.scene.bed)
        print("\n".join(mail.lines(found)))
        self.scene.keeper.mail(found)
        return wrong + mail.wrong_with(connection.NAME, step.FULL_NAME, tour.MAIL_DOMAIN, found)

    def monitor_again(self):
        self.walk.click("frsCon_lblBack")
        self.walk.click("frsCon_lblBack")
        self.walk.monitor()
        time.sleep(3)
        self.walk.picture("monitor-again")

    def take(self):
        self.station("splash and home", self.start)
        self.station("monitor", self.monitor)
        self.station("sorting, about and addresses", self.look_round)
        self.station("report", self.report)
        self.station("process", self.act)
        self.station("ports", self.ports)
        self.station("memory", self.memory)
        self.station("keys", lambda: self.go_round("main_ListView1", *actions.BUTTONS, "main_cmbAdapters"))
        self.station("surf", self.surf)
        self.station("surf keys", lambda: self.go_round(surf.LIST, "frmSurf_cmdAdvanced", "surf_lblBack"))
        self.station("trace", self.trace)
        self.station("back", self.leave_surfing)
        self.station("first connection", self.connect)
        say("the cards get no addresses for the modem behind a VPN: Wine's management of network cards has no such method")
        self.station("troubleshooter", self.trouble)
        self.station("refused dial", self.refused)
        self.station("mail", self.mail)
        self.station("monitor again", self.monitor_again)
        self.station("end", self.end)
        return self.wrong

    def end(self):
        self.walk.close()
        wait_for("the end of the program", self.has_ended, 10)

    def has_ended(self):
        return not any("quendra.exe" in line for line in wine_machine.processes(self.scene.bed))


def start_clients(stack, opened):
    """Programs of Windows that talk, each from a file of its own name; gives their ports."""
    ports = {}
    for name, (role, port, *rate) in CLIENTS.items():
        talker = start_talker(stack, opened, name, role, stage.THERE_ADDRESS, port, *rate)
        said = talker.stdout.readline().strip()
        if not said:
            raise RuntimeError(f"{name} isn't connected")
        ports[name] = int(said)
    return ports


def start_talker(stack, opened, name, *words):
    with open(f"{wine_machine.STANDINS}/talker.exe", "rb") as file:
        opened.put(file.read(), f"/tmp/{name}.exe")
    command = opened.wine(f"/tmp/{name}.exe", *map(str, words))
    return stack.enter_context(stage.started(command, stdout=subprocess.PIPE, text=True))


def start_victim(stack, opened):
    name = f"runaway-{os.getpid()}"
    process = start_talker(stack, opened, name, "wait", SECONDS)
    process.stdout.readline()
    return cast.Victim(f"{name}.exe", f"/tmp/{name}.exe", process)


def start_editor(stack, opened):
    """Its window is out of the way."""
    stack.enter_context(stage.started(opened.wine(EDITOR)))
    window = wait_for("a window of the editor", lambda: wine_machine.windows_of(EDITOR))[0]
    stage.run("xdotool", "windowminimize", window)


def add_network(stack, scene):
    here, there = scene.spaces
    stage.run(*stage.in_namespace(here, "sh", "-c", wine_machine.SECOND_CARD))
    cast.start_traffic(stack, {"here": here, "there": there}, SERVERS)
    scene.route = stack.enter_context(trace.route(there))
    wine_machine.record_frames(stack, here)


def add_servers(stack, spaces, keeper):
    logs = keeper.folder
    support = report.start_server(stack, spaces, SECONDS, f"{logs}/requests.log")
    missing = surf.start_mail_servers(stack, spaces, SECONDS, logs)
    for reason in missing:
        say(f"a mail server is missing: {reason}")
    return support, bool(support.folder) and not missing


def perform():
    os.makedirs(SCREENS, exist_ok=True)
    for old in glob.glob(f"{SCREENS}/*.png"):
        os.remove(old)
    with contextlib.ExitStack() as stack:
        tour.set_scene(stack)
        spaces = stack.enter_context(stage.linked_namespaces())
        keeper = keep.Keeper("windows")
        support, servers_are_there = add_servers(stack, spaces, keeper)
        opened = stack.enter_context(bed.held_open(spaces))
        scene = Scene(opened, spaces, keeper, support, servers_are_there=servers_are_there)
        wine_machine.furnish(opened)
        add_network(stack, scene)
        scene.ports = start_clients(stack, opened)
        scene.victim = start_victim(stack, opened)
        start_editor(stack, opened)
        stack.enter_context(stage.started(wine_machine.command(opened)))
        reader = stack.enter_context(wine_program.reader(opened))
        return Tour(Walk(wine_program.Program(opened, reader), SCREENS), scene).take()


def too_late(*_):
    raise TimeoutError(f"the tour took more than {SECONDS} s")


def main():
    if os.geteuid() != 0:
        say("failed: without root there is no network for the servers that the program speaks to")
        return 1
    signal.signal(signal.SIGALRM, too_late)
    for end in (signal.SIGTERM, signal.SIGHUP):
        signal.signal(end, lambda number, _: sys.exit(128 + number))
    signal.alarm(SECONDS)
    try:
        wrong = perform()
    except (RuntimeError, TimeoutError, OSError, subprocess.SubprocessError) as fault:
        wrong = [str(fault)]
    signal.alarm(0)
    for sentence in wrong:
        say(f"WRONG: {sentence}")
    say(f"screenshots are in {os.path.relpath(SCREENS)}")
    say(f"what servers received and files became is in {os.path.relpath(keep.folder('windows'))}")
    say("failed" if wrong else "all as it should be")
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
