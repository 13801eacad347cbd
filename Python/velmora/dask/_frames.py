# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Bags and data frames, a partition for each file."""

from __future__ import annotations

from typing import Any, Union
from collections.abc import Iterable

import dask
import dask.bag
import dask.dataframe
import pandas as pd

from .._events import events as events_of
from .._program import Files, Losses, paths_of
from .._samples import sample_objects
from .._samples import samples as samples_of
from .._select import Select


def bag(files: Files, select: Select = None, **options: Any) -> dask.bag.Bag:
    """The samples as dictionaries, as velmora-log writes them. Options are those of `velmora.samples`."""
    return dask.bag.from_delayed([dask.delayed(_objects)(path, select, options) for path in paths_of(files)])


def samples(files: Files, select: Select = None, **options: Any) -> dask.dataframe.DataFrame:
    """As `velmora.samples`, of files whose frames have the columns of the first one's: with `select`, those of one
    technology. Columns that a file has not are empty, further ones are left out."""
    paths = paths_of(files)
    model = samples_of(paths[0], select, **options)
    made = [dask.delayed(_samples)(path, select, options, _empty(model)) for path in paths]
    return dask.dataframe.from_delayed(made, meta=_empty(model), verify_meta=False)


def events(files: Files, *, kinds: Union[None, str, Iterable[str]] = None, severity: str | None = None,
           technology: str | None = None, losses: Losses = "raise") -> dask.dataframe.DataFrame:
    """As `velmora.events`, but each file is analysed by itself. It has the columns of the first file's."""
    paths = paths_of(files)
    options: dict[str, Any] = {"kinds": kinds, "severity": severity, "technology": technology, "losses": losses}
    model = events_of(paths[0], **options)
    made = [dask.delayed(_events)(path, options, _empty(model)) for path in paths]
    return dask.dataframe.from_delayed(made, meta=_empty(model), verify_meta=False)


def _empty(frame: pd.DataFrame) -> pd.DataFrame:
    """Its columns without rows. Whole numbers are real ones where a file may have none."""
    empty = frame.iloc[:0]
    return empty.astype({name: "float64" for name, kind in empty.dtypes.items() if kind == "int64"})


def _like(frame: pd.DataFrame, model: pd.DataFrame) -> pd.DataFrame:
    return frame.reindex(columns=model.columns).astype(dict(model.dtypes))


def _objects(path: str, select: Select, options: dict[str, Any]) -> list[dict[str, Any]]:
    return list(sample_objects(path, select, **options))


def _samples(path: str, select: Select, options: dict[str, Any], model: pd.DataFrame) -> pd.DataFrame:
    return _like(samples_of(path, select, **options), model)


def _events(path: str, options: dict[str, Any], model: pd.DataFrame) -> pd.DataFrame:
    return _like(events_of(path, **options), model)
