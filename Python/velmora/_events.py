# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Events: what happened."""

from __future__ import annotations

from collections.abc import Iterable, Iterator
from typing import Any, Union

import pandas as pd

from ._frames import frame_of
from ._program import Files, Losses, objects, paths_of
from ._select import options_of

COMMON = ("time", "end", "state", "kind", "severity", "technology", "text")
#: Of every event, so that a frame has these columns whatever there is in it.
FIELDS = ("from", "to", "value", "cause", "duration")


def event_objects(files: Files, *, kinds: Union[None, str, Iterable[str]] = None, severity: str | None = None,
                  technology: str | None = None, start: str | None = None, end: str | None = None,
                  losses: Losses = "raise") -> Iterator[dict[str, Any]]:
    """The events one by one, as velmora-log writes them (Resources/velmora-log-events.schema.json)."""
    several = [kinds] if isinstance(kinds, str) else list(kinds or ())
    options = [f"--kind={kind}" for kind in several] + options_of(technology, start, end)
    if severity is not None:
        options.append(f"--severity={severity}")
    yield from objects(["events", "--format=jsonl", *options, "--", *paths_of(files)], losses)


def events(files: Files, *, kinds: Union[None, str, Iterable[str]] = None, severity: str | None = None,
           technology: str | None = None, start: str | None = None, end: str | None = None,
           losses: Losses = "raise") -> pd.DataFrame:
    """What happened, a row for each event: its time and end, kind, severity, text, a column for each field, and the
    messages that made it (`file`, `record` of the first; `evidence` has all as pairs). Files that follow each other
    are analysed as one.

    >>> frame = events(recordings / "lte.pcapng", kinds="radio-state")
    >>> frame["text"].iloc[0]
    'RRC: idle to connected'
    >>> frame.attrs["units"]["duration"]
    's'
    """
    columns: dict[str, list[Any]] = {name: [] for name in (*COMMON, *FIELDS, "file", "record", "evidence")}
    units: dict[str, str] = {"duration": "s"}
    found = event_objects(files, kinds=kinds, severity=severity, technology=technology, start=start, end=end,
                          losses=losses)
    for count, event in enumerate(found):
        row = {name: event.get(name) for name in COMMON} | event["fields"]
        evidence = [(each.get("file"), each["record"]) for each in event["evidence"]]
        row["file"], row["record"] = evidence[0] if evidence else (None, None)
        row["evidence"] = evidence
        units.update({name: unit for name, unit in event["units"].items() if name != "value"})
        for name in row.keys() - columns.keys():
            columns[name] = [None] * count
        for name, values in columns.items():
            values.append(row.get(name))
    return frame_of(columns, units)
