# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What the checks of positions have in common."""

from __future__ import annotations

import csv
import io
import math
import os
import shutil
import subprocess
import sys
from functools import reduce
from pathlib import Path

SKIPPED = 77
# The ring road of the synthetic drives, as they put it on the map.
LENGTH, WIDTH = 1800.0, 1100.0
METRES_IN_DEGREE = 111_320.0
CENTRE = 0.005

problems: list[str] = []


def expect(holds: bool, problem: str) -> None:
    if not holds:
        problems.append(problem)


def run(*command: str | Path, status: int = 0) -> str:
    """The standard output of a program, which has to end with that status."""
    ended = subprocess.run([str(word) for word in command], capture_output=True, text=True, check=False)
    if ended.returncode != status:
        raise SystemExit(f"{' '.join(map(str, command))}: status {ended.returncode}, wanted {status}\n{ended.stderr}")
    return ended.stdout


def need(*programs: str) -> None:
    """Skips the check where one of them is not installed."""
    os.environ["PATH"] += ":/usr/sbin"
    missing = [program for program in programs if not shutil.which(program)]
    if missing:
        print(f"skipped: {', '.join(missing)} not installed")
        sys.exit(SKIPPED)


def finish() -> None:
    for problem in problems[:20]:
        print(problem)
    print(f"{len(problems)} problems")
    sys.exit(1 if problems else 0)


def samples(velmora_log: Path, recording: Path, *options: str) -> list[dict[str, str]]:
    text = run(velmora_log, "decode", "--samples", "--positions", "--format", "csv", *options, recording)
    return list(csv.DictReader(io.StringIO(text)))


def distance_from_road(latitude: float, longitude: float) -> float:
    """In metres, by trying the ring's points at ever smaller steps."""
    east, north = longitude * METRES_IN_DEGREE, (latitude - CENTRE) * METRES_IN_DEGREE

    def distance(angle: float) -> float:
        return math.hypot(east - LENGTH * math.cos(angle), north - WIDTH * math.sin(angle))

    best, step = math.atan2(north / WIDTH, east / LENGTH), 0.01
    while step > 1e-8:
        best = min((best - step, best, best + step), key=distance)
        step /= 1.5
    return distance(best)


def sentence(content: str) -> str:
    return f"${content}*{reduce(lambda total, each: total ^ each, content.encode(), 0):02X}\r\n"
