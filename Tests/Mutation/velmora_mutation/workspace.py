# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""A copy of the source tree, and its build without a change."""

import json
import shutil
import subprocess
from pathlib import Path

from velmora_mutation.build_graph import (
    BuildGraph,
    parse_compilations,
    parse_link,
    parse_programs,
    parse_users,
    tests_decoders,
)
from velmora_mutation.commands import output_lines
from velmora_mutation.source_tree import decoder_files, technologies


class Workspace:
    """Lies in a directory of its own: `tree` is the copy, `build` what is built of it, `graph` how."""

    def __init__(self, source: Path, directory: Path) -> None:
        self.directory = directory
        self.tree = directory / "tree"
        self.build = directory / "build"
        self.tree.mkdir(parents=True, exist_ok=True)
        self.tree = self.tree.resolve()
        copy_tree(source, self.tree)
        self._configure()
        self.graph = self._build()

    def _configure(self) -> None:
        if (self.build / "build.ninja").exists():
            return
        linker = ["-DCMAKE_EXE_LINKER_FLAGS=-fuse-ld=lld"] if shutil.which("ld.lld") else []
        options = ["-DCMAKE_BUILD_TYPE=", "-DCMAKE_CXX_FLAGS=-O0", "-DCMAKE_CXX_COMPILER_LAUNCHER="]
        subprocess.run(
            [
                "cmake",
                "-S",
                self.tree,
                "-B",
                self.build,
                "-G",
                "Ninja",
                *options,
                "-DVELMORA_BENCHMARKS=OFF",
                *linker,
            ],
            check=True,
            stdout=subprocess.DEVNULL,
        )

    def _build(self) -> BuildGraph:
        """Builds the tests of the decoders."""
        subprocess.run(["ninja", "--quiet", "build.ninja"], cwd=self.build, check=True)
        entries = json.loads((self.build / "compile_commands.json").read_text(encoding="utf-8"))
        compilations = parse_compilations(entries, self.tree)
        links = {}
        for program in parse_programs(output_lines(["ninja", "-t", "targets", "all"], self.build)):
            steps = output_lines(["ninja", "-t", "commands", "-s", program], self.build)
            link = parse_link(steps[-1], program)
            if tests_decoders(link, compilations):
                links[program] = link
        subprocess.run(["ninja", "--quiet", *links], cwd=self.build, check=True)
        dependencies = output_lines(["ninja", "-t", "deps"], self.build)
        return BuildGraph(
            technologies=technologies(decoder_files(self.tree)),
            compilations=compilations,
            users=parse_users(dependencies, self.tree, compilations),
            links=links,
        )


def copy_tree(source: Path, tree: Path) -> None:
    """Makes the tree a copy of the source's files, ignored ones left out.

    Files that are the same stay untouched, so that what is built of them stays valid; others are removed.
    """
    listed = output_lines(["git", "ls-files", "--cached", "--others", "--exclude-standard"], source)
    wanted = {name for name in listed if (source / name).is_file()}
    for name in sorted(wanted):
        copy = tree / name
        if not copy.exists() or copy.read_bytes() != (source / name).read_bytes():
            copy.parent.mkdir(parents=True, exist_ok=True)
            shutil.copy(source / name, copy)
    for path in list(tree.rglob("*")):
        if path.is_file() and path.relative_to(tree).as_posix() not in wanted:
            path.unlink()
