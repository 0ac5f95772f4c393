"""cimomd under load, among hostile clients, with classes and sources that change meanwhile."""

import collections
import os
import pathlib
import random
import re
import shutil
import signal
import socket
import time
import xml.etree.ElementTree as xml

import neighbours
import rows
from rows import MIB, expect, expect_equal
from silent_mount import SilentMount
from storm import Answers, Storm

from cim_client import Client
from cimomd_server import Server, body_of, call, class_name, exchange, post, waited

SUITE = rows.Suite(__doc__)
CLIENTS = 64
MAX_GROWTH_BYTES = 12 * MIB
OWN_CLASS = "Test_Place"
OWN_MOF = """
class Test_Place { [Key] string Name; uint32 Floor; };
instance of Test_Place { Name = "door"; Floor = %d; };
"""
WRONG_MOF = "class Test_Place { uint32 ; };\n"
# What comes and goes while clients ask: files and a directory.
SOURCES = ("etc/passwd", "etc/group", "proc/net/route", "sys/class/hwmon")


class Daemon(Server):
    """cimomd on a copy of a recorded machine, at a Unix socket and over HTTP. To be used in a with
    statement, which leaves no process behind whatever fails."""

    def __init__(self, trial, place):
        self.machine = place / "machine"
        shutil.copytree(neighbours.MACHINE, self.machine, symlinks=True)
        self.own = place / "own"
        self.own.mkdir()
        self.load(OWN_MOF % 1, reload=False)
        self.program = trial.bin / "cimomd"
        socket_path = str(place / "s")
        super().__init__(place, self.program, "--http", "127.0.0.1:0", "--socket", socket_path,
                         "--root", self.machine, "--mof-dir", self.own, "--idle-timeout", "20")
        self.http_port = self.port()
        self.places = [socket_path, ("127.0.0.1", self.http_port)]
        self.client = Client(self.http_port)

    def load(self, mof, reload=True):
        """A new file in the place of the old one, in one step."""
        new = self.own / "new"
        new.write_text(mof)
        new.rename(self.own / "places.mof")
        if reload:
            self.process.send_signal(signal.SIGHUP)

    def answer(self, request):
        with socket.create_connection(("127.0.0.1", self.http_port),
                                                 rows.PATIENCE_S) as connection:
            return body_of(exchange(connection, post(request), rows.PATIENCE_S))

    def classes(self):
        return sorted(name for name in self.client.class_names() if name.startswith("Velmira_"))

    def memory(self, field):
        """A line of /proc/PID/status, in octets."""
        for line in pathlib.Path(f"/proc/{self.process.pid}/status").read_text().splitlines():
            if line.startswith(field + ":"):
                return int(line.split()[1]) * 1024
        raise rows.Failure(f"cimomd is gone: {self.log()[-2000:]}")

    def expect_memory_below(self, seen, limit, what):
        """Under the address sanitizer memory says nothing."""
        expect(rows.is_sanitized(self.program) or seen < limit,
               f"memory {what}: expected less than {limit // MIB} MiB, seen {seen / MIB:.1f}")

    def expect_end(self):
        expect_equal(self.end(), 0, "exit status of cimomd")

    def __enter__(self):
        return self

    def __exit__(self, *_):
        if self.process.poll() is None:
            self.process.kill()
            self.process.wait()


def instances_of(name):
    return call("EnumerateInstances", class_name(name))


class Sources:
    """Files of a recorded machine that vanish, turn to garbage, and come back."""

    def __init__(self, machine, seed):
        self.machine = machine
        self.random = random.Random(seed)
        self.count = 0

    def disturb(self, name):
        path = self.machine / name
        kept = path.with_name(path.name + ".kept")
        path.rename(kept)
        if self.random.random() < 0.7:
            self.random.choice(GARBAGE)(path, self.random)
        self.count += 1

    def restore(self, name):
        path = self.machine / name
        kept = path.with_name(path.name + ".kept")
        if kept.exists():
            clear(path)
            kept.rename(path)


def clear(path):
    if path.is_dir() and not path.is_symlink():
        shutil.rmtree(path)
    else:
        path.unlink(missing_ok=True)


def sparse_gigabyte(path, _):
    path.touch()
    os.truncate(path, 1 << 30)


GARBAGE = (
    lambda path, _: path.write_bytes(b""),
    lambda path, rng: path.write_bytes(rng.randbytes(rng.randrange(1, 70000))),
    lambda path, _: path.write_bytes(b"\0" * 5000),
    lambda path, _: path.write_bytes(b"9" * 100000),
    lambda path, _: path.write_bytes(b"18446744073709551616\n-9223372036854775809\n" * 50),
    lambda path, _: path.write_bytes(b"a:b:c d\t=\n\n:\n::::::::::\n" * 1000),
    lambda path, _: path.write_bytes(b"\xed\xa0\x80\xc0\xaf\xff<&>\x01\x1b[31m" * 100),
    lambda path, _: path.mkdir(),
    lambda path, _: os.mkfifo(path),
    lambda path, _: path.symlink_to("nowhere"),
    lambda path, _: path.symlink_to(path.name),
    lambda path, _: path.symlink_to("/dev/zero"),
    sparse_gigabyte,
)


def expected_answers(daemon):
    """What clients may be told: bodies that stay, and those that change with own classes."""
    answers = Answers()
    requests = [instances_of(name) for name in daemon.classes()]
    requests += [call("GetClass", class_name(name)) for name in daemon.classes()]
    requests.append(call("EnumerateClassNames"))
    quiet = {request: daemon.answer(request) for request in requests}
    # By then clocks in the answers show something else.
    time.sleep(1.1)
    unsteady = {request for request in requests if daemon.answer(request) != quiet[request]}
    sources = Sources(daemon.machine, "rehearsal")
    for name in SOURCES:
        sources.disturb(name)
        unsteady |= {request for request in requests if daemon.answer(request) != quiet[request]}
        sources.restore(name)
    expect(len(unsteady) < len(requests) / 4, f"{len(unsteady)} of {len(requests)} answers change by themselves")
    for request, body in quiet.items():
        answers.add(request, *(() if request in unsteady else (body,)))
    own = instances_of(OWN_CLASS)
    first = daemon.answer(own)
    daemon.load(OWN_MOF % 2)
    expect(waited(lambda: daemon.answer(own) != first), "the classes are not loaded again")
    answers.add(own, first, daemon.answer(own))
    expect_equal([len(first.split(b"<VALUE>1<")), len(daemon.answer(own).split(b"<VALUE>2<"))],
                 [2, 2], "the values of own instances")
    return answers, quiet


Outcome = collections.namedtuple("Outcome", "counts reloads sources growth")


def disturb_while(storm, daemon, sources):
    """Changes classes and sources until the clients have finished; the number of reloads."""
    reloads = 0
    while storm.is_under_way():
        for name in SOURCES:
            sources.disturb(name)
        daemon.load(WRONG_MOF if reloads % 5 == 4 else OWN_MOF % (1 + reloads % 2))
        reloads += 1
        time.sleep(0.1)
        for name in SOURCES:
            sources.restore(name)
        time.sleep(0.1)
    return reloads


def storm_of(trial):
    seconds = trial.run_seconds(300, 5)
    with rows.place() as place, Daemon(trial, pathlib.Path(place)) as daemon:
        descriptors = daemon.descriptors()
        answers, quiet = expected_answers(daemon)
        counts, reloads, memory = collections.Counter(), 0, []
        sources = Sources(daemon.machine, "storm")
        # The first part fills what the C library keeps for its threads.
        for part in (0.4, 0.6):
            storm = Storm(daemon.places, answers, CLIENTS, part * seconds, part)
            reloads += disturb_while(storm, daemon, sources)
            more, failures = storm.wait()
            counts += more
            expect(not failures, f"{len(failures)} clients failed: " + "; ".join(failures[:3]))
            expect(waited(lambda: daemon.descriptors() == descriptors),
                   f"descriptors: {descriptors} before, {daemon.descriptors()} after")
            memory.append(daemon.memory("VmRSS"))
        for request, body in quiet.items():
            if answers.allowed[request]:
                expect(daemon.answer(request) == body, f"afterwards: a wrong answer to {request}")
        daemon.expect_end()
        return Outcome(counts, reloads, sources.count, memory[1] - memory[0])


class OneStorm:
    """The storm that all cases below tell of."""

    outcome = None

    @classmethod
    def of(cls, trial):
        if cls.outcome is None:
            try:
                cls.outcome = storm_of(trial)
            except rows.Failure as failure:
                cls.outcome = failure
        if isinstance(cls.outcome, rows.Failure):
            raise cls.outcome
        return cls.outcome


def count_of(kind):
    def tried(trial):
        trial.count(OneStorm.of(trial).counts[kind])
    return tried


@SUITE.case(f"requests of {CLIENTS} clients at once, among all of the following")
def _(trial):
    count_of("right")(trial)
    return "no wrong answer"


for fault, its_kind in (("connections dropped at any stage", "dropped"),
                        ("malformed requests", "malformed"),
                        ("oversized requests", "oversized"),
                        ("requests sent octet by octet", "slow")):
    SUITE.case(fault)(lambda trial, kind=its_kind: count_of(kind)(trial) or "the others are served")


@SUITE.case("classes loaded anew during requests, every fifth time wrong ones")
def _(trial):
    trial.count(OneStorm.of(trial).reloads)
    return "each answer has the old or the new ones"


@SUITE.case("sources that vanish, turn to garbage and come back during requests")
def _(trial):
    trial.count(OneStorm.of(trial).sources)
    return "classes of other sources are as ever, the answers are complete"


@SUITE.case("memory and descriptors during all that")
def _(trial):
    trial.count()
    outcome = OneStorm.of(trial)
    if rows.is_sanitized(trial.bin / "cimomd"):
        return "as many descriptors as before; memory is not looked at under a sanitizer"
    expect(outcome.growth < MAX_GROWTH_BYTES,
           f"memory grew by {outcome.growth / MIB:.1f} MiB after the first part")
    return (f"as many descriptors as before; memory {outcome.growth / MIB:+.1f} MiB from two "
            "fifths of the time to the end")


def expect_complete(daemon, name, damaged):
    try:
        answer = xml.fromstring(daemon.answer(instances_of(name)))
    except (xml.ParseError, OSError, ValueError) as error:
        raise rows.Failure(f"{name} with {damaged}: {error!r}; log {daemon.log()[-500:]}") from error
    result = answer.find("./MESSAGE/SIMPLERSP/IMETHODRESPONSE")
    expect(result is not None, f"{name} with {damaged}: no answer")
    return result


# What changes by itself, whatever the machine.
CLOCK = re.compile(rb'<PROPERTY NAME="LocalDateTime".*?</PROPERTY>')


def answers_of(daemon, names):
    answers = {name: CLOCK.sub(b"", daemon.answer(instances_of(name))) for name in names}
    expect(not any(b"<ERROR" in answer for answer in answers.values()), f"errors: {answers}")
    return answers


@SUITE.case("a tenth of all sources is replaced by garbage, FIFOs, links, directories, 1 GiB")
def _(trial):
    rng = random.Random("garbage")
    with rows.place() as place, Daemon(trial, pathlib.Path(place)) as daemon:
        names = sorted(daemon.classes())
        files = sorted(path for path in daemon.machine.rglob("*")
                       if path.is_file() and not path.is_symlink())
        contents = {path: path.read_bytes() for path in files}
        before = answers_of(daemon, names)
        errors = 0
        for _ in trial.repeat(300 if trial.full else 40):
            damaged = rng.sample(files, len(files) // 10)
            for path in damaged:
                path.unlink()
                rng.choice(GARBAGE)(path, rng)
            for name in names:
                trial.count()
                result = expect_complete(daemon, name, [str(path) for path in damaged])
                errors += result.find("ERROR") is not None
            for path in damaged:
                clear(path)
                path.write_bytes(contents[path])
        expect(errors < trial.tried / 20, f"{errors} of {trial.tried} answers are errors")
        expect_equal(answers_of(daemon, names), before, "afterwards, all sources being back")
        daemon.expect_memory_below(daemon.memory("VmHWM"), 256 * MIB, "at most")
        daemon.expect_end()
    return ("every class is answered, few of them with an error, else with what is left; afterwards as "
            "ever; below 256 MiB")


def get_instance_through(references):
    """A request for an instance whose key is a reference, and so on."""
    name = '<INSTANCENAME CLASSNAME="Test_Place"><KEYVALUE>x</KEYVALUE></INSTANCENAME>'
    for _ in range(references):
        name = ('<INSTANCENAME CLASSNAME="Test_Place"><VALUE.REFERENCE>' + name +
                "</VALUE.REFERENCE></INSTANCENAME>")
    return post(call("GetInstance", f'<IPARAMVALUE NAME="InstanceName">{name}</IPARAMVALUE>'))


@SUITE.case("requests with references in each other's keys, 25 deep")
def _(trial):
    with rows.place() as place, Daemon(trial, pathlib.Path(place)) as daemon:
        for references, status in ((4, b"200"), (5, b"400"), *[(25, b"400")] * 50):
            trial.count()
            with socket.create_connection(("127.0.0.1", daemon.http_port)) as connection:
                octets = exchange(connection, get_instance_through(references), rows.PATIENCE_S)
            expect(octets.startswith(b"HTTP/1.1 " + status), f"{references}: {octets[:300]!r}")
        daemon.expect_memory_below(daemon.memory("VmHWM"), 64 * MIB, "at most")
        daemon.expect_end()
    return "refused, beyond four; below 64 MiB"


@SUITE.case("a source that never answers")
def _(trial):
    neighbours.need()
    with rows.place() as place, Daemon(trial, pathlib.Path(place)) as daemon:
        silent = daemon.machine / "sys" / "class" / "hwmon"
        shutil.rmtree(silent)
        with SilentMount(silent, "fuse.silent", takes_requests=False):
            waiting = []
            for _ in trial.repeat(50):
                trial.count()
                waiting.append(socket.create_connection(("127.0.0.1", daemon.http_port)))
                waiting[-1].sendall(post(instances_of("Velmira_NumericSensor")))
            for name in set(daemon.classes()) - {"Velmira_NumericSensor", "Velmira_Fan",
                                                 "Velmira_MissingValue"}:
                expect_complete(daemon, name, "a silent source of sensors")
            for connection in waiting:
                expect(b"</CIM>" not in at_hand(connection), "the silent source has answered")
                connection.close()
            daemon.expect_end()
    return "only who asked for it waits; the others are served; cimomd ends when told to"


@SUITE.case("sources of 1 GiB, asked for by 16 clients at once")
def _(trial):
    with rows.place() as place, Daemon(trial, pathlib.Path(place)) as daemon:
        for name in daemon.classes():
            expect_complete(daemon, name, "sources as they are")
        before = daemon.memory("VmRSS")
        for name in ("etc/passwd", "etc/group"):
            sparse_gigabyte(daemon.machine / name, None)
        for _ in trial.repeat(20):
            trial.count(16)
            ask_at_once(daemon, ["Velmira_Account", "Velmira_Group"] * 8)
        growth = daemon.memory("VmRSS") - before
        daemon.expect_memory_below(growth, MAX_GROWTH_BYTES, "more than before")
        daemon.expect_end()
    return f"refused; afterwards the memory is what it was, within {MAX_GROWTH_BYTES // MIB} MiB"


def ask_at_once(daemon, names):
    connections = []
    for name in names:
        connections.append(socket.create_connection(("127.0.0.1", daemon.http_port)))
        connections[-1].sendall(post(instances_of(name)))
    for connection in connections:
        with connection:
            octets = exchange(connection, b"", rows.PATIENCE_S)
            expect(octets.startswith(b"HTTP/1.1 200") and b"</CIM>" in octets,
                   f"no complete answer: {octets[-300:]!r}")


def at_hand(connection):
    """What has arrived until now."""
    connection.settimeout(0)
    octets = b""
    try:
        while piece := connection.recv(65536):
            octets += piece
    except BlockingIOError:
        pass
    return octets


if __name__ == "__main__":
    neighbours.main(SUITE)
