# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of a program under test, with shell commands instead of Velmora's programs."""

import signal
import subprocess
import unittest

from velmora_chaos.checks import Problem
from velmora_chaos.program import Program, parse_resident_kib

STATUS = """Name:	velmora
VmHWM:	   21044 kB
VmRSS:	   20996 kB
Threads:	3
"""


def shell(script: str) -> Program:
    process = subprocess.Popen(["/bin/sh", "-c", script], stdout=subprocess.PIPE, text=True)
    assert process.stdout
    program = Program(process, process.stdout)
    line = program.lines.next(10)
    assert line and line.text == "ready"
    return program


class ResidentTest(unittest.TestCase):
    def test_is_the_resident_size_and_not_the_peak(self) -> None:
        self.assertEqual(parse_resident_kib(STATUS), 20996)

    def test_is_zero_for_a_zombie(self) -> None:
        self.assertEqual(parse_resident_kib("Name:\tsh\nState:\tZ (zombie)\n"), 0)

    def test_is_zero_after_the_program_has_ended(self) -> None:
        program = shell("echo ready; exec sleep 60")
        self.assertGreater(program.resident_kib(), 0)
        program.kill()
        self.assertEqual(program.resident_kib(), 0)


class EndCleanlyTest(unittest.TestCase):
    def test_accepts_status_0(self) -> None:
        program = shell("trap 'exit 0' TERM; echo ready; while :; do sleep 0.01; done")
        program.end_cleanly()
        program.kill()

    def test_reports_another_status(self) -> None:
        program = shell("trap 'exit 3' TERM; echo ready; while :; do sleep 0.01; done")
        with self.assertRaisesRegex(Problem, "^sh ended with 3 on SIGTERM, wanted 0$"):
            program.end_cleanly()
        program.kill()

    def test_reports_the_signal(self) -> None:
        program = shell("echo ready; exec sleep 60")
        with self.assertRaisesRegex(Problem, f"^sh ended with -{int(signal.SIGTERM)} on SIGTERM, wanted 0$"):
            program.end_cleanly()
        program.kill()

    def test_reports_a_program_that_was_not_running(self) -> None:
        program = shell("echo ready; exit 0")
        program.kill()
        with self.assertRaisesRegex(Problem, "^sh has already ended with "):
            program.end_cleanly()
