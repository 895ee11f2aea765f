"""The program brought to a page by bare clicks and without the accessibility interface, which would cost time of its own:
what is measured then is what a subscriber runs. A first run, which can be read, tells where to click. Needs a display."""

import contextlib
import os
import time

import stage

TICKS = os.sysconf("SC_CLK_TCK")


def click(place):
    stage.run("xdotool", "mousemove", "--sync", *map(str, place), "click", "1")


def places_of(command, names, last):
    """Where the controls of these names lie, each clicked to reach the next one; `last` is what must come up in the end."""
    from accessible import Program

    places = []
    with stage.started(command, env=dict(os.environ, QT_LINUX_ACCESSIBILITY_ALWAYS_ON="1")) as child:
        program = Program(child.pid)
        for name in names:
            control = program.control(name)
            time.sleep(0.5)
            places.append(control.centre())
            click(places[-1])
        program.control(last)
    return places


@contextlib.contextmanager
def opened(command, places):
    with stage.started(command) as child:
        for place in places:
            time.sleep(1.5)
            click(place)
        time.sleep(1.5)
        yield child


def windows_of(process):
    return stage.run("xdotool", "search", "--onlyvisible", "--pid", str(process)).split()


def cpu_seconds(process):
    """User and system time of all threads."""
    with open(f"/proc/{process}/stat") as stat:
        fields = stat.read().rsplit(")", 1)[1].split()
    return int(fields[11]) / TICKS, int(fields[12]) / TICKS


def switches(process):
    """How often its threads were switched to and from."""
    count = 0
    for thread in os.listdir(f"/proc/{process}/task"):
        with open(f"/proc/{process}/task/{thread}/status") as status:
            count += sum(int(line.split()[1]) for line in status if "ctxt_switches" in line)
    return count
