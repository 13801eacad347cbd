#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Compares every figure of `velmora-log stats` with the same computed here from what `velmora-log decode` writes.

usage: check-stats.py VELMORA_LOG RECORDING...

Figures must be equal to the last digit. Exit status: 0 all are, 1 some is not.
"""

from __future__ import annotations

import json
import math
import statistics
import sys
from collections import Counter, defaultdict
from datetime import datetime, timezone
from typing import Any

from recorded import Leaf, Recording, key_of, nanoseconds, objects_of, run

MINUTE = 60 * 10**9
FEWEST_SAMPLES = 5
BIN_WIDTHS = {"dBm": 5, "%": 5, "dB": 2, "MHz": 10, "°": 1}
MOST_VALUES = 50
LOWEST_MEDIAN = {"serving.level", "serving.quality"}
HIGHEST_MEAN = {"block-error-rate"}

problems: list[str] = []


def time_text(time: int) -> str:
    moment = datetime.fromtimestamp(time // 10**9, timezone.utc)
    return moment.strftime("%Y-%m-%dT%H:%M:%S") + f".{time % 10**9:09d}Z"


def expect(place: str, got: Any, wanted: Any) -> None:
    if got != wanted:
        problems.append(f"{place}: got {got!r}, wanted {wanted!r}")


def rank(values: list[float], percent: int) -> float:
    """The nearest rank, of sorted values."""
    return values[max(1, -(-len(values) * percent // 100)) - 1]


def growing_bin(value: float) -> tuple[float, float]:
    edges = [0.0, 1.0]
    while edges[-1] <= value:
        edges.append(edges[-1] * (2.5 if str(edges[-1])[0] == "2" else 2))
    return edges[-2], edges[-1]


def histogram(values: list[float], unit: str | None) -> dict[str, Any]:
    if unit is None:
        counts = Counter(values)
        kept = sorted(counts, key=lambda value: (-counts[value], value))
        bins = [{"value": value, "samples": counts[value]} for value in sorted(kept[:MOST_VALUES])]
        return {"bins": bins, "others": sum(counts[value] for value in kept[MOST_VALUES:])}
    found: Counter[tuple[float, float]] = Counter()
    for value in values:
        if unit in BIN_WIDTHS:
            index = math.floor(value / BIN_WIDTHS[unit])
            found[index * BIN_WIDTHS[unit], (index + 1) * BIN_WIDTHS[unit]] += 1
        else:
            found[growing_bin(value)] += 1
    bins = [{"from": low, "to": high, "samples": count} for (low, high), count in sorted(found.items())]
    return {"bins": bins, "others": 0}


def check_numbers(place: str, got: dict[str, Any], values: list[float], unit: str | None) -> None:
    values = sorted(values)
    expect(f"{place} samples", got["samples"], len(values))
    expect(f"{place} unit", got.get("unit"), unit)
    if not values:
        return
    figures = {"minimum": min(values), "p5": rank(values, 5), "p50": statistics.median_low(values),
               "p95": rank(values, 95), "maximum": max(values), "mean": statistics.fmean(values)}
    for name, figure in figures.items():
        expect(f"{place} {name}", got[name], figure)
    expect(f"{place} relativeError", got.get("relativeError"), None)
    if "histogram" in got:
        expect(f"{place} histogram", got["histogram"], histogram(values, unit))


def check_states(place: str, got: dict[str, Any], leaf: Leaf) -> None:
    values = {key_of(each["value"]): each for each in got["values"]}
    expect(f"{place} samples", got["samples"], leaf.samples.total())
    expect(f"{place} values", {key: each["samples"] for key, each in values.items()}, dict(leaf.samples))
    if got.get("list"):
        return
    known = leaf.times.total()
    expect(f"{place} seconds", got["seconds"], known / 10**9)
    expect(f"{place} transitions", got["transitions"], leaf.changes.total())
    for key, each in values.items():
        expect(f"{place} seconds of {key}", each["seconds"], leaf.times[key] / 10**9)
        expect(f"{place} share of {key}", each["share"], leaf.times[key] / known if known else None)
    changes = {(key_of(each["from"]), key_of(each["to"])): each["count"] for each in got["changes"]}
    expect(f"{place} changes", changes, dict(leaf.changes))


def worst_minute(role: str, numbers: list[tuple[int, float]]) -> dict[str, Any] | None:
    minutes = defaultdict(list)
    for time, value in numbers:
        minutes[time // MINUTE * MINUTE].append(value)
    found = []
    for begin, values in minutes.items():
        if len(values) >= FEWEST_SAMPLES:
            figure = -statistics.fmean(values) if role in HIGHEST_MEAN else statistics.median_low(values)
            found.append((figure, begin, len(values)))
    if not found:
        return None
    figure, begin, samples = min(found)
    is_mean = role in HIGHEST_MEAN
    return {"minute": time_text(begin), "measure": "mean" if is_mean else "median",
            "value": -figure if is_mean else figure, "samples": samples}


def check_roles(place: str, got: list[dict[str, Any]], leaves: dict[str, Leaf]) -> None:
    numbers: dict[str, list[tuple[int, float]]] = defaultdict(list)
    units = {}
    for leaf in leaves.values():
        if leaf.role and leaf.numbers:
            numbers[leaf.role] += leaf.numbers
            units[leaf.role] = leaf.unit
    expect(f"{place} roles", {each["role"] for each in got}, set(numbers))
    for each in got:
        role = each["role"]
        check_numbers(f"{place} {role}", each, [value for _, value in numbers[role]], units.get(role))
        expect(f"{place} {role} has a worst minute", "worstMinute" in each, role in LOWEST_MEDIAN | HIGHEST_MEAN)
        if "worstMinute" in each:
            worst = each["worstMinute"]
            if worst:
                worst.pop("technology")
            expect(f"{place} {role} worst minute", worst, worst_minute(role, numbers[role]))


def check_whole(program: str, file: str, recording: Recording) -> int:
    objects = objects_of(run(program, "stats", "--format", "json", "--histogram", file))
    expect(f"{file} objects", len(objects), 1)
    part = objects[0]["technologies"][0]
    expect(f"{file} messages", part["messages"], len(recording.times))
    expect(f"{file} first", part["first"], time_text(recording.times[0]))
    check_roles(file, objects[0]["roles"], recording.leaves)
    numbers = {each["path"]: each for each in part["numbers"]}
    states = {each["path"]: each for each in part["states"]}
    expect(f"{file} numbers", {path for path, each in numbers.items() if each["samples"]},
           {path for path, leaf in recording.leaves.items() if leaf.numbers})
    expect(f"{file} states", {path for path, each in states.items() if each["samples"]},
           {path for path, leaf in recording.leaves.items() if leaf.samples})
    for path, each in (numbers | states).items():
        expect(f"{file} {path} absent", each["absent"], recording.leaves[path].absent)
    for path, each in numbers.items():
        leaf = recording.leaves[path]
        check_numbers(f"{file} {path}", each, [value for _, value in leaf.numbers], leaf.unit)
    for path, each in states.items():
        check_states(f"{file} {path}", each, recording.leaves[path])
    return len(numbers) + len(states)


def check_minutes(program: str, file: str, recording: Recording) -> int:
    objects = objects_of(run(program, "stats", "--format", "json", "--by", "minute", file))
    seconds: Counter[tuple[str, Any]] = Counter()
    for group in objects:
        begin = nanoseconds(group["minute"])
        for each in group["technologies"][0]["numbers"]:
            leaf = recording.leaves[each["path"]]
            values = [value for time, value in leaf.numbers if begin <= time < begin + MINUTE]
            check_numbers(f"{file} {group['minute']} {each['path']}", each, values, leaf.unit)
        for each in group["technologies"][0]["states"]:
            for value in each["values"]:
                seconds[each["path"], key_of(value["value"])] += round(value.get("seconds", 0) * 10**9)
    # The minutes' times add up to those of the whole.
    for path, leaf in recording.leaves.items():
        for key, time in leaf.times.items():
            expect(f"{file} {path} minutes of {key}", seconds[path, key], time)
    return len(objects)


def main() -> int:
    program = sys.argv[1]
    for file in sys.argv[2:]:
        technology = json.loads(run(program, "info", "--format", "json", file))["technologies"][0]["technology"]
        recording = Recording(program, file, technology)
        fields_compared = check_whole(program, file, recording)
        minutes = check_minutes(program, file, recording)
        print(f"{file}: {fields_compared} fields, {minutes} minutes")
        if fields_compared < 20 or minutes < 2:
            problems.append(f"{file}: too little to compare")
    for problem in problems[:40]:
        print(problem)
    print(f"{len(problems)} differences")
    return 1 if problems else 0


if __name__ == "__main__":
    sys.exit(main())
