# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the list of equivalent changes."""

import unittest

from velmora_mutation.changes import ChangeKey
from velmora_mutation.equivalents import MalformedList, find_outdated, follow_moves, parse_equivalents

LIST = """# A comment.

file: LogGenerator/Field.cpp
from: std::size_t at = 0;
to: std::size_t at = 1;
why: set before it is read,
on two lines.

file: LogGenerator/Base.cpp
from: f();
to:
why: does nothing.
"""
AT = ChangeKey("LogGenerator/Field.cpp", "std::size_t at = 0;", "std::size_t at = 1;")
SOURCE = "void g() {\n    std::size_t  at = 0;\n}\n"


class ParseTest(unittest.TestCase):
    def test_reads_every_entry_in_order(self) -> None:
        self.assertEqual(parse_equivalents(LIST), [AT, ChangeKey("LogGenerator/Base.cpp", "f();", "")])

    def test_an_empty_list_has_no_entries(self) -> None:
        self.assertEqual(parse_equivalents("# Nothing yet.\n"), [])

    def test_an_entry_without_a_reason_is_malformed(self) -> None:
        with self.assertRaisesRegex(MalformedList, "(?s)not the rows file, from, to and why:.file: a.cpp"):
            parse_equivalents("file: a.cpp\nfrom: x\nto: y\n")

    def test_an_entry_that_is_listed_twice_is_malformed(self) -> None:
        with self.assertRaisesRegex(MalformedList, "(?s)listed twice:.file: a.cpp"):
            parse_equivalents("file: a.cpp\nfrom: x\nto: y\nwhy: z\n\n" * 2)


class OutdatedTest(unittest.TestCase):
    def test_an_entry_that_fits_is_not_reported(self) -> None:
        self.assertEqual(find_outdated([AT], {AT.path: SOURCE}), [])

    def test_a_file_that_does_not_exist(self) -> None:
        (found,) = find_outdated([AT], {"LogGenerator/Base.cpp": SOURCE})
        self.assertEqual(
            str(found),
            "LogGenerator/Field.cpp: the file does not exist\n"
            "    - std::size_t at = 0;\n    + std::size_t at = 1;",
        )

    def test_a_line_that_does_not_exist(self) -> None:
        (found,) = find_outdated([AT], {AT.path: "std::size_t at = 2;\n"})
        self.assertEqual((found.key, found.reason, found.moved_to), (AT, "the line does not exist", None))

    def test_a_change_that_is_not_made(self) -> None:
        (found,) = find_outdated([AT._replace(after="std::size_t at = 7;")], {AT.path: SOURCE})
        self.assertEqual(found.reason, "the line is not changed in this way")

    def test_a_file_that_was_moved(self) -> None:
        files = {"LogGenerator/Fields/Field.cpp": SOURCE, "LogGenerator/Fields/OtherField.cpp": SOURCE}
        (found,) = find_outdated([AT], files)
        self.assertEqual(found.moved_to, "LogGenerator/Fields/Field.cpp")
        self.assertIn("; it may be LogGenerator/Fields/Field.cpp now\n", str(found))

    def test_two_candidates_are_none(self) -> None:
        files = {"LogGenerator/Fields/Field.cpp": SOURCE, "LogMessages/Field.cpp": SOURCE}
        (found,) = find_outdated([AT], files)
        self.assertIsNone(found.moved_to)

    def test_a_file_that_was_moved_and_changed_is_no_candidate(self) -> None:
        (found,) = find_outdated([AT], {"LogGenerator/Fields/Field.cpp": "x = 0;\n"})
        self.assertIsNone(found.moved_to)


class FollowMovesTest(unittest.TestCase):
    def test_changes_the_path_of_the_moved_file_and_nothing_else(self) -> None:
        outdated = find_outdated(parse_equivalents(LIST), {"LogGenerator/Fields/Field.cpp": SOURCE})
        moved = LIST.replace("file: LogGenerator/Field.cpp", "file: LogGenerator/Fields/Field.cpp")
        self.assertEqual(follow_moves(LIST, outdated), moved)

    def test_without_candidates_the_list_stays(self) -> None:
        self.assertEqual(follow_moves(LIST, find_outdated(parse_equivalents(LIST), {})), LIST)
