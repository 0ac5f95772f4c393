"""Whether hardening_test.py finds what a program lacks, on programs compiled with and without the
protections."""

import argparse
import os
import pathlib
import platform
import subprocess
import sys
import tempfile
import unittest

COMPILER = None
TOOL = pathlib.Path(__file__).with_name("hardening_test.py")

# Its address is taken, so that calls of it are indirect.
FUNCTION = "__attribute__((noinline)) void f%d(char* text) { text[%d] = 0; }\n"
MAIN = """
#include <cstring>
%s
void (*volatile functions[])(char*) = {%s};
int main(int count, char** words) {
    char text[20000];
    std::strcpy(text, words[0]);
    for (auto function : functions)
        function(text);
    return text[count];
}
"""
SOURCE = MAIN % ("".join(FUNCTION % (i, i) for i in range(30)),
                 ", ".join(f"f{i}" for i in range(30)))

LINKED = ["-pie", "-Wl,-z,relro,-z,now,-z,noexecstack"]
COMPILED = ["-O2", "-fPIE", "-D_FORTIFY_SOURCE=2", "-fstack-protector-strong"]
PROTECTED = ["-fstack-clash-protection", "-fcf-protection"]


class FindsTest(unittest.TestCase):
    def setUp(self):
        place = tempfile.TemporaryDirectory(prefix="hardening.")
        self.addCleanup(place.cleanup)
        self.place = pathlib.Path(place.name)

    def findings(self, flags, *options):
        """What is told of a program with these flags, and the exit status."""
        source, program = self.place / "source.cc", self.place / "program"
        source.write_text(SOURCE)
        subprocess.run([COMPILER, "-std=c++20", *flags, source, "-o", program], check=True)
        result = subprocess.run([sys.executable, "-B", TOOL, *options, program],
                                capture_output=True, text=True, check=False)
        lines = [line.removeprefix(f"{program} ") for line in result.stdout.splitlines()]
        return lines, result.returncode

    @unittest.skipUnless(platform.machine() == "x86_64", "not all flags are for this processor")
    def test_a_protected_program_passes(self):
        self.assertEqual(self.findings(LINKED + COMPILED + PROTECTED, "--optimised"), ([], 0))

    @unittest.skipUnless(platform.machine() == "x86_64", "not all flags are for this processor")
    def test_what_the_compiler_left_out_is_told(self):
        bare = ["-O2", "-fPIE", "-U_FORTIFY_SOURCE", "-fno-stack-protector",
                "-fno-stack-clash-protection", "-fcf-protection=none"]
        self.assertEqual(self.findings(LINKED + bare), ([], 0))
        self.assertEqual(self.findings(LINKED + bare, "--optimised"),
                         (["has no stack protector", "calls no fortified function",
                           "has no marks for indirect calls",
                           "does not probe a large stack frame"], 1))

    def test_what_the_linker_left_out_is_told(self):
        bare = ["-no-pie", "-Wl,-z,norelro,-z,lazy,-z,execstack"]
        self.assertEqual(self.findings(bare),
                         (["is not position-independent",
                           "is not marked as a position-independent program",
                           "has no segment that becomes read-only",
                           "resolves symbols late, so that their table stays writable",
                           "has a stack with the rights 'RWE'"], 1))


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--compiler", required=True)
    known, others = parser.parse_known_args()
    COMPILER = known.compiler
    os.environ["LC_ALL"] = "C"
    unittest.main(argv=sys.argv[:1] + others)
