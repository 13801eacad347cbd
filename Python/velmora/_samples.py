# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Samples: the values that messages report."""

from __future__ import annotations

import re
from collections.abc import Iterator
from typing import Any

import pandas as pd

from ._fields import enumerations
from ._frames import frame_of
from ._program import Files, Losses, objects, paths_of
from ._select import Select, arguments_of, options_of, pattern_of

POSITION = {"latitude": "°", "longitude": "°", "altitude": "m", "speed": "m/s", "fixAge": "s", "hdop": "",
            "deviation": "m"}
#: What each sample has, by the name that the program gives it.
MESSAGE = {"file": "file", "technology": "technology", "time": "time", "modemTime": "modem_time", "record": "record"}


def sample_objects(files: Files, select: Select = None, *, positions: bool = False, technology: str | None = None,
                   start: str | None = None, end: str | None = None,
                   losses: Losses = "raise") -> Iterator[dict[str, Any]]:
    """The samples one by one, as velmora-log writes them (Resources/velmora-log.schema.json), with their file."""
    paths = paths_of(files)
    options = arguments_of(select) + options_of(technology, start, end) + (["--positions"] if positions else [])
    for sample in objects(["decode", "--samples", "--format=jsonl", *options, "--", *paths], losses):
        sample.setdefault("file", paths[0])
        yield sample


def samples(files: Files, select: Select = None, *, positions: bool = False, technology: str | None = None,
            start: str | None = None, end: str | None = None, losses: Losses = "raise") -> pd.DataFrame:
    """What messages reported, in the catalogue's units and signs.

    Without `select` a row for each value: `path`, `row` (the key of a list's row), `value` (of an enumeration its
    number), `unit`, `text` (as it is shown), `code`. With it a row for each message, and each row of a list, that
    reported a selected value, and a column for each name or path; enumerations are texts there. `positions` adds
    where the message arrived, `technology`, `start` and `end` are `--technology`, `--from` and `--to`. Where a file
    has losses, `losses` raises InputError or warns.

    >>> frame = samples(recordings / "lte.pcapng")
    >>> frame["path"].iloc[0], frame["unit"].iloc[2]
    ('/Idle Mode Neighbors/Neighbor Measurements/Version', 'dBm')
    >>> samples(recordings / "lte.pcapng", select="/Nowhere")
    Traceback (most recent call last):
        ...
    velmora._errors.UsageError: --select: "/Nowhere" ...
    """
    found = sample_objects(files, select, positions=positions, technology=technology, start=start, end=end,
                           losses=losses)
    return _long(found, positions) if select is None else _wide(found, positions)


def _names(positions: bool) -> dict[str, str]:
    names = dict(MESSAGE)
    if positions:
        names.update({name: "fix_age" if name == "fixAge" else name for name in POSITION})
    return names


def _units(positions: bool) -> dict[str, str]:
    return {_names(True)[name]: unit for name, unit in POSITION.items() if unit} if positions else {}


def _long(found: Iterator[dict[str, Any]], positions: bool) -> pd.DataFrame:
    names = _names(positions) | {each: each for each in ("path", "row", "value", "unit", "text", "code")}
    columns: dict[str, list[Any]] = {name: [] for name in names.values()}
    for sample in found:
        for key, name in names.items():
            columns[name].append(sample.get(key))
    return frame_of(columns, _units(positions))


def _wide(found: Iterator[dict[str, Any]], positions: bool) -> pd.DataFrame:
    names = _names(positions)
    common: dict[str, list[Any]] = {name: [] for name in (*names.values(), "row")}
    leaves: dict[str, dict[int, Any]] = {}
    units = _units(positions)
    latest: tuple[Any, ...] | None = None
    count = 0
    for sample in found:
        leaf = sample.get("name", pattern_of(sample["path"]))
        place = (sample["file"], sample["record"], sample.get("row"), _row_of(sample["path"]))
        if place != latest or count - 1 in leaves.get(leaf, {}):
            for key, name in names.items():
                common[name].append(sample.get(key))
            common["row"].append(sample.get("row"))
            latest = place
            count += 1
        is_text = sample["value"] is not None and pattern_of(sample["path"]) in enumerations()
        leaves.setdefault(leaf, {})[count - 1] = sample["text"] if is_text else sample["value"]
        if "unit" in sample:
            units[leaf] = sample["unit"]
    columns = common | {leaf: [values.get(row) for row in range(count)] for leaf, values in leaves.items()}
    return frame_of(columns, units)


def _row_of(path: str) -> str:
    """The path of the list's row that a value is in, or nothing."""
    match = re.match(r".*/[0-9]+(?=/)", path)
    return match.group() if match else ""

