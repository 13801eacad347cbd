# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Making the page of a recording."""

from collections.abc import Sequence
from typing import ClassVar

from velmora_chaos.failing.case import Case
from velmora_chaos.sandbox import RECORDINGS


class ReportCase(Case):
    """Makes the page of one of the example recordings, over another file with `had`: it is complete or not there."""

    kinds: ClassVar[Sequence[str]] = ("memory", "read", "write", "open", "sync", "rename")

    def __init__(self, source: str, had: bool) -> None:
        super().__init__(
            f"report of {source}{' over another file' if had else ''}",
            ["report", *(["--force"] if had else []), str(RECORDINGS / source), "-o", "@page.html"],
            made="page.html",
            had=had,
        )
