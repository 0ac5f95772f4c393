#!/usr/bin/env python3
"""Writes the compiled time zones (RFC 9636) of the recorded machines from the tables below."""

import pathlib
import struct

HERE = pathlib.Path(__file__).parent

# Place: kinds of local time (seconds ahead of UTC, daylight), changes (time, kind), rules.
ZONES = {
    "laptop/usr/share/zoneinfo/Europe/Berlin": (
        [(3208, 0), (3600, 0), (7200, 1)],
        [(-2422054408, 1), (-1693706400, 2), (-1680483600, 1)],
        "CET-1CEST,M3.5.0,M10.5.0/3",
    ),
    "server/usr/share/zoneinfo/UTC": ([(0, 0)], [], "UTC0"),
}

NAME = b"LT\0\0"


def header(changes, kinds):
    return struct.pack(">4sc15x6I", b"TZif", b"2", 0, 0, 0, changes, kinds, len(NAME))


def zone(kinds, changes, rules):
    first = header(0, 1) + struct.pack(">ibB", 0, 0, 0) + NAME
    second = header(len(changes), len(kinds))
    second += b"".join(struct.pack(">q", time) for time, _ in changes)
    second += bytes(kind for _, kind in changes)
    second += b"".join(struct.pack(">ibB", offset, daylight, 0) for offset, daylight in kinds)
    return first + second + NAME + b"\n" + rules.encode() + b"\n"


for place, table in ZONES.items():
    path = HERE / place
    path.parent.mkdir(parents=True, exist_ok=True)
    path.write_bytes(zone(*table))
