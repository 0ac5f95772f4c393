#!/usr/bin/env python3
"""Writes the EDID files of the recorded machines, and the seeds of their fuzzing, from the tables
below. The files are in the tree, so that tests need no Python; run this after changing a table."""

import pathlib

TESTS = pathlib.Path(__file__).resolve().parent.parent


def text(kind, content):
    """A descriptor of 18 bytes: a text of up to 13 characters, ended by LF and padded."""
    body = content.encode() + (b"\n" if len(content) < 13 else b"")
    return bytes([0, 0, 0, kind, 0]) + body.ljust(13, b" ")


def frequency_range(vertical, horizontal):
    """From least to most, in Hz and in kHz."""
    return bytes([0, 0, 0, 0xFD, 0, *vertical, *horizontal, 30, 0, 10, 32, 32, 32, 32, 32, 32])


def timing(width, height, width_mm, height_mm, clock_10khz=14850, interlaced=False):
    """A detailed timing as far as monitors are known by it; the blanking is 160 by 45."""
    blank, lines = 160, 45
    return bytes([
        clock_10khz & 255, clock_10khz >> 8,
        width & 255, blank, (width >> 8) << 4,
        height & 255, lines, (height >> 8) << 4,
        48, 32, 0x36, 0,
        width_mm & 255, height_mm & 255, (width_mm >> 8) << 4 | height_mm >> 8,
        0, 0, 0x98 if interlaced else 0x18,
    ])


def block(maker, product, descriptors, serial=0, week=0, year=0, revision=4, video=0xA5,
          size=(0, 0), features=0x22):
    """The first block: `maker` is three letters, `size` is in cm."""
    packed = 0
    for letter in maker:
        packed = packed << 5 | ord(letter) - ord("A") + 1
    out = bytes([0, 255, 255, 255, 255, 255, 255, 0])
    out += packed.to_bytes(2, "big") + product.to_bytes(2, "little") + serial.to_bytes(4, "little")
    out += bytes([week, year - 1990 if year else 0, 1, revision, video, *size, 120, features])
    out += bytes(10)  # chromaticity
    out += bytes(3)   # established timings
    out += b"\x01\x01" * 8
    padding = bytes([0, 0, 0, 0x10]) + bytes(14)
    out += b"".join(descriptors + [padding] * (4 - len(descriptors)))
    out += bytes(1)   # no further blocks
    return out + bytes([-sum(out) % 256])


PANEL = block("LGD", 0x0665, [timing(1920, 1200, 302, 188), text(0xFE, "LG Display"),
                              text(0xFE, "LP140WU1-SPB1")], year=2020, size=(30, 19))
DESK = block("DEL", 0xA0C4, [timing(2560, 1440, 597, 336), text(0xFF, "CN0J5H1Q74"),
                             text(0xFC, "DELL U2719D"), frequency_range((56, 76), (30, 120))],
             serial=0x4C333942, week=33, year=2019, size=(60, 34), features=0x3B)
CONSOLE = block("HWP", 0x2600, [timing(1024, 768, 304, 228), text(0xFC, "HP 1530")],
                serial=0x01010101, week=12, year=2004, revision=3, video=0x08, size=(30, 23),
                features=0x08)
VIRTUAL = block("RHT", 0x1234, [timing(1280, 800, 325, 203), text(0xFC, "QEMU Monitor"),
                                frequency_range((50, 125), (30, 160))],
                week=42, year=2014, size=(32, 20))
TELEVISION = block("SAM", 0x0C4B, [timing(1920, 540, 16, 9, interlaced=True),
                                   text(0xFC, "SAMSUNG"), frequency_range((60, 60), (15, 15))],
                   serial=0x01000E00, week=255, year=2015, revision=4, video=0x80, size=(89, 50),
                   features=0x02)

FILES = {
    "machines/laptop/sys/class/drm/card0-eDP-1/edid": PANEL,
    # A monitor with a second block, which nobody reads here.
    "machines/laptop/sys/class/drm/card0-DP-2/edid": DESK[:126] + bytes([1, DESK[127] - 1]) +
                                                     bytes(128),
    "machines/server/sys/class/drm/card0-VGA-1/edid": CONSOLE,
    "machines/virtual/sys/class/drm/card0-Virtual-1/edid": VIRTUAL,
    "machines/arm/sys/class/drm/card1-HDMI-A-1/edid": TELEVISION,
    "fuzz/corpus/edid/panel": PANEL,
    "fuzz/corpus/edid/desk": DESK,
    "fuzz/corpus/edid/console": CONSOLE,
    "fuzz/corpus/edid/television": TELEVISION,
    "fuzz/corpus/edid/short": PANEL[:127],
    "fuzz/corpus/edid/broken-sum": PANEL[:127] + bytes([PANEL[127] ^ 1]),
}

for name, content in FILES.items():
    path = TESTS / name
    path.parent.mkdir(parents=True, exist_ok=True)
    path.write_bytes(content)
