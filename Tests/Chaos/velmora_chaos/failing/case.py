# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The work of a program that is repeated with failures, and what it may leave."""

import os
from collections.abc import Mapping, Sequence
from dataclasses import dataclass
from pathlib import Path
from typing import ClassVar

from velmora_chaos.checks import expect
from velmora_chaos.failing.injection import Run
from velmora_chaos.sandbox import SOURCE

OLD = b"what was there before\n"


@dataclass(frozen=True)
class Reference:
    """The run without a failure, and the content of the file that it made."""

    run: Run
    made: bytes | None


class Case:
    """A command of velmora-log. In its arguments "@" stands for the work directory and a slash.

    `made` names the file that it writes there, if any; with `had`, a file of that name is there before. The
    exit status without a failure is `status`.
    """

    program: ClassVar[str] = "velmora-log"
    kinds: ClassVar[Sequence[str]] = ("memory", "read", "write", "open")
    waits: ClassVar[bool] = False  # whether a run mostly waits, so that many fit on a machine

    def __init__(
        self, name: str, arguments: Sequence[str], made: str | None = None, had: bool = False, status: int = 0
    ) -> None:
        self.name = name
        self.made = made
        self.had = had
        self.status = status
        self._arguments = arguments

    def begin(self, build: Path, directory: Path) -> None:
        """Called once before the first run; the directory is for what the runs share."""

    def end(self) -> None:
        """Called once after the last run."""

    def environment(self) -> Mapping[str, str]:
        """The environment of a run; may be called on any thread."""
        return {
            "VELMORA_RESOURCES": str(SOURCE / "Resources"),
            **os.environ,
            "QT_QPA_PLATFORM": "offscreen",
            "VELMORA_REDUCED_MOTION": "1",
        }

    def arguments(self, work: Path) -> list[str]:
        """The arguments of a run in a work directory."""
        return [word.replace("@", f"{work}/") for word in self._arguments]

    def prepare(self, work: Path) -> None:
        """Fills the empty work directory of a run."""
        if self.made and self.had:
            (work / self.made).write_bytes(OLD)

    def content(self, work: Path) -> bytes | None:
        """The file that a run made; None if there is none."""
        path = work / self.made if self.made else None
        return path.read_bytes() if path and path.exists() else None

    def check(self, run: Run, work: Path, reference: Reference) -> None:
        """Raises Problem for an outcome that no failure excuses."""
        if run.status == 0:
            self.check_output(run, reference)
        else:
            expect(run.status == 1, f"ended with {run.status}, wanted 0 or 1")
            expect("velmora-log: " in run.errors, "failed without a message")
        if self.made:
            left = sorted(path.name for path in work.iterdir())
            expect(left in ([], [self.made]), f"left {left}")
            self.check_file(run, self.content(work), reference)

    def check_output(self, run: Run, reference: Reference) -> None:
        """Checks the standard output of a run that exited with status 0."""
        expect(run.output == reference.run.output, "exited with status 0, with another output")

    def check_file(self, run: Run, content: bytes | None, reference: Reference) -> None:
        """Checks the file: whole, the old one or the new one."""
        if run.status == 0:
            expect(content == reference.made, "exited with status 0, with another file")
        else:
            length = 0 if content is None else len(content)
            allowed = [OLD if self.had else None, reference.made]
            expect(content in allowed, f"left {length} bytes that are neither the old file nor the new one")
