# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Recording from the telephony service."""

import tempfile
import threading
from collections.abc import Mapping, Sequence
from pathlib import Path
from typing import ClassVar

from velmora_chaos.checks import expect
from velmora_chaos.failing.case import OLD, Case, Reference
from velmora_chaos.failing.injection import Run
from velmora_chaos.failing.recording import messages
from velmora_chaos.sandbox import Sandbox


class RecordCase(Case):
    """Records until a limit. Each run has a service to itself, and so the drive from its start: each thread
    keeps one.

    All runs end by themselves: without a limit, a recorder without a port retries every five seconds.
    """

    kinds: ClassVar[Sequence[str]] = ("memory", "write", "open", "sync")
    waits: ClassVar[bool] = True

    def __init__(self, had: bool, name: str, limit: Sequence[str]) -> None:
        made = "drive.pcapng"
        super().__init__(
            f"record {name}{' over another' if had else ''}",
            ["record", *(["--force"] if had else []), *limit, f"@{made}"],
            made=made,
            had=had,
        )
        self._own = threading.local()
        self._sandboxes: list[Sandbox] = []
        self._build = Path()
        self._directory = Path()

    def begin(self, build: Path, directory: Path) -> None:
        self._build = build
        self._directory = directory

    def end(self) -> None:
        for sandbox in self._sandboxes:
            sandbox.close()

    def environment(self) -> Mapping[str, str]:
        if not hasattr(self._own, "environment"):
            sandbox = Sandbox(self._build, Path(tempfile.mkdtemp(dir=self._directory)))
            self._sandboxes.append(sandbox)
            sandbox.service("scenario:gsm,seed=1,speed=20")
            # GLib, which Qt's event loop uses otherwise, aborts the program when an allocation fails.
            self._own.environment = {**sandbox.environment, "QT_NO_GLIB": "1"}
        environment: Mapping[str, str] = self._own.environment
        return environment

    def check_output(self, run: Run, reference: Reference) -> None:
        """The output names durations, which differ from run to run."""

    def check_file(self, run: Run, content: bytes | None, reference: Reference) -> None:
        """Whatever is recorded is the drive from its start without a gap."""
        if content is None or content == OLD:
            expect(run.status != 0, "exited with status 0, without a recording")
            expect((content == OLD) == self.had, "lost the file that was there")
            return
        expect(len(content) > 0, "left an empty file")
        assert reference.made is not None
        recorded = messages(content)
        wanted = messages(reference.made)
        common = min(len(recorded), len(wanted))
        expect(recorded[:common] == wanted[:common], "the messages differ from the drive's")
        if run.status == 0:
            expect(common > 0, "exited with status 0, without a message")
