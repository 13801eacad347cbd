# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Writing the columns of a recording."""

import hashlib
import json
from collections.abc import Sequence
from pathlib import Path
from typing import ClassVar

from velmora_chaos.checks import expect
from velmora_chaos.failing.case import Case, Reference
from velmora_chaos.failing.injection import Run
from velmora_chaos.sandbox import RECORDINGS


class ColumnsCase(Case):
    """Writes the tables of one of the example recordings: each of their files is complete or absent."""

    kinds: ClassVar[Sequence[str]] = ("memory", "read", "write", "open", "sync", "rename")

    def __init__(self, source: str) -> None:
        super().__init__(f"columns of {source}", ["columns", "--out", "@columns", str(RECORDINGS / source)],
                         made="columns")

    def content(self, work: Path) -> bytes | None:
        """The hashes of all files, by their names."""
        root = work / "columns"
        return json.dumps({str(path.relative_to(root)): hashlib.sha256(path.read_bytes()).hexdigest()
                           for path in sorted(root.rglob("*")) if path.is_file()}).encode()

    def check_file(self, run: Run, content: bytes | None, reference: Reference) -> None:
        """Checks that there is nothing but complete files, and all of them where there was no failure."""
        assert content is not None and reference.made is not None
        left, whole = json.loads(content), json.loads(reference.made)
        if run.status == 0:
            expect(left == whole, "exited with status 0, with other files")
        for name, digest in left.items():
            expect(whole.get(name) == digest, f"left {name}, which is not complete")
