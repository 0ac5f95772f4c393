"""The names that the shipped scripts lead to in the files of every product: none is there twice,
none is a word that a database keeps for itself, and queries find the tables that are made."""

import argparse
import json
import pathlib
import re
import sys
import tempfile
import unittest

import installation

PROGRAMS = None

# Words that Oracle, SQL Server, Sybase or MySQL and its kin take for their own where a column's
# name stands.
RESERVED = set("""
    access accessible add all alter analyze and any as asc asensitive audit authorization backup
    before begin between bigint binary blob body both break browse bulk by call cascade case change
    char character check checkpoint close cluster clustered coalesce collate column comment commit
    compress compute condition confirm connect constraint contains containstable continue controlrow
    convert create cross current cursor database databases date dbcc deallocate dec decimal declare
    default delayed delete deny desc describe deterministic disk distinct distinctrow distributed
    div double drop dual dummy dump each else elseif elsif enclosed end errlvl errordata errorexit
    escape escaped except exclusive exec execute exists exit explain external false fetch file
    fillfactor float for force foreign freetext from full fulltext function general get goto grant
    group groups having high_priority holdlock identified identity if ignore immediate in increment
    index infile initial inner inout insensitive insert int integer intersect interval into is
    iterate join key keys kill leading leave left level like limit linear lineno lines load
    localtime lock long loop low_priority match maxextents maxvalue merge minus mirror mirrorexit
    mlslabel mod mode modifies modify national natural noaudit nocheck nocompress nonclustered not
    nowait null nullif number numeric of off offline offsets on once online open optimize option
    optionally or order others out outer outfile over package partition pctfree percent permanent
    pivot plan precision prepare primary print prior privileges proc procedure processexit proxy
    public purge raise raiserror range rank raw read reads readtext real reconfigure references
    regexp release rename repeat replace replication require resignal resource restore restrict
    return revert revoke right rlike rollback row rowcount rowguidcol rowid rownum rows rowtype rule
    save schema schemas select sensitive separator session set setuser share show shutdown signal
    size smallint some spatial specific sql ssl start starting statistics stored straight_join
    stripe successful synonym sysdate system table tablesample temp temporary terminated textsize
    then tinyblob tinyint to top trailing tran transaction trigger true truncate tsequal uid undo
    union unique unlock unpivot unsigned update updatetext usage use user using validate values
    varbinary varchar varchar2 varying view virtual waitfor when whenever where while window with
    work write writetext xor
""".split())


def schema_text():
    return "\n".join(file.read_text() for file in sorted(PROGRAMS.schema.glob("*.mof")))


def keys_of(text, class_name):
    """Name and type of each key, those of the superclasses first."""
    head = re.search(rf"class {class_name}(?:\s*:\s*(\w+))?\s*\{{(.*?)\n\}};", text, re.S)
    inherited = keys_of(text, head[1]) if head[1] else []
    declared = [(name, kind) for kind, name in
                re.findall(r"\[Key,[^]]*\]\s*(\w+)\s+(\w+);", re.sub(r'"[^"]*"', "", head[2]))]
    return [key for key in inherited if key not in declared] + declared


def instance_of(text, class_name):
    """An instance of nothing but its keys."""
    values = {"string": '"one"', "uint16": "3", "datetime": '"20240229120000.000000+000"'}
    keys = "".join(f" {name} = {values[kind]};" for name, kind in keys_of(text, class_name))
    return f"instance of {class_name} {{{keys} }};\n"


def class_of(script):
    text = (PROGRAMS.inventory / f"{script}.script.inv").read_text()
    return re.search(r"^G\[0\]=(\w+)$", text, re.M)[1]


def twice(names):
    """Importers and databases take names that differ in case for the same."""
    lower = [name.lower() for name in names]
    return sorted({name for name in lower if lower.count(name) > 1})


class NamesTest(unittest.TestCase):
    """On a machine that has one of everything, as administrators can declare it; hardly anything
    is to be read there."""

    @classmethod
    def setUpClass(cls):
        directory = tempfile.TemporaryDirectory(prefix="inventory-names-")
        cls.addClassCleanup(directory.cleanup)
        place = pathlib.Path(directory.name)
        (place / "own").mkdir()
        for name in ("sys/class/net", "sys/devices/system/cpu", "proc/self"):
            (place / "root" / name).mkdir(parents=True)
        for name in ("proc/self/mountinfo", "proc/cpuinfo"):
            (place / "root" / name).touch()
        text = schema_text()
        (place / "own" / "everything.mof").write_text(
            "".join(instance_of(text, class_of(script)) for script in PROGRAMS.scripts()))
        with installation.Cimomd(PROGRAMS, place, place / "root", place / "own") as server:
            cls.complaints = server.complaints()
            cls.runs = {product: installation.Run(PROGRAMS, product, place, server.socket)
                        for product in installation.PRODUCTS}

    def test_the_runs_end_well(self):
        self.assertEqual(self.complaints, [])
        for run in self.runs.values():
            self.assertEqual((run.result.returncode, run.result.stderr), (0, ""))
            self.assertNotIn("Deleting", run.result.stdout)

    def tables(self, product, file):
        # Of these instances nothing but the keys is known, the words for numbers neither.
        return self.runs[product].tables(file, ["integers-as-text"])

    def check_tables(self, tables, expected_count):
        self.assertEqual(len(tables), expected_count)
        self.assertEqual(twice([table["name"] for table in tables]), [])
        for table in tables:
            self.assertEqual(twice(table["columns"]), [], table["name"])

    def test_each_script_has_a_file_for_sms_and_landesk(self):
        for product in ("SMS", "LD"):
            files = self.runs[product].files()
            self.assertEqual([file.name for file in files],
                             [script + ".mif" for script in PROGRAMS.scripts()])
            tables = [table for file in files for table in self.tables(product, file)]
            self.check_tables(tables, len(files))

    def test_each_script_has_a_group_for_ca(self):
        files = self.runs["CA"].files()
        self.assertEqual([file.name for file in files], ["kwvinv.mif"])
        # An instance more of what every machine has is a group more of the same kind.
        groups = {json.dumps([group["name"], group["columns"]]): group
                  for group in self.tables("CA", files[0])}
        self.check_tables(list(groups.values()), len(PROGRAMS.scripts()))

    def test_each_script_has_a_table_for_qve(self):
        files = self.runs["QVE"].files()
        self.assertEqual([file.name for file in files], ["kwinvlumo.mif", "kwvinv.mif"])
        for file in files:
            self.check_tables(self.tables("QVE", file), len(PROGRAMS.scripts()))

    def schemas(self, dialect):
        return {script: installation.Schema(
                    self.runs["QVE"].sql / f"kwv_{script}_{dialect}_schema.sql")
                for script in PROGRAMS.scripts()}

    def queries(self, end):
        return {script: installation.Query(self.runs["QVE"].sql / f"kwv_{script}_{end}")
                for script in PROGRAMS.scripts()}

    def test_the_databases_get_names_they_can_take(self):
        for dialect, longest in (("lumo", 18), ("sybase", 30), ("ms", 30), ("oracle", 30)):
            schemas = self.schemas(dialect)
            for kind in ("table", "view"):
                self.assertEqual(twice(getattr(schema, kind) for schema in schemas.values()), [])
            for script, schema in schemas.items():
                with self.subTest(dialect=dialect, script=script):
                    self.assertEqual(twice(schema.columns), [])
                    self.assertGreater(len(schema.columns), 4)
                    for name in [schema.table, schema.view, *schema.columns[4:]]:
                        self.assertRegex(name, r"\A[A-Za-z]\w*\Z")
                        self.assertLessEqual(len(name), longest + 5)
                        self.assertNotIn(name.lower(), RESERVED)

    def test_the_databases_get_the_columns_of_the_files(self):
        for file, dialect in (("kwinvlumo.mif", "lumo"), ("kwvinv.mif", "oracle")):
            found = {table["name"]: table["columns"]
                     for table in self.tables("QVE", self.runs["QVE"].mif / file)}
            made = {schema.table: schema.columns[3:]
                    for schema in self.schemas(dialect).values()}
            self.assertEqual(found, made)

    def test_queries_ask_for_the_views_that_are_made(self):
        for end, dialects in (("queries_lumo.sh", ["lumo"]),
                              ("queries.sh", ["sybase", "ms", "oracle"])):
            queries = self.queries(end)
            self.assertEqual(twice(query.title for query in queries.values()), [])
            self.assertEqual(twice(query.shown for query in queries.values()), [])
            for dialect in dialects:
                for script, schema in self.schemas(dialect).items():
                    query = queries[script]
                    self.assertEqual(query.view, schema.view)
                    self.assertEqual(query.columns, ["QVE_OBJECT_LABEL", *schema.columns[4:]])


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    known, rest = parser.parse_known_args()
    PROGRAMS = installation.programs_of(known)
    unittest.main(argv=[sys.argv[0], *rest])
