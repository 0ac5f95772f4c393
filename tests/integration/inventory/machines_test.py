"""The shipped scripts on the recorded machines: which files there are for which product, that they
are MIF to the letter, that the products get the same values, and what some rows say."""

import argparse
import pathlib
import re
import sys
import tempfile
import unittest

import installation
from machine_rows import ROWS, SCRIPTS

PROGRAMS = None
MACHINES = None
# Configuration Manager refuses larger files unless the site allows them.
MAX_SMS_FILE = 250 * 1024


def words_of(schema, class_name):
    """The names of the properties of a class that have a list of words."""
    head = re.search(rf"class {class_name}(?:\s*:\s*(\w+))?\s*\{{(.*?)\n\}};", schema, re.S)
    inherited = words_of(schema, head[1]) if head[1] else set()
    body = re.sub(r'"[^"]*"', "", head[2])
    return inherited | set(re.findall(r"Values[ \n]*\{[^]]*\]\s*u?s?int\d+ (\w+)", body))


class MachinesTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        directory = tempfile.TemporaryDirectory(prefix="inventory-machines-")
        cls.addClassCleanup(directory.cleanup)
        cls.runs = {machine: cls.run_all(pathlib.Path(directory.name) / machine, machine)
                    for machine in SCRIPTS}

    @classmethod
    def run_all(cls, place, machine):
        (place / "own").mkdir(parents=True)
        with installation.Cimomd(PROGRAMS, place, MACHINES / machine, place / "own") as server:
            return {product: installation.Run(PROGRAMS, product, place, server.socket)
                    for product in installation.PRODUCTS}

    def check_each_run(self, check, *products):
        for machine, runs in self.runs.items():
            for product in products:
                with self.subTest(machine=machine, product=product):
                    check(machine, runs[product])

    def table(self, machine, product, script):
        run = self.runs[machine][product]
        tables = run.tables(run.mif / f"{script}.mif")
        self.assertEqual(len(tables), 1)
        table = tables[0]
        table["rows"].sort(key=lambda row: int(row[0]))
        return table

    def test_every_run_ends_well(self):
        def check(_machine, run):
            self.assertEqual((run.result.returncode, run.result.stderr), (0, ""))

        self.check_each_run(check, *installation.PRODUCTS)

    def test_sms_and_landesk_get_a_file_for_what_is_there(self):
        def check(machine, run):
            self.assertEqual([file.name for file in run.files()],
                             [script + ".mif" for script in SCRIPTS[machine]])

        self.check_each_run(check, "SMS", "LD")

    def test_ca_gets_all_in_one_file(self):
        def check(machine, run):
            self.assertEqual([file.name for file in run.files()], ["kwvinv.mif"])
            groups = run.tables(run.files()[0])
            self.assertEqual(groups, self.groups_like_sms(machine))

        self.check_each_run(check, "CA")

    def groups_like_sms(self, machine):
        return [{"name": table["name"], "columns": table["columns"], "rows": [row]}
                for script in SCRIPTS[machine]
                for table in [self.table(machine, "SMS", script)] for row in table["rows"]]

    def test_qve_gets_two_files_and_six_scripts_for_each_table(self):
        def check(machine, run):
            for file in run.files():
                self.assertEqual(len(run.tables(file)), len(SCRIPTS[machine]), file.name)
            self.assertEqual([file.name for file in run.files()], ["kwinvlumo.mif", "kwvinv.mif"])
            ends = ["lumo_schema.sql", "ms_schema.sql", "oracle_schema.sql", "queries.sh",
                    "queries_lumo.sh", "sybase_schema.sql"]
            self.assertEqual(sorted(file.name for file in run.sql.iterdir()),
                             sorted(f"kwv_{script}_{end}"
                                    for script in SCRIPTS[machine] for end in ends))

        self.check_each_run(check, "QVE")

    def test_every_file_of_sms_is_small_enough_and_like_that_of_landesk(self):
        def check(machine, run):
            for script in SCRIPTS[machine]:
                self.assertLess((run.mif / f"{script}.mif").stat().st_size, MAX_SMS_FILE)
                self.assertEqual(self.table(machine, "SMS", script),
                                 self.table(machine, "LD", script))

        self.check_each_run(check, "SMS")

    def test_no_number_stands_where_its_words_are_expected(self):
        worded = {script: self.worded_columns(script) for script in PROGRAMS.scripts()}
        self.assertEqual(worded["diskdrive"], {"Type", "Abilities"})

        def check(machine, run):
            for script in SCRIPTS[machine]:
                table = self.table(machine, run.product, script)
                for column in worded[script]:
                    place = table["columns"].index(column)
                    for row in table["rows"]:
                        self.assertNotRegex(row[place], r"\A-?\d+\Z", f"{script}: {column}")

        self.check_each_run(check, "SMS", "LD")

    @staticmethod
    def worded_columns(script):
        """The columns of numbers that the schema has words for."""
        schema = "\n".join(file.read_text() for file in PROGRAMS.schema.glob("*.mof"))
        text = (PROGRAMS.inventory / f"{script}.script.inv").read_text()
        names = (PROGRAMS.inventory / "sennet.properties").read_text()
        name = re.search(r"^G\[0\]=(\w+)$", text, re.M)[1]
        words = words_of(schema, name)
        return {re.search(rf"^{name}\.{listed}=(.*)$", names, re.M)[1]
                for listed in re.search(r"^A\[0\]=(.*)$", text, re.M)[1].split(",")
                if listed in words}

    def test_rows(self):
        for machine, scripts in ROWS.items():
            for script, expected in scripts.items():
                with self.subTest(machine=machine, script=script):
                    table = self.table(machine, "SMS", script)
                    rows = [dict(zip(table["columns"], row)) for row in table["rows"]]
                    found = [{column: rows[int(number) - 1][column] for column in row}
                             for number, row in expected.items()]
                    self.assertEqual(found, list(expected.values()))


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    known, rest = parser.parse_known_args()
    PROGRAMS = installation.programs_of(known)
    MACHINES = known.machines.resolve()
    unittest.main(argv=[sys.argv[0], *rest])
