# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Recordings as the programs write them: little-endian pcapng files of one interface."""

import struct
from collections.abc import Iterable, Iterator
from pathlib import Path

BEGINNING_NS = 1_767_600_000_000_000_000  # 2026-01-05 08:00:00 UTC
LINK_TYPE = 147
NANOSECONDS = 9
SECTION_HEADER, INTERFACE, PACKET = 0x0A0D0D0A, 1, 6
INTERFACE_NAME, TIME_RESOLUTION = 2, 9


def padded(body: bytes) -> bytes:
    return body + bytes(-len(body) % 4)


def block(kind: int, body: bytes) -> bytes:
    length = struct.pack("<I", len(body) + 12)
    return struct.pack("<I", kind) + length + body + length


def option(code: int, value: bytes) -> bytes:
    return struct.pack("<HH", code, len(value)) + padded(value)


def head(technology: str) -> bytes:
    section = struct.pack("<IHHq", 0x1A2B3C4D, 1, 0, -1)
    interface = struct.pack("<HHI", LINK_TYPE, 0, 0)
    interface += option(INTERFACE_NAME, technology.encode()) + option(TIME_RESOLUTION, bytes([NANOSECONDS]))
    return block(SECTION_HEADER, section) + block(INTERFACE, interface + option(0, b""))


def packet(time_ns: int, message: bytes) -> bytes:
    fields = struct.pack("<IIIII", 0, time_ns >> 32, time_ns & 0xFFFFFFFF, len(message), len(message))
    return block(PACKET, fields + padded(message))


def write(path: Path, technology: str, messages: Iterable[bytes], interval_ns: int = 40_000_000) -> None:
    """One message each 40 ms, so that there are refreshes in between."""
    with path.open("wb") as file:
        file.write(head(technology))
        for number, message in enumerate(messages):
            file.write(packet(BEGINNING_NS + number * interval_ns, message))


def messages_of(path: Path) -> Iterator[bytes]:
    content = path.read_bytes()
    at = 0
    while at < len(content):
        kind, length = struct.unpack_from("<II", content, at)
        if kind == PACKET:
            captured = struct.unpack_from("<I", content, at + 20)[0]
            yield content[at + 28 : at + 28 + captured]
        at += length
