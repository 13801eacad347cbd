# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The headers that most decoders include and no change touches, compiled once."""

import re
import subprocess
from collections.abc import Mapping, Sequence
from pathlib import Path

from velmora_mutation.build_graph import BuildGraph
from velmora_mutation.source_tree import DECODERS, ROOTS, is_within

STANDARD = ("algorithm", "charconv", "cmath", "functional", "map", "optional")


def common_headers(users: Mapping[str, Sequence[str]], decoders: Sequence[str]) -> list[str]:
    """The headers outside the changed folders that more than half of the decoders' objects use."""
    objects = set(decoders)
    return sorted(
        path
        for path, using in users.items()
        if path.endswith(".h")
        and not is_within(path, ROOTS)
        and 2 * len(objects.intersection(using)) > len(objects)
    )


def header_text(headers: Sequence[str]) -> str:
    """A header that includes them."""
    return "".join(
        f"#include {name}\n" for name in [*(f"<{name}>" for name in STANDARD), *map('"{}"'.format, headers)]
    )


def compile_common_header(graph: BuildGraph, build: Path, tree: Path, header: Path) -> bool:
    """Precompiles the header for the objects of LogGenerator/; False where it would hide a change or fails.

    It would if it took in a file that may be changed: the compiler then skips the changed one.
    """
    decoders = [target for target, made in graph.compilations.items() if is_within(made.source, [DECODERS])]
    header.write_text(header_text(common_headers(graph.users, decoders)), encoding="utf-8")
    command = graph.compilations[decoders[0]].command
    dependencies = header.with_suffix(".d")
    made = header.with_name(header.name + ".gch")
    done = subprocess.run(
        [
            *command[: command.index("-o")],
            "-x",
            "c++-header",
            header,
            "-o",
            made,
            "-MMD",
            "-MF",
            dependencies,
        ],
        cwd=build,
        check=False,
    )
    if done.returncode == 0 and not includes_decoder(dependencies.read_text(encoding="utf-8"), tree):
        return True
    made.unlink(missing_ok=True)
    return False


def includes_decoder(dependencies: str, tree: Path) -> bool:
    """Whether a list of dependencies names a file that may be changed."""
    roots = "|".join(ROOTS)
    return re.search(rf"{re.escape(str(tree))}/(?:{roots})/", dependencies) is not None
