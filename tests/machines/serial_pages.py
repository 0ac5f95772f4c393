#!/usr/bin/env python3
"""Writes the SCSI pages 0x80 (unit serial number, SPC) of the recorded machines' disks."""

from pathlib import Path

# machine, disk, serial number; drives that speak ATA fill theirs up with blanks
SERIALS = [
    ("server", "sda", "ZC1A2B30"),
    ("server", "sdb", "ZC1A2B31"),
    ("server", "sdc", "ZC1A2B32"),
    ("server", "sdd", "ZC1A2B33"),
    ("server", "sdaa", "20312A1B2C3D        "),
]

PAGE = 0x80


def page(serial):
    """Device type and qualifier, page number, length in two bytes, the number itself."""
    return bytes([0, PAGE]) + len(serial).to_bytes(2, "big") + serial.encode("ascii")


for machine, disk, number in SERIALS:
    device = Path(__file__).parent / machine / "sys/block" / disk / "device"
    (device / "vpd_pg80").write_bytes(page(number))
