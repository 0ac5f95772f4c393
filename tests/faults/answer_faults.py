#!/usr/bin/env python3
"""CIM servers whose HTTP is right and whose documents are not: broken XML, answers to something
else, and values that do not fit."""

import re
import sys

import rows
import wire
from hostile_run import (ABANDONED, BOTH, CLASS, DROPPED, EMPTY, INSTANCES, WHOLE, HostileRun,
                         right, sends_document)

SUITE = rows.Suite(__doc__)


def both(name, make, **options):
    """A case: a wrong document for the class, and for the instances. `make` is given the request and
    the right document."""
    @SUITE.case(name)
    def _(trial):
        with HostileRun(trial) as run:
            return run.expect_both(sends_document(make), **options)


def replaced(old, new, count=1):
    """The right document with this replaced in it."""
    def make(_, document):
        rows.expect(old in document, f"{old!r} is not in the document")
        return document.replace(old, new, count)
    return make


def after_start(octets):
    """The right document with this inside IRETURNVALUE."""
    return replaced(b"<IRETURNVALUE>", b"<IRETURNVALUE>" + octets)


def boundaries(document):
    """Where an element or a text begins or ends."""
    return sorted({match.start() for match in re.finditer(b"<", document)} |
                  {match.end() for match in re.finditer(b">", document)})


def samples(run):
    """The right documents as the server sends them, by place."""
    documents = {}

    def note(where):
        def make(_, document):
            documents[where] = document
            return document
        return make
    for where in (CLASS, INSTANCES):
        run.expect(WHOLE, where, sends_document(note(where)), "control")
    return documents


# ---- XML

@SUITE.case("XML truncated at every element boundary")
def _(trial):
    with HostileRun(trial) as run:
        for where, document in samples(run).items():
            lost = ABANDONED if where == CLASS else EMPTY
            for at in trial.some(boundaries(document)[:-1], every=9):
                cut = sends_document(lambda _, document, at=at: document[:at])
                run.expect(lost, where, cut, f"{at} octets")
    return BOTH


def inserted(trial, octets, outcomes, every):
    """Puts the octets at every boundary of the documents but the first and the last ones."""
    with HostileRun(trial) as run:
        for where, document in samples(run).items():
            for at in trial.some(boundaries(document)[1:-1], every):
                insert = sends_document(
                    lambda _, document, at=at: document[:at] + octets + document[at:])
                run.expect(outcomes[where], where, insert, f"{octets!r} at octet {at}")


@SUITE.case("unknown element at every boundary")
def _(trial):
    inserted(trial, b"<WIDGET/>", {CLASS: ABANDONED, INSTANCES: EMPTY}, every=13)
    return BOTH


@SUITE.case("comment at every boundary, which is allowed")
def _(trial):
    inserted(trial, b"<!-- <WIDGET> -->", {CLASS: WHOLE, INSTANCES: WHOLE}, every=29)
    return f"{WHOLE}; next script right"


@SUITE.case("unknown attributes, which are allowed")
def _(trial):
    with HostileRun(trial) as run:
        for where in (CLASS, INSTANCES):
            run.expect(WHOLE, where, sends_document(
                lambda _, document: re.sub(rb"(<[A-Z.]+)", rb'\1 X="y"', document)), "attributes")
    return f"{WHOLE}; next script right"


both("empty document", lambda _, document: b"\n")
both("unclosed tag", replaced(b"</IMETHODRESPONSE>", b"</IMETHODRESPONSE"))
both("end tag of another element", replaced(b"</IRETURNVALUE>", b"</RETURNVALUE>"))
both("two root elements", lambda _, document: document + b"<CIM/>")
both("an attribute twice", replaced(b"CIMVERSION=", b'CIMVERSION="2.0" CIMVERSION='))
both("text between elements", after_start(b"text"))
both("UTF-16", lambda _, document: document.decode().encode("utf-16"))
both("another encoding declared", replaced(b"utf-8", b"IBM037"))
both("entity definitions",
     replaced(b"<CIM ", b'<!DOCTYPE CIM [<!ENTITY a "aaaaaaaaaa">' + b"".join(
         b'<!ENTITY %c "%s">' % (ord("b") + i, b"&%c;" % (ord("a") + i) * 10) for i in range(12)) +
         b"]><CIM "))
both("an entity that names a file",
     replaced(b"<CIM ", b'<!DOCTYPE CIM [<!ENTITY a SYSTEM "file:///etc/passwd">]><CIM '))
for _reference in (b"&nosuch;", b"&#0;", b"&#xD800;", b"&#x110000;", b"&#99999999999999999999;",
                   b"&#;", b"&", b"&amp"):
    both(f"character reference {_reference.decode()}", after_start(_reference))
for _what, _octets in {"a lone byte": b"caf\xe9", "overlong": b"\xc0\xaf",
                       "a surrogate": b"\xed\xa0\x80", "beyond Unicode": b"\xf4\x90\x80\x80",
                       "cut": b"\xe2\x82"}.items():
    both(f"invalid UTF-8 ({_what}) in one value",
         lambda _, document, octets=_octets: re.sub(rb"<VALUE>\w+", b"<VALUE>" + octets, document))
both("NUL in one value",
     lambda _, document: re.sub(rb"<VALUE>\w+", b"<VALUE>a\0b", document))
both("NUL in a tag", replaced(b"<IRETURNVALUE>", b"<IRETURN\0VALUE>"))
both("control character in one value",
     lambda _, document: re.sub(rb"<VALUE>\w+", b"<VALUE>a\x1bb", document))


# ---- messages

both("wrong message id", lambda request, document: document.replace(
    b'ID="' + request.message_id.encode(), b'ID="1'))
both("no message id", lambda request, document: document.replace(
    f' ID="{request.message_id}"'.encode(), b""))
both("a request for an answer", lambda request, document: request.body)
both("the answer to another method", replaced(b"IMETHODRESPONSE NAME=\"", b"IMETHODRESPONSE NAME=\"X"))
both("IRETURNVALUE twice", replaced(b"</IRETURNVALUE>", b"</IRETURNVALUE><IRETURNVALUE/>"))
both("ERROR without a code", lambda request, _: wire.document(request, "<ERROR/>"))
both("ERROR whose code is a word",
     lambda request, _: wire.document(request, '<ERROR CODE="six"/>'))
both("PARAMVALUE with TYPE for PARAMTYPE",
     replaced(b"</IRETURNVALUE>", b'</IRETURNVALUE><PARAMVALUE NAME="EndOfSequence" TYPE="boolean">'
              b"<VALUE>TRUE</VALUE></PARAMVALUE>"))


@SUITE.case("ERROR with every code of the standard and beyond")
def _(trial):
    with HostileRun(trial) as run:
        for code in trial.some([*range(1, 30), 99, 4294967295], every=8):
            error = sends_document(lambda request, _, code=code: wire.document(
                request, f'<ERROR CODE="{code}" DESCRIPTION="no"/>'))
            run.expect(DROPPED, CLASS, error, f"code {code}")
            run.expect(EMPTY, INSTANCES, error, f"code {code}")
    return f"class: {DROPPED}; instances: {EMPTY}; next script right"


@SUITE.case("instances for the class, and the class for the instances")
def _(trial):
    with HostileRun(trial) as run:
        run.expect(ABANDONED, CLASS, sends_document(lambda request, _: wire.result(
            request, wire.instances("CIM_Faulty", "x1"))), "instances")
        run.expect(EMPTY, INSTANCES, sends_document(lambda request, _: wire.result(
            request, wire.cim_class("CIM_Faulty"))), "class")
        run.expect(ABANDONED, CLASS, sends_document(lambda request, _: wire.result(
            request, "")), "nothing")
    return BOTH


# ---- values

def prop(kind, inside, name="P", element="PROPERTY"):
    attributes = f' NAME="{name}"' + ("" if kind is None else f' TYPE="{kind}"')
    return f"<{element}{attributes}>{inside}</{element}>"


def value(kind, text):
    return prop(kind, f"<VALUE>{text}</VALUE>")


# What is wrong, and what is like it and right.
VALUES = {
    'TYPE=""': (value("", "1"), value("uint8", "1")),
    "no TYPE": (value(None, "1"), value("string", "1")),
    "unknown TYPE": (value("uint128", "1"), value("uint64", "1")),
    "no NAME": ('<PROPERTY TYPE="uint8"><VALUE>1</VALUE></PROPERTY>', value("uint8", "1")),
    "text in an uint16": (value("uint16", "fast"), value("uint16", "1")),
    "number and text in an uint16": (value("uint16", "1 fast"), value("uint16", " 1 ")),
    "fraction in an uint16": (value("uint16", "1.5"), value("uint16", "0x15")),
    "empty integer": (value("uint16", ""), prop("uint16", "")),
    "empty boolean": (value("boolean", ""), prop("boolean", "")),
    "boolean that is a number": (value("boolean", "1"), value("boolean", "True")),
    "uint8 of 256": (value("uint8", "256"), value("uint8", "255")),
    "negative uint8": (value("uint8", "-1"), value("uint8", "+1")),
    "sint8 of -129": (value("sint8", "-129"), value("sint8", "-128")),
    "uint64 of 2^64": (value("uint64", "18446744073709551616"),
                       value("uint64", "18446744073709551615")),
    "sint64 below -2^63": (value("sint64", "-9223372036854775809"),
                           value("sint64", "-9223372036854775808")),
    "hexadecimal uint64 of 17 digits": (value("uint64", "0x1" + "0" * 16),
                                        value("uint64", "0x" + "F" * 16)),
    "real that is text": (value("real32", "fast"), value("real32", "1.5")),
    "char16 of two": (value("char16", "ab"), value("char16", "a")),
    "datetime of words": (value("datetime", "yesterday"),
                          value("datetime", "20180911124613.128000+060")),
    "datetime of month 13": (value("datetime", "20181311124613.128000+060"),
                             value("datetime", "20181211124613.128000+060")),
    "datetime 20180911124613.128***:000": (value("datetime", "20180911124613.128***:000"),
                                           value("datetime", "20180911124613.128***+000")),
    "datetime of 24 characters": (value("datetime", "20180911124613.128000+06"),
                                  value("datetime", "20180911124613.128***+060")),
    "VALUE where an array is declared": (prop("uint8", "<VALUE>1</VALUE>", element="PROPERTY.ARRAY"),
                                         prop("uint8", "<VALUE.ARRAY><VALUE>1</VALUE></VALUE.ARRAY>",
                                              element="PROPERTY.ARRAY")),
    "VALUE.ARRAY where a scalar is declared":
        (prop("uint8", "<VALUE.ARRAY><VALUE>1</VALUE></VALUE.ARRAY>"), value("uint8", "1")),
    "bad value in an array":
        (prop("uint8", "<VALUE.ARRAY><VALUE>1</VALUE><VALUE>x</VALUE></VALUE.ARRAY>",
              element="PROPERTY.ARRAY"),
         prop("uint8", "<VALUE.ARRAY/>", element="PROPERTY.ARRAY")),
    "two values": (prop("uint8", "<VALUE>1</VALUE><VALUE>2</VALUE>"), value("uint8", "1")),
    "property named twice": (value("uint8", "1") + value("uint8", "2"), value("uint8", "1")),
    "property named twice in another case":
        (value("uint8", "1") + prop("uint8", "<VALUE>1</VALUE>", name="p"),
         value("uint8", "1") + prop("uint8", "<VALUE>1</VALUE>", name="q")),
    "name that is no CIM name": (prop("uint8", "", name="a-b"), prop("uint8", "", name="a_b")),
    "reference to nothing":
        ('<PROPERTY.REFERENCE NAME="P"><VALUE.REFERENCE/></PROPERTY.REFERENCE>',
         '<PROPERTY.REFERENCE NAME="P"></PROPERTY.REFERENCE>'),
    "embedded instance that is no XML":
        ('<PROPERTY NAME="P" TYPE="string" EmbeddedObject="instance"><VALUE>&lt;INST</VALUE>'
         "</PROPERTY>",
         '<PROPERTY NAME="P" TYPE="string" EmbeddedObject="instance"><VALUE>&lt;INSTANCE '
         'CLASSNAME="X"/&gt;</VALUE></PROPERTY>'),
}


def with_property(xml):
    """The right instance with one more property, which the script does not ask for."""
    return sends_document(lambda request, _: wire.result(request, wire.named(
        "CIM_Faulty", wire.string_property("Name", "x1") + xml)))


for _name, (_wrong, _right) in VALUES.items():
    @SUITE.case(f"value: {_name}")
    def _(trial, wrong=_wrong, good=_right):
        with HostileRun(trial) as run:
            run.expect(WHOLE, INSTANCES, with_property(good), "control")
            run.expect(EMPTY, INSTANCES, with_property(wrong))
        return f"{EMPTY}; next script right"


@SUITE.case("INSTANCE without CLASSNAME")
def _(trial):
    with HostileRun(trial) as run:
        for attributes in ("", ' CLASSNAME=""', ' CLASSNAME="a b"'):
            run.expect(EMPTY, INSTANCES, sends_document(lambda request, _, attributes=attributes:
                       wire.result(request, wire.named("CIM_Faulty", "", attributes))), attributes)
    return f"{EMPTY}; next script right"


if __name__ == "__main__":
    sys.exit(SUITE.main())
