# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the three command lines."""

import contextlib
import io
import unittest
from collections.abc import Callable, Sequence
from pathlib import Path

from velmora_chaos import chaos, failures, options, soak
from velmora_chaos.failing.sweep import Extent


def usage_error(parse: Callable[[Sequence[str]], object], arguments: Sequence[str]) -> str:
    """The message for a command line that exits with status 2."""
    errors = io.StringIO()
    try:
        with contextlib.redirect_stderr(errors):
            parse(arguments)
    except SystemExit as ended:
        assert ended.code == 2
        return errors.getvalue()
    raise AssertionError(f"accepted {arguments}")


class ChaosOptionsTest(unittest.TestCase):
    def test_defaults(self) -> None:
        self.assertEqual(
            options.parse_options(["/build"]),
            options.Options(Path("/build"), rounds=5, lanes=4, seconds=6, seed=1, only="", strict=False),
        )

    def test_everything_given(self) -> None:
        words = "/b --rounds 200 --lanes 2 --seconds 30 --seed 7 --only flood --strict".split()
        self.assertEqual(
            options.parse_options(words),
            options.Options(Path("/b"), rounds=200, lanes=2, seconds=30, seed=7, only="flood", strict=True),
        )

    def test_the_build_directory_becomes_absolute(self) -> None:
        self.assertEqual(options.parse_options(["build"]).build, Path.cwd() / "build")

    def test_usage_errors(self) -> None:
        self.assertIn("BUILD_DIRECTORY", usage_error(options.parse_options, []))
        self.assertIn("0 is not positive", usage_error(options.parse_options, ["/b", "--rounds", "0"]))


class ChosenExperimentsTest(unittest.TestCase):
    def test_all_without_a_word(self) -> None:
        self.assertEqual(chaos.chosen(""), list(chaos.EXPERIMENTS.values()))

    def test_those_whose_name_contains_the_word(self) -> None:
        both = [chaos.EXPERIMENTS["service_restarts"], chaos.EXPERIMENTS["application_restarts"]]
        self.assertEqual(chaos.chosen("restarts"), both)

    def test_no_experiment_is_a_usage_error(self) -> None:
        errors = io.StringIO()
        with contextlib.redirect_stderr(errors):
            self.assertEqual(chaos.main(["/b", "--only", "storm"]), 2)
        self.assertIn("no experiment named storm, wanted one of service_restarts, ", errors.getvalue())


class FailuresOptionsTest(unittest.TestCase):
    def test_defaults(self) -> None:
        parsed = failures.parse_options(["/b"])
        self.assertEqual(parsed.extent, Extent(sample=24, all_allocations=False, first_error_only=False))
        self.assertGreaterEqual(parsed.jobs, 2)

    def test_quick_takes_a_small_sample_and_one_error(self) -> None:
        parsed = failures.parse_options(["/b", "--quick", "--sample", "400"])
        self.assertEqual(parsed.extent, Extent(sample=8, all_allocations=False, first_error_only=True))

    def test_a_sample_and_all(self) -> None:
        self.assertEqual(failures.parse_options(["/b", "--sample", "400"]).extent.sample, 400)
        self.assertTrue(failures.parse_options(["/b", "--all"]).extent.all_allocations)


class SoakOptionsTest(unittest.TestCase):
    def test_defaults(self) -> None:
        parsed = soak.parse_options(["/b"])
        self.assertEqual(parsed.parts, ["decode", "live"])
        self.assertEqual(
            (parsed.drive.hours, parsed.drive.scenario, parsed.drive.live_seconds), (24, "gsm", 60)
        )

    def test_one_part(self) -> None:
        parsed = soak.parse_options(["/b", "--only", "live", "--hours", "2", "--live-seconds", "7.5"])
        self.assertEqual(parsed.parts, ["live"])
        self.assertEqual((parsed.drive.hours, parsed.drive.live_seconds), (2, 7.5))

    def test_an_unknown_part_is_a_usage_error(self) -> None:
        self.assertIn("invalid choice: 'dead'", usage_error(soak.parse_options, ["/b", "--only", "dead"]))
