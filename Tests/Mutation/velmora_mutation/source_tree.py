# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The files of the decoders and the technologies that they belong to, found by the folders."""

from collections.abc import Iterable
from pathlib import Path, PurePosixPath

SOURCE = Path(__file__).resolve().parents[3]
DECODERS = "LogGenerator"
ROOTS = (DECODERS, "LogMessages")  # the folders that are changed
TESTS = tuple(f"Tests/{root}" for root in ROOTS)
SHARED = "shared"


def is_within(path: str, folders: Iterable[str]) -> bool:
    """Whether a path, relative to the source, lies in one of the folders or below."""
    return any(path.startswith(f"{folder}/") for folder in folders)


def decoder_files(tree: Path) -> dict[str, str]:
    """The content of every source and header that may be changed, by its path relative to the tree."""
    files = {}
    for root in ROOTS:
        for path in sorted((tree / root).rglob("*")):
            if path.suffix in (".cpp", ".h"):
                files[path.relative_to(tree).as_posix()] = path.read_text(encoding="utf-8")
    return files


def technologies(paths: Iterable[str]) -> frozenset[str]:
    """The folders of LogGenerator/ that hold a generator, at any depth. What lies elsewhere is shared."""
    found = set()
    for path in map(PurePosixPath, paths):
        if path.parts[0] == DECODERS and len(path.parts) > 2 and path.name.endswith("LogGenerator.h"):
            found.add(path.parts[1])
    return frozenset(found)


def technology_of(path: str, known: frozenset[str]) -> str | None:
    """The technology of a source or of a test; None for what is shared."""
    for folder in (DECODERS, f"Tests/{DECODERS}"):
        if is_within(path, [folder]):
            first = path.removeprefix(f"{folder}/").split("/")[0]
            return first if first in known else None
    return None
