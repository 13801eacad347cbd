# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of what the crowd may take."""

import dataclasses
import unittest
from typing import Any

from velmora_chaos.checks import Problem
from velmora_chaos.crowd import CrowdResult, counted_lines

GOOD = CrowdResult(late_s=15.0, growth_kib=70_000, displays=2, refused_s=1.2, lines=30, counted=4970)


class CrowdResultTest(unittest.TestCase):
    def test_a_good_result_passes(self) -> None:
        GOOD.check()

    def test_every_limit_is_checked(self) -> None:
        changes: list[tuple[dict[str, Any], str]] = [
            ({"late_s": 25.1}, "25.1 s until a display, wanted at most 25"),
            ({"growth_kib": 106_497}, "grew by 106497 KiB, wanted at most 106496"),
            ({"displays": 0}, "no display beside unfinished frames"),
            ({"lines": 34}, "34 lines about refused requests, wanted at most 33"),
            ({"counted": 4969}, "4999 of 5000 refused requests were logged or counted"),
        ]
        for change, problem in changes:
            with self.subTest(problem), self.assertRaisesRegex(Problem, f"^{problem}$"):
                dataclasses.replace(GOOD, **change).check()


class CountedLinesTest(unittest.TestCase):
    def test_counts_of_the_kind_are_added(self) -> None:
        texts = [
            "<3>odd requests: 12 more within a second",
            "<3>odd requests: 30 more within a second",
            "<3>closed connections: 500 more within a second",
            "<3>odd requests",
        ]
        self.assertEqual(counted_lines(texts, "odd requests"), 42)
