# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the reader of a program's output."""

import os
import unittest

from velmora_chaos.lines import Lines


class LinesTest(unittest.TestCase):
    def test_keeps_the_lines_in_order_without_their_ends(self) -> None:
        lines = Lines(["serving a\n", "\n", "streaming"])
        lines.join()
        self.assertEqual([line.text for line in lines.all()], ["serving a", "", "streaming"])

    def test_times_never_go_back(self) -> None:
        lines = Lines(["1\n", "2\n", "3\n"])
        lines.join()
        times = [line.when_s for line in lines.all()]
        self.assertEqual(times, sorted(times))

    def test_counts_the_lines_that_contain_a_text(self) -> None:
        lines = Lines(["Updated 1, Updated 2\n", "row\n", "Updated 3\n"])
        lines.join()
        self.assertEqual(lines.count("Updated "), 2)
        self.assertEqual(lines.count("closed"), 0)

    def test_next_returns_each_line_once_and_then_none(self) -> None:
        lines = Lines(["1\n", "2\n"])
        found = [lines.next(5), lines.next(5), lines.next(5)]
        self.assertEqual([line.text if line else None for line in found], ["1", "2", None])

    def test_next_times_out_while_the_stream_is_open(self) -> None:
        reading, writing = os.pipe()
        with os.fdopen(reading) as stream:
            lines = Lines(stream)
            self.assertIsNone(lines.next(0.02))
            os.write(writing, b"late\n")
            line = lines.next(5)
            os.close(writing)
            lines.join()
        self.assertEqual(line.text if line else None, "late")
