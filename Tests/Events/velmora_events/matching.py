# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Which events that were found are those that happened: one to one, the nearest first."""

from bisect import bisect_left, bisect_right
from collections import defaultdict
from collections.abc import Sequence
from dataclasses import dataclass, field

from velmora_events.events import Event, plain
from velmora_events.kinds import KINDS, MOVES, Kind

SAME_NUMBERS = ("from.channel", "to.channel", "from.physical-cell", "to.physical-cell", "context")
SAME_NAMES = ("from", "to")


@dataclass
class Outcome:
    """The events of one kind: those that both have, and those that one has alone."""

    both: int = 0
    hidden: int = 0
    missed: list[Event] = field(default_factory=list)
    wrong: list[Event] = field(default_factory=list)


def is_compatible(truth: Event, found: Event) -> bool:
    """Whether what both say of it is the same."""
    for name in SAME_NUMBERS:
        if name in truth.fields and name in found.fields and truth.fields[name] != found.fields[name]:
            return False
    for name in SAME_NAMES:
        if truth.fields.get(name) and name in found.fields:
            # Records have their own spellings of states, with a prefix or a number.
            words = [plain(word) for word in truth.fields[name].split(",")]
            if not any(word in plain(found.fields[name]) for word in words):
                return False
    return True


def _distance(truth: Event, found: Event, kind: Kind) -> float | None:
    distance = abs(truth.time - found.time)
    if distance > kind.tolerance_s + 1e-6:
        return None
    if (truth.end is None) != (found.end is None):
        return None
    if truth.end is not None and found.end is not None and abs(truth.end - found.end) > kind.tolerance_s + 1e-6:
        return None
    return distance if is_compatible(truth, found) else None


def _pairs(truths: Sequence[Event], found: Sequence[Event], kind: Kind) -> list[tuple[int, int]]:
    """The places of those that belong together."""
    order = sorted(range(len(found)), key=lambda place: found[place].time)
    times = [found[place].time for place in order]
    candidates = []
    for number, truth in enumerate(truths):
        first = bisect_left(times, truth.time - kind.tolerance_s - 1e-6)
        last = bisect_right(times, truth.time + kind.tolerance_s + 1e-6)
        for place in order[first:last]:
            distance = _distance(truth, found[place], kind)
            if distance is not None:
                candidates.append((distance, number, place))
    pairs = []
    taken_truths: set[int] = set()
    taken_found: set[int] = set()
    for _, number, place in sorted(candidates):
        if number not in taken_truths and place not in taken_found:
            taken_truths.add(number)
            taken_found.add(place)
            pairs.append((number, place))
    return pairs


def _without(events: Sequence[Event], places: set[int]) -> list[Event]:
    return [event for place, event in enumerate(events) if place not in places]


def _set_hidden_aside(outcomes: dict[str, Outcome], hidden: Sequence[Event]) -> None:
    """What no record states may be found or not, and a move as any kind of move."""
    for truth in hidden:
        for name in [truth.kind, *sorted(MOVES - {truth.kind} if truth.kind in MOVES else ())]:
            outcome = outcomes[name]
            pairs = _pairs([truth], outcome.wrong, KINDS[truth.kind])
            if pairs:
                outcome.hidden += 1
                outcome.wrong = _without(outcome.wrong, {pairs[0][1]})
                break


def match(truths: Sequence[Event], found: Sequence[Event]) -> dict[str, Outcome]:
    """The outcome of each kind that either has; those that KINDS does not name are left out."""
    outcomes: dict[str, Outcome] = defaultdict(Outcome)
    for name in sorted({event.kind for event in (*truths, *found)} & KINDS.keys()):
        expected = [event for event in truths if event.kind == name and not event.is_hidden]
        listed = [event for event in found if event.kind == name]
        pairs = _pairs(expected, listed, KINDS[name])
        outcome = outcomes[name]
        outcome.both = len(pairs)
        outcome.missed = _without(expected, {number for number, _ in pairs})
        outcome.wrong = _without(listed, {place for _, place in pairs})
    _set_hidden_aside(outcomes, [event for event in truths if event.is_hidden])
    return dict(outcomes)
