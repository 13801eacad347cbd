# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What both builds are fed with, made when its turn comes and removed after it."""

import random
import subprocess
import tempfile
from collections.abc import Iterator
from dataclasses import dataclass
from pathlib import Path

from . import pcapng, random_records
from .damage import damaged

RECORDINGS = Path(__file__).parents[1] / "Recordings"
TECHNOLOGIES = {"gsm": "Ostrel_GSM", "lte": "Ostrel_LTE", "utran": "Ostrel_UTRAN2", "c2k": "Ostrel_CDMA", "ifx": "IFX",
                "modem": "Modem"}
# A drive of that length has every log code of its technology.
SAMPLES = 20_000


@dataclass(frozen=True)
class Input:
    path: Path
    scenario: str
    short: bool  # is tried with more commands


class Drives:
    def __init__(self, maker: Path) -> None:
        self._maker = maker

    def make(self, scenario: str, seed: int, messages: int, path: Path) -> Path:
        subprocess.run([self._maker, scenario, str(seed), str(messages), path], check=True)
        return path

    def messages(self, scenario: str) -> list[bytes]:
        with tempfile.TemporaryDirectory() as directory:
            return list(pcapng.messages_of(self.make(scenario, 1, SAMPLES, Path(directory, "drive.pcapng"))))


def recordings() -> Iterator[Input]:
    for scenario in TECHNOLOGIES:
        for path in sorted(RECORDINGS.glob(f"{scenario}.*")):
            if path.suffix in (".pcapng", ".velmora", ".dlf"):
                yield Input(path, scenario, True)


def damaged_recordings(directory: Path) -> Iterator[Input]:
    for scenario, technology in TECHNOLOGIES.items():
        for path in damaged(RECORDINGS / f"{scenario}.pcapng", technology, directory):
            yield Input(path, scenario, True)


def random_messages(drives: Drives, count: int, directory: Path, seed: int = 1) -> Iterator[Input]:
    samples = {scenario: drives.messages(scenario) for scenario in TECHNOLOGIES}
    codes = sorted(set().union(*(random_records.codes_of(samples[name]) for name in TECHNOLOGIES if name != "ifx")))
    for scenario, technology in TECHNOLOGIES.items():
        own = samples[scenario]
        path = directory / f"random-{scenario}.pcapng"
        if scenario == "ifx":
            pcapng.write(path, technology, random_records.displays(count, seed))
        else:
            cells = {"gsm": "GSM", "lte": "LTE", "utran": "UTRAN"}.get(scenario, "CDMA")
            pcapng.write(path, technology, random_records.records(cells, count, seed, own, codes))
        yield Input(path, scenario, True)
    yield from fatal_messages(samples, directory)


def fatal_messages(samples: dict[str, list[bytes]], directory: Path) -> Iterator[Input]:
    """What ends the program, or decoding, is in files of its own: nothing after it would be compared."""
    for scenario, technology in TECHNOLOGIES.items():
        own = samples[scenario]
        chance = random.Random(scenario)
        bad = random_records.record(0, chance.randbytes(40), chance, random_records.EXTRA)
        path = directory / f"unreadable-{scenario}.pcapng"
        pcapng.write(path, technology, own[:300] + [bad] + own[300:600])
        yield Input(path, scenario, True)
    for seed in range(20):
        path = directory / f"odd-{seed}.pcapng"
        pcapng.write(path, TECHNOLOGIES["ifx"], random_records.odd_displays(samples["ifx"], seed))
        yield Input(path, "ifx", True)
