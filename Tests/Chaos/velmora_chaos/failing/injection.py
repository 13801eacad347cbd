# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Runs a program under the preloaded library that makes chosen calls fail."""

import errno
import os
import struct
import subprocess
from collections.abc import Iterator, Mapping, Sequence
from dataclasses import dataclass
from pathlib import Path

from velmora_chaos.checks import Problem

LIMIT_S = 60
COUNTS = struct.Struct("<QQ")  # calls of the kind, failed ones
MODES: Mapping[str, int] = {
    "once": 1,
    "three": 3,
    "for good": 0,
}  # how many calls fail; 0 for all that follow
ERRORS: Mapping[str, Sequence[int]] = {
    "memory": [errno.ENOMEM],
    "read": [errno.EIO],
    "write": [errno.ENOSPC, errno.EIO],
    "sync": [errno.EIO],
    "rename": [errno.EACCES],
    "open": [errno.EACCES, errno.EMFILE],
}


@dataclass(frozen=True)
class Injection:
    """The calls that fail: of one kind, from the `at`-th on, counted from 1; `at` 0 for none."""

    kind: str
    at: int
    mode: str
    error: int

    def __str__(self) -> str:
        return f"{self.kind} {self.at} {self.mode}, {os.strerror(self.error)}"

    def setting(self) -> str:
        """The value of VELMORA_FAIL."""
        return f"{self.kind} {self.at} {MODES[self.mode]} {self.error}"


@dataclass(frozen=True)
class Run:
    """Exit status (negative for a signal), output, the number of calls of the kind and of failed ones."""

    status: int
    output: str
    errors: str
    calls: int
    failed: int


def counting(kind: str) -> Injection:
    """Counts the calls of a kind and lets none fail."""
    return Injection(kind, 0, "for good", 0)


def injections(kind: str, calls: Sequence[int], first_error_only: bool) -> Iterator[Injection]:
    """Each of the calls, in every mode, with every error of the kind."""
    for at in calls:
        for mode in MODES:
            for error in ERRORS[kind][:1] if first_error_only else ERRORS[kind]:
                yield Injection(kind, at, mode, error)


def sampled_calls(calls: int, sample: int) -> list[int]:
    """A sample of the calls 1 to `calls`: a quarter of it from the start, where each call has another
    origin, and the rest spread evenly."""
    if calls <= sample:
        return list(range(1, calls + 1))
    first = sample // 4
    step = (calls - first) / (sample - first)
    return [*range(1, first + 1), *(first + 1 + int(number * step) for number in range(sample - first))]


def run_injected(
    command: Sequence[str], environment: Mapping[str, str], library: Path, injection: Injection, counts: Path
) -> Run:
    """Runs the command; the library counts in the file `counts`. Raises Problem after the time-out."""
    counts.write_bytes(bytes(COUNTS.size))
    injected = {
        **environment,
        "LD_PRELOAD": str(library),
        "VELMORA_FAIL": injection.setting(),
        "VELMORA_FAIL_COUNT": str(counts),
    }
    try:
        ended = subprocess.run(
            command,
            env=injected,
            capture_output=True,
            text=True,
            errors="replace",
            timeout=LIMIT_S,
            check=False,
        )
    except subprocess.TimeoutExpired:
        raise Problem(f"did not end within {LIMIT_S} s") from None
    calls, failed = COUNTS.unpack(counts.read_bytes())
    return Run(ended.returncode, ended.stdout, ended.stderr, calls, failed)
