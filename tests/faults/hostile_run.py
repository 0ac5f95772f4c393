"""One run of the generator against a server that misbehaves for one class, and what has to come of
it: that class is the loss, and the next script's file is right to the last byte."""

import contextlib
import itertools

import expected
import rows
import wire
from generator import MEMORY_LIMIT, QUICK, Generator
from hostile_server import HostileServer

CLASS = ("GetClass", "CIM_Faulty")
INSTANCES = ("EnumerateInstances", "CIM_Faulty")
# What becomes of script a.
ABANDONED = "script abandoned"
DROPPED = "class dropped"
EMPTY = "instances empty"
WHOLE = "answer taken"
FIRST_FILE = {ABANDONED: expected.EARLIER, DROPPED: expected.DROPPED, EMPTY: expected.EMPTY,
              WHOLE: expected.WHOLE}


def right(request):
    """The body of a right answer."""
    if request.method == "GetClass":
        return wire.result(request, wire.cim_class(request.class_name))
    names = {"CIM_Fan": ["f1"], "CIM_Faulty": ["x1"]}[request.class_name]
    return wire.result(request, wire.instances(request.class_name, *names))


class HostileRun:
    """To be used in a with statement; many runs one after another."""

    def __init__(self, trial):
        self.trial = trial
        self._fault = None
        self._where = None
        self._stack = contextlib.ExitStack()

    def __enter__(self):
        place = self._stack.enter_context(rows.place())
        self.generator = Generator(self.trial.bin, place)
        self.generator.add_script("a", "[CIM]\nG[0]=CIM_Faulty\nA[0]=Name\n"
                                       "G[1]=CIM_Fan\nA[1]=Name\n")
        self.generator.add_script("b", "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n")
        self.server = self._stack.enter_context(
            HostileServer(self.generator.socket, self._answer))
        return self

    def __exit__(self, *error):
        return self._stack.__exit__(*error)

    def _answer(self, peer, request):
        if (request.method, request.class_name) == self._where:
            return self._fault(peer, request)
        peer.send(wire.in_chunks(right(request), trailer=b"CIMStatusCode: 0\r\n"))
        return True

    def expect(self, outcome, where, fault, what="", **options):
        """Runs with `fault` as the answer at `where`; options as for expect_run."""
        self._where, self._fault = where, fault
        self.expect_run(outcome, f"{what} at {where[0]}", **options)
        self._where = None

    def expect_run(self, outcome, what, quick=False, memory=MEMORY_LIMIT,
                   patience_s=rows.PATIENCE_S, limits=()):
        """Runs, with `quick` to a time-out that comes soon. `memory` is what the program may come
        to use, `limits` are of the kernel."""
        self.trial.count()
        generator = self.generator
        generator.empty_outputs()
        (generator.mif / "a.mif").write_bytes(expected.EARLIER)
        finished = generator.run("SMS", {"CLOCK": QUICK} if quick else None,
                                 limits, patience_s)
        lines = ("" if outcome == ABANDONED else "Processing a...\n") + "Processing b...\n"
        if (finished.status, finished.out) != (0, generator.banner() + lines):
            raise rows.Failure(f"{what}: expected status 0 and the lines {lines!r}, "
                               f"seen {finished}")
        rows.expect_equal(self.server.failures, [], f"{what}: failures of the server")
        outputs = generator.outputs()
        rows.expect_equal(sorted(outputs), ["mif/a.mif", "mif/b.mif"], f"{what}: files")
        rows.expect_equal(outputs["mif/a.mif"], FIRST_FILE[outcome], f"{what}: a.mif")
        rows.expect_equal(outputs["mif/b.mif"], expected.NEXT, f"{what}: b.mif")
        rows.expect_memory_below(finished, memory, generator.program)

    def expect_both(self, fault, what="", **options):
        """A fault that is no CIM error, at full effort in either answer, else in one of them by
        turns. Returns the outcome as text."""
        places = [(ABANDONED, CLASS), (EMPTY, INSTANCES)]
        for outcome, where in places if self.trial.full else [places[next(TURNS)]]:
            self.expect(outcome, where, fault, what, **options)
        return BOTH


TURNS = itertools.cycle((0, 1))
BOTH = f"class: {ABANDONED}; instances: {EMPTY}; next script right"


def sends(make, then="close"):
    """A fault that sends the octets that `make` makes of the right body, and then closes the
    connection, keeps it for the next request or hangs."""
    def fault(peer, request):
        peer.send(make(right(request)))
        if then == "hang":
            peer.hang()
        return then == "keep"
    return fault


def sends_document(make, then="keep"):
    """A fault in the document alone; `make` is given the request and the right one."""
    def fault(peer, request):
        peer.send(wire.with_length(make(request, right(request))))
        return then == "keep"
    return fault
