# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The catalogue of all fields."""

from __future__ import annotations

from functools import cache
from typing import Any

import pandas as pd

from ._frames import frame_of
from ._program import document

COLUMNS = ("technology", "path", "section", "kind", "unit", "role", "identity", "clause")


def fields(technology: str | None = None, *, role: str | None = None) -> pd.DataFrame:
    """Every field that displays can show, a row each; `values` has the texts of an enumeration's numbers, `codes` the
    log codes that report it.

    >>> frame = fields("LTE", role="serving.level")
    >>> frame["path"].iloc[0], frame["unit"].iloc[0]
    ('/Serving Cell/Serving Cell Measurements/Measured RSRP', 'dBm')
    """
    options = [] if technology is None else [f"--technology={technology}"]
    if role is not None:
        options.append(f"--role={role}")
    columns: dict[str, list[Any]] = {name: [] for name in (*COLUMNS, "codes", "values")}
    for field in document(["fields", "--format=json", *options])["fields"]:
        sources = field.get("sources", [])
        for name in COLUMNS:
            columns[name].append(field.get(name))
        columns["codes"].append(sorted({source["code"] for source in sources if "code" in source}))
        columns["values"].append({each["value"]: each["text"] for source in sources
                                  for each in source.get("values", [])})
    return frame_of(columns, {})


@cache
def enumerations() -> frozenset[str]:
    """The paths whose values are numbers that stand for texts.

    >>> "/Registration/Process CS/MM State" in enumerations()
    True
    """
    found = document(["fields", "--format=json"])["fields"]
    return frozenset(field["path"] for field in found if field["kind"] == "enumeration")
