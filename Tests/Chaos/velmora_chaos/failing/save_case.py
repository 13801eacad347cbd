# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The application's save."""

from collections.abc import Mapping, Sequence
from pathlib import Path
from typing import ClassVar

from velmora_chaos.checks import expect
from velmora_chaos.failing.case import OLD, Case, Reference
from velmora_chaos.failing.injection import Run

EARLIER = "VelmoraSnapshot-1.velmora"


class SaveCase(Case):
    """Saves one snapshot beside an earlier one; the calls count from the save on."""

    program: ClassVar[str] = "tests/save-once"
    kinds: ClassVar[Sequence[str]] = ("memory", "write", "open")

    def __init__(self) -> None:
        super().__init__("save", ["@"])

    def environment(self) -> Mapping[str, str]:
        return {**super().environment(), "VELMORA_FAIL_ASKED": "1"}

    def prepare(self, work: Path) -> None:
        (work / EARLIER).write_bytes(OLD)

    def check(self, run: Run, work: Path, reference: Reference) -> None:
        expect((work / EARLIER).read_bytes() == OLD, "another snapshot has changed")
        made = [path for path in work.iterdir() if path.name != EARLIER]
        if run.status == 1:
            expect("out of memory" in run.errors, "failed without a message")
            return
        expect(run.status == 0, f"ended with {run.status}, wanted 0 or 1")
        if run.output == "saved; goes on\n":
            expect(len(made) == 1, f"left {[path.name for path in made]}")
            whole = made[0].read_text(encoding="utf-8").endswith("</plist>\n")
            expect(whole, "reported a saved snapshot that is not whole")
        else:
            expect(run.output == "refused; goes on\n", f"printed {run.output!r}")
            expect("<3>Unable to write snapshot to " in run.errors, "no line in the log")
