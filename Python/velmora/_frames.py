# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Makes data frames."""

from __future__ import annotations

from collections.abc import Iterable, Mapping, Sequence
from typing import Any

import pandas as pd

#: The columns that hold times, in every frame.
TIMES = ("time", "modem_time", "end")


def times(values: Sequence[Any]) -> pd.Series:
    """Nanoseconds, UTC.

    >>> times(["2026-01-05T08:00:00.162000001Z", None]).dtype
    datetime64[ns, UTC]
    """
    return pd.to_datetime(pd.Series(values, dtype=object), utc=True)


def frame_of(columns: Mapping[str, Sequence[Any]], units: Mapping[str, str]) -> pd.DataFrame:
    """A frame of columns of the same length, with their units."""
    made = {name: times(values) if name in TIMES else pd.Series(values, dtype=_type_of(values))
            for name, values in columns.items()}
    frame = pd.DataFrame(made, columns=list(columns))
    frame.attrs["units"] = dict(units)
    return frame


def _type_of(values: Iterable[Any]) -> str:
    """Numbers where all values that there are are numbers.

    >>> _type_of([1, None, 2.5]), _type_of([1, 2]), _type_of([None, "a"]), _type_of([True, None])
    ('float64', 'int64', 'object', 'object')
    """
    kinds = {type(value) for value in values}
    if kinds == {int}:
        return "int64"
    if kinds == {bool}:
        return "bool"
    return "float64" if kinds and kinds <= {int, float, type(None)} else "object"
