# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the link command, the common header and the time-out of a trial."""

import tempfile
import time
import unittest
from pathlib import Path

from velmora_mutation.common_header import common_headers, header_text, includes_decoder
from velmora_mutation.test_runner import FailsUnchanged, limit_for, measure_limits, passes
from velmora_mutation.trial import link_with


FIELD = {"lib/Field.o": Path("/l/Field.o")}


class LinkWithTest(unittest.TestCase):
    LINK = ["g++", "-O0", "test.o", "other.o", "-o", "tests/t", "lib.a"]

    def test_an_object_of_a_library_comes_before_all_others(self) -> None:
        self.assertEqual(
            link_with(self.LINK, FIELD, FIELD, Path("/l/t")),
            ["g++", "-O0", "/l/Field.o", "test.o", "other.o", "-o", "/l/t", "lib.a"],
        )

    def test_an_object_that_is_linked_by_name_is_replaced(self) -> None:
        self.assertEqual(
            link_with(self.LINK, {"other.o": Path("/l/other.o")}, {}, Path("/l/t")),
            ["g++", "-O0", "test.o", "/l/other.o", "-o", "/l/t", "lib.a"],
        )

    def test_a_decoder_that_is_linked_by_name_comes_once(self) -> None:
        link = ["g++", "lib/Field.o", "test.o", "-o", "tests/t"]
        self.assertEqual(
            link_with(link, FIELD, FIELD, Path("/l/t")), ["g++", "/l/Field.o", "test.o", "-o", "/l/t"]
        )

    def test_an_object_of_another_program_is_left_out(self) -> None:
        made = {"another-test.o": Path("/l/another-test.o")}
        self.assertEqual(
            link_with(self.LINK, made, {}, Path("/l/t")),
            ["g++", "-O0", "test.o", "other.o", "-o", "/l/t", "lib.a"],
        )


class CommonHeaderTest(unittest.TestCase):
    def test_headers_of_other_folders_that_most_decoders_use(self) -> None:
        users = {
            "PropertyLists/Value.h": ["a", "b", "test"],
            "Platform/Clock.h": ["a"],
            "LogGenerator/Base.h": ["a", "b", "c"],
            "LogMessages/Record.h": ["a", "b", "c"],
            "Tests/Support/Fake.h": ["test", "test2", "test3"],
        }
        self.assertEqual(common_headers(users, ["a", "b", "c"]), ["PropertyLists/Value.h"])

    def test_text(self) -> None:
        self.assertIn("#include <algorithm>\n", header_text([]))
        self.assertTrue(header_text(["Platform/Value.h"]).endswith('#include "Platform/Value.h"\n'))

    def test_a_header_that_takes_in_a_decoder_is_detected(self) -> None:
        self.assertTrue(
            includes_decoder("common.h.gch: /t/Model/A.h \\\n /t/LogMessages/Record.h\n", Path("/t"))
        )
        self.assertFalse(includes_decoder("common.h.gch: /t/Platform/LogGenerator.h\n", Path("/t")))


class TestRunnerTest(unittest.TestCase):
    def setUp(self) -> None:
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.directory = Path(temporary.name)

    def program(self, script: str) -> Path:
        path = self.directory / "test-x"
        path.write_text(f"#!/bin/sh\n{script}\n")
        path.chmod(0o700)
        return path

    def test_status_0_passes(self) -> None:
        self.assertTrue(passes(self.program('[ "$TMPDIR" = "$PWD" ]'), self.directory, 10))

    def test_another_status_and_a_crash_do_not(self) -> None:
        self.assertFalse(passes(self.program("exit 1"), self.directory, 10))
        self.assertFalse(passes(self.program("kill -SEGV $$"), self.directory, 10))

    def test_a_program_that_hangs_is_killed_with_what_it_started(self) -> None:
        start = time.monotonic()
        self.assertFalse(passes(self.program("sleep 60 & sleep 60"), self.directory, 0.1))
        self.assertLess(time.monotonic() - start, 30)

    def test_a_program_that_fails_unchanged_ends_the_run(self) -> None:
        self.program("exit 1")
        with self.assertRaisesRegex(FailsUnchanged, "^test-x fails without a change$"):
            measure_limits(["test-x"], self.directory, self.directory)

    def test_the_limit_is_ten_times_the_duration_and_ten_seconds(self) -> None:
        self.assertEqual(limit_for(1.5), 25)
        self.program("exit 0")
        self.assertGreater(measure_limits(["test-x"], self.directory, self.directory)["test-x"], 10)
