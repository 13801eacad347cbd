# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the order of changes, of a run and of its report."""

import unittest
from collections.abc import Callable

from velmora_mutation.campaign import Campaign
from velmora_mutation.changes import Change, changes_of
from velmora_mutation.sequence import WIDE_SHARE, in_turn
from velmora_mutation.tally import Outcome, Tally, describe, survivors


def changes(path: str, count: int) -> list[Change]:
    """So many changes of a file."""
    return list(changes_of(path, "x = 0;\n" * count))


def order(every: list[Change], seed: int = 1, wide: str = "-") -> list[Change]:
    return list(in_turn(every, lambda change: change.path[0], lambda change: change.path == wide, seed))


class InTurnTest(unittest.TestCase):
    EVERY = [*changes("a1", 3), *changes("b1", 30), *changes("a2", 4)]

    def test_every_change_comes_once(self) -> None:
        found = order(self.EVERY)
        self.assertEqual(len(found), len(self.EVERY))
        self.assertEqual(set(found), set(self.EVERY))

    def test_the_groups_alternate_until_one_is_empty(self) -> None:
        groups = "".join(change.path[0] for change in order(self.EVERY))
        self.assertEqual(groups, "ab" * 7 + "b" * 23)

    def test_the_same_seed_gives_the_same_order(self) -> None:
        self.assertEqual(order(self.EVERY, seed=3), order(self.EVERY, seed=3))
        self.assertNotEqual(order(self.EVERY, seed=3), order(self.EVERY, seed=4))

    def test_wide_headers_are_one_in_so_many_and_the_rest_comes_last(self) -> None:
        wide = [change.path == "w" for change in order([*changes("a", 45), *changes("w", 4)], wide="w")]
        before = [i for i, is_wide in enumerate(wide) if is_wide][:2]
        # The 20th and the 40th of the others follow one; two remain.
        self.assertEqual(before, [WIDE_SHARE - 1, 2 * WIDE_SHARE])
        self.assertEqual(wide[-3:], [False, True, True])


class CampaignTest(unittest.TestCase):
    def run_campaign(
        self, count: int, sample: int, try_change: Callable[[Change, int], Outcome], jobs: int = 1
    ) -> tuple[Tally, list[str]]:
        report: list[str] = []
        listed = {changes("listed", 1)[0].key}
        every = iter([*changes("listed", 1), *changes("a", count)])
        campaign = Campaign(every, listed, sample, try_change, report.append)
        campaign.run(jobs)
        return campaign.tally, report

    def test_ends_when_the_sample_is_complete(self) -> None:
        tally, report = self.run_campaign(30, 5, lambda change, lane: Outcome.NOTICED)
        self.assertEqual(tally.counts, {Outcome.EQUIVALENT: 1, Outcome.NOTICED: 4})
        self.assertEqual(len(report), 5)

    def test_what_does_not_compile_does_not_count(self) -> None:
        def outcome(change: Change, _lane: int) -> Outcome:
            return Outcome.NOTICED if change.line % 2 == 0 else Outcome.NOT_COMPILED

        tally, _ = self.run_campaign(30, 5, outcome)
        self.assertEqual(tally.counts, {Outcome.EQUIVALENT: 1, Outcome.NOTICED: 4, Outcome.NOT_COMPILED: 4})

    def test_0_tries_all(self) -> None:
        tally, _ = self.run_campaign(30, 0, lambda change, lane: Outcome.SURVIVED, jobs=3)
        self.assertEqual(tally.counts, {Outcome.EQUIVALENT: 1, Outcome.SURVIVED: 30})
        self.assertTrue(tally.has_survivors())

    def test_a_trial_that_raises_ends_the_run(self) -> None:
        def fail(change: Change, lane: int) -> Outcome:
            raise OSError("disk full")

        with self.assertRaisesRegex(OSError, "disk full"):
            self.run_campaign(3, 0, fail)


class ReportTest(unittest.TestCase):
    def test_survivors_are_read_again(self) -> None:
        first, second = changes("LogGenerator/a.cpp", 1) + changes("b", 1)
        report = "\n".join(
            [
                "2 changes are possible",
                describe(Outcome.NOTICED, second),
                describe(Outcome.SURVIVED, first),
                "1 noticed, 1 survived, 0 equivalent, 0 not compiled",
            ]
        )
        self.assertIn("survived LogGenerator/a.cpp:1\n    - x = 0;\n    + x = 1;\n", report)
        self.assertEqual(survivors(report), {first.key})

    def test_last_lines(self) -> None:
        tally = Tally()
        for outcome in (Outcome.NOTICED, Outcome.NOTICED, Outcome.NOT_COMPILED, Outcome.EQUIVALENT):
            tally.add(outcome)
        self.assertEqual(
            tally.report(10), "2 noticed, 0 survived, 1 equivalent, 1 not compiled\n10 s, 2.5 s a change"
        )
        self.assertEqual(tally.compiled(), 3)
        self.assertFalse(tally.has_survivors())

    def test_without_a_change(self) -> None:
        wanted = "0 noticed, 0 survived, 0 equivalent, 0 not compiled\n3 s, 3.0 s a change"
        self.assertEqual(Tally().report(3), wanted)
