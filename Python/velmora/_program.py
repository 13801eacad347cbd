# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Runs velmora-log."""

from __future__ import annotations

import json
import os
import shutil
import subprocess
import tempfile
import warnings
from collections.abc import Iterable, Iterator, Sequence
from typing import Any, Literal, Union

from ._errors import InputError, InputWarning, UsageError, VelmoraError

Path = Union[str, "os.PathLike[str]"]
Files = Union[Path, Iterable[Path]]
Losses = Literal["raise", "warn"]

_BAD_INPUT = 1
_USAGE = 2
_SEVERE = 3  # events of the asked severity were found


def program() -> str:
    """The program's path."""
    found = os.environ.get("VELMORA_LOG") or shutil.which("velmora-log")
    if found is None:
        raise VelmoraError("velmora-log is not installed, and VELMORA_LOG does not name it")
    return found


def paths_of(files: Files) -> list[str]:
    """One file or several as arguments.

    >>> paths_of("a.pcapng")
    ['a.pcapng']
    >>> paths_of(["-v.pcapng", "b.pcapng"])
    ['./-v.pcapng', 'b.pcapng']
    """
    several = [files] if isinstance(files, (str, os.PathLike)) else list(files)
    paths = [os.fspath(each) for each in several]
    if not paths:
        raise UsageError("got no file, wanted at least one")
    return [f"./{path}" if path.startswith("-") else path for path in paths]


def message_of(errors: str) -> str:
    r"""What the program said: its own lines, or those of the decoders where there are no others.

    >>> message_of("<3>2 times: Invalid log type: 2. Dropping.\nvelmora-log: a.pcapng: cannot open\n")
    'a.pcapng: cannot open'
    """
    own = [line for line in errors.splitlines() if not line.startswith("<")]
    return "\n".join(line.removeprefix("velmora-log: ") for line in own or errors.splitlines())


def lines(arguments: Sequence[str], losses: Losses = "raise") -> Iterator[str]:
    """The lines of its standard output as they come. Raises at their end where it failed."""
    if losses not in ("raise", "warn"):
        raise ValueError(f'losses is "{losses}", wanted "raise" or "warn"')
    with tempfile.TemporaryFile("w+", errors="replace") as errors:
        try:
            process = subprocess.Popen([program(), *arguments], stdin=subprocess.DEVNULL, stdout=subprocess.PIPE,
                                       stderr=errors, encoding="utf-8")
        except OSError as error:
            raise VelmoraError(f"velmora-log cannot be started: {error.strerror}") from error
        assert process.stdout is not None
        try:
            yield from process.stdout
            status = process.wait()
        finally:
            # Where the caller has stopped, or an exception passes.
            process.kill()
            process.wait()
            process.stdout.close()
        errors.seek(0)
        _check(status, message_of(errors.read()), losses)


def _check(status: int, message: str, losses: Losses) -> None:
    if status in (0, _SEVERE):
        return
    if status == _BAD_INPUT and losses == "warn":
        warnings.warn(message, InputWarning, stacklevel=5)
    elif status == _BAD_INPUT:
        raise InputError(message, status)
    elif status == _USAGE:
        raise UsageError(message, status)
    else:
        raise VelmoraError(message or f"velmora-log ended with status {status}", status)


def objects(arguments: Sequence[str], losses: Losses = "raise") -> Iterator[dict[str, Any]]:
    """Its lines of JSON."""
    for line in lines(arguments, losses):
        yield json.loads(line)


def document(arguments: Sequence[str]) -> Any:
    """All of its output as one value of JSON."""
    return json.loads("".join(lines(arguments)))
