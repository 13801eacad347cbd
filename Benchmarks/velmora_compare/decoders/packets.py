# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Reads recordings as the programs write them, and writes lines of their 0xB17F records."""

import json
import struct
import sys
import time
from collections.abc import Callable, Iterator
from typing import TextIO

PACKET = 6
CODE = 0xB17F
HEADER_LENGTH, RECORD_LENGTH = 13, 33
PREFIX_MARKER = 0x81

BLOCK = struct.Struct("<II")
PACKET_HEADER = struct.Struct("<IIII")


def packets(content: bytes) -> Iterator[tuple[int, bytes]]:
    """Time in nanoseconds and message of each packet."""
    at = 0
    while at < len(content):
        kind, length = BLOCK.unpack_from(content, at)
        if kind == PACKET:
            _, high, low, captured = PACKET_HEADER.unpack_from(content, at + 8)
            yield high << 32 | low, content[at + 28 : at + 28 + captured]
        at += length


def time_text(time_ns: int) -> str:
    second, nanosecond = divmod(time_ns, 1_000_000_000)
    return f"{time.strftime('%Y-%m-%dT%H:%M:%S', time.gmtime(second))}.{nanosecond:09}Z"


def write_lines(content: bytes, decode: Callable[[bytes], dict[str, str]], output: TextIO) -> None:
    """A line for each message; a record that is too short shows what the one before it did."""
    shown: dict[str, str] = {}
    for time_ns, message in packets(content):
        record = message[2:] if message[0] == PREFIX_MARKER else message
        if len(record) >= RECORD_LENGTH:
            shown = decode(record)
        line = {"time": time_text(time_ns), "code": CODE, "sections": {"Serving Cell Measurements": shown}}
        output.write(json.dumps(line, separators=(",", ":")) + "\n")


def run(decode: Callable[[bytes], dict[str, str]]) -> None:
    """The script: writes the lines of the recording that its argument names."""
    with open(sys.argv[1], "rb") as file:
        write_lines(file.read(), decode, sys.stdout)
