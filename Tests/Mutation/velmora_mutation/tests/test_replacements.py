# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of what numbers and operators are replaced with."""

import unittest

from velmora_mutation.replacements import OPERATORS, other_numbers


class OtherNumbersTest(unittest.TestCase):
    def test_by_notation(self) -> None:
        for text, others in {
            "5": ["6", "4"],
            "0": ["1"],
            "1'000u": ["1001u", "999u"],
            "0x0F": ["0x10", "0xE"],
            "0x0": ["0x1"],
            "16UL": ["17UL", "15UL"],
            "0.25": ["1.25"],
            "2.5f": ["3.5f"],
            "3.": ["4."],
            "1e6": [],
            ".5": [],
        }.items():
            with self.subTest(text=text):
                self.assertEqual(other_numbers(text), others)


class OperatorsTest(unittest.TestCase):
    def test_every_replacement_is_another_operator(self) -> None:
        for operator, others in OPERATORS.items():
            with self.subTest(operator=operator):
                self.assertTrue(others)
                self.assertNotIn(operator, others)
