# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Paths of the display, as the functions take them."""

from __future__ import annotations

import re
from collections.abc import Iterable, Mapping
from typing import Union

#: A path, "name=path", several of them, or names with their paths.
Select = Union[None, str, Iterable[str], Mapping[str, str]]


def arguments_of(select: Select) -> list[str]:
    """The options of velmora-log.

    >>> arguments_of({"level": "/GSM/GSM Serving Cell/RSSI"})
    ['--select=level=/GSM/GSM Serving Cell/RSSI']
    """
    if select is None:
        return []
    if isinstance(select, str):
        select = [select]
    named = [f"{name}={path}" for name, path in select.items()] if isinstance(select, Mapping) else select
    return [f"--select={each}" for each in named]


def options_of(technology: str | None, start: str | None, end: str | None) -> list[str]:
    """Those that several commands have.

    >>> options_of("LTE", None, "+60")
    ['--technology=LTE', '--to=+60']
    """
    given = {"technology": technology, "from": start, "to": end}
    return [f"--{name}={value}" for name, value in given.items() if value is not None]


def pattern_of(path: str) -> str:
    """A value's path as the catalogue has it, with a * for the number of a row.

    >>> pattern_of("/GSM/Neighboring Cells/3/RSSI")
    '/GSM/Neighboring Cells/*/RSSI'
    """
    return re.sub(r"/[0-9]+(?=/)", "/*", path)
