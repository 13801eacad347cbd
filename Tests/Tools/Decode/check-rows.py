#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Works out the rows of `velmora-log decode --format csv --every message` from its JSON lines, and compares them.

check-rows.py VELMORA-LOG RECORDING... Of each recording, of a technology whose lines have sections or displays, every
value of the last display gets a column, and so do rows of lists that are not there, a list, and a value of all rows.
"""

import csv
import io
import json
import subprocess
import sys
from collections.abc import Iterator
from typing import Any


def output(program: str, *arguments: str) -> str:
    return subprocess.run([program, "decode", *arguments], stdout=subprocess.PIPE, stderr=subprocess.DEVNULL,
                          check=True).stdout.decode()


def leaves(value: Any, place: tuple[str, ...] = ()) -> Iterator[tuple[str, ...]]:
    children = value.items() if isinstance(value, dict) else enumerate(value) if isinstance(value, list) else None
    if children is None:
        yield place
    else:
        for name, child in children:
            yield from leaves(child, (*place, str(name)))


def replaced(place: tuple[str, ...], row: str) -> tuple[str, ...]:
    """The place with all its row numbers replaced."""
    return tuple(row if name.isdigit() else name for name in place)


def found(value: Any, place: tuple[str, ...]) -> list[Any]:
    """The values at the place, in order; "*" is any name."""
    if not place:
        return [value]
    name, rest = place[0], place[1:]
    if isinstance(value, dict):
        return [each for key in value if name in ("*", key) for each in found(value[key], rest)]
    if isinstance(value, list):
        return [each for index, row in enumerate(value) if name in ("*", str(index)) for each in found(row, rest)]
    return []


def cell(values: list[Any]) -> str:
    return "; ".join(each if isinstance(each, str) else json.dumps(each, ensure_ascii=False, separators=(",", ":"))
                     for each in values)


def put(display: Any, section: str, node: Any) -> None:
    """Replaces the section, wherever it is."""
    for name in display:
        if name == section:
            display[name] = node
        elif isinstance(display[name], dict):
            put(display[name], section, node)


def emptied(display: Any, sections: set[str]) -> Any:
    """The display before any message concerned these sections."""
    if not isinstance(display, dict):
        return display
    return {name: type(child)() if name in sections else emptied(child, sections)
            for name, child in display.items()}


def check(program: str, path: str) -> int:
    lines = [json.loads(line) for line in output(program, "--format", "jsonl", "--every", "message", path).splitlines()]
    last = json.loads(output(program, "--format", "json", path))["display"]
    places = list(leaves(last))
    rows = [place for place in places if any(name.isdigit() for name in place)]
    places += sorted({replaced(place, "*") for place in rows} | {replaced(place, "77") for place in rows})
    places += [place[:-1] for place in (places[0], places[-1])]
    display: Any = emptied(last, {name for line in lines for name in line.get("sections", {})})
    selection = [word for place in places for word in ("--select", "/" + "/".join(place))]
    table = csv.reader(io.StringIO(output(program, "--format", "csv", "--every", "message", *selection, path)))
    header = next(table)
    assert len(header) == 1 + len(places) and lines, path
    for number, (line, row) in enumerate(zip(lines, table, strict=True), 1):
        display = line.get("display", display)
        for section, node in line.get("sections", {}).items():
            put(display, section, node)
        expected = [line["time"], *(cell(found(display, place)) for place in places)]
        if row != expected:
            wrong = next(i for i, (is_, wanted) in enumerate(zip(row, expected)) if is_ != wanted)
            print(f"{path}: message {number}, {header[wrong]}: {row[wrong]!r}, wanted {expected[wrong]!r}")
            return 1
    print(f"{path}: {len(lines)} rows of {len(places)} cells")
    return 0


if __name__ == "__main__":
    sys.exit(max(check(sys.argv[1], path) for path in sys.argv[2:]))
