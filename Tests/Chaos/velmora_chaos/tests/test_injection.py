# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of how failures are chosen."""

import errno
import unittest

from velmora_chaos.failing.injection import Injection, injections, sampled_calls
from velmora_chaos.failing.sweep import Extent


class SampledCallsTest(unittest.TestCase):
    def test_few_calls_are_all_taken(self) -> None:
        self.assertEqual(sampled_calls(3, 8), [1, 2, 3])
        self.assertEqual(sampled_calls(0, 8), [])

    def test_a_quarter_from_the_start_and_the_rest_evenly(self) -> None:
        self.assertEqual(sampled_calls(62, 8), [1, 2, 3, 13, 23, 33, 43, 53])

    def test_a_sample_is_ascending_without_repetition_and_within_the_calls(self) -> None:
        for calls in (9, 10, 100, 12345):
            with self.subTest(calls=calls):
                sample = sampled_calls(calls, 8)
                self.assertEqual(len(sample), 8)
                self.assertEqual(sample, sorted(set(sample)))
                self.assertTrue(1 <= sample[0] and sample[-1] <= calls)


class ExtentTest(unittest.TestCase):
    def test_only_allocations_are_sampled(self) -> None:
        extent = Extent(sample=8, all_allocations=False, first_error_only=True)
        self.assertEqual(len(extent.calls("memory", 1000)), 8)
        self.assertEqual(list(extent.calls("write", 20)), list(range(1, 21)))

    def test_all_allocations(self) -> None:
        extent = Extent(sample=8, all_allocations=True, first_error_only=True)
        self.assertEqual(list(extent.calls("memory", 1000)), list(range(1, 1001)))


class InjectionTest(unittest.TestCase):
    def test_each_call_fails_in_every_mode_with_every_error(self) -> None:
        settings = [injection.setting() for injection in injections("write", [2], first_error_only=False)]
        full, broken = errno.ENOSPC, errno.EIO
        self.assertEqual(
            settings, [f"write 2 {times} {error}" for times in (1, 3, 0) for error in (full, broken)]
        )

    def test_first_error_only(self) -> None:
        chosen = list(injections("open", [1, 2], first_error_only=True))
        self.assertEqual(
            [(each.at, each.mode) for each in chosen[:3]], [(1, "once"), (1, "three"), (1, "for good")]
        )
        self.assertEqual({each.error for each in chosen}, {errno.EACCES})

    def test_text(self) -> None:
        self.assertEqual(str(Injection("sync", 3, "once", errno.EIO)), "sync 3 once, Input/output error")
