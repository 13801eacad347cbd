# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Precision and recall, and how they are shown."""

from collections.abc import Iterable, Sequence
from dataclasses import dataclass

from velmora_events.kinds import KINDS, needed
from velmora_events.matching import Outcome


@dataclass
class Figures:
    """How many events of a kind happened and were found, in all drives of a technology."""

    both: int = 0
    missed: int = 0
    wrong: int = 0
    hidden: int = 0

    def add(self, outcome: Outcome) -> None:
        self.both += outcome.both
        self.missed += len(outcome.missed)
        self.wrong += len(outcome.wrong)
        self.hidden += outcome.hidden

    @property
    def precision(self) -> float | None:
        """Which share of what was found happened; none where nothing was found."""
        found = self.both + self.wrong
        return self.both / found if found else None

    @property
    def recall(self) -> float | None:
        """Which share of what happened was found; none where nothing happened."""
        happened = self.both + self.missed
        return self.both / happened if happened else None

    def is_short_of(self, needed: float | None) -> bool:
        if needed is None:
            return False
        return any(share is not None and share < needed for share in (self.precision, self.recall))


Table = dict[tuple[str, str], Figures]
"""By kind and technology."""


def _share(share: float | None) -> str:
    if share is None:
        return "–"
    # Rounded down: what is short of 1 must not look like it.
    return f"{int(share * 10_000) / 10_000:.4f}"


def _remark(kind: str, technology: str, figures: Figures) -> str:
    if needed(kind, technology) is None:
        return "only shown"
    return "short" if figures.is_short_of(needed(kind, technology)) else ""


def rows(table: Table) -> list[tuple[str, ...]]:
    """A row each of kind, technology and figures, the kinds in the order of KINDS."""
    lines: list[tuple[str, ...]] = []
    for kind, asked in KINDS.items():
        for (name, technology), figures in sorted(table.items()):
            if name == kind:
                happened = figures.both + figures.missed
                found = figures.both + figures.wrong
                lines.append((
                    kind,
                    "stated" if asked.is_stated else "derived",
                    technology,
                    str(happened),
                    str(found),
                    _share(figures.precision),
                    _share(figures.recall),
                    _remark(kind, technology, figures),
                ))
    return lines


HEADS = ("kind", "", "technology", "happened", "found", "precision", "recall", "")


def as_text(lines: Iterable[Sequence[str]]) -> str:
    """Columns for a terminal."""
    cells = [HEADS, *lines]
    widths = [max(len(row[column]) for row in cells) for column in range(len(HEADS))]
    return "\n".join(
        "  ".join(cell.ljust(width) for cell, width in zip(row, widths, strict=True)).rstrip() for row in cells
    )


def _cell(figures: Figures | None) -> str:
    if figures is None or figures.both + figures.missed + figures.wrong == 0:
        return ""
    happened = figures.both + figures.missed
    if figures.missed == figures.wrong == 0:
        return str(happened)
    return f"{happened}: {_share(figures.precision)}, {_share(figures.recall)}"


def as_markdown(table: Table) -> str:
    """A table for a document: how many of each kind happened, and precision and recall where one is not 1."""
    scenarios = sorted({scenario for _, scenario in table})
    lines = [
        "| kind | " + " | ".join(scenarios) + " |",
        "|---|" + "---|" * len(scenarios),
    ]
    for kind in KINDS:
        cells = [_cell(table.get((kind, scenario))) for scenario in scenarios]
        if any(cells):
            lines.append(f"| `{kind}` | " + " | ".join(cells) + " |")
    return "\n".join(lines)


def short_kinds(table: Table) -> list[str]:
    """The kinds that do not reach what is asked of them, each with its technology."""
    return [
        f"{kind} of {technology}"
        for (kind, technology), figures in sorted(table.items())
        if figures.is_short_of(needed(kind, technology))
    ]
