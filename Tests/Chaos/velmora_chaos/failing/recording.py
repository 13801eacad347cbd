# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The messages of a recording, for comparing two recordings of one drive."""

import struct

from velmora_chaos.checks import expect

BLOCK = struct.Struct("<II")  # type, total length
LEAST_BLOCK = 12
ENHANCED_PACKET = 6
LENGTH_AT = 20  # of the captured length, in an Enhanced Packet Block
DATA_AT = 28


def messages(recording: bytes) -> list[bytes]:
    """The packets of a pcapng file, in order; raises Problem unless it ends with a whole block."""
    found = []
    at = 0
    while at < len(recording):
        expect(at + LEAST_BLOCK <= len(recording), f"a block is cut off at {at}")
        kind, length = BLOCK.unpack_from(recording, at)
        whole = LEAST_BLOCK <= length <= len(recording) - at and length % 4 == 0
        expect(whole, f"a block is cut off at {at}")
        if kind == ENHANCED_PACKET:
            (size,) = struct.unpack_from("<I", recording, at + LENGTH_AT)
            found.append(recording[at + DATA_AT : at + DATA_AT + size])
        at += length
    return found
