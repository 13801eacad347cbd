# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Counts the instructions of a process and its children, in user mode.

By the processor's counter where there is one, otherwise by valgrind's callgrind, which takes fifty times as long.
"""

import re
import shutil
import subprocess
import tempfile
from collections.abc import Iterable
from pathlib import Path

from velmora_compare.running import Runner

EVENT = "instructions:u"


def from_perf(text: str) -> int | None:
    """The count in what `perf stat -x ,` writes; none where the processor does not count."""
    for line in text.splitlines():
        fields = line.split(",")
        if len(fields) > 2 and fields[2].startswith("instructions") and fields[0].isdigit():
            return int(fields[0])
    return None


def from_valgrind(logs: Iterable[str]) -> int | None:
    """The sum of the processes' counts, a log each; none where no log has one."""
    counts = [re.search(r"I\s+refs:\s+([\d,]+)", log) for log in logs]
    found = [int(count.group(1).replace(",", "")) for count in counts if count]
    return sum(found) if found else None


class Perf:
    """The processor's counter, by `perf stat`."""

    name = "perf stat"
    is_slow = False

    @staticmethod
    def is_available() -> bool:
        return shutil.which("perf") is not None and Perf._count(["true"], None) is not None

    @staticmethod
    def count(command: list[str], runner: Runner) -> int | None:
        return Perf._count(runner.pinned(command), runner)

    @staticmethod
    def _count(command: list[str], runner: Runner | None) -> int | None:
        with tempfile.TemporaryDirectory() as home:
            figures = Path(home, "figures")
            subprocess.run(["perf", "stat", "-x", ",", "-e", EVENT, "-o", figures, "--", *command],
                           stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
                           env=runner.environment(home) if runner else None, check=False)
            return from_perf(figures.read_text(encoding="utf-8")) if figures.exists() else None


class Callgrind:
    """The cheapest of valgrind's tools that count."""

    name = "callgrind"
    is_slow = True

    @staticmethod
    def is_available() -> bool:
        return shutil.which("valgrind") is not None

    @staticmethod
    def count(command: list[str], runner: Runner) -> int | None:
        with tempfile.TemporaryDirectory() as home:
            valgrind = ["valgrind", "--tool=callgrind", "--callgrind-out-file=/dev/null", "--trace-children=yes",
                        f"--log-file={home}/log.%p"]
            subprocess.run(runner.pinned([*valgrind, *command]), stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL,
                           stderr=subprocess.DEVNULL, env=runner.environment(home), check=False)
            return from_valgrind(log.read_text(errors="replace") for log in Path(home).glob("log.*"))


Counter = Perf | Callgrind


def counter() -> Counter | None:
    """The cheapest that works on this machine."""
    available: list[Counter] = [Perf(), Callgrind()]
    return next((each for each in available if each.is_available()), None)
