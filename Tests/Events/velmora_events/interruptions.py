# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Recordings with silences and clocks that go back, which no drive has: a drive's copy with other times of arrival."""

import random
import struct
from dataclasses import dataclass

from velmora_events.events import Event

KINDS = frozenset({"gap", "clock-jump"})
PACKET = 6
HIGH_TIME = 12
"""The offset of a packet's time in its block, in two halves of 32 bits, in nanoseconds."""


@dataclass(frozen=True)
class Interruption:
    """What happens between a message and the next: so much time from the one to the other."""

    kind: str | None
    """The event that it is; none where it is too little for one."""
    least_s: float
    most_s: float

    def seconds(self, dice: random.Random) -> float:
        return round(dice.uniform(self.least_s, self.most_s), 3)


INTERRUPTIONS = (
    Interruption("gap", 30.001, 120),
    Interruption(None, 20, 30),
    Interruption("clock-jump", -60, -1.001),
    Interruption(None, -1, -0.001),
)


def packets_of(recording: bytes) -> list[int]:
    """Where the blocks of messages begin in a recording, a little-endian one."""
    places, at = [], 0
    while at < len(recording):
        kind, length = struct.unpack_from("<II", recording, at)
        if kind == PACKET:
            places.append(at)
        at += length
    return places


def interrupted(recording: bytes, dice: random.Random) -> tuple[bytes, list[Event]]:
    """The recording with one of each interruption, and the events that these are."""
    packets = packets_of(recording)
    if len(packets) <= len(INTERRUPTIONS):
        return recording, []
    before = dict(zip(dice.sample(range(1, len(packets)), len(INTERRUPTIONS)), INTERRUPTIONS, strict=True))
    changed, events = bytearray(recording), []
    shift = last = 0
    for number, place in enumerate(packets):
        high, low = struct.unpack_from("<II", recording, place + HIGH_TIME)
        own = high << 32 | low
        if (interruption := before.get(number)) is not None:
            shift = last - own + round(interruption.seconds(dice) * 1e9)
        now = own + shift
        struct.pack_into("<II", changed, place + HIGH_TIME, now >> 32, now & 0xFFFFFFFF)
        if interruption is not None and interruption.kind == "gap":
            events.append(Event(last / 1e9, "gap", now / 1e9))
        elif interruption is not None and interruption.kind is not None:
            events.append(Event(now / 1e9, interruption.kind))
        last = now
    return bytes(changed), events
