# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of what the screen's probe prints."""

import subprocess
import unittest

from velmora_chaos.checks import Problem
from velmora_chaos.program import Program
from velmora_chaos.redraws import Redraw, longest_gap_s, next_redraw, parse_redraw, redraws


def printing(text: str) -> Program:
    process = subprocess.Popen(["/usr/bin/printf", "%b", text], stdout=subprocess.PIPE, text=True)
    assert process.stdout
    return Program(process, process.stdout)


def at(*times_s: float) -> list[Redraw]:
    return [Redraw(when_s, 0, 0) for when_s in times_s]


class ParseRedrawTest(unittest.TestCase):
    def test_reads_time_delay_and_memory(self) -> None:
        self.assertEqual(parse_redraw("redraw 12.5 0.75 31000"), Redraw(12.5, 0.75, 31000))

    def test_other_lines_are_none(self) -> None:
        for line in ("", "status 12.5 waiting for data", "redraw 12.5", "redraws 1 2 3"):
            with self.subTest(line=line):
                self.assertIsNone(parse_redraw(line))


class NextRedrawTest(unittest.TestCase):
    def test_skips_earlier_redraws_and_other_lines(self) -> None:
        screen = printing(r"redraw 1 0 9\n\nstatus x\nredraw 2 0 9\nredraw 4 0 9\n")
        self.addCleanup(screen.kill)
        self.assertEqual(next_redraw(screen, since_s=1.5), 2)
        self.assertEqual(next_redraw(screen), 4)
        self.assertEqual([redraw.when_s for redraw in redraws(screen)], [1, 2, 4])

    def test_times_out_without_a_redraw(self) -> None:
        screen = printing(r"redraw 1 0 9\n")
        self.addCleanup(screen.kill)
        with self.assertRaisesRegex(Problem, "^no redraw within 1 s$"):
            next_redraw(screen, since_s=2, limit_s=1)


class LongestGapTest(unittest.TestCase):
    def test_is_the_longest_time_between_neighbours(self) -> None:
        self.assertEqual(longest_gap_s(at(1, 3, 6, 8), since_s=1), 3)

    def test_ignores_what_came_before(self) -> None:
        self.assertEqual(longest_gap_s(at(1, 9, 11, 12), since_s=9), 2)

    def test_one_redraw_has_no_gap(self) -> None:
        with self.assertRaisesRegex(Problem, "^1 redraws, wanted at least 2$"):
            longest_gap_s(at(1, 9), since_s=9)
