# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tries a sequence of changes in parallel until the sample is complete."""

import threading
from collections.abc import Callable, Collection, Iterator
from concurrent.futures import ThreadPoolExecutor

from velmora_mutation.changes import Change, ChangeKey
from velmora_mutation.tally import Outcome, Tally, describe

Trial = Callable[[Change, int], Outcome]  # of a change, in the lane of that number


class Campaign:
    """Hands out the changes; those on the list of equivalents count as tried without a trial."""

    def __init__(
        self,
        sequence: Iterator[Change],
        equivalents: Collection[ChangeKey],
        sample: int,
        try_change: Trial,
        report: Callable[[str], None],
    ) -> None:
        self.tally = Tally()
        self._sequence = sequence
        self._equivalents = equivalents
        self._sample = sample  # 0 for all
        self._try_change = try_change
        self._report = report
        self._lock = threading.Lock()

    def run(self, jobs: int) -> None:
        """Tries changes on so many threads."""
        with ThreadPoolExecutor(jobs) as pool:
            for lane in [pool.submit(self._work, number) for number in range(jobs)]:
                lane.result()

    def _next(self) -> Change | None:
        with self._lock:
            complete = 0 < self._sample <= self.tally.compiled()
            return None if complete else next(self._sequence, None)

    def _work(self, lane: int) -> None:
        while change := self._next():
            listed = change.key in self._equivalents
            outcome = Outcome.EQUIVALENT if listed else self._try_change(change, lane)
            with self._lock:
                self.tally.add(outcome)
                self._report(describe(outcome, change))
