# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of summaries and of the limits that measurements are held against."""

import unittest
from dataclasses import replace

from velmora_chaos.checks import Problem
from velmora_chaos.clients import ClientsResult
from velmora_chaos.figures import shares, summary
from velmora_chaos.flood import FloodResult, dropped_counts
from velmora_chaos.growth import Growth
from velmora_chaos.hostile import HostileResult
from velmora_chaos.lines import Line
from velmora_chaos.redraws import Redraw
from velmora_chaos.restarts import recovery_limit_s, streaming_since


class SummaryTest(unittest.TestCase):
    def test_median_percentile_and_maximum(self) -> None:
        numbers = [float(number) for number in range(200, 0, -1)]
        self.assertEqual(
            summary("took", "s", numbers),
            "took: median 100.50 s, 99 % 199.00 s, maximum 200.00 s (200 times)",
        )

    def test_one_number(self) -> None:
        self.assertEqual(
            summary("took", "ms", [4]), "took: median 4.00 ms, 99 % 4.00 ms, maximum 4.00 ms (1 times)"
        )


class SharesTest(unittest.TestCase):
    def test_the_remainder_goes_to_the_first(self) -> None:
        self.assertEqual(shares(11, 4), [3, 3, 3, 2])

    def test_an_even_division(self) -> None:
        self.assertEqual(shares(8, 4), [2, 2, 2, 2])


class RestartsTest(unittest.TestCase):
    STREAMING = "<6>com.velmora.vox.server: streaming to com.velmora.BasebandStateReport.LogChannel"

    def test_streaming_is_the_first_line_after_the_start(self) -> None:
        lines = [Line(1, self.STREAMING), Line(3, "x: streaming to another"), Line(4, self.STREAMING)]
        self.assertEqual(streaming_since([*lines, Line(5, self.STREAMING)], 2), 4)

    def test_not_streaming_yet(self) -> None:
        self.assertIsNone(streaming_since([Line(1, self.STREAMING)], 2))

    def test_a_busy_machine_may_take_the_second_attempt_and_two_ticks(self) -> None:
        self.assertEqual(recovery_limit_s(strict=True), 6)
        self.assertEqual(recovery_limit_s(strict=False), 5 + 1 + 2 + 1)


class ClientsResultTest(unittest.TestCase):
    GOOD = ClientsResult(seconds=6, sent=500, displays=[2, 3], gap_s=2.0)

    def test_good(self) -> None:
        self.GOOD.check()
        self.assertEqual(
            str(self.GOOD),
            "2 clients beside one that never reads and one that sent 500 malformed frames: 2 to 3 displays "
            "each in 6 s; longest time without a redraw 2.00 s",
        )

    def test_a_client_without_its_displays(self) -> None:
        with self.assertRaisesRegex(Problem, "^a client received 1 displays, wanted at least 2$"):
            replace(self.GOOD, displays=[3, 1]).check()

    def test_a_screen_that_hangs(self) -> None:
        with self.assertRaisesRegex(Problem, r"^5\.01 s without a redraw$"):
            replace(self.GOOD, gap_s=5.01).check()


class HostileResultTest(unittest.TestCase):
    GOOD = HostileResult(attack_s=3, refused=0, gap_s=2.1, displays=2, passed_s=8.5)

    def test_one_display_may_be_missed(self) -> None:
        self.GOOD.check()
        with self.assertRaisesRegex(Problem, "^another client received 1 displays, wanted at least 2$"):
            replace(self.GOOD, displays=1).check()

    def test_a_screen_that_hangs(self) -> None:
        with self.assertRaisesRegex(Problem, r"^6\.00 s without a redraw$"):
            replace(self.GOOD, gap_s=6).check()


class FloodResultTest(unittest.TestCase):
    # Seven redraws fill the history; memory counts from the sixth on.
    GOOD = FloodResult(
        passed_s=2,
        dropped=[150_000, 50_000],
        redraws=[Redraw(2 * number, 10 + number, 20_000 + 100 * number) for number in range(9)],
        gap_s=2,
        service_before_kib=9000,
        service_after_kib=9100,
    )

    def test_figures(self) -> None:
        self.assertEqual(self.GOOD.rate, 100_000)
        self.assertEqual(self.GOOD.screen_before_kib, 20_600)
        self.assertEqual(self.GOOD.screen_growth_kib, 200)
        self.assertEqual(self.GOOD.service_growth_kib, 100)
        self.assertEqual(
            str(self.GOOD),
            "flood: 100000 messages a second sent to a client that never reads, all counted as dropped in 2 "
            "lines; the screen's loop late by 14.0 ms in the median redraw, 18.0 ms at most; longest time "
            "without a redraw 2.00 s; memory: service 9000 +100 KiB, application 20600 +200 KiB",
        )
        self.GOOD.check(strict=True)

    def test_a_service_that_grows(self) -> None:
        with self.assertRaisesRegex(Problem, "^the service grew by 4096 KiB$"):
            replace(self.GOOD, service_after_kib=9000 + 4096).check(strict=False)

    def test_an_application_that_grows_by_a_quarter(self) -> None:
        grown = [*self.GOOD.redraws, Redraw(20, 0, 20_600 + 5150)]
        with self.assertRaisesRegex(Problem, "^the application grew by 5150 KiB$"):
            replace(self.GOOD, redraws=grown).check(strict=False)

    def test_a_screen_that_answers_late(self) -> None:
        late = replace(self.GOOD, redraws=[*self.GOOD.redraws, Redraw(20, 51, 20_000)])
        late.check(strict=False)
        with self.assertRaisesRegex(Problem, "^the screen answered after 51 ms, wanted 50 ms$"):
            late.check(strict=True)

    def test_a_rate_too_low(self) -> None:
        slow = replace(self.GOOD, dropped=[180_000])
        slow.check(strict=False)
        with self.assertRaisesRegex(Problem, "^90000 messages a second, wanted 100000$"):
            slow.check(strict=True)

    def test_counts_are_read_from_the_log(self) -> None:
        log = ["<4>x: messages dropped because the peer is slow: 17", "<6>serving", "messages dropped: 3"]
        self.assertEqual(dropped_counts(log), [17])


class GrowthTest(unittest.TestCase):
    def test_report(self) -> None:
        self.assertEqual(
            str(Growth("decode", 1800, 9000, 9012)),
            "decode: 1800 refreshes; 9000 KiB after the first 5, at most +12 KiB later",
        )

    def test_less_than_a_mebibyte_is_accepted(self) -> None:
        Growth("decode", 11, 9000, 9000 + 1023).check()

    def test_a_mebibyte_is_too_much(self) -> None:
        with self.assertRaisesRegex(Problem, "^decode: grew by 1024 KiB, wanted less than 1024$"):
            Growth("decode", 11, 9000, 9000 + 1024).check()

    def test_too_few_refreshes(self) -> None:
        with self.assertRaisesRegex(Problem, "^decode: 10 refreshes are too few$"):
            Growth("decode", 10, 9000, 9000).check()
