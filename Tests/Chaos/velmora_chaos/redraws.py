# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Redraws of the application's screen, as tests/screen-probe prints them."""

import time
from collections.abc import Sequence
from dataclasses import dataclass

from velmora_chaos.checks import Problem, expect
from velmora_chaos.program import Program

REDRAW_S = 2
SLACK_S = 1.0  # what a busy machine adds
HISTORY = 5  # displays that the application keeps; its memory grows until there are so many


@dataclass(frozen=True)
class Redraw:
    """The monotonic time, the longest delay of the event loop since the redraw before, the memory."""

    when_s: float
    late_ms: float
    resident_kib: int


def parse_redraw(line: str) -> Redraw | None:
    """The redraw that a line of the probe reports; None for any other line."""
    words = line.split()
    if len(words) != 4 or words[0] != "redraw":
        return None
    return Redraw(float(words[1]), float(words[2]), int(words[3]))


def redraws(screen: Program) -> list[Redraw]:
    """All redraws so far."""
    parsed = (parse_redraw(line.text) for line in screen.lines.all())
    return [redraw for redraw in parsed if redraw]


def next_redraw(screen: Program, since_s: float = 0, limit_s: float = 30) -> float:
    """Waits for the next redraw at or after that time and returns its time; earlier ones are skipped."""
    end = time.monotonic() + limit_s
    while True:
        line = screen.lines.next(end - time.monotonic())
        if line is None:
            raise Problem(f"no redraw within {limit_s:g} s")
        redraw = parse_redraw(line.text)
        if redraw and redraw.when_s >= since_s:
            return redraw.when_s


def longest_gap_s(seen: Sequence[Redraw], since_s: float) -> float:
    """The longest time between two consecutive redraws from that time on."""
    times = [redraw.when_s for redraw in seen if redraw.when_s >= since_s]
    expect(len(times) >= 2, f"{len(times)} redraws, wanted at least 2")
    return max(later - earlier for earlier, later in zip(times, times[1:]))
