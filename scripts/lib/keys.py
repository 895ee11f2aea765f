"""A page as somebody meets it who uses the keyboard and a screen reader."""

import time

from seen import wait_for

MOST_STOPS = 30


class KeysStep:
    """Goes round a window by the Tab key."""

    def __init__(self, walk):
        self.walk = walk
        self.program = walk.program

    def stop(self):
        """The name in the code and the spoken name of what the next Tab reaches."""
        self.walk.xdotool("key", "Tab")
        time.sleep(0.1)
        control = wait_for("a control with the focus", self.program.focused)
        return control.code, control.name

    def take(self, wanted):
        """Gives the stops in their order, and what is wrong with them."""
        stops = [self.stop()]
        for _ in range(MOST_STOPS):
            stop = self.stop()
            if stop == stops[0]:
                break
            stops.append(stop)
        wrong = [f"{control} has no name to be spoken" for control, name in stops if not name.strip()]
        reached = [control for control, _ in stops]
        return reached, wrong + [f"the Tab key never reaches {control}" for control in wanted if control not in reached]
