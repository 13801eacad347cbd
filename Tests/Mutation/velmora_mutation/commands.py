# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Running commands."""

import subprocess
from collections.abc import Sequence
from pathlib import Path


def output_lines(command: Sequence[str | Path], directory: Path) -> list[str]:
    """The standard output of a command that must succeed."""
    done = subprocess.run(command, cwd=directory, check=True, stdout=subprocess.PIPE, text=True)
    return done.stdout.splitlines()
