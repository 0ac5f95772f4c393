"""Where the tests of the packaging find what they look at."""

import argparse
import pathlib
import re
import subprocess
import sys
import unittest


class Places:
    """Filled from the command line by run_tests."""

    source = None
    built = None
    programs = None


def run_tests():
    parser = argparse.ArgumentParser()
    for name in ("source", "built", "programs"):
        parser.add_argument("--" + name, type=pathlib.Path, required=True)
    known, rest = parser.parse_known_args(namespace=Places())
    for name in ("source", "built", "programs"):
        setattr(Places, name, getattr(known, name).resolve())
    unittest.main(module="__main__", argv=[sys.argv[0], *rest])


def help_of(*command):
    result = subprocess.run([Places.programs / command[0], *command[1:], "--help"],
                            capture_output=True, text=True, timeout=60, check=True)
    return result.stdout


def options_of(*command):
    """The options that the program itself tells, in both spellings."""
    heads = re.findall(r"(?m)^  (-\S+)", help_of(*command))
    return sorted(option for head in heads for option in head.split(","))


def commands_of(*command):
    """The names of the program's commands, as it tells them itself."""
    return re.findall(r"(?m)^  (\w+)", help_of(*command).partition("Subcommands:\n")[2]
                      .partition("\n\n")[0])
