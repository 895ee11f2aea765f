#!/usr/bin/python3
"""Walks through the program on virtual screens of several sizes, each with a window manager and room for a panel at the
lower edge. Leaves pictures of the splash, the home page, the pages with their steps, the panel that traces and every dialog in
build/screens/WIDTHxHEIGHT[@SCALE] and ends non-zero when a window, its frame included, lies outside the usable screen.

    screens.py [WIDTHxHEIGHT[@SCALE]...]        without a size: all of them"""

import contextlib
import os
import re
import subprocess
import sys
import time

from gi.repository import GLib

import cast
import connection
import dialogs
import stage
import surf
import tour
import trace
from accessible import Program
from walk import Walk

SIZES = (
    *("800x600", "1024x768", "1280x800", "1366x768", "1920x1080", "1920x1080@1.5", "1920x1080@2"),
    *("3840x2160", "3840x2160@2"),
)
PANEL = 40
SECONDS = 150
SECOND_CARD = "ip link add qcard0 type veth peer name qcard1 && ip address add 10.8.0.1/24 dev qcard0 && ip link set qcard0 up"
NO_MANAGER, FAILED = "Error Number = 711", "נכשל!"


class CheckedWalk(Walk):
    """A walk that looks, with each picture, whether every window lies on the screen."""

    def __init__(self, program, folder, scale, room):
        super().__init__(program, folder, scale)
        self.room = room
        self.wrong = []

    def picture(self, name):
        super().picture(name)
        for window in self.windows():
            left, top, right, bottom = frame_of(window)
            if left < 0 or top < 0 or right > self.room[0] or bottom > self.room[1]:
                self.wrong.append(f"{name}: a window from {left},{top} to {right},{bottom} on a screen of {self.room}")


def frame_of(window):
    """The edges of a window with what its manager put round it."""
    said = stage.run("xwininfo", "-id", window)
    left, top, width, height = (
        int(re.search(rf"{what}:\s+(-?\d+)", said).group(1))
        for what in ("Absolute upper-left X", "Absolute upper-left Y", "Width", "Height")
    )
    told = re.search(r"= (.*)", stage.run("xprop", "-id", window, "_NET_FRAME_EXTENTS"))
    before, after, above, below = map(int, told.group(1).split(",")) if told else (0, 0, 0, 0)
    return left - before, top - above, left + width + after, top + height + below


def connect_without_manager(walk):
    """The troubleshooter and, where cards are those of a namespace, their list: both stand without remote access, too."""
    boxes = connection.Boxes(walk)
    walk.click("lblCaption(2)")
    walk.click("frsCon_lblConnectProb")
    boxes.press(NO_MANAGER, "trouble-without-manager")
    boxes.press(FAILED, "trouble-failed")
    walk.program.control("cmdCheck")
    walk.picture("trouble")
    walk.click("Command1")
    if os.geteuid() != 0:
        return
    walk.click("frsCon_lblCaption(1)")
    step = connection.ConnectionStep(walk, None, None)
    step.fill()
    walk.click(f"frsCon_lblModems({connection.BY_VPN})")
    walk.click("frsCon_cmdCreate")
    step.choose_card()
    boxes.press(NO_MANAGER, "creation-without-manager")
    boxes.press(FAILED, "creation-failed")


def walk_through(walk):
    walk.splash()
    walk.home()
    walk.monitor()
    time.sleep(3)
    walk.picture("monitor")
    walk.about()
    # No server answers here: the dialog and the page show what went wrong.
    dialogs.PortsStep(walk).take(False)
    dialogs.MemoryStep(walk).take()
    surf.SurfStep(walk).take(False)
    if os.geteuid() == 0:  # who else may send echoes is up to the machine
        trace.TraceStep(walk).take(trace.Route([], ["127.0.0.1"]))
    walk.click("surf_lblBack")
    walk.first_connection()
    connect_without_manager(walk)
    walk.close()
    return walk.wrong


def show(size):
    """One size, in a process of its own: the accessibility bus is that of the first display that a process speaks to."""
    parts = re.fullmatch(r"(\d+)x(\d+)(?:@([\d.]+))?", size).groups(default="1")
    width, height, scale = int(parts[0]), int(parts[1]), float(parts[2])
    folder = f"{tour.SCREENS}/{size}"
    os.makedirs(folder, exist_ok=True)
    for old in os.listdir(folder):
        os.remove(f"{folder}/{old}")
    with contextlib.ExitStack() as stack:
        tour.set_scene(stack, width, height, PANEL)
        surf.fill_cache()
        os.environ["QT_SCALE_FACTOR"] = str(scale)
        os.environ["DBUS_SYSTEM_BUS_ADDRESS"] = "unix:path=/nowhere"  # nothing is asked of this machine's network manager
        command = [tour.PROGRAM]
        if os.geteuid() == 0:
            here, there = stack.enter_context(stage.linked_namespaces())
            cast.start_traffic(stack, {"here": here, "there": there})
            stage.run(*stage.in_namespace(here, "sh", "-c", SECOND_CARD))
            command = stage.in_namespace(here, *command)
        child = stack.enter_context(stage.started(command))
        walk = CheckedWalk(Program(child.pid), folder, scale, (width, height - PANEL))
        try:
            return walk_through(walk)
        except RuntimeError:
            walk.picture("where-it-failed")
            raise


def all_of(sizes):
    failed = [size for size in sizes if subprocess.run([sys.executable, __file__, "--one", size], timeout=SECONDS).returncode]
    for size in failed:
        print(f"screens: {size} failed")
    return 1 if failed else 0


def main():
    if sys.argv[1:2] != ["--one"]:
        return all_of(sys.argv[1:] or SIZES)
    size = sys.argv[2]
    try:
        wrong = show(size)
    except (RuntimeError, subprocess.SubprocessError, GLib.Error) as fault:
        wrong = [str(fault)]
    for sentence in wrong:
        print(f"screens: {size}: WRONG: {sentence}")
    print(f"screens: {size}: {'failed' if wrong else 'every window lies on the screen'}", flush=True)
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
