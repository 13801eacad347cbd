# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Converting a recording."""

from collections.abc import Sequence
from typing import ClassVar

from velmora_chaos.failing.case import Case
from velmora_chaos.sandbox import RECORDINGS


class ConvertCase(Case):
    """Converts one of the example recordings to a file, over another with `had`."""

    kinds: ClassVar[Sequence[str]] = ("memory", "read", "write", "open", "sync", "rename")

    def __init__(self, source: str, made: str, had: bool) -> None:
        super().__init__(
            f"convert {source} to {made}{' over another' if had else ''}",
            ["convert", *(["--force"] if had else []), str(RECORDINGS / source), f"@{made}"],
            made=made,
            had=had,
            # The recordings have messages that a DLF log cannot hold.
            status=1 if made.endswith(".dlf") else 0,
        )
