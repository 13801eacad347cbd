# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Costs of a message and how they are written."""

import unittest

from velmora_compare.figures import Cost, ratio, sizes_of, three_digits


class FiguresTest(unittest.TestCase):
    def test_the_start_of_a_program_does_not_count(self) -> None:
        # 0.5 s to start and 2 us a message: 1000 messages take 0.502 s, 100 take 0.5002 s.
        self.assertAlmostEqual(sizes_of(1000).each(0.502, 0.5002), 2e-6)

    def test_the_smaller_recording_is_a_tenth(self) -> None:
        self.assertEqual((sizes_of(50_000).large, sizes_of(50_000).small), (50_000, 5000))
        self.assertEqual(sizes_of(5).small, 1)

    def test_spread_is_of_the_median(self) -> None:
        cost = Cost([110.0, 90.0, 100.0])
        self.assertEqual(cost.median, 100.0)
        self.assertAlmostEqual(cost.spread, 0.2)
        self.assertEqual(Cost([7.0]).spread, 0.0)

    def test_a_ratio_needs_two_costs_that_were_measured(self) -> None:
        self.assertEqual(ratio(Cost([6.0]), Cost([4.0])), 1.5)
        self.assertIsNone(ratio(Cost([6.0]), None))
        self.assertIsNone(ratio(None, Cost([6.0])))
        self.assertIsNone(ratio(Cost([6.0]), Cost([0.0])))
        self.assertIsNone(ratio(Cost([-6.0]), Cost([4.0])))

    def test_numbers_have_three_digits(self) -> None:
        for number, text in ((0, "0.00"), (0.03129, "0.0313"), (1, "1.00"), (9.996, "10.0"), (75.44, "75.4"),
                             (710.4, "710"), (12345, "12,300"), (999_600, "1,000,000"), (-41.26, "-41.3")):
            with self.subTest(number=number):
                self.assertEqual(three_digits(number), text)
