"""What the tour stands on, each part made and taken down as a context: a display, a message bus, two network namespaces
joined by a link, and the processes in them. Everything carries this process's id in its name, so that two tours can run
side by side."""

import contextlib
import os
import re
import signal
import subprocess
import tempfile
import time

HERE_ADDRESS = "10.71.0.1"
THERE_ADDRESS = "10.71.0.2"
PORT_RANGE = "1025 5000"
OFFLOADS = "tx off rx off tso off gso off gro off sg off".split()


def run(*command):
    """Runs a short command; its own words are the error when it fails."""
    done = subprocess.run(command, capture_output=True, text=True, timeout=20)
    if done.returncode != 0:
        raise RuntimeError(f"{' '.join(command)}: {done.stderr.strip() or done.stdout.strip()}")
    return done.stdout


@contextlib.contextmanager
def started(command, **options):
    """A child process, ended by its id: asked first, killed when it doesn't listen."""
    child = subprocess.Popen(command, stdin=subprocess.DEVNULL, **options)
    try:
        yield child
    finally:
        if child.poll() is None:
            child.terminate()
            try:
                child.wait(3)
            except subprocess.TimeoutExpired:
                child.kill()
                child.wait()


@contextlib.contextmanager
def display(directory, width=1280, height=860, panel=0):
    """A virtual display with a window manager, which keeps `panel` pixels at the lower edge free; gives its name."""
    read_end, write_end = os.pipe()
    server = ["Xvfb", "-displayfd", str(write_end), "-screen", "0", f"{width}x{height}x24", "-nolisten", "tcp"]
    with open(f"{directory}/display.log", "w") as log, started(server, pass_fds=[write_end], stdout=log, stderr=log):
        os.close(write_end)
        with os.fdopen(read_end) as answer:
            number = answer.readline().strip()
        if not number:
            raise RuntimeError("Xvfb found no display number: " + open(f"{directory}/display.log").read())
        name = ":" + number
        manager = ["openbox", "--config-file", manager_rules(directory, panel)]
        with started(manager, env=dict(os.environ, DISPLAY=name), stdout=log, stderr=log):
            await_window_manager(name)
            yield name


def manager_rules(directory, panel):
    """The window manager's own rules, save for the room of a panel."""
    with open("/etc/xdg/openbox/rc.xml") as system:
        rules = system.read()
    head, margins, rest = rules.partition("<margins>")
    with open(f"{directory}/rc.xml", "w") as own:
        own.write(head + margins + re.sub(r"<bottom>\d+</bottom>", f"<bottom>{panel}</bottom>", rest, count=1))
    return own.name


def await_window_manager(name):
    """Waits for the window manager: a window that is shown before it runs loses the first click."""
    for _ in range(100):
        if "window id" in run("xprop", "-display", name, "-root", "_NET_SUPPORTING_WM_CHECK"):
            return
        time.sleep(0.1)
    raise RuntimeError("the window manager doesn't come up")


@contextlib.contextmanager
def message_bus(directory):
    """A session bus of the tour's own, where the accessibility bus is started on demand; gives its address."""
    command = ["dbus-daemon", "--session", "--nofork", "--print-address", f"--address=unix:path={directory}/bus"]
    with open(f"{directory}/bus.log", "w") as log:
        with started(command, stdout=subprocess.PIPE, stderr=log, text=True) as daemon:
            yield daemon.stdout.readline().strip()


def in_namespace(name, *command):
    return ["ip", "netns", "exec", name, *command]


def lay_link(here, there):
    """The link's ends lie in the two namespaces. Without offloads a frame on it is what a wire would carry."""
    ends = [(here, f"qh{os.getpid()}", HERE_ADDRESS), (there, f"qt{os.getpid()}", THERE_ADDRESS)]
    run("ip", "link", "add", ends[0][1], "netns", here, "type", "veth", "peer", "name", ends[1][1], "netns", there)
    for space, end, address in ends:
        run("ip", "-n", space, "address", "add", f"{address}/24", "dev", end)
        run(*in_namespace(space, "ethtool", "-K", end, *OFFLOADS))
        run(*in_namespace(space, "sysctl", "-q", "-w", f"net.ipv4.ip_local_port_range={PORT_RANGE}"))
        run("ip", "-n", space, "link", "set", "lo", "up")
        run("ip", "-n", space, "link", "set", end, "up")
    run("ip", "-n", here, "route", "add", "default", "via", THERE_ADDRESS)


@contextlib.contextmanager
def linked_namespaces():
    """Two namespaces joined by a link; gives their names, this side's first."""
    names = [f"quendra-here-{os.getpid()}", f"quendra-there-{os.getpid()}"]
    made = []
    try:
        for name in names:
            run("ip", "netns", "add", name)
            made.append(name)
        lay_link(*names)
        yield names
    finally:
        for name in made:
            end_processes_of(name)
            subprocess.run(["ip", "netns", "delete", name])


def end_processes_of(name):
    """Ends what still runs in a namespace: the tour made it, so the tour started what runs there."""
    listed = subprocess.run(["ip", "netns", "pids", name], capture_output=True, text=True).stdout
    for process in map(int, listed.split()):
        with contextlib.suppress(ProcessLookupError):
            os.kill(process, signal.SIGKILL)


@contextlib.contextmanager
def private_directory():
    """A directory for sockets and logs that goes at the end."""
    with tempfile.TemporaryDirectory(prefix="quendra-tour-") as directory:
        yield directory
