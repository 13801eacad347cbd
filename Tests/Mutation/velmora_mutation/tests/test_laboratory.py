# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tries changes of a small project that is built like Velmora."""

import subprocess
import tempfile
import unittest
from pathlib import Path
from typing import ClassVar

from velmora_mutation.changes import changes_of
from velmora_mutation.source_tree import decoder_files
from velmora_mutation.tally import Outcome
from velmora_mutation.trial import Laboratory
from velmora_mutation.workspace import Workspace

PROJECT = {
    "CMakeLists.txt": """cmake_minimum_required(VERSION 3.25)
project(Small LANGUAGES CXX)
set(CMAKE_EXPORT_COMPILE_COMMANDS ON)
set(CMAKE_RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests)
include_directories(${PROJECT_SOURCE_DIR})
add_library(decoders STATIC LogGenerator/Fields/Scale.cpp LogGenerator/LTE/LTELogGenerator.cpp)
foreach(name LTE/LTETest FieldsTest)
    string(REGEX REPLACE ".*/" "" program ${name})
    add_executable(${program} Tests/LogGenerator/${name}.cpp)
    target_link_libraries(${program} decoders)
endforeach()
add_executable(OtherTest Tests/Platform/OtherTest.cpp)
""",
    "LogMessages/Size.h": """#pragma once
inline int sizeOf(int count) {
    return 4 + count;
}
inline int unusedSize() {
    return 9;
}
""",
    "LogGenerator/Fields/Scale.h": "#pragma once\nint scaled(int value);\n",
    "LogGenerator/Fields/Scale.cpp": """#include "LogGenerator/Fields/Scale.h"
static const int factors[2]{3, 5};
int scaled(int value) {
    return factors[0] * value;
}
""",
    "LogGenerator/LTE/LTELogGenerator.h": "#pragma once\nint level(int count);\n",
    "LogGenerator/LTE/LTELogGenerator.cpp": """#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/Fields/Scale.h"
#include "LogMessages/Size.h"
int level(int count) {
    return scaled(sizeOf(count)) - 2;
}
""",
    "Tests/LogGenerator/LTE/LTETest.cpp": """#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogMessages/Size.h"
int main() { return level(6) == 28 ? 0 : 1; }
""",
    "Tests/LogGenerator/FieldsTest.cpp": """#include "LogGenerator/Fields/Scale.h"
#include "LogMessages/Size.h"
int main() { return scaled(0) == 0 ? 0 : 1; }
""",
    "Tests/Platform/OtherTest.cpp": "int main() { return 1; }\n",
}


class LaboratoryTest(unittest.TestCase):
    laboratory: ClassVar[Laboratory]
    source: ClassVar[Path]

    @classmethod
    def setUpClass(cls) -> None:
        temporary = tempfile.TemporaryDirectory()
        cls.addClassCleanup(temporary.cleanup)
        cls.source = Path(temporary.name, "source")
        for name, text in PROJECT.items():
            path = cls.source / name
            path.parent.mkdir(parents=True, exist_ok=True)
            path.write_text(text)
        subprocess.run(["git", "init", "--quiet", cls.source], check=True)
        cls.laboratory = Laboratory(Workspace(cls.source, Path(temporary.name, "work")))

    def outcome(self, path: str, after: str) -> Outcome:
        """What becomes of the change that makes a line that one."""
        files = decoder_files(self.source)
        (change,) = [each for each in changes_of(path, files[path]) if each.key.after == after]
        return self.laboratory.try_change(change, 0)

    def test_the_programs_are_those_of_the_decoders_tests(self) -> None:
        self.assertEqual(set(self.laboratory.graph.links), {"tests/LTETest", "tests/FieldsTest"})
        self.assertEqual(
            self.laboratory.graph.programs_for("LogGenerator/LTE/LTELogGenerator.cpp"),
            ["tests/LTETest", "tests/FieldsTest"],
        )

    def test_a_change_of_a_technology_is_noticed(self) -> None:
        path = "LogGenerator/LTE/LTELogGenerator.cpp"
        self.assertEqual(self.outcome(path, "return scaled(sizeOf(count)) + 2;"), Outcome.NOTICED)

    def test_a_change_of_what_is_shared_is_noticed_by_a_technology(self) -> None:
        path = "LogGenerator/Fields/Scale.cpp"
        self.assertEqual(self.outcome(path, "static const int factors[2]{4, 5};"), Outcome.NOTICED)

    def test_a_change_of_an_inline_function_reaches_the_libraries(self) -> None:
        self.assertEqual(self.outcome("LogMessages/Size.h", "return 5 + count;"), Outcome.NOTICED)

    def test_a_change_that_no_test_notices_survives_every_program(self) -> None:
        self.assertEqual(self.outcome("LogMessages/Size.h", "return 10;"), Outcome.SURVIVED)
        path = "LogGenerator/Fields/Scale.cpp"
        self.assertEqual(self.outcome(path, "static const int factors[2]{3, 6};"), Outcome.SURVIVED)

    def test_a_change_that_does_not_compile(self) -> None:
        path = "LogGenerator/Fields/Scale.cpp"
        self.assertEqual(self.outcome(path, "static const int factors[1]{3, 5};"), Outcome.NOT_COMPILED)

    def test_the_source_stays_as_it_is(self) -> None:
        self.outcome("LogMessages/Size.h", "return 5 + count;")
        for name, text in PROJECT.items():
            self.assertEqual((self.source / name).read_text(), text)
