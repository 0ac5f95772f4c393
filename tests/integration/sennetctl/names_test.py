"""Column names that collide, and titles: `sennetctl check` tells those, and only those, of which
readers of MIF files or databases refuse what sennet writes."""

import argparse
import json
import os
import pathlib
import re
import sqlite3
import subprocess
import sys
import tempfile
import unittest

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE.parent / "inventory"))
import installation

ARGUMENTS = None
SCRIPT = """[DEFAULT]
title=Disks

[CIM]
G[0]=CIM_DiskDrive
N[0]=root/cimv2
A[0]=DeviceID,Name
"""
PROFILES = {"SMS": "sms", "CA": "ca", "LD": "landesk", "QVE": "dmi"}
DIALECTS = ("oracle", "ms", "sybase", "lumo")


class Outcome:
    """What comes of the script with a title and a name for each of its two columns."""

    def __init__(self, server, place, first, second, title="Disks"):
        self.place = place
        self.inventory = place / "inventory"
        self.inventory.mkdir()
        (self.inventory / "one.script.inv").write_text(
            SCRIPT.replace("Disks", title), encoding="utf-8")
        (self.inventory / "sennet.properties").write_text(
            f"title.Disks=Disks\nCIM_DiskDrive.DeviceID={first}\nCIM_DiskDrive.Name={second}\n")
        self.socket = server.socket
        self.sennetctl = ARGUMENTS.programs.resolve() / "sennetctl"
        self.runs = {product: installation.Run(installation.programs_of(ARGUMENTS), product, place,
                                               server.socket, self.inventory)
                     for product in installation.PRODUCTS}

    def told(self):
        """The errors and warnings of check: line, column, severity and message."""
        result = subprocess.run(
            [self.sennetctl, "check", "--json"], capture_output=True, text=True, timeout=60,
            check=False, env={"CIM_LOCAL_SOCKET": str(self.socket), "PATH": os.environ["PATH"],
                              "VELM_CONFIG": str(self.place / "SMS" / "velm.properties")})
        return [(each["line"], each["column"], each["severity"], each["message"])
                for each in json.loads(result.stdout)["findings"] if each["severity"] != "note"]

    def refused_files(self):
        """The products of which the strict reader refuses a file for a repeated name."""
        return {product for product, run in self.runs.items()
                if any(self.is_refused(product, run, file) for file in run.files())}

    def is_refused(self, product, run, file):
        """Both the strict reader and the check of MIF files have to say so."""
        reason = "second attribute of this name in the group"
        try:
            run.tables(file)
            refused = False
        except ValueError as error:
            refused = reason in str(error)
        checked = self.checked(product, file)
        assert refused == (reason in checked), checked
        return refused

    def refusing_profiles(self):
        """The products for whose file the check of MIF files has an error."""
        return {product for product, run in self.runs.items()
                if any(": error: " in self.checked(product, file) for file in run.files())}

    @staticmethod
    def checked(product, file):
        return subprocess.run(
            [ARGUMENTS.programs.resolve() / "sennetctl", "mif", "check", "--profile",
             PROFILES[product], file],
            capture_output=True, text=True, timeout=60, check=False).stdout

    def refused_schemas(self):
        """The dialects whose table a database refuses for a repeated name."""
        return {dialect for dialect in DIALECTS
                if "duplicate column name" in self.refusal_of(dialect)}

    def broken_schemas(self):
        """The dialects whose table a database refuses for another reason."""
        return {dialect for dialect in DIALECTS
                if self.refusal_of(dialect)} - self.refused_schemas()

    def refusal_of(self, dialect):
        text = (self.runs["QVE"].sql / f"kwv_one_{dialect}_schema.sql").read_text("ascii")
        create = re.search(r"^create table .*?\) *;?$", text, re.M | re.S)[0]
        database = sqlite3.connect(":memory:")
        try:
            database.execute(create)
        except sqlite3.Error as error:
            return str(error)
        finally:
            database.close()
        return ""

    def run_query_script(self):
        """Runs the query script. Returns its status and what it has to complain of."""
        (self.place / "tmp").mkdir()
        command = self.place / "qvmkquery"
        command.write_text("#!/bin/sh\n")
        command.chmod(0o755)
        script = (self.runs["QVE"].sql / "kwv_one_queries.sh").read_text("ascii")
        result = subprocess.run(
            ["bash", "-c", script.replace("\r", "")], capture_output=True, text=True, timeout=60,
            check=False, cwd=self.place,
            env={"PATH": f"{self.place}:{os.environ['PATH']}", "QUERY_LIB": "library",
                 "DBDIR": str(self.place)})
        return result.returncode, result.stderr


class NamesTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        place = pathlib.Path(cls.enterClassContext(
            tempfile.TemporaryDirectory(prefix="sennet-names-")))
        (place / "mof.d").mkdir()
        cls.server = cls.enterClassContext(installation.Cimomd(
            installation.programs_of(ARGUMENTS), place, ARGUMENTS.machines.resolve() / "server",
            place / "mof.d"))

    def outcome(self, first, second, title="Disks"):
        return Outcome(self.server, self.fresh_place(), first, second, title)

    def fresh_place(self):
        return pathlib.Path(self.enterContext(
            tempfile.TemporaryDirectory(prefix="sennet-names-")))

    def test_names_without_fault(self):
        for names in (("ID", "Name"), ("ID", "INDEX")):
            with self.subTest(names=names):
                outcome = self.outcome(*names)
                self.assertEqual(outcome.told(), [])
                self.assertEqual(outcome.refused_files(), set())
                self.assertEqual(outcome.refused_schemas(), set())

    def test_the_name_of_the_numbers_of_rows(self):
        outcome = self.outcome("ID", "Index")
        (*place, message), = outcome.told()
        self.assertEqual(place, [7, 15, "error"])
        self.assertIn("the name Index is that of the numbers of rows", message)
        self.assertEqual(outcome.refused_files(), {"SMS", "CA", "LD"})
        self.assertEqual(outcome.refused_schemas(), set())

    def test_the_name_of_the_numbers_of_rows_of_qve(self):
        outcome = self.outcome("ID", "Row Index")
        (*place, message), = outcome.told()
        self.assertEqual(place, [7, 15, "error"])
        self.assertIn("each table of QVE has a column Row_Index already", message)
        self.assertEqual(outcome.refused_files(), {"QVE"})
        self.assertEqual(outcome.refused_schemas(), set(DIALECTS))

    def test_other_names_that_qve_has(self):
        for name, products, dialects in (
                ("config change time", ("QVE", "QVE with Lumo"), set(DIALECTS)),
                ("CFG CHG TYPE", ("QVE with Lumo",), {"lumo"})):
            with self.subTest(name=name):
                outcome = self.outcome("ID", name)
                told = outcome.told()
                self.assertEqual(len(told), len(products), told)
                for product, (*place, message) in zip(products, told):
                    self.assertEqual(place, [7, 15, "error"])
                    self.assertIn(f"each table of {product} has a column ", message)
                self.assertEqual(outcome.refused_files(), set())
                self.assertEqual(outcome.refused_schemas(), dialects)

    def test_names_that_differ_in_case_only(self):
        outcome = self.outcome("Unit", "UNIT")
        self.assertEqual({tuple(place) for *place, _ in outcome.told()}, {(7, 15, "warning")})
        self.assertTrue(any("differ in case only: for QVE the table has one twice" in message
                            for *_, message in outcome.told()))
        self.assertEqual(outcome.refused_files(), set())
        self.assertEqual(outcome.refused_schemas(), set(DIALECTS))

    def test_one_name_twice_is_numbered(self):
        outcome = self.outcome("Unit", "Unit")
        (*_, message), = outcome.told()
        self.assertIn("two columns are called Unit: for all products this one becomes Unit3",
                      message)
        self.assertEqual(outcome.refused_files(), set())
        self.assertEqual(outcome.refused_schemas(), set())

    def test_titles_that_readers_refuse(self):
        for title, part, products in (
                ("Plain (2)", None, set()),
                ("Back\\slash", "cannot be read but by CA", {"SMS", "LD", "QVE"}),
                ("End\\", "begins an escape: the MIF file cannot be read", set(PROFILES)),
                ("L\u00fcfter", "letters beyond ASCII", {"SMS"}),
                ("\u20ac", "letters beyond ASCII", {"SMS", "QVE"}),
                ("architecture", "Configuration Manager's own", {"SMS"}),
                ("a|Identification", "Configuration Manager's own", {"SMS"})):
            with self.subTest(title=title):
                outcome = self.outcome("ID", "Name", title)
                errors = [message for *_, severity, message in outcome.told()
                          if severity == "error"]
                self.assertEqual(len(errors), 1 if part else 0, errors)
                self.assertIn(part or "", "".join(errors))
                self.assertEqual(outcome.refusing_profiles(), products)

    def test_a_column_that_readers_refuse(self):
        outcome = self.outcome("ID", "Sel\\\\x")
        (*place, message), = outcome.told()
        self.assertEqual(place, [7, 15, "error"])
        self.assertIn("the name Sel\\x has a backslash", message)
        self.assertEqual(outcome.refusing_profiles(), {"SMS", "LD", "QVE"})

    def test_names_that_databases_refuse(self):
        for title, name, part in (("Disk_Drives 2", "Free (MB)", None),
                                  ("Wi-Fi", "Name", "the title Wi-Fi has characters besides"),
                                  ("a;b", "Name", "the title a;b has characters besides"),
                                  ("a.b", "Name", "the title a.b has characters besides"),
                                  ("Disks", "Free %", "the name Free % has characters besides"),
                                  ("Disks", "1st", "the name 1st begins with a digit")):
            with self.subTest(title=title, name=name):
                outcome = self.outcome("ID", name, title)
                told = outcome.told()
                self.assertEqual([severity for *_, severity, _ in told],
                                 ["warning"] if part else [])
                self.assertIn(part or "", "".join(message for *_, message in told))
                self.assertEqual(outcome.broken_schemas(), set(DIALECTS) if part else set())

    def test_words_of_sql(self):
        told = "is a word of SQL: for QVE some databases refuse the table"
        for words, refused in (
                (("Order", "Group"), True), (("Table", "Values"), True), (("Select", "From"), True),
                (("Where", "Check"), True), (("Default", "References"), True),
                (("Primary", "Unique"), True), (("User", "Number"), False)):
            with self.subTest(words=words):
                outcome = self.outcome(*words)
                self.assertEqual(outcome.told(), [
                    (7, 6, "warning", f"the name {words[0]} {told}"),
                    (7, 15, "warning", f"the name {words[1]} {told}")])
                self.assertEqual(outcome.broken_schemas(), set(DIALECTS) if refused else set())
                for word in words if refused else ():
                    with self.assertRaisesRegex(sqlite3.Error, f'near "{word}": syntax error'):
                        sqlite3.connect(":memory:").execute(f"create table t ({word} varchar(9))")

    def test_words_that_qve_writes_otherwise(self):
        outcome = self.outcome("Level", "Size")
        self.assertEqual(outcome.told(), [])
        self.assertEqual(outcome.broken_schemas(), set())
        text = (outcome.runs["QVE"].sql / "kwv_one_ms_schema.sql").read_text("ascii")
        self.assertRegex(text, r"(?s) level_ varchar.* siz_ varchar")

    def test_a_title_that_the_shell_runs(self):
        outcome = self.outcome("ID", "Name", "x$(touch run)")
        self.assertTrue(any(severity == "error" and "the shell replaces it" in message
                            for *_, severity, message in outcome.told()))
        outcome.run_query_script()
        self.assertTrue((outcome.place / "run").exists())

    def test_titles_that_the_shell_leaves_alone(self):
        for title in ("Disk Drives", "Drives_2"):
            with self.subTest(title=title):
                outcome = self.outcome("ID", "Name", title)
                self.assertEqual(outcome.told(), [])
                self.assertEqual(outcome.run_query_script(), (0, ""))

    def test_two_titles_that_are_one_table(self):
        outcome = self.outcome("ID", "Name", "A B")
        (outcome.inventory / "two.script.inv").write_text(SCRIPT.replace("Disks", "A_B"))
        (*_, message), = outcome.told()
        self.assertIn("has the title A_B, too: for QVE both are one SQL table and view", message)
        run = installation.Run(installation.programs_of(ARGUMENTS), "QVE", self.fresh_place(),
                               self.server.socket, outcome.inventory)
        self.assertEqual({installation.Schema(file).table
                          for file in run.sql.glob("*_ms_schema.sql")}, {"KWX_A_B"})
        self.assertEqual(len(list(run.sql.glob("*_ms_schema.sql"))), 2)
        text = (run.mif / "kwvinv.mif").read_text("ascii")
        self.assertEqual(set(re.findall(r'Class = "(.*)"', text)),
                         {"Corvane-Velt|KWX MIF A B|001", "Corvane-Velt|KWX MIF A_B|001"})


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    ARGUMENTS, rest = parser.parse_known_args()
    unittest.main(argv=[sys.argv[0], *rest])
