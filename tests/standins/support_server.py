#!/usr/bin/env python3
"""A stand-in for the support server: hands out report numbers and keeps the reports that are posted under them.

    support_server.py [PORT] --reports FOLDER [--seconds N] [--first NUMBER] [--megabytes N] [--keep N] [--log FILE]

Listens on loopback only. Prints its port once it can be reached and ends after N seconds or on SIGTERM. Each report
becomes two files in FOLDER, counted up from 00001: .head with the request's head and .body with its body, both byte
for byte as they came. Of all reports the newest N stay. The log has the head of every request, whatever it asks for."""

import argparse
import os
import re
import signal
import socket
import socketserver
import sys
import threading
from urllib.parse import urlsplit

ADDRESS = "127.0.0.1"
LONGEST_HEAD = 64 * 1024
LONGEST_BODY = 64 * 1024 * 1024
PATIENCE = 20
MOST_CONNECTIONS = 64
# The checks of a surf page end their lines with a line feed alone.
HEAD_END = re.compile(rb"\r?\n\r?\n")


class BadRequest(Exception):
    pass


def read_request(connection):
    """Head and body, each as bytes; what stands after the body is left alone."""
    data = b""
    while not (end := HEAD_END.search(data)):
        if len(data) > LONGEST_HEAD:
            raise BadRequest("the head is too long")
        piece = connection.recv(65536)
        if not piece:
            raise BadRequest("the request ends in its head")
        data += piece
    head, body = data[: end.start()], data[end.end() :]
    length = body_length(head)
    pieces = [body]
    missing = length - len(body)
    while missing > 0:
        piece = connection.recv(min(missing, 1 << 20))
        if not piece:
            raise BadRequest("the request ends in its body")
        pieces.append(piece)
        missing -= len(piece)
    return head, b"".join(pieces)[:length]


def body_length(head):
    for line in head.splitlines()[1:]:
        name, _, value = line.partition(b":")
        if name.strip().lower() == b"content-length":
            value = value.strip()
            if not value.isdigit() or len(value) > 12 or int(value) > LONGEST_BODY:
                raise BadRequest("no length that can be used")
            return int(value)
    return 0


def method_and_path(head):
    """The address may be absolute, and blanks may stand after the version."""
    words = head.partition(b"\n")[0].decode("latin-1").split()
    if len(words) != 3 or not words[2].startswith("HTTP/"):
        raise BadRequest("no request line")
    try:
        return words[0], urlsplit(words[1]).path
    except ValueError as fault:
        raise BadRequest("no address") from fault


def reply(status, content, kind="text/plain"):
    head = f"HTTP/1.1 {status}\r\nContent-Type: {kind}\r\nContent-Length: {len(content)}\r\nConnection: close\r\n\r\n"
    return head.encode() + content


class Desk:
    """What the server knows: the numbers it has given and the reports it has taken. Used by many threads."""

    def __init__(self, folder, first_number, megabytes, kept, log=None):
        self.log = log
        self.folder = folder
        self.kept = kept
        self.number = first_number - 1
        self.reports = 0
        self.load = bytes(megabytes << 20)
        self.lock = threading.Lock()

    def next_number(self):
        with self.lock:
            self.number += 1
            return self.number

    def keep(self, head, body):
        with self.lock:
            self.reports += 1
            name = f"{self.folder}/{self.reports:05}"
            outdated = f"{self.folder}/{self.reports - self.kept:05}"
        for ending, content in (("head", head), ("body", body)):
            # Whoever watches the folder sees whole files only.
            with open(f"{name}.{ending}.part", "wb") as file:
                file.write(content)
            os.rename(f"{name}.{ending}.part", f"{name}.{ending}")
            if os.path.exists(f"{outdated}.{ending}"):
                os.remove(f"{outdated}.{ending}")

    def note(self, head):
        if not self.log:
            return
        with self.lock, open(self.log, "ab") as log:
            log.write(head + b"\n\n")

    def answer(self, method, path, head, body):
        if (method, path) == ("GET", "/getid.asp"):
            return reply("200 OK", b"~~~~~~~~\r\n%d" % self.next_number())
        if (method, path) == ("POST", "/procreport.asp"):
            self.keep(head, body)
            return reply("200 OK", b"~OK")
        if (method, path) == ("GET", "/files/big.zip"):
            return reply("200 OK", self.load, "application/zip")
        if (method, path) == ("GET", "/procs.htm"):
            return reply("200 OK", b"<html><body></body></html>", "text/html")
        return reply("404 Not Found", b"nothing here")


class Exchange(socketserver.BaseRequestHandler):
    def handle(self):
        self.request.settimeout(PATIENCE)
        try:
            self.request.sendall(self.answer())
            self.wait_for_the_end()
        except OSError:
            pass  # a peer that is silent or gone concerns nobody else

    def answer(self):
        if threading.active_count() > MOST_CONNECTIONS:
            return reply("503 Service Unavailable", b"too many connections")
        try:
            head, body = read_request(self.request)
            self.server.desk.note(head)
            return self.server.desk.answer(*method_and_path(head), head, body)
        except BadRequest as fault:
            return reply("400 Bad Request", str(fault).encode())

    def wait_for_the_end(self):
        """Closing with bytes unread, such as line ends after a body, would reset the connection under the reply."""
        self.request.shutdown(socket.SHUT_WR)
        self.request.settimeout(2)
        for _ in range(1000):
            if not self.request.recv(65536):
                break


class Server(socketserver.ThreadingTCPServer):
    allow_reuse_address = True
    daemon_threads = True
    block_on_close = False
    request_queue_size = 64

    def handle_error(self, request, client_address):
        print(f"support server: {sys.exc_info()[1]}", file=sys.stderr, flush=True)


def main():
    parser = argparse.ArgumentParser(description="stand-in support server on loopback")
    parser.add_argument("port", nargs="?", type=int, default=80)
    parser.add_argument("--reports", required=True, help="folder for the reports")
    parser.add_argument("--seconds", type=float, default=3600)
    parser.add_argument("--first", type=int, default=1001, help="the first report number")
    parser.add_argument("--megabytes", type=int, default=4, help="size of the load download")
    parser.add_argument("--keep", type=int, default=1000, help="how many reports stay")
    parser.add_argument("--log", help="file for the heads of all requests")
    arguments = parser.parse_args()
    for end in (signal.SIGTERM, signal.SIGINT, signal.SIGALRM):
        signal.signal(end, lambda *_: sys.exit(0))
    signal.setitimer(signal.ITIMER_REAL, arguments.seconds)
    os.makedirs(arguments.reports, exist_ok=True)
    try:
        server = Server((ADDRESS, arguments.port), Exchange)
    except OSError as fault:
        sys.exit(f"support server: can't listen on {ADDRESS}:{arguments.port}: {fault.strerror}")
    server.desk = Desk(arguments.reports, arguments.first, arguments.megabytes, arguments.keep, arguments.log)
    print(server.server_address[1], flush=True)
    server.serve_forever()


if __name__ == "__main__":
    main()
