# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What a recording reports, read from what `velmora-log decode` writes: numbers from `--samples`, the times of messages
that report nothing, and what they withdraw, from `--every message`."""

from __future__ import annotations

import json
import re
import subprocess
import sys
from collections import Counter, defaultdict
from dataclasses import dataclass, field
from datetime import datetime, timezone
from typing import Any

LONGEST_SILENCE = 30 * 10**9
LARGEST_STEP_BACK = 10**9


def run(program: str, *arguments: str) -> str:
    result = subprocess.run([program, *arguments], capture_output=True, text=True, check=False)
    if result.returncode != 0:
        sys.exit(f"{' '.join(arguments)}: {result.stderr}")
    return result.stdout


def lines_of(program: str, *arguments: str) -> list[dict[str, Any]]:
    return [json.loads(line) for line in run(program, *arguments).splitlines()]


def objects_of(text: str) -> list[dict[str, Any]]:
    decoder = json.JSONDecoder()
    objects = []
    at = 0
    while at < len(text.rstrip()):
        value, at = decoder.raw_decode(text, at)
        objects.append(value)
        at += len(text[at:]) - len(text[at:].lstrip())
    return objects


def nanoseconds(time: str) -> int:
    seconds = datetime.strptime(time[:19], "%Y-%m-%dT%H:%M:%S").replace(tzinfo=timezone.utc)
    return int(seconds.timestamp()) * 10**9 + int(time[20:29])


@dataclass
class Leaf:
    """What is known of a path: from the catalogue, and from the samples."""

    unit: str | None = None
    role: str | None = None
    identifies: bool = False
    numbers: list[tuple[int, float]] = field(default_factory=list)
    absent: int = 0
    # Of a state: samples and time by value, and how often one followed another.
    samples: Counter[Any] = field(default_factory=Counter)
    times: Counter[Any] = field(default_factory=Counter)
    changes: Counter[tuple[Any, Any]] = field(default_factory=Counter)


def pattern(path: str) -> str:
    return re.sub(r"/\d+(?=/|$)", "/*", path)


def is_in_list(path: str) -> bool:
    return "/*" in path


def key_of(value: Any) -> Any:
    """True and 1 are one key to Python, and are not the same value here."""
    return (type(value).__name__, value)


def is_shown(message: dict[str, Any], path: str) -> bool | None:
    """Whether a leaf is still shown after the message; None where the message says nothing of it."""
    names = path.split("/")[1:]
    value: Any = None
    if "display" in message:
        value = message["display"]
    elif names[0] in message.get("sections", {}):
        value = {names[0]: message["sections"][names[0]]}
    else:
        return None
    for name in names:
        if not isinstance(value, dict) or name not in value:
            return False
        value = value[name]
    return not isinstance(value, (dict, list))


class Recording:
    """All of it: its messages in order, and each one's samples."""

    def __init__(self, program: str, file: str, technology: str) -> None:
        self.leaves: dict[str, Leaf] = defaultdict(Leaf)
        self.kinds: dict[str, str] = {}
        for leaf in json.loads(run(program, "fields", "--technology", technology, "--format", "json"))["fields"]:
            self.kinds[leaf["path"]] = leaf["kind"]
            self.leaves[leaf["path"]] = Leaf(leaf.get("unit"), leaf.get("role"), "identity" in leaf)
        samples = defaultdict(list)
        for sample in lines_of(program, "decode", "--samples", "--format", "jsonl", file):
            samples[sample["record"]].append(sample)
        messages = lines_of(program, "decode", "--every", "message", "--format", "jsonl", file)
        self.times = [nanoseconds(message["time"]) for message in messages]
        replaces = technology in ("Modem", "IFX")  # whose messages are whole accounts
        held: dict[str, tuple[Any, int]] = {}
        last: int | None = None
        now = 0
        for number, message in enumerate(messages, start=1):
            time = self.times[number - 1]
            if last is not None and (time - last > LONGEST_SILENCE or last - time > LARGEST_STEP_BACK):
                self.forget(held, last)
                last = None
            now = time if last is None else max(last, time)
            for sample in samples.pop(number, []):
                self.add(sample, held, now)
            for path in [path for path in held if replaces and is_shown(message, path) is False]:
                self.withdraw(held, path, now)
            last = now
        self.forget(held, now)
        if samples:
            sys.exit(f"{file}: samples of records that are no messages: {sorted(samples)[:5]}")

    def add(self, sample: dict[str, Any], held: dict[str, tuple[Any, int]], now: int) -> None:
        path = pattern(sample["path"])
        leaf = self.leaves[path]
        value = sample["value"]
        # Enumerations are numbers in the samples: the catalogue says which ones.
        kind = self.kinds.get(path)
        if value is None:
            leaf.absent += 1
            self.withdraw(held, path, now)
        elif isinstance(value, (int, float)) and not isinstance(value, bool) and kind != "enumeration":
            leaf.unit = sample.get("unit")
            self.withdraw(held, path, now)
            leaf.numbers.append((now, float(value)))
        elif kind == "bytes" or (isinstance(value, str) and leaf.identifies):
            pass
        else:
            key = key_of(value)
            leaf.samples[key] += 1
            if is_in_list(path):
                return
            before = held.get(path)
            if before and before[0] == key:
                return
            self.withdraw(held, path, now)
            held[path] = (key, now)
            if before:
                leaf.changes[before[0], key] += 1

    def withdraw(self, held: dict[str, tuple[Any, int]], path: str, now: int) -> None:
        if path in held:
            key, since = held.pop(path)
            self.leaves[path].times[key] += now - since

    def forget(self, held: dict[str, tuple[Any, int]], now: int) -> None:
        for path in list(held):
            self.withdraw(held, path, now)
