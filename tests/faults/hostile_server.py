"""A CIM server on a Unix socket that answers byte by byte as a test wants it to, right or wrong."""

import contextlib
import os
import re
import select
import socket
import threading

# Longer than any client waits.
PATIENCE_S = 600
RECEIVE_OCTETS = 65536


class Request:
    """What a test may want to know of a request."""

    def __init__(self, head, body):
        self.head = head
        self.body = body
        self.method = _found(rb'<IMETHODCALL NAME="(\w+)"', body)
        self.class_name = _found(rb'<CLASSNAME NAME="(\w+)"', body)
        self.message_id = _found(rb'<MESSAGE ID="(\w+)"', body)


def _found(pattern, octets):
    match = re.search(pattern, octets)
    return match.group(1).decode() if match else ""


class Peer:
    """The server's end of one connection. Its methods raise OSError when the client has gone."""

    def __init__(self, connection):
        self.connection = connection

    def send(self, octets):
        self.connection.sendall(octets)

    def stream(self, octets, total=None):
        """Sends `octets` again and again, `total` octets at least or until the client leaves."""
        block = octets * (1 + (1 << 16) // len(octets))
        sent = 0
        while total is None or sent < total:
            self.send(block)
            sent += len(block)

    def drip(self, octets, pause_s):
        """One octet at a time."""
        for octet in octets:
            self.send(bytes([octet]))
            if select.select([self.connection], [], [], pause_s)[0]:
                raise ConnectionResetError("the client left")

    def hang(self):
        """Says nothing more, until the client leaves."""
        while select.select([self.connection], [], [], PATIENCE_S)[0]:
            if not self.connection.recv(RECEIVE_OCTETS):
                return


class HostileServer:
    """To be used in a with statement.

    `answer` is called with a Peer and a Request, in the thread of the connection; a true result
    keeps the connection. `on_connect`, when set, is called with a Peer and the number of the
    connection before anything is read; a false result closes the connection. What they raise, the
    loss of the connection aside, is noted in `failures`.
    """

    def __init__(self, path, answer, backlog=128):
        self.path = str(path)
        self.answer = answer
        self.on_connect = None
        self.connections = 0
        self.failures = []
        self._open = set()
        self._listener = socket.socket(socket.AF_UNIX)
        self._listener.bind(self.path)
        os.chmod(self.path, 0o666)
        self._listener.listen(backlog)
        self._thread = threading.Thread(target=self._accept, daemon=True)

    def __enter__(self):
        self._thread.start()
        return self

    def __exit__(self, *_):
        self.stop()

    def stop(self):
        """No connection is taken any more, and those that there are end."""
        # Closing alone does not wake the thread that accepts.
        with contextlib.suppress(OSError):
            self._listener.shutdown(socket.SHUT_RDWR)
        self._listener.close()
        for connection in list(self._open):
            with contextlib.suppress(OSError):
                connection.shutdown(socket.SHUT_RDWR)

    def _accept(self):
        while True:
            try:
                connection, _ = self._listener.accept()
            except OSError:
                return
            self.connections += 1
            threading.Thread(target=self._serve, args=(connection, self.connections),
                             daemon=True).start()

    def _serve(self, connection, number):
        self._open.add(connection)
        try:
            with connection:
                self._answer_all(Peer(connection), number)
        except OSError:
            pass
        except Exception as failure:  # pylint: disable=broad-except; a thread has nobody to tell
            self.failures.append(repr(failure))
        finally:
            self._open.discard(connection)

    def _answer_all(self, peer, number):
        if self.on_connect and not self.on_connect(peer, number):
            return
        while (request := _read_request(peer.connection)) is not None:
            if not self.answer(peer, request):
                return


def _read_request(connection):
    received = b""
    while b"\r\n\r\n" not in received:
        piece = connection.recv(RECEIVE_OCTETS)
        if not piece:
            return None
        received += piece
    # Anything before it came from a client that writes something else into the connection.
    if not received.startswith(b"POST /cimom HTTP/1.1\r\n"):
        return None
    head, body = received.split(b"\r\n\r\n", 1)
    length = int(re.search(rb"(?i)\ncontent-length: *(\d+)", head).group(1))
    while len(body) < length:
        piece = connection.recv(RECEIVE_OCTETS)
        if not piece:
            return None
        body += piece
    return Request(head, body)
