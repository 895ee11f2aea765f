"""What a user does to a process from the monitor page: shows its file, ends it; and opens what adds and removes programs."""

import time
import urllib.parse

from seen import NAME, wait_for

TRIES = 8
BUTTONS = (
    *("main_lblEndProcess", "main_lblJumpToPath", "main_cmdChecks", "main_cmdMemInfo"),
    *("main_cmdAddRemove", "main_cmdRpt"),
)


class ActionsStep:
    """Works on a process of the tour's own. A button is pressed only while the table says that this very process is
    selected: the selection stays with its row, and what else runs on this machine is none of the tour's business."""

    def __init__(self, walk, desktop, victim):
        self.walk = walk
        self.program = walk.program
        self.desktop = desktop
        self.victim = victim

    def place(self):
        """The victim's row; None when there is none."""
        names = [row[NAME] for row in self.program.table().rows()]
        return names.index(self.victim.name) if self.victim.name in names else None

    def is_selected(self):
        table = self.program.table()
        return [table.cell(row, NAME) for row in table.selected()] == [self.victim.name]

    def select(self):
        """By the keys, as its row may lie anywhere. A pass that changes the order meanwhile makes another try."""
        for _ in range(TRIES):
            place = wait_for(f"the row of {self.victim.name}", lambda: (number := self.place()) is not None and [number])[0]
            self.walk.click("main_ListView1")
            self.walk.xdotool("key", "--delay", 6, "Home", *["Down"] * place)
            time.sleep(0.3)
            if self.is_selected():
                return
        raise RuntimeError(f"the row of {self.victim.name} can't be selected")

    def press(self, button):
        if not self.is_selected():
            raise RuntimeError(f"{button} isn't pressed: the selection went from {self.victim.name}")
        self.walk.click(button)

    def show_file(self):
        """Gives what the file manager was asked, and what is wrong with it."""
        self.press("main_lblJumpToPath")
        request = self.desktop.wait_for_request("file-manager")
        wanted = "ShowItems file://" + urllib.parse.quote(self.victim.file)
        return request, [] if request == wanted else [f"the file manager was asked {request!r}, not {wanted!r}"]

    def end(self):
        """Gives how the process ended, and what is wrong with that or with its row."""
        before = len(self.program.windows())
        self.press("main_lblEndProcess")
        wait_for(f"the end of {self.victim.name}", lambda: self.victim.process.poll() is not None, 10)
        status = self.victim.process.returncode
        wrong = [] if status == -9 else [f"{self.victim.name} ended with {status}"]
        try:
            wait_for("the row to go", lambda: self.place() is None, 3)
        except RuntimeError:
            wrong.append("the row of an ended process stays")
        if len(self.program.windows()) != before:
            wrong.append(f"a box says {self.program.texts(self.program.windows()[-1])}")
        return f"by signal {-status}", wrong

    def add_or_remove_programs(self):
        self.walk.click("main_cmdAddRemove")
        return self.desktop.wait_for_request("software-centre")

    def take(self):
        """Gives a line for each action, and what is wrong."""
        self.select()
        self.walk.picture("selected")
        request, wrong = self.show_file()
        way, lacks = self.end()
        self.walk.picture("ended")
        lines = [
            f"file manager: {request}",
            f"{self.victim.name}: ended by the button, {way}",
            f"software centre: {self.add_or_remove_programs()}",
        ]
        return lines, wrong + lacks
