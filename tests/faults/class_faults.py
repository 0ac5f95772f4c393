#!/usr/bin/env python3
"""CIM servers whose classes are well-formed and contradict themselves, or their instances. For every
product the files have to be readable: what one class says must not cost the other scripts their
part of a file for all."""

import sys

import rows
import wire
from generator import PRODUCTS, Generator
from hostile_server import HostileServer
from inventory_run import expect_readable

SUITE = rows.Suite(__doc__)


def prop(kind, inside="", element="PROPERTY"):
    return f'<{element} NAME="P" TYPE="{kind}">{inside}</{element}>'


def qualifier(name, kind, *values, is_array=True):
    texts = "".join(f"<VALUE>{value}</VALUE>" for value in values)
    texts = f"<VALUE.ARRAY>{texts}</VALUE.ARRAY>" if is_array else texts
    return f'<QUALIFIER NAME="{name}" TYPE="{kind}">{texts}</QUALIFIER>'


def one(kind, value):
    return prop(kind, f"<VALUE>{value}</VALUE>")


def many(kind, *values):
    texts = "".join(f"<VALUE>{value}</VALUE>" for value in values)
    return prop(kind, f"<VALUE.ARRAY>{texts}</VALUE.ARRAY>", "PROPERTY.ARRAY")


NAMES = qualifier("Values", "string", "Off", "On")
# The property in the class, and in its two instances.
CLASSES = {
    "MaxLen of several numbers": (prop("string", qualifier("MaxLen", "uint32", 8, 9)),
                                  one("string", "x")),
    "MaxLen of no number": (prop("string", qualifier("MaxLen", "uint32")), one("string", "x")),
    "MaxLen that is a text": (prop("string", qualifier("MaxLen", "string", "8", is_array=False)),
                              one("string", "x")),
    "Values that is one text": (prop("uint16", qualifier("Values", "string", "Off",
                                                         is_array=False)), one("uint16", 1)),
    "Values that are numbers": (prop("uint16", qualifier("Values", "uint32", 7, 8)),
                                one("uint16", 1)),
    "ValueMap of numbers": (prop("uint16", qualifier("ValueMap", "uint32", 0, 1) + NAMES),
                            one("uint16", 1)),
    "ValueMap that is one text": (prop("uint16", qualifier("ValueMap", "string", "1",
                                                           is_array=False) + NAMES),
                                  one("uint16", 1)),
    "ValueMap longer than Values": (prop("uint16", qualifier("ValueMap", "string", *range(9)) +
                                         NAMES), one("uint16", 8)),
    "ValueMap without Values": (prop("uint16", qualifier("ValueMap", "string", 0, 1)),
                                one("uint16", 1)),
    "Values of a property that is a text": (prop("string", NAMES), one("string", "1")),
    "an array where the instances have one value": (prop("uint16", element="PROPERTY.ARRAY"),
                                                    one("uint16", 1)),
    "one value where the instances have an array": (prop("uint16", NAMES), many("uint16", 0, 1)),
    "a number where the instances have a text": (prop("uint32"), one("string", "x")),
    "a text where the instances have a number": (prop("string"), one("sint64", -1)),
    "a date where the instances have a number": (prop("datetime"), one("uint8", 1)),
    "a default of another shape": (many("uint16", 1, 2), one("uint16", 1)),
}


def answering(declared, held):
    def answer(peer, request):
        if request.method == "GetClass":
            content = wire.cim_class(request.class_name,
                                     declared if request.class_name == "CIM_Faulty" else "")
        elif request.class_name == "CIM_Faulty":
            content = "".join(
                wire.named("CIM_Faulty", wire.string_property("Name", name) + held)
                for name in ("x1", "x2"))
        else:
            content = wire.instances(request.class_name, "f1")
        peer.send(wire.with_length(wire.result(request, content)))
        return True
    return answer


for _name, (_declared, _held) in CLASSES.items():
    @SUITE.case(f"class: {_name}")
    def _(trial, name=_name, declared=_declared, held=_held):
        with rows.place() as place:
            generator = Generator(trial.bin, place)
            generator.add_script("a", "[CIM]\nG[0]=CIM_Faulty\nA[0]=Name,P\n")
            generator.add_script("b", "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n")
            with HostileServer(generator.socket, answering(declared, held)) as server:
                for product in PRODUCTS:
                    trial.count()
                    generator.empty_outputs()
                    finished = generator.run(product)
                    rows.expect_equal((finished.status, finished.out, server.failures),
                                      (0, generator.banner() + "Processing a...\n"
                                       "Processing b...\n", []), f"{name}, /{product}")
                    expect_readable(generator, product)
        return "answer taken; the files of every product are whole and readable"


if __name__ == "__main__":
    sys.exit(SUITE.main())
