# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The kinds of events: how sure each has to be, and how far apart its two times may be."""

from dataclasses import dataclass

STATED = 1.0
DERIVED = 0.98


@dataclass(frozen=True)
class Kind:
    """What is asked of a kind of events."""

    needed: float
    """The least precision and recall."""
    tolerance_s: float = 1.0
    """How long a record may take that reports what has happened."""

    @property
    def is_stated(self) -> bool:
        return self.needed == STATED


KINDS = {
    "cell-reselection": Kind(DERIVED),
    "handover": Kind(DERIVED),
    "cell-change": Kind(STATED),
    "technology-change": Kind(STATED),
    "ping-pong": Kind(DERIVED),
    "late-reselection": Kind(DERIVED, 2),
    "early-reselection": Kind(DERIVED, 2),
    "radio-state": Kind(STATED, 0.01),
    "registration-state": Kind(STATED, 0.01),
    "mobility-state": Kind(STATED, 0.01),
    "area-update": Kind(DERIVED, 2),
    "out-of-service": Kind(STATED),
    "limited-service": Kind(STATED),
    "call-setup": Kind(STATED),
    "call-end": Kind(STATED),
    "call-lost": Kind(DERIVED),
    "re-establishment": Kind(STATED),
    "context-up": Kind(STATED, 0.01),
    "context-down": Kind(STATED, 0.01),
    "address-change": Kind(STATED, 0.01),
    "evdo-session": Kind(STATED, 0.01),
    "sim-change": Kind(STATED, 0.01),
    "gap": Kind(STATED),
    "malformed": Kind(STATED, 0.01),
    "clock-jump": Kind(STATED),
    "note": Kind(STATED),
    "weak-coverage": Kind(DERIVED, 2),
    "poor-quality": Kind(DERIVED, 2),
    "pilot-pollution": Kind(DERIVED, 2),
    "missing-neighbour": Kind(DERIVED, 2),
    "block-error-burst": Kind(DERIVED, 2),
    "data-stall": Kind(DERIVED, 2),
    "fer-alarm": Kind(DERIVED, 2),
}

SHOWN_ONLY: dict[tuple[str, str], str] = {}
"""Where a kind is short in a scenario, and why: the figures are shown, and nothing is asked of them."""


def needed(kind: str, scenario: str) -> float | None:
    """The least precision and recall of a kind in that scenario; none where they are only shown."""
    return None if (kind, scenario) in SHOWN_ONLY else KINDS[kind].needed


MOVES = frozenset({"cell-reselection", "handover", "cell-change"})
"""A move that no record explains may be found as any of these."""
