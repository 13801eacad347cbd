# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Decodes 0xB17F with the struct module, and shifts and masks for the fields of a few bits."""

import struct
from typing import NamedTuple

from velmora_compare.decoders.packets import HEADER_LENGTH, run
from velmora_compare.decoders.texts import texts

WORDS = struct.Struct("<B3xHHIII")


class Measurement(NamedTuple):
    """The raw values."""

    version: int
    channel: int
    cell: int
    priority: int
    rsrp: int
    average_rsrp: int
    rsrq: int
    average_rsrq: int
    rssi: int
    minimum: int
    power: int
    maximum_power: int
    level: int
    cycles: int
    intra: int
    non_intra: int
    updated: int
    rules: int


def decode(record: bytes) -> dict[str, str]:
    version, channel, cell, levels, limits, selection = WORDS.unpack_from(record, HEADER_LENGTH)
    return texts(Measurement(
        version, channel,
        cell & 0x1FF, cell >> 9 & 0xF,
        levels & 0x1FF, levels >> 9 & 0x1FF, levels >> 18 & 0x7F, levels >> 25,
        limits & 0x1FF, limits >> 9 & 0x3F, limits >> 15 & 0x7F, limits >> 22 & 0x3F,
        selection & 0x7F, selection >> 7 & 0x3F, selection >> 13 & 0x3F, selection >> 19 & 0x3F,
        selection >> 25 & 1, selection >> 26 & 0xF,
    ))


if __name__ == "__main__":
    run(decode)
