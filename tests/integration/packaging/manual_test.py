"""The manual pages: mandoc finds nothing to complain of, and they name every option there is."""

import re
import subprocess
import unittest

from places import Places, commands_of, options_of, run_tests

PAGES = ["cimomd.8", "script.inv.5", "sennet.8", "sennet.properties.5", "sennetctl.1",
         "velm.properties.5"]


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
        self.assertEqual(told, options_of("cimomd"))

    def test_sennetctl_1_has_the_commands_and_options_that_the_program_tells(self):
        text = page("sennetctl.1").read_text()
        synopsis = text.partition(".Sh SYNOPSIS\n")[2].partition(".Sh ")[0]
        for command in (["sennetctl"], ["sennetctl", "mif"]):
            for name in set(commands_of(*command)) - {"mif"}:
                with self.subTest(command=name):
                    words = " ".join([*command[1:], name])
                    usage = synopsis.partition(f".Cm {words}\n")[2].partition(".Nm\n")[0]
                    told = {option.lstrip("-") for option in options_of(*command, name)
                            if option.startswith("--")} - {"help"}
                    told -= {name}  # "mif json" is JSON anyhow
                    item = text.partition(f".It Cm {words}\n")[2].partition(".It Cm")[0]
                    for option in told:
                        self.assertRegex(usage + item, rf"(Fl|,) -{option}\b")
                    self.assertEqual("Fl -json" in usage, "json" in told)

    def test_sennetctl_1_names_no_option_that_the_program_lacks(self):
        commands = [["sennetctl", name] for name in set(commands_of("sennetctl")) - {"mif"}]
        commands += [["sennetctl", "mif", name] for name in commands_of("sennetctl", "mif")]
        told = {option for command in commands for option in options_of(*command)}
        told |= set(options_of("sennetctl"))
        lines = re.findall(r"(?m)^\.(?:It |Op )?Fl .*$", page("sennetctl.1").read_text())
        named = set(re.findall(r"(?:Fl|,) (-?[a-z][a-z-]*)", "\n".join(lines)))
        self.assertLessEqual({"-" + option for option in named}, told)


if __name__ == "__main__":
    run_tests()
