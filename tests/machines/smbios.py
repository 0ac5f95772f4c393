#!/usr/bin/env python3
"""Writes the SMBIOS tables of the recorded machines, and the texts the kernel takes out of them.

Run it after a change to the tables below; its output is kept beside it. Offsets and numbers are
those of DSP0134.
"""

import pathlib
import struct

HERE = pathlib.Path(__file__).parent


class Structure:
    """Fields by offset, texts in their order; everything else is 0."""

    def __init__(self, kind, length, handle):
        self.area = bytearray(length)
        self.area[0:4] = struct.pack("<BBH", kind, length, handle)
        self.texts = []

    def byte(self, offset, value):
        self.area[offset] = value
        return self

    def word(self, offset, value):
        self.area[offset : offset + 2] = struct.pack("<H", value)
        return self

    def double(self, offset, value):
        self.area[offset : offset + 4] = struct.pack("<I", value)
        return self

    def raw(self, offset, value):
        self.area[offset : offset + len(value)] = value
        return self

    def text(self, offset, value):
        """An empty text has no number: it would end the texts."""
        if not value:
            return self
        self.texts.append(value.encode())
        return self.byte(offset, len(self.texts))

    def bytes(self):
        texts = b"".join(text + b"\0" for text in self.texts) or b"\0"
        return bytes(self.area) + texts + b"\0"


def firmware(length, vendor, version, date, rom_steps, release=(0xFF, 0xFF), controller=(0xFF, 0xFF)):
    out = Structure(0, length, 0x0000).text(4, vendor).text(5, version).word(6, 0xE800)
    out.text(8, date).byte(9, rom_steps)
    return out.raw(0x14, bytes(release)).raw(0x16, bytes(controller))


def system(maker, product, version, serial, uuid, wake, sku=None, family=None):
    out = Structure(1, 0x1B, 0x0001).text(4, maker).text(5, product).text(6, version)
    out.text(7, serial).raw(8, bytes.fromhex(uuid)).byte(0x18, wake)
    if sku:
        out.text(0x19, sku)
    if family:
        out.text(0x1A, family)
    return out


def board(handle, maker, product, version, serial, asset, flags, location, kind):
    out = Structure(2, 0x0F, handle).text(4, maker).text(5, product).text(6, version)
    out.text(7, serial).text(8, asset).byte(9, flags).text(0x0A, location)
    return out.word(0x0B, 0x0003).byte(0x0D, kind)


def chassis(length, maker, kind, version, serial, asset, height, cords, sku=None):
    out = Structure(3, length, 0x0003).text(4, maker).byte(5, kind).text(6, version)
    out.text(7, serial).text(8, asset).raw(9, b"\x03\x03\x03\x03")
    out.byte(0x11, height).byte(0x12, cords).byte(0x14, 3 if length > 0x15 else 0)
    return out.text(0x15, sku) if sku else out


def processor(handle, socket, family, maker, version, maximum, current, status, upgrade, cores, threads,
              external=0, serial=None, part=None):
    out = Structure(4, 0x2A, handle).text(4, socket).byte(5, 3).byte(6, family)
    out.text(7, maker).text(0x10, version).word(0x12, external).word(0x14, maximum).word(0x16, current)
    for offset, value in ((0x20, serial), (0x22, part)):
        if value:
            out.text(offset, value)
    out.byte(0x18, status).byte(0x19, upgrade).byte(0x23, cores).byte(0x24, cores)
    return out.byte(0x25, threads).word(0x26, 0x00FC).word(0x28, family)


def slot(length, handle, name, kind, width, usage, number, features, address=(0xFFFF, 0xFF, 0xFF)):
    out = Structure(9, length, handle).text(4, name).byte(5, kind).byte(6, width)
    out.byte(7, usage).byte(8, 4).word(9, number).byte(0x0B, 0x0C).byte(0x0C, features)
    if length > 0x0D:
        out.word(0x0D, address[0]).byte(0x0F, address[1]).byte(0x10, address[2])
    return out


def memory_array(handle, use, sockets, capacity_kb):
    out = Structure(16, 0x17, handle).byte(4, 3).byte(5, use).byte(6, 3)
    return out.double(7, capacity_kb).word(0x0B, 0xFFFE).word(0x0D, sockets)


def memory_module(length, handle, array, widths, megabytes, form, locator, bank, kind, speed=0, configured=0,
                  maker=None, serial=None, asset=None, part=None):
    out = Structure(17, length, handle).word(4, array).word(6, 0xFFFE)
    out.word(8, widths[0]).word(0x0A, widths[1])
    if megabytes < 0x7FFF:
        out.word(0x0C, megabytes)
    else:
        out.word(0x0C, 0x7FFF).double(0x1C, megabytes)
    out.byte(0x0E, form).text(0x10, locator).text(0x11, bank).byte(0x12, kind).word(0x15, speed)
    for offset, value in ((0x17, maker), (0x18, serial), (0x19, asset), (0x1A, part)):
        if value:
            out.text(offset, value)
    return out.word(0x20, configured)


def empty_socket(length, handle, array, form, locator, bank):
    return memory_module(length, handle, array, (0xFFFF, 0xFFFF), 0, form, locator, bank, 2,
                         maker="NO DIMM", serial="NO DIMM", part="NO DIMM")


def hardware_security(handle, settings):
    return Structure(24, 5, handle).byte(4, settings)


def entry_point_64(version, size):
    out = bytearray(b"_SM3_\0\x18" + bytes(version) + b"\0\x01\0" + struct.pack("<IQ", size, 0x7A000000))
    out[5] = -sum(out) % 256
    return bytes(out)


def entry_point_32(version, size, count):
    out = bytearray(b"_SM_\0\x1F" + bytes(version) + struct.pack("<H", 512) + bytes(6) + b"_DMI_\0")
    out += struct.pack("<HIHB", size, 0x000F0480, count, version[0] << 4 | version[1])
    out[0x15] = -sum(out[0x10:0x1F]) % 256
    out[4] = -sum(out) % 256
    return bytes(out)


def write(machine, wide, version, structures, texts):
    """`texts`: what the kernel shows of the tables, by the names of its files."""
    table = b"".join(item.bytes() for item in structures) + Structure(127, 4, 0xFEFF).bytes()
    entry = entry_point_64(version, len(table)) if wide else entry_point_32(version, len(table), len(structures) + 1)
    tables = HERE / machine / "sys/firmware/dmi/tables"
    tables.mkdir(parents=True, exist_ok=True)
    (tables / "DMI").write_bytes(table)
    (tables / "smbios_entry_point").write_bytes(entry)
    names = HERE / machine / "sys/class/dmi/id"
    names.mkdir(parents=True, exist_ok=True)
    for name, text in texts.items():
        (names / name).write_text(text + "\n")


# A notebook of two modules, UEFI, tables of version 3.2.
write("laptop", True, (3, 2), [
    firmware(0x1A, "Nordwind Systems", "N2HET47W (1.30 )", "08/14/2022", 0xFF, (1, 30), (1, 18))
    .word(0x18, 0x0020),
    system("Nordwind Systems", "NX-14 Gen 2", "NX 14", "PF2A7K3Q", "cc5a3c4b5e21b211a85ce8d0fc1be7a1", 6,
           "NX14_MT_20W0", "NX 14"),
    board(0x0002, "Nordwind Systems", "20W0S1AB00", "SDK0J40697 WIN", "L1HF16N00TQ", "No Asset Information",
          0x09, "Not Available", 10),
    chassis(0x16, "Nordwind Systems", 10, "None", "PF2A7K3Q", "IT-00417", 0, 1, "NX14_CH_01")
    .byte(0x14, 0),
    processor(0x0004, "U3E1", 0xCD, "Intel(R) Corporation", "11th Gen Intel(R) Core(TM) i5-1135G7 @ 2.40GHz",
              4200, 2400, 0x41, 0x3C, 4, 8, 100, "To Be Filled By O.E.M.", "To Be Filled By O.E.M."),
    slot(0x18, 0x0009, "Media Card Slot", 0x01, 0x01, 3, 1, 0x04),
    slot(0x18, 0x000A, "M.2 SSD", 0x17, 0x0A, 4, 2, 0x04, (0, 4, 0x00)),
    memory_array(0x0010, 3, 2, 32 << 20),
    memory_module(0x54, 0x0011, 0x0010, (64, 64), 8192, 13, "ChannelA-DIMM0", "BANK 0", 26, 3200, 3200,
                  "Samsung", "18C7A4F1", "9876543210", "M471A1G44BB0-CWE    "),
    memory_module(0x54, 0x0012, 0x0010, (64, 64), 8192, 13, "ChannelB-DIMM0", "BANK 2", 26, 3200, 3200,
                  "Samsung", "18C7A4F2", "9876543210", "M471A1G44BB0-CWE    "),
    hardware_security(0x0013, 0x02),
], {
    "bios_vendor": "Nordwind Systems", "bios_version": "N2HET47W (1.30 )", "bios_date": "08/14/2022",
    "bios_release": "1.30", "ec_firmware_release": "1.18",
    "sys_vendor": "Nordwind Systems", "product_name": "NX-14 Gen 2", "product_version": "NX 14",
    "product_serial": "PF2A7K3Q", "product_uuid": "4b3c5acc-215e-11b2-a85c-e8d0fc1be7a1",
    "product_sku": "NX14_MT_20W0", "product_family": "NX 14",
    "board_vendor": "Nordwind Systems", "board_name": "20W0S1AB00", "board_version": "SDK0J40697 WIN",
    "board_serial": "L1HF16N00TQ", "board_asset_tag": "No Asset Information",
    "chassis_vendor": "Nordwind Systems", "chassis_type": "10", "chassis_version": "None",
    "chassis_serial": "PF2A7K3Q", "chassis_asset_tag": "IT-00417",
})

# A rack server of two sockets with a riser, half of its 16 sockets for memory filled; version 2.8.
SERVER_MODULES = [
    memory_module(0x28, 0x1100 + i, 0x1000, (72, 64), 32768, 9, f"{bank}{1 + i % 4}", f"Bank {bank}", 26, 2933, 2666,
                  "Micron", f"2F1B{0xA1 + i:02X}30", f"{bank}{1 + i % 4}_AssetTag", "36ASF4G72PZ-2G9E2")
    if i % 8 < 4 else empty_socket(0x28, 0x1100 + i, 0x1000, 9, f"{bank}{5 + i % 4}", f"Bank {bank}")
    for i, bank in ((i, "AB"[i // 8]) for i in range(16))
]
write("server", False, (2, 8), [
    firmware(0x18, "Granit Computer", "2.11.2", "05/21/2021", 0xFF, (2, 11)),
    system("Granit Computer", "GR-740 Rack Server", "Not Specified", "7XK2LM3",
           "4c4c4544005810 4b80 32b7c04f4c4d33".replace(" ", ""), 6, "SKU=0715;ModelName=GR-740", "GR Rack"),
    board(0x0200, "Granit Computer", "0YWR7D", "A06", "CNFCP0000123AB", "", 0x09, "", 10),
    board(0x0201, "Granit Computer", "0RSR2B", "A01", "CNFCP0000456CD", "", 0x0C, "Riser 2", 13),
    chassis(0x15, "Granit Computer", 0x80 | 23, "Default string", "7XK2LM3", "DC2-R12-U07", 2, 2),
    processor(0x0400, "CPU1", 0xB3, "Intel", "Intel(R) Xeon(R) Gold 5222 CPU @ 3.80GHz", 4000, 3800, 0x41, 0x36,
              4, 4, 10400, "5F3A81C7", "Not Specified"),
    processor(0x0401, "CPU2", 0xB3, "Intel", "Intel(R) Xeon(R) Gold 5222 CPU @ 3.80GHz", 4000, 3800, 0x41, 0x36,
              4, 4, 10400, "5F3A81D2", "Not Specified"),
    slot(0x11, 0x0900, "PCIe Slot 1", 0xB5, 0x0B, 4, 1, 0x04, (0, 0x3B, 0x00)),
    slot(0x11, 0x0901, "PCIe Slot 2", 0xB6, 0x0D, 3, 2, 0x06),
    slot(0x11, 0x0902, "PCIe Slot 3", 0xB6, 0x0B, 2, 3, 0x04),
    memory_array(0x1000, 3, 16, 0x80000000),
    *SERVER_MODULES,
    hardware_security(0x1800, 0x01),
], {
    "bios_vendor": "Granit Computer", "bios_version": "2.11.2", "bios_date": "05/21/2021", "bios_release": "2.11",
    "sys_vendor": "Granit Computer", "product_name": "GR-740 Rack Server", "product_version": "Not Specified",
    "product_serial": "7XK2LM3", "product_uuid": "44454c4c-5800-4b10-8032-b7c04f4c4d33",
    "product_sku": "SKU=0715;ModelName=GR-740", "product_family": "GR Rack",
    "board_vendor": "Granit Computer", "board_name": "0YWR7D", "board_version": "A06",
    "board_serial": "CNFCP0000123AB", "board_asset_tag": "",
    "chassis_vendor": "Granit Computer", "chassis_type": "23", "chassis_version": "Default string",
    "chassis_serial": "7XK2LM3", "chassis_asset_tag": "DC2-R12-U07",
})

# A virtual machine whose maker filled in little, version 2.8.
write("virtual", False, (2, 8), [
    firmware(0x18, "SeaBIOS", "1.16.2-debian-1.16.2-1", "04/01/2014", 0, (0, 0)),
    system("System manufacturer", "Standard PC (i440FX + PIIX, 1996)", "pc-i440fx-7.2", "Not Specified",
           "00000000000000000000000000000000", 6),
    chassis(0x15, "QEMU", 1, "pc-i440fx-7.2", "To Be Filled By O.E.M.", "No Asset Tag", 0, 0),
    processor(0x0400, "CPU 0", 0x01, "QEMU", "pc-i440fx-7.2", 2000, 2000, 0x41, 0x01, 1, 1),
    processor(0x0401, "CPU 1", 0x01, "QEMU", "pc-i440fx-7.2", 2000, 2000, 0x41, 0x01, 1, 1),
    memory_array(0x1000, 3, 1, 4 << 20),
    memory_module(0x28, 0x1100, 0x1000, (0xFFFF, 0xFFFF), 4096, 9, "DIMM 0", "Not Specified", 7, 0, 0, "QEMU",
                  "Not Specified", "Not Specified", "Not Specified"),
], {
    "bios_vendor": "SeaBIOS", "bios_version": "1.16.2-debian-1.16.2-1", "bios_date": "04/01/2014",
    "bios_release": "0.0",
    "sys_vendor": "System manufacturer", "product_name": "Standard PC (i440FX + PIIX, 1996)",
    "product_version": "pc-i440fx-7.2", "product_serial": "Not Specified",
    "product_uuid": "00000000-0000-0000-0000-000000000000",
    "chassis_vendor": "QEMU", "chassis_type": "1", "chassis_version": "pc-i440fx-7.2",
    "chassis_serial": "To Be Filled By O.E.M.", "chassis_asset_tag": "No Asset Tag",
})
