# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Runs test programs within a time-out."""

import os
import signal
import subprocess
import time
from collections.abc import Iterable
from pathlib import Path

UNCHANGED_LIMIT_S = 300.0


class FailsUnchanged(Exception):
    """A test program fails without a change, so that it cannot notice one."""


def passes(program: Path, scratch: Path, limit_s: float) -> bool:
    """Whether all tests of a program pass in time. Whatever it started is killed after the time-out."""
    environment = {**os.environ, "TMPDIR": str(scratch), "XDG_RUNTIME_DIR": str(scratch)}
    test = subprocess.Popen(
        [program, "--gtest_brief=1", "--gtest_fail_fast"],
        cwd=scratch,
        env=environment,
        start_new_session=True,
        stdin=subprocess.DEVNULL,
        stdout=subprocess.DEVNULL,
        stderr=subprocess.DEVNULL,
    )
    try:
        return test.wait(limit_s) == 0
    except subprocess.TimeoutExpired:
        os.killpg(test.pid, signal.SIGKILL)
        test.wait()
        return False


def limit_for(took_s: float) -> float:
    """The time that a program is given with a change: ten times what it takes without, and ten seconds."""
    return 10 + 10 * took_s


def measure_limits(programs: Iterable[str], build: Path, scratch: Path) -> dict[str, float]:
    """The limit of each program; raises FailsUnchanged for one that fails as it is."""
    limits = {}
    for name in programs:
        start = time.monotonic()
        if not passes(build / name, scratch, UNCHANGED_LIMIT_S):
            raise FailsUnchanged(f"{name} fails without a change")
        limits[name] = limit_for(time.monotonic() - start)
    return limits
