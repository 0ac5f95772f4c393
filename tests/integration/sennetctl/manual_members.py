"""The members of JSON documents that the section JSON of sennetctl(1) names.

It is a list of commands, with a list of members for each, and lists of members within those that are
objects. Behind its name a member has its types; `Only` in its text says that it may be absent, and
"the members of X" that it has those of X. The name of a member that differs from object to object
is an argument (Ar).
"""

import dataclasses
import re

ANY_NAME = "*"


@dataclasses.dataclass
class Member:
    path: tuple  # the names of the objects around it and its own; arrays do not count
    commands: frozenset  # empty for all
    types: frozenset
    text: str = ""

    def may_be_absent(self):
        return re.search(r"\bOnly\b", self.text) is not None

    def belongs_to(self, command):
        return not self.commands or command in self.commands


def _names_and_types(head):
    match = re.fullmatch(r"(Li|Ar) (.+) Pq (.+)", head)
    names = [ANY_NAME] if match[1] == "Ar" else match[2].split(" , ")
    return names, frozenset(re.split(r", | or ", match[3]))


def _commands(head):
    return frozenset(head.removeprefix("Cm ").split(" , ")) if head.startswith("Cm ") else frozenset()


class _Reader:
    """Takes the lines of the section one after the other."""

    def __init__(self):
        self.members = []
        self.commands = frozenset()
        self.around = []  # the names of the item that each open list is in
        self.latest = []  # the members of the last item

    def take(self, line):
        if line.startswith(".Bl "):
            self.around.append(self.latest[0].path if self.latest else ())
            self.latest = []
        elif line == ".El":
            self.around.pop()
            self.latest = []
        elif not line.startswith(".It "):
            for member in self.latest:
                member.text += line + "\n"
        elif len(self.around) == 1:
            self.commands = _commands(line.removeprefix(".It "))
            self.latest = []
        else:
            names, types = _names_and_types(line.removeprefix(".It "))
            self.latest = [Member((*self.around[-1], name), self.commands, types)
                           for name in names]
            self.members += self.latest


def _with_those_of_others(members):
    """Members, and those that they have from another by its name."""
    found = list(members)
    for member in members:
        if other := re.search(r"the members of\n\.Li (\w+)", member.text):
            found += [dataclasses.replace(each, path=(*member.path, *each.path[1:]),
                                          commands=member.commands)
                      for each in members if each.path[0] == other[1] and len(each.path) > 1]
    return found


def members_of(page):
    reader = _Reader()
    for line in page.partition(".Sh JSON\n")[2].partition("\n.Sh ")[0].splitlines():
        reader.take(line)
    return _with_those_of_others(reader.members)
