# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Costs of a message, from costs of whole processes."""

import statistics
from collections.abc import Sequence
from dataclasses import dataclass


@dataclass(frozen=True)
class Sizes:
    """Two recordings of one drive, the smaller the beginning of the larger."""

    large: int
    small: int

    def each(self, large: float, small: float) -> float:
        """What a message costs. The difference leaves out the start of the program."""
        return (large - small) / (self.large - self.small)


def sizes_of(messages: int) -> Sizes:
    return Sizes(messages, max(messages // 10, 1))


@dataclass(frozen=True)
class Cost:
    """What a message costs, by round."""

    rounds: Sequence[float]

    @property
    def median(self) -> float:
        return statistics.median(self.rounds)

    @property
    def spread(self) -> float:
        """(Slowest - fastest) / median; none of a single round."""
        return (max(self.rounds) - min(self.rounds)) / self.median if self.median > 0 else 0.0


def ratio(above: Cost | None, below: Cost | None) -> float | None:
    """None where there is nothing to compare; too few messages cost nothing that is measured."""
    if above is None or below is None or above.median <= 0 or below.median <= 0:
        return None
    return above.median / below.median


def three_digits(number: float) -> str:
    """Three significant digits, with commas: 0.0313, 4.52, 75.4, 12,300."""
    rounded = f"{number:.2e}"
    exponent = int(rounded.partition("e")[2])
    return f"{float(rounded):,.{max(2 - exponent, 0)}f}"
