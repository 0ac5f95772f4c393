"""The examples of the manual pages and of the companion's help, run."""

import argparse
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

PROGRAMS = None
MACHINE = None
PAGES = None


def example(page):
    """The first block of literal text below EXAMPLES."""
    text = (PAGES / page).read_text().split(".Sh EXAMPLES\n", 1)[1]
    return re.search(r"(?ms)^\.Bd -literal.*?\n(.*?)^\.Ed$", text)[1]


def commands(page):
    """The lines for a shell below EXAMPLES."""
    text = (PAGES / page).read_text().split(".Sh EXAMPLES\n", 1)[1].split("\n.Sh ", 1)[0]
    return re.findall(r"(?m)^(?:\.Dl )?(sennet.*)$", text)


def help_examples(*command):
    """The examples of a command of sennetctl and of those below it."""
    told = subprocess.run([PROGRAMS.sennet.parent / "sennetctl", *command, "--help"],
                          capture_output=True, text=True, timeout=60, check=True).stdout
    found = re.findall(r"(?m)^  (sennetctl .*)$", told.partition("Examples:\n")[2])
    for name in re.findall(r"(?m)^  (\w+) ", told.partition("Subcommands:\n")[2]
                           .partition("\n\n")[0]):
        found += help_examples(*command, name)
    return found


class ExamplesTest(unittest.TestCase):
    def setUp(self):
        self.place = pathlib.Path(self.enterContext(
            tempfile.TemporaryDirectory(prefix="sennet-examples-")))
        self.scripts = self.place / "scripts"
        self.scripts.mkdir()
        (self.place / "mof.d").mkdir()
        (self.scripts / "processors.script.inv").write_text(example("script.inv.5"))

    def table(self):
        with installation.Cimomd(PROGRAMS, self.place, MACHINE, self.place / "mof.d") as server:
            run = installation.Run(PROGRAMS, "SMS", self.place, server.socket, self.scripts)
        self.assertEqual([file.name for file in run.files()], ["processors.mif"])
        return run.tables(run.files()[0])[0]

    def test_a_script_alone(self):
        table = self.table()
        self.assertEqual(table["name"], "Processor_List")
        self.assertEqual(table["columns"],
                         ["Index", "DeviceID", "Manufacturer", "Model", "MaxClockSpeed"])

    def test_a_script_with_its_names(self):
        (self.scripts / "sennet.properties").write_text(example("sennet.properties.5"))
        table = self.table()
        self.assertEqual(table["name"], "Processors")
        self.assertEqual(table["columns"], ["Index", "Socket", "Manufacturer", "Model", "Clock MHz"])

    def run_in_shell(self, line, **environment):
        return subprocess.run(
            ["sh", "-c", line], capture_output=True, text=True, timeout=60, check=False,
            cwd=self.place, env={
                "PATH": f"{PROGRAMS.sennet.parent}:{os.environ['PATH']}",
                "VELM_CONFIG": str(self.place / "velm.properties"), **environment})

    def test_the_companion(self):
        lines = commands("sennetctl.1")
        self.assertGreater(len(lines), 6)
        (self.place / "velm.properties").write_text(
            f"sennet.directory={PROGRAMS.inventory}\n"
            f"sennet.resources={PROGRAMS.inventory / 'sennet.properties'}\n")
        with installation.Cimomd(PROGRAMS, self.place, MACHINE, self.place / "mof.d") as server:
            for line in ["sennet /SMS yesterday", *lines]:
                with self.subTest(line=line):
                    result = self.run_in_shell(line, CIM_LOCAL_SOCKET=str(server.socket))
                    self.assertEqual((result.returncode, result.stderr), (0, ""))

    def test_the_companions_help(self):
        lines = help_examples()
        self.assertGreater(len(lines), 20)
        for line in lines:
            with self.subTest(line=line):
                result = self.run_in_shell(line, CIM_EMBEDDED="never", CIM_LOCAL_SOCKET="none")
                self.assertNotIn("Run with --help", result.stderr)


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--pages", type=pathlib.Path, required=True)
    installation.add_arguments(parser)
    known, rest = parser.parse_known_args()
    PROGRAMS = installation.programs_of(known)
    MACHINE = known.machines.resolve() / "laptop"
    PAGES = known.pages.resolve()
    unittest.main(argv=[sys.argv[0], *rest])
