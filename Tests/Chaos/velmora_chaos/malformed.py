# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Malformed input for a message port."""

import plistlib
import random
import struct

from velmora_chaos.raw_client import HEADER, ONE_WAY, REPLY, REQUEST, frame
from velmora_chaos.sandbox import SERVER_PORT

VARIANTS = 10


def malformed_input(chance: random.Random) -> bytes:
    """One of the variants, with equal probability."""
    return malformed_variant(chance.randrange(VARIANTS), chance)


def malformed_variant(variant: int, chance: random.Random) -> bytes:
    """The variant of that number, from 0 on."""
    if variant == 0:  # noise
        return chance.randbytes(chance.randrange(1, 4000))
    if variant == 1:  # a header without its last field
        return struct.pack("<IiI", 100, 0, ONE_WAY)
    if variant == 2:  # a length above the limit of a frame
        return HEADER.pack(0xFFFFFFFF, 0, ONE_WAY, 0)
    if variant == 3:  # a payload that is not a property list
        return frame(REQUEST, chance.randbytes(200), 7)
    if variant == 4:  # nested deeper than the reader allows, and cut off
        return frame(REQUEST, b'<?xml version="1.0"?><plist>' + b"<array>" * 5000, 8)
    if variant == 5:  # a reply without a request
        return frame(REPLY, b"unsolicited")
    if variant == 6:  # a log channel for a port that does not exist
        return frame(REQUEST, plistlib.dumps({"CreateLogChannel": "x" * chance.randrange(1, 300)}), 9)
    if variant == 7:  # log codes that are not numbers
        return frame(ONE_WAY, plistlib.dumps({"SetState": "Streaming", "SetOstrelLogCodes": ["all"]}))
    if variant == 8:  # a log channel to the service itself
        own = chance.choice([SERVER_PORT, f"{SERVER_PORT}.channel.1"])
        return frame(REQUEST, plistlib.dumps({"CreateLogChannel": own}), 10)
    return b""
