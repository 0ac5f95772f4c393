"""What bash offers at the tabulator key."""

import pathlib
import subprocess
import tempfile
import unittest

from places import Places, commands_of, options_of, run_tests

SCRIPT = """
. "$1"
shift
COMP_WORDS=("$@")
COMP_CWORD=$(($# - 1))
compopt() { :; }
"_$1"
printf '%s\\n' "${COMPREPLY[@]}"
"""


class CompletionTest(unittest.TestCase):
    def setUp(self):
        directory = tempfile.TemporaryDirectory(prefix="sennet-completion-")
        self.addCleanup(directory.cleanup)
        self.directory = pathlib.Path(directory.name)
        (self.directory / "out").mkdir()
        (self.directory / "own.mof").touch()
        (self.directory / "own.txt").touch()
        (self.directory / "own.mif").touch()
        (self.directory / "own.script.inv").touch()

    def offered(self, *words):
        """For the last of the words, in the order of the alphabet."""
        result = subprocess.run(
            ["bash", "-c", SCRIPT, "bash", Places.source / "completion" / words[0], *words],
            capture_output=True, text=True, cwd=self.directory, timeout=60, check=True)
        self.assertEqual(result.stderr, "")
        return sorted(line for line in result.stdout.splitlines() if line)

    def test_bash_knows_the_function(self):
        for name in ("sennet", "cimomd", "sennetctl"):
            result = subprocess.run(
                ["bash", "-c", '. "$1"; complete -p "$2"', "bash",
                 Places.source / "completion" / name, name],
                capture_output=True, text=True, timeout=60, check=True)
            self.assertEqual(result.stdout, f"complete -F _{name} {name}\n")

    def test_products(self):
        self.assertEqual(self.offered("sennet", ""), ["/CA", "/LD", "/QVE", "/SMS"])
        self.assertEqual(self.offered("sennet", "/S"), ["/SMS"])

    def test_directories_of_an_inventory(self):
        self.assertEqual(self.offered("sennet", "/SMS", "o"), ["out"])
        self.assertEqual(self.offered("sennet", "/QVE", "out", "o"), ["out"])
        self.assertEqual(self.offered("sennet", "/SMS", "out", "o"), [])

    def test_all_options_of_cimomd(self):
        self.assertEqual(self.offered("cimomd", "-"), options_of("cimomd"))

    def test_what_an_option_takes(self):
        self.assertEqual(self.offered("cimomd", "--root", "o"), ["out"])
        self.assertEqual(self.offered("cimomd", "--socket", "own"), ["own.mif", "own.mof", "own.script.inv", "own.txt"])
        self.assertIn("root", self.offered("cimomd", "--socket-group", "roo"))
        self.assertEqual(self.offered("cimomd", "--idle-timeout", ""), [])

    def test_mof_files_to_check(self):
        self.assertEqual(self.offered("cimomd", "--check", "o"), ["out", "own.mof"])
        self.assertEqual(self.offered("cimomd", "--check", "own.mof", "o"), ["out", "own.mof"])
        self.assertEqual(self.offered("cimomd", "--check", "own.mof", "--schema", "o"), ["out"])

    def test_all_commands_of_sennetctl(self):
        for command in (["sennetctl"], ["sennetctl", "mif"]):
            names = commands_of(*command)
            self.assertIn("check", names)
            self.assertEqual([word for word in self.offered(*command, "") if word[0] != "-"],
                             sorted(names))

    def test_all_options_of_sennetctl(self):
        self.assertEqual(self.offered("sennetctl", "-"), options_of("sennetctl"))
        self.assertEqual(self.offered("sennetctl", "mif", "-"), options_of("sennetctl", "mif"))
        for command in (["sennetctl"], ["sennetctl", "mif"]):
            for name in set(commands_of(*command)) - {"mif"}:
                with self.subTest(command=name):
                    self.assertEqual(self.offered(*command, name, "-"),
                                     options_of(*command, name))

    def test_what_commands_of_sennetctl_take(self):
        self.assertEqual(self.offered("sennetctl", "check", "o"), ["out", "own.script.inv"])
        self.assertEqual(self.offered("sennetctl", "mif", "diff", "a.mif", "o"), ["out", "own.mif"])
        self.assertEqual(self.offered("sennetctl", "mif", "html", "own.mif", "-o", "o"), ["out"])
        self.assertEqual(self.offered("sennetctl", "mif", "check", "--profile", ""),
                         ["ca", "dmi", "landesk", "sms"])
        self.assertEqual(self.offered("sennetctl", "get", "o"), [])
        self.assertEqual(self.offered("sennetctl", "get", "CIM_Fan", "-n", ""), [])
        self.assertEqual(self.offered("sennetctl", "nothing", ""), [])


if __name__ == "__main__":
    run_tests()
