#!/usr/bin/env python3
"""CIM servers that are silent, slow, break off or do not speak HTTP, and a generator that goes on."""

import socket
import sys
import time

import expected
import rows
import wire
from generator import QUICK, Generator
from hostile_run import (ABANDONED, BOTH, CLASS, DROPPED, EMPTY, FIRST_FILE, INSTANCES, WHOLE,
                         HostileRun, right, sends)
from hostile_server import HostileServer

SUITE = rows.Suite(__doc__)
# So many octets of a stream without end come before the client must have left.
ENOUGH = 256 * rows.MIB


def both(name, fault, **options):
    """A case: the fault in the answer for the class, and in the one for the instances."""
    @SUITE.case(name)
    def _(trial):
        with HostileRun(trial) as run:
            return run.expect_both(fault, **options)


def with_head(head, then="close"):
    """A right body after this header."""
    return sends(lambda body: head + b"\r\n" + body, then)


def with_chunks(make, then="close"):
    """What `make` makes of the right body in the place of its chunks."""
    return sends(lambda body: wire.CHUNKED + make(body), then)


# ---- connections

def expect_no_run(trial, generator, what, quick=False):
    """The run ends at once, or at the time-out, with status 1 and touches nothing."""
    trial.count()
    generator.empty_outputs()
    (generator.mif / "a.mif").write_bytes(expected.EARLIER)
    finished = generator.run("SMS", {"CLOCK": QUICK} if quick else None)
    if (finished.status, finished.out) != (1, generator.banner()):
        raise rows.Failure(f"{what}: expected status 1 and no script, seen {finished}")
    rows.expect_equal(generator.outputs(), {"mif/a.mif": expected.EARLIER}, f"{what}: files")


@SUITE.case("connection refused; no socket; no socket but a file")
def _(trial):
    with rows.place() as place:
        generator = Generator(trial.bin, place)
        generator.add_script("a", "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n")
        expect_no_run(trial, generator, "no socket")
        with socket.socket(socket.AF_UNIX) as nobody_listens:
            nobody_listens.bind(str(generator.socket))
            expect_no_run(trial, generator, "nobody listens")
        generator.socket.unlink()
        generator.socket.write_bytes(b"")
        expect_no_run(trial, generator, "a file")
    return "status 1, earlier files untouched"


@SUITE.case("server that never accepts, its queue full")
def _(trial):
    with rows.place() as place:
        generator = Generator(trial.bin, place)
        generator.add_script("a", "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n")
        with socket.socket(socket.AF_UNIX) as listener, socket.socket(socket.AF_UNIX) as first:
            listener.bind(str(generator.socket))
            listener.listen(0)
            first.connect(str(generator.socket))
            expect_no_run(trial, generator, "full queue", quick=True)
    return "status 1 at the time-out, earlier files untouched"


@SUITE.case("server that is gone after the first class")
def _(trial):
    with rows.place() as place:
        generator = Generator(trial.bin, place)
        for name in ("a", "b"):
            generator.add_script(name, "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n")

        def answer(peer, request):
            peer.send(wire.in_chunks(right(request)))
            server.stop()
        with HostileServer(generator.socket, answer) as server:
            trial.count()
            generator.empty_outputs()
            for name in ("a", "b"):
                (generator.mif / f"{name}.mif").write_bytes(expected.EARLIER)
            finished = generator.run("SMS")
            # The instances of script a are taken as none; script b has no class to ask about.
            rows.expect_equal((finished.status, finished.out),
                              (0, generator.banner() + "Deleting a...\n"), "run")
            rows.expect_equal(generator.outputs(), {"mif/b.mif": expected.EARLIER}, "files")
    return "first script without instances, the others abandoned, status 0"


@SUITE.case("connection closed before and inside the request, by octets read")
def _(trial):
    with HostileRun(trial) as run:
        lengths = []

        def whole_request(_, request):
            lengths.append(len(request.head) + 4 + len(request.body))
        run.expect(ABANDONED, CLASS, whole_request, what="after the request")
    for octets in trial.some(range(lengths[0]), every=197):
        def reads_some(peer, number, octets=octets):
            if number > 1:
                return True
            peer.connection.recv(1, socket.MSG_PEEK)
            left = octets
            while left:
                left -= len(peer.connection.recv(left))
            return False
        with HostileRun(trial) as run:
            run.server.on_connect = reads_some
            run.expect_run(ABANDONED, f"{octets} octets read")
    return f"{ABANDONED}; next script right"


@SUITE.case("connections closed before a request comes")
def _(trial):
    with HostileRun(trial) as run:
        for closed in trial.some(range(1, 8), every=3):
            trial.count()
            first = run.server.connections + 1
            run.server.on_connect = lambda _, number, end=first + closed: number >= end
            run.generator.empty_outputs()
            (run.generator.mif / "a.mif").write_bytes(expected.EARLIER)
            finished = run.generator.run("SMS")
            # Which requests are lost depends on who is faster.
            rows.expect_equal(finished.status, 0, f"{closed} closed: {finished}: status")
            outputs = run.generator.outputs()
            rows.expect(outputs.pop("mif/a.mif") in FIRST_FILE.values() and
                        outputs in ({}, {"mif/b.mif": expected.NEXT}),
                        f"{closed} closed: expected whole files, seen {run.generator.outputs()}")
        run.server.on_connect = None
        run.expect_run(WHOLE, "next run")
    return "run ends, every file whole; next run right"


@SUITE.case("answer cut after every octet")
def _(trial):
    with HostileRun(trial) as run:
        lengths = {}

        def measured(peer, request):
            lengths[request.method] = len(wire.in_chunks(right(request)))
            return sends(wire.in_chunks, "keep")(peer, request)
        for where, lost in ((CLASS, ABANDONED), (INSTANCES, EMPTY)):
            run.expect(WHOLE, where, measured, what="control")
            length = lengths[where[0]]
            for octets in trial.some(range(length), every=37):
                cut = sends(lambda body, octets=octets: wire.in_chunks(body)[:octets])
                # Nothing is missing without the very last line feed.
                run.expect(WHOLE if octets == length - 1 else lost, where, cut,
                           what=f"{octets} octets")
    return BOTH


@SUITE.case("answer cut after some octets, then silence")
def _(trial):
    with HostileRun(trial) as run:
        for octets in trial.some([0, 9, 40, 120, 124, 200, 350, 450], every=3):
            cut = sends(lambda body, octets=octets: wire.in_chunks(body)[:octets], "hang")
            run.expect_both(cut, quick=True, what=f"{octets} octets")
        trailer = sends(lambda body: wire.in_chunks(body)[:-2] + b"CIMStatusCode: 0\r\n", "hang")
        run.expect_both(trailer, quick=True, what="inside the trailer")
    return BOTH + "; at the time-out"


@SUITE.case("silence for the real three minutes")
def _(trial):
    if not trial.full:
        raise rows.Skip("only at full effort")
    with HostileRun(trial) as run:
        start = time.monotonic()
        run.expect(EMPTY, INSTANCES, sends(lambda body: b"", "hang"), patience_s=240)
        seconds = time.monotonic() - start
        rows.expect(seconds >= 180, f"expected 180 s of patience, seen {seconds:.1f} s")
    return f"{EMPTY} after 180 s; next script right"


@SUITE.case("slow drip, one octet a second")
def _(trial):
    def drip(pause_s):
        def fault(peer, request):
            peer.drip(wire.in_chunks(right(request)), pause_s)
            return True
        return fault
    with HostileRun(trial) as run:
        # The answers have more octets than the time-out has seconds: the time is the operation's.
        run.expect_both(drip(1 / QUICK), quick=True, what="drip")
        run.expect(WHOLE, CLASS, drip(0), what="ten thousand octets a second")
    return BOTH + "; at the time-out of the whole operation"


# ---- lengths and chunks

for _length in ("0", "1", "200"):
    both(f"Content-Length too short ({_length})",
         sends(lambda body, said=_length: wire.with_length(body, said), "keep"))
for _length in ("100000", "4294967296", "9223372036854775807", "9223372036854775808", "9" * 40,
                "-1", "-500", "many", "0x200", ""):
    both(f"Content-Length wrong ({_length[:20] or 'empty'}), then closed",
         sends(lambda body, said=_length: wire.with_length(body, said)))
both("Content-Length too long, then silence",
     sends(lambda body: wire.with_length(body, len(body) + 1), "hang"), quick=True)
both("Content-Length negative, then silence",
     sends(lambda body: wire.with_length(body, "-5"), "hang"), quick=True)
both("two Content-Length that differ",
     sends(lambda body: wire.HEAD + b"Content-Length: 20\r\nContent-Length: %d\r\n\r\n" % len(body) +
           body))
both("two Content-Length that differ, the right one first",
     sends(lambda body: wire.HEAD + b"Content-Length: %d\r\nContent-Length: 20\r\n\r\n" % len(body) +
           body))


@SUITE.case("two Content-Length that agree; a length beside chunks")
def _(trial):
    def twice(body):
        line = b"Content-Length: %d\r\n" % len(body)
        return wire.HEAD + line + line + b"\r\n" + body
    with HostileRun(trial) as run:
        run.expect(WHOLE, INSTANCES, sends(twice, "keep"), what="twice")
        run.expect(WHOLE, INSTANCES, sends(
            lambda body: wire.in_chunks(body).replace(
                b"Transfer", b"Content-Length: 7\r\nTransfer", 1), "keep"), what="beside chunks")
    return f"{WHOLE}; next script right"


for _name, _size in {"garbage": b"zz", "empty": b"", "negative": b"-5", "blank": b" ",
                     "huge": b"7fffffffffffffff", "beyond 64 bits": b"f" * 17,
                     "a thousand digits": b"1" * 1000, "hexadecimal prefix": b"0x10"}.items():
    both(f"chunk size: {_name}",
         with_chunks(lambda body, size=_size: size + b"\r\n" + body + b"\r\n0\r\n\r\n"))
both("chunk size: too small",
     with_chunks(lambda body: b"%x\r\n" % (len(body) - 3) + body + b"\r\n0\r\n\r\n"))
both("chunk size: too large",
     with_chunks(lambda body: b"%x\r\n" % (len(body) + 3) + body + b"\r\n0\r\n\r\n"))
both("chunk size: huge, then silence",
     with_chunks(lambda body: b"7fffffffffffffff\r\n" + body, "hang"), quick=True)
both("chunk without its line end",
     with_chunks(lambda body: b"%x\r\n" % 50 + body[:50] + wire.chunk(body[50:]) + b"0\r\n\r\n"))
both("zero-size chunk in the middle",
     with_chunks(lambda body: wire.chunk(body[:99]) + b"0\r\n\r\n" + wire.chunk(body[99:]) +
                 b"0\r\n\r\n", "keep"))
both("stop inside a chunk", with_chunks(lambda body: b"%x\r\n" % len(body) + body[:99]))
both("no last chunk", with_chunks(wire.chunk))
both("endless chunk extension", lambda peer, request: peer.send(wire.CHUNKED + b"5;") or
     peer.stream(b"x" * 1000, None), quick=True)


# ---- headers and trailers

def endless(start, line):
    """A fault that sends `start` and then `line` until the client leaves."""
    def fault(peer, request):
        peer.send(start(right(request)))
        peer.stream(line, ENOUGH)
        raise rows.Failure("the client did not leave")
    return fault


both("endless header lines", endless(lambda body: wire.HEAD, b"X-Field: value\r\n"))
both("endless header line", endless(lambda body: wire.HEAD + b"X-Field: ", b"value"))
both("endless status line", endless(lambda body: b"HTTP/1.1 200 ", b"O"))
both("endless interim answers", endless(lambda body: b"", b"HTTP/1.1 100 Continue\r\n\r\n"))
both("endless folded header line", endless(lambda body: wire.HEAD + b"X-Field: v", b"\r\n more"))
both("endless trailer lines",
     endless(lambda body: wire.CHUNKED + wire.chunk(body) + b"0\r\n", b"X-Field: value\r\n"))
both("endless trailer line",
     endless(lambda body: wire.CHUNKED + wire.chunk(body) + b"0\r\nX-Field: ", b"value"))


@SUITE.case("trailer that reports a CIM error after good data")
def _(trial):
    with HostileRun(trial) as run:
        for code in trial.some([1, 2, 3, 4, 5, 6, 7, 16, 20, 99], every=4):
            late = sends(lambda body, code=code: wire.in_chunks(
                body, trailer=b"CIMStatusCode: %d\r\nCIMStatusCodeDescription: late%%20news\r\n" %
                code), "keep")
            run.expect(DROPPED, CLASS, late, what=f"code {code}")
            run.expect(EMPTY, INSTANCES, late, what=f"code {code}")
    return f"class: {DROPPED}; instances: {EMPTY}; next script right"


for _code in ("six", "-1", "4294967297", "6.5"):
    both(f"trailer with CIMStatusCode: {_code}",
         sends(lambda body, code=_code: wire.in_chunks(
             body, trailer=f"CIMStatusCode: {code}\r\n".encode()), "keep"))


# ---- what is no answer

both("connection reset", lambda peer, request: peer.connection.shutdown(socket.SHUT_RDWR))
both("garbage", sends(lambda body: bytes(range(256)) * 40))
both("another protocol", sends(lambda body: b"SSH-2.0-Server\r\n", "hang"))
both("NULs", sends(lambda body: bytes(100000)))
both("header lines with NULs and without a colon",
     with_head(b"HTTP/1.1 200 OK\r\nContent-Type\0: text/xml\r\nno colon\r\n"))
both("200 with an HTML page",
     sends(lambda body: b"HTTP/1.1 200 OK\r\nContent-Type: text/html\r\nContent-Length: 29\r\n\r\n"
           b"<html><body>Hi!</body></html>", "keep"))
both("200 with an HTML page that calls itself XML",
     sends(lambda body: wire.with_length(b"<html><body>Hi!</body></html>"), "keep"))
both("200 without a body", sends(lambda body: wire.with_length(b""), "keep"))
for _status in (101, 204, 301, 400, 401, 404, 500, 503, 999):
    both(f"HTTP status {_status}", sends(
        lambda body, status=_status: b"HTTP/1.1 %d Odd\r\nLocation: http://192.0.2.1/\r\n" % status +
        wire.with_length(body).split(b"\r\n", 1)[1]))


if __name__ == "__main__":
    sys.exit(SUITE.main())
