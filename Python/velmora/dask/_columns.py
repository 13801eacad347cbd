# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""`velmora-log columns` over a cluster."""

from __future__ import annotations

import os
import subprocess
from collections.abc import Sequence
from dataclasses import dataclass
from typing import Any, Union

from distributed import Client, get_client

from .._program import Files, Path, message_of, paths_of, program


@dataclass(frozen=True)
class Report:
    """What became of a file."""

    file: str
    status: int  #: 0 done, 1 it was bad, or parts of it were: what could be read of it is written
    text: str  #: "written: 16 tables, 5298904 rows, 19402554 bytes", "there already", "failed"
    errors: str  #: what the program said on standard error

    def __str__(self) -> str:
        return f"{self.file}: {self.text}"


def write_columns(path: str, out: str, options: Sequence[str] = ()) -> Report:
    """Writes the tables of one file: they follow from its content and name alone, whoever writes them, and however
    often. Each appears under its name when it is complete."""
    ended = subprocess.run([program(), "columns", "--out", out, *options, "--", path], stdin=subprocess.DEVNULL,
                           stdout=subprocess.PIPE, stderr=subprocess.PIPE, encoding="utf-8", errors="replace", check=False)
    lines = ended.stdout.splitlines()
    text = lines[0].rpartition(f"{path}: ")[2] if lines else "failed"
    return Report(path, ended.returncode, text, message_of(ended.stderr))


def columns(files: Files, out: Path, *, client: Union[None, Client] = None, options: Sequence[str] = (),
            retries: int = 3) -> list[Report]:
    """Writes the tables of all files to the directory `out`, which every worker has under that name, and returns a
    report for each file, in their order. `options` are further ones of `velmora-log columns`.

    A file whose worker was lost is written by another one, and one whose task failed up to `retries` times more. What
    a killed velmora-log leaves has a name that begins with a dot; no engine reads it, and `velmora-log columns
    --compact` removes it.
    """
    cluster = client if client is not None else get_client()
    futures: list[Any] = cluster.map(write_columns, paths_of(files), out=os.fspath(out), options=list(options),
                                     retries=retries, pure=False)
    reports: list[Report] = cluster.gather(futures)
    return reports
