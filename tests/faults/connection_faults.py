"""Other users who take all the connections of cimomd that they can get."""

import contextlib
import os
import pathlib
import socket
import time

import neighbours
import rows
from neighbours import STRANGER
from rows import expect, expect_equal

from cimomd_server import Server, call, exchange, post, waited

SUITE = rows.Suite(__doc__)
MAX_CONNECTIONS = 8


def hold_connections(place, ready):
    """Silent connections, more than there is room for."""
    held = []
    for _ in range(2 * MAX_CONNECTIONS):
        held.append(connected(place))
    os.write(ready, b"!")
    time.sleep(rows.PATIENCE_S)


def connected(place):
    connection = socket.socket(socket.AF_UNIX if isinstance(place, str) else socket.AF_INET)
    connection.connect(place)
    return connection


def is_answered(path):
    with socket.socket(socket.AF_UNIX) as connection:
        connection.connect(path)
        try:
            return exchange(connection, post(call("EnumerateClassNames"))).startswith(
                b"HTTP/1.1 200")
        except (BrokenPipeError, ConnectionResetError):
            return False


def ask_one_after_another(path):
    """Its connections count until the server has noticed their ends."""
    return all(waited(lambda: is_answered(path)) for _ in range(2 * MAX_CONNECTIONS))


@contextlib.contextmanager
def public_daemon(trial):
    """cimomd for all users, with few places; its socket and its port."""
    neighbours.need()
    with rows.place() as place:
        pathlib.Path(place).chmod(0o755)
        path = str(pathlib.Path(place) / "s")
        server = Server(pathlib.Path(place), trial.bin / "cimomd", "--http", "127.0.0.1:0",
                        "--socket", path, "--socket-mode", "0666", "--root", neighbours.MACHINE,
                        "--max-connections", str(MAX_CONNECTIONS), "--idle-timeout", "3600")
        try:
            yield path, ("127.0.0.1", server.port())
            expect(server.process.poll() is None, f"cimomd is gone: {server.log()[-2000:]}")
        finally:
            status = server.end()
        expect_equal(status, 0, "exit status of cimomd")


def expect_answers(place):
    for number in range(20):
        with connected(place) as connection:
            octets = exchange(connection, post(call("EnumerateClassNames")), 20)
        expect(octets.startswith(b"HTTP/1.1 200"), f"request {number}: {octets[:99]!r}")


HOLDERS = {
    "another user opens": ((STRANGER, False),),
    "three other users open": tuple((STRANGER + number, False) for number in range(3)),
    "another user opens, over HTTP,": ((STRANGER, True),),
    "other users open, some over HTTP,": ((STRANGER, False), (STRANGER + 1, True)),
}
for _who, _holders in HOLDERS.items():
    @SUITE.case(f"{_who} more silent connections than there is room for")
    def _(trial, holders=_holders):
        trial.count()
        with public_daemon(trial) as (path, web):
            expect(neighbours.as_stranger(ask_one_after_another, path),
                   "connections that have ended count")
            seen, ready = os.pipe()
            for user, uses_web in holders:
                neighbours.Deed(hold_connections, web if uses_web else path, ready, user=user)
                os.read(seen, 1)
            expect_answers(path)
        return "places are kept for root: each of its requests is answered"


def connect_again_and_again(path, ready):
    os.write(ready, b"!")
    end_s = time.monotonic() + rows.PATIENCE_S
    while time.monotonic() < end_s:
        try:
            connected(path).close()
        except OSError:
            return


@SUITE.case("other users connect as fast as they can")
def _(trial):
    trial.count()
    with public_daemon(trial) as (path, _):
        seen, ready = os.pipe()
        for number in range(3):
            neighbours.Deed(connect_again_and_again, path, ready, user=STRANGER + number)
            os.read(seen, 1)
        expect_answers(path)
    return "each of root's requests is answered; cimomd ends when told to"


if __name__ == "__main__":
    neighbours.main(SUITE)
