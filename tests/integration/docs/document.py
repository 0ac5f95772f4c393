"""The documents as a reader meets them: sections, fenced blocks, and commands with what they print.

The first word behind the fence is the language:

    sh          commands; all of them have to succeed
    console     `$ ` before a command, `# ` before one for root on an installed system, `> ` before a
                further line of it; what else stands there is printed by the command above
    others      data

Further words tell where it comes from and are not shown to readers:

    file=NAME   the block is written to this file, for the commands behind it
    from=PATH   the block is a part of what sennet writes: MACHINE/PRODUCT/FILE
    on=MACHINE  the recorded machine that the commands run on
    given=NAME  what is wrong with the system meanwhile
    exits=N     the status of the last command, where it is not 0
"""

import dataclasses
import pathlib
import re


@dataclasses.dataclass
class Command:
    text: str
    for_root: bool
    line: int
    shown: list = dataclasses.field(default_factory=list)


@dataclasses.dataclass
class Block:
    section: str
    line: int
    language: str
    attributes: dict
    text: str

    def commands(self):
        """The commands of a console block."""
        found = []
        for number, line in enumerate(self.text.splitlines(), self.line + 1):
            if line[:2] in ("$ ", "# "):
                found.append(Command(line[2:], line[0] == "#", number))
            elif not found:
                raise ValueError(f"line {number}: printed before any command")
            elif line[:2] == "> " and not found[-1].shown:
                found[-1].text += "\n" + line[2:]
            else:
                found[-1].shown.append(line)
        return found


class Document:
    def __init__(self, path):
        self.path = path
        self.name = path.name
        self.blocks = []
        self.sections = []
        self.prose = []  # (number, line) outside of the blocks
        self._read(path.read_text())

    def _read(self, text):
        block = None
        lines = []
        indentation = ""
        for number, line in enumerate(text.splitlines(), 1):
            fence = re.fullmatch(r"( *)```(\S*) ?(.*)", line)
            if fence and block is None:
                block = Block(self.sections[-1] if self.sections else "", number, fence[2],
                              dict(word.split("=", 1) for word in fence[3].split()), "")
                lines = []
                indentation = fence[1]
            elif fence:
                block.text = "".join(lines)
                self.blocks.append(block)
                block = None
            elif block is not None:
                lines.append(line.removeprefix(indentation) + "\n")
            else:
                self.prose.append((number, line))
                if heading := re.fullmatch(r"#+ (.*)", line):
                    self.sections.append(heading[1])
        if block is not None:
            raise ValueError(f"{self.name}:{block.line}: the block has no end")

    def indented_blocks(self):
        """Lines where a block begins that has no fence, and so tells no language."""
        before = ""
        last_text = ""
        for number, line in self.prose:
            if line.startswith("    ") and not before and not re.match(r" *([-*]|\d+\.) ", last_text):
                yield number
            before = line.strip()
            last_text = line if before and not line.startswith("    ") else last_text

    def inline_code(self):
        """Code within sentences and tables, as (line, text)."""
        text = "\n".join(line for _, line in self.prose)
        numbers = [number for number, _ in self.prose]
        for match in re.finditer(r"`([^`]+)`", text):
            yield numbers[text.count("\n", 0, match.start())], " ".join(match[1].split())

    def links(self):
        for number, line in self.prose:
            for target in re.findall(r"\]\(([^)]+)\)", line):
                yield number, target

    def anchors(self):
        return {re.sub(r"[^\w\- ]", "", section.lower()).replace(" ", "-")
                for section in self.sections}


def documents_of(source):
    """All documents of a tree of sources."""
    own = (source / name for name in ("README.md", "CONTRIBUTING.md", "SECURITY.md"))
    return [Document(path) for path in (*own, *sorted((source / "docs").glob("*.md")))]


def shape(line):
    """What stays the same from machine to machine and from day to day."""
    return re.sub(r"\d+(\.\d+)?", "0", " ".join(line.split()))


def _matches(shown, printed):
    """Where each of the lines stands at the beginning of what was printed."""
    return shown == printed[:len(shown)]


def has_shape(shown, printed):
    """Whether lines were printed as a document shows them; a line `...` stands for any number."""
    printed = [shape(line) for line in printed]
    pieces = [[]]
    for line in shown:
        if line.strip() == "...":
            pieces.append([])
        else:
            pieces[-1].append(shape(line))
    if len(pieces) == 1:
        return pieces[0] == printed
    if not _matches(pieces[0], printed):
        return False
    start = len(pieces[0])
    for piece in pieces[1:-1]:
        while not _matches(piece, printed[start:]):
            start += 1
            if start > len(printed):
                return False
        start += len(piece)
    last = pieces[-1]
    return len(printed) - start >= len(last) and printed[len(printed) - len(last):] == last


def section_commands(path, section):
    """The commands of a section, those for root and those of `sh`, in their order."""
    found = []
    for block in Document(pathlib.Path(path)).blocks:
        if block.section == section and block.language == "sh":
            found.append(Command(block.text, True, block.line, ["..."]))
        elif block.section == section and block.language == "console":
            found += [command for command in block.commands() if command.for_root]
    return found
