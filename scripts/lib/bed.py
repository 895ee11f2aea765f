"""The Wine bed held open on the tour's display: programs of Windows run in it side by side, in the network of this side of
the link, over a layer that is thrown away at the end."""

import contextlib
import os
import subprocess

import stage

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
WINE_BED = f"{ROOT}/scripts/wine-bed"
# Asked before the tour has caches of its own.
FOLDER = stage.run(WINE_BED, "where").strip()
SYSTEM_FOLDER = "/root/.wine/drive_c/windows/system32"


class Bed:
    def __init__(self, number, spaces):
        self.number = number
        self.spaces = spaces

    def command(self, *words):
        """By which a command of the bed's own system is run in it."""
        return [WINE_BED, "in", self.number, *words]

    def wine(self, *words):
        return self.command("wine", *words)

    def run(self, *words, seconds=60):
        """Gives what a command says, as bytes."""
        return subprocess.run(self.command(*words), capture_output=True, timeout=seconds, check=True).stdout

    def put(self, content, path):
        """A file of the bed."""
        subprocess.run(self.command("sh", "-c", 'cat >"$0"', path), input=content, timeout=20, check=True)

    def take(self, path):
        """What a file of the bed holds; None where there is none."""
        done = subprocess.run(self.command("cat", path), capture_output=True, timeout=20)
        return done.stdout if done.returncode == 0 else None

    def has(self, process):
        """Whether a process of this machine runs in the bed, or waits for one that does."""
        with contextlib.suppress(OSError):
            with open(f"/proc/{process}/cmdline", "rb") as words:
                if words.read().startswith(f"nsenter\0--target\0{self.number}\0".encode()):
                    return True
            return os.readlink(f"/proc/{process}/ns/pid") == os.readlink(f"/proc/{self.number}/ns/pid_for_children")
        return False


@contextlib.contextmanager
def held_open(spaces):
    """In the first of the network namespaces where there are any."""
    command = stage.in_namespace(spaces[0], WINE_BED, "keep") if spaces else [WINE_BED, "keep"]
    environment = dict(os.environ, QUENDRA_BED=FOLDER)
    with subprocess.Popen(command, stdin=subprocess.PIPE, stdout=subprocess.PIPE, text=True, env=environment) as bed:
        try:
            number = bed.stdout.readline().strip()
            if not number:
                raise RuntimeError("the Wine bed doesn't open")
            opened = Bed(number, spaces)
            if spaces:
                # No server of names is there. One that refuses at once keeps Wine from waiting ten seconds for each name.
                opened.put(b"nameserver 127.0.0.1\n", "/etc/resolv.conf")
            yield opened
        finally:
            # Its first process ends with its input, and all others with that.
            bed.stdin.close()
            bed.wait(20)
