# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Counts in what perf and valgrind write."""

import unittest

from velmora_compare.instructions import from_perf, from_valgrind

HEAD = "# started on Sun Nov 22 20:19:00 2026\n\n"


class InstructionsTest(unittest.TestCase):
    def test_the_processors_count(self) -> None:
        self.assertEqual(from_perf(HEAD + "1234567,,instructions:u,5000000,100.00,,\n"), 1_234_567)

    def test_a_processor_that_does_not_count(self) -> None:
        self.assertIsNone(from_perf(HEAD + "<not supported>,,instructions:u,0,100.00,,\n"))
        self.assertIsNone(from_perf(HEAD))

    def test_the_processes_of_a_pipeline_are_added(self) -> None:
        logs = ("==7== Collected : 58558109\n==7==\n==7== I   refs:      58,558,109\n", "==8== I refs: 41,891\n")
        self.assertEqual(from_valgrind(logs), 58_600_000)

    def test_a_log_without_a_count(self) -> None:
        self.assertIsNone(from_valgrind(["valgrind: no such program\n"]))
        self.assertEqual(from_valgrind(["==8== killed\n", "==9== I refs: 12\n"]), 12)
