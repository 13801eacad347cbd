# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the changes of a source."""

import unittest

from velmora_mutation.changes import ChangeKey, changes_of


def lines_after(source: str) -> list[str]:
    """The line of each change, as it becomes."""
    return [change.key.after for change in changes_of("a.cpp", source)]


class TokenChangesTest(unittest.TestCase):
    def test_an_operator_and_the_numbers_beside_it(self) -> None:
        self.assertEqual(
            lines_after("x = a < 7 && b;\n"),
            ["x = a <= 7 && b;", "x = a >= 7 && b;", "x = a < 8 && b;", "x = a < 6 && b;", "x = a < 7 || b;"],
        )

    def test_templates_references_and_pointers_stay(self) -> None:
        self.assertEqual(lines_after("std::vector<int> f(const T& a, char* b, T&& c);\n"), [])

    def test_declared_operators_stay(self) -> None:
        self.assertEqual(lines_after("bool operator < (T a);\n"), [])

    def test_a_negation_goes(self) -> None:
        self.assertEqual(lines_after("if (!good) x = y;\n"), ["if (good) x = y;"])

    def test_truth_is_inverted(self) -> None:
        self.assertEqual(lines_after("x = true;\n"), ["x = false;"])

    def test_comments_texts_characters_and_directives_stay(self) -> None:
        source = "#define A 1 + \\\n    2\n// 1 + 1\n/* 2 < 3\n 4 */ x = \"5 == 6\" y '7';\n#if 8\n"
        self.assertEqual(lines_after(source), [])

    def test_static_assertions_stay(self) -> None:
        self.assertEqual(lines_after("static_assert(a == 4);\nx = 0;\n"), ["x = 1;"])


class StatementChangesTest(unittest.TestCase):
    def test_a_call_goes_with_the_line_before_as_its_context(self) -> None:
        source = "if (a) {\n    list.rows->add(b, f(c));\n}\n"
        self.assertEqual(
            [change.key for change in changes_of("a.cpp", source)],
            [ChangeKey("a.cpp", "if (a) { list.rows->add(b, f(c));", "if (a) { {}")],
        )

    def test_return_continue_and_break_go(self) -> None:
        for word in ("return", "continue", "break"):
            with self.subTest(word=word):
                self.assertEqual(lines_after(f"if (a) {word};\n"), ["if (a) {}"])

    def test_a_value_that_is_returned_stays(self) -> None:
        self.assertEqual(lines_after("{ return a; }\n"), [])

    def test_a_call_whose_result_is_used_stays(self) -> None:
        self.assertEqual(lines_after("{ f(a) = b; }\n"), [])
        self.assertEqual(lines_after("{ auto x = f(a); }\n"), [])

    def test_the_first_words_of_a_file_are_no_statement(self) -> None:
        self.assertEqual(lines_after("f(a);"), [])


class ChangeTest(unittest.TestCase):
    def test_knows_its_line_and_the_changed_file(self) -> None:
        source = "a;\nb = 0;\nc;\n"
        (change,) = changes_of("dir/b.cpp", source)
        self.assertEqual((change.path, change.line, change.changed), ("dir/b.cpp", 2, "a;\nb = 1;\nc;\n"))

    def test_the_key_does_not_depend_on_the_layout(self) -> None:
        keys = [[change.key for change in changes_of("a", text)] for text in ("\nx  =\t0;\n", "x = 0;\n")]
        self.assertEqual(keys[0], keys[1])

    def test_a_source_cut_off_anywhere_is_read(self) -> None:
        source = "if (!a.b->f(1 + 2)) { return; }\nstatic_assert(x);"
        for length in range(len(source) - len("static_assert(x);")):
            with self.subTest(length=length):
                list(changes_of("a.cpp", source[:length]))
