# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
import unittest
import unittest.mock

from velmora_events.events import Event
from velmora_events.figures import Figures, as_markdown, as_text, rows, short_kinds
from velmora_events.kinds import SHOWN_ONLY
from velmora_events.matching import Outcome


class FiguresTest(unittest.TestCase):
    def test_precision_and_recall(self) -> None:
        figures = Figures()
        figures.add(Outcome(both=8, missed=[Event(1, "handover")] * 2))
        figures.add(Outcome(both=4, wrong=[Event(1, "handover")] * 3))
        # 12 of the 15 that were found happened, and 12 of the 14 that happened were found.
        self.assertEqual(figures.precision, 12 / 15)
        self.assertEqual(figures.recall, 12 / 14)

    def test_nothing_has_no_figure(self) -> None:
        self.assertIsNone(Figures().precision)
        self.assertIsNone(Figures().recall)
        self.assertFalse(Figures().is_short_of(1))

    def test_a_stated_kind_must_be_exact_and_a_derived_one_nearly(self) -> None:
        nearly = Figures(both=99, missed=1)
        table = {("context-up", "lte"): nearly, ("handover", "lte"): nearly, ("handover", "gsm"): Figures(97, 3)}
        self.assertEqual(short_kinds(table), ["context-up of lte", "handover of gsm"])

    def test_what_is_only_shown_is_never_short(self) -> None:
        table = {("pilot-pollution", "lte"): Figures(1, 9), ("pilot-pollution", "c2k"): Figures(1, 9)}
        with unittest.mock.patch.dict(SHOWN_ONLY, {("pilot-pollution", "lte"): "a reason"}):
            self.assertEqual(short_kinds(table), ["pilot-pollution of c2k"])
            self.assertEqual([row[-1] for row in rows(table)], ["short", "only shown"])

    def test_shares_are_never_rounded_up(self) -> None:
        (row,) = rows({("context-up", "lte"): Figures(both=99_999, missed=1)})
        self.assertEqual(row, ("context-up", "stated", "lte", "100000", "99999", "1.0000", "0.9999", "short"))

    def test_kinds_come_in_the_order_of_their_table(self) -> None:
        table = {("malformed", "gsm"): Figures(1), ("handover", "lte"): Figures(1), ("handover", "gsm"): Figures(1)}
        self.assertEqual([row[:3] for row in rows(table)], [
            ("handover", "derived", "gsm"), ("handover", "derived", "lte"), ("malformed", "stated", "gsm")])

    def test_text_has_a_line_a_row(self) -> None:
        lines = rows({("handover", "gsm"): Figures(1), ("gap", "gsm"): Figures(wrong=1)})
        self.assertEqual(len(as_text(lines).splitlines()), 3)

    def test_markdown_has_a_column_a_scenario(self) -> None:
        table = {("handover", "lte"): Figures(3, 1), ("handover", "gsm"): Figures(2), ("gap", "gsm"): Figures(wrong=1),
                 ("ping-pong", "gsm"): Figures(hidden=1)}
        self.assertEqual(as_markdown(table).splitlines(), [
            "| kind | gsm | lte |",
            "|---|---|---|",
            "| `handover` | 2 | 4: 1.0000, 0.7500 |",
            "| `gap` | 0: 0.0000, – |  |",
        ])
