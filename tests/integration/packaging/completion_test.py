"""What bash offers at the tabulator key."""

import pathlib
import subprocess
import tempfile
import unittest

from places import Places, options_of_cimomd, run_tests

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

    def offered(self, *words):
        """For the last of the words, in the order of the alphabet."""
        result = subprocess.run(
            ["bash", "-c", SCRIPT, "bash", Places.source / "completion" / words[0], *words],
            capture_output=True, text=True, cwd=self.directory, timeout=60, check=True)
        self.assertEqual(result.stderr, "")
        return sorted(line for line in result.stdout.splitlines() if line)

    def test_bash_knows_the_function(self):
        for name in ("sennet", "cimomd"):
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
        self.assertEqual(self.offered("cimomd", "-"), options_of_cimomd())

    def test_what_an_option_takes(self):
        self.assertEqual(self.offered("cimomd", "--root", "o"), ["out"])
        self.assertEqual(self.offered("cimomd", "--socket", "own"), ["own.mof", "own.txt"])
        self.assertIn("root", self.offered("cimomd", "--socket-group", "roo"))
        self.assertEqual(self.offered("cimomd", "--idle-timeout", ""), [])

    def test_mof_files_to_check(self):
        self.assertEqual(self.offered("cimomd", "--check", "o"), ["out", "own.mof"])
        self.assertEqual(self.offered("cimomd", "--check", "own.mof", "o"), ["out", "own.mof"])
        self.assertEqual(self.offered("cimomd", "--check", "own.mof", "--schema", "o"), ["out"])


if __name__ == "__main__":
    run_tests()
