# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Runs a program as a whole process, and takes its time."""

import os
import subprocess
import tempfile
import time
from dataclasses import dataclass
from pathlib import Path


@dataclass(frozen=True)
class Runner:
    """Runs programs on one core, each with a home directory that has nothing in it, so that no plugin loads."""

    core: int
    resources: Path
    counts_wall: bool = False

    def environment(self, home: str) -> dict[str, str]:
        return dict(os.environ, HOME=home, XDG_CONFIG_HOME=home, VELMORA_RESOURCES=str(self.resources),
                    PYTHONHASHSEED="0", TZ="UTC")

    def seconds(self, command: list[str]) -> float:
        """Of the process and its children; what it writes is thrown away."""
        with tempfile.TemporaryDirectory() as home:
            begin = time.monotonic()
            process = subprocess.Popen(self.pinned(command), stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL,
                                       stderr=subprocess.DEVNULL, env=self.environment(home))
            _, status, usage = os.wait4(process.pid, 0)
            wall = time.monotonic() - begin
        process.returncode = os.waitstatus_to_exitcode(status)
        if process.returncode != 0:
            raise RuntimeError(f"{' '.join(command)}: exit status {process.returncode}")
        return wall if self.counts_wall else float(usage.ru_utime + usage.ru_stime)

    def output(self, command: list[str]) -> bytes:
        with tempfile.TemporaryDirectory() as home:
            return subprocess.run(self.pinned(command), stdin=subprocess.DEVNULL, stdout=subprocess.PIPE,
                                  stderr=subprocess.DEVNULL, env=self.environment(home), check=True).stdout

    def pinned(self, command: list[str]) -> list[str]:
        return ["taskset", "-c", str(self.core), *command]
