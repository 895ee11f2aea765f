#!/usr/bin/python3
"""Walks through the program on a virtual display as a user would, with real clicks and keys, while real clients and
servers exchange data over a link of its own: sends a report to a stand-in support server, has a file shown and a process
ended, opens every dialog, runs the checks of the page for surf problems and traces a route, makes the first connection
for each modem and the mail account for each mail program, and looks for what is wrong with a connection. Leaves
screenshots in build/screens and what servers and files say in build/linux-tour, prints what the table, the report, each row and each dialog say and what other tools find
afterwards, and ends non-zero when something isn't as it should be.

The link, the traffic, the route and the network manager need root. Without it the program runs on this machine as it is, the table has no
rates, no route is traced and no connection is made."""

import contextlib
import dataclasses
import glob
import os
import signal
import subprocess
import sys
import time

from gi.repository import GLib

import actions
import cast
import connection
import desktop
import dialogs
import keep
import keys
import mail
import network_manager
import report
import stage
import surf
import trace
from accessible import Program
from checks import missing_processes, missing_rates
from read_table import as_text
from walk import Walk

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
PROGRAM = os.environ.get("QUENDRA", f"{ROOT}/build/linux/quendra")
# The same on a machine that has mail programs.
OFFICE = os.environ.get("QUENDRA_OFFICE", f"{ROOT}/build/linux/quendra_office")
MAIL_DOMAIN = "localhost"
SCREENS = f"{ROOT}/build/screens"


def say(text):
    print(f"tour: {text}", flush=True)


def watch_table(program, ports):
    """Reads the table until every rate is there, for some passes at most; gives the last rows and what they lack."""
    for _ in range(25):
        time.sleep(1)
        rows = program.table().rows()
        wrong = missing_rates(rows, ports) if ports else []
        if not wrong:
            break
    return rows, wrong + missing_processes(rows, ("Xvfb", "explorer.exe", os.path.basename(PROGRAM)))


def send_report(walk, support, keeper):
    """Gives what is wrong with the report. Without a support server the button isn't pressed."""
    if not support.folder:
        say(f"no report is sent: {support.reason}")
        return []
    with report.silence(support.spaces, walk.program):
        number, body, wrong = report.ReportStep(walk, support.folder).take()
    say(f"report {number}, as the support server received it, {len(body)} bytes:")
    print(report.as_lines(body))
    keeper.report(support.folder)
    return wrong


def go_round(walk, *wanted):
    """By the Tab key; gives what is wrong with its stops."""
    stops, wrong = keys.KeysStep(walk).take(wanted)
    print("keys: " + ", ".join(stops))
    return wrong


def act_on_process(walk, scene):
    with report.silence(scene.spaces, walk.program):
        lines, wrong = actions.ActionsStep(walk, scene.desktop, scene.victim).take()
    print("\n".join(lines))
    return wrong


def check_ports(walk, scene):
    answers, wrong = dialogs.PortsStep(walk).take(scene.servers_are_there)
    scene.keeper.tell("ports.txt", [f"{port}: {answer}" for port, answer in answers.items()])
    return wrong


def read_memory(walk, scene):
    figures, wrong = dialogs.MemoryStep(walk).take()
    scene.keeper.tell("memory.txt", [f"{field}: {figure}" for field, figure in figures.items()])
    return wrong


def check_surfing(walk, scene):
    """The page for surf problems; gives what is wrong with it."""
    rows, wrong = surf.SurfStep(walk).take(scene.servers_are_there)
    scene.keeper.tell("surf.txt", surf.as_lines(rows))
    wrong += go_round(walk, surf.LIST, "frmSurf_cmdAdvanced", "surf_lblBack")
    if scene.route:
        said, lacks = trace.TraceStep(walk).take(scene.route)
        scene.keeper.tell("trace.txt", said)
        wrong += lacks
    walk.click("surf_lblBack")
    return wrong


def connect(walk, scene):
    """The page of the first connection; gives what is wrong with it."""
    if not scene.manager:
        walk.first_connection()
        return []
    scene.manager.add_entry("Office")
    wrong = connection.ConnectionStep(walk, scene.manager, scene.keeper).take()
    wrong += look_for_trouble(walk, scene)
    walk.click("frsCon_lblCaption(0)")
    wrong += connection.MailStep(walk).take([0])
    print("\n".join(mail.lines()))
    walk.click("frsCon_lblBack")
    walk.click("frsCon_lblBack")
    return wrong


def look_for_trouble(walk, scene):
    step = connection.TroubleStep(walk)
    said, wrong = step.simulate(connection.ENTRY, scene.manager)
    scene.keeper.tell("trouble-691.txt", said)
    said, lacks = step.dial(connection.ENTRY)
    scene.keeper.tell("trouble-dial.txt", said)
    return wrong + lacks


def make_mail_accounts(walk, scene):
    """In a program on a machine that has the mail programs; gives what is wrong with the accounts."""
    walk.splash()
    walk.click("lblCaption(2)")
    walk.click("frsCon_lblCaption(0)")
    step = connection.MailStep(walk)
    wrong = step.take([0, 1, 2, 4])
    found = mail.left()
    print("\n".join(mail.lines(found)))
    scene.keeper.mail(found)
    print(f"the desktop {scene.desktop.wait_for_request('opener')}")
    return wrong + mail.wrong_with(connection.NAME, step.FULL_NAME, MAIL_DOMAIN, found)


def tour(child, pictures, take, scene):
    """Gives what is wrong with a walk through the program and with its end."""
    walk = Walk(Program(child.pid), SCREENS)
    walk.pictures = pictures
    try:
        return take(walk, scene) + end_of(walk, child), walk.pictures
    except RuntimeError:
        walk.picture("where-it-failed")
        raise


def walk_through(walk, scene):
    program = walk.program
    walk.splash()
    walk.home()
    walk.monitor()
    rows, wrong = watch_table(program, scene.ports)
    walk.picture("monitor")
    print(as_text(program.table().captions(), rows, limit=40))
    for label in ("main_lblUpload", "main_lblDownload"):
        print(f"{label}: {program.control(label).name}")
    walk.column()
    walk.about()
    scene.keeper.tell("addresses.txt", walk.addresses())
    wrong += send_report(walk, scene.support, scene.keeper)
    wrong += act_on_process(walk, scene)
    wrong += check_ports(walk, scene)
    wrong += read_memory(walk, scene)
    wrong += go_round(walk, "main_ListView1", *actions.BUTTONS, "main_cmbAdapters")
    wrong += check_surfing(walk, scene)
    wrong += connect(walk, scene)
    walk.monitor()
    time.sleep(3)
    walk.picture("monitor-again")
    return wrong


def end_of(walk, child):
    """Closes the program; gives what is wrong with its end."""
    walk.close()
    try:
        status = child.wait(10)
    except subprocess.TimeoutExpired:
        status = "none: it still runs"
    return [] if status == 0 else [f"the program was closed and its status is {status}"]


def set_scene(stack, *screen):
    """Display and buses; gives the environment that the program and this script share."""
    directory = stack.enter_context(stage.private_directory())
    # The program keeps data, and deletes what browsers keep: never this user's own.
    os.environ.update(
        XDG_RUNTIME_DIR=directory, XDG_DATA_HOME=f"{directory}/data", XDG_CACHE_HOME=f"{directory}/cache"
    )
    os.environ["DISPLAY"] = stack.enter_context(stage.display(directory, *screen))
    os.environ["DBUS_SESSION_BUS_ADDRESS"] = stack.enter_context(stage.message_bus(directory))
    os.environ["QT_LINUX_ACCESSIBILITY_ALWAYS_ON"] = "1"
    os.environ["QT_QPA_PLATFORM"] = "xcb"
    # The session on this display is this user's own, whoever called sudo.
    os.environ.pop("SUDO_UID", None)


@dataclasses.dataclass
class Scene:
    """What the tour has around the program."""

    desktop: desktop.Desktop
    victim: cast.Victim
    keeper: keep.Keeper = dataclasses.field(default_factory=lambda: keep.Keeper("linux"))
    spaces: list = dataclasses.field(default_factory=list)
    ports: dict = dataclasses.field(default_factory=dict)
    route: trace.Route | None = None
    support: report.Support | None = None
    manager: network_manager.NetworkManager | None = None
    servers_are_there: bool = False

    def command(self, program):
        """A program's, on this side of the link where there is one."""
        return stage.in_namespace(self.spaces[0], program) if self.spaces else [program]


def add_network(stack, scene):
    """The link, the traffic on it and a route behind it, as far as this user may make them."""
    if os.geteuid() != 0:
        say("not root: no capture, no traffic of its own and no route, so no rates are looked for and nothing is traced")
        return
    scene.spaces = here, there = stack.enter_context(stage.linked_namespaces())
    scene.ports = cast.start_traffic(stack, {"here": here, "there": there})
    scene.route = stack.enter_context(trace.route(there))
    say("traffic runs, local ports " + ", ".join(f"{name} {port}" for name, port in scene.ports.items()))


def add_network_manager(stack, scene):
    """The one by which connections are made."""
    missing = network_manager.missing()
    if missing:
        say(f"no connection is made, for there is no network manager: {missing}")
    else:
        scene.manager = network_manager.start(stack)


def add_servers(stack, scene):
    """The stand-ins that the report and the checks speak to."""
    scene.support = report.start_server(stack, scene.spaces, cast.SECONDS, f"{scene.keeper.folder}/requests.log")
    missing = surf.start_mail_servers(stack, scene.spaces, cast.SECONDS, scene.keeper.folder)
    for reason in missing:
        say(f"a mail server is missing: {reason}")
    scene.servers_are_there = bool(scene.support.folder) and not missing


def perform():
    os.makedirs(SCREENS, exist_ok=True)
    for old in glob.glob(f"{SCREENS}/*.png"):
        os.remove(old)
    with contextlib.ExitStack() as stack:
        set_scene(stack)
        scene = Scene(desktop.Desktop(stack, cast.SECONDS), cast.start_victim(stack))
        surf.fill_cache()
        add_network(stack, scene)
        add_servers(stack, scene)
        add_network_manager(stack, scene)
        wrong, pictures = tour(stack.enter_context(stage.started(scene.command(PROGRAM))), 0, walk_through, scene)
        office = stack.enter_context(stage.started(scene.command(OFFICE)))
        return wrong + tour(office, pictures, make_mail_accounts, scene)[0]


def too_late(*_):
    raise TimeoutError(f"the tour took more than {cast.SECONDS} s")


def main():
    signal.signal(signal.SIGALRM, too_late)
    for end in (signal.SIGTERM, signal.SIGHUP):
        signal.signal(end, lambda number, _: sys.exit(128 + number))
    signal.alarm(cast.SECONDS)
    try:
        wrong = perform()
    except (RuntimeError, TimeoutError, subprocess.SubprocessError, GLib.Error) as fault:
        wrong = [str(fault)]
    signal.alarm(0)
    for sentence in wrong:
        say(f"WRONG: {sentence}")
    say(f"screenshots are in {os.path.relpath(SCREENS)}")
    say("failed" if wrong else "all as it should be")
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
