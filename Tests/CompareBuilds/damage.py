# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Recordings that are cut, that have flipped bytes, and that hold shortened messages."""

import random
from pathlib import Path

from . import pcapng
from .random_records import changed, is_sim_file

FLIPPED = [1, 3, 10, 40, 200]  # bytes of a file


def damaged(recording: Path, technology: str, directory: Path) -> list[Path]:
    content = recording.read_bytes()
    chance = random.Random(recording.name)
    made: list[Path] = []

    def path(name: str) -> Path:
        made.append(directory / f"{recording.stem}-{name}.pcapng")
        return made[-1]

    for name, end in (("half", len(content) // 2), ("last-byte", len(content) - 1), ("head", 70), ("section", 20)):
        path(f"cut-{name}").write_bytes(content[:end])
    for count in FLIPPED:
        flipped = bytearray(content)
        for _ in range(count):
            flipped[chance.randrange(len(flipped))] ^= chance.randrange(1, 256)
        path(f"flipped-{count}").write_bytes(flipped)
    messages = list(pcapng.messages_of(recording))
    spared = [is_sim_file(message) for message in messages]
    pcapng.write(path("shortened"), technology,
                 (message if keep or chance.random() < 0.5 else message[: chance.randrange(len(message) + 1)]
                  for message, keep in zip(messages, spared)))
    pcapng.write(path("changed"), technology,
                 (message if keep else changed(message, chance) for message, keep in zip(messages, spared)))
    return made
