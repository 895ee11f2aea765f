"""A user's hands and eyes: real clicks and keys on a program's window, and a picture after each step."""

import time

import stage
from seen import NAME, wait_for


class Walk:
    """Steps of the tour, in the order in which a user takes them. Pictures are numbered and go to a folder. A program that
    the toolkit shows at a scale tells its places in pixels of its own, each `scale` of the screen's wide."""

    def __init__(self, program, folder, scale=1):
        self.program = program
        self.folder = folder
        self.scale = scale
        self.pictures = 0

    def xdotool(self, *words):
        return stage.run("xdotool", *map(str, words))

    def picture(self, name):
        self.pictures += 1
        stage.run("import", "-window", "root", f"{self.folder}/{self.pictures:02}-{name}.png")

    def windows(self):
        return self.program.frames()

    def point_at(self, control):
        self.xdotool("mousemove", *(self.scale * place for place in control.centre()))

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
        """A click on a header sorts until the next pass. One that a pass undid at once gets another try."""
        for _ in range(8):
            table = self.program.table()
            self.xdotool("mousemove", *table.place_of_header(NAME), "click", 1)
            time.sleep(0.1)
            names = [name.casefold() for name in table.column(NAME, 12)]
            if names in (sorted(names), sorted(names, reverse=True)):
                self.picture("column")
                return
            time.sleep(0.35)
        raise RuntimeError(f"a click on a header doesn't sort: {names}")

    def about(self):
        before = len(self.program.windows())
        self.click("Label1")
        wait_for("the about box", lambda: len(self.program.windows()) > before)
        time.sleep(0.5)
        self.picture("about")
        box = self.program.windows()[-1]
        self.point_at(box)
        self.xdotool("click", 1)
        wait_for("the about box to close", lambda: len(self.program.windows()) == before)

    def addresses(self):
        before = len(self.program.windows())
        self.xdotool("key", "ctrl+i")
        wait_for("the address panel", lambda: len(self.program.windows()) > before)
        time.sleep(0.3)
        self.picture("addresses")
        said = self.program.texts(self.program.windows()[-1])
        self.xdotool("key", "Return")
        wait_for("the address panel to close", lambda: len(self.program.windows()) == before)
        return said

    def first_connection(self):
        self.click("lblCaption(2)")
        self.program.control("frsCon_lblBack")
        time.sleep(0.4)
        self.picture("first-connection")
        for step, first in ((1, "frsCon_txtUsername"), (0, "frsCon_txtFullName")):
            self.click(f"frsCon_lblCaption({step})")
            self.program.control(first)
            time.sleep(0.4)
            self.picture(f"first-connection-step-{2 - step}")
            self.click("frsCon_lblBack")
        self.program.control("frsCon_lblCaption(1)")
        self.click("frsCon_lblBack")

    def close(self):
        window = self.windows()[-1]
        self.xdotool("windowactivate", "--sync", window)
        x, y = close_button_of(window)
        self.xdotool("mousemove", x, y, "click", 1)


def close_button_of(window):
    """The right end of the title bar that the window manager put above the window."""
    said = stage.run("xwininfo", "-id", window)
    value = {line.split(":")[0].strip(): line.split(":")[-1].strip() for line in said.splitlines() if ":" in line}
    extents = stage.run("xprop", "-id", window, "_NET_FRAME_EXTENTS").split("=")[1].split(",")
    top = int(extents[2])
    right_edge = int(value["Absolute upper-left X"]) + int(value["Width"])
    return right_edge - 10, int(value["Absolute upper-left Y"]) - top // 2
