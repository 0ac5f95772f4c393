"""Every class that cimomd ships, asked on the machine this runs on: the answers agree with each
other, each null has its reason, and a user without rights is told nothing else than root, only
less."""

import argparse
import collections
import os
import pathlib
import shutil
import subprocess
import sys
import tempfile
import unittest

from cimomd_server import NAMESPACE
from live_server import LiveServer

CIMOMD = None

MISSING = "Velmira_MissingValue"
PROCESS = "Velmira_UnixProcess"
ABSENT, NEEDS_ROOT = 2, 3
# What numbers with words are where their source tells none.
UNKNOWN = {"BatteryStatus": 2, "CacheType": 0, "Chemistry": 2, "DiskType": 0, "EnabledState": 0,
           "FormFactor": 0, "OSType": 0}
# How many instances of a class are asked for one by one.
SAMPLE = 5

# What changes from one reading to the next.
PASSING = {
    "AvailableSpace", "AvailableSpaceMB", "CurrentClockSpeed", "CurrentReading", "CurrentValue",
    "EstimatedChargeRemaining", "EstimatedRunTime", "FreeInodes", "FreePhysicalMemory",
    "FreePhysicalMemoryMB", "FreeVirtualMemory", "LastLogin", "LocalDateTime", "NumberOfProcesses",
    "NumberOfUsers"}


def constant(properties):
    return {name: value for name, value in properties.items() if name not in PASSING}


def sample(instances):
    return instances[::max(1, len(instances) // SAMPLE)]


def lasting(names):
    """Keys without those of processes, which come and go."""
    return [keys for keys in names if not keys.get("InstanceID", "").startswith(
        f"Velmira:{PROCESS}:")]


class ShippedClassesTest(unittest.TestCase):
    maxDiff = None

    @classmethod
    def setUpClass(cls):
        cls.server = LiveServer(CIMOMD)
        cls.addClassCleanup(cls.server.end)
        cls.client = cls.server.client
        cls.classes = sorted(name for name in cls.client.class_names()
                             if name.startswith("Velmira_"))

    def check_each_class(self, check):
        self.assertIn("Velmira_OperatingSystem", self.classes)
        for name in self.classes:
            with self.subTest(name=name):
                check(name)

    def test_every_instance_has_its_full_key(self):
        self.check_each_class(self.check_keys)

    def check_keys(self, name):
        instances = self.client.instances(name)
        self.assertEqual({instance.class_name for instance in instances} - {name}, set())
        for instance in instances:
            self.assertEqual(instance.keys, {key: instance[key] for key in instance.keys})
            self.assertNotIn("", instance.keys.values())
        keys = collections.Counter(instance.key() for instance in instances)
        self.assertEqual([key for key, count in keys.items() if count > 1], [])

    def test_enumerating_again_gives_the_same(self):
        self.check_each_class(self.check_again)

    def check_again(self, name):
        if name == PROCESS:
            return
        first, second = (lasting(self.client.names(name)) for _ in range(2))
        self.assertEqual(first, second)
        instances = [(instance.keys, constant(instance.properties))
                     for instance in self.client.instances(name)]
        self.assertEqual(lasting(keys for keys, _ in instances), first)
        if name != MISSING:
            self.assertEqual([(instance.keys, constant(instance.properties))
                              for instance in self.client.instances(name)], instances)

    def test_processes_that_last_keep_their_order(self):
        first, second = ([keys["Handle"] for keys in self.client.names(PROCESS)] for _ in range(2))
        self.assertIn(str(os.getpid()), first)
        self.assertEqual([handle for handle in first if handle in second],
                         [handle for handle in second if handle in first])

    def test_an_instance_alone_is_the_one_among_others(self):
        self.check_each_class(self.check_alone)

    def check_alone(self, name):
        instances = self.client.instances(name)
        if name == PROCESS:
            instances = [instance for instance in instances
                         if instance["Handle"] == str(os.getpid())]
        elif name == MISSING:
            instances = [instance for instance in instances
                         if instance["TargetClassName"] != PROCESS]
        for instance in sample(instances):
            alone = self.client.get(instance)
            self.assertEqual(alone.keys(), instance.properties.keys())
            if name != PROCESS:
                self.assertEqual(constant(alone), constant(instance.properties))

    @unittest.skipIf(shutil.which("wbemcli") is None, "there is no wbemcli here")
    def test_wbemcli_gets_as_many(self):
        self.check_each_class(self.check_count)

    def check_count(self, name):
        asked = {name, self.client.superclass(name) or name}
        for asked_class in asked:
            count = self.count_of_wbemcli(asked_class, name)
            if name in (PROCESS, MISSING):
                self.assertGreater(count, 1)
            else:
                self.assertEqual(count, len(self.client.names(name)), asked_class)

    def count_of_wbemcli(self, asked_class, name):
        """Instances of the class `name` when asked for all of `asked_class`."""
        place = f"localhost:{self.server.port}/{NAMESPACE}:"
        result = subprocess.run(["wbemcli", "-nl", "ei", f"http://{place}{asked_class}"],
                                capture_output=True, timeout=120, check=True)
        self.assertEqual(result.stderr, b"")
        return sum(line.startswith(f"{place}{name}.")
                   for line in result.stdout.decode().splitlines())


def nulls_of(instances):
    return collections.Counter((instance.class_name, name)
                               for instance in instances for name in instance.nulls())


def unknowns_of(instances):
    """Those that are not null but unknown, which may also be what the source says."""
    return collections.Counter((instance.class_name, name) for instance in instances
                               for name, unknown in UNKNOWN.items()
                               if instance.get(name) == unknown)


class MissingValuesTest(unittest.TestCase):
    maxDiff = None

    def check_reasons(self, as_nobody):
        server = LiveServer(CIMOMD, as_nobody)
        self.addCleanup(server.end)
        told = collections.Counter(
            (value["TargetClassName"], value["PropertyName"])
            for value in server.client.instances(MISSING) if value["TargetClassName"] != PROCESS)
        for name in server.client.class_names():
            if not name.startswith("Velmira_") or name in (MISSING, PROCESS):
                continue
            instances = server.client.instances(name)
            with self.subTest(name=name):
                ours = {key: count for key, count in told.items() if key[0] == name}
                emptiness = ours.pop((name, None), 0)
                unknown = collections.Counter(ours) - nulls_of(instances)
                self.assertEqual(ours, nulls_of(instances) + unknown)
                self.assertEqual(unknown - unknowns_of(instances), collections.Counter())
                self.assertLessEqual(emptiness, 0 if instances else 1)

    def test_each_null_has_its_reason(self):
        self.check_reasons(as_nobody=False)

    @unittest.skipUnless(os.getuid() == 0, "only root can become nobody")
    def test_each_null_of_nobody_has_its_reason(self):
        self.check_reasons(as_nobody=True)


@unittest.skipUnless(os.getuid() == 0, "only root can become nobody")
class NobodyTest(unittest.TestCase):
    """As root and as nobody, side by side."""

    maxDiff = None

    @classmethod
    def setUpClass(cls):
        servers = [LiveServer(CIMOMD, as_nobody) for as_nobody in (False, True)]
        for server in servers:
            cls.addClassCleanup(server.end)
        cls.root, cls.nobody = (server.client for server in servers)
        cls.root_process = str(servers[0].server.process.pid)

    def needing_root(self):
        """Classes, properties and keys that nobody may not read."""
        return {(value["TargetClassName"], value["PropertyName"], value["TargetIdentity"])
                for value in self.nobody.instances(MISSING) if value["Reason"] == NEEDS_ROOT}

    def test_nobody_is_told_less_and_nothing_else(self):
        needing_root = self.needing_root()
        for name in self.root.class_names():
            if not name.startswith("Velmira_") or name in (MISSING, PROCESS):
                continue
            with self.subTest(name=name):
                whole = {instance.key(): instance for instance in self.root.instances(name)}
                part = {instance.key(): instance for instance in self.nobody.instances(name)}
                if (name, None, None) in needing_root:
                    self.assertEqual(part, {})
                    continue
                self.assertEqual(part.keys(), whole.keys())
                for key, instance in part.items():
                    self.check(instance, whole[key], needing_root)

    def check(self, instance, whole, needing_root):
        for name, value in constant(instance.properties).items():
            if value is not None or whole[name] is None:
                self.assertEqual(value, whole[name], (instance.keys, name))
                continue
            identities = {identity for class_name, property_name, identity in needing_root
                          if (class_name, property_name) == (instance.class_name, name)}
            self.assertTrue(identities & set(instance.keys.values()), (instance.keys, name))

    def test_programs_of_other_users_need_root(self):
        def of_root(instances):
            [found] = [process for process in instances if process["Handle"] == self.root_process]
            return found
        self.assertEqual(of_root(self.root.instances(PROCESS))["ModulePath"],
                         str(pathlib.Path(CIMOMD).resolve()))
        self.assertIsNone(of_root(self.nobody.instances(PROCESS))["ModulePath"])
        self.assertIn((PROCESS, "ModulePath", self.root_process), self.needing_root())


class SerialNumberTest(unittest.TestCase):
    """A machine whose kernel hands on what the firmware says as files, some for root only."""

    TEXTS = {"sys_vendor": "Example Works", "product_serial": "SN-4711",
             "product_uuid": "2c2b1f40-6d2e-4c0a-9a53-0d3f0a1b2c3d"}

    def setUp(self):
        place = tempfile.mkdtemp(prefix="cimomd-serial-")
        self.addCleanup(shutil.rmtree, place)
        os.chmod(place, 0o755)
        self.machine = pathlib.Path(place)
        identity = self.machine / "sys" / "class" / "dmi" / "id"
        identity.mkdir(parents=True)
        for name, text in self.TEXTS.items():
            (identity / name).write_text(text + "\n")
        for name in ("product_serial", "product_uuid"):
            # Its owner must not read it either when the test is not run by root.
            (identity / name).chmod(0o400 if os.getuid() == 0 else 0)

    def asked(self, as_nobody):
        server = LiveServer(CIMOMD, as_nobody, self.machine)
        self.addCleanup(server.end)
        [system] = server.client.instances("Velmira_ComputerSystem")
        reasons = {value["PropertyName"]: value["Reason"]
                   for value in server.client.instances(MISSING)
                   if value["TargetClassName"] == "Velmira_ComputerSystem"}
        return system, reasons

    def test_serial_numbers_need_root(self):
        system, reasons = self.asked(as_nobody=os.getuid() == 0)
        self.assertEqual(system["Manufacturer"], "Example Works")
        self.assertIsNone(system["SerialNumber"])
        self.assertIsNone(system["UUID"])
        self.assertIsNone(system["Model"])
        self.assertEqual(reasons["SerialNumber"], NEEDS_ROOT)
        self.assertEqual(reasons["UUID"], NEEDS_ROOT)
        self.assertEqual(reasons["Model"], ABSENT)

    @unittest.skipUnless(os.getuid() == 0, "only root can read what needs root")
    def test_root_reads_serial_numbers(self):
        system, reasons = self.asked(as_nobody=False)
        self.assertEqual(system["SerialNumber"], "SN-4711")
        self.assertEqual(system["UUID"], "2c2b1f40-6d2e-4c0a-9a53-0d3f0a1b2c3d")
        self.assertNotIn("SerialNumber", reasons)


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--cimomd", required=True)
    known, rest = parser.parse_known_args()
    CIMOMD = known.cimomd
    unittest.main(argv=[sys.argv[0], "-v", *rest])
