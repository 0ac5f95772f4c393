"""What the shipped scripts are to show of the recorded machines, read off the machines' files."""

# On every machine.
COMMON = [
    "account", "cachememory", "computersystem", "desktopmonitor", "diskdrive", "diskpackage",
    "diskpartition", "dnssettingdata", "ethernetport", "group", "ipprotocolendpoint",
    "lanendpoint", "localfilesystem", "memory", "nexthopiproute", "operatingsystem",
    "physicalmemory", "processor", "unixprocess", "usbdevice", "videocontroller",
]
# The scripts with data: what a machine lacks has no file.
SCRIPTS = {
    "laptop": sorted(COMMON + [
        "battery", "bioselement", "card", "chassis", "fan", "numericsensor", "pcidevice",
        "remotefilesystem", "slot", "softwareidentity", "storagevolume", "timezone", "wifiport",
    ]),
    "server": sorted(COMMON + [
        "bioselement", "card", "cdromdrive", "chassis", "fan", "nfs", "numericsensor",
        "pcidevice", "remotefilesystem", "slot", "storagevolume", "timezone",
    ]),
    "virtual": sorted(COMMON + [
        "bioselement", "cdromdrive", "chassis", "pcidevice", "remotefilesystem",
        "softwareidentity", "timezone",
    ]),
    "arm": sorted(COMMON + ["numericsensor", "wifiport"]),
}

# Some cells by machine, script and number of the row.
ROWS = {
    "laptop": {
        "account": {3: {"Login Name": "ada", "Remarks": "Ada Lund", "User Id": "1000",
                        "Home": "/home/ada", "Login Shell": "/bin/bash"}},
        "battery": {1: {
            "Battery": "BAT0", "Manufacturer": "LGC", "Chemistry": "Lithium Polymer",
            "Capacity New mWh": "57020", "Capacity Now mWh": "51350", "Charge Percent": "87",
            "Charge Cycles": "142",
        }},
        "bioselement": {1: {
            "Version": "N2HET47W (1.30 )", "Type": "UEFI",
            "Released": "20220814000000.000000+000", "ROM KB": "32768",
        }},
        "cachememory": {
            1: {"Cache Level": "1", "Holds": "Data", "Capacity KB": "48", "Ways": "12",
                "Logical CPUs": "0,4"},
            4: {"Cache Level": "3", "Holds": "Unified", "Capacity KB": "8192",
                "Logical CPUs": "0-7"},
        },
        "chassis": {1: {"Type": "Notebook", "Asset Tag": "IT-00417", "Has Lock": "false"}},
        "computersystem": {1: {
            "Host Name": "birch", "Manufacturer": "Nordwind Systems", "Model": "NX-14 Gen 2",
            "Serial Number": "PF2A7K3Q", "UUID": "4b3c5acc-215e-11b2-a85c-e8d0fc1be7a1",
        }},
        "desktopmonitor": {
            1: {"Connector": "card0-DP-2", "Model": "DELL U2719D", "Pixels Wide": "2560",
                "Pixels High": "1440", "Diagonal Inches": "27.0", "Made": "2019-W33"},
            2: {"Connector": "card0-eDP-1", "Diagonal Inches": "14.0"},
        },
        "diskdrive": {
            1: {"Device": "/dev/sda", "Abilities":
                "Random Access,Supports Writing,Supports Removeable Media", "Type": "Other"},
            2: {"Device": "/dev/nvme0n1", "Model": "Samsung SSD 980 PRO 1TB",
                "Serial Number": "S5P2NG0R704512X", "Type": "Solid State Drive",
                "Capacity MB": "1024209"},
        },
        "dnssettingdata": {1: {
            "Name Servers": "192.168.178.1,fe80::cece:1eff:fe4b:1%wlp0s20f3",
            "Domain": "home.example",
        }},
        "group": {3: {"Group Name": "sudo", "Group Id": "27", "Members": "ada"}},
        "localfilesystem": {
            1: {"Mount Point": "/", "Type": "ext4", "Total MB": "939488", "Free MB": "703125"},
            5: {"Mount Point": "/media/mia/USB STICK", "Device": "/dev/sda1", "Status": "OK"},
        },
        "memory": {1: {"Usable MB": "15738", "Installed MB": "16384", "Modules": "2",
                       "Modules Missing": "false"}},
        "nexthopiproute": {1: {"IP Kind": "IPv4", "Destination": "0.0.0.0", "Prefix Length": "0",
                               "Gateway": "192.168.178.1", "Interface": "wlp0s20f3",
                               "Metric": "600"}},
        "operatingsystem": {1: {"Name": "Ubuntu", "Version": "22.04", "Type": "Ubuntu 64-Bit"}},
        "physicalmemory": {
            1: {"Module": "ChannelA-DIMM0", "Capacity MB": "8192", "Type": "DDR4",
                "Form Factor": "SODIMM", "Speed MHz": "3200", "Bits": "64"},
            2: {"Module": "ChannelB-DIMM0", "Serial Number": "18C7A4F2"},
        },
        "processor": {1: {"Model": "11th Gen Intel(R) Core(TM) i5-1135G7 @ 2.40GHz",
                          "Cores": "4", "Threads": "8", "Max Clock MHz": "4200"}},
        "softwareidentity": {2: {"Package Name": "libc6", "Version": "2.35-0ubuntu3.6",
                                 "Machine": "amd64"}},
        "storagevolume": {2: {"Device": "/dev/mapper/birch--vg-root", "Type": "LVM",
                              "Capacity MB": "958464", "Made Of": "dm-0"}},
        "timezone": {1: {"Time Zone": "Europe/Berlin", "Offset Minutes": "60",
                         "Daylight Name": "CEST", "Daylight Minutes": "120"}},
        "unixprocess": {2: {"Process Id": "2350", "Name": "Web Content (2)", "User Name": "ada",
                            "State": "Running", "RAM KB": "524288"}},
        "usbdevice": {4: {"Port": "4-1", "Kind": "Mass Storage", "Product": "Ultra Flair",
                          "Speed Mbps": "5000"}},
        "videocontroller": {1: {"Manufacturer": "Intel Corporation", "Driver": "i915"}},
        "wifiport": {1: {"Interface": "wlp0s20f3", "Factory Address": "A46BB64012C8",
                         "Driver": "iwlwifi"}},
    },
    "server": {
        "card": {
            1: {"Model": "0YWR7D", "Main Board": "true"},
            2: {"Model": "0RSR2B", "Location": "Riser 2", "Main Board": "false"},
        },
        "cdromdrive": {1: {"Device": "/dev/sr0", "Model": "DVDRAM GUD1N", "CD Speed": "24",
                           "Writes DVD R": "true"}},
        "chassis": {1: {"Type": "Rack Mount Chassis", "Height Units": "2", "Power Cords": "2"}},
        "computersystem": {1: {"Host Name": "rack12-db1", "Model": "GR-740 Rack Server"}},
        "diskdrive": {1: {"Device": "/dev/sda", "Serial Number": "ZC1A2B30",
                          "Type": "Hard Disk Drive", "Capacity MB": "4000787"}},
        "ethernetport": {3: {"Interface": "ens1f0np0", "MAC Addresses": "0C42A15E90D2",
                             "Speed Mbps": "25000", "Full Duplex": "true", "MTU": "9000"}},
        "fan": {
            1: {"Fan": "nct6779 fan1", "Speed RPM": "5273", "Status": "OK"},
            2: {"Speed RPM": "210", "Status": "Degraded"},
            3: {"Fan": "nct6779 fan10", "Speed RPM": "0", "Status": "Stopped"},
        },
        "ipprotocolendpoint": {2: {"Interface": "bond0.100", "IP Kind": "IPv4",
                                   "Address": "10.20.0.11/22", "Subnet Mask": "255.255.252.0"}},
        "lanendpoint": {1: {"Interface": "bond0", "Kind": "IEEE 802.3ad Link Aggregation"}},
        "memory": {1: {"Usable MB": "257676", "Installed MB": "262144", "Modules": "8"}},
        "nfs": {1: {"Mount Point": "/home", "Mounted From": "nas.example.org:/export/home",
                    "Total MB": "8388608", "Free MB": "4194304", "Status": "OK"}},
        "numericsensor": {
            4: {"Sensor": "nct6779 CPUTIN", "Reading": "-62.0 C", "Status": "Error"},
            10: {"Sensor": "pfe1100 vin", "Measures": "Voltage", "Reading": "230.250 V"},
        },
        "physicalmemory": {1: {"Capacity MB": "32768", "Speed MHz": "2666",
                               "Max Speed MHz": "2933", "Bits With ECC": "72", "Bits": "64"}},
        "remotefilesystem": {1: {"Mounted From": "//files.example.org/public", "Type": "cifs",
                                 "Total MB": "10240"}},
        "slot": {1: {"Slot": "PCIe Slot 1", "Type": "PCI Express 3 x8", "Lanes": "8",
                     "In Use": "true", "Bus Address": "0000:3b:00.0"}},
        "storagevolume": {2: {"Device": "/dev/md1", "Capacity MB": "7628842",
                              "RAID Kind": "raid10", "Missing Disks": "1",
                              "Made Of": "sda2,sdb2,sdc2,sdd2"}},
    },
    "virtual": {
        "bioselement": {1: {"Manufacturer": "SeaBIOS", "Type": "BIOS"}},
        "computersystem": {1: {"Manufacturer": "", "Serial Number": ""}},
        "diskdrive": {1: {"Device": "/dev/vda", "Type": "Unknown"}},
        "diskpartition": {3: {"Device": "/dev/vda5", "Type": "Logical", "Capacity MB": "2047"}},
        "physicalmemory": {1: {"Capacity MB": "4096", "Speed MHz": "0",
                               "Described By": "SMBIOS"}},
    },
    "arm": {
        "computersystem": {1: {"Model": "Raspberry Pi 4 Model B Rev 1.4",
                               "Serial Number": "10000000abcdef01"}},
        "memory": {1: {"Usable MB": "3793", "Installed MB": "0"}},
        "numericsensor": {1: {"Sensor": "cpu_thermal temp1", "Reading": "48.2 C"}},
        "physicalmemory": {1: {"Capacity MB": "3793", "Form Factor": "Unknown",
                               "Described By": "Kernel"}},
    },
}
