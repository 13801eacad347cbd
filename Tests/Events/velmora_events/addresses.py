# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Recordings in which an active context gets another address, as no drive has: a changed copy of a drive's."""

import random
import struct

from velmora_events.events import Event
from velmora_events.interruptions import HIGH_TIME, packets_of

ADDRESS, OTHER = b"192.0.2.17", b"192.0.2.18"
"""That of the drives' first context, and one of the same length."""
MESSAGE = 28
"""The offset of a packet's message in its block."""
CONTEXTS = bytes([2, 0])
"""The code of the lists of contexts in the extra stream."""
PREFIX, EXTRA = 0x81, 0xFF


def is_list_of_contexts(message: bytes) -> bool:
    """Whether the message is one of the extra stream, with that code after type and length."""
    record = message[2:] if message[:1] == bytes([PREFIX]) else message
    return record[:1] == bytes([EXTRA]) and record[3:5] == CONTEXTS


def readdressed(recording: bytes, dice: random.Random) -> tuple[bytes, list[Event]]:
    """The recording with the other address from some list of contexts on, and the event that this is.

    The list before has the context too: it was up, and not without an address.
    """
    lists = []
    for place in packets_of(recording):
        (length,) = struct.unpack_from("<I", recording, place + HIGH_TIME + 8)
        message = recording[place + MESSAGE : place + MESSAGE + length]
        if is_list_of_contexts(message):
            lists.append((place, ADDRESS in message))
    places = [place for (_, was), (place, has) in zip(lists, lists[1:]) if was and has]
    if not places:
        return recording, []
    place = dice.choice(places)
    high, low = struct.unpack_from("<II", recording, place + HIGH_TIME)
    changed = recording[:place] + recording[place:].replace(ADDRESS, OTHER)
    return changed, [Event((high << 32 | low) / 1e9, "address-change")]
