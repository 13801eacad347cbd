# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
import random
import struct
import unittest

from velmora_events.interruptions import HIGH_TIME, interrupted, packets_of


def block(kind: int, body: bytes) -> bytes:
    length = struct.pack("<I", len(body) + 12)
    return struct.pack("<I", kind) + length + body + length


def recording(times_ns: list[int]) -> bytes:
    """A block that is no packet, and a packet for each time."""
    packets = [block(6, struct.pack("<IIIII", 0, t >> 32, t & 0xFFFFFFFF, 0, 0)) for t in times_ns]
    return block(1, bytes(8)) + b"".join(packets)


def times_of(content: bytes) -> list[int]:
    halves = [struct.unpack_from("<II", content, place + HIGH_TIME) for place in packets_of(content)]
    return [high << 32 | low for high, low in halves]


class InterruptionsTest(unittest.TestCase):
    def setUp(self) -> None:
        # Fifty messages, a tenth of a second apart.
        self.times = [1_767_600_000_000_000_000 + number * 100_000_000 for number in range(50)]

    def test_has_one_of_each(self) -> None:
        for seed in range(20):
            changed, events = interrupted(recording(self.times), random.Random(seed))
            times = times_of(changed)
            steps = [(later - earlier) / 1e9 for earlier, later in zip(times, times[1:])]
            self.assertEqual(len(steps), 49)
            self.assertEqual(sum(abs(step - 0.1) < 1e-6 for step in steps), 45)
            self.assertEqual(sum(step > 30 for step in steps), 1)
            self.assertEqual(sum(20 <= step <= 30 for step in steps), 1)
            self.assertEqual(sum(step < -1 for step in steps), 1)
            self.assertEqual(sum(-1 <= step < 0 for step in steps), 1)
            self.assertEqual(sorted(event.kind for event in events), ["clock-jump", "gap"])

    def test_a_gap_lasts_from_the_message_before_to_the_one_after(self) -> None:
        changed, events = interrupted(recording(self.times), random.Random(1))
        times = times_of(changed)
        gap = next(event for event in events if event.kind == "gap")
        after = next(number for number in range(1, 50) if times[number] - times[number - 1] > 30e9)
        self.assertAlmostEqual(gap.time, times[after - 1] / 1e9, 5)
        self.assertAlmostEqual(gap.end or 0, times[after] / 1e9, 5)

    def test_what_has_too_few_messages_stays(self) -> None:
        self.assertEqual(interrupted(b"", random.Random(1)), (b"", []))
        short = recording(self.times[:4])
        self.assertEqual(interrupted(short, random.Random(1)), (short, []))

    def test_the_same_dice_give_the_same(self) -> None:
        content = recording(self.times)
        self.assertEqual(interrupted(content, random.Random(3)), interrupted(content, random.Random(3)))


if __name__ == "__main__":
    unittest.main()
