"""What another user may leave where root's inventory writes its files."""

import itertools
import os
import pathlib
import signal
import socket
import stat
import time

import neighbours
import rows
from generator import environment_of_faults
from neighbours import STRANGER, Deed, Generator, as_stranger
from rows import expect, expect_equal

from cimomd_server import waited

SUITE = rows.Suite(__doc__)
PRODUCTS = ("SMS", "LD", "CA", "QVE")
PRECIOUS = "what only root may write\n"
UMASK = 0o022


class Surroundings:
    """An object manager, the generator, a directory that everybody may write to, and a file of
    root that nobody else may."""

    def __init__(self, trial, product):
        self.trial = trial
        self.product = product

    def __enter__(self):
        self._place = rows.place()
        place = pathlib.Path(self._place.__enter__())
        self.generator = Generator(self.trial, place)
        self.generator.output.mkdir()
        self.generator.output.chmod(0o1777)
        self.precious = place / "precious"
        self.precious.write_text(PRECIOUS)
        self.precious.chmod(0o644)
        self.absent = place / "absent"
        self._socket = place / "s"
        self._server = rows.Program([self.trial.bin / "cimomd", "--socket", self._socket, "--root",
                                     neighbours.MACHINE])
        if not waited(self._socket.exists):
            raise rows.Failure(f"cimomd does not serve: {self._server.kill()}")
        return self

    def __exit__(self, *what):
        self._server.signal(signal.SIGTERM)
        self._server.wait()
        self._place.__exit__(*what)

    def start(self, **faults):
        environment = self.generator.environment(
            self._socket, **environment_of_faults(self.trial.bin, faults))
        return rows.Program(self.generator.command(self.product), environment, umask=UMASK)

    def run(self, **faults):
        expect_success(self.start(**faults).wait())

    def names(self):
        """What is in the output directory, hidden files too."""
        return sorted(os.listdir(self.generator.output))

    def path(self, name):
        return self.generator.output / name

    def own_names(self):
        """Those of root's files only."""
        return [name for name in self.names() if self.path(name).lstat().st_uid == 0]

    def clear(self):
        for name in self.names():
            path = self.path(name)
            if stat.S_ISDIR(path.lstat().st_mode):
                path.rmdir()
            else:
                path.unlink()

    def contents(self):
        return {name: self.path(name).read_bytes() for name in self.names()}

    def expect_precious(self, what):
        status = self.precious.lstat()
        expect_equal((self.precious.read_text(), stat.S_IMODE(status.st_mode), status.st_uid),
                     (PRECIOUS, 0o644, 0), f"{what}: root's file, its mode and owner")
        expect(not os.path.lexists(self.absent), f"{what}: a file was made through a link")


def expect_success(finished):
    expect_equal(finished.status, 0, f"status of {finished}")


def plant_socket(path):
    with socket.socket(socket.AF_UNIX) as made:
        made.bind(str(path))


def plant_open_file(path):
    path.write_text("planted")
    path.chmod(0o666)


# What is replaced by root's own file.
REPLACED = {
    "a link to a file of root": lambda here, path: os.symlink(here.precious, path),
    "a link to nothing": lambda here, path: os.symlink(here.absent, path),
    "a link to itself": lambda here, path: os.symlink(path.name, path),
    "a link to a directory": lambda here, path: os.symlink("/var/tmp", path),
    "a file that all may write to": lambda _, path: plant_open_file(path),
}
# What stays, for a file cannot take its place without harm.
KEPT = {
    "a directory": lambda _, path: path.mkdir(),
    "a FIFO": lambda _, path: os.mkfifo(path),
    "a socket": lambda _, path: plant_socket(path),
}


def each_product(trial, products=PRODUCTS):
    """The surroundings of each product, with the files that it writes there."""
    neighbours.need()
    for product in products:
        with Surroundings(trial, product) as here:
            here.run()
            expected = here.contents()
            expect(expected, f"{product} writes no file")
            yield here, expected


def expect_own_files(here, expected, what):
    expect_equal(here.own_names(), sorted(expected), f"{what}: names in the directory")
    for name, content in expected.items():
        status = here.path(name).lstat()
        expect(stat.S_ISREG(status.st_mode), f"{what}: {name} is no regular file")
        expect_equal((status.st_uid, stat.S_IMODE(status.st_mode)), (0, 0o644),
                     f"{what}: owner and mode of {name}")
        expect(here.path(name).read_bytes() == content, f"{what}: {name} differs")


@SUITE.case("links and writable files planted at the names of all output files")
def _(trial):
    for here, expected in each_product(trial):
        for thing, plant in REPLACED.items():
            here.clear()
            for name in expected:
                as_stranger(plant, here, here.path(name))
            trial.count(len(expected))
            here.run()
            expect_own_files(here, expected, f"{here.product}, {thing}")
            here.expect_precious(f"{here.product}, {thing}")
    return "replaced by files of root that only root may write; nothing is followed"


@SUITE.case("a second name of root's file planted at the names of all output files")
def _(trial):
    for here, expected in each_product(trial):
        here.clear()
        # Another user can make such names only where the kernel does not protect hard links.
        for name in expected:
            os.link(here.precious, here.path(name))
        trial.count(len(expected))
        here.run()
        expect_own_files(here, expected, here.product)
        here.expect_precious(here.product)
    return "replaced; the file behind it stays as it was"


@SUITE.case("directories, FIFOs and sockets planted at the names of all output files")
def _(trial):
    for here, expected in each_product(trial):
        for thing, plant in KEPT.items():
            here.clear()
            for name in expected:
                as_stranger(plant, here, here.path(name))
            before = {name: here.path(name).lstat() for name in expected}
            trial.count(len(expected))
            here.run()
            expect_equal(here.names(), sorted(expected), f"{here.product}, {thing}: names")
            for name, status in before.items():
                after = here.path(name).lstat()
                expect_equal((after.st_ino, after.st_mode, after.st_uid),
                             (status.st_ino, status.st_mode, STRANGER),
                             f"{here.product}, {thing}: what stands at {name}")
    return "left alone, the run ends and leaves nothing else behind"


def replace_hidden(directory, target):
    """Puts links to `target` in the place of all hidden files; how many."""
    names = [name for name in os.listdir(directory) if name.startswith(".")]
    for name in names:
        (directory / name).unlink()
        (directory / name).symlink_to(target)
    return len(names)


def replaced_at(here, number, named, target):
    """How many temporary files were replaced by links to `target` before the run's call of that
    number on output files; None when it makes fewer."""
    program = here.start(CALL=number, STOP=1, NAMED=named)
    try:
        stopped = program.stops()
        replaced = as_stranger(replace_hidden, here.generator.output, target) if stopped else None
    finally:
        program.signal(signal.SIGCONT)
        finished = program.wait()
    expect_success(finished)
    return replaced


def replaced_at_each_call(here, named, targets):
    """In how many runs a temporary file was replaced."""
    runs = 0
    for number in itertools.count(1):
        for target in targets:
            replaced = replaced_at(here, number, named, target)
            if replaced is None:
                return runs
            here.expect_precious(f"{here.product}, links to {target.name} before call {number}")
            runs += replaced > 0
    raise AssertionError("itertools.count has no end")


def replaced_temporary_names(trial, named):
    for here, expected in each_product(trial, PRODUCTS if trial.full else PRODUCTS[:2]):
        # Without the sticky bit names can be taken from root.
        here.generator.output.chmod(0o777)
        runs = replaced_at_each_call(here, named, trial.some((here.precious, here.absent)))
        expect(runs > 0, f"{here.product}: no temporary name was ever seen")
        trial.count(runs)
        here.run(NAMED=named)
        expect_own_files(here, expected, f"{here.product}, after links were planted")
    return "nothing is followed; the files of the next run are whole"


@SUITE.case("links put in the place of each named temporary file before each call on it")
def _(trial):
    return replaced_temporary_names(trial, 1)


@SUITE.case("links put in the place of each nameless temporary file that has just got a name")
def _(trial):
    return replaced_temporary_names(trial, 0)


def disturb(directory, target, names, end_s):
    """Puts links to `target` at the names of the outputs and at every other that appears. Returns how
    many took the place of a file of root at an output name, and how many that of another."""
    outputs = others = 0
    while time.monotonic() < end_s:
        for name in {*names, *os.listdir(directory)}:
            path = directory / name
            try:
                was_link = path.is_symlink()
                path.unlink()
                path.symlink_to(target)
            except OSError:
                continue
            outputs += name in names and not was_link
            others += name not in names and not was_link
    return outputs, others


@SUITE.case("links put at each name as it appears, while root writes")
def _(trial):
    neighbours.need()
    with Surroundings(trial, "SMS") as here:
        # Without the sticky bit names can be taken from root.
        here.generator.output.chmod(0o777)
        here.run()
        expected = here.contents()
        expect(expected, "no file is written")
        end_s = time.monotonic() + trial.run_seconds(60, 2)
        neighbour = Deed(disturb, here.generator.output, here.precious, list(expected), end_s)
        while time.monotonic() < end_s:
            trial.count()
            here.run(NAMED=trial.tried % 2)
        outputs, others = neighbour.result()
        expect(outputs > 0, "no link was put at the name of an output")
        expect(others > 0 or not trial.full, "no link was put at the name of a temporary file")
        here.expect_precious("while links were planted")
        here.run()
        expect_own_files(here, expected, "after links were planted")
    return "nothing is followed; the files of the next run are whole"


if __name__ == "__main__":
    neighbours.main(SUITE)
