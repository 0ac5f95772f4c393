"""The reader of the documents, and the comparison of what they show with what is printed."""

import pathlib
import subprocess
import tempfile
import unittest

import document
import root_commands

TEXT = """\
# Title

Run `sennet
/SMS` and see [below](#the-end-of-it), or [there](other.md).

- an item

      of several lines

## The end of it!

```console given=nothing exits=1
$ one \\
> two
printed
# three
$ four
```

    no fence

- a list

  ```ini file=a.ini
  [x]
  ```
"""


class DocumentTest(unittest.TestCase):
    def setUp(self):
        directory = tempfile.TemporaryDirectory(prefix="sennet-document-")
        self.addCleanup(directory.cleanup)
        self.path = pathlib.Path(directory.name) / "some.md"
        self.path.write_text(TEXT)
        self.document = document.Document(self.path)

    def test_blocks(self):
        console, data = self.document.blocks
        self.assertEqual((console.section, console.line, console.language, console.attributes),
                         ("The end of it!", 12, "console", {"given": "nothing", "exits": "1"}))
        self.assertEqual((data.language, data.attributes, data.text),
                         ("ini", {"file": "a.ini"}, "[x]\n"))

    def test_commands(self):
        one, three, four = self.document.blocks[0].commands()
        self.assertEqual((one.text, one.for_root, one.line, one.shown),
                         ("one \\\ntwo", False, 13, ["printed"]))
        self.assertEqual((three.text, three.for_root, three.shown), ("three", True, []))
        self.assertEqual((four.text, four.for_root), ("four", False))

    def test_output_without_a_command_is_refused(self):
        block = document.Block("", 1, "console", {}, "printed\n$ one\n")
        with self.assertRaises(ValueError):
            block.commands()

    def test_a_block_without_end_is_refused(self):
        self.path.write_text("```sh\nls\n")
        with self.assertRaises(ValueError):
            document.Document(self.path)

    def test_what_stands_between_the_blocks(self):
        self.assertEqual(list(self.document.indented_blocks()), [20])
        self.assertEqual(list(self.document.inline_code()), [(3, "sennet /SMS")])
        self.assertEqual(list(self.document.links()),
                         [(4, "#the-end-of-it"), (4, "other.md")])
        self.assertEqual(self.document.anchors(), {"title", "the-end-of-it"})

    def test_commands_of_a_section(self):
        self.assertEqual([command.text for command in
                          document.section_commands(self.path, "The end of it!")], ["three"])


class ShapeTest(unittest.TestCase):
    def assertShape(self, shown, printed, expected=True):
        self.assertEqual(document.has_shape(shown.split("|"), printed.split("|")), expected)

    def test_numbers_and_blanks_differ(self):
        self.assertShape("12 instances  of X", "7 instances of X")
        self.assertShape("0.40 ms", "13 ms")

    def test_words_do_not(self):
        self.assertShape("12 instances of X", "7 instances of Y", False)
        self.assertShape("a|b", "a", False)
        self.assertShape("a", "a|b", False)

    def test_dots_stand_for_any_lines(self):
        self.assertShape("a|...|c", "a|b|b|c")
        self.assertShape("a|...|c", "a|c")
        self.assertShape("...|c", "a|b|c")
        self.assertShape("a|...", "a|b|c")
        self.assertShape("a|...|c|...|e", "a|b|c|d|e")

    def test_dots_leave_no_line_out_that_is_shown(self):
        self.assertShape("a|...|c", "a|b", False)
        self.assertShape("a|...|c|...|e", "a|b|d|e", False)
        self.assertShape("...|c", "c|d", False)
        self.assertShape("a|...|a", "a", False)


class RootCommandsTest(unittest.TestCase):
    def setUp(self):
        directory = tempfile.TemporaryDirectory(prefix="sennet-root-commands-")
        self.addCleanup(directory.cleanup)
        self.path = pathlib.Path(directory.name) / "some.md"
        self.place = pathlib.Path(directory.name) / "told"

    def judged(self, shown, command="echo 7 timers"):
        """What is said of a command after it has run; None is nothing."""
        self.path.write_text(f"## One\n\n```console\n# {command}\n{shown}\n```\n")
        script = subprocess.run(
            ["python3", "-B", root_commands.__file__, "script", self.path, "One", self.place],
            capture_output=True, check=True, timeout=60).stdout
        subprocess.run(["sh"], input=script, check=True, timeout=60)
        try:
            return root_commands.judge(self.path, "One", self.place)
        except SystemExit as end:
            return str(end)

    def test_what_is_shown_is_compared(self):
        self.assertIsNone(self.judged("8 timers"))
        self.assertIn("prints another thing", self.judged("8 services"))

    def test_a_failure_is_told(self):
        self.assertIn("ends with status 1", self.judged("", "false"))

    def test_a_command_that_did_not_run_is_told(self):
        self.judged("8 timers")
        (self.place / "0.status").unlink()
        with self.assertRaises(SystemExit):
            root_commands.judge(self.path, "One", self.place)

    def test_a_section_without_commands_is_told(self):
        self.judged("8 timers")
        with self.assertRaises(SystemExit):
            root_commands.judge(self.path, "Two", self.place)


if __name__ == "__main__":
    unittest.main()
