"""A mounted disk of a server that has died, while an inventory is made."""

import errno
import pathlib
import shutil
import signal

import neighbours
import rows
from neighbours import TOP, Generator
from rows import expect, expect_equal
from silent_mount import SilentMount

from cim_client import Client
from cimomd_server import PATIENCE_S, Server, waited

SUITE = rows.Suite(__doc__)
# CIM_ManagedSystemElement.OperationalStatus
UNKNOWN = 0
NO_CONTACT = 12
TIMED_OUT = 5
REMOTE = "fuse.sshfs"
# Of all sizes that are asked for, and of whatever else is asked meanwhile.
HANGS_S = 90


def members_of(session):
    """The processes of a session but its leader, with their states."""
    found = {}
    for entry in pathlib.Path("/proc").iterdir():
        try:
            state, _, _, its_session = (entry / "stat").read_text().rsplit(")", 1)[1].split()[:4]
        except (OSError, ValueError):
            continue
        if int(its_session) == session and entry.name != str(session) and state != "Z":
            found[int(entry.name)] = state
    return found


class Situation:
    """A silent mount; `kinds` of mounts and whether they can be left by SIGKILL."""

    def __init__(self, kind, takes_requests):
        self.kind = kind
        self.takes_requests = takes_requests

    def __str__(self):
        return f"{self.kind}, requests {'taken' if self.takes_requests else 'left'}"

    def mounted(self, place):
        try:
            return SilentMount(pathlib.Path(place) / "dead", self.kind, self.takes_requests)
        except OSError as error:
            raise rows.Skip(f"no FUSE here: {error.strerror}")


SITUATIONS = [Situation(REMOTE, False), Situation(REMOTE, True)]


def each_situation(trial):
    neighbours.need()
    for situation in SITUATIONS:
        for _ in trial.repeat(5):
            trial.count()
            with rows.place() as place:
                try:
                    with situation.mounted(place) as dead:
                        yield situation, pathlib.Path(place), dead
                except OSError as error:
                    if error.errno in (errno.EPERM, errno.ENODEV, errno.ENOENT):
                        raise rows.Skip(f"FUSE cannot be mounted: {error.strerror}")
                    raise


def dead_instance(client, dead):
    [found] = [instance for instance in client.instances("CIM_RemoteFileSystem")
               if instance["Root"] == str(dead.path)]
    return found


def expect_told(client, dead, what):
    found = dead_instance(client, dead)
    expect_equal((found["OperationalStatus"], found["FileSystemType"], found["Device"],
                  found["FileSystemSize"], found["AvailableSpace"]),
                 ([NO_CONTACT], dead.kind, "user@server.example:/srv", None, None),
                 f"{what}: what is told of the dead mount")
    reasons = {missing["PropertyName"]: missing["Reason"]
               for missing in client.instances("Velmira_MissingValue")
               if missing["TargetIdentity"] == str(dead.path)}
    expect_equal(reasons.get("FileSystemSize"), TIMED_OUT, f"{what}: reason for the missing size")
    roots = [instance["Root"] for instance in client.instances("CIM_LocalFileSystem")
             if instance["FileSystemSize"]]
    expect(roots, f"{what}: no size of another file system is told")


def expect_gone(session, what):
    expect(waited(lambda: not members_of(session)),
           f"{what}: processes left behind: {members_of(session)}")


@SUITE.case("cimomd tells of a mount whose server is dead")
def _(trial):
    for situation, place, dead in each_situation(trial):
        server = Server(place, trial.bin / "cimomd", "--http", "127.0.0.1:0",
                        start_new_session=True)
        session = server.process.pid
        try:
            expect_told(Client(server.port()), dead, situation)
            server.process.send_signal(signal.SIGTERM)
            expect_equal(server.process.wait(PATIENCE_S), 0, f"{situation}: exit status")
        finally:
            server.process.kill()
            server.end()
        if situation.takes_requests:
            # What waits for a request that was taken cannot be ended, and must hold nobody up.
            expect(set(members_of(session).values()) <= {"D"},
                   f"{situation}: left behind: {members_of(session)}")
            dead.abort()
        expect_gone(session, situation)
    return "No Contact and no size; the other file systems have theirs; it ends when told to"


@SUITE.case("cimomd tells of a mount that another user keeps for himself, its server dead")
def _(trial):
    neighbours.need()
    with rows.place() as place, \
            SilentMount(pathlib.Path(place) / "private", REMOTE, False, neighbours.STRANGER) as mount:
        trial.count()
        server = Server(pathlib.Path(place), trial.bin / "cimomd", "--http", "127.0.0.1:0")
        try:
            found = dead_instance(Client(server.port()), mount)
            expect_equal((found["OperationalStatus"], found["FileSystemSize"],
                          found["AvailableSpace"], found["BlockSize"]), ([UNKNOWN], None, None, None),
                         "what is told of the mount")
        finally:
            server.end()
    return "no size, also not 0, and an unknown status"


@SUITE.case("sennet makes an inventory beside a mount whose server is dead")
def _(trial):
    for situation, place, dead in each_situation(trial):
        generator = Generator(trial, place)
        for name in ("localfilesystem", "remotefilesystem"):
            shutil.copy(TOP / "inventory" / f"{name}.script.inv", place / "scripts")
        program = rows.Program(generator.command(), generator.environment())
        finished = program.wait(HANGS_S)
        expect_equal(finished.status, 0, f"{situation}: status of {finished}")
        remote = (generator.output / "remotefilesystem.mif").read_text()
        expect(str(dead.path) in remote and "No Contact" in remote,
               f"{situation}: the dead mount is not told of: {remote[-400:]}")
        for name in (neighbours.SCRIPT, "localfilesystem"):
            expect((generator.output / f"{name}.mif").exists(), f"{situation}: no {name}.mif")
        if situation.takes_requests:
            dead.abort()
        expect_gone(program.pid, situation)
    return "its row says No Contact; the other files are complete; status 0"


@SUITE.case("sennet is killed while it waits for a mount whose server is dead")
def _(trial):
    for situation, place, dead in each_situation(trial):
        generator = Generator(trial, place)
        shutil.copy(TOP / "inventory" / "remotefilesystem.script.inv", place / "scripts")
        program = rows.Program(generator.command(), generator.environment())
        expect(waited(lambda p=program: len(members_of(p.pid)) >= 2),
               f"{situation}: nobody asks the mount")
        program.kill()
        if situation.takes_requests:
            expect(waited(lambda p=program: set(members_of(p.pid).values()) <= {"D"}),
                   f"{situation}: left behind: {members_of(program.pid)}")
            dead.abort()
        expect_gone(program.pid, situation)
    return "nothing is left but what only the kernel can end, and that with the mount"


if __name__ == "__main__":
    neighbours.main(SUITE)
