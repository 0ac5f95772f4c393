"""What cimomd says about the machine this runs on, held against independent tools. Where two
readings of a tool differ the machine has changed meanwhile, and both are read again."""

import argparse
import collections
import datetime
import os
import pathlib
import platform
import re
import sys
import time
import unittest

import machine_tools as tools
from live_server import LiveServer

CIMOMD = None
AS_NOBODY = False
MACHINES = None

# The exit status that tells CTest so.
SKIPPED = 77
ATTEMPTS = 5
# What a busy machine may use or give back between two readings.
DRIFT_OF_PROCESSES = 100

# Velmira_MissingValue.Reason
ABSENT = 2
# CIM_CacheMemory.CacheType
CACHE_TYPES = {3: "Instruction", 4: "Data", 5: "Unified"}
# CIM_MediaAccessDevice.Capabilities
SUPPORTS_WRITING, REMOVABLE_MEDIA = 4, 7

# What firmware says where it has nothing to say.
PLACEHOLDER = re.compile(
    r"(to be filled by o\.e\.m\.|default string|system (serial number|product name|manufacturer|"
    r"version)|(chassis|base board) serial number|not (specified|applicable|present|settable)|none|"
    r"unknown|n/a|no asset tag|invalid|0?123456789|(?P<one>.)(?P=one)+|[-0]+|)", re.IGNORECASE)


def cim_time(text):
    """Seconds since 1970 of a CIM datetime."""
    minutes = datetime.timedelta(minutes=int(text[21:]))
    moment = datetime.datetime.strptime(text[:21], "%Y%m%d%H%M%S.%f")
    return moment.replace(tzinfo=datetime.timezone(minutes)).timestamp()


class MachineTest(unittest.TestCase):
    maxDiff = None
    recorded = None

    @classmethod
    def setUpClass(cls):
        cls.server = LiveServer(CIMOMD, as_nobody=AS_NOBODY, root=cls.recorded)
        cls.addClassCleanup(cls.server.end)

    def instances(self, name):
        return self.server.client.instances(name)

    def only(self, name):
        [instance] = self.instances(name)
        return instance

    def same(self, told, ours):
        """Both are read until the tool says the same before and after."""
        for _ in range(ATTEMPTS):
            before, got, after = told(), ours(), told()
            if before == after:
                self.assertEqual(got, before)
                return
        self.fail("the tool says something else each time")


class ProcessorTest(MachineTest):
    def test_packages(self):
        def ours():
            return sorted((processor["NumberOfEnabledCores"], processor["NumberOfEnabledThreads"])
                          for processor in self.instances("Velmira_Processor")
                          if processor["CPUStatus"] == 1)
        self.same(tools.processor_packages, ours)

    def test_models(self):
        if platform.machine() not in ("x86_64", "i686"):
            self.skipTest("lscpu translates the numbers of this kind of processor")
        fields = tools.processor_fields()
        for processor in self.instances("Velmira_Processor"):
            self.assertEqual(processor["Manufacturer"], fields["Vendor ID"])
            self.assertEqual(processor["Model"], fields["Model name"])
            self.assertEqual(processor["Stepping"], fields["Stepping"])

    def test_caches(self):
        def ours():
            return collections.Counter(
                (cache["LevelNumber"], CACHE_TYPES[cache["CacheType"]],
                 cache["BlockSize"] * cache["NumberOfBlocks"], cache["Ways"], cache["LineSize"])
                for cache in self.instances("Velmira_CacheMemory"))
        self.same(tools.caches, ours)


class MemoryTest(MachineTest):
    def test_totals(self):
        def ours():
            memory = self.only("Velmira_Memory")
            system = self.only("Velmira_OperatingSystem")
            self.assertEqual(system["TotalVisibleMemorySize"] * 1024,
                             memory["BlockSize"] * memory["NumberOfBlocks"])
            return (memory["BlockSize"] * memory["NumberOfBlocks"],
                    system["TotalSwapSpaceSize"] * 1024)
        self.same(tools.memory_bytes, ours)


class StorageTest(MachineTest):
    @staticmethod
    def is_disk(device):
        if re.match(r"(loop|z?ram|dm-|md|fd)", device["kname"]) or device["type"] != "disk":
            return False
        return device["size"] != 0 or not device["kname"].startswith("nbd")

    def test_disks(self):
        def told():
            return {name: (device["size"] // 1000 or None, device["log-sec"], not device["ro"],
                           device["rm"])
                    for name, device in tools.block_devices().items() if self.is_disk(device)}

        def ours():
            return {disk["DeviceID"]:
                        (disk["MaxMediaSize"], disk["DefaultBlockSize"],
                         SUPPORTS_WRITING in disk["Capabilities"],
                         REMOVABLE_MEDIA in disk["Capabilities"])
                    for disk in self.instances("Velmira_DiskDrive")}
        self.same(told, ours)

    def test_models_and_serial_numbers(self):
        told = {f"/dev/{name}": device for name, device in tools.block_devices().items()
                if self.is_disk(device)}
        packages = {package["Tag"]: package for package in self.instances("Velmira_DiskPackage")}
        self.assertEqual(packages.keys(), told.keys())
        for path, device in told.items():
            for name, field in (("Model", "model"), ("SerialNumber", "serial")):
                if device[field] is not None:
                    self.assertEqual(packages[path][name], device[field].strip(), path)

    def test_partitions(self):
        def told():
            return {name: (device["size"], device["start"], device["pkname"], not device["ro"])
                    for name, device in tools.block_devices().items()
                    if device["type"] == "part" and not device["pkname"].startswith("loop")}

        def ours():
            return {partition["DeviceID"]:
                        (partition["BlockSize"] * partition["NumberOfBlocks"],
                         partition["StartingBlock"], partition["Disk"], not partition["ReadOnly"])
                    for partition in self.instances("Velmira_DiskPartition")}
        self.same(told, ours)

    def test_volumes(self):
        def told():
            return {name: device["size"] for name, device in tools.block_devices().items()
                    if re.match(r"(dm-|md)", name) and device["type"] != "part"}

        def ours():
            return {volume["DeviceID"]: volume["BlockSize"] * volume["NumberOfBlocks"]
                    for volume in self.instances("Velmira_StorageVolume")}
        self.same(told, ours)


class FileSystemTest(MachineTest):
    def test_file_systems(self):
        def told():
            return {target: (mount["fstype"], mount["source"].split("[")[0],
                             "ro" in mount["fs-options"].split(","))
                    for target, mount in tools.file_systems(self.recorded).items()}

        def ours():
            return {system["Root"]: (system["FileSystemType"], system["Device"],
                                     system["ReadOnly"])
                    for system in self.instances("Velmira_LocalFileSystem")}
        self.same(told, ours)


class FileSystemSizeTest(MachineTest):
    def test_sizes(self):
        def told():
            return {target: tools.file_system_sizes(target) for target in tools.file_systems()}

        def ours():
            return {system["Root"]: (system["FileSystemSize"], system["TotalInodes"])
                    for system in self.instances("Velmira_LocalFileSystem")}
        self.same(told, ours)


class NetworkTest(MachineTest):
    def test_links(self):
        def told():
            return {name: (link["address"].replace(":", "").upper(), link["mtu"])
                    for name, link in tools.links().items() if link["link_type"] == "ether"}

        def ours():
            return {link["Name"]: (link["MACAddress"], link["MTU"])
                    for link in self.instances("Velmira_LANEndpoint")
                    if link["MACAddress"] is not None}
        self.same(told, ours)

    def test_ports(self):
        def told():
            return {name: (link["address"].replace(":", "").upper(), link["mtu"],
                           "UP" in link["flags"])
                    for name, link in tools.links().items()
                    if link["link_type"] == "ether" and "parentdev" in link}

        def ours():
            ports = self.instances("Velmira_EthernetPort") + self.instances("Velmira_WiFiPort")
            return {port["DeviceID"]: (port["NetworkAddresses"][0],
                                       port["ActiveMaximumTransmissionUnit"],
                                       port["EnabledState"] in (2, 6))
                    for port in ports}
        self.same(told, ours)

    def test_addresses(self):
        def ours():
            found = []
            for endpoint in self.instances("Velmira_IPProtocolEndpoint"):
                prefix = endpoint["AddressWithPrefix"].rsplit("/")[-1]
                found.append((endpoint["InterfaceName"],
                              endpoint["IPv4Address"] or endpoint["IPv6Address"], int(prefix)))
            return sorted(found)
        self.same(tools.addresses, ours)

    def test_routes(self):
        def ours():
            return sorted(
                (f"{route['DestinationAddress']}/{route['PrefixLength']}",
                 route["GatewayAddress"] or "", route["InterfaceName"] or "",
                 -1 if route["RouteMetric"] is None else route["RouteMetric"])
                for route in self.instances("Velmira_NextHopIPRoute"))
        self.same(tools.routes, ours)

    def test_name_servers(self):
        def ours():
            return [address for settings in self.instances("Velmira_DNSSettingData")
                    for address in settings["DNSServerAddresses"] or []]
        self.same(tools.name_servers, ours)


class PciTest(MachineTest):
    def test_pci(self):
        self.same(lambda: tools.pci_devices(self.recorded),
                  lambda: {device["DeviceID"]: (device["ClassCode"], device["VendorID"],
                                                device["PCIDeviceID"], device["RevisionNumber"])
                           for device in self.instances("Velmira_PCIDevice")})


class UsbTest(MachineTest):
    def test_usb(self):
        self.same(tools.usb_devices,
                  lambda: sorted((device["VendorID"], device["ProductID"])
                                 for device in self.instances("Velmira_USBDevice")))


class FirmwareTest(MachineTest):
    def tables(self):
        return tools.FirmwareTables(self.recorded)

    def test_texts(self):
        tables = self.tables()
        told = {keyword: tables.text(keyword) for keyword in tables.KEYWORDS}
        system, firmware = self.only("Velmira_ComputerSystem"), self.only("Velmira_BIOSElement")
        [chassis, *_] = self.instances("Velmira_Chassis")
        [board, *_] = [*self.instances("Velmira_Card"), collections.defaultdict(lambda: None)]
        ours = (system["Manufacturer"], system["Model"], system["ModelVersion"],
                system["SerialNumber"], system["UUID"], firmware["Manufacturer"],
                firmware["Version"] or None, board["Manufacturer"], board["Model"],
                board["SerialNumber"], chassis["Manufacturer"], chassis["SerialNumber"])
        for keyword, text in zip(tables.KEYWORDS, ours):
            if text is None:
                self.assertTrue(PLACEHOLDER.fullmatch(told[keyword]), (keyword, told[keyword]))
            else:
                self.assertEqual(text, told[keyword], keyword)

    def test_boards_and_chassis_and_slots(self):
        tables = self.tables()
        for kind, field, name, title in ((2, "Product Name", "Velmira_Card", "Model"),
                                         (3, "Serial Number", "Velmira_Chassis", "SerialNumber"),
                                         (9, "Designation", "Velmira_Slot", "Name")):
            told = [structure.get(field, "") for structure in tables.structures(kind)]
            ours = [instance[title] for instance in self.instances(name)]
            self.assertEqual(len(ours), len(told), name)
            for entry, text in zip(ours, told):
                self.assertTrue(entry == text or (entry is None and PLACEHOLDER.fullmatch(text)),
                                (entry, text))

    def test_memory_modules(self):
        modules = self.tables().memory_modules()
        if not modules:
            self.skipTest("the firmware's tables list no memory module")
        self.same(lambda: modules,
                  lambda: sorted((module["CapacityMB"], module["Name"])
                                 for module in self.instances("Velmira_PhysicalMemory")))


class SoftwareTest(MachineTest):
    def test_operating_system(self):
        system = self.only("Velmira_OperatingSystem")
        release = tools.release_fields()
        self.assertEqual(system["Name"], release["NAME"])
        self.assertEqual(system["DistributionId"], release["ID"])
        self.assertEqual(system["Version"] or "", release["VERSION_ID"])
        self.assertEqual(system["KernelRelease"], tools.output_of("uname", "-r").strip())
        self.assertEqual(system["Architecture"], tools.output_of("uname", "-m").strip())
        self.assertEqual(system["CSName"], tools.output_of("uname", "-n").strip())
        self.assertEqual(self.only("Velmira_ComputerSystem")["Name"], system["CSName"])

    def test_clock(self):
        def minutes():
            offset = tools.output_of("date", "+%z").strip()
            return int(offset[0] + "1") * (int(offset[1:3]) * 60 + int(offset[3:]))
        before = int(tools.output_of("date", "+%s"))
        system = self.only("Velmira_OperatingSystem")
        after = int(tools.output_of("date", "+%s"))
        self.assertTrue(before - 1 <= cim_time(system["LocalDateTime"]) <= after + 1)
        self.assertEqual(system["CurrentTimeZone"], minutes())
        started = datetime.datetime.fromisoformat(tools.output_of("uptime", "-s").strip())
        self.assertAlmostEqual(cim_time(system["LastBootUpTime"]), started.timestamp(), delta=3)

    def test_users_and_processes_in_number(self):
        before = len(tools.processes())
        system = self.only("Velmira_OperatingSystem")
        after = len(tools.processes())
        count = system["NumberOfProcesses"]
        self.assertGreaterEqual(count, min(before, after) - DRIFT_OF_PROCESSES)
        self.assertLessEqual(count, max(before, after) + DRIFT_OF_PROCESSES)
        if os.path.exists("/run/utmp"):
            self.same(lambda: len(tools.output_of("who").splitlines()),
                      lambda: self.only("Velmira_OperatingSystem")["NumberOfUsers"])
        else:
            self.assertIsNone(system["NumberOfUsers"])

    def test_packages(self):
        self.same(tools.packages,
                  lambda: sorted((package["Name"], package["Architecture"],
                                  package["VersionString"])
                                 for package in self.instances("Velmira_SoftwareIdentity")
                                 if package["ExtendedResourceType"] == 8))

    def test_accounts(self):
        self.same(tools.users,
                  lambda: {account["Name"]: (account["UserID"], account["PrimaryGroupID"],
                                             account["HomeDirectory"] or "",
                                             account["LoginShell"] or "")
                           for account in self.instances("Velmira_Account")})

    def test_groups(self):
        self.same(tools.groups,
                  lambda: {group["Name"]: (group["GroupID"], group["Members"])
                           for group in self.instances("Velmira_Group")})

    def test_processes(self):
        before = tools.processes()
        ours = {process["Handle"]: (process["ParentProcessID"], process["RealUserID"],
                                    process["ProcessGroupID"], process["ProcessSessionID"],
                                    tools.process_name(process["Name"]))
                for process in self.instances("Velmira_UnixProcess")}
        after = tools.processes()
        lasting = {number: entry for number, entry in before.items() if after.get(number) == entry}
        self.assertIn(str(os.getpid()), lasting)
        self.assertEqual({number: ours.get(number) for number in lasting}, lasting)

    def test_services(self):
        told = tools.loaded_services()
        ours = {service["Name"].removesuffix(".service"):
                    (service["ActiveState"], service["SubState"])
                for service in self.instances("Velmira_Service")}
        self.assertEqual({name: ours.get(name) for name in told}, told)

    @unittest.skipIf(os.path.exists("/run/dbus/system_bus_socket"), "there is a system bus")
    def test_no_services_without_a_bus(self):
        self.assertEqual(self.instances("Velmira_Service"), [])
        told = [(value["PropertyName"], value["Reason"])
                for value in self.instances("Velmira_MissingValue")
                if value["TargetClassName"] == "Velmira_Service"]
        self.assertEqual(told, [(None, ABSENT)])

    def test_time_zone(self):
        zone = self.only("Velmira_TimeZone")
        self.assertEqual(zone["StandardOffset"], -time.timezone // 60)
        self.assertEqual(zone["StandardName"], time.tzname[0])
        if time.daylight:
            self.assertEqual(zone["DaylightName"], time.tzname[1])
        else:
            self.assertIsNone(zone["DaylightName"])


# Tools that can be shown the files of another machine.
RECORDED = {"laptop": (FileSystemTest, PciTest, FirmwareTest),
            "server": (FileSystemTest, PciTest, FirmwareTest),
            "virtual": (FileSystemTest, PciTest, FirmwareTest),
            "arm": (FileSystemTest,)}


def recorded_tests():
    for name, bases in RECORDED.items():
        for base in bases:
            title = f"Recorded{name.title()}{base.__name__}"
            yield title, type(title, (base,), {"recorded": MACHINES / name, "__module__": __name__})


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--cimomd", required=True)
    parser.add_argument("--machines", required=True, type=pathlib.Path)
    parser.add_argument("--as-nobody", action="store_true")
    known, rest = parser.parse_known_args()
    CIMOMD, MACHINES, AS_NOBODY = known.cimomd, known.machines, known.as_nobody
    if AS_NOBODY and os.getuid() != 0:
        print("only root can become nobody")
        sys.exit(SKIPPED)
    if not AS_NOBODY:
        globals().update(recorded_tests())
    unittest.main(argv=[sys.argv[0], "-v", *rest])
