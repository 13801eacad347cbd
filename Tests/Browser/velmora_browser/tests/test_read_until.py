# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of waiting for a page that is still changing, with a page that is made up."""

import unittest
from typing import Any
from unittest import mock

from velmora_browser import browser
from velmora_browser.browser import Browser, DriverError


class ReadUntilTest(unittest.TestCase):
    def setUp(self) -> None:
        self.clock_s = 0.0

        def pass_time(seconds: float) -> None:
            self.clock_s += seconds

        time = mock.patch.multiple("velmora_browser.browser.time", monotonic=lambda: self.clock_s, sleep=pass_time)
        time.start()
        self.addCleanup(time.stop)
        self.pass_time = pass_time

    def read(self, *values: object) -> tuple[Any, bool]:
        """Reads one of the values after the other, the last one for good, until one is above 5."""
        page: Any = mock.create_autospec(Browser, instance=True)
        page.wait_for_drawing.side_effect = lambda: self.pass_time(1)
        page.run.side_effect = [*values, *[values[-1]] * 10_000]
        return Browser.read_until(page, "return length", lambda value: value > 5)

    def test_returns_what_holds_at_once(self) -> None:
        self.assertEqual(self.read(7), (7, True))
        self.assertEqual(self.clock_s, 0)

    def test_reads_again_after_drawing(self) -> None:
        self.assertEqual(self.read(1, 2, 6), (6, True))
        self.assertEqual(self.clock_s, 2)

    def test_null_never_holds(self) -> None:
        self.assertEqual(self.read(None, None, 8), (8, True))

    def test_a_page_that_is_left_is_read_again(self) -> None:
        self.assertEqual(self.read(1, DriverError("the page was left"), DriverError("no such element"), 9), (9, True))

    def test_the_last_value_is_returned_when_time_is_up(self) -> None:
        self.assertEqual(self.read(None, 3), (3, False))
        self.assertGreaterEqual(self.clock_s, browser.LONGEST_WAIT_S)

    def test_the_last_error_is_returned_when_time_is_up(self) -> None:
        value, holds = self.read(DriverError("no such element"))
        self.assertEqual((str(value), holds), ("no such element", False))

    def test_a_browser_that_ended_is_not_waited_for(self) -> None:
        with self.assertRaisesRegex(RuntimeError, "^firefox ended$"):
            self.read(1, RuntimeError("firefox ended"), 9)


if __name__ == "__main__":
    unittest.main()
