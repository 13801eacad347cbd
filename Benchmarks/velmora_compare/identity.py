# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Holds the output of programs that are compared against each other."""

from velmora_compare import checks
from velmora_compare.programs import (BEFORE, BY_HAND, CONSTRUCT, FINAL, JQ, LINES, MADE_TEXTS, STRUCT, TSHARK_JSON,
                                      Program)
from velmora_compare.recordings import RECORD, Maker
from velmora_compare.running import Runner

SHOWN_PACKETS = 1000  # whose values are compared with the capture tool's


class Identity:
    """Each operation lists what differs. Programs that are not compared are not run."""

    def __init__(self, programs: dict[str, Program], maker: Maker, runner: Runner) -> None:
        self._programs = programs
        self._maker = maker
        self._runner = runner

    def builds(self, recording: str, messages: int) -> list[str]:
        """Both builds write the same bytes."""
        return [f"{name} and {name + BEFORE} differ on {recording}" for name in (FINAL, LINES)
                if not self._same(name, name + BEFORE, recording, messages)]

    def by_hand(self, messages: int) -> list[str]:
        """What is written by hand is what decode writes."""
        return [f"{LINES} and {name} differ on {RECORD}" for name in (BY_HAND, MADE_TEXTS)
                if not self._same(LINES, name, RECORD, messages)]

    def others(self, messages: int) -> list[str]:
        """Other programs' lines have the same values, and the capture tool shows all of them."""
        found: list[str] = []
        if LINES not in self._programs:
            return found
        lines = self._programs[LINES]
        recording = self._maker.make(RECORD, messages)
        expected = self._runner.output(lines.command(recording))
        for name in (STRUCT, CONSTRUCT, JQ):
            if name not in self._programs:
                continue
            wanted = checks.sections_of(expected) if name == JQ else expected
            line = checks.different_line(wanted, self._runner.output(self._programs[name].command(recording)))
            if line is not None:
                found.append(f"{LINES} and {name} differ on {RECORD} in line {line}")
        if tshark := self._programs.get(TSHARK_JSON):
            short = self._maker.make(RECORD, min(messages, SHOWN_PACKETS))
            problem = checks.capture_tool_problem(tshark, lines, short, self._runner)
            if problem:
                found.append(f"{LINES} and {TSHARK_JSON} differ on {RECORD}: {problem}")
        return found

    def _same(self, one: str, other: str, recording: str, messages: int) -> bool:
        if one not in self._programs or other not in self._programs:
            return True
        path = self._maker.make(recording, messages)
        return checks.same_bytes(self._programs[one].command(path), self._programs[other].command(path), self._runner)
