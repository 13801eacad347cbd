# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Every number of the page's data, compared with what other commands say of the same recording."""

import json
import subprocess
from collections import defaultdict
from collections.abc import Iterator
from datetime import datetime, timezone
from pathlib import Path
from typing import Any

FIGURES = ("samples", "minimum", "p5", "p50", "p95", "maximum", "mean")


def objects(program: Path, *arguments: object) -> list[dict[str, Any]]:
    done = subprocess.run([program, *map(str, arguments)], stdout=subprocess.PIPE, stderr=subprocess.DEVNULL, check=False)
    return [json.loads(line) for line in done.stdout.splitlines()]


def document(program: Path, *arguments: object) -> list[dict[str, Any]]:
    """Of JSON documents that follow each other."""
    text = subprocess.run([program, *map(str, arguments)], stdout=subprocess.PIPE, stderr=subprocess.DEVNULL,
                          check=False).stdout.decode()
    decoder, found, at = json.JSONDecoder(), [], 0
    while text[at:].strip():
        at += len(text[at:]) - len(text[at:].lstrip())
        one, at = decoder.raw_decode(text, at)
        found.append(one)
    return found


def nanoseconds(text: str) -> int:
    seconds, fraction = text.rstrip("Z").split(".")
    moment = datetime.strptime(seconds, "%Y-%m-%dT%H:%M:%S").replace(tzinfo=timezone.utc)
    return int(moment.timestamp()) * 10**9 + int(fraction.ljust(9, "0"))


def summed(steps: list[int], first: int = 0) -> list[int]:
    out = []
    for step in steps:
        first += step
        out.append(first)
    return out


Bucket = tuple[float, float, int, int, int]  # least, greatest, samples, the messages of both


def unpacked(series: dict[str, Any]) -> dict[int, Bucket]:
    """The buckets by their index."""
    indexes: list[int] = []
    at = 0
    for skipped, length in zip(series["runs"][::2], series["runs"][1::2], strict=True):
        at += skipped
        indexes += range(at, at + length)
        at += length
    if "decimals" in series:
        factor = 10 ** series["decimals"]
        steps = summed(series["minimumSteps"])
        least = [low / factor for low in steps]
        greatest = [(low + spread) / factor for low, spread in zip(steps, series["spread"], strict=True)]
    else:
        least, greatest = series["minimum"], series["maximum"]
    least_at = summed(series["minimumAtSteps"])
    columns = zip(indexes, least, greatest, series["count"], least_at, series["maximumAtOffset"], strict=True)
    return {index: (low, high, count, number, number + offset) for index, low, high, count, number, offset in columns}


def wanted_buckets(samples: list[dict[str, Any]], path: str, width_ms: int, only_best: bool) -> dict[int, Bucket]:
    """The same made of samples."""
    by_message: dict[tuple[int, int], list[float]] = defaultdict(list)
    for sample in samples:
        if pattern(sample["path"]) == path and isinstance(sample["value"], int | float):
            by_message[(nanoseconds(sample["time"]), sample["record"])].append(sample["value"])
    buckets: dict[int, list[tuple[float, int]]] = defaultdict(list)
    for (time, number), values in by_message.items():
        chosen = [max(values)] if only_best else values
        buckets[time // (width_ms * 10**6)] += [(value, number) for value in chosen]
    made = {}
    for index, members in buckets.items():
        low, high = min(value for value, _ in members), max(value for value, _ in members)
        made[index] = (low, high, len(members), min(number for value, number in members if value == low),
                       min(number for value, number in members if value == high))
    return made


def pattern(path: str) -> str:
    return "/".join("*" if part.isdecimal() else part for part in path.split("/"))


CHARTED = ("serving.level", "serving.quality", "neighbour.level", "neighbour.quality", "block-error-rate", "data-rate")


def check_series(data: dict[str, Any], samples: list[dict[str, Any]], stats: dict[str, Any]) -> Iterator[str]:
    reported = {role["role"] for role in stats["roles"] if role["samples"]} & set(CHARTED)
    if missing := reported - {series["role"] for series in data["series"]}:
        yield f"no series of {sorted(missing)}"
    for series in data["series"]:
        got, wanted = unpacked(series), wanted_buckets(samples, series["path"], series["width"], series["best"])
        if got != wanted:
            index = next(each for each in sorted(got.keys() | wanted.keys()) if got.get(each) != wanted.get(each))
            yield f"{series['path']}, bucket {index}: got {got.get(index)}, wanted {wanted.get(index)}"


def check_roles(data: dict[str, Any], stats: dict[str, Any]) -> Iterator[str]:
    wanted = {role["role"]: role for role in stats["roles"]}
    for role in data["roles"]:
        other = wanted[role["role"]]
        for name in FIGURES:
            if role["figures"].get(name) != other.get(name):
                yield f"{role['role']}, {name}: got {role['figures'].get(name)}, wanted {other.get(name)}"
        minute, other_minute = role.get("worstMinute"), other.get("worstMinute")
        if (minute is None) != (other_minute is None):
            yield f"{role['role']}: worst minute {minute}, wanted {other_minute}"
        elif minute and other_minute and minute["samples"] != other_minute["samples"]:
            yield f"{role['role']}: worst minute {minute}, wanted {other_minute}"


def check_cells(data: dict[str, Any], cells: list[dict[str, Any]]) -> Iterator[str]:
    wanted = {(each["technology"], each["cell"]): each for each in cells if each["cell"]}
    got = {(each["technology"], each["cell"]): each for each in data["cells"]}
    if got.keys() != wanted.keys():
        yield f"cells: got {sorted(got.keys() - wanted.keys())} too, not {sorted(wanted.keys() - got.keys())}"
    for key in got.keys() & wanted.keys():
        for name, role in (("level", "serving.level"), ("quality", "serving.quality")):
            other = next((each for each in wanted[key]["roles"] if each["role"] == role), {"samples": 0})
            for figure in FIGURES:
                if got[key][name].get(figure) != other.get(figure):
                    yield f"{key}, {name}, {figure}: got {got[key][name].get(figure)}, wanted {other.get(figure)}"


def check_events(data: dict[str, Any], events: list[dict[str, Any]]) -> Iterator[str]:
    packed = data["events"]
    times, names = summed(packed["timeSteps"], data["base"]), packed["names"]
    first, got = 0, []
    for i, steps in enumerate(packed["messageSteps"]):
        numbers = summed(steps, first)
        first = numbers[0] if numbers else first
        got.append((times[i], names[packed["kind"][i]], ("info", "warning", "critical")[packed["severity"][i]], numbers))
    wanted = [(nanoseconds(each["time"]) // 10**6, each["kind"], each["severity"],
               [evidence["record"] for evidence in each["evidence"]]) for each in events]
    if sorted(got) != sorted(wanted):
        difference = next((pair for pair in zip(sorted(got), sorted(wanted), strict=False) if pair[0] != pair[1]), None)
        yield f"events: got {len(got)}, wanted {len(wanted)}; first difference {difference}"


def check_numbers(program: Path, recording: Path, data: dict[str, Any]) -> Iterator[str]:
    """For a page of one recording whose numbers are its own."""
    samples = objects(program, "decode", "--samples", "--format", "jsonl", recording)
    stats = document(program, "stats", "--format", "json", recording)[0]
    yield from check_series(data, samples, stats)
    yield from check_roles(data, stats)
    yield from check_cells(data, document(program, "stats", "--by", "cell", "--format", "json", recording))
    yield from check_events(data, objects(program, "events", "--format", "jsonl", recording))
    info = document(program, "info", "--format", "json", recording)
    messages = sum(technology["messages"] for each in info for technology in each.get("technologies", []))
    if data["files"][0]["messages"] != messages:
        yield f"messages: got {data['files'][0]['messages']}, wanted {messages}"
