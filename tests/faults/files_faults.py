#!/usr/bin/env python3
"""File systems that are full, read-only or faulty, odd things where an output file belongs, and many
runs into one directory: every output file stays whole, the old one or the new one."""

import contextlib
import errno
import os
import pathlib
import socket
import stat
import subprocess
import sys

import rows
from generator import PRODUCTS
from inventory_run import InventoryRun

SUITE = rows.Suite(__doc__)
WHOLE = "every file whole, old or new; no temporary file; status 0"
NOBODY = 65534


@contextlib.contextmanager
def mounted(options):
    """A file system in memory of its own; Skip where this user cannot mount."""
    if not rows.is_root():
        raise rows.Skip("mounting needs root")
    with rows.place() as place:
        os.chmod(place, 0o755)
        mount = subprocess.run(["mount", "-t", "tmpfs", "-o", options, "faults", place],
                               capture_output=True, check=False)
        if mount.returncode != 0:
            raise rows.Skip("mounting is not allowed here")
        try:
            yield pathlib.Path(place)
        finally:
            subprocess.run(["umount", "--lazy", place], check=True)


def expect_end(finished, what):
    rows.expect_equal(finished.status, 0, f"{what}: {finished}: status")


# ---- directories

@SUITE.case("read-only file system")
def _(trial):
    with mounted("size=1m") as top, InventoryRun(trial, outputs=top) as run:
        for product in trial.some(PRODUCTS, every=3):
            trial.count()
            run.new(product)
            run.leave_earlier_files(product)
            subprocess.run(["mount", "-o", "remount,ro", top], check=True)
            expect_end(run.generator.run(product), product)
            new = run.expect_whole(product, "read-only")
            subprocess.run(["mount", "-o", "remount,rw", top], check=True)
            rows.expect_equal(new, 0, "new files")
    return "earlier files untouched, status 0"


@SUITE.case("directory of somebody else")
def _(trial):
    if not rows.is_root():
        raise rows.Skip("becoming another user needs root")
    as_nobody = ["setpriv", f"--reuid={NOBODY}", f"--regid={NOBODY}", "--clear-groups"]
    if rows.run([*as_nobody, "test", "-x", trial.bin / "sennet"]).status != 0:
        raise rows.Skip("another user cannot reach the program")
    with InventoryRun(trial) as run:
        for product in trial.some(PRODUCTS, every=3):
            trial.count()
            run.new(product)
            run.leave_earlier_files(product)
            finished = run.generator.run(product, before=as_nobody)
            expect_end(finished, product)
            rows.expect_equal(run.expect_whole(product, "as nobody"), 0, "new files")
            # That was for want of rights, and of nothing else.
            for directory in (run.generator.mif, run.generator.sql):
                os.chown(directory, NOBODY, NOBODY)
            expect_end(run.generator.run(product, before=as_nobody), product)
            run.expect_new(product, "in a directory of nobody's")
    return "earlier files untouched, status 0"


@SUITE.case("missing directories")
def _(trial):
    with InventoryRun(trial) as run:
        for product in trial.some(PRODUCTS, every=3):
            trial.count()
            run.new(product)
            run.generator.remove_outputs()
            expect_end(run.generator.run(product), product)
            run.expect_new(product, "missing directories")
    return "made, every file new, status 0"


@SUITE.case("a file in the place of a directory, and of its parent")
def _(trial):
    with InventoryRun(trial) as run, rows.place() as place:
        for product in trial.some(PRODUCTS, every=3):
            for below in ("", "below/here"):
                trial.count()
                file = pathlib.Path(place) / "file"
                file.write_bytes(b"not a directory")
                finished = rows.run([run.generator.program, "/" + product, file / below,
                                     file / below], run.generator.environment())
                expect_end(finished, product)
                rows.expect_equal(file.read_bytes(), b"not a directory", "the file")
    return "the file untouched, status 0"


@SUITE.case("a directory that vanishes during the run")
def _(trial):
    with InventoryRun(trial, instances=300) as run:
        for _ in trial.repeat(100):
            trial.count()
            run.new("QVE")
            run.leave_earlier_files("QVE")
            program = run.generator.start("QVE")
            while program.is_running() and run.is_untouched("QVE"):
                pass
            away = run.generator.place / "away"
            run.generator.mif.rename(away)
            expect_end(program.wait(), "vanishing")
            away.rename(run.generator.mif)
            run.expect_whole("QVE", "vanishing")
    return WHOLE


# ---- what stands at an output name

def odd_outputs(trial, make, check, what):
    """Makes something odd of each output name in turn; all other files are new then."""
    with InventoryRun(trial) as run:
        for product in trial.some(PRODUCTS, every=3):
            for path in trial.some(run.new(product), every=6):
                trial.count()
                run.leave_earlier_files(product)
                odd = run.generator.top / path
                odd.unlink()
                make(odd)
                expect_end(run.generator.run(product), f"/{product}, {what} {path}")
                check(odd, run.new(product)[path])
                others = {name: octets for name, octets in run.generator.outputs().items()
                          if name in run.new(product) and name != path}
                rows.expect_equal(others, {name: octets for name, octets in
                                           run.new(product).items() if name != path}, what)
                run.generator.remove_outputs()


@SUITE.case("output name that is a directory")
def _(trial):
    def make(odd):
        odd.mkdir()
        (odd / "in the way").write_bytes(b"stays")

    def check(odd, _):
        rows.expect_equal((odd / "in the way").read_bytes(), b"stays", "directory")
    odd_outputs(trial, make, check, "directory")
    return "directory untouched, the other files new, status 0"


@SUITE.case("output name that is a FIFO, a socket, a device")
def _(trial):
    def make_socket(odd):
        with socket.socket(socket.AF_UNIX) as made:
            made.bind(str(odd))

    def make_device(odd):
        os.mknod(odd, stat.S_IFCHR | 0o600, os.makedev(1, 3))

    makers = {stat.S_IFIFO: os.mkfifo, stat.S_IFSOCK: make_socket}
    if rows.is_root():
        makers[stat.S_IFCHR] = make_device
    for kind, make in makers.items():
        odd_outputs(trial, make, lambda odd, _, kind=kind: rows.expect_equal(
            stat.S_IFMT(odd.lstat().st_mode), kind, "kind"), "special file")
    return "special file untouched, the other files new, status 0"


@SUITE.case("output name that is a symbolic link")
def _(trial):
    with rows.place() as place:
        target = pathlib.Path(place) / "target"
        for leads_to in (target, pathlib.Path(place) / "nowhere", pathlib.Path(place)):
            target.write_bytes(b"somebody's")

            def check(odd, new, leads_to=leads_to):
                rows.expect_equal((odd.is_symlink(), odd.read_bytes()), (False, new), "file")
                rows.expect_equal(target.read_bytes(), b"somebody's", f"target of {leads_to}")
                rows.expect_equal(os.listdir(place), ["target"], "beside the target")
            odd_outputs(trial, lambda odd, to=leads_to: odd.symlink_to(to), check, "link")
    return "link replaced and not followed, status 0"


# ---- space

@SUITE.case("disk full after each page")
def _(trial):
    pages = 0
    with mounted("size=64m") as top, InventoryRun(trial, 700, outputs=top) as run:
        for product in trial.some(PRODUCTS, every=3):
            needed = sum(len(octets) // 4096 + 1 for octets in run.new(product).values())
            seen = set()
            for pages in trial.some(range(needed + 8), every=17):
                trial.count()
                run.leave_earlier_files(product)
                subprocess.run(["mount", "-o", f"remount,size={(needed + pages) * 4096}", top],
                               check=True)
                expect_end(run.generator.run(product), f"/{product}, {pages} pages")
                seen.add(run.expect_whole(product, f"{pages} pages left"))
                subprocess.run(["mount", "-o", "remount,size=64m", top], check=True)
            rows.expect(len(seen) > 1, f"/{product}: the size made no difference: {seen}")
    return WHOLE


@SUITE.case("limit of the size of a file")
def _(trial):
    with InventoryRun(trial, 700) as run:
        for product in trial.some(PRODUCTS, every=3):
            longest = max(len(octets) for octets in run.new(product).values())
            seen = set()
            for size in trial.some(range(0, longest + 512, 512), every=97):
                trial.count()
                run.leave_earlier_files(product)
                finished = run.generator.run(product, limits=[f"--fsize={size}"])
                expect_end(finished, f"/{product}, {size} octets")
                seen.add(run.expect_whole(product, f"{size} octets"))
            rows.expect(len(seen) > 1, f"/{product}: the limit made no difference: {seen}")
    return WHOLE


# ---- calls that fail

def failing_calls(trial, named):
    with InventoryRun(trial, 700) as run:
        mark = run.generator.place / "mark"
        for product in trial.some(PRODUCTS, every=3):
            run.new(product)
            for error in (errno.EIO, errno.ENOSPC) if trial.full else (errno.EIO,):
                call, failed = 0, "none yet"
                while failed:
                    call += 1 if trial.full else 17
                    trial.count()
                    run.leave_earlier_files(product)
                    finished = run.generator.run(product, {
                        "CALL": call, "ERROR": error, "MARK": mark, "NAMED": named})
                    what = f"call {call} fails with {errno.errorcode[error]}"
                    expect_end(finished, f"/{product}, {what}")
                    failed = mark.read_text() if mark.exists() else ""
                    mark.unlink(missing_ok=True)
                    # What cannot be removed stays, to be removed by another run.
                    run.expect_whole(product, f"{what}: {failed}", hidden=failed == "unlinkat")
                run.expect_new(product, "no call failed")
    return "every file whole, old or new; status 0"


@SUITE.case("each call on an output file fails, nameless temporary files")
def _(trial):
    return failing_calls(trial, 0)


@SUITE.case("each call on an output file fails, named temporary files")
def _(trial):
    return failing_calls(trial, 1)


@SUITE.case("calls interrupted, and writes that take little")
def _(trial):
    with InventoryRun(trial, 700) as run:
        for product in trial.some(PRODUCTS, every=3):
            for named in (0, 1):
                trial.count()
                run.new(product)
                run.leave_earlier_files(product)
                expect_end(run.generator.run(product, {"INTERRUPT": 1, "NAMED": named}), product)
                run.expect_new(product, "interrupted")
    return "every file new, status 0"


# ---- runs at once

@SUITE.case("two and eight runs at once into the same directories")
def _(trial):
    with InventoryRun(trial, 700) as run, InventoryRun(trial, 700, "other") as other:
        other.generator.use_outputs_of(run.generator)
        for product in trial.some(PRODUCTS, every=3):
            new, others = run.new(product), other.new(product)
            rows.expect_equal(sorted(new), sorted(others), "names")
            for number in trial.repeat(30):
                trial.count()
                run.leave_earlier_files(product)
                faults = {"NAMED": number % 2}
                programs = [one.generator.start(product, faults)
                            for one in [run, other] * (4 if number % 3 == 0 else 1)]
                for program in programs:
                    expect_end(program.wait(), product)
                for path, octets in run.generator.outputs().items():
                    rows.expect(octets in (new.get(path), others.get(path)),
                                f"/{product}: {path} is of neither run: {octets[:200]!r}")
                rows.expect_equal(sorted(run.generator.outputs()), sorted(new), "names")
    return "every file whole, of one run; no temporary file; status 0"


if __name__ == "__main__":
    sys.exit(SUITE.main())
