"""What programs of Debian that are not this project's say about a machine, as plain values. A tool
that is not here, or finds nothing to work on, skips the test that asked."""

import collections
import json
import os
import re
import shlex
import shutil
import subprocess
import tempfile
import unittest

PATIENCE_S = 120


def output_of(*command, shell_text=None):
    name = command[0]
    if shutil.which(name) is None:
        raise unittest.SkipTest(f"there is no {name} here")
    result = subprocess.run(command, input=shell_text, capture_output=True, text=True,
                            env=dict(os.environ, LC_ALL="C"), timeout=PATIENCE_S, check=False)
    if result.returncode != 0:
        raise unittest.SkipTest(f"{shlex.join(command)}: {result.stderr.strip()[:200]}")
    return result.stdout


def json_of(*command):
    return json.loads(output_of(*command) or "[]")


# Processors and memory

def processor_packages():
    """Cores and threads of each socket."""
    cores, threads = collections.defaultdict(set), collections.Counter()
    for line in output_of("lscpu", "-p=CPU,CORE,SOCKET").splitlines():
        if not line.startswith("#"):
            _, core, package = line.split(",")
            cores[package].add(core)
            threads[package] += 1
    return sorted((len(cores[package]), threads[package]) for package in threads)


def processor_fields():
    fields, pending = {}, json_of("lscpu", "-J")["lscpu"]
    while pending:
        entry = pending.pop()
        fields[entry["field"].rstrip(":")] = entry["data"]
        pending += entry.get("children", [])
    return fields


def caches():
    """How many there are of each level, kind, size, ways and line."""
    counts = collections.Counter()
    for cache in json_of("lscpu", "-C", "-J", "-B")["caches"]:
        size = int(cache["one-size"])
        kind = (cache["level"], cache["type"], size, cache["ways"], cache["coherency-size"])
        counts[kind] += int(cache["all-size"]) // size
    return counts


def memory_bytes():
    """Of the main memory and of the swap space."""
    totals = {line.split()[0]: int(line.split()[1])
              for line in output_of("free", "-b").splitlines()[1:]}
    return totals["Mem:"], totals["Swap:"]


# Storage

def block_devices():
    devices = json_of("lsblk", "-J", "-b", "-l", "-a", "-o",
                      "KNAME,TYPE,SIZE,RO,RM,LOG-SEC,START,PKNAME,MODEL,SERIAL")["blockdevices"]
    return {device["kname"]: device for device in devices}


def file_systems(recorded=None):
    """Mounted file systems on devices, and temporary ones outside of the system's directories."""
    options = [] if recorded is None else ["-F", str(recorded / "proc" / "self" / "mountinfo")]
    mounts = json_of("findmnt", "-J", "-l", "-o", "TARGET,SOURCE,FSTYPE,MAJ:MIN,FSROOT,FS-OPTIONS",
                     *options)["filesystems"]
    found = {}
    for place, mount in enumerate(mounts):
        if is_local(mount) and not any(covers(later, mount) for later in mounts[place + 1:]):
            device = mount["maj:min"]
            if device not in found or (found[device]["fsroot"] != "/" and mount["fsroot"] == "/"):
                found[device] = mount
    return {mount["target"]: mount for mount in found.values()}


def covers(later, mount):
    return (mount["target"] + "/").startswith(later["target"].rstrip("/") + "/")


def is_local(mount):
    if mount["fstype"] == "tmpfs":
        return re.match(r"/(dev|proc|run|sys)(/|$)", mount["target"]) is None
    if mount["fstype"] in ("squashfs", "erofs", "cramfs"):
        return False  # images of software
    return mount["source"].startswith("/dev/") or mount["fstype"] == "zfs"


def file_system_sizes(target):
    """Bytes in all, inodes in all."""
    line = output_of("df", "-B1", "--output=size,itotal", target).splitlines()[1]
    return tuple(None if word == "-" else int(word) for word in line.split())


# Network

def links():
    return {link["ifname"]: link for link in json_of("ip", "-j", "-d", "link")}


def addresses():
    return sorted((link["ifname"], entry["local"], entry["prefixlen"])
                  for link in json_of("ip", "-j", "addr") for entry in link.get("addr_info", []))


def routes():
    """Destination with its prefix, gateway, interface, metric; -1 for one beyond 16 bits. Of
    several gateways the kernel's table names the first."""
    found = [route_entry("0.0.0.0/0", 32, route) for route in json_of("ip", "-4", "-j", "route")]
    found += [route_entry("::/0", 128, route)
              for route in json_of("ip", "-6", "-j", "route", "show", "table", "all")
              if route.get("type") not in ("local", "multicast", "anycast")]
    return sorted(found)


def route_entry(everywhere, bits, route):
    destination = everywhere if route["dst"] == "default" else route["dst"]
    if "/" not in destination:
        destination += f"/{bits}"
    metric = route.get("metric", 0)
    hop = (route.get("nexthops") or [route])[0]
    leads_nowhere = route.get("type", "unicast") != "unicast"
    return (destination, hop.get("gateway", ""), "" if leads_nowhere else hop["dev"],
            metric if metric < 1 << 16 else -1)


def name_servers():
    return output_of("awk", '$1 == "nameserver" { print $2 }', "/etc/resolv.conf").split()


# Buses

def pci_devices(recorded=None):
    """Base class, maker, device and revision by place."""
    options = [] if recorded is None else ["-O", f"sysfs.path={recorded}/sys/bus/pci"]
    found = {}
    for line in output_of("lspci", "-mmnD", *options).splitlines():
        words = shlex.split(line)
        place, device_class, vendor, device = words[:4]
        revision = next((int(word[2:], 16) for word in words if word.startswith("-r")), 0)
        found[place] = (int(device_class, 16) >> 8, int(vendor, 16), int(device, 16), revision)
    return found


def usb_devices():
    pairs = re.findall(r"^Bus \d+ Device \d+: ID ([0-9a-f]{4}):([0-9a-f]{4})",
                       output_of("lsusb"), re.MULTILINE)
    if not pairs:
        raise unittest.SkipTest("lsusb finds no device")
    return sorted((int(vendor, 16), int(product, 16)) for vendor, product in pairs)


# Firmware

class FirmwareTables:
    """What dmidecode reads from the running machine, or from the tables of a recorded one."""

    KEYWORDS = ("system-manufacturer", "system-product-name", "system-version",
                "system-serial-number", "system-uuid", "bios-vendor", "bios-version",
                "baseboard-manufacturer", "baseboard-product-name", "baseboard-serial-number",
                "chassis-manufacturer", "chassis-serial-number")

    def __init__(self, recorded=None):
        self.options = []
        self.dump = None
        if recorded is not None:
            self.dump = tempfile.NamedTemporaryFile()
            self.dump.write(dump_of(recorded / "sys" / "firmware" / "dmi" / "tables"))
            self.dump.flush()
            self.options = ["--from-dump", self.dump.name]

    def text(self, keyword):
        """Empty without the structure that has it."""
        lines = [line for line in output_of("dmidecode", *self.options, "-s", keyword).splitlines()
                 if not line.startswith("#")]
        return lines[0] if lines else ""

    def structures(self, kind):
        """The lines "field: text" of each structure of this SMBIOS type."""
        blocks = output_of("dmidecode", *self.options, "-t", str(kind)).split("\n\n")
        return [dict(re.findall(r"^\t(\w[^:\n]*): (.*)$", block, re.MULTILINE))
                for block in blocks if f", DMI type {kind}, " in block]

    def memory_modules(self):
        """Megabytes and place of each module that is plugged in."""
        units = {"MB": 1, "GB": 1024, "TB": 1024 * 1024}
        return sorted((int(number) * units[unit], module["Locator"])
                      for module in self.structures(17) if module["Size"][0].isdigit()
                      for number, unit in [module["Size"].split()])


def dump_of(tables):
    """Entry point and table in one file: dmidecode's own form, where the entry point's address of
    the table counts from the file's start."""
    entry = bytearray((tables / "smbios_entry_point").read_bytes())
    address = 32
    if entry[:5] == b"_SM3_":
        entry[16:24] = address.to_bytes(8, "little")
        entry[5] = 0
        entry[5] = -sum(entry) % 256
    else:
        entry[24:28] = address.to_bytes(4, "little")
        entry[21] = 0
        entry[21] = -sum(entry[16:]) % 256
        entry[4] = 0
        entry[4] = -sum(entry) % 256
    return bytes(entry.ljust(address, b"\0")) + (tables / "DMI").read_bytes()


# Software

def packages():
    """Name, architecture and version of what is installed."""
    lines = output_of("dpkg-query", "-W", "-f",
                      "${db:Status-Status}\t${Package}\t${Architecture}\t${Version}\n").splitlines()
    return sorted(tuple(line.split("\t")[1:]) for line in lines if line.startswith("installed\t"))


def users():
    return {fields[0]: (fields[2], fields[3], fields[5], fields[6])
            for fields in (line.split(":") for line in
                           output_of("getent", "-s", "files", "passwd").splitlines())}


def groups():
    return {fields[0]: (fields[2], [member for member in fields[3].split(",") if member])
            for fields in (line.split(":") for line in
                           output_of("getent", "-s", "files", "group").splitlines())}


def processes():
    """Parent, real user, process group, session and name by number."""
    found = {}
    for line in output_of("ps", "-eo", "pid=,ppid=,ruid=,pgid=,sid=,comm=").splitlines():
        words = line.split(None, 5)
        found[words[0]] = (words[1], int(words[2]), int(words[3]), int(words[4]),
                           process_name(words[5].removesuffix(" <defunct>")))
    return found


def process_name(name):
    """Without what a thread of the kernel happens to work on."""
    return re.sub(r"^(kworker/[^-+]*)[-+].*", r"\1", name)


def loaded_services():
    """Activity, and what it is in detail, of each unit that is loaded."""
    units = json_of("systemctl", "list-units", "--type=service", "--all", "-o", "json")
    return {unit["unit"].removesuffix(".service"): (unit["active"], unit["sub"])
            for unit in units if unit["load"] == "loaded"}


def release_fields():
    """Fields of os-release as a shell reads them, which the file is written for."""
    script = """for file in /etc/os-release /usr/lib/os-release; do
        if [ -r "$file" ]; then . "$file"; break; fi; done
        printf '%s\\n' "$NAME" "$ID" "$VERSION_ID" """
    name, short_name, version = output_of("sh", shell_text=script).splitlines()
    return {"NAME": name, "ID": short_name, "VERSION_ID": version}
