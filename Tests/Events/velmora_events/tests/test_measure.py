# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
import contextlib
import io
import stat
import tempfile
import unittest
from pathlib import Path

from velmora_events.measure import main, numbers

# A make-drive whose truth is one handover; the program's arguments are SCENARIO SEED LENGTH FILE --truth FILE.
MAKE_DRIVE = """#!/bin/sh
touch "$4"
echo '{"time":"2026-01-05T08:00:05Z","kind":"handover"}' > "$6"
"""
EVENTS = """#!/bin/sh
echo '{"time":"2026-01-05T08:00:%sZ","kind":"handover","text":"","fields":{}}'
"""


class MeasureTest(unittest.TestCase):
    def setUp(self) -> None:
        directory = tempfile.TemporaryDirectory()
        self.addCleanup(directory.cleanup)
        self.build = Path(directory.name)
        (self.build / "tests").mkdir()
        self.program("tests/make-drive", MAKE_DRIVE)

    def program(self, name: str, text: str) -> None:
        path = self.build / name
        path.write_text(text)
        path.chmod(path.stat().st_mode | stat.S_IXUSR)

    def run_main(self, *arguments: str, scenario: str = "utran") -> tuple[int, str]:
        output = io.StringIO()
        with contextlib.redirect_stdout(output), contextlib.redirect_stderr(output):
            status = main([str(self.build), "--scenario", scenario, "--seeds", "1-3", *arguments])
        return status, output.getvalue()

    def test_all_drives_are_counted(self) -> None:
        self.program("velmora-log", EVENTS % "05")
        status, output = self.run_main()
        self.assertEqual(status, 0)
        self.assertRegex(output, r"handover +derived +utran +3 +3 +1\.0000 +1\.0000")

    def test_the_round_of_incidents_is_counted_too(self) -> None:
        self.program("velmora-log", EVENTS % "05")
        status, output = self.run_main(scenario="lte")
        self.assertEqual(status, 0)
        self.assertRegex(output, r"handover +derived +lte +6 +6 +1\.0000 +1\.0000")

    def test_a_difference_fails_and_is_shown(self) -> None:
        self.program("velmora-log", EVENTS % "09")
        status, output = self.run_main("--differences", "1")
        self.assertEqual(status, 1)
        self.assertIn("missed handover utran seed 1 at 5.000 s", output)
        self.assertIn("wrong handover utran seed 1 at 9.000 s", output)
        self.assertNotIn("seed 2", output)
        self.assertIn("short: handover of utran", output)

    def test_a_program_that_fails_is_an_error(self) -> None:
        self.program("velmora-log", "#!/bin/sh\necho no such command >&2\nexit 2\n")
        status, output = self.run_main()
        self.assertEqual(status, 2)
        self.assertIn("utran seed 1: velmora-log ended with 2: no such command", output)

    def test_ranges(self) -> None:
        self.assertEqual(numbers("2-4"), [2, 3, 4])
        self.assertEqual(numbers("7"), [7])
