# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
import random
import struct
import unittest

from velmora_events.addresses import is_list_of_contexts, readdressed
from velmora_events.tests.test_interruptions import block

LIST = bytes.fromhex("ff 2000 0200 0000000000000000")
SIM = bytes.fromhex("ff 2000 0000 0000000000000000")


def recording(messages: list[bytes]) -> bytes:
    """A message a second."""
    packets = []
    for number, message in enumerate(messages):
        time_ns = (1_767_600_000 + number) * 10**9
        head = struct.pack("<IIIII", 0, time_ns >> 32, time_ns & 0xFFFFFFFF, len(message), len(message))
        packets.append(block(6, head + message + bytes(-len(message) % 4)))
    return b"".join(packets)


class AddressesTest(unittest.TestCase):
    def test_lists_of_contexts_are_found_by_stream_and_code(self) -> None:
        self.assertTrue(is_list_of_contexts(LIST))
        self.assertTrue(is_list_of_contexts(b"\x81\xff" + LIST))
        self.assertFalse(is_list_of_contexts(SIM))
        self.assertFalse(is_list_of_contexts(b"\x01" + LIST[1:]))
        self.assertFalse(is_list_of_contexts(b""))

    def test_the_address_changes_at_the_second_of_two_lists_that_have_it(self) -> None:
        content = recording([LIST + b"<array/>", LIST + b"192.0.2.17", SIM, LIST + b"192.0.2.17", LIST])
        changed, events = readdressed(content, random.Random(1))
        self.assertEqual(changed.count(b"192.0.2.17"), 1)
        self.assertEqual(changed.count(b"192.0.2.18"), 1)
        self.assertLess(changed.index(b"192.0.2.17"), changed.index(b"192.0.2.18"))
        self.assertEqual([(event.kind, event.time) for event in events], [("address-change", 1_767_600_003)])

    def test_a_context_that_was_down_in_between_does_not_change(self) -> None:
        content = recording([LIST + b"192.0.2.17", LIST + b"<array/>", LIST + b"192.0.2.17"])
        self.assertEqual(readdressed(content, random.Random(1)), (content, []))


if __name__ == "__main__":
    unittest.main()
