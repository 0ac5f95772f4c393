#!/usr/bin/env python3
"""Acts as the QVE product on the generator's files: runs the schema scripts on real database
engines, loads the rows of the MIF files by attribute name, and runs the query scripts in bash.

Prints a line for each check; the status is 1 when one failed.

  consumer_test.py --programs DIR --mif-rows FILE --write-case FILE --golden DIR
"""

import argparse
import json
import os
import pathlib
import re
import subprocess
import sys
import tempfile

import dialects
from engines import EngineError, MariaDb, PostgreSql, run

HERE = pathlib.Path(__file__).resolve().parent
LIBRARY = "library one"
DIALECT_FILES = ["%s_schema.sql" % name for name in ("lumo", "ms", "oracle", "sybase")]
SCRIPT_FILES = sorted(DIALECT_FILES + ["queries.sh", "queries_lumo.sh"])


class Report:
    def __init__(self):
        self.count = 0
        self.failures = 0

    def check(self, what, found, expected=True):
        self.count += 1
        good = found == expected
        print("%s %d - %s" % ("ok" if good else "not ok", self.count, what), flush=True)
        if not good:
            self.failures += 1
            print("#    found    %r\n#    expected %r" % (found, expected), flush=True)
        return good


class Inventory:
    """The files of one run, and what the folder's JSON file says about its scripts."""

    def __init__(self, name, directory, report, mif_rows):
        self.name = name
        self.mif = pathlib.Path(directory) / "mif"
        self.sql = pathlib.Path(directory) / "sql"
        self.report = report
        self.mif_rows = mif_rows
        facts = json.loads((HERE / (name + ".json")).read_text())
        written = {match[1] for file in self.sql.glob("*_schema.sql")
                   for match in [re.match(r"kwv_(.*)_[a-z]+_schema\.sql$", file.name)] if match}
        self.unexpected = sorted(written - facts["scripts"].keys())
        self.scripts = {script: fact for script, fact in facts["scripts"].items()
                        if script in written or not fact.get("optional")}

    def text(self, script, suffix):
        return (self.sql / ("kwv_%s_%s" % (script, suffix))).read_bytes().decode("latin-1")

    def check_files(self):
        self.report.check(self.name + ": only known scripts were written", self.unexpected, [])
        self.report.check(self.name + ": the MIF files", sorted(os.listdir(self.mif)),
                          ["kwinvlumo.mif", "kwvinv.mif"])
        names = sorted("kwv_%s_%s" % (script, suffix)
                       for script in self.scripts for suffix in SCRIPT_FILES)
        self.report.check(self.name + ": six files per script", sorted(os.listdir(self.sql)), names)

    def tables(self, dialect):
        """The tables of the dialect's MIF file by name, read to the letter but for raw line ends,
        and for the names that abbreviating made equal where the facts say so."""
        allowed = ["--allow", "raw-line-ends"]
        if dialect.name == "lumo" and any(self.repeated(s, dialect) for s in self.scripts):
            allowed += ["--allow", "repeated-names"]
        result = run([self.mif_rows] + allowed + [str(self.mif / dialect.mif)])
        self.report.check("%s: %s is read strictly" % (self.name, dialect.mif), result.stderr, "")
        tables = [json.loads(line) for line in result.stdout.splitlines()]
        names = ["KWX_" + self.stem(script, dialect) for script in self.scripts]
        self.report.check("%s: the tables of %s" % (self.name, dialect.mif),
                          sorted(table["name"] for table in tables), sorted(names))
        found = {table["name"]: table for table in tables}
        for script, fact in self.scripts.items():
            table = found.get("KWX_" + self.stem(script, dialect))
            if table and "rows" in fact:
                self.report.check("%s: the rows of %s in %s" % (self.name, script, dialect.mif),
                                  table["rows"], fact["rows"])
        return found

    def stem(self, script, dialect):
        fact = self.scripts[script]
        return fact["lumoStem"] if dialect.name == "lumo" else fact["stem"]

    def repeated(self, script, dialect):
        """The column that the schema of a script names twice, or none."""
        return self.scripts[script].get("lumoRepeats") if dialect.name == "lumo" else None


class Consumer:
    """One engine's database of one dialect, as the product would use it."""

    def __init__(self, engine, dialect, inventory):
        self.engine = engine
        self.dialect = dialect
        self.inventory = inventory
        self.report = inventory.report
        self.database = "%s_%s" % (inventory.name, dialect.name)
        self.where = "%s: %s %s" % (inventory.name, engine.name, dialect.name)
        engine.create(self.database)
        engine.must(self.database, dialect.tables())

    def run_schemas(self, again):
        for script in self.inventory.scripts:
            text = self.inventory.text(script, self.dialect.name + "_schema.sql")
            self.first_run(script, text)
            if again and not self.inventory.repeated(script, self.dialect):
                self.report.check("%s: %s runs again" % (self.where, script),
                                  self.engine.errors(self.database, self.dialect.statements(text)),
                                  [])

    def first_run(self, script, text):
        stem = self.inventory.stem(script, self.dialect)
        errors = self.engine.errors(self.database, self.dialect.statements(text))
        repeated = self.inventory.repeated(script, self.dialect)
        if repeated:
            self.report.check("%s: %s is refused for its second column %s"
                              % (self.where, script, repeated),
                              errors[1], self.engine.repeats(repeated))
            return
        self.report.check("%s: %s runs, but for the drops" % (self.where, script), errors,
                          self.engine.missing("KWX_" + stem, "KWX_V" + stem))
        registered = self.engine.must(self.database, "select count(*) from QUERY_VIEWS where"
                                      " VIEW_NAME = 'KWX_V%s'" % stem)
        self.report.check("%s: %s registers its view" % (self.where, script), registered, "1\n")

    def load(self, tables):
        for script in self.inventory.scripts:
            if not self.inventory.repeated(script, self.dialect):
                name = "KWX_" + self.inventory.stem(script, self.dialect)
                if self.report.check("%s: %s has rows" % (self.where, script), name in tables):
                    self.load_table(script, tables[name])

    def load_table(self, script, table):
        where = "%s: %s" % (self.where, script)
        columns = self.engine.columns(self.database, table["name"])
        names = list(self.dialect.keys) + table["columns"]
        same = [self.engine.quoted(name) for name in names]
        if not self.report.check(where + ": the attributes are the columns, in order",
                                 [self.engine.quoted(name) for name, _ in columns], same):
            return
        lengths = [length for _, length in columns]
        keys = [dialects.SYSTEM, "I", "2026-01-31 12:00:00"]
        rows = [keys + row for row in table["rows"]]
        long = [value for row in rows for value, length in zip(row, lengths) if len(value) > length]
        self.report.check(where + ": every value fits", long, [])
        values = ["(%s)" % ", ".join(self.engine.literal(value) for value in row) for row in rows]
        self.engine.must(self.database, "insert into %s (%s) values %s"
                         % (table["name"], ", ".join(same), ", ".join(values)))
        self.report.check(where + ": the view gives the rows of the MIF file back",
                          self.view_rows(script, same), sorted(rows))

    def view_rows(self, script, columns):
        view = "KWX_V" + self.inventory.stem(script, self.dialect)
        selected = self.engine.must(self.database, "select %s from %s" % (
            ", ".join(self.engine.hexadecimal(column) for column in columns), view))
        return sorted([bytes.fromhex(cell).decode("latin-1") for cell in line.split("\t")]
                      for line in selected.split("\n")[:-1])


class Queries:
    """Runs the query scripts of one dialect as an installer does, with the view in MariaDB."""

    def __init__(self, consumer, tables, directory):
        self.consumer = consumer
        self.inventory = consumer.inventory
        self.report = consumer.report
        self.tables = tables
        self.directory = pathlib.Path(directory) / consumer.database
        (self.directory / "tmp").mkdir(parents=True)
        self.log = self.directory / "tmp" / "kwvinstall.log"

    def run_all(self):
        for script in self.inventory.scripts:
            if "KWX_" + self.inventory.stem(script, self.consumer.dialect) not in self.tables:
                continue
            path = self.without_carriage_returns(script)
            where = "%s: %s" % (self.consumer.where, path.name)
            linted = run(["shellcheck", "--shell=bash", "--severity=error", str(path)])
            self.report.check(where + " has no error for shellcheck", linted.stdout + linted.stderr,
                              "")
            self.run_script(script, path, where)

    def without_carriage_returns(self, script):
        name = "kwv_%s_%s" % (script, self.consumer.dialect.queries)
        path = self.directory / name
        path.write_bytes((self.inventory.sql / name).read_bytes().replace(b"\r", b""))
        return path

    def call(self, path, taken):
        self.log.write_text("")
        environment = dict(
            os.environ, PATH="%s:%s" % (HERE, os.environ["PATH"]), QUERY_LIB=LIBRARY,
            DBDIR=str(self.directory), QVE_LIBRARY=LIBRARY, QVE_TAKEN="1" if taken else "",
            QVE_CALLS=str(self.directory / "calls"), QVE_ROWS=str(self.directory / "rows"),
            QVE_SELECT=" ".join(self.consumer.engine.client(self.consumer.database)))
        result = run(["bash", str(path)], env=environment)
        return result.stdout + result.stderr, self.log.read_text()

    def run_script(self, script, path, where):
        fact = self.inventory.scripts[script]
        creating = "Creating query '%s' in %s...\n" % (fact["shown"], LIBRARY)
        exists = "'%s' query already exists.\n" % fact["title"]
        stem = self.inventory.stem(script, self.consumer.dialect)
        asked = stem if self.consumer.dialect.name == "lumo" else fact.get("askedStem", stem)

        console, log = self.call(path, taken=False)
        table = self.tables["KWX_" + stem]
        columns = [column for column in table["columns"] if column != "Row_Index"]
        arguments = ["-d", fact["shown"], "-r", "inventory", "-v", "KWX_V" + asked,
                     "-c", "QVE_OBJECT_LABEL"]
        arguments += [word for column in columns for word in ("-c", column)]
        self.report.check(where + " names the view and its columns",
                          (self.directory / "calls").read_text().split("\n")[:-1],
                          arguments + [LIBRARY, fact["title"]])
        if self.inventory.repeated(script, self.consumer.dialect) or asked != stem:
            self.report.check(where + " takes the missing view for an existing query", console,
                              creating + exists)
            self.report.check(where + " leaves the reason in the log",
                              "KWX_V%s' doesn't exist" % asked in log)
        else:
            self.report.check(where + " says that it creates the query", console, creating)
            self.report.check(where + " writes the same to the log", log, creating)
            # The client escapes line feeds in values; CRs stand as they are.
            rows = (self.directory / "rows").read_bytes().decode("latin-1")
            labels = [line.split("\t")[0] for line in rows.split("\n")[:-1]]
            self.report.check(where + " selects every row", labels,
                              [dialects.LABEL] * len(table["rows"]))

        console, log = self.call(path, taken=True)
        self.report.check(where + " says that the query exists", console, creating + exists)
        self.report.check(where + " keeps the errors of the command", log,
                          creating + "qvmkquery: the library has a query of this name\n")


def consume(inventories, scratch):
    read = {}
    for inventory in inventories:
        inventory.check_files()
        for dialect in (dialects.LUMO, dialects.SYBASE):
            read[inventory.name, dialect.mif] = inventory.tables(dialect)

    plan = [(MariaDb, [dialects.LUMO, dialects.SYBASE, dialects.MS, dialects.ORACLE]),
            (PostgreSql, [dialects.LUMO, dialects.SYBASE])]
    for make, families in plan:
        with tempfile.TemporaryDirectory(dir=scratch) as directory, make(directory) as engine:
            for inventory in inventories:
                for dialect in families:
                    tables = read[inventory.name, dialect.mif]
                    consumer = Consumer(engine, dialect, inventory)
                    consumer.run_schemas(again=make is MariaDb)
                    consumer.load(tables)
                    if make is MariaDb:
                        Queries(consumer, tables, scratch).run_all()


def write_inventories(arguments, scratch, report):
    machine = pathlib.Path(scratch) / "machine"
    environment = {"PATH": os.environ["PATH"],
                   "VELM_CONFIG": str(arguments.programs.parent / "etc" / "velm.properties")}
    made = run([str(arguments.programs / "sennet"), "/QVE", str(machine / "mif"),
                str(machine / "sql")], env=environment, cwd=scratch)
    report.check("machine: the generator runs", (made.returncode, made.stderr), (0, ""))
    inventories = [Inventory("machine", machine, report, arguments.mif_rows)]

    for case in (arguments.golden / "workstation", HERE / "office"):
        name = case.name
        directory = pathlib.Path(scratch) / name
        made = run([arguments.write_case, str(case), str(directory)])
        report.check(name + ": the generator runs", (made.returncode, made.stderr), (0, ""))
        inventories.append(Inventory(name, directory, report, arguments.mif_rows))
    return inventories


def main():
    parser = argparse.ArgumentParser(description=__doc__.split("\n\n")[0])
    parser.add_argument("--programs", type=pathlib.Path, required=True)
    parser.add_argument("--mif-rows", required=True)
    parser.add_argument("--write-case", required=True)
    parser.add_argument("--golden", type=pathlib.Path, required=True)
    arguments = parser.parse_args()
    report = Report()
    with tempfile.TemporaryDirectory(prefix="qve-") as scratch:
        os.chmod(scratch, 0o755)
        try:
            consume(write_inventories(arguments, scratch, report), scratch)
        except (EngineError, OSError, subprocess.SubprocessError) as error:
            report.check("the engines and files could be used: %s" % error, False)
    print("1..%d" % report.count)
    return 1 if report.failures else 0


if __name__ == "__main__":
    sys.exit(main())
