#!/usr/bin/env python3
"""The commands of the documents that are for root on an installed system, for packaging/test-packages.

    root_commands.py sections SOURCE                lists the sections that have such, as DOCUMENT:SECTION
    root_commands.py script DOCUMENT SECTION PLACE  prints a shell script of those of a section
    root_commands.py judge DOCUMENT SECTION PLACE   tells what was not as the document says

The script leaves what each command printed, and its status, in the directory PLACE.
"""

import pathlib
import sys

from document import documents_of, has_shape, section_commands


def sections(source):
    for document in documents_of(pathlib.Path(source)):
        names = {}
        for block in document.blocks:
            if block.language == "console" and any(one.for_root for one in block.commands()):
                names[block.section] = True
        for name in names:
            print(f"{document.path.relative_to(source)}:{name}")


def script(document, section, place):
    print(f"mkdir -p '{place}'")
    for number, command in enumerate(section_commands(document, section)):
        print(f"sh -e >'{place}/{number}.out' 2>&1 <<'END_OF_COMMAND'\n{command.text.rstrip()}\n"
              f"END_OF_COMMAND\necho $? >'{place}/{number}.status'")


def judge(document, section, place):
    commands = section_commands(document, section)
    if not commands:
        sys.exit(f"{document}: no commands in the section {section}")
    for number, command in enumerate(commands):
        status = pathlib.Path(place, f"{number}.status")
        if not status.exists():
            sys.exit(f"{document}:{command.line}: did not run: {command.text}")
        printed = pathlib.Path(place, f"{number}.out").read_text()
        where = f"{document}:{command.line}: {command.text}"
        if status.read_text().strip() != "0":
            sys.exit(f"{where}\nends with status {status.read_text().strip()}:\n{printed}")
        if command.shown and not has_shape(command.shown, printed.splitlines()):
            sys.exit(f"{where}\nprints another thing than what is shown:\n{printed}")


if __name__ == "__main__":
    {"sections": sections, "script": script, "judge": judge}[sys.argv[1]](*sys.argv[2:])
