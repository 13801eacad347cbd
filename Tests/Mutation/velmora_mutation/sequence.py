# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The order in which changes are tried."""

import itertools
import random
from collections.abc import Callable, Iterable, Iterator

from velmora_mutation.changes import Change

WIDE_SHARE = 20  # a change of a header that many files include takes long: one in so many at most


def in_turn(
    changes: Iterable[Change], group_of: Callable[[Change], str], is_wide: Callable[[Change], bool], seed: int
) -> Iterator[Change]:
    """All changes, one of each group after the other, each group shuffled; the same order for the same seed.

    Those of wide headers are spread among the others, and what remains of them comes last.
    """
    groups: dict[str, list[Change]] = {}
    wide: list[Change] = []
    for change in changes:
        (wide if is_wide(change) else groups.setdefault(group_of(change), [])).append(change)
    chance = random.Random(seed)
    ordered = [groups[name] for name in sorted(groups)]
    for group in [*ordered, wide]:
        chance.shuffle(group)
    taken = 0
    for row in itertools.zip_longest(*ordered):
        for change in row:
            if change is None:
                continue
            taken += 1
            if wide and taken % WIDE_SHARE == 0:
                yield wide.pop()
            yield change
    yield from wide
