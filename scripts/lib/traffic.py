#!/usr/bin/python3
"""One process of the tour's traffic, client or server, under a name of its own. Ends by itself after SECONDS.

    traffic.py NAME SECONDS serve-bulk ADDRESS PORT     sends to whoever connects, RATE bytes a second
    traffic.py NAME SECONDS serve-sink ADDRESS PORT     reads what comes
    traffic.py NAME SECONDS serve-echo ADDRESS PORT     gives back what comes
    traffic.py NAME SECONDS get ADDRESS PORT            a bulk download
    traffic.py NAME SECONDS put ADDRESS PORT            a bulk upload, RATE bytes a second
    traffic.py NAME SECONDS talk ADDRESS PORT           short lines, ten a second, each answered

Prints one line, the local port, once it listens or is connected. RATE comes from the environment, default 200000."""

import ctypes
import os
import signal
import socket
import sys
import threading
import time

CHUNK = 8192
RATE = int(os.environ.get("RATE", "200000"))
PR_SET_NAME = 15


def send_paced(connection):
    chunk = bytes(CHUNK)
    due = time.monotonic()
    while True:
        connection.sendall(chunk)
        due += CHUNK / RATE
        time.sleep(max(0.0, due - time.monotonic()))


def read_all(connection):
    while connection.recv(65536):
        pass


def echo(connection):
    while data := connection.recv(65536):
        connection.sendall(data)


def talk(connection):
    while True:
        connection.sendall(b"a line of some sixty characters, as a person types it in a chat\n")
        connection.recv(65536)
        time.sleep(0.1)


def quietly(work, connection):
    """A peer that went away ends the connection, not the process."""
    try:
        work(connection)
    except OSError:
        pass
    connection.close()


def serve(work, address):
    listener = socket.create_server(address)
    print(listener.getsockname()[1], flush=True)
    while True:
        connection, _ = listener.accept()
        threading.Thread(target=quietly, args=(work, connection), daemon=True).start()


def connect(work, address):
    connection = socket.create_connection(address, timeout=10)
    connection.settimeout(None)
    print(connection.getsockname()[1], flush=True)
    work(connection)


ROLES = {
    "serve-bulk": (serve, send_paced),
    "serve-sink": (serve, read_all),
    "serve-echo": (serve, echo),
    "get": (connect, read_all),
    "put": (connect, send_paced),
    "talk": (connect, talk),
}


def main():
    name, seconds, role, host, port = sys.argv[1:6]
    ctypes.CDLL(None).prctl(PR_SET_NAME, name.encode(), 0, 0, 0)
    signal.alarm(int(seconds))
    run, work = ROLES[role]
    run(work, (host, int(port)))


if __name__ == "__main__":
    main()
