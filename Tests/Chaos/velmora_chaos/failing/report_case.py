# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Making the page of a recording."""

from collections.abc import Sequence
from typing import ClassVar

from velmora_chaos.checks import expect
from velmora_chaos.failing.case import Case, Reference
from velmora_chaos.failing.injection import Run
from velmora_chaos.sandbox import RECORDINGS


class ReportCase(Case):
    """Makes the page of one of the example recordings, over another file with `had`: it is complete or not there. Of a
    recording that cannot be read to its end it is complete, too, and says so; rules that cannot be read are reported
    and left out, so that there are none here."""

    kinds: ClassVar[Sequence[str]] = ("memory", "read", "write", "open", "sync", "rename")

    def __init__(self, source: str, had: bool) -> None:
        super().__init__(
            f"report of {source}{' over another file' if had else ''}",
            ["report", "--no-rules", *(["--force"] if had else []), str(RECORDINGS / source), "-o", "@page.html"],
            made="page.html",
            had=had,
        )

    def check_file(self, run: Run, content: bytes | None, reference: Reference) -> None:
        """Checks that the page is the whole one, or with a failure one of what could be read, never a part of one."""
        whole = content is not None and content.startswith(b"<!DOCTYPE html>") and content.endswith(b"</html>\n")
        if run.status == 0 or not whole:
            super().check_file(run, content, reference)
        else:
            expect(bool(run.errors), "exited with a failure that it does not name")
