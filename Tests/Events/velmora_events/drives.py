# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Short drives of all scenarios, with what happened in them and what velmora-log finds."""

import random
import subprocess
import tempfile
from dataclasses import dataclass
from pathlib import Path

from velmora_events.addresses import readdressed
from velmora_events.events import Event, found_of, truth_of
from velmora_events.interruptions import KINDS, interrupted

ROUNDS_S = {"gsm": 370, "c2k": 245, "lte": 155, "utran": 215, "ifx": 155, "modem": 275}
"""By scenario: a round and the beginning of the next one."""


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
        """What happened, and what was found: in the drive, and of what no drive has in copies that have it."""
        with tempfile.TemporaryDirectory(prefix="measure-events-") as directory:
            recording, truth = Path(directory, "drive.pcapng"), Path(directory, "truth.jsonl")
            length = f"{ROUNDS_S[self.scenario] * self.rounds}s"
            drive = [self.scenario, str(self.seed), length, str(recording), "--truth", str(truth)]
            self._run(self.build / "tests" / "make-drive", *drive)
            truths, found = truth_of(truth.read_text().splitlines()), self._found(recording)
            copy = Path(directory, "copy.pcapng")
            # What else happened cannot be seen across an interruption.
            for change, kinds in ((interrupted, KINDS), (readdressed, {"address-change"})):
                content, events = change(recording.read_bytes(), random.Random(self.name))
                copy.write_bytes(content)
                truths += events
                found += [each for each in self._found(copy) if each.kind in kinds]
            return truths, found

    def _found(self, recording: Path) -> list[Event]:
        listed = self._run(self.build / "velmora-log", "events", "--format", "jsonl", str(recording))
        return found_of(listed.splitlines())

    def _run(self, program: Path, *arguments: str) -> str:
        result = subprocess.run([program, *arguments], capture_output=True, text=True, check=False)
        if result.returncode != 0:
            raise Problem(f"{self.name}: {program.name} ended with {result.returncode}: {result.stderr.strip()}")
        return result.stdout
