"""A script without fault, with one fault after the other planted into it: `sennetctl check` names
each, at its place."""

import argparse
import json
import os
import pathlib
import pty
import subprocess
import sys
import tempfile
import unittest

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE.parent / "inventory"))
import installation

ARGUMENTS = None
GOOD = """[DEFAULT]
title=Disks

[CIM]
G[0]=CIM_DiskDrive
N[0]=root/cimv2
A[0]=DeviceID,Name
"""
# What is replaced by what, and the line, the column, the severity and a part of what is told.
FAULTS = {
    "blanks around =": ("title=", "title = ", 2, 1, "warning", "write title=Disks"),
    "blank behind a slot": ("G[0]=", "G[0] =", 5, 1, "error", "write G[0]=CIM_DiskDrive"),
    "blank before a slot": ("G[0]", " G[0]", 5, 1, "warning", "write G[0]=CIM_DiskDrive"),
    "section in small letters": ("[CIM]", "[cim]", 4, 1, "warning", "exactly [CIM]"),
    "nonsense": ("A[0]", "nonsense\nA[0]", 7, 1, "warning", "line without effect"),
    "slot without class": ("A[0]", "A[1]=Name\nA[0]", 7, 6, "warning", "slot 1 has no class"),
    "slot 10": ("N[0]", "N[10]", 6, 3, "error", "slots are 0 to 9"),
    "slot that is no number": ("N[0]", "N[x]", 6, 3, "warning", "read as 0"),
    "slot twice": ("A[0]", "G[0]=CIM_DiskDrive\nA[0]", 7, 1, "warning", "replaces the class"),
    "no properties": ("A[0]=DeviceID,Name\n", "", 5, 6, "warning", "no property list"),
    "illegal name": ("Name", "Na-me", 7, 15, "error", "'Na-me' is no name of a property"),
    "comma at the end": ("Name", "Name,", 7, 15, "error", "comma or blank at the end"),
    "property twice": ("Name", "DeviceID", 7, 15, "warning", "listed twice"),
    "unknown property": ("Name", "Nickname", 7, 15, "warning", "no property Nickname"),
    "unknown class": ("DiskDrive", "DiscDrive", 5, 6, "error", "CIM_ERR_NOT_FOUND (6)"),
    "unknown namespace": ("root/cimv2", "root/none", 5, 6, "error", "CIM_ERR_INVALID_NAMESPACE"),
    "no namespace": ("N[0]=root/cimv2\n", "", 5, 6, "error", "no line N[n]="),
    "class without instances": (
        "G[0]=CIM_DiskDrive", "G[0]=CIM_Battery\nG[1]=CIM_DiskDrive\nA[1]=Name\nN[1]=root/cimv2",
        5, 6, "error", "show the instances of CIM_DiskDrive"),
    "long line": ("Name", "Name" + " " * 1100, 7, 1025, "warning", "only the first 1024"),
    "encoding": ("Disks", "M\xfchle", 2, 8, "error", "octets that are not UTF-8"),
    "byte-order mark": ("[DEFAULT]", "\xef\xbb\xbf[DEFAULT]", 1, 1, "error", "byte-order mark"),
    "blank behind a class": ("DiskDrive", "DiskDrive ", 5, 6, "error", "write CIM_DiskDrive:"),
    "class in quotes": ("CIM_DiskDrive", '"CIM_DiskDrive"', 5, 6, "error", "quotes belong to it"),
    "comment behind a class": (
        "CIM_DiskDrive", "CIM_DiskDrive # x", 5, 6, "error", "a comment has a line of its own"),
    "comment behind properties": (
        "Name", "Name # x", 7, 20, "error", "a comment has a line of its own"),
    "blank before a namespace": ("=root", "= root", 6, 6, "error", "write root/cimv2:"),
    "CR at the end of the file": (
        "Name\n", "Name\r", 7, 15, "error", "the carriage return at the end of the file"),
    "64-bit number": ("Name", "MaxMediaSize", 7, 15, "warning", "beyond 32 bits"),
    "title that is cut": ("Disks", "Disks of this machine", 2, 7, "warning", "with Lumo"),
}
# What makes nothing of a script, and what makes half a file of it.
GIVEN_UP = {
    "slot 10": ("N[0]", "N[10]"),
    "class": ("CIM_DiskDrive", "CIM-DiskDrive"),
    "namespace": ("root/cimv2", "root//cimv2"),
    "blank behind =": ("N[0]=", "N[0]= "),
    "blank around =": ("G[0]=", "G[0] = "),
    "blank behind a class": ("DiskDrive", "DiskDrive "),
    "class in quotes": ("CIM_DiskDrive", '"CIM_DiskDrive"'),
    "comment behind a class": ("CIM_DiskDrive", "CIM_DiskDrive # x"),
    "encoding": ("Disks", "M\xfchle"),
}
BROKEN_OFF = {
    "name": ("Name", "Na-me"),
    "comma at the end": ("Name", "Name,"),
    "blank at the end": ("Name", "Name "),
    "CR at the end of the file": ("Name\n", "Name\r"),
    "comment behind properties": ("Name", "Name # x"),
    "properties in quotes": ("DeviceID,Name", '"DeviceID,Name"'),
}


class FaultsTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.place = pathlib.Path(cls.enterClassContext(
            tempfile.TemporaryDirectory(prefix="sennet-faults-")))
        (cls.place / "mof.d").mkdir()
        (cls.place / "texts").touch()
        (cls.place / "velm.properties").write_text(f"sennet.resources={cls.place}/texts\n")
        programs = installation.programs_of(ARGUMENTS)
        cls.server = cls.enterClassContext(installation.Cimomd(
            programs, cls.place, ARGUMENTS.machines.resolve() / "server", cls.place / "mof.d"))

    def check(self, text):
        """The status and what is found in a script; each character is an octet."""
        script = self.place / "own.script.inv"
        script.write_bytes(text.encode("latin-1"))
        result = subprocess.run(
            [ARGUMENTS.programs.resolve() / "sennetctl", "check", "--json", script],
            capture_output=True, text=True, timeout=60, check=False,
            env={"CIM_LOCAL_SOCKET": str(self.server.socket), "PATH": os.environ["PATH"],
                 "VELM_CONFIG": str(self.place / "velm.properties")})
        self.assertEqual(result.stderr, "")
        return result.returncode, json.loads(result.stdout)["findings"]

    def test_the_script_is_without_fault(self):
        status, found = self.check(GOOD)
        self.assertEqual((status, [each["severity"] for each in found]), (0, ["note"]), found)

    def test_each_fault_is_named(self):
        for name, (good, bad, line, column, severity, message) in FAULTS.items():
            with self.subTest(fault=name):
                self.assertIn(good, GOOD)
                status, found = self.check(GOOD.replace(good, bad, 1))
                self.assertEqual(status, 1)
                self.assertTrue(any(
                    (each["line"], each["column"], each["severity"]) == (line, column, severity)
                    and message in each["message"] for each in found), found)

    def run_with(self, product, *scripts):
        """What sennet makes of scripts of these texts, one0, one1 and so on."""
        place = pathlib.Path(self.enterContext(
            tempfile.TemporaryDirectory(prefix="sennet-faults-")))
        inventory = place / "inventory"
        inventory.mkdir()
        (inventory / "sennet.properties").touch()
        for number, text in enumerate(scripts):
            (inventory / f"one{number}.script.inv").write_bytes(text.encode("latin-1"))
        return installation.Run(installation.programs_of(ARGUMENTS), product, place,
                                self.server.socket, inventory)

    def test_the_script_without_fault_makes_a_file(self):
        for product in ("SMS", "CA"):
            run = self.run_with(product, GOOD)
            file, = run.files()
            self.assertTrue(run.tables(file))

    def test_what_a_later_line_replaces_is_no_fault(self):
        text = GOOD.replace("G[0]", "G[0] = CIM_DiskDrive\nG[0]").replace(
            "A[0]", "A[0]=Na-me,\nA[0]")
        _, found = self.check(text)
        self.assertEqual([each["severity"] for each in found if each["severity"] != "note"],
                         ["warning", "warning"], found)
        self.assertTrue(all("replaces the" in each["message"] for each in found
                            if each["severity"] != "note"), found)
        run = self.run_with("SMS", text)
        file, = run.files()
        self.assertTrue(run.tables(file))

    def test_an_empty_list_makes_a_cell_without_a_column(self):
        text = GOOD.replace("DeviceID,Name", ",")
        _, found = self.check(text)
        self.assertIn("7:6 warning slot 0 has an empty property list",
                      "".join("{line}:{column} {severity} {message}".format(**each)
                              for each in found))
        file, = self.run_with("SMS", text).files()
        self.assertRegex(file.read_text("ascii"), r"\{ *1, *\}")

    def test_a_name_of_the_ending_alone_makes_no_file(self):
        place = self.place / "nameless"
        place.mkdir()
        script = place / ".script.inv"
        script.write_text(GOOD)
        (place / "sennet.properties").touch()
        told = subprocess.run(
            [ARGUMENTS.programs.resolve() / "sennetctl", "check", "--offline", script],
            capture_output=True, text=True, timeout=60, check=False)
        self.assertIn("for SMS and LANDesk sennet writes no file", told.stdout)
        run = installation.Run(installation.programs_of(ARGUMENTS), "SMS", place,
                               self.server.socket, place)
        self.assertIn("Processing ", run.result.stdout)
        self.assertEqual(list(place.rglob("*.mif")), [])

    def test_what_is_given_up_makes_no_file(self):
        for name, (good, bad) in GIVEN_UP.items():
            with self.subTest(fault=name):
                text = GOOD.replace(good, bad, 1)
                _, found = self.check(text)
                self.assertTrue(any("gives the whole script up" in each["message"]
                                    for each in found), found)
                run = self.run_with("SMS", text)
                self.assertNotIn("one0", run.result.stdout)
                self.assertEqual(list(run.mif.glob("*.mif")), [])

    def test_carriage_returns_alone_are_no_lines(self):
        text = GOOD.replace("\n", "\r")
        _, found = self.check(text)
        self.assertEqual([(each["line"], each["severity"]) for each in found], [(1, "error")])
        self.assertIn("sennet sees one line and no entry", found[0]["message"])
        run = self.run_with("SMS", text)
        self.assertIn("Deleting one0", run.result.stdout)
        self.assertEqual(run.files(), [])

    def escapes_on_a_terminal(self, **environment):
        """Whether a finding is shown in colour on a terminal."""
        script = self.place / "terminal.script.inv"
        script.write_text(GOOD.replace("[CIM]", "nonsense\n[CIM]"))
        ours, theirs = pty.openpty()
        try:
            subprocess.run(
                [ARGUMENTS.programs.resolve() / "sennetctl", "check", "--offline", script],
                stdout=theirs, stderr=subprocess.DEVNULL, timeout=60, check=False,
                env={"PATH": os.environ["PATH"], **environment})
            text = os.read(ours, 65536)
        finally:
            os.close(theirs)
            os.close(ours)
        self.assertIn(b"terminal.script.inv", text)
        return b"\x1b[" in text

    def test_colours_are_for_terminals_that_want_them(self):
        self.assertTrue(self.escapes_on_a_terminal(TERM="xterm"))
        self.assertTrue(self.escapes_on_a_terminal(TERM="xterm", NO_COLOR=""))
        self.assertFalse(self.escapes_on_a_terminal(TERM="xterm", NO_COLOR="1"))
        self.assertFalse(self.escapes_on_a_terminal(TERM="dumb"))

    def test_a_title_with_a_quote_spoils_the_file(self):
        text = GOOD.replace("Disks", '17" Disks')
        _, found = self.check(text)
        self.assertTrue(any("the MIF file cannot be read" in each["message"]
                            for each in found), found)
        for product in ("SMS", "CA"):
            run = self.run_with(product, text)
            file, = run.files()
            with self.assertRaises(ValueError):
                run.tables(file)

    def test_what_is_broken_off_spoils_the_file(self):
        for name, (good, bad) in BROKEN_OFF.items():
            text = GOOD.replace(good, bad, 1)
            _, found = self.check(text)
            self.assertTrue(any("breaks the MIF file off" in each["message"]
                                and "gives the whole script up" not in each["message"]
                                for each in found), found)
            for product, scripts in (("SMS", [text]), ("CA", [GOOD, text, GOOD])):
                with self.subTest(fault=name, product=product):
                    run = self.run_with(product, *scripts)
                    self.assertIn("Processing one0", run.result.stdout)
                    file, = run.files()
                    with self.assertRaises(ValueError):
                        run.tables(file)


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    ARGUMENTS, rest = parser.parse_known_args()
    unittest.main(argv=[sys.argv[0], *rest])
