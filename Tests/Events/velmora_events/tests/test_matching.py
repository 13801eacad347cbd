# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
import unittest

from velmora_events.events import Event
from velmora_events.matching import match


def move(time: float, kind: str = "handover", is_hidden: bool = False, **fields: str) -> Event:
    return Event(time, kind, None, is_hidden, {name.replace("_", "."): value for name, value in fields.items()})


class MatchTest(unittest.TestCase):
    def test_what_is_found_in_time_is_both(self) -> None:
        outcome = match([move(10)], [move(10.9)])["handover"]
        self.assertEqual((outcome.both, outcome.missed, outcome.wrong), (1, [], []))

    def test_what_is_found_too_late_is_missed_and_wrong(self) -> None:
        outcome = match([move(10)], [move(11.1)])["handover"]
        self.assertEqual((outcome.both, outcome.missed, outcome.wrong), (0, [move(10)], [move(11.1)]))

    def test_another_kind_is_another_event(self) -> None:
        outcomes = match([move(10)], [move(10, "ping-pong")])
        self.assertEqual(outcomes["handover"].missed, [move(10)])
        self.assertEqual(outcomes["ping-pong"].wrong, [move(10, "ping-pong")])

    def test_each_is_matched_once(self) -> None:
        outcome = match([move(10)], [move(10), move(10.1)])["handover"]
        self.assertEqual((outcome.both, outcome.wrong), (1, [move(10.1)]))
        outcome = match([move(10), move(10.1)], [move(10)])["handover"]
        self.assertEqual((outcome.both, outcome.missed), (1, [move(10.1)]))

    def test_the_nearest_is_matched_first(self) -> None:
        # In order of time the first would take the second's, and the second go without.
        outcome = match([move(10), move(10.8)], [move(10.7), move(11.7)])["handover"]
        self.assertEqual((outcome.both, outcome.missed, outcome.wrong), (1, [move(10)], [move(11.7)]))

    def test_another_cell_is_another_event(self) -> None:
        outcome = match([move(10, to_channel="1300")], [move(10, to_channel="3175")])["handover"]
        self.assertEqual(outcome.both, 0)
        outcome = match([move(10, to_channel="1300")], [move(10, to_channel="1300")])["handover"]
        self.assertEqual(outcome.both, 1)

    def test_names_of_states_are_compared_without_their_spelling(self) -> None:
        truth = move(10, "radio-state", to="CELL DCH")
        self.assertEqual(match([truth], [move(10, "radio-state", to="Cell_DCH")])["radio-state"].both, 1)
        self.assertEqual(match([truth], [move(10, "radio-state", to="CELL_FACH")])["radio-state"].both, 0)

    def test_what_lasts_ends_in_time(self) -> None:
        truth = Event(10, "limited-service", 20)
        self.assertEqual(match([truth], [Event(10, "limited-service", 20.5)])["limited-service"].both, 1)
        self.assertEqual(match([truth], [Event(10, "limited-service", 22)])["limited-service"].both, 0)
        self.assertEqual(match([truth], [Event(10, "limited-service")])["limited-service"].both, 0)

    def test_what_no_record_states_is_not_counted(self) -> None:
        hidden = move(10, is_hidden=True)
        self.assertEqual(match([hidden], [])["handover"].missed, [])
        outcome = match([hidden], [move(10)])["handover"]
        self.assertEqual((outcome.both, outcome.hidden, outcome.wrong), (0, 1, []))

    def test_a_hidden_move_may_be_found_as_any_move(self) -> None:
        outcome = match([move(10, is_hidden=True)], [move(10, "cell-reselection")])["cell-reselection"]
        self.assertEqual((outcome.hidden, outcome.wrong), (1, []))

    def test_a_stated_event_comes_before_a_hidden_one(self) -> None:
        outcome = match([move(10.1, is_hidden=True), move(10)], [move(10.1)])["handover"]
        self.assertEqual((outcome.both, outcome.hidden), (1, 0))

    def test_kinds_of_users_rules_are_left_out(self) -> None:
        self.assertEqual(match([], [move(10, "my-rule")]), {})
