"""What `sennetctl check` says about values, beside what `sennet` makes of them."""

import argparse
import json
import os
import pathlib
import re
import subprocess
import sys
import tempfile
import unittest

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE.parent / "inventory"))
import installation

ARGUMENTS = None
UNKNOWN = "19800101000000.000000+000"
NAME = "Twelve chars"
# Type, value in MOF or none, what the cell shows, and a part of what is told or none.
COLUMNS = {
    "Label": ("string", '"plain"', "plain", None),
    "Long": ("string", f'"{"x" * 256}"', "x" * 255, "1 value of Long cut"),
    "Wide": ("string", '"eleven char"', "eleven char", "longer than the column of 10"),
    "State": ("uint16", "1", NAME, "1 value of State longer than the column of 10"),
    "States": ("uint16[]", f"{{{','.join(['1'] * 20)}}}", ",".join([NAME] * 20)[:255],
               "1 value of States cut"),
    "Few": ("uint16[]", "{1, 1}", NAME + "," + NAME, None),
    "Umlaut": ("string", '"M\u00fcller"', "M ller", "letters beyond ASCII"),
    "Tabbed": ("string", r'"a\tb"', "a b", "control characters"),
    "Lines": ("string", r'"a\nb"', "a\\\nb", "1 value of Lines with a line end"),
    "Quoted": ("string", r'"a \"b\""', 'a \\"b\\"', "1 value of Quoted with a double quote"),
    "Inside": ("string", r'"C:\\Temp"', r"C:\\Temp", None),
    "Ended": ("string", r'"x\\"', r"x\\", "1 value of Ended with a backslash at the end"),
    "Begun": ("datetime", '"20260102030405.000000+060"', "20260102030405.000000+060", None),
    "Never": ("datetime", None, UNKNOWN, f"the column Never is empty; {UNKNOWN}"),
    "Lasted": ("datetime", '"00000001000000.000000:000"', UNKNOWN, "no date from 1900 to 2099"),
    "Old": ("datetime", '"18991231235959.000000+000"', UNKNOWN, "no date from 1900 to 2099"),
    "Large": ("uint32", "4294967295", "-1", "1 value of Large beyond 32 bits"),
    "Larger": ("uint64", "4294967297", "1", "1 value of Larger beyond 32 bits"),
    "Least": ("sint64", "-2147483649", "2147483647", "1 value of Least beyond 32 bits"),
    "Larges": ("uint32[]", "{1, 4294967295}", "1,-1", "1 value of Larges beyond 32 bits"),
    "Whole": ("uint64[]", "{4294967296}", "4294967296", None),
    "Absent": ("uint32", None, "0", "the column Absent is empty; 0"),
    "NoState": ("uint16", None, "0", "the column NoState is empty; 0"),
    "NoText": ("string", None, "", "the column NoText is empty"),
    "Flag": ("boolean", "true", "true", "1 value of Flag longer than the column of 3"),
    "Odd": ("string", '"x"', "x", None),
}
NAMED = ("State", "States", "Few", "NoState")
SIZES = {"Wide": "10", "State": "10", "Flag": "3", "Odd": "abc"}


def mof():
    names = f'[ValueMap {{"1"}}, Values {{"{NAME}"}}] '
    declared = "".join(
        f"{names if name in NAMED else ''}{kind.rstrip('[]')} {name}"
        f"{'[]' if kind.endswith('[]') else ''};\n" for name, (kind, *_) in COLUMNS.items())
    values = "".join(f"{name} = {value};\n"
                     for name, (_, value, *_) in COLUMNS.items() if value is not None)
    return (f"class Example_Thing {{\n[Key] string Id;\n{declared}}};\n"
            f'instance of Example_Thing {{\nId = "1";\n{values}}};\n')


class ValuesTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.place = pathlib.Path(cls.enterClassContext(
            tempfile.TemporaryDirectory(prefix="sennet-values-")))
        own = cls.place / "mof.d"
        own.mkdir()
        (own / "thing.mof").write_text(mof(), encoding="utf-8")
        cls.inventory = cls.place / "inventory"
        cls.inventory.mkdir()
        (cls.inventory / "thing.script.inv").write_text(
            "[DEFAULT]\ntitle=Things\n[CIM]\nG[0]=Example_Thing\nN[0]=root/cimv2\n"
            f"A[0]={','.join(COLUMNS)}\n")
        cls.texts = cls.inventory / "sennet.properties"
        cls.texts.write_text("".join(f"Example_Thing.{name}.Size={size}\n"
                                     for name, size in SIZES.items())
                             + "Example_Thing.Label=L\xfcfter\n", encoding="latin-1")
        cls.programs = installation.programs_of(ARGUMENTS)
        cls.server = cls.enterClassContext(installation.Cimomd(
            cls.programs, cls.place, ARGUMENTS.machines.resolve() / "server", own))
        run = installation.Run(cls.programs, "SMS", cls.place, cls.server.socket, cls.inventory)
        file, = run.files()
        cls.mif = file.read_bytes().decode("latin-1").replace("\r\n", "\n")
        result = subprocess.run(
            [ARGUMENTS.programs.resolve() / "sennetctl", "check", "--json",
             "--translations"], capture_output=True, text=True, timeout=60, check=False,
            env={"CIM_LOCAL_SOCKET": str(cls.server.socket), "PATH": os.environ["PATH"],
                 "VELM_CONFIG": str(cls.place / "SMS/velm.properties")})
        cls.document = json.loads(result.stdout)
        cls.found = cls.document["findings"]

    def told_of(self, name):
        """What is told of the values of a column."""
        return [each["message"] for each in self.found
                if re.search(rf"\b(values?|column)\b.* {name}\b", each["message"])]

    def test_backslashes_that_spoil_the_file_of_ca(self):
        for column, is_told in (("Inside", False), ("Ended", True)):
            with self.subTest(column=column):
                place = pathlib.Path(self.enterContext(
                    tempfile.TemporaryDirectory(prefix="sennet-values-")))
                inventory = place / "inventory"
                inventory.mkdir()
                (inventory / "sennet.properties").touch()
                (inventory / "thing.script.inv").write_text(
                    "[DEFAULT]\ntitle=Things\n[CIM]\nG[0]=Example_Thing\nN[0]=root/cimv2\n"
                    f"A[0]=Label,{column},Odd\n")
                run = installation.Run(self.programs, "CA", place, self.server.socket, inventory)
                checked = subprocess.run(
                    [ARGUMENTS.programs.resolve() / "sennetctl", "mif", "check", "--profile", "ca",
                     *run.files()], capture_output=True, text=True, timeout=60, check=False)
                self.assertEqual(": error: " in checked.stdout, is_told, checked.stdout)
                severities = [each["severity"] for each in self.found
                              if f" of {column} with a backslash" in each["message"]]
                self.assertEqual(severities, ["error"] if is_told else [])

    def test_cells(self):
        row = re.search(r"^ *\{ 1, (.*)\}$", self.mif, re.M | re.S)[1]
        cells = re.findall(r'"((?:\\.|[^"\\])*)"|(-?\d+)', row, re.S)
        self.assertEqual(len(cells), len(COLUMNS))
        for name, (text, number) in zip(COLUMNS, cells):
            with self.subTest(column=name):
                self.assertEqual(text or number, COLUMNS[name][2])

    def test_what_is_told_of_the_cells(self):
        for name, (*_, part) in COLUMNS.items():
            with self.subTest(column=name):
                told = self.told_of(name)
                self.assertEqual(len(told), 0 if part is None else 1, told)
                self.assertIn(part or "", "".join(told))

    def test_sizes_are_written_as_they_are(self):
        for name, size in SIZES.items():
            self.assertRegex(self.mif, rf'Name = "{name}"\n.*\n +Type = String\({size}\)')
        refused = [each for each in self.found if each["file"] == str(self.texts)]
        self.assertEqual([(each["line"], each["column"], each["severity"]) for each in refused],
                         [(4, 24, "error"), (5, 21, "warning")])
        self.assertIn("String(abc)", refused[0]["message"])
        self.assertEqual([each["message"] for each in self.found
                          if "Example_Thing.Odd.Size" in each["message"]], [])

    def test_octets_that_are_not_utf8(self):
        self.assertIn('Name = "L\ufffdfter"\n', self.mif.encode("latin-1").decode("utf-8"))
        self.assertTrue(any("not UTF-8: sennet takes each for U+FFFD" in each["message"]
                            for each in self.found))

    def test_the_places_that_were_used(self):
        self.assertEqual(
            [self.document[name] for name in ("configuration", "directory", "resources")],
            [str(self.place / "SMS/velm.properties"), str(self.inventory), str(self.texts)])


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    ARGUMENTS, rest = parser.parse_known_args()
    unittest.main(argv=[sys.argv[0], *rest])
