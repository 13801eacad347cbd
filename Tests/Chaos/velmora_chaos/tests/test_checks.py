# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of checks and of waiting."""

import unittest

from velmora_chaos.checks import Problem, expect, wait_for


class ExpectTest(unittest.TestCase):
    def test_passes_what_holds(self) -> None:
        expect(True, "not shown")

    def test_raises_the_text_of_what_does_not_hold(self) -> None:
        with self.assertRaisesRegex(Problem, "^3 sockets, wanted 2$"):
            expect([], "3 sockets, wanted 2")


class WaitForTest(unittest.TestCase):
    def test_returns_the_first_true_result(self) -> None:
        results = iter([0, None, 7, 8])
        self.assertEqual(wait_for("a result", lambda: next(results)), 7)

    def test_times_out_with_what_it_waited_for(self) -> None:
        with self.assertRaisesRegex(Problem, r"^timed out after 0\.02 s waiting for the service$"):
            wait_for("the service", lambda: False, 0.02)
