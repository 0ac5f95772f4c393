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


def options_of_cimomd():
    """The options that the program itself tells, in both spellings."""
    result = subprocess.run([Places.programs / "cimomd", "--help"], capture_output=True, text=True,
                            timeout=60, check=True)
    heads = re.findall(r"(?m)^  (-\S+)", result.stdout)
    return sorted(option for head in heads for option in head.split(","))
