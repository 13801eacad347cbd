# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The table that is pasted."""

import unittest
from pathlib import Path

from velmora_compare.figures import Cost
from velmora_compare.programs import Program
from velmora_compare.table import table


def nothing(recording: Path) -> list[str]:
    return ["true", str(recording)]


PROGRAMS = {program.name: program for program in (
    Program("final", "`decode`", "copy", nothing),
    Program("copy", "copying", "", nothing),
    Program("stats", "`stats`", "final", nothing),
)}


class TableTest(unittest.TestCase):
    def test_costs_with_multiples_and_spreads(self) -> None:
        costs = {("final", "gsm"): Cost([90.0, 100.0, 110.0]), ("final", "lte"): Cost([150.0, 150.0, 150.0]),
                 ("copy", "gsm"): Cost([25.0, 25.0, 25.0])}
        self.assertEqual(table("ns", PROGRAMS, ["gsm", "lte"], costs).splitlines(), [
            "| ns, a message (times) | times what | Ostrel GSM | Ostrel LTE | spread |",
            "|---|---|---|---|---|",
            "| final: `decode` | copy | 100 (4.00) | 150 | 0 to 20 % |",
            "| copy: copying |  | 25.0 |  |  |",
        ])

    def test_the_spread_of_one_recording_is_one_number(self) -> None:
        row = table("ns", PROGRAMS, ["gsm"], {("copy", "gsm"): Cost([19.0, 20.0, 21.0])}).splitlines()[2]
        self.assertEqual(row, "| copy: copying |  | 20.0 | 10 % |")

    def test_counts_have_no_spread(self) -> None:
        self.assertEqual(table("instructions", PROGRAMS, ["c2k"], {("stats", "c2k"): Cost([6390.0])}).splitlines(), [
            "| instructions, a message (times) | times what | Ostrel CDMA |",
            "|---|---|---|",
            "| stats: `stats` |  | 6,390 |",
        ])

    def test_what_is_too_short_to_measure_is_none(self) -> None:
        row = table("ns", PROGRAMS, ["gsm"], {("copy", "gsm"): Cost([-3.0])}).splitlines()[2]
        self.assertEqual(row, "| copy: copying |  | - |")
