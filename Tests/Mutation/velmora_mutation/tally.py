# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The outcomes of the changes, as they are printed and read again."""

import re
from collections import Counter
from dataclasses import dataclass, field
from enum import Enum

from velmora_mutation.changes import Change, ChangeKey


class Outcome(Enum):
    """What became of a change."""

    NOTICED = "noticed"
    SURVIVED = "survived"
    EQUIVALENT = "equivalent"
    NOT_COMPILED = "not compiled"


SURVIVOR = re.compile(rf"(?m)^{Outcome.SURVIVED.value} (.+):\d+\n    - (.*)\n    \+ (.*)$")


def describe(outcome: Outcome, change: Change) -> str:
    """The lines of the report for a change."""
    key = change.key
    return f"{outcome.value} {change.path}:{change.line}\n    - {key.before}\n    + {key.after}"


def survivors(report: str) -> set[ChangeKey]:
    """The changes that survived according to an earlier report."""
    return {ChangeKey(*row) for row in SURVIVOR.findall(report)}


@dataclass
class Tally:
    """The number of changes by outcome."""

    counts: Counter[Outcome] = field(default_factory=Counter)

    def add(self, outcome: Outcome) -> None:
        """Counts a change."""
        self.counts[outcome] += 1

    def compiled(self) -> int:
        """The changes that count for the sample."""
        return self.counts.total() - self.counts[Outcome.NOT_COMPILED]

    def has_survivors(self) -> bool:
        """Whether a change survived that is not on the list."""
        return self.counts[Outcome.SURVIVED] > 0

    def report(self, took_s: float) -> str:
        """The last lines of the report."""
        numbers = ", ".join(f"{self.counts[outcome]} {outcome.value}" for outcome in Outcome)
        return f"{numbers}\n{took_s:.0f} s, {took_s / max(self.counts.total(), 1):.1f} s a change"
