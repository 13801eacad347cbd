# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""A terminal of others for the checks of screens: tmux."""

from __future__ import annotations

import re
import subprocess
import tempfile
import time
from pathlib import Path

SKIPPED = 77
PATIENCE = 60.0  # seconds; a machine may be busy


def cut(text: str, columns: int) -> str:
    return text if len(text) <= columns else text[: columns - 1] + "…"


def expect(shown: str, wanted: str, what: str) -> None:
    if shown.rstrip() != wanted.rstrip():
        raise AssertionError(f"{what}:\nshown:  {shown!r}\nwanted: {wanted!r}")


class Terminal:
    """A program in tmux."""

    def __init__(self, command: list[str], columns: int, rows: int) -> None:
        self._folder = tempfile.TemporaryDirectory()
        self._tmux = ["tmux", "-S", str(Path(self._folder.name) / "socket"), "-f", "/dev/null"]
        subprocess.run([*self._tmux, "new-session", "-d", "-x", str(columns), "-y", str(rows), "env", "LC_ALL=C.UTF-8", *command],
                       check=True)

    def close(self) -> None:
        subprocess.run([*self._tmux, "kill-server"], check=False, capture_output=True)
        self._folder.cleanup()

    def press(self, *keys: str) -> None:
        subprocess.run([*self._tmux, "send-keys", *keys], check=True)

    def screen(self) -> list[str]:
        shown = subprocess.run([*self._tmux, "capture-pane", "-p", "-N"], check=True, capture_output=True, text=True).stdout
        return shown.split("\n")[:-1]

    def wait_for(self, text: str) -> list[str]:
        """The screen once it has the text and no work is going on."""
        end = time.monotonic() + PATIENCE
        before: list[str] = []
        while time.monotonic() < end:
            lines = self.screen()
            # Twice the same: one that is being drawn is part old, part new.
            is_whole, before = lines == before, lines
            if is_whole and any(text in line for line in lines) and not re.search(r"reading,|finding events,", lines[-1]):
                return lines
            time.sleep(0.1)
        raise TimeoutError(f"{text!r} was not shown:\n" + "\n".join(self.screen()))
