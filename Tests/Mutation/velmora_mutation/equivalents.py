# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The list of changes that no test can detect, and whether the sources still have them."""

import re
from collections.abc import Iterable, Mapping, Sequence
from dataclasses import dataclass
from pathlib import PurePosixPath

from velmora_mutation.changes import ChangeKey, changes_of

COMMENT = re.compile(r"(?m)^#.*\n")
ENTRY = re.compile(r"file: (.+)\nfrom: (.+)\nto:(.*)\nwhy: ((?s:.+))")


class MalformedList(Exception):
    """An entry of the list cannot be read."""


@dataclass(frozen=True)
class Outdated:
    """An entry that does not fit the sources any more, why, and where its file is if one candidate fits."""

    key: ChangeKey
    reason: str
    moved_to: str | None = None

    def __str__(self) -> str:
        hint = f"; it may be {self.moved_to} now" if self.moved_to else ""
        return f"{self.key.path}: {self.reason}{hint}\n    - {self.key.before}\n    + {self.key.after}"


def parse_equivalents(text: str) -> list[ChangeKey]:
    """The entries of the list; raises MalformedList for one that is not complete or that repeats another."""
    entries: list[ChangeKey] = []
    listed = COMMENT.sub("", text).strip()
    for block in re.split(r"\n\s*\n", listed) if listed else []:
        rows = ENTRY.fullmatch(block)
        if not rows:
            raise MalformedList(f"not the rows file, from, to and why:\n{block}")
        entries.append(ChangeKey(rows[1], rows[2], rows[3].strip()))
        if entries[-1] in entries[:-1]:
            raise MalformedList(f"listed twice:\n{block}")
    return entries


def find_outdated(entries: Iterable[ChangeKey], files: Mapping[str, str]) -> list[Outdated]:
    """The entries that are no change of the files (content by path) any more, in the order of the list."""
    possible = {path: {change.key for change in changes_of(path, text)} for path, text in files.items()}
    found = []
    for key in entries:
        if key in possible.get(key.path, set()):
            continue
        candidates = [
            path
            for path, keys in possible.items()
            if path != key.path and is_same_name(path, key.path) and key._replace(path=path) in keys
        ]
        found.append(Outdated(key, reason(key, files), candidates[0] if len(candidates) == 1 else None))
    return found


def is_same_name(path: str, other: str) -> bool:
    """Whether two paths end in the same file name."""
    return PurePosixPath(path).name == PurePosixPath(other).name


def reason(key: ChangeKey, files: Mapping[str, str]) -> str:
    """Why an entry is no change of the files."""
    if key.path not in files:
        return "the file does not exist"
    if key.before not in " ".join(files[key.path].split()):
        return "the line does not exist"
    return "the line is not changed in this way"


def follow_moves(text: str, outdated: Sequence[Outdated]) -> str:
    """The list with the new path in every entry whose file was moved."""
    moved = {each.key: each.moved_to for each in outdated if each.moved_to}

    def replace(row: re.Match[str]) -> str:
        path = moved.get(ChangeKey(row[1], row[2], row[3].strip()), row[1])
        return f"file: {path}\nfrom: {row[2]}\nto:{row[3]}\n"

    return re.sub(r"(?m)^file: (.+)\nfrom: (.+)\nto:(.*)\n", replace, text)
