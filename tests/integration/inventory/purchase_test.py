"""The worked example of docs/inventory.md, step by step as it stands there."""

import argparse
import os
import pathlib
import re
import shutil
import subprocess
import sys
import tempfile
import unittest

import installation

PROGRAMS = None
EXAMPLE = None
DOCUMENT = None

# Stands in for systemd's, which waits for the end of a reload too.
SYSTEMCTL = """#!/bin/bash
set -eu
[ "$*" = "reload cimomd" ]
kill -HUP "$CIMOMD_PID"
for ((i = 0; i < 500; ++i)); do
    grep -q "loaded again" "$CIMOMD_LOG" && exit 0
    sleep 0.02
done
exit 1
"""


def section():
    return DOCUMENT.read_text().split("## A worked example\n", 1)[1].split("\n## ", 1)[0]


def blocks(language):
    return re.findall(rf"(?ms)^```{language}\n(.*?)^```$", section())


class PurchaseTest(unittest.TestCase):
    def setUp(self):
        directory = tempfile.TemporaryDirectory(prefix="inventory-purchase-")
        self.addCleanup(directory.cleanup)
        self.place = pathlib.Path(directory.name)
        for name in ("mof.d", "root", "bin"):
            (self.place / name).mkdir()
        shutil.copytree(PROGRAMS.inventory, self.place / "sennet")
        shutil.copytree(EXAMPLE, self.place / "example")
        systemctl = self.place / "bin" / "systemctl"
        systemctl.write_text(SYSTEMCTL)
        systemctl.chmod(0o755)
        (self.place / "velm.properties").write_text(
            f"sennet.directory={self.place / 'sennet'}\n"
            f"sennet.resources={self.place / 'sennet' / 'sennet.properties'}\n")

    def bash(self, commands, server):
        return subprocess.run(
            ["bash", "-eu"], input=commands, cwd=self.place / "example", capture_output=True,
            text=True, timeout=60, check=False,
            env={"PATH": f"{self.place / 'bin'}:{PROGRAMS.sennet.parent}:{os.environ['PATH']}",
                 "MOF_DIR": str(self.place / "mof.d"), "SENNET_DIR": str(self.place / "sennet"),
                 "CIMOMD_PID": str(server.process.pid), "CIMOMD_LOG": str(server.log_path),
                 "VELM_CONFIG": str(self.place / "velm.properties"),
                 "CIM_LOCAL_SOCKET": str(server.socket), "CIM_EMBEDDED": "never"})

    def test_every_step_does_what_is_told(self):
        with installation.Cimomd(PROGRAMS, self.place, self.place / "root",
                                 self.place / "mof.d") as server:
            for commands in blocks("sh"):
                result = self.bash(commands, server)
                self.assertEqual((result.returncode, result.stderr), (0, ""), commands)
        self.assertIn("Processing purchase...\n", result.stdout)
        written = (self.place / "example" / "out" / "purchase.mif").read_bytes()
        shown = blocks("mif")
        self.assertEqual(len(shown), 1)
        self.assertIn(shown[0].replace("\n", "\r\n").encode(), written)
        self.assertEqual(PROGRAMS.tables(self.place / "example" / "out" / "purchase.mif", []), [{
            "name": "Purchase",
            "columns": ["Index", "Order Number", "Ordered", "Price", "Supplier", "Warranty End",
                        "Ownership"],
            "rows": [["1", "PO-2026-00417", "20260302000000.000000+060", "1249.00 EUR",
                      "Example Trading", "20290301000000.000000+060", "Bought"]],
        }])

    def test_the_document_shows_the_files(self):
        shown = section()
        for file in sorted(EXAMPLE.iterdir()):
            self.assertIn(f"\n{file.read_text().strip()}\n```\n", shown, file.name)


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    known, rest = parser.parse_known_args()
    PROGRAMS = installation.programs_of(known)
    EXAMPLE = known.examples / "purchase"
    DOCUMENT = known.examples.parent / "inventory.md"
    unittest.main(argv=[sys.argv[0], *rest])
