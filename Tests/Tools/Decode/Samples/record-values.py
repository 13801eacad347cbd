#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Reads the messages of a recording, which is a pcapng file, without Velmora.

record-values.py RECORDING CODE[:any] [OFFSET]: for each record of the baseband's stream, or of any type, with that
code, the message's number, and the byte at the offset as a number where one is given.
record-values.py RECORDING CODE:list KEY...: for each record of the extra stream with that code whose property list has a
value along the keys, numbers of which count the elements of an array: the message's number and the value.
record-values.py RECORDING KEY KEY: for each property list with the second key in the dictionary of the first, the
message's number and the value.
"""

from __future__ import annotations

import plistlib
import sys
from pathlib import Path

ENHANCED_PACKET_BLOCK = 6
HEADER_LENGTH = 13
PREFIX_MARKER = 0x81
BASEBAND = 1
EXTRA = 0xFF


def little(data: bytes, offset: int, length: int) -> int:
    return int.from_bytes(data[offset : offset + length], "little")


def messages(recording: bytes) -> list[bytes]:
    """The packets, in their order."""
    packets = []
    offset = 0
    while offset < len(recording):
        if little(recording, offset, 4) == ENHANCED_PACKET_BLOCK:
            captured = little(recording, offset + 20, 4)
            packets.append(recording[offset + 28 : offset + 28 + captured])
        offset += little(recording, offset + 4, 4)
    return packets


def print_records(packets: list[bytes], code: int, any_type: bool, offset: int | None) -> None:
    for number, message in enumerate(packets, 1):
        if len(message) < HEADER_LENGTH:
            continue
        record = message[2:] if message[0] == PREFIX_MARKER else message
        if (any_type or record[0] == BASEBAND) and little(record, 3, 2) == code:
            print(number if offset is None else f"{number} {record[offset]}")


def value_along(keys: list[str], value: object) -> object:
    for key in keys:
        if isinstance(value, dict):
            value = value.get(key)
        elif isinstance(value, list) and key.isdigit() and int(key) < len(value):
            value = value[int(key)]
        else:
            return None
    return value


def print_list_values(packets: list[bytes], code: int, keys: list[str]) -> None:
    for number, message in enumerate(packets, 1):
        record = message[2:] if message[:1] == bytes([PREFIX_MARKER]) else message
        if len(record) < HEADER_LENGTH or record[0] != EXTRA or little(record, 3, 2) != code & 0xFFFF:
            continue
        try:
            value = value_along(keys, plistlib.loads(record[HEADER_LENGTH:]))
        except plistlib.InvalidFileException:
            continue  # cut off, on purpose
        if value is not None:
            print(number, value)


def print_properties(packets: list[bytes], group: str, key: str) -> None:
    for number, message in enumerate(packets, 1):
        value = plistlib.loads(message).get(group, {}).get(key)
        if value is not None:
            print(number, value)


def main(name: str, what: str, *rest: str) -> None:
    packets = messages(Path(name).read_bytes())
    if what.startswith("0x"):
        code, _, types = what.partition(":")
        if types == "list":
            print_list_values(packets, int(code, 16), list(rest))
            return
        print_records(packets, int(code, 16), types == "any", int(rest[0]) if rest else None)
    else:
        print_properties(packets, what, rest[0])


if __name__ == "__main__":
    main(*sys.argv[1:])
