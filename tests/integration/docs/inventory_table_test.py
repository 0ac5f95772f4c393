"""The table of docs/inventory.md names each shipped script with its title and its class."""

import argparse
import pathlib
import re
import sys
import unittest

SOURCE = None
END = ".script.inv"


def shown_scripts():
    """Script, title and class of each row."""
    text = (SOURCE / "docs/inventory.md").read_text()
    return re.findall(r"(?m)^\| `([a-z]+)` \| ([^|]+) \| `(\w+)` \|", text)


def entry(text, key):
    return re.search(rf"(?m)^{re.escape(key)}=(.*)$", text)[1]


def shipped_scripts():
    names = (SOURCE / "inventory/sennet.properties").read_text()
    for path in sorted((SOURCE / "inventory").glob("*" + END)):
        text = path.read_text()
        title = entry(text, "title").replace(" ", "_")
        yield path.name[:-len(END)], entry(names, "title." + title), entry(text, "G[0]")


class InventoryTableTest(unittest.TestCase):
    def test_it_has_a_row_for_each_script(self):
        self.assertEqual(shown_scripts(), list(shipped_scripts()))


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--source", type=pathlib.Path, required=True)
    known, rest = parser.parse_known_args()
    SOURCE = known.source.resolve()
    unittest.main(argv=[sys.argv[0], *rest])
