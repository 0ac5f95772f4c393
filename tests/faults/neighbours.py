"""Another user of this machine, mounts that only a suite sees, and runs of the programs beside
them."""

import ctypes
import functools
import multiprocessing
import os
import pathlib
import select
import shutil
import socket
import sys
import tempfile

import rows

TOP = pathlib.Path(__file__).resolve().parents[2]
sys.path.insert(0, str(TOP / "tests" / "integration" / "cimomd"))

MACHINE = TOP / "tests" / "machines" / "server"
STRANGER = 12345
# A script whose class every machine has.
SCRIPT = "memory"
# A known place of a CIM server's socket, in a directory where everybody may make files.
KNOWN_SOCKET = pathlib.Path("/var/tmp/cimxml.socket")

_CLONE_NEWNS = 0x20000
_MS_REC_PRIVATE = 0x4000 | 0x40000
MS_BIND = 0x1000
_MNT_DETACH = 2
_SYS_PIDFD_GETFD = 438
_LIBC = ctypes.CDLL(None, use_errno=True)
_FORK = multiprocessing.get_context("fork")


def _check(result, what):
    if result != 0:
        error = ctypes.get_errno()
        raise OSError(error, f"{what}: {os.strerror(error)}")


def mount(source, target, kind, flags=0, data=""):
    _check(_LIBC.mount(source.encode(), os.fsencode(target), kind.encode(),
                       ctypes.c_ulong(flags), data.encode()), f"mount {kind}")


def unmount(target):
    _check(_LIBC.umount2(os.fsencode(target), _MNT_DETACH), "umount")


def duplicate_of(pidfd, number):
    """A duplicate in this process of a descriptor of another one; Skip where there is no such
    call, or none for this user."""
    descriptor = _LIBC.syscall(_SYS_PIDFD_GETFD, pidfd, number, 0)
    if descriptor < 0:
        raise rows.Skip(f"no duplicates of descriptors: {os.strerror(ctypes.get_errno())}")
    return descriptor


def _enter_own_mounts():
    """From now on this process and its children see mounts that nobody else sees, among them an
    empty /var/tmp."""
    _check(_LIBC.unshare(_CLONE_NEWNS), "unshare")
    mount("none", "/", "none", _MS_REC_PRIVATE)
    mount("var-tmp", "/var/tmp", "tmpfs", 0, "mode=1777")


@functools.cache
def _obstacle():
    try:
        _enter_own_mounts()
    except OSError as error:
        return f"no mounts of its own: {error.strerror}"
    return None


def need():
    """To be called by a case that needs another user and mounts of its own; Skip where they cannot
    be had."""
    if not rows.is_root():
        raise rows.Skip("only root can be another user")
    if _obstacle():
        raise rows.Skip(_obstacle())


def main(suite):
    """What the caller's environment says about servers and places must not matter."""
    for name in list(os.environ):
        if name.startswith(("CIM_", "VELM_")):
            del os.environ[name]
    rows.no_core_files()
    os.umask(0o022)
    sys.exit(suite.main())


def _become(user, groups=()):
    os.setgroups(groups)
    os.setresgid(user, user, user)
    os.setresuid(user, user, user)


class Deed:
    """What another user does in the meantime."""

    def __init__(self, function, *arguments, user=STRANGER, groups=()):
        self._pipe, theirs = _FORK.Pipe()
        self._process = _FORK.Process(target=self._do, daemon=True,
                                      args=(theirs, user, groups, function, arguments))
        self._process.start()
        theirs.close()

    @staticmethod
    def _do(pipe, user, groups, function, arguments):
        _become(user, groups)
        try:
            pipe.send(function(*arguments))
        except OSError as error:
            pipe.send(error)

    def result(self):
        """What the function returned; raises the OSError that it raised."""
        result = self._pipe.recv()
        self._process.join()
        if isinstance(result, OSError):
            raise result
        return result


def as_stranger(function, *arguments, **options):
    return Deed(function, *arguments, **options).result()


class Listener:
    """A server of another user that answers nothing and remembers what it hears."""

    def __init__(self, path, user=STRANGER):
        self.path = pathlib.Path(path)
        self._pipe, theirs = _FORK.Pipe()
        self._child = _FORK.Process(target=self._serve, args=(theirs, user), daemon=True)
        self._child.start()
        theirs.close()
        self._pipe.recv()

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self._child.kill()
        self._child.join()
        self.path.unlink(missing_ok=True)

    def heard(self):
        """The number of connections, and all octets that came through them."""
        self._pipe.send(None)
        return self._pipe.recv()

    def _serve(self, pipe, user):
        _become(user)
        listener = socket.socket(socket.AF_UNIX)
        listener.bind(str(self.path))
        self.path.chmod(0o777)
        listener.listen()
        pipe.send("ready")
        connections, heard = [], b""
        while True:
            ready, _, _ = select.select([pipe, listener, *connections], [], [])
            if listener in ready:
                connections.append(listener.accept()[0])
            for connection in [one for one in connections if one in ready]:
                piece = connection.recv(65536)
                heard += piece
                if not piece:
                    connections[connections.index(connection)] = _Ended(connection)
            if pipe in ready:
                pipe.recv()
                pipe.send((len(connections), heard))


class _Ended:
    """A connection that is only counted any more; select finds nothing to read in it."""

    def __init__(self, connection):
        connection.close()
        self._silent, self._kept = socket.socketpair()

    def fileno(self):
        return self._silent.fileno()


class Generator:
    """sennet with one script, in a place of its own that everybody may look into."""

    def __init__(self, trial, place, programs=None, script=SCRIPT):
        self.place = pathlib.Path(place)
        self.place.chmod(0o755)
        self.program = (programs or trial.bin) / "sennet"
        self.output = self.place / "mif"
        scripts = self.place / "scripts"
        scripts.mkdir()
        for name in (script + ".script.inv", "sennet.properties"):
            shutil.copy(TOP / "inventory" / name, scripts)
        self.configuration = self.place / "velm.properties"
        self.configuration.write_text(f"sennet.directory={scripts}\n"
                                      f"sennet.resources={scripts / 'sennet.properties'}\n")

    def command(self, product="SMS"):
        return [self.program, "/" + product, self.output, self.output]

    def environment(self, socket_path=None, **more):
        chosen = {"CIM_LOCAL_SOCKET": str(socket_path)} if socket_path else {}
        return {"VELM_CONFIG": str(self.configuration), **chosen, **more}

    def run(self, socket_path=None, product="SMS", more=(), **options):
        return rows.run(self.command(product), self.environment(socket_path, **dict(more)),
                        **options)

    def expect_inventory(self, finished):
        rows.expect_equal(finished.status, 0, f"status of {finished}")
        file = self.output / (SCRIPT + ".mif")
        rows.expect(file.is_file() and b"Start Table" in file.read_bytes(),
                    f"no inventory was written: {finished}")


def place_for_programs():
    """Like rows.place(), but where programs may run with another user's rights, if they may
    anywhere."""
    return tempfile.TemporaryDirectory(prefix="faults.")


def public_programs(trial, place):
    """The programs and the schema, copied to where another user may run them."""
    top = pathlib.Path(place) / "programs"
    shutil.copytree(trial.bin.parent / "share" / "cimomd" / "schema",
                    top / "share" / "cimomd" / "schema")
    (top / "bin").mkdir()
    for name in ("sennet", "cimomd"):
        shutil.copy(trial.bin / name, top / "bin")
    for directory, _, files in os.walk(top):
        for name in ["."] + files:
            os.chmod(os.path.join(directory, name), 0o755)
    return top / "bin"


def stranger_options(user=STRANGER):
    """How rows.run lets that user run a program."""
    return {"user": user, "group": user, "extra_groups": []}
