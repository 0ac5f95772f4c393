"""The object manager and the generator as they are installed, in a directory of their own."""

import json
import os
import pathlib
import re
import subprocess
import sys

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE.parent / "cimomd"))
from cimomd_server import SLOWNESS, Server, waited

PATIENCE_S = 60 * SLOWNESS
PRODUCTS = ("SMS", "CA", "LD", "QVE")
# Where the files of each product leave the grammar whatever the inventory holds.
TOLERANCES = {
    "SMS": ["raw-line-ends"],
    "CA": ["raw-line-ends", "plain-backslashes"],
    "LD": ["raw-line-ends", "integers-as-text", "empty-dates"],
    "QVE": ["raw-line-ends"],
}


class Programs:
    """What was built: the programs, the strict reader of MIF files and the shipped inventory."""

    def __init__(self, directory, mif_rows, inventory, schema):
        self.sennet = directory / "sennet"
        self.cimomd = directory / "cimomd"
        self.mif_rows = mif_rows
        self.inventory = inventory
        self.schema = schema

    def scripts(self):
        end = ".script.inv"
        return sorted(file.name[:-len(end)] for file in self.inventory.glob("*" + end))

    def tables(self, file, tolerances):
        """The tables of a MIF file. Raises ValueError with the reason when it is refused."""
        allowed = [word for name in tolerances for word in ("--allow", name)]
        result = subprocess.run([self.mif_rows, *allowed, file], capture_output=True, text=True,
                                timeout=PATIENCE_S, check=False)
        if result.returncode != 0:
            raise ValueError(result.stderr.strip())
        return [json.loads(line) for line in result.stdout.splitlines()]


class Cimomd(Server):
    """The object manager on a Unix socket in `place`; to be used in a with statement."""

    def __init__(self, programs, place, root, own):
        self.socket = place / "cimomd.socket"
        super().__init__(place, programs.cimomd, "--socket", self.socket, "--root", root,
                         "--mof-dir", own)

    def __enter__(self):
        if not waited(self.socket.exists):
            self.end()
            raise RuntimeError("cimomd does not serve: " + self.log())
        return self

    def __exit__(self, *_):
        self.end()

    def complaints(self):
        """What it logged, but for the connections."""
        return [line for line in self.log().splitlines() if "connection from" not in line]


class Run:
    """One run of the generator for a product, and the files it wrote."""

    def __init__(self, programs, product, place, socket, scripts=None):
        self.programs = programs
        self.product = product
        self.mif = place / product / "mif"
        self.sql = place / product / "sql"
        self.mif.parent.mkdir()
        configuration = place / product / "velm.properties"
        scripts = scripts or programs.inventory
        configuration.write_text(f"sennet.directory={scripts}\n"
                                 f"sennet.resources={scripts / 'sennet.properties'}\n")
        self.result = subprocess.run(
            [programs.sennet, "/" + product, self.mif, self.sql], capture_output=True, text=True,
            timeout=PATIENCE_S, check=False,
            env={"VELM_CONFIG": str(configuration), "CIM_LOCAL_SOCKET": str(socket),
                 "CIM_EMBEDDED": "never", "PATH": os.environ["PATH"]})

    def files(self):
        return sorted(self.mif.iterdir())

    def tables(self, file, more_tolerances=()):
        return self.programs.tables(file, [*TOLERANCES[self.product], *more_tolerances])


class Schema:
    """The table that a schema script of QVE creates."""

    def __init__(self, file):
        text = file.read_bytes().decode("ascii")
        self.table = re.search(r"^create table (\S+) \(", text, re.M)[1]
        self.view = re.search(r"^create view (\S+)", text, re.M)[1]
        self.columns = re.findall(r"^   (\S+) varchar2?\(\d+\)", text, re.M)


class Query:
    """The query that a query script of QVE registers."""

    def __init__(self, file):
        text = file.read_bytes().decode("ascii")
        self.shown = re.search(r'qvmkquery -d "([^"]*)"', text)[1]
        self.title = re.search(r'"\$QUERY_LIB" "([^"]*)"', text)[1]
        self.view = re.search(r" -v (\S+) ", text)[1]
        self.columns = re.findall(r"^   -c (\S+) ", text, re.M)


def add_arguments(parser):
    for name in ("programs", "mif-rows", "inventory", "schema", "machines", "examples"):
        parser.add_argument("--" + name, type=pathlib.Path, required=True)


def programs_of(arguments):
    return Programs(*(path.resolve() for path in (
        arguments.programs, arguments.mif_rows, arguments.inventory, arguments.schema)))
