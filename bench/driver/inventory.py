"""A synthetic inventory: its server, the programs that read it, and whether they got all of it."""

import contextlib
import dataclasses
import os
import shutil
import subprocess

import cost


@dataclasses.dataclass(frozen=True)
class Inventory:
    classes: int
    properties: int
    instances: int

    def __str__(self):
        shape = f"{self.instances:,} instances of {self.properties} properties"
        return shape if self.classes == 1 else f"{self.classes:,} scripts of {shape}"

    def values(self):
        return self.classes * self.properties * self.instances

    def class_names(self):
        return [f"Bench_Device{number:03}" for number in range(self.classes)]


@contextlib.contextmanager
def served(programs, inventory, directory):
    """Runs the server; gives the environment that makes clients use it and its scripts."""
    scripts = os.path.join(directory, "scripts")
    socket = os.path.join(directory, "socket")
    os.mkdir(scripts)
    server = subprocess.Popen(
        [os.path.join(programs, "synthetic-server"), socket, scripts, str(inventory.classes),
         str(inventory.properties), str(inventory.instances)], stdout=subprocess.PIPE, text=True)
    try:
        if server.stdout.readline() != "ready\n":
            raise cost.Failure("the server of the synthetic inventory does not start")
        configuration = os.path.join(directory, "velm.properties")
        with open(configuration, "w", encoding="utf-8") as file:
            file.write(f"sennet.directory={scripts}\n"
                       f"sennet.resources={scripts}/sennet.properties\n")
        yield {"CIM_LOCAL_SOCKET": socket, "CIM_EMBEDDED": "never", "VELM_CONFIG": configuration}
    finally:
        server.kill()
        server.wait()
        server.stdout.close()
        os.unlink(socket)
        shutil.rmtree(scripts)


def expect(what, found, expected):
    if found != expected:
        raise cost.Failure(f"{what}: {found} instead of {expected}")


def count_starts(path, *starts):
    """How many lines of the file begin with each of the texts, blanks left out."""
    counts = [0] * len(starts)
    with open(path, "rb") as file:
        for line in file:
            line = line.lstrip()
            for i, start in enumerate(starts):
                counts[i] += line.startswith(start)
    return counts


def expect_mif(path, groups, attributes, rows):
    expect(os.path.basename(path),
           count_starts(path, b"Start Group", b"Start Attribute", b"{ ", b"End Component"),
           [groups, groups * attributes, rows, 1])


@dataclasses.dataclass(frozen=True)
class Task:
    """A program that reads the whole inventory."""

    name: str
    command: tuple
    check: object  # called with what the program printed and the directory of its output


def check_floor(inventory):
    seen = set()

    def check(printed, _output):
        # Both ways read the same bytes, and no instance is shorter than its property tags.
        seen.add(printed)
        expect("different sizes of one answer", len(seen), 1)
        size = int(printed.split()[0])
        if size < inventory.values() * 60:
            raise cost.Failure(f"the answers have only {size} bytes")
    return check


def check_fetch(inventory):
    def check(printed, _output):
        expect("fetch", printed, f"{inventory.classes * inventory.instances} instances\n")
    return check


def check_rows(inventory):
    """A file for each class, with a row for each instance."""
    def check(_printed, output):
        names = inventory.class_names()
        expect("files", sorted(os.listdir(output + "/mif")), [f"{name}.mif" for name in names])
        for name in names:
            expect_mif(f"{output}/mif/{name}.mif", 1, inventory.properties + 1, inventory.instances)
    return check


def check_groups(inventory):
    """A group for each instance in one file."""
    def check(_printed, output):
        expect_mif(output + "/mif/kwvinv.mif", inventory.classes * inventory.instances,
                   inventory.properties + 1, 0)
    return check


def check_database(inventory):
    """Two files with a row for each instance, and a column for each property in every schema."""
    def check(_printed, output):
        for name in ("kwvinv.mif", "kwinvlumo.mif"):
            expect_mif(f"{output}/mif/{name}", inventory.classes, inventory.properties + 1,
                       inventory.classes * inventory.instances)
        expect("SQL files", len(os.listdir(output + "/sql")), 6 * inventory.classes)
        for name in inventory.class_names():
            for database in ("lumo", "ms", "oracle", "sybase"):
                with open(f"{output}/sql/kwv_{name}_{database}_schema.sql", "rb") as file:
                    table = file.read().split(b"create table ")[1].split(b" );")[0]
                # Beside the properties: the computer, kind and time of the change, the row.
                expect(f"columns for {database}", table.count(b" varchar"),
                       inventory.properties + 4)
    return check


def make_tasks(programs, inventory, output):
    names = inventory.class_names()
    floor_check = check_floor(inventory)

    def program(name, *arguments):
        return (os.path.join(programs, name), *arguments)

    def sennet(option, check):
        return Task(f"sennet {option}",
                    program("sennet", option, output + "/mif", output + "/sql"), check(inventory))

    return [
        Task("floor-copy", program("floor", "copy", *names), floor_check),
        Task("floor-parse", program("floor", "parse", *names), floor_check),
        Task("fetch", program("fetch", *names), check_fetch(inventory)),
        sennet("/SMS", check_rows),
        sennet("/LD", check_rows),
        sennet("/CA", check_groups),
        sennet("/QVE", check_database),
    ]


def compare(programs, inventory, turns, directory):
    """The costs of every task, turn by turn."""
    output = os.path.join(directory, "output")
    tasks = make_tasks(programs, inventory, output)
    costs = {task.name: [] for task in tasks}
    with served(programs, inventory, directory) as environment:
        for turn in range(turns):
            for task in tasks:
                os.mkdir(output)
                taken, printed = cost.run(os.path.join(programs, "measure"), task.command,
                                          environment, directory)
                if turn == 0:
                    task.check(printed, output)
                costs[task.name].append(taken)
                shutil.rmtree(output)
    return costs
