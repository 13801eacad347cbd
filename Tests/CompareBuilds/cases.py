# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The commands that an input is tried with."""

import json
import re
import subprocess
from collections.abc import Iterator
from pathlib import Path
from typing import Any

from .inputs import RECORDINGS, TECHNOLOGIES, Input
from .running import Case, environment

COLUMNS = 24
MANY_COLUMNS = 100
PRODUCTS = ("out.pcapng", "out.velmora", "out.dlf")
SORTED = "_sorted"


def leaves(value: Any, path: str = "") -> Iterator[str]:
    """The paths by which --select finds what the JSON shows. The keys of a sorted dictionary begin with what they
    are sorted by, which is no part of a path."""
    if isinstance(value, dict):
        for key, child in value.items():
            if key != SORTED:
                yield from leaves(child, f"{path}/{key.split(';', 1)[-1] if SORTED in value else key}")
    elif isinstance(value, list):
        for index, child in enumerate(value):
            yield from leaves(child, f"{path}/{index}")
    else:
        yield path


def columns(display: str) -> list[str]:
    """Of the display's values some from its beginning to its end, two groups, and a row that is not there."""
    found = list(leaves(json.loads(display)["display"]))
    spread = found[:: max(1, len(found) // COLUMNS)]
    groups = sorted({path.rpartition("/")[0] for path in found} - {""})
    missing = [re.sub(r"/\d+(?=/|$)", "/4095", path, count=1) for path in found if re.search(r"/\d+(/|$)", path)]
    return spread + groups[:1] + groups[-1:] + missing[:1]


def further_columns(display: str) -> Iterator[list[str]]:
    """Selections of other kinds: many values; lists and any of their rows; all groups; the whole display beside a
    value; and one value, so that most of the display is not selected."""
    found = list(leaves(json.loads(display)["display"]))
    rows = [path for path in found if re.search(r"/\d+(/|$)", path)]
    lists = {re.sub(r"/\d+(/.*|$)", "", path) for path in rows} - {""}
    anywhere = {re.sub(r"/\d+(?=/|$)", "/*", path) for path in rows}
    yield found[:: max(1, len(found) // MANY_COLUMNS)][:MANY_COLUMNS]
    yield sorted(lists | anywhere)[:MANY_COLUMNS] or ["/*"]
    yield sorted({path.rpartition("/")[0] for path in found} - {""})[:COLUMNS] or ["/*"]
    yield ["/", found[-1]]
    yield [found[len(found) // 2]]
    yield ["/*/" + found[0].rpartition("/")[2], *found[-2:]]


def selected(paths: list[str]) -> tuple[str, ...]:
    return tuple(word for path in paths for word in ("--select", path))


def cases_of_columns(given: Input, selections: list[list[str]]) -> Iterator[Case]:
    """Rows by each of these selections, and what else is selected by the first two and the last one."""
    file = str(given.path)
    rows = ("decode", "--format", "csv")
    for paths in selections:
        yield Case((*rows, "--every", "message", *selected(paths), file))
    for paths in (*selections[:2], selections[-1]):
        chosen = (*selected(paths), file)
        yield Case((*rows, "--safe", "--max-age", "5", *chosen))
        yield Case(("decode", "--format", "jsonl", "--every", "message", *chosen))
        yield Case(("decode", "--samples", "--wide", "--format", "csv", *chosen))
    yield Case(("--log-level", "7", *rows, "--every", "message", *selected(selections[-1]), file))
    yield Case(("decode", "--format", "json", *selected(selections[1]), file))
    yield Case(("decode", "--samples", "--format", "csv", *selected(selections[1]), file))


def cases(given: Input, paths: list[str]) -> Iterator[Case]:
    file = str(given.path)
    every = ("--every", "message")
    csv = ("decode", "--format", "csv", *selected(paths))
    for arguments in (("decode", "--format", "text"), ("decode", "--format", "json"), ("decode", "--format", "jsonl"),
                      ("decode", "--format", "jsonl", *every), csv, (*csv, *every), ("info",)):
        yield Case((*arguments, file))
    for product in PRODUCTS:
        yield Case(("convert", file, product), product)
    if not given.short:
        return
    verbose = ("--log-level", "7")
    group = "/" + paths[0].split("/")[1]
    yield Case((*verbose, "decode", "--format", "text", file))
    yield Case((*verbose, "decode", "--format", "jsonl", *every, file))
    yield Case((*verbose, "info", file))
    yield Case((*verbose, "convert", file, "out.velmora"), "out.velmora")
    yield Case(("decode", "--select", group, file))
    yield Case(("decode", "--format", "json", *selected(paths[:3]), file))
    yield Case(("decode", "--format", "jsonl", *every, "--select", group, file))
    yield Case(("decode", "--format", "jsonl", *every, "--from", "+10", "--to", "+60", file))
    yield Case(("decode", "--technology", TECHNOLOGIES[given.scenario], "-"), stdin=given.path)


def cases_of_all_recordings() -> Iterator[Case]:
    files = [str(RECORDINGS / f"{scenario}.pcapng") for scenario in TECHNOLOGIES]
    for form in ("text", "json", "jsonl"):
        for jobs in ("1", "3"):
            yield Case(("decode", "--format", form, "--jobs", jobs, *files))
    # What one technology's decoder makes of another's messages.
    for file in files:
        for technology in TECHNOLOGIES.values():
            yield Case(("decode", "--format", "json", "--technology", technology, file))
            yield Case(("info", "--technology", technology, file))


def converted(build: Path, given: Input, directory: Path) -> Iterator[Input]:
    """The recording in its other forms."""
    for suffix in (".velmora", ".dlf"):
        path = directory / f"{given.path.stem}{suffix}"
        subprocess.run([build / "velmora-log", "convert", given.path, path], stderr=subprocess.DEVNULL,
                       env=environment(), check=False)
        if path.exists():
            yield Input(path, given.scenario, True)
