"""What the shipped scripts are to show of the recorded machines, read off the machines' files."""

# The scripts with data: what a machine lacks has no file.
SCRIPTS = {
    "laptop": [
        "battery", "bioselement", "card", "chassis", "computersystem", "desktopmonitor", "fan",
        "memory", "numericsensor", "operatingsystem", "pcidevice", "physicalmemory", "slot",
        "usbdevice", "videocontroller",
    ],
    "server": [
        "bioselement", "card", "chassis", "computersystem", "desktopmonitor", "fan", "memory",
        "numericsensor", "operatingsystem", "pcidevice", "physicalmemory", "slot", "usbdevice",
        "videocontroller",
    ],
    "virtual": [
        "bioselement", "chassis", "computersystem", "desktopmonitor", "memory", "operatingsystem",
        "pcidevice", "physicalmemory", "usbdevice", "videocontroller",
    ],
    "arm": [
        "computersystem", "desktopmonitor", "memory", "numericsensor", "operatingsystem",
        "physicalmemory", "usbdevice", "videocontroller",
    ],
}

# Scripts of which some number with words has no value on that machine.
NAMELESS_NUMBERS = {
    "laptop": ["operatingsystem"],
    "server": ["operatingsystem"],
    "virtual": ["operatingsystem"],
    "arm": ["operatingsystem", "physicalmemory"],
}

# Some cells by machine, script and number of the row.
ROWS = {
    "laptop": {
        "computersystem": {1: {
            "Host Name": "birch", "Manufacturer": "Nordwind Systems", "Model": "NX-14 Gen 2",
            "Serial Number": "PF2A7K3Q", "UUID": "4b3c5acc-215e-11b2-a85c-e8d0fc1be7a1",
        }},
        "battery": {1: {
            "Battery": "BAT0", "Manufacturer": "LGC", "Chemistry": "Lithium Polymer",
            "Capacity New mWh": "57020", "Capacity Now mWh": "51350", "Charge Percent": "87",
            "Charge Cycles": "142",
        }},
        "bioselement": {1: {
            "Version": "N2HET47W (1.30 )", "Type": "UEFI",
            "Released": "20220814000000.000000+000", "ROM KB": "32768",
        }},
        "chassis": {1: {"Type": "Notebook", "Asset Tag": "IT-00417", "Has Lock": "false"}},
        "desktopmonitor": {
            1: {"Connector": "card0-DP-2", "Model": "DELL U2719D", "Pixels Wide": "2560",
                "Pixels High": "1440", "Diagonal Inches": "27.0", "Year Made": "2019",
                "Week Made": "33"},
            2: {"Connector": "card0-eDP-1", "Diagonal Inches": "14.0"},
        },
        "memory": {1: {"Usable MB": "15738", "Installed MB": "16384", "Modules": "2",
                       "Modules Missing": "false"}},
        "physicalmemory": {
            1: {"Module": "ChannelA-DIMM0", "Capacity MB": "8192", "Type": "DDR4",
                "Form Factor": "SODIMM", "Speed MHz": "3200", "Bits": "64"},
            2: {"Module": "ChannelB-DIMM0", "Serial Number": "18C7A4F2"},
        },
        "usbdevice": {4: {"Port": "4-1", "Kind": "Mass Storage", "Product": "Ultra Flair",
                          "Speed Mbps": "5000"}},
        "videocontroller": {1: {"Manufacturer": "Intel Corporation", "Driver": "i915"}},
    },
    "server": {
        "computersystem": {1: {"Host Name": "rack12-db1", "Model": "GR-740 Rack Server"}},
        "card": {
            1: {"Model": "0YWR7D", "Main Board": "true"},
            2: {"Model": "0RSR2B", "Location": "Riser 2", "Main Board": "false"},
        },
        "chassis": {1: {"Type": "Rack Mount Chassis", "Height Units": "2", "Power Cords": "2"}},
        "fan": {
            1: {"Fan": "nct6779 fan1", "Speed RPM": "5273", "Status": "OK"},
            2: {"Speed RPM": "210", "Status": "Degraded"},
            3: {"Fan": "nct6779 fan10", "Speed RPM": "0", "Status": "Stopped"},
        },
        "memory": {1: {"Usable MB": "257676", "Installed MB": "262144", "Modules": "8"}},
        "numericsensor": {
            4: {"Sensor": "nct6779 CPUTIN", "Reading": "-62.0 C", "Status": "Error"},
            10: {"Sensor": "pfe1100 vin", "Measures": "Voltage", "Reading": "230.250 V"},
        },
        "physicalmemory": {1: {"Capacity MB": "32768", "Speed MHz": "2666",
                               "Max Speed MHz": "2933", "Bits With ECC": "72", "Bits": "64"}},
        "slot": {1: {"Slot": "PCIe Slot 1", "Type": "PCI Express 3 x8", "Lanes": "8",
                     "In Use": "true", "Bus Address": "0000:3b:00.0"}},
    },
    "virtual": {
        "computersystem": {1: {"Manufacturer": "", "Serial Number": ""}},
        "bioselement": {1: {"Manufacturer": "SeaBIOS", "Type": "BIOS"}},
        "physicalmemory": {1: {"Capacity MB": "4096", "Speed MHz": "0",
                               "Described By": "SMBIOS"}},
    },
    "arm": {
        "computersystem": {1: {"Model": "Raspberry Pi 4 Model B Rev 1.4",
                               "Serial Number": "10000000abcdef01"}},
        "memory": {1: {"Usable MB": "3793", "Installed MB": "0"}},
        "physicalmemory": {1: {"Capacity MB": "3793", "Described By": "Kernel"}},
        "numericsensor": {1: {"Sensor": "cpu_thermal temp1", "Reading": "48.2 C"}},
    },
}
