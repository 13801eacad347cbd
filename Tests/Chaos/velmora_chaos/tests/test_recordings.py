# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of what is checked of recordings whose files others change."""

import struct
import tempfile
import unittest
from pathlib import Path

from velmora_chaos.recordings import CHANGES, gap, whole_blocks

DRIVE = [b"1", b"2", b"3", b"4", b"5"]


class GapTest(unittest.TestCase):
    def test_counts_what_is_in_neither_part(self) -> None:
        self.assertEqual(gap(DRIVE, DRIVE[:2], DRIVE[2:]), 0)
        self.assertEqual(gap(DRIVE, DRIVE[:3], DRIVE[1:4]), 0)
        self.assertEqual(gap(DRIVE, DRIVE[:1], DRIVE[3:]), 2)
        self.assertEqual(gap(DRIVE, [], DRIVE[2:3]), 2)

    def test_other_messages_are_no_part(self) -> None:
        self.assertIsNone(gap(DRIVE, [b"2"], DRIVE[2:]))
        self.assertIsNone(gap(DRIVE, DRIVE[:2], [b"3", b"5"]))
        self.assertIsNone(gap(DRIVE, DRIVE[:2], []))


class WholeBlocksTest(unittest.TestCase):
    def test_leaves_out_the_block_that_is_cut_off(self) -> None:
        block = struct.pack("<III", 6, 12, 12)
        self.assertEqual(whole_blocks(block + block), block + block)
        self.assertEqual(whole_blocks(block + block[:11]), block)
        self.assertEqual(whole_blocks(block + struct.pack("<III", 6, 16, 0)), block)
        self.assertEqual(whole_blocks(block + bytes(12)), block)


class ChangesTest(unittest.TestCase):
    def test_do_what_they_are_called(self) -> None:
        for name, change in CHANGES.items():
            with tempfile.TemporaryDirectory() as directory:
                path = Path(directory) / "drive.pcapng"
                path.write_bytes(b"recorded")
                with path.open("rb") as file:
                    change(path)
                    left = file.read()
                exists = "truncated" in name or "replaced" in name
                self.assertEqual(path.exists(), exists, name)
                self.assertEqual(left, b"" if "truncated" in name else b"recorded", name)
