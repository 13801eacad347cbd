# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of what is read from Ninja and the compilation database."""

import tempfile
import unittest
from pathlib import Path

from velmora_mutation.build_graph import (
    BuildGraph,
    Compilation,
    parse_compilations,
    parse_link,
    parse_programs,
    parse_users,
    tests_decoders,
)

FIELD, LTE_CELL, GSM = "lib/Field.cpp.o", "lib/LTE/Cell.cpp.o", "lib/GSM/GSM.cpp.o"
BASE_TEST, LTE_TEST, C2K_TEST, PORT_TEST = "base.o", "lte.o", "c2k.o", "port.o"
SOURCES = {
    FIELD: "LogGenerator/Fields/Field.cpp",
    LTE_CELL: "LogGenerator/LTE/Cell.cpp",
    GSM: "LogGenerator/GSM/GSM.cpp",
    BASE_TEST: "Tests/LogGenerator/BaseTest.cpp",
    LTE_TEST: "Tests/LogGenerator/LTE/CellTest.cpp",
    C2K_TEST: "Tests/LogGenerator/C2K/StatusTest.cpp",
    PORT_TEST: "Tests/Platform/PortTest.cpp",
}
COMPILATIONS = {target: Compilation([], source) for target, source in SOURCES.items()}


def link(*objects: str) -> list[str]:
    return ["g++", *objects, "-o", "x", "lib.a"]


GRAPH = BuildGraph(
    technologies=frozenset({"LTE", "C2K", "GSM"}),
    compilations=COMPILATIONS,
    users={"LogGenerator/Base.h": ["o"] * 21, "LogGenerator/LTE/Records.h": ["o"] * 20, "a.cpp": ["o"] * 30},
    links={
        "tests/test-c2k": link(C2K_TEST),
        "tests/test-lte": link(LTE_TEST),
        "tests/test-shared": link(BASE_TEST),
        "tests/test-sections": link(LTE_TEST, C2K_TEST),
    },
)


class ProgramsTest(unittest.TestCase):
    SHARED = ["tests/test-sections", "tests/test-shared"]

    def test_a_technology_is_tried_with_its_own_and_the_shared_programs(self) -> None:
        self.assertEqual(GRAPH.programs_for(SOURCES[LTE_CELL]), ["tests/test-lte", *self.SHARED])

    def test_a_technology_without_a_program_is_tried_with_all(self) -> None:
        self.assertEqual(GRAPH.programs_for(SOURCES[GSM]), [*self.SHARED, "tests/test-c2k", "tests/test-lte"])

    def test_what_is_shared_is_tried_with_all(self) -> None:
        wanted = [*self.SHARED, "tests/test-c2k", "tests/test-lte"]
        self.assertEqual(GRAPH.programs_for(SOURCES[FIELD]), wanted)
        self.assertEqual(GRAPH.programs_for("LogMessages/Record.h"), wanted)

    def test_a_program_of_several_technologies_is_shared(self) -> None:
        self.assertIsNone(GRAPH.program_technology("tests/test-sections"))
        self.assertEqual(GRAPH.program_technology("tests/test-lte"), "LTE")

    def test_sources_of_a_technology_are_first_tried_with_its_program(self) -> None:
        self.assertTrue(GRAPH.is_tested_by(SOURCES[LTE_CELL], "tests/test-lte"))
        self.assertFalse(GRAPH.is_tested_by(SOURCES[LTE_CELL], "tests/test-c2k"))
        self.assertTrue(GRAPH.is_tested_by(SOURCES[FIELD], "tests/test-c2k"))


class WideTest(unittest.TestCase):
    def test_a_header_with_more_than_twenty_users(self) -> None:
        self.assertTrue(GRAPH.is_wide("LogGenerator/Base.h"))
        self.assertFalse(GRAPH.is_wide("LogGenerator/LTE/Records.h"))
        self.assertFalse(GRAPH.is_wide("LogGenerator/Unused.h"))

    def test_a_source_is_not_wide(self) -> None:
        self.assertFalse(GRAPH.is_wide("a.cpp"))


class ParseTest(unittest.TestCase):
    def test_compilations_of_the_tree_alone(self) -> None:
        entries = [
            {"command": "g++ -DA='x y' -o lib/a.o -c /t/LogGenerator/a.cpp", "file": "/t/LogGenerator/a.cpp"},
            {"command": "g++ -o moc.o -c /b/moc.cpp", "file": "/b/moc.cpp"},
        ]
        found = parse_compilations(entries, Path("/t"))
        self.assertEqual(list(found), ["lib/a.o"])
        self.assertEqual(found["lib/a.o"].source, "LogGenerator/a.cpp")
        self.assertEqual(found["lib/a.o"].command[1], "-DA=x y")

    def test_users_of_the_tree_s_files(self) -> None:
        lines = [
            "a.o: #deps 3, deps mtime 1 (VALID)",
            "    /t/LogGenerator/a.cpp",
            "    /t/LogGenerator/Base.h",
            "    /usr/include/string",
            "",
            "b.o: #deps 1, deps mtime 1 (VALID)",
            "    /t/LogGenerator/Base.h",
            "",
            "unknown.o: #deps 1, deps mtime 1 (VALID)",
            "    /t/LogGenerator/Base.h",
        ]
        self.assertEqual(
            parse_users(lines, Path("/t"), ["a.o", "b.o"]),
            {"LogGenerator/a.cpp": ["a.o"], "LogGenerator/Base.h": ["a.o", "b.o"]},
        )

    def test_users_through_a_linked_include_folder(self) -> None:
        with tempfile.TemporaryDirectory() as directory:
            tree = Path(directory).resolve() / "tree"
            (tree / "LogGenerator").mkdir(parents=True)
            (tree / "LogGenerator" / "Base.h").touch()
            (tree.parent / "include").symlink_to(tree)
            lines = ["a.o: #deps 1", f"    {tree.parent}/include/LogGenerator/Base.h"]
            self.assertEqual(parse_users(lines, tree, ["a.o"]), {"LogGenerator/Base.h": ["a.o"]})

    def test_programs_are_the_executables_of_the_tests(self) -> None:
        lines = [
            "velmora-log: CXX_EXECUTABLE_LINKER__velmora-log_",
            "tests/test-lte: CXX_EXECUTABLE_LINKER__test-lte_",
            "tests/libfailing-calls.so: CXX_MODULE_LIBRARY_LINKER__failing-calls_",
            "test-lte: phony",
        ]
        self.assertEqual(parse_programs(lines), ["tests/test-lte"])

    def test_the_link_command_among_the_steps(self) -> None:
        line = ": && /usr/bin/g++ a.o -o tests/test-lte lib.a && cd /b && cmake -E touch done"
        self.assertEqual(
            parse_link(line, "tests/test-lte"), ["/usr/bin/g++", "a.o", "-o", "tests/test-lte", "lib.a"]
        )

    def test_a_step_that_links_something_else(self) -> None:
        with self.assertRaisesRegex(ValueError, "^no command that links tests/test-c2k: "):
            parse_link(": && g++ a.o -o tests/test-lte && :", "tests/test-c2k")

    def test_programs_of_other_folders_do_not_test_decoders(self) -> None:
        self.assertTrue(tests_decoders(link(BASE_TEST), COMPILATIONS))
        self.assertFalse(tests_decoders(link(PORT_TEST), COMPILATIONS))
