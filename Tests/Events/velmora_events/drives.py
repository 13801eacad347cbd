# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Short drives of all scenarios, with what happened in them and what velmora-log finds."""

import random
import subprocess
import tempfile
from dataclasses import dataclass, replace
from pathlib import Path

from velmora_events.addresses import readdressed
from velmora_events.events import Event, found_of, truth_of
from velmora_events.interruptions import KINDS, interrupted

ROUNDS_S = {"gsm": 370, "c2k": 245, "lte": 155, "utran": 215, "ifx": 155, "modem": 275}
"""By scenario: a round and the beginning of the next one."""
INCIDENTS_S = {"gsm": 282, "c2k": 134, "lte": 163, "modem": 156}
"""The same of the scenarios that have a round of incidents: to where the phone is off, or searches."""


DAY_S = 86_400


def later(event: Event) -> Event:
    """The event a day later."""
    return replace(event, time=event.time + DAY_S, end=None if event.end is None else event.end + DAY_S)


class Problem(Exception):
    """A program that failed."""


@dataclass(frozen=True)
class Drive:
    """The beginning of a scenario's drive."""

    build: Path
    scenario: str
    seed: int
    rounds: int = 1

    @property
    def name(self) -> str:
        return f"{self.scenario} seed {self.seed}"

    def measure(self) -> tuple[list[Event], list[Event]]:
        """What happened, and what was found: in the scenario's round, in that of its incidents, and of what no drive
        has in copies that have it."""
        with tempfile.TemporaryDirectory(prefix="measure-events-") as directory:
            recording, truth = Path(directory, "drive.pcapng"), Path(directory, "truth.jsonl")
            copy = Path(directory, "copy.pcapng")
            truths, found = [], []
            if self.scenario in INCIDENTS_S:
                self._make(INCIDENTS_S[self.scenario], recording, truth, "--incidents")
                truths, found = truth_of(truth.read_text().splitlines()), self._found(recording)
            # Of another day, so that no event of the one drive is near one of the other.
            truths, found = [[later(event) for event in events] for events in (truths, found)]
            self._make(ROUNDS_S[self.scenario] * self.rounds, recording, truth)
            truths += truth_of(truth.read_text().splitlines())
            found += self._found(recording)
            # What else happened cannot be seen across an interruption.
            for change, kinds in ((interrupted, KINDS), (readdressed, {"address-change"})):
                content, events = change(recording.read_bytes(), random.Random(self.name))
                copy.write_bytes(content)
                truths += events
                found += [each for each in self._found(copy) if each.kind in kinds]
            return truths, found

    def _make(self, length_s: int, recording: Path, truth: Path, *options: str) -> None:
        drive = [self.scenario, str(self.seed), f"{length_s}s", str(recording), "--truth", str(truth), *options]
        self._run(self.build / "tests" / "make-drive", *drive)

    def _found(self, recording: Path) -> list[Event]:
        listed = self._run(self.build / "velmora-log", "events", "--format", "jsonl", str(recording))
        return found_of(listed.splitlines())

    def _run(self, program: Path, *arguments: str) -> str:
        result = subprocess.run([program, *arguments], capture_output=True, text=True, check=False)
        if result.returncode != 0:
            raise Problem(f"{self.name}: {program.name} ended with {result.returncode}: {result.stderr.strip()}")
        return result.stdout
