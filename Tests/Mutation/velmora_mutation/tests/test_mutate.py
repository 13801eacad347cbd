# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the command line."""

import contextlib
import io
import os
import tempfile
import unittest
from pathlib import Path

from velmora_mutation.changes import changes_of
from velmora_mutation.equivalents import MalformedList
from velmora_mutation.mutate import check_equivalents, chosen_changes
from velmora_mutation.options import Options, parse_options
from velmora_mutation.source_tree import SOURCE

LIST = "# Comment.\n\nfile: LogGenerator/Field.cpp\nfrom: x = 0;\nto: x = 1;\nwhy: unused.\n"


class OptionsTest(unittest.TestCase):
    def test_defaults(self) -> None:
        self.assertEqual(
            parse_options([]),
            Options(
                sample=300,
                seed=1,
                jobs=os.cpu_count() or 1,
                directory=SOURCE / "build" / "mutate",
                again=None,
                check=False,
                follow_moves=False,
                places=[],
            ),
        )

    def test_everything_given(self) -> None:
        words = "--sample 0 --seed 4 --jobs 3 --directory /d --again out a.cpp b.h:20"
        self.assertEqual(
            parse_options(words.split()),
            Options(
                0, 4, 3, Path("/d"), Path("out"), check=False, follow_moves=False, places=["a.cpp", "b.h:20"]
            ),
        )

    def test_following_moves_checks_the_list(self) -> None:
        self.assertTrue(parse_options(["--follow-moves"]).check)

    def test_usage_errors(self) -> None:
        for words in (["--sample", "-1"], ["--jobs", "0"], ["--seed", "x"]):
            with self.subTest(words=words), contextlib.redirect_stderr(io.StringIO()):
                with self.assertRaises(SystemExit) as ended:
                    parse_options(words)
                self.assertEqual(ended.exception.code, 2)


class ChosenChangesTest(unittest.TestCase):
    EVERY = [*changes_of("a.cpp", "x = 0;\ny = 0;\n"), *changes_of("b.cpp", "x = 0;\n")]

    def test_all(self) -> None:
        self.assertEqual(chosen_changes(self.EVERY, [], None), self.EVERY)

    def test_of_a_file_and_of_a_line(self) -> None:
        self.assertEqual(chosen_changes(self.EVERY, ["a.cpp"], None), self.EVERY[:2])
        self.assertEqual(chosen_changes(self.EVERY, ["a.cpp:2", "b.cpp"], None), self.EVERY[1:])

    def test_of_an_earlier_report(self) -> None:
        self.assertEqual(chosen_changes(self.EVERY, [], {self.EVERY[2].key}), self.EVERY[2:])
        self.assertEqual(chosen_changes(self.EVERY, ["a.cpp"], {self.EVERY[2].key}), [])


class CheckEquivalentsTest(unittest.TestCase):
    def setUp(self) -> None:
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.source = Path(temporary.name)
        self.list = self.source / "mutations-equivalent"
        self.list.write_text(LIST)

    def write(self, name: str, text: str) -> None:
        path = self.source / name
        path.parent.mkdir(parents=True, exist_ok=True)
        path.write_text(text)

    def check(self, moves: bool = False) -> list[str]:
        """The reasons, where an entry does not fit."""
        return [each.reason for each in check_equivalents(self.source, self.list, moves)]

    def test_a_list_that_fits(self) -> None:
        self.write("LogGenerator/Field.cpp", "x = 0;\n")
        self.assertEqual(self.check(), [])

    def test_an_entry_without_its_file(self) -> None:
        self.assertEqual(self.check(), ["the file does not exist"])
        self.assertEqual(self.check(moves=True), ["the file does not exist"])

    def test_an_entry_without_its_line(self) -> None:
        self.write("LogGenerator/Field.cpp", "x = 2;\n")
        self.assertEqual(self.check(), ["the line does not exist"])

    def test_a_moved_file_is_followed_on_request(self) -> None:
        self.write("LogGenerator/Fields/Field.cpp", "x = 0;\n")
        self.assertEqual(self.check(), ["the file does not exist"])
        self.assertEqual(self.list.read_text(), LIST)
        self.assertEqual(self.check(moves=True), [])
        self.assertEqual(self.list.read_text(), LIST.replace("/Field.cpp", "/Fields/Field.cpp"))

    def test_a_malformed_list(self) -> None:
        self.list.write_text("file: a\n")
        with self.assertRaises(MalformedList):
            self.check()
