# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Checks that a run must pass, and waiting for a condition with a time-out."""

import time
from collections.abc import Callable
from typing import TypeVar

POLL_S = 0.005

T = TypeVar("T")


class Problem(Exception):
    """A check failed; the text says what was found and what was wanted."""


def expect(holds: object, problem: str) -> None:
    """Raises Problem unless the condition holds."""
    if not holds:
        raise Problem(problem)


def wait_for(what: str, condition: Callable[[], T | None], limit_s: float = 30) -> T:
    """Polls the condition until its result is true and returns that; raises Problem after the time-out."""
    end = time.monotonic() + limit_s
    while time.monotonic() < end:
        found = condition()
        if found:
            return found
        time.sleep(POLL_S)
    raise Problem(f"timed out after {limit_s:g} s waiting for {what}")
