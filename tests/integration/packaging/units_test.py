"""The units that make an inventory every day: systemd finds nothing wrong with them, and they leave
little exposed."""

import pathlib
import re
import subprocess
import tempfile
import unittest

from places import Places, run_tests

# systemd-analyze grades from 0 (best) to 10; it counts root as most of what is left.
MAX_EXPOSURE = 3.0


class UnitsTest(unittest.TestCase):
    def setUp(self):
        directory = tempfile.TemporaryDirectory(prefix="sennet-units-")
        self.addCleanup(directory.cleanup)
        self.directory = pathlib.Path(directory.name)
        for name in ("sennet@.service", "sennet@.timer"):
            # The program need not be installed for a look at the units.
            text = re.sub(r"(?m)^ExecStart=\S+", "ExecStart=/bin/true", self.unit(name))
            (self.directory / name.replace("@", "@SMS")).write_text(text)

    @staticmethod
    def unit(name):
        return (Places.built / "systemd" / name).read_text()

    def test_systemd_takes_them(self):
        units = [self.directory / f"sennet@SMS.{kind}" for kind in ("service", "timer")]
        result = subprocess.run(["systemd-analyze", "verify", "--man=no", *units],
                                capture_output=True, text=True, timeout=60, check=False)
        self.assertEqual((result.returncode, result.stderr), (0, ""))

    def test_little_is_exposed(self):
        result = subprocess.run(
            ["systemd-analyze", "security", "--offline=true", "--no-pager",
             self.directory / "sennet@SMS.service"],
            capture_output=True, text=True, timeout=60, check=True)
        exposure = re.search(r"Overall exposure level for \S+: ([\d.]+)", result.stdout).group(1)
        self.assertLessEqual(float(exposure), MAX_EXPOSURE)

    def test_the_instance_is_the_product(self):
        self.assertRegex(self.unit("sennet@.service"), r"(?m)^ExecStart=/\S+/sennet /%i$")

    def test_the_timer_brings_runs_up_that_were_missed_and_spreads_them(self):
        lines = self.unit("sennet@.timer").splitlines()
        for line in ("OnCalendar=daily", "RandomizedDelaySec=4h", "Persistent=yes",
                     "WantedBy=timers.target"):
            self.assertIn(line, lines)


if __name__ == "__main__":
    run_tests()
