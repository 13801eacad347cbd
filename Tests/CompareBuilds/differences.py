# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Compares, counts, and shows what differs."""

import filecmp
import itertools
import shlex
import shutil
import tempfile
import threading
from pathlib import Path

from .running import Case, Outcome, run

KEPT = 20  # differences of which the outputs are kept
WIDTH = 200


def shown(line: bytes | None) -> str:
    if line is None:
        return "(the end)"
    text = line.rstrip(b"\n").decode(errors="backslashreplace")
    text = "".join(each if each.isprintable() else f"\\x{ord(each):02x}" for each in text)
    return text if len(text) <= WIDTH else text[:WIDTH] + "..."


def first_difference(before: Path, after: Path) -> str:
    """The first differing line of both, with the line before it; of long lines what is around the difference."""
    last = b""
    with before.open("rb") as a, after.open("rb") as b:
        for number, (one, other) in enumerate(itertools.zip_longest(a, b), 1):
            if one == other:
                last = one or b""
                continue
            at = 0
            if one is not None and other is not None:
                at = next((i for i, (x, y) in enumerate(zip(one, other)) if x != y), min(len(one), len(other)))
            start = max(0, at - 60)
            return (f"  line {number}, byte {at + 1}:\n      {shown(last)}\n"
                    f"    - {shown(one and one[start:])}\n    + {shown(other and other[start:])}")
    return "  the same when run again: the output is not the same from run to run"


class Comparison:
    def __init__(self, before: Path, after: Path, keep: Path | None, ignored: frozenset[str] = frozenset()) -> None:
        self.before, self.after = before, after
        self._keep = keep
        self._ignored = ignored
        self._lock = threading.Lock()
        self.count = self.differing = 0

    def compare(self, case: Case) -> None:
        one, other = (self._compared(run(build, case)) for build in (self.before, self.after))
        with self._lock:
            self.count += 1
        if one != other:
            with self._lock:
                self.differing += 1
                self._report(case, one, other)

    def _compared(self, outcome: Outcome) -> Outcome:
        digests = {name: digest for name, digest in outcome.digests.items() if name not in self._ignored}
        return Outcome(outcome.status, digests)

    def note(self, what: str, one: bytes, other: bytes) -> None:
        """Compares what has been gathered already."""
        with self._lock:
            self.count += 1
            if one == other:
                return
            self.differing += 1
            directory = self._directory()
            for side, content in (("before", one), ("after", other)):
                (directory / f"{side}.watch").write_bytes(content)
            print(f"DIFFERENT: {what}\n{first_difference(directory / 'before.watch', directory / 'after.watch')}\n"
                  f"  kept in {directory}", flush=True)

    def fail(self, what: str) -> None:
        """Counts what could not be compared as a difference."""
        with self._lock:
            self.count += 1
            self.differing += 1
            print(f"NOT COMPARED: {what}", flush=True)

    def _directory(self) -> Path:
        if not self._keep:
            self._keep = Path(tempfile.mkdtemp(prefix="compare-builds-kept-"))
        directory = self._keep / f"{self.differing:03}"
        directory.mkdir(parents=True, exist_ok=True)
        return directory

    def _report(self, case: Case, one: Outcome, other: Outcome) -> None:
        redirection = f" < {case.stdin}" if case.stdin else ""
        print(f"DIFFERENT: velmora-log {shlex.join(case.arguments)}{redirection}")
        if one.status != other.status:
            print(f"  exit status {one.status}, then {other.status}")
        if self.differing > KEPT:
            print("  not kept: enough are", flush=True)
            return
        directory = self._directory()
        run(self.before, case, directory, "before")
        run(self.after, case, directory, "after")
        for what, digest in one.digests.items():
            if digest != other.digests.get(what):
                sides = [directory / f"{side}.{what}" for side in ("before", "after")]
                for missing in sides:
                    missing.touch()
                print(f"  {what}:\n{first_difference(*sides)}")
        # Inputs that were made for this run are removed after it.
        for word in (*case.arguments, str(case.stdin or "")):
            made = Path(word)
            if made.is_absolute() and made.is_file() and made.is_relative_to(tempfile.gettempdir()):
                shutil.copy(made, directory)
        for side in directory.glob("before.*"):
            twin = directory / side.name.replace("before", "after", 1)
            if twin.exists() and filecmp.cmp(side, twin, shallow=False):
                side.unlink()
                twin.unlink()
        print(f"  kept in {directory}", flush=True)
