# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Displays: the texts that the screens show."""

from __future__ import annotations

from collections.abc import Iterator
from typing import Any

import pandas as pd

from ._frames import frame_of
from ._program import Files, Losses, objects, paths_of
from ._samples import MESSAGE
from ._select import Select, arguments_of, options_of


def decode(files: Files, select: Select = None, *, technology: str | None = None, start: str | None = None,
           end: str | None = None, losses: Losses = "raise") -> pd.DataFrame:
    """The display as it stood every 2 s, a row for each refresh and a column for each path. Its values are the texts
    that the screens show, with their units: those of `samples` are numbers. A named path is a column of that name.

    >>> frame = decode(recordings / "gsm.pcapng", select="/Registration/Process CS/MM State")
    >>> frame["/Registration/Process CS/MM State"].iloc[0]
    'MM_IDLE'
    """
    paths = paths_of(files)
    names = _names(select)
    # The names are given to columns here: displays have their paths.
    options = arguments_of(list(names) or None) + options_of(technology, start, end)
    columns: dict[str, list[Any]] = {name: [] for name in (*MESSAGE.values(), "messages") if name != "record"}
    del columns["modem_time"]
    fixed = len(columns)
    for count, refresh in enumerate(objects(["decode", "--format=jsonl", *options, "--", *paths], losses)):
        row = {name: refresh.get(name) for name in list(columns)[:fixed]}
        row["file"] = refresh.get("file", paths[0])
        row.update({names.get(path, path): text for path, text in _leaves(refresh["display"], "")})
        for name in row.keys() - columns.keys():
            columns[name] = [None] * count
        for name, values in columns.items():
            values.append(row.get(name))
    return frame_of(columns, {})


def _names(select: Select) -> dict[str, str]:
    """The selected paths with the names of their columns.

    >>> _names(["level=/GSM/RSSI", "/GSM/Band"])
    {'/GSM/RSSI': 'level', '/GSM/Band': '/GSM/Band'}
    """
    found = {}
    for argument in arguments_of(select):
        name, separator, path = argument.removeprefix("--select=").partition("=/")
        found["/" + path if separator else name] = name
    return found


def _leaves(node: Any, path: str) -> Iterator[tuple[str, Any]]:
    """The texts of a display with their paths.

    >>> list(_leaves({"GSM": {"Band": "850", "Cells": [{"RSSI": "-71 dBm"}]}}, ""))
    [('/GSM/Band', '850'), ('/GSM/Cells/0/RSSI', '-71 dBm')]
    """
    if isinstance(node, dict):
        for name, value in node.items():
            yield from _leaves(value, f"{path}/{name}")
    elif isinstance(node, list):
        for index, value in enumerate(node):
            yield from _leaves(value, f"{path}/{index}")
    else:
        yield path, node
