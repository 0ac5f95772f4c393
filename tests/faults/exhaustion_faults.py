#!/usr/bin/env python3
"""CIM servers whose answers are made to exhaust a client: without an end, which the client must not
wait for, and just beyond a limit, beside others that are just within it."""

import sys

import rows
import wire
from generator import MEMORY_LIMIT, Generator
from hostile_run import (ABANDONED, BOTH, CLASS, DROPPED, EMPTY, INSTANCES, WHOLE, HostileRun, right,
                         sends, sends_document)
from hostile_server import HostileServer
from rows import MIB

SUITE = rows.Suite(__doc__)
GIB = 1 << 30
LOST = {CLASS: ABANDONED, INSTANCES: EMPTY}
BLOCK = 1 << 16


def again(octets, total):
    """The octets again and again, in large pieces, about `total` in all."""
    block = octets * (1 + BLOCK // len(octets))
    return (block for _ in range(total // len(block)))


# ---- answers without an end

def stream(start, pieces, most, inside=b"<IRETURNVALUE>"):
    """A fault: a document that begins as the right one does, and goes on with `inside` in the place
    of IRETURNVALUE, `start` and the pieces. The client has to leave before it was sent `most` octets
    of them."""
    def fault(peer, request):
        document = right(request)
        peer.send(wire.HEAD + b"Connection: close\r\n\r\n")
        peer.send(document[:document.index(b"<IRETURNVALUE>")] + inside + start)
        sent = 0
        for piece in pieces:
            peer.send(piece)
            sent += len(piece)
            if sent > most:
                raise rows.Failure(f"after {sent // MIB} MiB the client still listens")
        raise rows.Failure("the client has taken it all")
    return fault


# What the client's HTTP library reads in one go, at most a hundred times 256 KiB, and what the socket
# holds.
ON_THE_WAY = 32 * MIB


def endless(name, start, octets, most, memory=MEMORY_LIMIT, small=(CLASS, INSTANCES), **options):
    """A case: answers that go on with these octets for ever. `most` of them, by place, may be taken.
    Places that are not in `small` take long and are tried at full effort."""
    @SUITE.case(name)
    def _(trial):
        with HostileRun(trial) as run:
            for where in (CLASS, INSTANCES) if trial.full else small:
                run.expect(LOST[where], where, stream(start[where], again(octets, 4 * GIB),
                                                      most[where] + ON_THE_WAY, **options),
                           name, memory=memory, patience_s=240)
        return f"{BOTH}; less than {memory // MIB} MiB of memory"


def at_both(octets):
    return {CLASS: octets, INSTANCES: octets}


# The begin of a property, in a class and in an instance.
PROPERTY = {CLASS: b'<CLASS NAME="CIM_Faulty"><PROPERTY NAME="P" TYPE="string">',
            INSTANCES: b'<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME="CIM_Faulty"/><INSTANCE '
                       b'CLASSNAME="CIM_Faulty"><PROPERTY NAME="P" TYPE="string">'}


def inside_property(octets):
    return {where: begin + octets for where, begin in PROPERTY.items()}


AT_ONCE = {CLASS: 0, INSTANCES: 0}
# The limit of one class, and of one tag or text.
TOKEN = {CLASS: 16 * MIB, INSTANCES: 64 * MIB}

endless("nesting without an end", at_both(b""), b"<VALUE.ARRAY>", AT_ONCE)
# Whatever is in an ERROR is passed over.
endless("nesting without an end where anything may stand", at_both(b""), b"<A>", AT_ONCE,
        inside=b'<ERROR CODE="6">')
endless("endless tag", at_both(b"<"), b"VALUE", TOKEN, 3 * MEMORY_LIMIT)
endless("endless attribute", at_both(b'<CLASS NAME="'), b"CIM", TOKEN, 3 * MEMORY_LIMIT,
        small=(CLASS,))
endless("endless comment", at_both(b"<!--"), b"more", TOKEN, 3 * MEMORY_LIMIT)
endless("endless value", inside_property(b"<VALUE>"), b"text", TOKEN, 4 * MEMORY_LIMIT)
endless("endless value in pieces", inside_property(b"<VALUE>"), b"text" * 999 + b"<!-- -->", TOKEN,
        4 * MEMORY_LIMIT, small=(CLASS,))
endless("endless blanks", at_both(b""), b" ", TOKEN, 3 * MEMORY_LIMIT, small=(CLASS,))


# All of it is one class, and all of it right.
CLASS_PARTS = {
    "properties": b'<PROPERTY NAME="P%d" TYPE="uint8"/>',
    "qualifiers": b'<QUALIFIER NAME="Q%d" TYPE="uint8"><VALUE>1</VALUE></QUALIFIER>',
    "methods": b'<METHOD NAME="M%d" TYPE="uint8"/>',
}


def numbered(part):
    first = 0
    while True:
        yield b"".join(part % number for number in range(first, first + 1000))
        first += 1000


for _name, _part in CLASS_PARTS.items():
    @SUITE.case(f"a class of endless {_name}")
    def _(trial, name=_name, part=_part):
        if not trial.full:
            raise rows.Skip("takes long: at full effort only")
        with HostileRun(trial) as run:
            run.expect(ABANDONED, CLASS,
                       stream(b'<CLASS NAME="CIM_Faulty">', numbered(part), 16 * MIB + ON_THE_WAY),
                       name, memory=3 * MEMORY_LIMIT, patience_s=240)
        return f"{ABANDONED}; next script right; less than {3 * MEMORY_LIMIT // MIB} MiB of memory"


@SUITE.case("endless attributes")
def _(trial):
    with HostileRun(trial) as run:
        for where in (CLASS, INSTANCES) if trial.full else (CLASS,):
            run.expect(LOST[where], where, stream(b"<CLASS", numbered(b' a%d="b"'),
                                                  TOKEN[where] + ON_THE_WAY), "attributes",
                       memory=3 * MEMORY_LIMIT)
    return f"{BOTH}; less than {3 * MEMORY_LIMIT // MIB} MiB of memory"


# ---- limits

def filled(make, filling):
    """A fault: the document that `make` makes of the request, with the pieces in the place of its
    "@"."""
    def fault(peer, request):
        before, after = make(request).split(b"@")
        peer.send(wire.CHUNKED + wire.chunk(before))
        for piece in filling:
            peer.send(wire.chunk(piece))
        peer.send(wire.chunk(after) + b"0\r\n\r\n")
        return True
    return fault


def in_class(xml):
    return lambda request: wire.result(request, wire.cim_class("CIM_Faulty", xml))


def in_instance(xml):
    return lambda request: wire.result(request, wire.named(
        "CIM_Faulty", wire.string_property("Name", "x1") + xml))


def attributes(count):
    return b"".join(b' a%d="b"' % number for number in range(count))


@SUITE.case("64 attributes, and 65")
def _(trial):
    # Two more have names of their own.
    xml = '<PROPERTY NAME="P" TYPE="uint8"@/>'
    with HostileRun(trial) as run:
        for where, make in ((CLASS, in_class(xml)), (INSTANCES, in_instance(xml))):
            run.expect(WHOLE, where, filled(make, [attributes(62)]), "64")
            run.expect(LOST[where], where, filled(make, [attributes(63)]), "65")
    return f"{WHOLE}; {BOTH}"


@SUITE.case("64 levels, and 65")
def _(trial):
    def nested(count):
        # Whatever is in it, an ERROR is one; it is at the fifth level itself.
        return sends_document(lambda request, _: wire.document(
            request, '<ERROR CODE="6">' + "<A>" * count + "</A>" * count + "</ERROR>"))
    with HostileRun(trial) as run:
        run.expect(DROPPED, CLASS, nested(59), "64")
        run.expect(ABANDONED, CLASS, nested(60), "65")
    return f"{DROPPED}; {ABANDONED}; next script right"


@SUITE.case("4 references in each other's keys, and 5, and 25")
def _(trial):
    def nested(count):
        path = '<INSTANCENAME CLASSNAME="X"/>'
        for _ in range(count):
            path = ('<INSTANCENAME CLASSNAME="X"><VALUE.REFERENCE>' + path +
                    "</VALUE.REFERENCE></INSTANCENAME>")
        return sends_document(lambda request, _: in_instance(
            '<PROPERTY.REFERENCE NAME="P"><VALUE.REFERENCE>' + path +
            "</VALUE.REFERENCE></PROPERTY.REFERENCE>")(request))
    with HostileRun(trial) as run:
        run.expect(WHOLE, INSTANCES, nested(4), "4")
        run.expect(EMPTY, INSTANCES, nested(5), "5")
        run.expect(EMPTY, INSTANCES, nested(25), "25")
    return f"{WHOLE}; {EMPTY}; next script right"


@SUITE.case("a class of 16 MiB, and one octet more")
def _(trial):
    def of(octets):
        def make(request):
            document = in_class("<!--@-->")(request)
            return document.replace(b"@", b"@" + b"x" * (octets - len(document) + 1))
        return filled(make, [])
    with HostileRun(trial) as run:
        for octets, outcome in ((16 * MIB, WHOLE), (16 * MIB + 1, ABANDONED)):
            run.expect(outcome, CLASS, of(octets), f"{octets} octets", memory=2 * MEMORY_LIMIT)
    return f"{WHOLE}; {ABANDONED}; next script right"


# Markup counts as well, about which a test need not know more.
LEEWAY = 64
TOKENS = {
    "text": in_instance('<PROPERTY NAME="P" TYPE="string"><VALUE>@</VALUE></PROPERTY>'),
    "tag": in_instance('<PROPERTY NAME="P" X="@" TYPE="string"/>'),
    "comment": in_instance("<!--@-->"),
    "text in pieces": in_instance('<PROPERTY NAME="P" TYPE="string"><VALUE>@<!-- --> </VALUE>'
                                  "</PROPERTY>"),
}
for _name, _make in TOKENS.items():
    @SUITE.case(f"a {_name} of 64 MiB, and beyond")
    def _(trial, name=_name, make=_make):
        if not trial.full and name != "text":
            raise rows.Skip("takes long: at full effort only")
        with HostileRun(trial) as run:
            for count, outcome in ((64 * MIB - LEEWAY, WHOLE), (64 * MIB + LEEWAY, EMPTY)):
                if trial.full or outcome == WHOLE:
                    blocks = [b"x" * BLOCK] * (count // BLOCK) + [b"x" * (count % BLOCK)]
                    run.expect(outcome, INSTANCES, filled(make, blocks), f"{count} octets",
                               memory=5 * MEMORY_LIMIT)
        return f"{WHOLE}; {EMPTY}; next script right"


@SUITE.case("instances of 4 GiB, and one octet more")
def _(trial):
    if not trial.full:
        raise rows.Skip("takes long: at full effort only")
    comment = b"<!--" + b"x" * (MIB - 7) + b"-->"

    def of(octets):
        def fault(peer, request):
            start, end = in_instance("@")(request).split(b"@")
            left = octets - len(start) - len(end)
            pieces = [comment] * (left // MIB - 1)
            last = left - len(pieces) * MIB
            pieces.append(b"<!--" + b"x" * (last - 7) + b"-->")
            return filled(in_instance("@"), pieces)(peer, request)
        return fault
    with HostileRun(trial) as run:
        for octets, outcome in ((4 * GIB, WHOLE), (4 * GIB + 1, EMPTY)):
            run.expect(outcome, INSTANCES, of(octets), f"{octets} octets", patience_s=240)
    return f"{WHOLE}; {EMPTY}; next script right"


# ---- memory

# Parts of instances, of which many take much more memory than octets.
ELEMENTS = ('<PROPERTY.ARRAY NAME="P" TYPE="string"><VALUE.ARRAY>@</VALUE.ARRAY>'
            "</PROPERTY.ARRAY>")
IN_INSTANCE = (b'<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME="CIM_Faulty"/>'
               b'<INSTANCE CLASSNAME="CIM_Faulty">')
INSTANCE_PARTS = {
    "instances": (b"", IN_INSTANCE + b"</INSTANCE></VALUE.NAMEDINSTANCE>"),
    "elements of an array": (IN_INSTANCE + b'<PROPERTY.ARRAY NAME="P" TYPE="string"><VALUE.ARRAY>',
                             b"<VALUE/>"),
    "properties of an instance": (IN_INSTANCE, b'<PROPERTY NAME="P%d" TYPE="uint8"/>'),
    "qualifiers of a property": (IN_INSTANCE + b'<PROPERTY NAME="P" TYPE="uint8">',
                                 b'<QUALIFIER NAME="Q%d" TYPE="boolean"/>'),
    "keys of an instance": (b'<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME="CIM_Faulty">',
                            b'<KEYBINDING NAME="K%d"><KEYVALUE/></KEYBINDING>'),
}
# A quarter of it is for the objects of answers.
MEMORY = GIB // 2


def need_limits(trial):
    """The address sanitizer reserves much more than any limit of the process."""
    if rows.is_sanitized(trial.bin / "sennet"):
        raise rows.Skip("memory cannot be limited under a sanitizer")


@SUITE.case("elements of an array that fit into a quarter of 512 MiB")
def _(trial):
    if not trial.full:
        raise rows.Skip("takes long: at full effort only")
    need_limits(trial)
    with HostileRun(trial) as run:
        run.expect(WHOLE, INSTANCES, filled(in_instance(ELEMENTS), again(b"<VALUE/>", 40 * MIB)),
                   "40 MiB of elements", limits=[f"--as={MEMORY}"], memory=MEMORY * 3 // 4)
    return f"{WHOLE}; next script right"


for _name, _octets in INSTANCE_PARTS.items():
    @SUITE.case(f"endless {_name}, with 512 MiB of memory")
    def _(trial, name=_name, octets=_octets):
        if not trial.full and name != "instances":
            raise rows.Skip("takes long: at full effort only")
        need_limits(trial)
        start, part = octets
        pieces = numbered(part) if b"%d" in part else again(part, 4 * GIB)
        with HostileRun(trial) as run:
            run.expect(EMPTY, INSTANCES, stream(start, pieces, GIB), name,
                       memory=MEMORY * 3 // 4, patience_s=240, limits=[f"--as={MEMORY}"])
        return f"{EMPTY}; next script right; less than {MEMORY * 3 // 4 // MIB} MiB of memory"


# An array that makes much more text than a file takes of it: the declaration, the elements, the text.
LONG_ARRAYS = {
    "numbers with names of 1 MiB": (
        '<PROPERTY.ARRAY NAME="P" TYPE="uint16"><QUALIFIER NAME="Values" TYPE="string"><VALUE.ARRAY>'
        f'<VALUE>{"x" * MIB}</VALUE></VALUE.ARRAY></QUALIFIER></PROPERTY.ARRAY>',
        '<PROPERTY.ARRAY NAME="P" TYPE="uint16"><VALUE.ARRAY>' + "<VALUE>0</VALUE>" * 2000 +
        "</VALUE.ARRAY></PROPERTY.ARRAY>", b'"' + b"x" * 255 + b'"'),
    "numbers of 309 digits": (
        '<PROPERTY.ARRAY NAME="P" TYPE="real64"/>',
        '<PROPERTY.ARRAY NAME="P" TYPE="real64"><VALUE.ARRAY>' + "<VALUE>1e308</VALUE>" * 200000 +
        "</VALUE.ARRAY></PROPERTY.ARRAY>", b'"%s"' % (b"%d" % int(1e308))[:255]),
}
for _name, _parts in LONG_ARRAYS.items():
    @SUITE.case(f"an array of {_name}")
    def _(trial, name=_name, parts=_parts):
        declaration, elements, text = parts

        def answer(peer, request):
            xml = wire.cim_class("CIM_Faulty", declaration) if request.method == "GetClass" else (
                wire.named("CIM_Faulty", elements))
            peer.send(wire.with_length(wire.result(request, xml)))
            return True
        with rows.place() as place:
            generator = Generator(trial.bin, place)
            generator.add_script("a", "[CIM]\nG[0]=CIM_Faulty\nA[0]=P\n")
            with HostileServer(generator.socket, answer) as server:
                trial.count()
                generator.empty_outputs()
                finished = generator.run("SMS")
                rows.expect_equal((finished.status, server.failures), (0, []), name)
                if b"{ 1, " + text + b"}" not in generator.outputs()["mif/a.mif"]:
                    raise rows.Failure(f"{name}: the row is not as expected")
                rows.expect_memory_below(finished, 2 * MEMORY_LIMIT, generator.program)
        return f"255 characters written; less than {2 * MEMORY_LIMIT // MIB} MiB of memory"


# ---- headers and trailers

def head_of(shape, octets):
    """An answer with about so many octets, not more, of header and trailer."""
    head, before, unit, after = HEADS[shape]

    def make(body):
        body = wire.chunk(body) + b"0\r\n"
        many = unit * ((octets - len(head) - len(before) - len(after)) // len(unit))
        if head:
            return head + body + before + many + after
        return before + many + after + body + b"\r\n"
    return sends(make, "keep")


# The head when there is one of its own, what stands before the many, one of these, and what ends them.
HEADS = {
    "header lines": (b"", wire.CHUNKED[:-2], b"X-Field: value\r\n", b"\r\n"),
    "header line": (b"", wire.CHUNKED[:-2] + b"X-Field: ", b"value", b"\r\n\r\n"),
    "status line": (b"", b"HTTP/1.1 200 ", b"O", wire.CHUNKED[wire.CHUNKED.index(b"\r\n"):]),
    "interim answers": (b"", b"", b"HTTP/1.1 100 Continue\r\n\r\n", wire.CHUNKED),
    "folded header line": (b"", wire.CHUNKED[:-2] + b"X-Field: v", b"\r\n more", b"\r\n\r\n"),
    "trailer lines": (wire.CHUNKED, b"", b"X-Field: value\r\n", b"\r\n"),
}
for _shape in HEADS:
    @SUITE.case(f"64 KiB of header and trailer, and beyond: {_shape}")
    def _(trial, shape=_shape):
        within, beyond = head_of(shape, 65536), head_of(shape, 65536 + LEEWAY)
        with HostileRun(trial) as run:
            for where, lost in LOST.items():
                run.expect(WHOLE, where, within, "within")
                run.expect(lost, where, beyond, "beyond")
        return f"{WHOLE}; {BOTH}"


if __name__ == "__main__":
    sys.exit(SUITE.main())
