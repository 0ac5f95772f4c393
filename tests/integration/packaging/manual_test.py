"""The manual pages: mandoc finds nothing to complain of, and they name every option there is."""

import re
import subprocess
import unittest

from places import Places, options_of_cimomd, run_tests

PAGES = ["cimomd.8", "script.inv.5", "sennet.8", "sennet.properties.5", "velm.properties.5"]


def page(name):
    return Places.built / "man" / name


class ManualTest(unittest.TestCase):
    def test_all_pages_are_there(self):
        found = {path.name for path in page("").glob("*.[1-8]")}
        self.assertLessEqual(set(PAGES), found)

    def test_lint_finds_nothing(self):
        for path in sorted(page("").glob("*.[1-8]")):
            with self.subTest(page=path.name):
                result = subprocess.run(["mandoc", "-T", "lint", path], capture_output=True,
                                        text=True, timeout=60, check=False)
                # Whether the pages are installed on the machine of the test is another matter.
                told = [line for line in result.stdout.splitlines()
                        if "referenced manual not found" not in line]
                self.assertEqual((told, result.stderr), ([], ""))

    def test_pages_that_are_referred_to_are_there(self):
        for path in sorted(page("").glob("*.[1-8]")):
            for name, section in re.findall(r"(?m)^\.Xr (\S+) (\d)", path.read_text()):
                with self.subTest(page=path.name, reference=name):
                    self.assertTrue(page(f"{name}.{section}").exists())

    def test_no_place_is_left_to_be_filled_in(self):
        for name in PAGES:
            self.assertNotRegex(page(name).read_text(), r"@[A-Z_]+@", name)

    def test_cimomd_8_has_the_options_that_the_program_tells(self):
        items = re.findall(r"(?m)^\.It (Fl .*)$", page("cimomd.8").read_text())
        told = sorted("-" + flag for item in items for flag in re.findall(r"Fl (\S+)", item))
        self.assertEqual(told, options_of_cimomd())


if __name__ == "__main__":
    run_tests()
