#!/usr/bin/python3
"""Compares, byte for byte, what the tours of the two editions have left in build/linux-tour and build/windows-tour: what the
stand-in servers received, the profile file, the registry's account, what was written to the phone book, what the pages say.
What can't be the same on two machines is masked on both sides, each with its reason. Ends non-zero where anything else
differs or is missing."""

import os
import re
import sys

import keep

# Pattern, what stands for it, why. A pattern that is never found is an error: it would hide nothing.
OTHER_PROCESSES = "other processes run there, and the table stands still at another try"
MASKS = {
    "report.head": [(rb"Content-Length: \d+", b"Content-Length: #", OTHER_PROCESSES)],
    "report.body": [
        (rb"^id=\d+&", b"id=#&", OTHER_PROCESSES),
        (rb"(?<=procs=).*$", None, OTHER_PROCESSES),
    ],
    "requests.log": [(rb"Content-Length: \d+", b"Content-Length: #", OTHER_PROCESSES)],
    "addresses.txt": [
        (rb"(?m)^(\xe2\x80\x8f?)(\d): .*$", rb"\1\2: #", "one machine has a card more, and each its own order of them"),
    ],
    "memory.txt": [(rb"[\d,]+ (Kb|%)", rb"# \1", "what is free changes from moment to moment")],
    "surf.txt": [
        (rb": ico_(check|x): [\d.]+%", b": ?: #%", "processor and line are busy as it comes"),
    ],
    "trace.txt": [(rb"\t(<10|\d+|>1200) ms\t", b"\t? ms\t", "an echo takes its time")],
}
# Of the other edition none: the reason.
WINDOWS_ALONE = {"trouble-refused.txt": "no real line refuses a login in the Linux tour"}


def record(text):
    """A row of a report must have its seven fields, whatever stands in them."""
    return b"|" * 6 if text.count(b"|") == 6 else text


def records(text):
    rows = text.split(b"}")
    return b"}".join(sorted({record(row) for row in rows if row})) + (b"}" if rows[-1] == b"" else b"")


def masked(name, content):
    """The content without what may differ, and what never came up of that."""
    vain = []
    for pattern, mark, _ in MASKS.get(name, ()):
        replacement = mark if mark is not None else lambda found: records(found.group())
        content, count = re.subn(pattern, replacement, content)
        vain += [] if count else [f"{name}: nothing to mask by {pattern.decode()}"]
    return content, vain


def once(content):
    """Tries of a report told as one."""
    requests = content.split(b"\n\n")
    kept = [request for at, request in enumerate(requests) if not is_try(request) or request not in requests[:at]]
    return b"\n\n".join(kept)


def is_try(request):
    return b"getid.asp" in request or b"procreport.asp" in request


def read(folder, name):
    with open(f"{folder}/{name}", "rb") as file:
        return file.read()


def differences(name, folders):
    sides, wrong = [], []
    for folder in folders:
        content, vain = masked(name, read(folder, name))
        sides.append(once(content) if name == "requests.log" else content)
        wrong += vain
    if sides[0] == sides[1]:
        return wrong
    lines = [side.split(b"\n") for side in sides]
    pairs = zip(*lines)
    first = next(((one, other) for one, other in pairs if one != other), None)
    return wrong + [f"{name}: {len(sides[0])} and {len(sides[1])} bytes, first {first}"]


def main():
    folders = [keep.folder("linux"), keep.folder("windows")]
    there = [set(os.listdir(folder)) if os.path.isdir(folder) else set() for folder in folders]
    wrong = [f"{name}: only one edition has it" for name in sorted(there[0] ^ there[1] - set(WINDOWS_ALONE))]
    wrong += [] if there[0] and there[1] else ["a tour has left nothing"]
    same = 0
    for name in sorted(there[0] & there[1]):
        found = differences(name, folders)
        wrong += found
        same += not found
        reasons = sorted({reason for _, _, reason in MASKS.get(name, ())})
        print(f"same bytes: {name}: {'differs' if found else 'the same'}{', save: ' if reasons else ''}{'; '.join(reasons)}")
    for name, reason in WINDOWS_ALONE.items():
        print(f"same bytes: {name}: not compared: {reason}")
    for sentence in wrong:
        print(f"same bytes: WRONG: {sentence}")
    print(f"same bytes: {same} files are the same in both editions{', others differ' if wrong else ''}")
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
