#!/usr/bin/env python3
"""A stand-in for servers that don't do as they should.

    odd_server.py PORT:MANNER[,MANNER...] [PORT:MANNER...] [--seconds N]

Listens on loopback only. The first connection to a port is treated in its first manner, the second in its second and so
on; the last manner goes on for all that follow. Prints "ready" once all ports can be reached and ends after N seconds or
on SIGTERM. Manners:

    answer   ten bytes, then silence
    byte     one byte, then silence
    garbage  bytes of no protocol, then silence
    silent   nothing at all
    close    an orderly end without a byte
    reset    an end by force once something has come
    late     ten bytes, and an end by force two seconds later
    full     a queue of connections that takes no more: the port looks filtered"""

import argparse
import signal
import socket
import struct
import sys
import threading
import time

ADDRESS = "127.0.0.1"
MOST_CONNECTIONS = 64
LINGER_NO_TIME = struct.pack("ii", 1, 0)


def reset(connection):
    connection.setsockopt(socket.SOL_SOCKET, socket.SO_LINGER, LINGER_NO_TIME)
    connection.close()


def answer(connection):
    connection.sendall(b"0123456789")


def one_byte(connection):
    connection.sendall(b"x")


def garbage(connection):
    connection.sendall(b"\0\xff\x80\r\x1b[2J\n" * 100)


def silent(_):
    pass


def close(connection):
    connection.shutdown(socket.SHUT_WR)


def reset_when_spoken_to(connection):
    connection.settimeout(10)
    connection.recv(100)
    reset(connection)


def late(connection):
    answer(connection)
    time.sleep(2)
    reset(connection)


MANNERS = {
    "answer": answer,
    "byte": one_byte,
    "garbage": garbage,
    "silent": silent,
    "close": close,
    "reset": reset_when_spoken_to,
    "late": late,
}


def treat(connection, manner):
    try:
        MANNERS[manner](connection)
    except OSError:
        pass  # the peer has gone


def serve(listener, manners):
    kept = []  # a connection that nobody holds would end
    for number in range(MOST_CONNECTIONS):
        connection, _ = listener.accept()
        kept.append(connection)
        manner = manners[min(number, len(manners) - 1)]
        threading.Thread(target=treat, args=(connection, manner), daemon=True).start()


def fill(listener, kept):
    """Connections that nobody accepts, until another one isn't taken."""
    for _ in range(8):
        attempt = socket.socket()
        attempt.settimeout(0.3)
        kept.append(attempt)
        try:
            attempt.connect(listener.getsockname())
        except OSError:
            return


def main():
    parser = argparse.ArgumentParser(description="stand-in for odd servers on loopback")
    parser.add_argument("ports", nargs="+", metavar="PORT:MANNER[,MANNER...]")
    parser.add_argument("--seconds", type=float, default=60)
    arguments = parser.parse_args()
    for end in (signal.SIGTERM, signal.SIGINT, signal.SIGALRM):
        signal.signal(end, lambda *_: sys.exit(0))
    signal.setitimer(signal.ITIMER_REAL, arguments.seconds)
    kept = []
    for words in arguments.ports:
        port, _, manners = words.partition(":")
        listener = socket.socket()
        listener.setsockopt(socket.SOL_SOCKET, socket.SO_REUSEADDR, 1)
        listener.bind((ADDRESS, int(port)))
        kept.append(listener)
        if manners == "full":
            listener.listen(0)
            fill(listener, kept)
        else:
            listener.listen(16)
            threading.Thread(target=serve, args=(listener, manners.split(",")), daemon=True).start()
    print("ready", flush=True)
    signal.pause()


if __name__ == "__main__":
    main()
