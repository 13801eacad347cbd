# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Whether outputs are the same."""

import json
import unittest
from pathlib import Path

from velmora_compare import checks
from velmora_compare.running import Runner

RUNNER = Runner(0, Path("."))


def line(**labels: str) -> dict[str, object]:
    return {"code": 45439, "sections": {checks.SECTION: labels}}


def packet(**fields: str) -> dict[str, object]:
    tree = {checks.FIELD + name: value for name, value in fields.items()}
    return {"_source": {"layers": {"velmora": {"velmora.code": "0x00b17f", "velmora.sections_tree": tree}}}}


class ChecksTest(unittest.TestCase):
    def test_lines_with_the_same_values_are_the_same_in_any_form(self) -> None:
        self.assertIsNone(checks.different_line(b'{"a":"1"}\n', b'{ "a": "1" }\n'))
        self.assertEqual(checks.different_line(b'{"a":"1"}\n{"a":"2"}\n', b'{"a":"1"}\n{"a":"3"}\n'), 2)

    def test_a_missing_or_additional_line_differs(self) -> None:
        self.assertEqual(checks.different_line(b'{}\n{}\n', b'{}\n'), 2)
        self.assertEqual(checks.different_line(b'', b'{}\n'), 1)

    def test_bytes_are_compared_as_they_are(self) -> None:
        self.assertTrue(checks.same_bytes(["echo", "a"], ["printf", "a\\n"], RUNNER))
        self.assertFalse(checks.same_bytes(["echo", "a"], ["printf", "a"], RUNNER))
        with self.assertRaisesRegex(RuntimeError, "false: exit status 1"):
            checks.same_bytes(["false"], ["false"], RUNNER)

    def test_sections_alone(self) -> None:
        self.assertEqual(checks.sections_of(json.dumps(line(Version="1")).encode()),
                         b'{"Serving Cell Measurements": {"Version": "1"}}')

    def test_the_capture_tool_shows_numbers_without_units(self) -> None:
        shown = packet(measured_rsrp="-97.5", num_of_consecutive_drx_cycles_of_s_0="3", p_max="23", updated="1")
        labels = {"Measured RSRP": "-97.50 dBm", "Num of Consecutive DRX Cycles of S < 0": "3", "P_Max": "23 dBm",
                  "Updated": "True"}
        self.assertIsNone(checks.missing_field(line(**labels), shown))

    def test_another_or_no_number_is_reported_by_its_label(self) -> None:
        self.assertEqual(checks.missing_field(line(P_Max="23 dBm"), packet(p_max="24")), "P_Max")
        self.assertEqual(checks.missing_field(line(P_Max="23 dBm"), packet()), "P_Max")

    def test_what_is_not_present_is_not_shown(self) -> None:
        self.assertIsNone(checks.missing_field(line(P_Max="Not Present"), packet()))
        self.assertEqual(checks.missing_field(line(P_Max="Not Present"), packet(p_max="34")), "P_Max")
