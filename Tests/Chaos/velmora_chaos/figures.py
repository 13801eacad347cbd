# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Summary of a series of measurements."""

import statistics
from collections.abc import Sequence


def summary(name: str, unit: str, numbers: Sequence[float]) -> str:
    """A line with median, 99th percentile and maximum."""
    ordered = sorted(numbers)
    return (
        f"{name}: median {statistics.median(ordered):.2f} {unit}, "
        f"99 % {ordered[int(len(ordered) * 0.99)]:.2f} {unit}, "
        f"maximum {ordered[-1]:.2f} {unit} ({len(ordered)} times)"
    )


def shares(total: int, parts: int) -> list[int]:
    """Divides a number of rounds into parts that differ by one at most, the larger ones first."""
    return [total // parts + (part < total % parts) for part in range(parts)]
