# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the sweep, with a script in place of the program and of the library that makes calls fail."""

import tempfile
import unittest
from collections.abc import Sequence
from concurrent.futures import ThreadPoolExecutor
from pathlib import Path
from typing import ClassVar

from velmora_chaos.failing.case import Case
from velmora_chaos.failing.sweep import Extent, Sweep, Tally
from velmora_chaos.failing.unusable_place import UnusablePlace, copy_read_only, remove_read_only

# Makes three calls. It survives a failure of the first, dies of one of the second, reports one of the third.
PROGRAM = r"""#!/bin/sh
printf '\003\000\000\000\000\000\000\000\001\000\000\000\000\000\000\000' >"$VELMORA_FAIL_COUNT"
set -- $VELMORA_FAIL
case $2 in
    2) kill -SEGV $$ ;;
    3) echo "velmora-log: cannot read" >&2; exit 1 ;;
esac
echo display
"""


class ReadCase(Case):
    kinds: ClassVar[Sequence[str]] = ("read",)


class SweepTest(unittest.TestCase):
    def setUp(self) -> None:
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.build = Path(temporary.name)
        program = self.build / "velmora-log"
        program.write_text(PROGRAM)
        program.chmod(0o700)
        self.runs = self.build / "runs"
        self.runs.mkdir()
        self.sweep = Sweep(self.build, self.runs, Extent(8, all_allocations=False, first_error_only=False))

    def try_case(self, case: Case) -> str:
        with ThreadPoolExecutor(2) as pool:
            return self.sweep.try_case(case, pool)

    def test_every_call_fails_in_every_mode(self) -> None:
        self.assertEqual(self.try_case(ReadCase("decode", [])), "decode: 3 read; 9 runs")
        self.assertEqual(self.sweep.tally.runs, 9)

    def test_a_run_that_dies_is_reported_with_its_failure(self) -> None:
        self.try_case(ReadCase("decode", []))
        first_lines = [problem.split("\n")[0] for problem in self.sweep.tally.problems]
        self.assertEqual(
            first_lines,
            [
                f"decode: read 2 {mode}, Input/output error: ended with -11, wanted 0 or 1"
                for mode in ("once", "three", "for good")
            ],
        )

    def test_a_program_that_fails_without_a_failure_is_reported(self) -> None:
        self.try_case(ReadCase("decode", [], status=1))
        self.assertEqual(len(self.sweep.tally.problems), 1)
        self.assertRegex(self.sweep.tally.problems[0], "^decode: ended with 0 without a failure: ")

    def test_nothing_is_left_in_the_directory(self) -> None:
        self.try_case(ReadCase("decode", []))
        self.assertEqual(list(self.runs.iterdir()), [])

    def test_an_unusable_place_is_checked_for_status_and_text(self) -> None:
        for status, text, problems in ((0, "display", 0), (1, "display", 1), (0, "nothing", 1)):
            with self.subTest(status=status, text=text):
                self.sweep.tally = Tally()
                environment = {"VELMORA_FAIL_COUNT": "@counts"}
                self.sweep.try_place(UnusablePlace("decode", ["velmora-log"], status, [text], environment))
                self.assertEqual((self.sweep.tally.runs, len(self.sweep.tally.problems)), (1, problems))


class TallyTest(unittest.TestCase):
    def test_report_and_status(self) -> None:
        tally = Tally()
        self.assertEqual(tally.status(), 1)  # nothing ran
        tally.add([])
        self.assertEqual((tally.report(12.4), tally.status()), ("1 runs in 12 s, 0 problems", 0))
        tally.add(["x"])
        self.assertEqual((tally.report(12.6), tally.status()), ("2 runs in 13 s, 1 problems", 1))


class ReadOnlyCopyTest(unittest.TestCase):
    def test_cannot_be_written_and_can_be_removed(self) -> None:
        with tempfile.TemporaryDirectory() as directory:
            source, copy = Path(directory, "source"), Path(directory, "copy")
            (source / "folder").mkdir(parents=True)
            (source / "folder" / "file").write_text("x")
            copy_read_only(source, copy / "resources")
            self.assertEqual((copy / "resources").stat().st_mode & 0o777, 0o500)
            self.assertEqual((copy / "resources" / "folder" / "file").stat().st_mode & 0o777, 0o400)
            remove_read_only(copy)
            self.assertFalse(copy.exists())
