"""The examples of the manual pages about scripts and names, put into files and run."""

import argparse
import pathlib
import re
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


class ExamplesTest(unittest.TestCase):
    def setUp(self):
        directory = tempfile.TemporaryDirectory(prefix="sennet-examples-")
        self.addCleanup(directory.cleanup)
        self.place = pathlib.Path(directory.name)
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


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--pages", type=pathlib.Path, required=True)
    installation.add_arguments(parser)
    known, rest = parser.parse_known_args()
    PROGRAMS = installation.programs_of(known)
    MACHINE = known.machines.resolve() / "laptop"
    PAGES = known.pages.resolve()
    unittest.main(argv=[sys.argv[0], *rest])
