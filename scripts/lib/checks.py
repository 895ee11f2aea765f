"""What a table that was read must hold, as sentences about what it lacks."""

import os

from cast import LEAST
from seen import DOWNLOAD, NAME, PORTS, UPLOAD, number

def missing_rates(rows, ports, least=LEAST):
    """What is wrong with the rows of the processes that the tour itself started, as sentences."""
    wrong = []
    for name, (upload, download) in least.items():
        owned = [row for row in rows if f".{ports[name]}." in row[PORTS]]
        if not owned:
            wrong.append(f"no row has the port {ports[name]} of {name}")
            continue
        seen = number(owned[0][UPLOAD]), number(owned[0][DOWNLOAD])
        if seen[0] < upload or seen[1] < download:
            wrong.append(f"{name} on port {ports[name]} has rates {seen}, at least {(upload, download)} are due")
    return wrong


def missing_processes(rows, names):
    """This machine's processes are in the table: as many as there are, those of the given names among them."""
    wrong = []
    alive = sum(entry.isdigit() for entry in os.listdir("/proc"))
    if abs(len(rows) - alive) > 20:
        wrong.append(f"{len(rows)} rows for {alive} processes")
    for name in names:
        if not any(name in row[NAME] for row in rows):
            wrong.append(f"no row for {name}")
    return wrong
