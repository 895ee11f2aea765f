"""A route of the tour's own, and the advanced panel of the page for surf problems that traces it."""

import contextlib
import os
import re
import subprocess
import time

import stage
from seen import wait_for

ROUTERS = 4


class Route:
    """Routers in a row behind the far side of the link, each in a network namespace; the last one is the target."""

    def __init__(self, spaces, hops):
        self.spaces = spaces
        self.hops = hops

    @property
    def target(self):
        return self.hops[-1]


def lay(spaces):
    """Links the spaces from the second one of the tour on, with routes both ways; gives the address of each hop. Link i has
    the addresses 10.72.i.1 and 10.72.i.2."""
    for space in spaces:
        stage.run(*stage.in_namespace(space, "sysctl", "-q", "-w", "net.ipv4.ip_forward=1"))
        # Else a router answers one echo a second and no more.
        stage.run(*stage.in_namespace(space, "sysctl", "-q", "-w", "net.ipv4.icmp_ratelimit=0"))
    for link, (near, far) in enumerate(zip(spaces, spaces[1:])):
        stage.run("ip", "link", "add", f"on{link}", "netns", near, "type", "veth", "peer", "name", "back", "netns", far)
        for space, end, address in ((near, f"on{link}", 1), (far, "back", 2)):
            stage.run("ip", "-n", space, "address", "add", f"10.72.{link}.{address}/30", "dev", end)
            stage.run("ip", "-n", space, "link", "set", end, "up")
        stage.run("ip", "-n", far, "route", "add", "default", "via", f"10.72.{link}.1")
        if link + 2 < len(spaces):
            stage.run("ip", "-n", near, "route", "add", "10.72.0.0/16", "via", f"10.72.{link}.2")
    return [f"10.72.{link}.2" for link in range(len(spaces) - 1)]


@contextlib.contextmanager
def route(start):
    """Routers behind a namespace of the tour."""
    names = [f"quendra-hop{number}-{os.getpid()}" for number in range(1, ROUTERS + 1)]
    made = []
    try:
        for name in names:
            stage.run("ip", "netns", "add", name)
            made.append(name)
        yield Route([start, *names], lay([start, *names]))
    finally:
        for name in made:
            subprocess.run(["ip", "netns", "delete", name])


class TraceStep:
    """Opens the panel, traces the route to a host and answers the question. The page stays."""

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
        return self.program.control("frmSurf_txtPingResult").text()

    def take(self, route):
        """Gives the report and what is wrong with it."""
        self.walk.click("frmSurf_cmdAdvanced")
        self.walk.click("frmSurf_txtping")
        self.walk.xdotool("type", "--delay", 40, route.target)
        self.walk.click("frmSurf_cmdStart")
        box = wait_for("the question at the end of the trace", self.question, 60)
        time.sleep(0.3)
        self.walk.picture("trace-question")
        self.walk.point_at(self.program.button(box))
        self.walk.xdotool("click", 1)
        wait_for("the question to close", lambda: not self.question())
        self.walk.picture("trace")
        report = self.report()
        self.walk.click("surf_lblBack")
        return report, self.wrong(report, route)

    @staticmethod
    def wrong(report, route):
        """The report must be the route, hop by hop from its second on, with whatever times."""
        hops = "".join(f"Hop #\t{number}\t? ms\t{hop}\n" for number, hop in enumerate(route.hops, 1))
        wanted = f"Tracing to {route.target} ({route.target})...\n{hops}\nTrace Route Complete"
        timeless = re.sub(r"\t(<10|\d+|>1200) ms\t", "\t? ms\t", report)
        return [] if timeless == wanted else [f"the trace says {report!r}, the route is {route.hops}"]
