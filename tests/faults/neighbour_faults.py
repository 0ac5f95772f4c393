"""What another user of the machine may try against an inventory that root makes."""

import grp
import os
import pathlib
import signal
import socket
import stat
import sys
import time

import neighbours
import rows
from challenge import ChallengingServer
from neighbours import KNOWN_SOCKET, STRANGER, Deed, Generator, Listener, as_stranger
from rows import expect, expect_equal

from cimomd_server import waited

SUITE = rows.Suite(__doc__)
SECRET = "the-text-of-a-secret-file"
THIRD_USER = 23456


@SUITE.case("another user listens at a known place of a server")
def _(trial):
    neighbours.need()
    for _ in trial.repeat(20):
        trial.count()
        with rows.place() as place, Listener(KNOWN_SOCKET) as listener:
            generator = Generator(trial, place)
            generator.expect_inventory(generator.run())
            expect_equal(listener.heard(), (0, b""), "what the other user heard")
    return "passed over without a connection; the inventory is made by a server of its own"


@SUITE.case("another user listens at a known place that was given to root")
def _(trial):
    neighbours.need()
    for _ in trial.repeat(20):
        trial.count()
        with rows.place() as place, Listener(KNOWN_SOCKET) as listener:
            os.chown(KNOWN_SOCKET, 0, 0)
            finished = Generator(trial, place).run()
            expect_equal(finished.status, 1, f"status of {finished}")
            expect_equal(listener.heard(), (1, b""), "what the other user heard")
    return "status 1; not one octet is sent"


@SUITE.case("CIM_LOCAL_SOCKET names another user's socket")
def _(trial):
    neighbours.need()
    for _ in trial.repeat(20):
        trial.count()
        with rows.place() as place, Listener("/var/tmp/any.socket") as listener:
            finished = Generator(trial, place).run(listener.path)
            expect_equal(finished.status, 1, f"status of {finished}")
            expect_equal(listener.heard(), (1, b""), "what the other user heard")
    return "status 1; not one octet is sent"


def plant_link(target):
    os.symlink(target, KNOWN_SOCKET)


def plant_closed_socket():
    closed = socket.socket(socket.AF_UNIX)
    closed.bind(str(KNOWN_SOCKET))


THINGS_AT_A_KNOWN_PLACE = {
    "directory": lambda _: os.mkdir(KNOWN_SOCKET),
    "FIFO": lambda _: os.mkfifo(KNOWN_SOCKET),
    "file": lambda _: KNOWN_SOCKET.write_text("no socket"),
    "socket without a server": lambda _: plant_closed_socket(),
    "link to a socket of root": plant_link,
    "link to itself": lambda _: plant_link(KNOWN_SOCKET),
}


def remove(path):
    if path.is_dir() and not path.is_symlink():
        path.rmdir()
    else:
        path.unlink()


@SUITE.case("another user leaves a link, a FIFO, a directory at a known place")
def _(trial):
    neighbours.need()
    for thing, plant in THINGS_AT_A_KNOWN_PLACE.items():
        trial.count()
        with rows.place() as place, Listener("/var/tmp/of-root", user=0) as listener:
            as_stranger(plant, str(listener.path))
            try:
                generator = Generator(trial, place)
                generator.expect_inventory(generator.run())
                expect_equal(listener.heard(), (0, b""), f"{thing}: what the linked socket heard")
            finally:
                remove(KNOWN_SOCKET)
    return "passed over; the inventory is made by a server of its own"


def challenged(trial, path, caller=0):
    """What a server of root is sent by a caller after it named this file, and how often it was
    asked."""
    with neighbours.place_for_programs() as place:
        programs = neighbours.public_programs(trial, place) if caller else None
        generator = Generator(trial, place, programs)
        options = neighbours.stranger_options(caller) if caller else {}
        generator.output.mkdir()
        os.chown(generator.output, caller, caller)
        socket_path = pathlib.Path(place) / "server.socket"
        with ChallengingServer(socket_path, path) as server:
            generator.run(socket_path, **options)
        return server


def secret_file(path, owner=0, mode=0o600):
    path = pathlib.Path(path)
    path.write_text(SECRET + "\n")
    path.chmod(mode)
    os.chown(path, owner, owner)
    return str(path)


def links_to_secret(make_link):
    target = secret_file("/var/tmp/kept/target")
    make_link(target, "/var/tmp/secret")
    return "/var/tmp/secret"


def fifo():
    os.mkfifo("/var/tmp/secret")
    return "/var/tmp/secret"


def device():
    os.mknod("/var/tmp/secret", 0o666 | stat.S_IFCHR, os.makedev(1, 5))
    return "/var/tmp/secret"


def too_long():
    pathlib.Path("/var/tmp/secret").write_text(SECRET * 1000)
    return "/var/tmp/secret"


def through(path):
    """A way to a file that is fine but for how it is named."""
    secret_file("/var/tmp/secret")
    return path


# Each makes what the challenge is about and returns the path that it names.
UNANSWERED = {
    "a file of root elsewhere": lambda: secret_file("/var/tmp/kept/secret"),
    "the shadow file": lambda: "/etc/shadow",
    "a way out of a known directory": lambda: "/var/tmp/../../etc/shadow",
    "a detour": lambda: through("/var/tmp/./secret"),
    "a relative path": lambda: through("secret"),
    "an empty path": lambda: through(""),
    "the directory itself": lambda: "/var/tmp/",
    "a directory": lambda: "/var/tmp/kept",
    "a symbolic link": lambda: links_to_secret(os.symlink),
    "a second name": lambda: links_to_secret(os.link),
    "another user's file": lambda: secret_file("/var/tmp/secret", STRANGER, 0o644),
    "a FIFO": fifo,
    "a device": device,
    "a long file": too_long,
}


def try_challenge(trial, make, caller=0):
    kept = pathlib.Path("/var/tmp/kept")
    kept.mkdir()
    try:
        return challenged(trial, make(), caller)
    finally:
        for path in [pathlib.Path("/var/tmp/secret"), *kept.iterdir()]:
            path.unlink(missing_ok=True)
        kept.rmdir()


@SUITE.case("a challenge names a file that is none of its server's business")
def _(trial):
    neighbours.need()
    for what, make in UNANSWERED.items():
        trial.count()
        server = try_challenge(trial, make)
        expect(server.requests() >= 1, f"{what}: the server was not asked")
        expect(b"PegasusAuthorization: Local \"root\"\r\n" in server.heard,
               f"{what}: the user's name was not sent: {server.heard!r}")
        expect_equal(server.heard.count(b"PegasusAuthorization"),
                     server.heard.count(b"PegasusAuthorization: Local \"root\"\r\n"),
                     f"{what}: requests without an answer to the challenge")
    return "refused: nothing of the file is sent"


@SUITE.case("a challenge names a secret that is meant for the caller, or for somebody else")
def _(trial):
    neighbours.need()
    for caller, owner, sent in ((0, 0, True), (STRANGER, STRANGER, True), (STRANGER, 0, True),
                                (STRANGER, THIRD_USER, False), (0, THIRD_USER, False)):
        trial.count()
        server = try_challenge(
            trial, lambda o=owner: secret_file("/var/tmp/secret", o, 0o644), caller)
        expect(server.requests() >= 1, "the server was not asked")
        expect_equal(f":/var/tmp/secret:{SECRET}\"".encode() in server.heard, sent,
                     f"caller {caller}, file of {owner}: whether the secret is sent")
    return "sent when the file belongs to the server's user or the caller, and only then"


def can_connect(path):
    with socket.socket(socket.AF_UNIX) as connection:
        try:
            connection.connect(str(path))
        except PermissionError:
            return False
        return True


def connections_until(path, end_s):
    """How often somebody who tries all the time gets through."""
    count = 0
    while time.monotonic() < end_s:
        try:
            count += can_connect(path)
        except (FileNotFoundError, ConnectionRefusedError):
            pass
    return count


class Daemon:
    """cimomd on a socket in an empty place that everybody may enter."""

    def __init__(self, trial, place, *more):
        self.place = pathlib.Path(place)
        self.place.chmod(0o755)
        self.socket = self.place / "s"
        self.program = rows.Program([trial.bin / "cimomd", "--socket", self.socket, "--root",
                                     neighbours.MACHINE, *more])

    def __enter__(self):
        if not waited(self.socket.exists):
            self.program.kill()
            raise rows.Failure("cimomd does not serve")
        return self

    def __exit__(self, *_):
        self.program.signal(signal.SIGTERM)
        self.program.wait()


@SUITE.case("another user connects to a socket of mode 0600 while it is being made")
def _(trial):
    neighbours.need()
    for _ in trial.repeat(20):
        trial.count()
        with rows.place() as place:
            path = pathlib.Path(place) / "s"
            attempts = Deed(connections_until, path, time.monotonic() + 1.5)
            with Daemon(trial, place) as daemon:
                expect_equal(attempts.result(), 0, "connections of the other user")
                expect(not as_stranger(can_connect, daemon.socket), "the other user got through")
                expect(can_connect(daemon.socket), "its owner cannot connect")
    return "refused, from the first moment on"


@SUITE.case("a user outside of the group connects to a socket for a group")
def _(trial):
    neighbours.need()
    group = next(entry for entry in grp.getgrall() if entry.gr_gid != 0)
    trial.count()
    with rows.place() as place, \
            Daemon(trial, place, "--socket-mode", "0660", "--socket-group", group.gr_name) as daemon:
        expect(waited(lambda: daemon.socket.stat().st_gid == group.gr_gid), "the group is not set")
        expect(not as_stranger(can_connect, daemon.socket), "a stranger got through")
        expect(as_stranger(can_connect, daemon.socket, groups=[group.gr_gid]),
               "a member of the group does not get through")
    return "refused; a member gets through"


if __name__ == "__main__":
    neighbours.main(SUITE)
