"""Whether built programs and libraries have the protections of the compiler, the linker and the
loader. What only an optimised build without sanitizers has is looked for with --optimised."""

import argparse
import pathlib
import re
import subprocess
import sys


# A page of stack is taken and at once touched; the compilers differ in how.
PROBE = re.compile(r"\bsub\s+\$0x1000,%rsp\n.*\b(?:or|mov)q?\s+\$0x0,.*\(%rsp\)")


def output_of(*command):
    return subprocess.run(command, check=True, capture_output=True, text=True,
                          env={"LC_ALL": "C", "PATH": "/usr/bin:/bin"}).stdout


class BuiltFile:
    def __init__(self, path):
        self.header = output_of("readelf", "--file-header", path)
        self.segments = output_of("readelf", "--segments", "--wide", path)
        self.dynamic = output_of("readelf", "--dynamic", "--wide", path)
        self.needed = output_of("readelf", "--dyn-syms", "--wide", path)
        self.path = path

    def is_program(self):
        return "INTERP" in self.segments

    def is_for_x86_64(self):
        return "X86-64" in self.header

    def instructions(self):
        return output_of("objdump", "--disassemble", "--no-show-raw-insn", self.path)

    def flags(self, segment):
        """The rights of a segment such as "RW "; None when there is none of this name."""
        found = re.search(rf"^\s+{segment}\s+(?:0x\w+\s+){{5}}([R ][W ][E ])", self.segments, re.M)
        return found and found[1]


def missing_everywhere(file):
    if not re.search(r"Type:\s+DYN", file.header):
        yield "is not position-independent"
    if file.is_program() and not re.search(r"FLAGS_1.*\bPIE\b", file.dynamic):
        yield "is not marked as a position-independent program"
    if file.flags("GNU_RELRO") is None:
        yield "has no segment that becomes read-only"
    if not re.search(r"\bBIND_NOW\b|FLAGS_1.*\bNOW\b", file.dynamic):
        yield "resolves symbols late, so that their table stays writable"
    if file.flags("GNU_STACK") != "RW ":
        yield f"has a stack with the rights {file.flags('GNU_STACK')!r}"
    if re.search(r"^\s+LOAD\s.* RWE ", file.segments, re.M):
        yield "has memory that is both writable and executable"
    if "TEXTREL" in file.dynamic:
        yield "changes its instructions when it is loaded"


def missing_when_optimised(file):
    if "__stack_chk_fail" not in file.needed:
        yield "has no stack protector"
    if file.is_program() and not re.search(r"\b__(?!stack_chk)\w+_chk\b", file.needed):
        yield "calls no fortified function"
    if not file.is_for_x86_64():
        return
    instructions = file.instructions()
    # The C library's own start has a few.
    if instructions.count("endbr64") < 20:
        yield "has no marks for indirect calls"
    if file.is_program() and not PROBE.search(instructions):
        yield "does not probe a large stack frame"


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--optimised", action="store_true")
    parser.add_argument("files", nargs="+", type=pathlib.Path)
    arguments = parser.parse_args()
    findings = []
    for path in arguments.files:
        file = BuiltFile(path)
        findings += [f"{path} {what}" for what in missing_everywhere(file)]
        if arguments.optimised:
            findings += [f"{path} {what}" for what in missing_when_optimised(file)]
    for finding in findings:
        print(finding)
    return 1 if findings else 0


if __name__ == "__main__":
    sys.exit(main())
