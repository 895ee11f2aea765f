#!/usr/bin/env python3
"""A stand-in for a mail server: greets whoever connects, as POP3 and SMTP servers do, and takes no mail.

    mail_greeter.py PROTOCOL [PORT] [--seconds N] [--log FILE]

PROTOCOL is pop3 or smtp. Listens on loopback only. Prints its port once it can be reached and ends after N seconds or on
SIGTERM. A client that sends a whole line is answered that nothing can be done for it; what it sends without a line end
is left alone. The log has a line for each visit, with the bytes that were sent."""

import argparse
import signal
import socketserver
import sys
import threading

ADDRESS = "127.0.0.1"
PATIENCE = 60
MOST_CONNECTIONS = 64
LONGEST_LINE = 1024
LINES_ANSWERED = 20

# Port, greeting, answer to any command, answer to QUIT.
PROTOCOLS = {
    "pop3": (110, b"+OK ready\r\n", b"-ERR no mailbox here\r\n", b"+OK bye\r\n"),
    "smtp": (25, b"220 localhost ready\r\n", b"502 no mail is taken here\r\n", b"221 bye\r\n"),
}


class Visit(socketserver.StreamRequestHandler):
    timeout = PATIENCE

    def handle(self):
        if threading.active_count() > MOST_CONNECTIONS:
            return
        said = []
        try:
            self.talk(said)
        except OSError:
            pass  # a peer that is silent or gone concerns nobody else
        self.server.note(b"".join(said))

    def talk(self, said):
        _, greeting, refusal, farewell = self.server.protocol
        self.wfile.write(greeting)
        for _ in range(LINES_ANSWERED):
            line = self.rfile.readline(LONGEST_LINE)
            said.append(line)
            if not line.endswith(b"\n"):
                return
            if line.strip().upper() == b"QUIT":
                self.wfile.write(farewell)
                return
            self.wfile.write(refusal)


class Server(socketserver.ThreadingTCPServer):
    allow_reuse_address = True
    daemon_threads = True
    block_on_close = False
    request_queue_size = 64
    log = None
    lock = threading.Lock()

    def note(self, said):
        if not self.log:
            return
        with self.lock, open(self.log, "a") as log:
            log.write(f"{said!r}\n")

    def handle_error(self, request, client_address):
        print(f"mail greeter: {sys.exc_info()[1]}", file=sys.stderr, flush=True)


def main():
    parser = argparse.ArgumentParser(description="stand-in mail server on loopback")
    parser.add_argument("protocol", choices=PROTOCOLS)
    parser.add_argument("port", nargs="?", type=int)
    parser.add_argument("--seconds", type=float, default=3600)
    parser.add_argument("--log", help="file for what visitors say")
    arguments = parser.parse_args()
    for end in (signal.SIGTERM, signal.SIGINT, signal.SIGALRM):
        signal.signal(end, lambda *_: sys.exit(0))
    signal.setitimer(signal.ITIMER_REAL, arguments.seconds)
    protocol = PROTOCOLS[arguments.protocol]
    port = protocol[0] if arguments.port is None else arguments.port
    try:
        server = Server((ADDRESS, port), Visit)
    except OSError as fault:
        sys.exit(f"mail greeter: can't listen on {ADDRESS}:{port}: {fault.strerror}")
    server.protocol = protocol
    server.log = arguments.log
    print(server.server_address[1], flush=True)
    server.serve_forever()


if __name__ == "__main__":
    main()
