# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Runs one command with one build and reduces what came of it to what is compared."""

import hashlib
import os
import re
import subprocess
import tempfile
import threading
from dataclasses import dataclass, field
from pathlib import Path
from typing import IO

CHUNK = 1 << 20
TIME_LIMIT_S = 900

# Where objects lie in memory differs from run to run; the log says it of a few. Addresses have 12 digits, 10 in an
# emulated arm64 program; log codes are shorter.
ADDRESS = re.compile(rb"\b0x[0-9a-f]{10,12}\b")
# The build stamp: 18 bytes at offset 63 of the version report that begins a DLF log (length 161, code 0x1FFD), and
# 24 characters at character 84 of the same in a snapshot's base64. The time and the version beside it are compared:
# a conversion takes its time from the recording.
REPORT = bytes.fromhex("a100fd1f")
STAMP = slice(63, 81)
STAMP_IN_BASE64 = re.compile(rb"(<data>\s*oQD9H(?:\s*[A-Za-z0-9+/]){79})(?:\s*[A-Za-z0-9+/]){24}")


@dataclass(frozen=True)
class Case:
    """A command line of velmora-log, without the program."""

    arguments: tuple[str, ...]
    product: str | None = None  # a file that the command makes in its working directory
    stdin: Path | None = None


@dataclass
class Outcome:
    status: int
    digests: dict[str, str] = field(default_factory=dict)


class Tap(threading.Thread):
    """Reads a pipe to its end into a digest, and into a file where there is one."""

    def __init__(self, stream: IO[bytes], normalised: bool, copy: Path | None) -> None:
        super().__init__(daemon=True)
        self._stream, self._normalised, self._copy = stream, normalised, copy
        self._digest = hashlib.sha256()

    def run(self) -> None:
        with self._stream, open(self._copy or os.devnull, "wb") as file:
            rest = b""
            while chunk := self._stream.read(CHUNK):
                if self._normalised:
                    whole, newline, rest = (rest + chunk).rpartition(b"\n")
                    chunk = ADDRESS.sub(b"ADDRESS", whole + newline)
                self._put(chunk, file)
            self._put(ADDRESS.sub(b"ADDRESS", rest), file)

    def _put(self, chunk: bytes, file: IO[bytes]) -> None:
        self._digest.update(chunk)
        file.write(chunk)

    def result(self) -> str:
        self.join()
        return self._digest.hexdigest()


def without_stamp(suffix: str, chunk: bytes) -> bytes:
    if suffix == ".dlf" and chunk.startswith(REPORT):
        return chunk[: STAMP.start] + bytes(STAMP.stop - STAMP.start) + chunk[STAMP.stop :]
    return STAMP_IN_BASE64.sub(rb"\1STAMP", chunk) if suffix == ".velmora" else chunk


def product_digest(path: Path, copy: Path | None) -> str:
    if not path.exists():
        return "missing"
    digest = hashlib.sha256()
    with path.open("rb") as file, open(copy or os.devnull, "wb") as kept:
        # A snapshot is read completely: the text may be anywhere in it.
        chunk = without_stamp(path.suffix, file.read(-1 if path.suffix == ".velmora" else CHUNK))
        while chunk:
            digest.update(chunk)
            kept.write(chunk)
            chunk = file.read(CHUNK)
    return digest.hexdigest()


def environment(**more: str) -> dict[str, str]:
    """Of the caller's own settings none that the programs read."""
    kept = {name: value for name, value in os.environ.items()
            if not name.startswith(("VELMORA_", "XDG_", "LC_", "LANG"))}
    return kept | {"TZ": "UTC", "LC_ALL": "C.UTF-8", "XDG_CONFIG_HOME": "/nonexistent"} | more


def run(build: Path, case: Case, keep: Path | None = None, side: str = "") -> Outcome:
    """With `keep`, what is compared is written there too, as `side`.stdout and so on."""
    def copy(what: str) -> Path | None:
        return keep / f"{side}.{what}" if keep else None

    with tempfile.TemporaryDirectory(prefix="compare-builds-") as directory:
        with open(case.stdin or os.devnull, "rb") as stdin:
            process = subprocess.Popen([str(build / "velmora-log"), *case.arguments], cwd=directory, env=environment(),
                                       stdin=stdin, stdout=subprocess.PIPE, stderr=subprocess.PIPE)
        assert process.stdout and process.stderr
        taps = {"stdout": Tap(process.stdout, False, copy("stdout")),
                "stderr": Tap(process.stderr, True, copy("stderr"))}
        for tap in taps.values():
            tap.start()
        try:
            process.wait(TIME_LIMIT_S)
        except subprocess.TimeoutExpired:
            process.kill()
        outcome = Outcome(process.wait(), {name: tap.result() for name, tap in taps.items()})
        if case.product:
            outcome.digests[case.product] = product_digest(Path(directory, case.product), copy(case.product))
    return outcome
