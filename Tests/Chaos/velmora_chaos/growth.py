# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The memory of a program over its refreshes."""

from dataclasses import dataclass

from velmora_chaos.checks import expect
from velmora_chaos.redraws import HISTORY

GROWTH_KIB = 1024


@dataclass(frozen=True)
class Growth:
    """The memory of a program over its refreshes."""

    name: str
    refreshes: int
    first_kib: int
    most_kib: int

    def __str__(self) -> str:
        return (
            f"{self.name}: {self.refreshes} refreshes; {self.first_kib} KiB after the first {HISTORY}, "
            f"at most {self.most_kib - self.first_kib:+d} KiB later"
        )

    def check(self) -> None:
        """Raises Problem for memory that grows, or for a run too short to show it."""
        expect(self.refreshes > 2 * HISTORY, f"{self.name}: {self.refreshes} refreshes are too few")
        growth = self.most_kib - self.first_kib
        expect(growth < GROWTH_KIB, f"{self.name}: grew by {growth} KiB, wanted less than {GROWTH_KIB}")
