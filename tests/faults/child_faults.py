"""What a private child of the generator gets from it, and what an environment may do."""

import os
import pathlib
import signal
import time

import neighbours
import rows
from neighbours import STRANGER, Generator, Listener
from rows import expect, expect_equal

from cimomd_server import waited

SUITE = rows.Suite(__doc__)
SECRET = "the-value-of-a-variable"


def child_of(program):
    """The cimomd that the running generator has started, or nothing yet."""
    try:
        children = pathlib.Path(f"/proc/{program.pid}/task/{program.pid}/children").read_text()
        for child in map(int, children.split()):
            if os.readlink(f"/proc/{child}/exe").endswith("/cimomd"):
                return child
    except OSError:
        pass
    return None


def is_running(process):
    try:
        return pathlib.Path(f"/proc/{process}/stat").read_text().rsplit(")", 1)[1].split()[0] != "Z"
    except OSError:
        return False


def descriptors_of(process):
    found = {}
    for entry in pathlib.Path(f"/proc/{process}/fd").iterdir():
        try:
            found[int(entry.name)] = os.readlink(entry)
        except FileNotFoundError:
            # Closed meanwhile.
            pass
    return found


def stopped_with_child(generator, **options):
    """The generator, stopped while its child serves, and the child. It is over in a moment, so that
    this may take several attempts."""
    for _ in range(100):
        program = rows.Program(generator.command(), generator.environment(SECRET_WORD=SECRET),
                               **options)
        end_s = time.monotonic() + rows.PATIENCE_S
        while child_of(program) is None and is_running(program.pid):
            expect(time.monotonic() < end_s, "no child was started")
        program.signal(signal.SIGSTOP)
        child = child_of(program)
        if child is not None:
            return program, child
        program.kill()
    raise rows.Failure("no child was seen")


def with_running_child(trial, look):
    """Calls `look` with the stopped generator, its child, and what the generator had inherited."""
    with rows.place() as place:
        generator = Generator(trial, place)
        kept = open(pathlib.Path(place) / "kept open", "w+b")
        inside, outside = os.pipe()
        inherited = {os.readlink(f"/proc/self/fd/{number}")
                     for number in (kept.fileno(), inside, outside)}
        program, child = stopped_with_child(
            generator, pass_fds=(kept.fileno(), inside, outside))
        try:
            look(program, child, inherited)
        finally:
            program.kill()
            kept.close()
            os.close(inside)
            os.close(outside)


def look_at_child(program, child, inherited):
    expect(inherited & set(descriptors_of(program.pid).values()) == inherited,
           "the generator itself did not inherit what it was given")
    environment = pathlib.Path(f"/proc/{child}/environ")
    # It is empty as long as the program is being loaded.
    expect(waited(environment.read_bytes), "the child is never loaded")
    found = descriptors_of(child)
    expect_equal([found.get(number) for number in range(3)], ["/dev/null"] * 3,
                 "the child's standard streams")
    expect(found.get(3, "").startswith("socket:"), f"the child's descriptor 3 is {found.get(3)}")
    expect(not inherited & set(found.values()), f"inherited by the child: {found}")
    expect_equal(environment.read_bytes(), b"PATH=/usr/sbin:/usr/bin:/sbin:/bin\0", "the child's environment")


@SUITE.case("the private child is looked at for what it could have inherited")
def _(trial):
    for _ in trial.repeat(20):
        trial.count()
        with_running_child(trial, look_at_child)
    return "nothing but its connection: no file, pipe, standard stream or variable"


def duplicates_of_sockets(process):
    """Duplicates in this process of the sockets of another one."""
    found = []
    pidfd = os.pidfd_open(process)
    try:
        for number, target in descriptors_of(process).items():
            if target.startswith("socket:"):
                found.append(neighbours.duplicate_of(pidfd, number))
    finally:
        os.close(pidfd)
    return found


def kill_parent(program, child, _):
    # As if another child of the parent had inherited its end, so that the connection stays open.
    held = duplicates_of_sockets(program.pid)
    try:
        expect(held, "the parent has no connection to its child")
        program.signal(signal.SIGKILL)
        expect(waited(lambda: not is_running(child)), "the child outlives its parent")
    finally:
        for descriptor in held:
            os.close(descriptor)


@SUITE.case("the generator is killed while its private child serves")
def _(trial):
    for _ in trial.repeat(50):
        trial.count()
        with_running_child(trial, kill_parent)
    return "the child ends with it, also when somebody else keeps the connection open"


TOOL = pathlib.Path("/usr/bin/dpkg-query")


def tool_that_hangs(directory):
    """A program that writes its process number and never ends."""
    program, trace = directory / "hangs", directory / "trace"
    program.write_text(f"#!/bin/sh\necho $$ >'{trace}.new'\nmv '{trace}.new' '{trace}'\n"
                       "exec sleep 600\n")
    program.chmod(0o755)
    return program, trace


def run_asking_tool(trial, place, end):
    """A run whose child asks the tool, and which `end` ends then. Leaves nothing running."""
    program, trace = tool_that_hangs(place)
    neighbours.mount(str(program), TOOL, "none", neighbours.MS_BIND)
    try:
        generator = Generator(trial, place, script="softwareidentity")
        running = rows.Program(generator.command(), generator.environment())
        tool = None
        try:
            expect(waited(trace.exists), "the tool is never asked")
            tool = int(trace.read_text())
            expect(is_running(tool), "the tool does not hang")
            end(running, child_of(running))
            expect(waited(lambda: not is_running(tool)), "the tool outlives the run")
        finally:
            running.kill()
            if tool and is_running(tool):
                os.kill(tool, signal.SIGKILL)
    finally:
        neighbours.unmount(TOOL)


@SUITE.case("the generator or its child is killed while a package manager's tool hangs")
def _(trial):
    neighbours.need()
    if not TOOL.exists() or not pathlib.Path("/var/lib/dpkg/status").exists():
        raise rows.Skip("there are no packages of Debian")
    ends = (lambda program, _: program.signal(signal.SIGKILL),
            lambda _, child: os.kill(child, signal.SIGKILL))
    for end in ends:
        trial.count()
        with neighbours.place_for_programs() as place:
            run_asking_tool(trial, pathlib.Path(place), end)
    return "the tool ends with them"


def evil_program(directory):
    """Something to be run in the place of cimomd, and the trace that it leaves."""
    program, trace = directory / "evil", directory / "trace"
    program.write_text(f"#!/bin/sh\nid -u >'{trace}'\n")
    program.chmod(0o755)
    return program, trace


def hostile_environment(directory, listener):
    program, _ = evil_program(directory)
    configuration = directory / "evil.properties"
    configuration.write_text(f"sennet.directory={directory}\nmif.directory={directory}\n")
    return {"CIM_COMMAND": str(program), "VELM_CONFIG": str(configuration),
            "TMPDIR": str(directory), "HOME": str(directory), "PATH": str(directory),
            **({"CIM_LOCAL_SOCKET": str(listener.path)} if listener else {})}


@SUITE.case("an unprivileged caller's environment meets a program that runs as root for it")
def _(trial):
    neighbours.need()
    with neighbours.place_for_programs() as place, Listener("/var/tmp/any.socket") as listener:
        directory = pathlib.Path(place)
        if os.statvfs(directory).f_flag & os.ST_NOSUID:
            raise rows.Skip("temporary files cannot be set-user-id here")
        programs = neighbours.public_programs(trial, place)
        program = programs / "sennet"
        options = {"patience_s": 30, **neighbours.stranger_options()}
        directory.chmod(0o777)
        _, trace = evil_program(directory)

        # Without the set-user-id bit it is the caller's own program and does as it is told.
        for chosen in (None, listener):
            trial.count()
            rows.run([program, "/SMS", directory / "out"], hostile_environment(directory, chosen),
                     **options)
        expect_equal(trace.read_text(), f"{STRANGER}\n", "who ran the caller's program")
        trace.unlink()
        before = listener.heard()
        expect(before[0] == 1, f"the caller's server was not asked: {before}")

        program.chmod(0o4755)
        for chosen in (None, listener):
            trial.count()
            finished = rows.run([program, "/SMS", directory / "out"],
                                hostile_environment(directory, chosen), **options)
            expect_equal(finished.status, 0, f"status of {finished}")
        expect(not trace.exists(), "the caller's program ran as another user")
        expect_equal(listener.heard(), before, "what the caller's server heard")
    return "CIM_COMMAND, CIM_LOCAL_SOCKET and VELM_CONFIG are ignored"


@SUITE.case("TMPDIR and HOME lead into another user's directory")
def _(trial):
    neighbours.need()
    with rows.place() as place, rows.place() as foreign:
        trial.count()
        os.chown(foreign, STRANGER, STRANGER)
        generator = Generator(trial, place)
        finished = generator.run(more={"TMPDIR": foreign, "HOME": foreign})
        generator.expect_inventory(finished)
        expect_equal(os.listdir(foreign), [], "what was left in the other user's directory")
        expect_equal(sorted(os.listdir(generator.output)), [neighbours.SCRIPT + ".mif"],
                     "the files of the run")
    return "nothing is written there"


if __name__ == "__main__":
    neighbours.main(SUITE)
