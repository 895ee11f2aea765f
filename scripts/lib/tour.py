#!/usr/bin/python3
"""Walks through the program on a virtual display as a user would, with real clicks and keys, while real clients and
servers exchange data over a link of its own, and sends a report to a stand-in support server. Leaves screenshots in
build/screens, prints the process table as a screen reader sees it and the report as the server got it, and ends non-zero
when the program, the table, a rate or the report isn't as it should be.

The link and the traffic need root. Without it the program runs on this machine as it is and the table has no rates."""

import contextlib
import dataclasses
import glob
import os
import signal
import subprocess
import sys
import time

from gi.repository import GLib

import cast
import report
import stage
import surf
from accessible import Program
from checks import missing_processes, missing_rates
from read_table import as_text
from walk import Walk

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
PROGRAM = os.environ.get("QUENDRA", f"{ROOT}/build/linux/quendra")
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


def send_report(walk, support):
    """Gives what is wrong with the report. Without a support server the button isn't pressed."""
    if not support.folder:
        say(f"no report is sent: {support.reason}")
        return []
    with report.silence(support.spaces, walk.program.process):
        number, body, wrong = report.ReportStep(walk, support.folder).take()
    say(f"report {number}, as the support server received it, {len(body)} bytes:")
    print(report.as_lines(body))
    return wrong


def check_surfing(walk, servers_are_there):
    """The page for surf problems; gives what is wrong with it."""
    rows, wrong = surf.SurfStep(walk).take(servers_are_there)
    for details, caption, icon in rows:
        print(f"surf: {icon or '-':9} {caption} {details}".rstrip())
    if os.geteuid() == 0:  # who else may send echoes is up to the machine
        report_text, lacks = surf.TraceStep(walk).take("127.0.0.1")
        print(report_text)
        wrong += lacks
    walk.click("surf_lblBack")
    return wrong


def check_ports(walk, servers_are_there):
    answers, wrong = surf.PortsStep(walk).take(servers_are_there)
    for port, answer in answers.items():
        print(f"port {port}: {answer}")
    return wrong


def tour(program, child, ports, servers):
    walk = Walk(program, SCREENS)
    try:
        return walk_through(walk, child, ports, servers)
    except RuntimeError:
        walk.picture("where-it-failed")
        raise


def walk_through(walk, child, ports, servers):
    program = walk.program
    walk.splash()
    walk.home()
    walk.monitor()
    rows, wrong = watch_table(program, ports)
    walk.picture("monitor")
    print(as_text(program.table().captions(), rows, limit=40))
    for label in ("main_lblUpload", "main_lblDownload"):
        print(f"{label}: {program.control(label).get_name()}")
    walk.column()
    walk.about()
    print("\n".join(walk.addresses()))
    wrong += send_report(walk, servers.support)
    wrong += check_ports(walk, servers.all_there)
    wrong += check_surfing(walk, servers.all_there)
    walk.first_connection()
    walk.monitor()
    time.sleep(3)
    walk.picture("monitor-again")
    walk.close()
    try:
        status = child.wait(10)
    except subprocess.TimeoutExpired:
        status = "none: it still runs"
    if status != 0:
        wrong.append(f"the program was closed and its status is {status}")
    return wrong


def set_scene(stack, *screen):
    """Display and buses; gives the environment that the program and this script share."""
    directory = stack.enter_context(stage.private_directory())
    os.environ.update(XDG_RUNTIME_DIR=directory, XDG_DATA_HOME=f"{directory}/data")
    os.environ["DISPLAY"] = stack.enter_context(stage.display(directory, *screen))
    os.environ["DBUS_SESSION_BUS_ADDRESS"] = stack.enter_context(stage.message_bus(directory))
    os.environ["QT_LINUX_ACCESSIBILITY_ALWAYS_ON"] = "1"
    os.environ["QT_QPA_PLATFORM"] = "xcb"
    # The session on this display is this user's own, whoever called sudo.
    os.environ.pop("SUDO_UID", None)


@dataclasses.dataclass
class Servers:
    support: report.Support
    all_there: bool


def start_servers(stack, spaces):
    """The stand-ins that the report and the checks speak to."""
    support = report.start_server(stack, spaces, cast.SECONDS)
    missing = surf.start_mail_servers(stack, spaces, cast.SECONDS)
    for reason in missing:
        say(f"a mail server is missing: {reason}")
    return Servers(support, bool(support.folder) and not missing)


def perform():
    os.makedirs(SCREENS, exist_ok=True)
    for old in glob.glob(f"{SCREENS}/*.png"):
        os.remove(old)
    with contextlib.ExitStack() as stack:
        set_scene(stack)
        command, ports, spaces = [PROGRAM], {}, []
        if os.geteuid() == 0:
            spaces = here, there = stack.enter_context(stage.linked_namespaces())
            ports = cast.start_traffic(stack, {"here": here, "there": there})
            command = stage.in_namespace(here, PROGRAM)
            say("traffic runs, local ports " + ", ".join(f"{name} {port}" for name, port in ports.items()))
        else:
            say("not root: no capture, no traffic of its own, so no rates are looked for")
        servers = start_servers(stack, spaces)
        child = stack.enter_context(stage.started(command))
        return tour(Program(child.pid), child, ports, servers)


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
