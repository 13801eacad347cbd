# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Every number of the page's data, compared with what other commands say of the same recording."""

import html
import json
import re
import subprocess
from collections import defaultdict
from collections.abc import Iterator
from datetime import datetime, timezone
from pathlib import Path
from typing import Any

from .static import data_of

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


ROW = re.compile(r"<tr><td>([^<]*)</td><td>[^<]*</td><td>[^<]*</td><td class=\"n\">([^<]*)</td>(?:<td class=\"n\">[^<]*</td>){6}"
                 r"<td>([^\n]*?)</td><td>([^\n]*?)</td></tr>")
NUMBER = re.compile(r"#(\d+)")


def check_ranges(page: str, samples: list[dict[str, Any]]) -> Iterator[str]:
    """The figures of a field name the first and the last message that reported it, and those of its extremes."""
    values: dict[str, list[tuple[int, float]]] = defaultdict(list)
    for sample in samples:
        if isinstance(sample["value"], int | float) and not isinstance(sample["value"], bool):
            values[pattern(sample["path"])].append((sample["record"], sample["value"]))
    found = 0
    for name, count, messages, extremes in ROW.findall(page):
        reported = values.get(html.unescape(name))
        if not reported:
            continue
        found += 1
        records = [record for record, _ in reported]
        wanted = [min(records), max(records)] if min(records) != max(records) else [records[0]]
        got = [int(number) for number in NUMBER.findall(messages)]
        if got != wanted or int(count.replace(",", "")) != len(reported):
            yield f"{name}: {count} samples in messages {got}, wanted {len(reported)} in {wanted}"
        values_at = dict(reported)
        least, greatest = (int(number) for number in NUMBER.findall(extremes))
        if least not in values_at or greatest not in values_at:
            yield f"{name}: the messages of the extremes, {least} and {greatest}, did not report it"
    if found < 3:
        yield f"only {found} fields have figures with messages"


def check_shares(page: str, messages: int) -> Iterator[str]:
    """Each share of time has its messages, of which one share has the first of all and one the last."""
    table = page.partition("<caption>Time by radio technology and level class")[2].partition("</table>")[0]
    rows = table.partition("<tbody>")[2].split("</tr>")[:-1]
    ranges = [[int(number) for number in NUMBER.findall(row)] for row in rows]
    if not rows or not all(ranges) or any(numbers != sorted(numbers) for numbers in ranges):
        yield f"the shares of time have the messages {ranges}"
    elif min(numbers[0] for numbers in ranges) > 20 or max(numbers[-1] for numbers in ranges) < messages - 20:
        yield f"the shares of time have the messages {ranges}, of {messages}"


def check_numbers(program: Path, recording: Path, page: str) -> Iterator[str]:
    """For a page of one recording whose numbers are its own."""
    data = data_of(page)
    samples = objects(program, "decode", "--samples", "--format", "jsonl", recording)
    stats = document(program, "stats", "--format", "json", recording)[0]
    yield from check_series(data, samples, stats)
    yield from check_roles(data, stats)
    yield from check_ranges(page, samples)
    yield from check_cells(data, document(program, "stats", "--by", "cell", "--format", "json", recording))
    yield from check_events(data, objects(program, "events", "--format", "jsonl", recording))
    info = document(program, "info", "--format", "json", recording)
    messages = sum(technology["messages"] for each in info for technology in each.get("technologies", []))
    yield from check_shares(page, messages)
    if data["files"][0]["messages"] != messages:
        yield f"messages: got {data['files'][0]['messages']}, wanted {messages}"
