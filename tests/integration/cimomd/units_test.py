"""The systemd units: systemd finds nothing wrong with them, they leave little exposed, and they hide
nothing that an inventory lists."""

import argparse
import pathlib
import re
import subprocess
import sys
import tempfile
import unittest

UNITS = None
USERS = None
# systemd-analyze grades from 0 (best) to 10; what is left is the network of the loopback and the
# one capability.
MAX_EXPOSURE = 2.5


class UnitsTest(unittest.TestCase):
    def setUp(self):
        self.directory = tempfile.TemporaryDirectory(prefix="cimomd-units-")
        self.addCleanup(self.directory.cleanup)
        self.units = []
        for name in ("cimomd.service", "cimomd.socket"):
            # The program need not be installed for a look at the units.
            text = re.sub(r"(?m)^ExecStart=\S+", "ExecStart=/bin/true",
                          (UNITS / name).read_text())
            unit = pathlib.Path(self.directory.name) / name
            unit.write_text(text)
            self.units.append(str(unit))

    def test_systemd_takes_them(self):
        result = subprocess.run(["systemd-analyze", "verify", "--man=no", *self.units],
                                capture_output=True, text=True, check=False)
        self.assertEqual((result.returncode, result.stderr), (0, ""))

    def test_little_is_exposed(self):
        result = subprocess.run(
            ["systemd-analyze", "security", "--offline=true", "--no-pager", self.units[0]],
            capture_output=True, text=True, check=True)
        exposure = re.search(r"Overall exposure level for \S+: ([\d.]+)", result.stdout).group(1)
        self.assertLessEqual(float(exposure), MAX_EXPOSURE)

    def test_the_user_of_the_service_is_made(self):
        # The message bus turned a dynamic user away, and the table of services stayed empty.
        self.assertIn("User=cimomd", (UNITS / "cimomd.service").read_text().splitlines())
        users = pathlib.Path(self.directory.name) / "root"
        (users / "etc").mkdir(parents=True)
        subprocess.run(["systemd-sysusers", f"--root={users}", USERS], capture_output=True,
                       check=True)
        self.assertRegex((users / "etc" / "passwd").read_text(), r"(?m)^cimomd:x:\d+:\d+:")

    def test_nothing_is_hidden_from_the_inventory(self):
        # What was mounted below /tmp and /usr/lib/modules was missing from the tables of file systems,
        # a made-up mount stood there, and a daemon that ran for weeks knew the old host name only.
        hiding = re.compile(r"(?m)^(PrivateTmp|PrivateDevices|PrivateNetwork|PrivateUsers|ProcSubset"
                            r"|ProtectProc|ProtectKernelModules|InaccessiblePaths|TemporaryFileSystem"
                            r"|ProtectHome=(?!read-only$)).*")
        for name in ("cimomd.service", "sennet@.service"):
            with self.subTest(unit=name):
                self.assertIsNone(hiding.search((UNITS / name).read_text()))
        self.assertNotIn("\nProtectHostname", (UNITS / "cimomd.service").read_text())

    def test_the_hardening_that_was_promised_is_there(self):
        lines = (UNITS / "cimomd.service").read_text().splitlines()
        for line in ("ProtectSystem=strict", "NoNewPrivileges=yes",
                     "CapabilityBoundingSet=CAP_DAC_READ_SEARCH",
                     "ExecReload=/bin/sh -c 'kill -HUP $MAINPID'"):
            self.assertIn(line, lines)


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--units", type=pathlib.Path, required=True)
    parser.add_argument("--users", type=pathlib.Path, required=True)
    known, rest = parser.parse_known_args()
    UNITS = known.units
    USERS = known.users
    unittest.main(argv=[sys.argv[0], *rest])
