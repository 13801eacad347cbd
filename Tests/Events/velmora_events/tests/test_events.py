# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
import unittest

from velmora_events.events import found_of, plain, seconds, truth_of


class EventsTest(unittest.TestCase):
    def test_times_have_any_fraction(self) -> None:
        self.assertEqual(seconds("1970-01-01T00:01:00Z"), 60)
        self.assertAlmostEqual(seconds("1970-01-01T00:01:00.125Z"), 60.125)
        self.assertAlmostEqual(seconds("1970-01-01T00:01:00.123456789Z"), 60.123456789)

    def test_the_truth_has_its_fields_beside_the_kind(self) -> None:
        (event,) = truth_of(['{"time":"1970-01-01T00:00:02Z","end":"1970-01-01T00:00:03Z","kind":"gap","hidden":true,"to":"a"}'])
        self.assertEqual((event.time, event.end, event.kind, event.is_hidden, event.fields), (2, 3, "gap", True, {"to": "a"}))

    def test_what_was_found_has_them_in_an_object(self) -> None:
        (event,) = found_of(['{"time":"1970-01-01T00:00:02Z","kind":"gap","text":"x","fields":{"to.channel":1300.0,"to":"b"}}'])
        self.assertEqual(event.fields, {"to.channel": "1300", "to": "b", "text": "x"})
        self.assertIsNone(event.end)

    def test_plain_text_has_letters_and_digits_alone(self) -> None:
        self.assertEqual(plain("RR_IDLE [5]"), "rridle5")
