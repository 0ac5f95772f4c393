"""Requests over HTTP that no CIM client sends, but a web page in a browser of this machine may."""

import pathlib
import socket

import neighbours
import rows
from rows import expect, expect_equal

from cimomd_server import Server, call, exchange, post

SUITE = rows.Suite(__doc__)
BODY = call("EnumerateClassNames")
GOOD = post(BODY)
ANSWERED = "HTTP/1.1 200"


class Daemon:
    """cimomd on the loopback, to be used in a with statement."""

    def __init__(self, trial, *more):
        self._place = rows.place()
        place = pathlib.Path(self._place.__enter__())
        self._server = Server(place, trial.bin / "cimomd", "--http", "127.0.0.1:0", "--root",
                              neighbours.MACHINE, *more)
        self.port = self._server.port()

    def __enter__(self):
        return self

    def __exit__(self, *what):
        self._server.end()
        self._place.__exit__(*what)

    def answer(self, request):
        """The first line of the answer without its words, and everything."""
        with socket.create_connection(("127.0.0.1", self.port), rows.PATIENCE_S) as connection:
            octets = exchange(connection, request)
        return octets[:12].decode(errors="replace"), octets

    def expect_refused(self, request, status, what):
        first, octets = self.answer(request)
        expect_equal(first, f"HTTP/1.1 {status}", what)
        expect(b"CLASSNAME" not in octets, f"{what}: the answer has contents")
        expect(b"access-control" not in octets.lower(), f"{what}: a web page may read the answer")

    def expect_served(self, request, what):
        first, octets = self.answer(request)
        expect_equal(first, ANSWERED, what)
        expect(b'<CLASSNAME NAME="CIM_ManagedElement"/>' in octets, f"{what}: no contents")


def with_host(host):
    return post(BODY, host=host.encode())


OWN_NAMES = ("localhost", "LocalHost", "localhost:5988", "127.0.0.1", "127.0.0.1:1", "127.1.2.3",
             "[::1]", "[::1]:5988")
FOREIGN_NAMES = (
    "evil.example", "evil.example:5988", "localhost.evil.example", "127.0.0.1.evil.example",
    "127.0.0.1.nip.io", "evil.example#localhost", "localhost@evil.example", "evil.example@localhost",
    "localhost:80@evil.example", "localhost evil.example", "evil.example, localhost", "localhost.",
    "0.0.0.0", "0", "2130706433", "0x7f000001", "017700000001", "127.1", "127.0.0.01", "128.0.0.1",
    "10.0.0.1", "169.254.169.254", "[::]", "[::ffff:127.0.0.1]", "[::1", "::1", "[fe80::1]",
    "localhost:", "localhost:x", "localhost:65536", "localhost:-1", "")


@SUITE.case("a Host header with another name than that of the loopback")
def _(trial):
    with Daemon(trial) as daemon:
        for host in OWN_NAMES:
            daemon.expect_served(with_host(host), f"Host: {host}")
        for host in FOREIGN_NAMES:
            trial.count()
            daemon.expect_refused(with_host(host), 403, f"Host: {host}")
        nameless = GOOD.replace(b"Host: localhost\r\n", b"")
        for request in (nameless, nameless.replace(b"HTTP/1.1", b"HTTP/1.0")):
            trial.count()
            daemon.expect_refused(request, 403, "no Host")
    return "403 without contents, also where there is none"


def replaced(old, new):
    expect(old in GOOD, f"the request has no {old!r}")
    return GOOD.replace(old, new)


KEPT_OPEN = replaced(b"Connection: close\r\n", b"")
LENGTH = b"Content-Length: %d" % len(KEPT_OPEN.split(b"\r\n\r\n", 1)[1])


def with_lines(old, *new):
    """The request with other lines for one, on a connection that is to stay open."""
    expect(old in KEPT_OPEN, f"the request has no {old!r}")
    return KEPT_OPEN.replace(old, b"\r\n".join(new))


def in_chunks(*lines):
    head, body = with_lines(LENGTH, *lines).split(b"\r\n\r\n", 1)
    return head + b"\r\n\r\n%x\r\n%s\r\n0\r\n\r\n" % (len(body), body)


HOST = b"Host: localhost"
CHUNKED = b"Transfer-Encoding: chunked"
# Requests that two readers take for different ones.
AMBIGUOUS = {
    "two hosts, the foreign one last": with_lines(HOST, HOST, b"Host: evil.example"),
    "two hosts, the foreign one first": with_lines(HOST, b"Host: evil.example", HOST),
    "the same host twice": with_lines(HOST, HOST, b"host: localhost"),
    "a NUL behind the host": with_lines(HOST, HOST + b"\0.evil.example"),
    "a NUL at the end of the head": with_lines(
        HOST + b"\r\n", b"").replace(b"\r\n\r\n", b"\r\n" + HOST + b"\0evil\r\n\r\n", 1),
    "a NUL behind the path": KEPT_OPEN.replace(b"/cimom ", b"/cimom\0/evil "),
    "a NUL behind the version": KEPT_OPEN.replace(b"HTTP/1.1\r", b"HTTP/1.1\0evil\r", 1),
    "a NUL behind the method": KEPT_OPEN.replace(b"POST ", b"POST\0evil ", 1),
    "a host on two lines": with_lines(HOST, b"Host:\r\n localhost"),
    "a NUL in a line of two": with_lines(HOST, HOST + b"\r\nX-Field: a\r\n b\0c"),
    "a NUL before a line of two": with_lines(HOST, HOST + b"\0evil\r\nX-Field: a\r\n b"),
    "two lengths, the wrong one last": with_lines(LENGTH, LENGTH, b"Content-Length: 3"),
    "two lengths, the wrong one first": with_lines(LENGTH, b"Content-Length: 3", LENGTH),
    "a length beside chunks": in_chunks(LENGTH, CHUNKED),
    "chunks beside a length": in_chunks(CHUNKED, LENGTH),
    "no chunks though they are announced": with_lines(LENGTH, LENGTH, CHUNKED),
    "an unknown coding": in_chunks(b"Transfer-Encoding: xchunked"),
    "two codings": in_chunks(b"Transfer-Encoding: gzip, chunked"),
    "chunks twice": in_chunks(CHUNKED, CHUNKED),
}


@SUITE.case("a request that can be read in two ways")
def _(trial):
    with Daemon(trial) as daemon:
        daemon.expect_served(in_chunks(CHUNKED + b"\r\nConnection: close"), "a body in chunks")
        daemon.expect_served(GOOD.replace(b"\r\n", b"\n"), "lines that end with LF alone")
        daemon.expect_served(GOOD.replace(b": ", b": \t "), "blanks before the values")
        for field in (b"X-Empty:", b"X-Blank: ", b"Cookie: a=b; c", b"X-Field:a \t"):
            daemon.expect_served(GOOD.replace(HOST, HOST + b"\r\n" + field), field)
        for what, request in AMBIGUOUS.items():
            trial.count()
            daemon.expect_refused(request, 400, what)
            # Whatever follows could be its body or another request.
            _, octets = daemon.answer(request + GOOD)
            expect_equal(octets.count(b"HTTP/1.1 "), 1, f"answers to {what}")
    return "400, and the connection ends"


# Without asking first, a page can send these three types, and no header of its own.
FROM_A_PAGE = {
    "no CIMOperation": (replaced(b"CIMOperation: MethodCall\r\n", b""), 400),
    "an empty CIMOperation": (replaced(b"CIMOperation: MethodCall", b"CIMOperation: "), 400),
    "a form": (replaced(b"application/xml", b"application/x-www-form-urlencoded"), 415),
    "a form with files": (replaced(b"application/xml", b"multipart/form-data; boundary=x"), 415),
    "plain text": (replaced(b"application/xml", b"text/plain"), 415),
    "no type": (replaced(b"Content-Type: application/xml\r\n", b""), 415),
    "another path": (replaced(b"/cimom", b"/"), 404),
    "GET": (replaced(b"POST", b"GET"), 405),
    "HEAD": (replaced(b"POST", b"HEAD"), 405),
    "PUT": (replaced(b"POST", b"PUT"), 405),
    "the question before a request": (
        b"OPTIONS /cimom HTTP/1.1\r\nHost: localhost\r\nOrigin: http://evil.example\r\n"
        b"Access-Control-Request-Method: POST\r\n"
        b"Access-Control-Request-Headers: cimoperation,content-type\r\n"
        b"Connection: close\r\n\r\n", 405),
}


@SUITE.case("a request that a web page can send without being asked first")
def _(trial):
    with Daemon(trial) as daemon:
        daemon.expect_served(GOOD, "a good request")
        for what, (request, status) in FROM_A_PAGE.items():
            trial.count()
            daemon.expect_refused(request, status, what)
    return "refused, without contents or leave for pages to ask"


def addresses_of_machine():
    """Addresses of this machine that others reach, as far as a name or a route tells them."""
    found = set()
    for family, elsewhere in ((socket.AF_INET, "192.0.2.1"), (socket.AF_INET6, "2001:db8::1")):
        try:
            with socket.socket(family, socket.SOCK_DGRAM) as probe:
                probe.connect((elsewhere, 9))
                found.add((family, probe.getsockname()[0]))
        except OSError:
            pass
    return found


@SUITE.case("a connection to an address that others reach")
def _(trial):
    with Daemon(trial) as daemon:
        for family, address in addresses_of_machine():
            trial.count()
            with socket.socket(family) as connection:
                connection.settimeout(rows.PATIENCE_S)
                expect(connection.connect_ex((address, daemon.port)) != 0,
                       f"there is a server at {address}")
    for address in ("0.0.0.0:0", "[::]:0", "192.0.2.1:0", "example.net:0", "128.0.0.1:0"):
        trial.count()
        finished = rows.run([trial.bin / "cimomd", "--http", address])
        expect_equal(finished.status, 1, f"--http {address}: {finished}")
    return "nobody listens there, and no option makes it so"


if __name__ == "__main__":
    neighbours.main(SUITE)
