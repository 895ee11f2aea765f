"""What a desktop offers to programs, each a stand-in that writes down what it is asked: a file manager on the session
bus, and among the programs a software centre and the opener of files."""

import os
import subprocess
import sys

import stage
from seen import wait_for

FILE_MANAGER = f"{os.path.dirname(os.path.abspath(__file__))}/../../tests/standins/file_manager.py"
SOFTWARE_CENTRE = "gnome-software"
OPENER = "xdg-open"


class Desktop:
    def __init__(self, stack, seconds):
        self.folder = stack.enter_context(stage.private_directory())
        self.start_file_manager(stack, seconds)
        self.add_programs()

    def start_file_manager(self, stack, seconds):
        said = stack.enter_context(open(f"{self.folder}/file-manager", "w"))
        command = [sys.executable, FILE_MANAGER, "--seconds", str(seconds)]
        stack.enter_context(stage.started(command, stdout=said, stderr=subprocess.STDOUT))
        wait_for("the stand-in file manager", lambda: "ready" in self.asked("file-manager"))

    def add_programs(self):
        """Programs of these names stand before all others in PATH."""
        os.mkdir(f"{self.folder}/bin")
        self.add_program(SOFTWARE_CENTRE, f'echo "started with $# words" >>"{self.folder}/software-centre"')
        self.add_program(OPENER, f'echo "opens $1" >>"{self.folder}/opener"')
        os.environ["PATH"] = f"{self.folder}/bin:{os.environ['PATH']}"

    def add_program(self, name, command):
        with open(f"{self.folder}/bin/{name}", "w") as script:
            script.write(f"#!/bin/sh\n{command}\n")
        os.chmod(script.name, 0o755)

    def asked(self, name):
        """What a stand-in wrote down so far, line by line."""
        path = f"{self.folder}/{name}"
        if not os.path.exists(path):
            return []
        with open(path) as lines:
            return lines.read().splitlines()

    def wait_for_request(self, name):
        """The newest line, once there is one besides its readiness."""
        return wait_for(f"a request to the {name}", lambda: [line for line in self.asked(name) if line != "ready"])[-1]
