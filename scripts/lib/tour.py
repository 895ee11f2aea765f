#!/usr/bin/python3
"""Walks through the program on a virtual display as a user would, with real clicks and keys, while real clients and
servers exchange data over a link of its own. Leaves screenshots in build/screens, prints the process table as a screen
reader sees it, and ends non-zero when the program, the table or a rate isn't as it should be.

The link and the traffic need root. Without it the program runs on this machine as it is and the table has no rates."""

import contextlib
import os
import signal
import subprocess
import sys
import time

import stage
from read_table import as_text

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
PROGRAM = os.environ.get("QUENDRA", f"{ROOT}/build/linux/quendra")
SCREENS = f"{ROOT}/build/screens"
SECONDS = 115
KILOBYTE = 1024

# Where, name, role, address, port, bytes a second. Servers stand before their clients.
SERVERS = [
    ("there", "web-server", "serve-bulk", stage.THERE_ADDRESS, 80, 900_000),
    ("there", "backup-server", "serve-sink", stage.THERE_ADDRESS, 8873, 0),
    ("there", "chat-server", "serve-echo", stage.THERE_ADDRESS, 6667, 0),
    ("here", "album-server", "serve-bulk", stage.HERE_ADDRESS, 8080, 150_000),
]
CLIENTS = [
    ("here", "download", "get", stage.THERE_ADDRESS, 80, 0),
    ("here", "backup", "put", stage.THERE_ADDRESS, 8873, 400_000),
    ("here", "chat", "talk", stage.THERE_ADDRESS, 6667, 0),
    ("here", "shell", "talk", stage.THERE_ADDRESS, 6667, 0),
    ("there", "visitor", "get", stage.HERE_ADDRESS, 8080, 0),
]
# The least upload and download rate, in kilobytes a second, of what runs on this side: half of what is sent.
LEAST = {
    "album-server": (75, 0.1),
    "download": (0.1, 450),
    "backup": (200, 0.1),
    "chat": (0.5, 0.5),
    "shell": (0.5, 0.5),
}
APPLICATION, NAME, CLASS, PORTS, UPLOAD, DOWNLOAD, TOTAL = range(7)


def say(text):
    print(f"tour: {text}", flush=True)


def start_traffic(stack, spaces):
    """Gives each local process's name with the port that it serves or speaks from."""
    ports = {}
    for side, name, role, address, port, rate in SERVERS + CLIENTS:
        script = [f"{ROOT}/scripts/lib/traffic.py", name, str(SECONDS), role, address, str(port)]
        child = stack.enter_context(
            stage.started(
                stage.in_namespace(spaces[side], *script),
                stdout=subprocess.PIPE,
                text=True,
                env=dict(os.environ, RATE=str(rate or 1)),
            )
        )
        said = child.stdout.readline().strip()
        if not said:
            raise RuntimeError(f"{name} neither listens nor is connected")
        if side == "here":
            ports[name] = int(said)
    return ports


class Walk:
    """A user's hands: each step clicks or types for real and leaves a picture."""

    def __init__(self, program):
        self.program = program
        self.pictures = 0

    def xdotool(self, *words):
        return stage.run("xdotool", *map(str, words))

    def picture(self, name):
        self.pictures += 1
        stage.run("import", "-window", "root", f"{SCREENS}/{self.pictures:02}-{name}.png")

    def point_at(self, control):
        import accessible

        self.xdotool("mousemove", "--sync", *accessible.centre_of(control))

    def click(self, name):
        self.point_at(self.program.control(name))
        self.xdotool("click", 1)

    def splash(self):
        self.program.control("Label2")
        time.sleep(0.5)
        self.picture("splash")
        self.click("Label1")
        self.program.control("picOut")
        time.sleep(4)
        self.picture("agreement")
        self.click("picOut")
        self.click("Label2")

    def home(self):
        self.program.control("lblCaption(0)")
        time.sleep(0.5)
        self.picture("home")
        self.point_at(self.program.control("lblCaption(1)"))
        time.sleep(0.5)
        self.picture("hover")

    def monitor(self):
        self.click("lblCaption(0)")
        self.program.control("main_ListView1")

    def column(self):
        import accessible

        table = self.program.table()
        self.point_at(table.table.get_column_header(NAME))
        self.xdotool("click", 1)
        time.sleep(0.2)
        self.picture("column")

    def about(self):
        import accessible

        before = len(self.program.windows())
        self.click("Label1")
        accessible.wait_for("the about box", lambda: len(self.program.windows()) > before)
        time.sleep(0.5)
        self.picture("about")
        box = self.program.windows()[-1]
        self.point_at(box)
        self.xdotool("click", 1)
        accessible.wait_for("the about box to close", lambda: len(self.program.windows()) == before)

    def addresses(self):
        import accessible

        before = len(self.program.windows())
        self.xdotool("key", "ctrl+i")
        accessible.wait_for("the address panel", lambda: len(self.program.windows()) > before)
        time.sleep(0.3)
        self.picture("addresses")
        said = self.program.texts(self.program.windows()[-1])
        self.xdotool("key", "Return")
        accessible.wait_for("the address panel to close", lambda: len(self.program.windows()) == before)
        return said

    def other_pages(self):
        for index, back, name in ((1, "surf_lblBack", "surf"), (2, "frsCon_lblBack", "first-connection")):
            self.click(f"lblCaption({index})")
            self.program.control(back)
            time.sleep(0.4)
            self.picture(name)
            self.click(back)

    def close(self):
        window = self.xdotool("search", "--onlyvisible", "--pid", self.program.process).split()[-1]
        self.xdotool("windowactivate", "--sync", window)
        x, y = close_button_of(window)
        self.xdotool("mousemove", "--sync", x, y, "click", 1)


def close_button_of(window):
    """The right end of the title bar that the window manager put above the window."""
    said = stage.run("xwininfo", "-id", window)
    value = {line.split(":")[0].strip(): line.split(":")[-1].strip() for line in said.splitlines() if ":" in line}
    extents = stage.run("xprop", "-id", window, "_NET_FRAME_EXTENTS").split("=")[1].split(",")
    top = int(extents[2])
    right_edge = int(value["Absolute upper-left X"]) + int(value["Width"])
    return right_edge - 10, int(value["Absolute upper-left Y"]) - top // 2


def missing_rates(rows, ports):
    """What is wrong with the rows of the processes that the tour itself started, as sentences."""
    import accessible

    wrong = []
    for name, (upload, download) in LEAST.items():
        owned = [row for row in rows if f".{ports[name]}." in row[PORTS]]
        if not owned:
            wrong.append(f"no row has the port {ports[name]} of {name}")
            continue
        seen = accessible.number(owned[0][UPLOAD]), accessible.number(owned[0][DOWNLOAD])
        if seen[0] < upload or seen[1] < download:
            wrong.append(f"{name} on port {ports[name]} has rates {seen}, at least {(upload, download)} are due")
    return wrong


def missing_processes(rows, program):
    """This machine's processes are in the table: as many as there are, among them the tour's own."""
    wrong = []
    alive = sum(entry.isdigit() for entry in os.listdir("/proc"))
    if abs(len(rows) - alive) > 20:
        wrong.append(f"{len(rows)} rows for {alive} processes")
    for name in ("Xvfb", "openbox", os.path.basename(PROGRAM)):
        if not any(name in row[NAME] for row in rows):
            wrong.append(f"no row for {name}")
    return wrong


def watch_table(program, ports):
    """Reads the table until every rate is there, for some passes at most; gives the last rows and what they lack."""
    for _ in range(25):
        time.sleep(1)
        rows = program.table().rows()
        wrong = missing_rates(rows, ports) if ports else []
        if not wrong:
            break
    return rows, wrong + missing_processes(rows, program)


def tour(program, child, ports):
    walk = Walk(program)
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
    walk.other_pages()
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


def set_scene(stack):
    """Display and buses; gives the environment that the program and this script share."""
    directory = stack.enter_context(stage.private_directory())
    os.environ.update(XDG_RUNTIME_DIR=directory, XDG_DATA_HOME=f"{directory}/data")
    os.environ["DISPLAY"] = stack.enter_context(stage.display(directory))
    os.environ["DBUS_SESSION_BUS_ADDRESS"] = stack.enter_context(stage.message_bus(directory))
    os.environ["QT_LINUX_ACCESSIBILITY_ALWAYS_ON"] = "1"
    os.environ["QT_QPA_PLATFORM"] = "xcb"


def perform():
    os.makedirs(SCREENS, exist_ok=True)
    for old in os.listdir(SCREENS):
        os.remove(f"{SCREENS}/{old}")
    with contextlib.ExitStack() as stack:
        set_scene(stack)
        command, ports = [PROGRAM], {}
        if os.geteuid() == 0:
            here, there = stack.enter_context(stage.linked_namespaces())
            ports = start_traffic(stack, {"here": here, "there": there})
            command = stage.in_namespace(here, PROGRAM)
            say("traffic runs, local ports " + ", ".join(f"{name} {port}" for name, port in ports.items()))
        else:
            say("not root: no capture, no traffic of its own, so no rates are looked for")
        child = stack.enter_context(stage.started(command))
        from accessible import Program

        return tour(Program(child.pid), child, ports)


def too_late(*_):
    raise TimeoutError(f"the tour took more than {SECONDS} s")


def main():
    signal.signal(signal.SIGALRM, too_late)
    signal.signal(signal.SIGTERM, lambda *_: sys.exit(143))
    signal.alarm(SECONDS)
    try:
        wrong = perform()
    except (RuntimeError, TimeoutError, subprocess.SubprocessError) as fault:
        wrong = [str(fault)]
    signal.alarm(0)
    for sentence in wrong:
        say(f"WRONG: {sentence}")
    say(f"screenshots are in {os.path.relpath(SCREENS)}")
    say("failed" if wrong else "all as it should be")
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
