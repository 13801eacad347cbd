#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Compares the events and statistics of drives with those of the same drives masked at levels identity and location.

usage: same_analysis.py VELMORA_LOG MAKE_DRIVE [--seeds N] [--first N] [--scenario NAME]...

All times, kinds, severities, counts, durations and numbers have to be the same. Only the values of masked fields may
differ, and these by a permutation: what was the same stays the same, and what was different stays different. Of
their statistics the samples, shares and transitions are compared, without the values. Exit status: 0 all is the same,
1 something differs or a command failed, 2 usage.
"""

from __future__ import annotations

import argparse
import json
import subprocess
import sys
import tempfile
from collections.abc import Iterator
from dataclasses import dataclass, field
from pathlib import Path
from typing import Any

# A round and the beginning of the next.
LENGTHS = {"gsm": "370s", "lte": "155s", "utran": "215s", "c2k": "245s", "ifx": "155s", "modem": "275s"}
KEY = "000102030405060708090a0b0c0d0e0f101112131415161718191a1b1c1d1e1f\n"
CLASSES = {"identity": {"subscriber", "equipment", "address"},
           "location": {"subscriber", "equipment", "address", "location"}}
# What events say of masked values: the field, by which part of the catalogue it is masked.
CELL_FIELDS = {"from.cell": "cell", "to.cell": "cell", "cell": "cell", "from.area": "area", "to.area": "area"}
MASKED_ROLES = {"serving.mcc", "serving.mnc", "serving.area", "serving.cell"}
# The names and codes of networks, which identify no place, but are masked with places.
NETWORKS = {"APN", "MCC", "MNC", "PLMN", "Operator", "Operator PLMN", "Network Name", "EF-ACTING HPLMN",
            "EF-OPERATOR PLMN LIST", "EF-OPLMNAcT", "EF-PLMN NETWORK NAME"}
VALUES = {"minimum", "p5", "p50", "p95", "maximum", "mean", "histogram", "worstMinute"}


@dataclass
class Pairs:
    """Values and their pseudonyms, which have to be one for one."""

    there: dict[tuple[str, str], str] = field(default_factory=dict)
    back: dict[tuple[str, str], str] = field(default_factory=dict)

    def fit(self, sort: str, value: Any, pseudonym: Any) -> bool:
        a, b = json.dumps(value), json.dumps(pseudonym)
        return self.there.setdefault((sort, a), b) == b and self.back.setdefault((sort, b), a) == a


def run(*arguments: str | Path) -> str:
    done = subprocess.run([str(each) for each in arguments], capture_output=True, text=True, check=False)
    # Drives have messages that cannot be decoded, which is status 1 and the same in both.
    if done.returncode not in (0, 1):
        raise SystemExit(f"{' '.join(map(str, arguments))}: exit status {done.returncode}\n{done.stderr}")
    return done.stdout


def objects(text: str) -> list[Any]:
    decoder, found, at = json.JSONDecoder(), [], 0
    text = text.strip()
    while at < len(text):
        value, at = decoder.raw_decode(text, at)
        found.append(value)
        while at < len(text) and text[at].isspace():
            at += 1
    return found


def masked_fields(event: dict[str, Any], level: str) -> dict[str, str]:
    """The fields of an event that have pseudonyms, and what they have in common."""
    names = {"address": "address"}
    if event["kind"] in ("sim-change", "address-change"):
        names |= {"from": event["kind"], "to": event["kind"]}
    if level == "location":
        names |= CELL_FIELDS
        if event["kind"] == "area-update":
            names |= {"from": "stored area", "to": "stored area"}
    return names


def without_values(text: str, fields: dict[str, Any], names: dict[str, str]) -> str:
    for name in sorted(names.keys() & fields.keys(), key=lambda name: -len(str(fields[name]))):
        text = text.replace(str(fields[name]), "<" + names[name] + ">")
    return text


def event_differences(one: dict[str, Any], other: dict[str, Any], level: str, pairs: Pairs) -> Iterator[str]:
    names = masked_fields(one, level)
    for key in sorted(one.keys() | other.keys()):
        if key == "evidence":
            if [each["record"] for each in one[key]] != [each["record"] for each in other[key]]:
                yield f"evidence {one[key]} and {other[key]}"
        elif key == "text":
            texts = [without_values(each["text"], each["fields"], names) for each in (one, other)]
            if texts[0] != texts[1]:
                yield f"text {one[key]!r} and {other[key]!r}"
        elif key != "fields" and one.get(key) != other.get(key):
            yield f"{key} {one.get(key)!r} and {other.get(key)!r}"
    for key in sorted(one["fields"].keys() | other["fields"].keys()):
        values = [each["fields"].get(key) for each in (one, other)]
        if key in names and None not in values:
            if not pairs.fit(names[key], *values):
                yield f"{key}: {values[0]!r} and {values[1]!r} are no pair"
        elif key in ("from", "to"):
            texts = [without_values(str(value), each["fields"], names) for value, each in zip(values, (one, other))]
            if texts[0] != texts[1]:
                yield f"{key} {values[0]!r} and {values[1]!r}"
        elif values[0] != values[1]:
            yield f"{key} {values[0]!r} and {values[1]!r}"


def shape_of_state(state: dict[str, Any]) -> dict[str, Any]:
    values = sorted((each["samples"], each.get("seconds", 0), each.get("share", 0)) for each in state["values"])
    changes = sorted(each["count"] for each in state.get("changes", []))
    return {**state, "values": values, "changes": changes}


def shape_of_group(group: dict[str, Any], masked: set[tuple[str, str]], level: str) -> dict[str, Any]:
    """What has to be the same of a group of statistics."""
    shape = {key: value for key, value in group.items() if key != "cell"}
    shape["roles"] = [{key: value for key, value in row.items() if key not in VALUES}
                      if level == "location" and row["role"] in MASKED_ROLES else row for row in group["roles"]]
    shape["technologies"] = []
    for technology in group["technologies"]:
        name = technology["technology"]
        numbers = [{key: value for key, value in row.items() if key not in VALUES}
                   if (name, row["path"]) in masked else row for row in technology["numbers"]]
        states = [shape_of_state(row) if (name, row["path"]) in masked else row for row in technology["states"]]
        shape["technologies"].append({**technology, "numbers": numbers, "states": states})
    return shape


def differences(one: Any, other: Any, place: str = "") -> Iterator[str]:
    if isinstance(one, dict) and isinstance(other, dict):
        for key in sorted(one.keys() | other.keys()):
            name = one.get("path") or one.get("role") or one.get("technology") or ""
            yield from differences(one.get(key), other.get(key), f"{place}{'/' if place else ''}{name}.{key}")
    elif isinstance(one, list) and isinstance(other, list) and len(one) == len(other):
        for number, pair in enumerate(zip(one, other, strict=True)):
            yield from differences(*pair, f"{place}[{number}]")
    elif one != other:
        yield f"{place}: {str(one)[:200]} and {str(other)[:200]}"


class Comparison:
    def __init__(self, log: Path, drive: Path, folder: Path) -> None:
        self.log, self.drive, self.folder = log, drive, folder
        self.key = folder / "key"
        self.key.write_text(KEY)
        self.key.chmod(0o600)
        rows = json.loads(run(log, "--log-level", "0", "fields", "--format", "json"))["fields"]
        self.masked = {level: {(row["technology"], row["path"]) for row in rows if row.get("identity") in classes}
                       for level, classes in CLASSES.items()}
        self.masked["location"] |= {(row["technology"], row["path"]) for row in rows
                                    if row["path"].rpartition("/")[2] in NETWORKS}

    def events(self, file: Path) -> list[dict[str, Any]]:
        return objects(run(self.log, "--log-level", "0", "events", "--format", "jsonl", file))

    def groups(self, file: Path, *options: str) -> list[dict[str, Any]]:
        return objects(run(self.log, "--log-level", "0", "stats", "--format", "json", *options, file))

    def drive_problems(self, scenario: str, seed: int) -> Iterator[str]:
        original = self.folder / "drive.pcapng"
        run(self.drive, scenario, str(seed), LENGTHS[scenario], original)
        events, totals = self.events(original), self.groups(original)
        cells = self.groups(original, "--by", "cell")
        if not events or not totals or not cells:
            yield f"{scenario} {seed}: nothing to compare"
        for level in CLASSES:
            name = f"{scenario} {seed}, {level}"
            file = self.folder / f"{level}.pcapng"
            run(self.log, "--log-level", "0", "mask", "--force", "--level", level, "--key", self.key, original, file)
            yield from self.list_problems(name, events, self.events(file), level)
            yield from self.statistics_problems(name, totals, self.groups(file), level)
            yield from self.statistics_problems(name + ", by cell", cells, self.groups(file, "--by", "cell"), level)
            marked = objects(run(self.log, "--log-level", "0", "events", "--format", "jsonl", f"--mask={level}",
                                 "--key", self.key, original))
            for event in marked:
                for each in event["evidence"]:
                    each.pop("file", None)
            for event in (masked := self.events(file)):
                for each in event["evidence"]:
                    each.pop("file", None)
            if marked != masked:
                yield f"{name}: events --mask has other events than the masked file"

    def list_problems(self, name: str, one: list[Any], other: list[Any], level: str) -> Iterator[str]:
        if len(one) != len(other):
            yield f"{name}: {len(one)} events and {len(other)}"
        pairs = Pairs()
        for a, b in zip(one, other):
            for problem in event_differences(a, b, level, pairs):
                yield f"{name}: {a['kind']} at {a['time']}: {problem}"

    def statistics_problems(self, name: str, one: list[Any], other: list[Any], level: str) -> Iterator[str]:
        if len(one) != len(other):
            yield f"{name}: {len(one)} groups and {len(other)}"
        masked = self.masked[level]
        for a, b in zip(one, other):
            for problem in differences(shape_of_group(a, masked, level), shape_of_group(b, masked, level)):
                yield f"{name}: {a.get('cell')}: {problem}"


def main() -> int:
    parser = argparse.ArgumentParser(usage=__doc__.split("\n\n")[1].removeprefix("usage: "))
    parser.add_argument("log", type=Path)
    parser.add_argument("drive", type=Path)
    parser.add_argument("--seeds", type=int, default=2)
    parser.add_argument("--first", type=int, default=1)
    parser.add_argument("--scenario", action="append", choices=LENGTHS)
    options = parser.parse_args()
    count = 0
    with tempfile.TemporaryDirectory(prefix="same-analysis-") as folder:
        comparison = Comparison(options.log, options.drive, Path(folder))
        for scenario in options.scenario or LENGTHS:
            for seed in range(options.first, options.first + options.seeds):
                for problem in comparison.drive_problems(scenario, seed):
                    count += 1
                    if count <= 40:
                        print(problem)
    print(f"{count} differences")
    return 1 if count else 0


if __name__ == "__main__":
    sys.exit(main())
