# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Which programs there are to compare."""

import tempfile
import unittest
from pathlib import Path

from velmora_compare.programs import every


class ProgramsTest(unittest.TestCase):
    def test_what_is_not_built_is_missing(self) -> None:
        with tempfile.TemporaryDirectory() as build:
            programs = every(Path(build), None, Path("Benchmarks"))
            self.assertEqual(programs["lines"].missing, f"{build}/velmora-log does not exist")
            self.assertEqual(programs["by-hand"].missing, f"{build}/benchmarks/measurement-lines does not exist")
            Path(build, "velmora-log").touch()
            self.assertEqual(every(Path(build), None, Path("Benchmarks"))["lines"].missing, "")

    def test_each_is_compared_with_another(self) -> None:
        programs = every(Path("build"), Path("before"), Path("Benchmarks"))
        for program in programs.values():
            self.assertTrue(program.against in programs or program.name == "copy", program.name)

    def test_another_build_is_compared_with_this_one(self) -> None:
        programs = every(Path("build"), Path("before"), Path("Benchmarks"))
        self.assertEqual(programs["lines-before"].against, "lines")
        self.assertEqual(programs["lines-before"].command(Path("r"))[0], "before/velmora-log")
        self.assertNotIn("lines-before", every(Path("build"), None, Path("Benchmarks")))

    def test_the_capture_tool_without_dissector_loads_none(self) -> None:
        programs = every(Path("build"), None, Path("Benchmarks"))
        self.assertIn("lua_script:build/velmora.lua", programs["tshark-json"].command(Path("r")))
        self.assertEqual(programs["tshark-bytes"].command(Path("r")), ["tshark", "-T", "json", "-r", "r"])
