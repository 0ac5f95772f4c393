#!/usr/bin/env python3
"""Runs that are killed, starved or started without standard streams: every output file stays whole,
the old one or the new one."""

import fcntl
import os
import pathlib
import random
import signal
import sys
import time

import rows
from generator import PRODUCTS
from inventory_run import InventoryRun

SUITE = rows.Suite(__doc__)
WHOLE = "every file whole, old or new"
# A request that fails for want of something counts like any that fails.
WHOLE_AS_TOLD = "every file whole: old, new, or without the instances that could not be asked for"
CANNOT_BE_LOADED = 127
NO_MEMORY = "sennet: not enough memory\n"


# ---- killed

def killed(trial, number, full, named):
    """Kills runs at random moments, and looks at the files after each. The run after the last one
    removes what was left."""
    moments = random.Random(5)
    counts = set()
    with InventoryRun(trial, 700) as run:
        for product in trial.some(PRODUCTS, every=3):
            start = time.monotonic()
            run.new(product)
            duration = time.monotonic() - start
            for _ in trial.repeat(full // len(PRODUCTS)):
                trial.count()
                run.leave_earlier_files(product)
                program = run.generator.start(product, {"NAMED": named})
                time.sleep(moments.uniform(0, duration))
                program.signal(number)
                status = program.wait().status
                rows.expect(status in (0, -number), f"/{product}: status {status}")
                counts.add(run.expect_whole(product, f"signal {number}", hidden=True))
                rows.expect_equal(run.generator.run(product, {"NAMED": named}).status, 0, "next run")
                run.expect_new(product, "the next run")
    # A few moments may well all be too late.
    rows.expect(len(counts) > 1 or not trial.full, f"the moment made no difference: {counts}")
    return f"{WHOLE}; the next run removes temporary files, and its files are new"


@SUITE.case("SIGKILL at random moments, nameless temporary files")
def _(trial):
    return killed(trial, signal.SIGKILL, 200, 0)


@SUITE.case("SIGKILL at random moments, named temporary files")
def _(trial):
    return killed(trial, signal.SIGKILL, 200, 1)


@SUITE.case("SIGTERM at random moments")
def _(trial):
    return killed(trial, signal.SIGTERM, 40, 1)


@SUITE.case("temporary files of a killed run, of one that runs, of another user")
def _(trial):
    trial.count()
    with InventoryRun(trial) as run:
        run.new("SMS")
        run.leave_earlier_files("SMS")
        mif = run.generator.mif
        (mif / ".velm-00000000000000aa.tmp").write_bytes(b"killed")
        foreign = mif / ".velm-00000000000000bb.tmp"
        if rows.is_root():
            foreign.write_bytes(b"another user's")
            os.chown(foreign, 65534, 65534)
        written = mif / ".velm-00000000000000cc.tmp"
        with written.open("wb") as file:
            fcntl.flock(file, fcntl.LOCK_EX)
            rows.expect_equal(run.generator.run("SMS").status, 0, "status")
        left = {pathlib.Path(path).name for path in run.generator.outputs()} - {"a.mif", "b.mif"}
        expected = {written.name, foreign.name} if rows.is_root() else {written.name}
        rows.expect_equal(left, expected, "left")
    return "abandoned ones removed, others not"


# ---- standard streams

CLOSED = {"<&-": "<&-", ">&-": ">&-", "2>&-": "2>&-", "all three": "<&- >&- 2>&-",
          ">&- and /dev/full": ">&- 2>/dev/full"}


@SUITE.case("closed standard streams")
def _(trial):
    with InventoryRun(trial) as run:
        for product in trial.some(PRODUCTS, every=3):
            run.new(product)
            for name, redirection in CLOSED.items():
                for named in (0, 1):
                    trial.count()
                    run.leave_earlier_files(product)
                    shell = ["sh", "-c", f'exec "$@" {redirection}', "sh"]
                    finished = run.generator.run(product, {"NAMED": named}, before=shell)
                    rows.expect_equal(finished.status, 0, f"/{product} {name}: {finished}")
                    run.expect_new(product, name)
    return "no message in a file, every file new, status 0"


@SUITE.case("standard output that is full, or that nobody reads")
def _(trial):
    with InventoryRun(trial) as run:
        for product in trial.some(PRODUCTS, every=3):
            run.new(product)
            trial.count()
            run.leave_earlier_files(product)
            full = run.generator.run(product, before=["sh", "-c", 'exec "$@" >/dev/full', "sh"])
            rows.expect_equal(full.status, 0, f"/{product}: {full}")
            run.expect_new(product, "/dev/full")
            trial.count()
            run.leave_earlier_files(product)
            reader, writer = os.pipe()
            os.close(reader)
            nobody = run.generator.start(product, stdout=writer)
            os.close(writer)
            rows.expect(nobody.wait().status in (0, -signal.SIGPIPE), f"/{product}: status")
            run.expect_whole(product, "nobody reads", hidden=True)
    return f"/dev/full: every file new; pipe without a reader: {WHOLE}"


# ---- starved

def starved(trial, run, product, limits):
    """Runs under each of the limits, the last of which is enough; gives each with how many files are
    new. Such a run ends with status 0, or with 1 and each file old or new; with less than that it
    cannot even be loaded."""
    run.learn_losses(product)
    statuses = set()
    for limit in limits:
        trial.count()
        run.leave_earlier_files(product)
        finished = run.generator.run(product, limits=[limit])
        what = f"/{product}, {limit}"
        rows.expect(finished.status in (0, 1, CANNOT_BE_LOADED), f"{what}: {finished}")
        count = run.expect_whole_or_less(product, what)
        if finished.status != 0:
            run.expect_whole(product, what)
        statuses.add(finished.status)
        yield what, finished, count
    run.expect_new(product, limits[-1])
    rows.expect({0, 1} <= statuses, f"/{product}: the limits made no difference: {statuses}")


@SUITE.case("few descriptors")
def _(trial):
    numbers = range(3, 64) if trial.full else (3, 4, 6, 8, 9, 12, 20)
    limits = [f"--nofile={number}" for number in [*numbers, 256]]
    with InventoryRun(trial) as run:
        for product in trial.some(PRODUCTS, every=3):
            for what, finished, count in starved(trial, run, product, limits):
                if finished.status != 0:
                    rows.expect_equal(count, 0, f"{what}: new files")
    return f"status 0 or 1; {WHOLE_AS_TOLD}"


def least_memory(run):
    """The bytes with which the program can be loaded."""
    for size in range(8 * rows.MIB, 512 * rows.MIB, rows.MIB):
        if run.generator.run("SMS", limits=[f"--as={size}"]).status != CANNOT_BE_LOADED:
            return size
    raise rows.Failure("expected the program to run with 512 MiB")


@SUITE.case("little memory")
def _(trial):
    if rows.is_sanitized(trial.bin / "sennet"):
        raise rows.Skip("the address sanitizer needs its memory")
    with InventoryRun(trial, 3000) as run:
        run.new("SMS")
        least = least_memory(run)
        step = rows.MIB // (32 if trial.full else 1)
        limits = [f"--as={size}" for size in range(least, least + 12 * rows.MIB, step)]
        for product in trial.some(PRODUCTS, every=3):
            for what, finished, _ in starved(trial, run, product, [*limits, f"--as={1 << 32}"]):
                if finished.status == 1:
                    rows.expect_equal(finished.err, NO_MEMORY, f"{what}: errors")
    return f"status 0, or 1 with a message; {WHOLE_AS_TOLD}"


if __name__ == "__main__":
    sys.exit(SUITE.main())
