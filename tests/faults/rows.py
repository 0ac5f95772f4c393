"""What the fault suites share: named cases and their table, runs of programs within limits, and
places of their own.

A suite is a program:

    SUITE = rows.Suite("what it is about")

    @SUITE.case("the fault as the table names it")
    def _(trial):
        for size in trial.some(range(1000)):    # a few of them, all of them at full effort
            trial.count()
            rows.expect(seen == wanted, f"size {size}: seen {seen}")
        return "the outcome as the table names it"

    if __name__ == "__main__":
        sys.exit(SUITE.main())
"""

import argparse
import contextlib
import functools
import os
import pathlib
import re
import resource
import select
import signal
import subprocess
import sys
import tempfile
import time
import traceback

MIB = 1 << 20
PATIENCE_S = 60
# The exit status that CTest is told to take for a test that was not tried.
SKIPPED = 77


class Failure(Exception):
    """A program did not do what it promises."""


class Skip(Exception):
    """The case cannot be tried here; the text says why."""


def expect(holds, message):
    if not holds:
        raise Failure(message)


def expect_equal(seen, expected, what):
    expect(seen == expected, f"{what}: expected {expected!r}, seen {seen!r}")


class Trial:
    """One case being tried: how hard, with which programs, and how often so far."""

    def __init__(self, arguments):
        self.bin = arguments.bin
        self.times = arguments.times
        self.seconds = arguments.seconds
        self.full = arguments.full
        self.tried = 0

    def count(self, number=1):
        self.tried += number

    def some(self, items, every=7):
        """All items at full effort, else each `every`th and the last one."""
        items = list(items)
        if self.full or not items:
            return items
        return items[::every] + ([] if (len(items) - 1) % every == 0 else items[-1:])

    def repeat(self, full):
        """Numbers from 0: `full` of them at full effort, else a tenth; --times overrules."""
        return range(self.times or (full if self.full else max(1, full // 10)))

    def run_seconds(self, full, small):
        return self.seconds or (full if self.full else small)


class Suite:
    def __init__(self, title):
        self.title = title
        self._cases = []

    def case(self, fault):
        """Makes a function of a Trial a case. It returns the outcome, or raises Failure or Skip."""
        def add(function):
            self._cases.append((fault, function))
            return function
        return add

    def _arguments(self):
        parser = argparse.ArgumentParser(description=self.title)
        parser.add_argument("--bin", type=pathlib.Path, required=True,
                            help="directory of the built programs")
        parser.add_argument("--times", type=int, help="tries of what can be tried any number of times")
        parser.add_argument("--seconds", type=float, help="duration of what can last any time")
        parser.add_argument("--full", action="store_true", help="full effort: minutes")
        parser.add_argument("--rows", action="store_true", help="print the table's rows at the end")
        parser.add_argument("--no-skip", action="store_true",
                            help="a case that cannot be tried here fails")
        parser.add_argument("--only", type=re.compile, help="pattern of the cases to try")
        return parser.parse_args()

    def main(self):
        """Tries the cases; 1 when one of them failed, or there is none though all were wanted;
        SKIPPED when none of them could be tried."""
        # A suite that is ended takes its programs, places and mounts away.
        signal.signal(signal.SIGTERM, lambda *_: sys.exit(1))
        arguments = self._arguments()
        arguments.bin = arguments.bin.resolve()
        cases = [(fault, function) for fault, function in self._cases
                 if not arguments.only or arguments.only.search(fault)]
        table = []
        failed = skipped = 0
        for fault, function in cases:
            start = time.monotonic()
            trial = Trial(arguments)
            verdict, outcome = _judge(function, trial)
            if verdict == "skip" and arguments.no_skip:
                verdict = "FAIL"
            failed += verdict == "FAIL"
            skipped += verdict == "skip"
            if verdict == "ok" and trial.tried == 0:
                verdict, outcome, failed = "FAIL", "never tried", failed + 1
            print(f"{verdict:4} {fault}: {outcome} ({trial.tried} times, "
                  f"{time.monotonic() - start:.1f} s)", flush=True)
            table.append(f"| {fault} | {trial.tried} | {_cell(verdict, outcome)} |")
        if arguments.rows:
            print("\n".join(table))
        if failed or not (cases or arguments.only):
            return 1
        return SKIPPED if cases and skipped == len(cases) else 0


def _judge(function, trial):
    try:
        return "ok", function(trial)
    except Skip as reason:
        return "skip", str(reason)
    except Failure as failure:
        return "FAIL", str(failure)
    except Exception:  # pylint: disable=broad-except; one broken case must not cost the others
        return "FAIL", traceback.format_exc()


def _cell(verdict, outcome):
    first = outcome.splitlines()[0] if outcome else ""
    text = {"ok": "", "skip": "not tried: ", "FAIL": "FAILED: "}[verdict] + first
    return text.replace("|", "\\|")


class Finished:
    """How a program ended. `status` is the exit status or the negative number of a signal."""

    def __init__(self, status, out, err, seconds, peak_bytes):
        self.status = status
        self.out = out
        self.err = err
        self.seconds = seconds
        self.peak_bytes = peak_bytes

    def __str__(self):
        return (f"status {self.status} after {self.seconds:.1f} s, {self.peak_bytes // MIB} MiB, "
                f"output {self.out[-400:]!r}, errors {self.err[-400:]!r}")


class Program:
    """A program in a process group of its own. Its output goes to files, so that a program that
    nobody reads does not wait."""

    def __init__(self, command, env=None, limits=(), **options):
        """`limits` are options of prlimit(1), such as --nofile=8."""
        self._out = tempfile.TemporaryFile()
        self._err = tempfile.TemporaryFile()
        if limits:
            command = ["prlimit", *limits, "--", *command]
        self._start = time.monotonic()
        options = {"stdin": subprocess.DEVNULL, "stdout": self._out, "stderr": self._err,
                   "start_new_session": True, **options}
        self._child = subprocess.Popen([str(word) for word in command],
                                       env=None if env is None else {**os.environ, **env},
                                       **options)
        self._ended = os.pidfd_open(self._child.pid)
        self._finished = None

    @property
    def pid(self):
        return self._child.pid

    def signal(self, number):
        # Popen would look whether the child has ended, and wait() would find none.
        with contextlib.suppress(ProcessLookupError):
            signal.pidfd_send_signal(self._ended, number)

    def is_running(self):
        return self._finished is None and not select.select([self._ended], [], [], 0)[0]

    def stops(self):
        """Waits until a signal has stopped it, or it has ended; True when stopped."""
        end_s = time.monotonic() + PATIENCE_S
        while self.is_running():
            if os.waitid(os.P_PID, self.pid, os.WSTOPPED | os.WNOHANG | os.WNOWAIT):
                return True
            if time.monotonic() > end_s:
                raise Failure(f"neither stops nor ends: {self.kill()}")
            time.sleep(0.001)
        return False

    def wait(self, patience_s=PATIENCE_S):
        """Finished, or Failure when it did not end in time; it is killed then."""
        if self._finished:
            return self._finished
        ended, _, _ = select.select([self._ended], [], [], patience_s)
        if not ended:
            os.killpg(self._child.pid, signal.SIGKILL)
        _, status, usage = os.wait4(self._child.pid, 0)
        seconds = time.monotonic() - self._start
        self._child.returncode = os.waitstatus_to_exitcode(status)
        os.close(self._ended)
        self._finished = Finished(self._child.returncode, _text(self._out), _text(self._err),
                                  seconds, usage.ru_maxrss * 1024)
        if not ended:
            raise Failure(f"hangs: no end within {patience_s:.0f} s; {self._finished}")
        return self._finished

    def kill(self):
        self.signal(signal.SIGKILL)
        return self.wait()


def _text(file):
    file.seek(0)
    text = file.read().decode(errors="replace")
    file.close()
    return text


def run(command, env=None, limits=(), patience_s=PATIENCE_S, **options):
    return Program(command, env, limits, **options).wait(patience_s)


@functools.lru_cache
def is_sanitized(program):
    """Whether it was built for the address sanitizer, which reserves memory without measure."""
    return b"__asan_init" in pathlib.Path(program).read_bytes()


def expect_memory_below(finished, bytes_limit, program):
    """The peak of the resident memory; under the address sanitizer it says nothing."""
    if not is_sanitized(program):
        expect(finished.peak_bytes < bytes_limit,
               f"memory: expected less than {bytes_limit // MIB} MiB, seen {finished}")


def place():
    """A temporary directory, to be used in a with statement; yields its path as text. In memory
    where that can be: thousands of runs would wait for the disk."""
    memory = "/dev/shm"
    return tempfile.TemporaryDirectory(
        prefix="faults.", dir=memory if os.access(memory, os.W_OK | os.X_OK) else None)


def is_root():
    return os.geteuid() == 0


def no_core_files():
    """Programs that are killed on purpose leave no core files."""
    resource.setrlimit(resource.RLIMIT_CORE, (0, resource.getrlimit(resource.RLIMIT_CORE)[1]))


if __name__ == "__main__":
    sys.exit("this is a module of the suites beside it")
