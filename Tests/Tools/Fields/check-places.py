#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Checks what `velmora-log fields` says against recordings: check-places.py VELMORA_LOG RECORDING...

Reads the records of a recording, which is a pcapng file, without Velmora, takes each number, enumeration and flag that
`decode --samples` lists out of its record as the catalogue's JSON says, and compares. Values in entries of lists are
left out, since the catalogue does not say where an entry begins. Prints how many values agreed; one that does not ends
it with a message and status 1.
"""

from __future__ import annotations

import json
import re
import subprocess
import sys
from pathlib import Path
from typing import Any

Source = dict[str, Any]

ENHANCED_PACKET_BLOCK = 6
RECORD_HEADER = 13
SUB_PACKETS_AT = 17  # their count is at 14 (3GPP2 1x status)
SUB_PACKET_COUNT_AT = 14


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


def without_prefix(message: bytes) -> bytes:
    """The log record of a message."""
    return message[2:] if len(message) > RECORD_HEADER and message[0] == 0x81 else message


def sub_packet(record: bytes, wanted: int) -> int:
    """Where that sub-packet begins."""
    offset = SUB_PACKETS_AT
    for _ in range(record[SUB_PACKET_COUNT_AT]):
        if record[offset] == wanted:
            return offset
        offset += little(record, offset + 2, 2)
    raise ValueError(f"no sub-packet {wanted}")


def raw_number(record: bytes, place: dict[str, Any]) -> int:
    """The number at the place."""
    offset = int(place["offset"]) + (sub_packet(record, place["subPacket"]) if "subPacket" in place else 0)
    bit, width = int(place["bit"]), int(place["width"])
    length = (bit + width + 7) // 8
    whole = int.from_bytes(record[offset : offset + length], "big" if place["bigEndian"] else "little")
    number = (whole >> bit) & ((1 << width) - 1)
    return number - (1 << width) if place["signed"] and number >> (width - 1) else number


def text_of(raw: int, source: Source) -> str:
    """What an enumeration or flag shows for the number."""
    for each in source["values"]:
        if each["value"] == raw:
            return str(each["text"])
    others = source["others"]
    return str(others["text"]) if "text" in others else f"{others['before']}{raw}{others['after']}"


def agrees(raw: int, source: Source, sample: dict[str, Any]) -> bool:
    """Whether the sample is what the number comes to."""
    if "values" in source:
        return text_of(raw, source) == str(sample["text"])
    physical = raw * float(source["physical"]["scale"]) + float(source["physical"]["offset"])
    return abs(physical - float(sample["value"])) <= 1e-9 * max(1, abs(physical))


def lines_of(program: str, *arguments: str) -> str:
    return subprocess.run([program, *arguments], stdout=subprocess.PIPE, stderr=subprocess.DEVNULL, text=True,
                          check=True).stdout


def main(program: str, recordings: list[str]) -> int:
    fields = json.loads(lines_of(program, "fields", "--format", "json"))["fields"]
    agreed = 0
    for name in recordings:
        technology = json.loads(lines_of(program, "decode", "--format", "json", name))["technology"]
        sources = {each["path"]: each["sources"] for each in fields if each["technology"] == technology}
        records = [without_prefix(message) for message in messages(Path(name).read_bytes())]
        for line in lines_of(program, "decode", "--samples", "--format", "jsonl", name).splitlines():
            sample = json.loads(line)
            path = re.sub(r"/[0-9]+(?=/|$)", "/*", sample["path"])
            for source in sources[path]:
                is_value = sample["value"] is not None and ("values" in source or "physical" in source)
                if source["code"] != sample["code"] or not is_value or "onlyAbsent" in source:
                    continue
                if "place" not in source or source["place"]["inEntry"]:
                    continue
                raw = raw_number(records[sample["record"] - 1], source["place"])
                if not agrees(raw, source, sample):
                    print(f"{name}: {raw} at {source['place']} is not {line}", file=sys.stderr)
                    return 1
                agreed += 1
    print(agreed)
    return 0 if agreed else 1


if __name__ == "__main__":
    sys.exit(main(sys.argv[1], sys.argv[2:]))
