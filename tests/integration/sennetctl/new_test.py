"""What `sennetctl new` writes is without fault for `sennetctl check`: for each class of the shipped
inventory, and for tables of several classes."""

import argparse
import os
import pathlib
import re
import shutil
import subprocess
import sys
import tempfile
import unittest

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE.parent / "inventory"))
import installation

ARGUMENTS = None
# What the recorded machine has, whatever a script makes of it.
OF_DATA = re.compile(r": warning: \d+ (values? of \S+ (cut|with letters|no date)|"
                     r"instances? of \S+ beside \d+ of )")


def shipped_classes():
    return sorted({name for script in ARGUMENTS.inventory.glob("*.script.inv")
                   for name in re.findall(r"^G\[\d\]=(\S+)", script.read_text(), re.M)})


class NewTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.place = pathlib.Path(cls.enterClassContext(
            tempfile.TemporaryDirectory(prefix="sennet-new-")))
        (cls.place / "mof.d").mkdir()
        cls.texts = cls.place / "sennet.properties"
        (cls.place / "velm.properties").write_text(f"sennet.resources={cls.texts}\n")
        cls.server = cls.enterClassContext(installation.Cimomd(
            installation.programs_of(ARGUMENTS), cls.place,
            ARGUMENTS.machines.resolve() / "laptop", cls.place / "mof.d"))

    def run_sennetctl(self, *arguments):
        return subprocess.run(
            [ARGUMENTS.programs.resolve() / "sennetctl", *arguments], capture_output=True,
            text=True, timeout=60, check=False,
            env={"CIM_LOCAL_SOCKET": str(self.server.socket), "PATH": os.environ["PATH"],
                 "VELM_CONFIG": str(self.place / "velm.properties")})

    def expect_no_fault(self, name, *classes, shipped=True):
        """Makes a script, appends its names to the resource properties and checks it."""
        if shipped:
            shutil.copy(ARGUMENTS.inventory / "sennet.properties", self.texts)
        else:
            self.texts.write_text("")
        script = self.place / f"{name}.script.inv"
        made = self.run_sennetctl("new", script,
                                  *(word for each in classes for word in ("--class", each)))
        self.assertEqual((made.returncode, made.stderr), (0, ""))
        with self.texts.open("a") as texts:
            texts.write(script.with_name(f"{name}.properties").read_text())
        checked = self.run_sennetctl("check", "--translations", script)
        faults = [line for line in checked.stdout.splitlines()[:-1]
                  if ": note: " not in line or ": note: replaces" in line]
        self.assertEqual([line for line in faults if not OF_DATA.search(line)], [], checked)
        script.unlink()
        script.with_name(f"{name}.properties").unlink()
        return made.stdout

    def test_each_class_beside_the_shipped_names(self):
        classes = shipped_classes()
        self.assertGreater(len(classes), 30)
        for name in classes:
            with self.subTest(name=name):
                self.expect_no_fault(name.lower(), name)

    def test_each_class_alone(self):
        for name in shipped_classes():
            with self.subTest(name=name):
                self.expect_no_fault("some_really_long_name_of_a_script", name, shipped=False)

    def test_tables_of_several_classes(self):
        for shipped in (True, False):
            with self.subTest(shipped=shipped):
                self.expect_no_fault("several", "Velmira_CDROMDrive", "Velmira_Processor",
                                     "Velmira_DiskDrive", "Velmira_Card", shipped=shipped)

    def test_it_says_what_is_named_already(self):
        self.assertIn(f"in {self.texts} already: Velmira_Processor.DeviceID\n",
                      self.expect_no_fault("own", "Velmira_Processor"))


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    ARGUMENTS, rest = parser.parse_known_args()
    unittest.main(argv=[sys.argv[0], *rest])
