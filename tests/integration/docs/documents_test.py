"""Every command of README.md, CONTRIBUTING.md and docs is run, or looked at where it belongs to an
installed system or builds; what the documents show is compared with what comes out."""

import argparse
import pathlib
import sys
import unittest

from checks import Checks
from document import documents_of, has_shape
from place import SITUATIONS, Place, Sources

SOURCES = None
CHECKS = None
# Pictures: nothing prints them.
FIGURES = {("architecture.md", "The rooms")}
# Run elsewhere: with a daemon that is told to read its files again, by inventory-purchase.
ELSEWHERE = {("inventory.md", "A worked example")}
# Data that a program of ours reads, and how it is told to look at it.
READERS = {".script.inv": "sennetctl check --offline {}", ".mof": "cimomd --check {}"}


class DocumentWalk:
    """One document from its beginning to its end, on a system of its own."""

    def __init__(self, document, place):
        self.document = document
        self.place = place
        self.outputs = {}

    def blocks(self):
        return [block for block in self.document.blocks
                if (self.document.name, block.section) not in FIGURES | ELSEWHERE]

    def look_at(self, block):
        if block.language == "sh":
            self.run_script(block)
        elif block.language == "console":
            self.run_commands(block)
        elif "file" in block.attributes:
            self.write_file(block)
        elif "from" in block.attributes:
            self.compare_output(block)
        else:
            raise AssertionError("nothing says what this block is")

    def run_script(self, block):
        if all(map(CHECKS.builds, block.text.splitlines())):
            for line in block.text.splitlines():
                CHECKS.check(line)
            return
        self.expect_run(block.text, block, 0, ["..."])

    def run_commands(self, block):
        commands = block.commands()
        for command in commands:
            if command.for_root:
                # packaging/test-packages runs it.
                CHECKS.check(command.text)
                continue
            status = int(block.attributes.get("exits", 0)) if command is commands[-1] else 0
            self.expect_run(command.text, block, status, command.shown)

    def expect_run(self, text, block, status, shown):
        on = block.attributes.get("on", "laptop")
        ended, printed = self.place.run(text, on, block.attributes.get("given"))
        if ended != status:
            raise AssertionError(f"{text}\nends with status {ended}:\n{printed}")
        if not has_shape(shown, printed.splitlines()):
            raise AssertionError(f"{text}\nprints another thing than what is shown:\n{printed}")

    def write_file(self, block):
        name = block.attributes["file"]
        self.place.write(name, block.text)
        for end, command in READERS.items():
            if name.endswith(end) and "faulty" not in block.attributes:
                self.expect_run(command.format(name), block, 0, ["..."])

    def compare_output(self, block):
        machine, product, name = block.attributes["from"].split("/")
        if (machine, product) not in self.outputs:
            directory = f"{machine}-{product}"
            status, printed = self.place.run(f"sennet /{product} {directory} {directory}", machine)
            if status != 0:
                raise AssertionError(f"sennet /{product} fails on {machine}:\n{printed}")
            self.outputs[machine, product] = self.place.work / directory
        text = (self.outputs[machine, product] / name).read_bytes().decode().replace("\r\n", "\n")
        if not has_shape(["...", *block.text.splitlines(), "..."], text.splitlines()):
            raise AssertionError(f"{name} has no such part")


class DocumentsTest(unittest.TestCase):
    def test_commands_do_what_the_documents_show(self):
        for document in documents_of(SOURCES.source):
            with Place(SOURCES) as place:
                walk = DocumentWalk(document, place)
                for block in walk.blocks():
                    with self.subTest(block=f"{document.name}:{block.line}"):
                        walk.look_at(block)

    def test_every_block_tells_its_language(self):
        for document in documents_of(SOURCES.source):
            self.assertEqual((document.name, list(document.indented_blocks())),
                             (document.name, []))

    def test_situations_are_known(self):
        for document in documents_of(SOURCES.source):
            for block in document.blocks:
                given = block.attributes.get("given")
                self.assertIn(given, [None, *SITUATIONS], f"{document.name}:{block.line}")

    def test_commands_in_sentences_exist(self):
        for document in documents_of(SOURCES.source):
            for line, text in document.inline_code():
                if " " in text and CHECKS.knows(text):
                    with self.subTest(place=f"{document.name}:{line}", command=text):
                        CHECKS.check(text)

    def test_the_readme_leads_to_every_document(self):
        readme, *others = documents_of(SOURCES.source)
        linked = {link for _, link in readme.links()}
        for document in others:
            self.assertIn(str(document.path.relative_to(SOURCES.source)), linked)

    def test_links_lead_somewhere(self):
        documents = documents_of(SOURCES.source)
        anchors = {document.path: document.anchors() for document in documents}
        for document in documents:
            for line, link in document.links():
                path, _, anchor = link.partition("#")
                target = (document.path.parent / path).resolve() if path else document.path
                with self.subTest(place=f"{document.name}:{line}", link=link):
                    self.assertTrue(target.exists())
                    self.assertTrue(not anchor or anchor in anchors[target])


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    for option in ("source", "build"):
        parser.add_argument("--" + option, type=pathlib.Path, required=True)
    known, rest = parser.parse_known_args()
    SOURCES = Sources(known.source.resolve(), known.build.resolve())
    CHECKS = Checks(SOURCES)
    unittest.main(argv=[sys.argv[0], *rest])
