"""The tour's clients and servers: who they are, how they are started, and which rates their rows must show."""

import dataclasses
import os
import shutil
import subprocess

import stage

TRAFFIC = f"{os.path.dirname(os.path.abspath(__file__))}/traffic.py"
SECONDS = 300

# Where, name, role, address, port, bytes a second. Servers stand before their clients. Each runs from a file of its own
# name, so that its row can be told from the others; those that talk run from the interpreter itself, which has an icon.
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


def executable(directory, name, role):
    """The interpreter, as a file of the given name where that helps."""
    interpreter = os.path.realpath("/usr/bin/python3")
    if role == "talk":
        return interpreter
    copy = f"{directory}/python"
    if not os.path.exists(copy):
        shutil.copy(interpreter, copy)
    os.link(copy, f"{directory}/{name}")
    return f"{directory}/{name}"


def start_traffic(stack, spaces, players=(*SERVERS, *CLIENTS)):
    """Gives each local process's name with the port that it serves or speaks from."""
    ports = {}
    directory = stack.enter_context(stage.private_directory())
    for side, name, role, address, port, rate in players:
        script = [executable(directory, name, role), "-S", TRAFFIC]
        script += [name, str(SECONDS), role, address, str(port)]
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


@dataclasses.dataclass
class Victim:
    """A process that is there to be ended."""

    name: str
    file: str
    process: subprocess.Popen


def start_victim(stack):
    """It has no traffic and a name that no other tour gives."""
    name = f"runaway-{os.getpid()}"
    file = executable(stack.enter_context(stage.private_directory()), name, "")
    command = [file, "-S", "-c", f"import time; time.sleep({SECONDS})"]
    return Victim(name, file, stack.enter_context(stage.started(command)))
