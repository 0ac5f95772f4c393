"""Every command with --json, also with findings and failures: its document has the members that
sennetctl(1) names, of the types named there, and the page names no others."""

import argparse
import dataclasses
import json
import os
import pathlib
import socket
import subprocess
import sys
import tempfile
import unittest

HERE = pathlib.Path(__file__).resolve().parent
sys.path[1:1] = [str(HERE.parent / "inventory"), str(HERE.parent / "packaging")]
import installation
import places
from manual_members import ANY_NAME, members_of

ARGUMENTS = None
MOF = """
class Example_Thing {
    [Key] string Id;
    uint32 Number;
    [Values {"None", "Some"}] uint16 State;
    [Values {"None", "Some"}] uint16 States[];
    Example_Thing ref Other;
};
instance of Example_Thing { Id = "1"; Number = 7; State = 1; States = {0, 1}; };
instance of Example_Thing { Id = "2"; };
class Example_Other { [Key] string Id; };
instance of Example_Other { Id = "1"; };
"""
GOOD_SCRIPT = ("[DEFAULT]\ntitle=Things\n[CIM]\nG[0]=Example_Thing\nN[0]=root/cimv2\n"
               "A[0]=Id,Number,State\n")
TEXTS = ("Example_Thing.Id=Id\nExample_Thing.Number=Count\nExample_Thing.Id.Size=8\n"
         "Example_Thing.State.Size=8\n")


def mif(table="Fan", size=9, rows='{ "a", 1 } { "b", 2 }'):
    return f"""Start Component Name = "Machine"
Start Group Name = "{table}" Class = "Own|Fan|001" Key = 1
Start Attribute Name = "Text" Id = 1 Type = String({size}) Value = "" End Attribute
Start Attribute Name = "Number" Id = 2 Type = Integer Value = unsupported End Attribute
End Group
Start Table Name = "{table}" Class = "Own|Fan|001" Id = 1
{rows}
End Table
End Component
"""


FILES = {
    "good.script.inv": GOOD_SCRIPT,
    "faulty.script.inv": GOOD_SCRIPT + "nonsense\n",
    "good.mif": mif(),
    "changed.mif": mif(table="Fans", size=8, rows='{ "a", 3 } { "c", }'),
    "renamed.mif": mif().replace('"Machine"', '"Other"'),
    "faulty.mif": mif().replace("Id = 2", "Id = 1"),
    "broken.mif": "Start Component\n   Nonsense\n",
}
REACHED, MISSING, SILENT = "cimomd.socket", "none.socket", "silent.socket"
# What is run: the command, the other words, the status, or none where the machine decides it, and
# the socket of the server, or none for those of the machine.
RUNS = [
    ("check", "good.script.inv", 0, REACHED),
    ("check", "faulty.script.inv", 1, REACHED),
    ("check", "faulty.script.inv --offline", 1, MISSING),
    ("check", "good.script.inv", 1, MISSING),
    ("check", "good.script.inv none.script.inv", 2, REACHED),
    ("check", "", 2, REACHED),
    ("server", "", 0, REACHED),
    ("server", "--classes -n root/none", 1, REACHED),
    ("server", "", 1, MISSING),
    ("server", "--timeout 1", 1, SILENT),
    ("server", "", None, None),
    ("server", "-n root//none", 2, REACHED),
    ("get", "Example_Thing", 0, REACHED),
    ("get", "Example_Thing -p Id,Nothing", 1, REACHED),
    ("get", "Example_Nothing", 2, REACHED),
    ("get", "Example_Thing", 2, MISSING),
    ("new", "one.script.inv --class Example_Thing", 0, REACHED),
    ("new", "two.script.inv --class Example_Thing --class Example_Other", 0, REACHED),
    ("new", "good.script.inv --class Example_Thing", 2, REACHED),
    ("mif check", "good.mif", 1, None),
    ("mif check", "faulty.mif good.mif", 1, None),
    ("mif check", "good.mif none.mif", 2, None),
    ("mif check", "--max-kb 100 good.mif", 2, None),
    ("mif show", "changed.mif", 0, None),
    ("mif show", "broken.mif", 2, None),
    ("mif json", "changed.mif", 0, None),
    ("mif json", "none.mif", 2, None),
    ("mif diff", "good.mif good.mif", 0, None),
    ("mif diff", "good.mif changed.mif", 1, None),
    ("mif diff", "good.mif renamed.mif", 1, None),
    ("mif diff", "good.mif broken.mif", 2, None),
    ("mif html", "good.mif -o page", 0, None),
    ("mif html", "good.mif broken.mif -o other", 2, None),
    ("mif html", "none.mif -o none", 2, None),
    ("mif html", "good.mif -o page", 2, None),
]


@dataclasses.dataclass
class Seen:
    """An object of a document: its place in it, and itself."""

    command: str
    path: tuple
    content: dict


def type_of(value):
    """A type as the page says it; None for an empty array, which may be one of any."""
    if isinstance(value, list):
        kinds = {type_of(each) + "s" for each in value}
        return "array of " + " and ".join(sorted(kinds)) if kinds else None
    return {str: "string", bool: "boolean", int: "number", float: "number", dict: "object",
            type(None): "null"}[type(value)]


class JsonTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.place = pathlib.Path(cls.enterClassContext(
            tempfile.TemporaryDirectory(prefix="sennet-json-")))
        (cls.place / "mof.d").mkdir()
        (cls.place / "mof.d/own.mof").write_text(MOF)
        for name, text in FILES.items():
            (cls.place / name).write_text(text)
        (cls.place / "sennet.properties").write_text(TEXTS)
        (cls.place / "velm.properties").write_text(
            f"sennet.directory={cls.place}/scripts\n"
            f"sennet.resources={cls.place}/sennet.properties\n")
        (cls.place / "scripts").mkdir()
        (cls.place / "scripts/lost.script.inv").symlink_to("nowhere")
        cls.enterClassContext(installation.Cimomd(
            installation.programs_of(ARGUMENTS), cls.place,
            ARGUMENTS.machines.resolve() / "laptop", cls.place / "mof.d"))
        silent = cls.enterClassContext(socket.socket(socket.AF_UNIX))
        silent.bind(str(cls.place / SILENT))
        silent.listen()
        cls.members = members_of(ARGUMENTS.page.read_text())
        cls.documents = [(run[0], cls.document_of(*run)) for run in RUNS]
        cls.seen = [seen for command, document in cls.documents
                    for seen in cls.objects_in(command, (), document)]

    @classmethod
    def document_of(cls, command, words, status, server):
        line = [*command.split(), "--json", *words.split()]
        place = {"CIM_LOCAL_SOCKET": str(cls.place / server)} if server else {}
        result = subprocess.run(
            [ARGUMENTS.programs.resolve() / "sennetctl", *line], capture_output=True, text=True,
            timeout=60, check=False, cwd=cls.place,
            env={"PATH": os.environ["PATH"], "CIM_EMBEDDED": "never", **place,
                 "VELM_CONFIG": str(cls.place / "velm.properties")})
        if status not in (None, result.returncode):
            raise AssertionError(f"{line} ends with status {result.returncode}: {result}")
        return json.loads(result.stdout)

    @classmethod
    def objects_in(cls, command, path, value):
        for each in value if isinstance(value, list) else [value]:
            if isinstance(each, dict):
                yield Seen(command, path, each)
                for name, inner in each.items():
                    yield from cls.objects_in(command, cls.path_of(path, name), inner)

    @classmethod
    def path_of(cls, around, name):
        """Where a member is, by the name that the page has for it."""
        any_name = (*around, ANY_NAME)
        return any_name if any(each.path == any_name for each in cls.members) else (*around, name)

    def values_of(self, member, command=None):
        return [value for seen in self.seen for name, value in seen.content.items()
                if self.path_of(seen.path, name) == member.path
                and member.belongs_to(seen.command) and command in (None, seen.command)]

    def objects_around(self, member):
        """The objects that may have a member. One that tells but an error has no others."""
        return [seen.content for seen in self.seen
                if seen.path == member.path[:-1] and member.belongs_to(seen.command)
                and (seen.path or set(seen.content) != {"error"})]

    def test_every_command_is_run_and_on_the_page(self):
        places.Places.programs = ARGUMENTS.programs.resolve()
        commands = {name for name in places.commands_of("sennetctl") if name != "mif"}
        commands |= {"mif " + name for name in places.commands_of("sennetctl", "mif")}
        self.assertEqual({command for command, *_ in RUNS}, commands)
        self.assertEqual({name for each in self.members for name in each.commands}, commands)

    def test_the_page_names_each_member(self):
        for seen in self.seen:
            for name in seen.content:
                path = self.path_of(seen.path, name)
                with self.subTest(command=seen.command, path=path):
                    self.assertTrue(any(each.path == path and each.belongs_to(seen.command)
                                        for each in self.members))

    def test_each_member_of_the_page_is_there(self):
        self.assertGreater(len(self.members), 50)
        for member in self.members:
            commands = {command for command, *_ in RUNS if member.belongs_to(command)}
            for command in commands if len(member.path) == 1 else [None]:
                with self.subTest(command=command, path=member.path):
                    self.assertTrue(self.values_of(member, command))

    def test_types_are_those_of_the_page(self):
        for member in self.members:
            if member.types != {"any type"}:
                with self.subTest(path=member.path):
                    seen = {type_of(value) for value in self.values_of(member)} - {None}
                    self.assertEqual(seen, member.types)

    def test_only_members_that_the_page_says_so_of_may_be_absent(self):
        for member in self.members:
            if member.path[-1] != ANY_NAME and member.path != ("error",):
                with self.subTest(path=member.path):
                    around = self.objects_around(member)
                    absent = [each for each in around if member.path[-1] not in each]
                    self.assertEqual(bool(absent), member.may_be_absent(), absent[:1])

    def test_an_error_is_there_when_the_status_is_2(self):
        for (command, words, status, _), (_, document) in zip(RUNS, self.documents):
            with self.subTest(command=command, words=words):
                self.assertEqual("error" in document, status == 2)
                self.assertTrue("error" not in document or "failures" in document
                                or len(document) == 1)


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    parser.add_argument("--page", type=pathlib.Path, required=True)
    ARGUMENTS, rest = parser.parse_known_args()
    unittest.main(argv=[sys.argv[0], *rest])
