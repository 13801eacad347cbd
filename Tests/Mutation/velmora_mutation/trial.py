# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Compiles a change, links it in front of the unchanged libraries, and runs the tests."""

import itertools
import shutil
import subprocess
from collections.abc import Iterator, Mapping, Sequence
from pathlib import Path

from velmora_mutation.build_graph import BuildGraph
from velmora_mutation.changes import Change
from velmora_mutation.common_header import compile_common_header
from velmora_mutation.source_tree import DECODERS, is_within
from velmora_mutation.tally import Outcome
from velmora_mutation.test_runner import measure_limits, passes
from velmora_mutation.workspace import Workspace


class Laboratory:
    """Tries changes; may be used by several threads, each with a lane (a directory) of its own."""

    def __init__(self, workspace: Workspace) -> None:
        self._tree = workspace.tree
        self._build = workspace.build
        self._directory = workspace.directory
        self.graph: BuildGraph = workspace.graph
        header = workspace.directory / "common.h"
        precompiled = compile_common_header(self.graph, self._build, self._tree, header)
        self._common = ["-include", str(header)] if precompiled else []
        self._limits: Mapping[str, float] = measure_limits(self.graph.links, self._build, workspace.directory)

    def try_change(self, change: Change, lane_number: int) -> Outcome:
        """What becomes of a change."""
        lane = self._directory / f"lane-{lane_number}"
        shutil.rmtree(lane, ignore_errors=True)
        overlay = lane / "overlay" / change.path
        overlay.parent.mkdir(parents=True)
        overlay.write_text(change.changed, encoding="utf-8")
        compiled: dict[str, Path | None] = {}
        # A mutant that seems to survive in a header is tried again with all its users recompiled.
        rounds = [False, True] if change.path.endswith(".h") else [False]
        for all_users, program in itertools.product(rounds, self.graph.programs_for(change.path)):
            for target in self._objects(change.path, program, all_users):
                if target not in compiled:
                    compiled[target] = self._compile(change.path, lane, target)
                if compiled[target] is None:
                    return Outcome.NOT_COMPILED
            made = {target: path for target, path in compiled.items() if path}
            if not passes(self._link(program, lane, made), lane, self._limits[program]):
                return Outcome.NOTICED
        return Outcome.SURVIVED

    def _objects(self, path: str, program: str, all_users: bool) -> Iterator[str]:
        """The objects to recompile for a test program. Without optimization the linker takes an inline
        function from the first object that has it; so those are mostly enough that include the file directly
        or are decoders, since others use only what is computed when they are compiled."""
        linked = set(self.graph.links[program])
        for target in self.graph.users.get(path, []):
            source = self.graph.compilations[target].source
            if self.graph.is_decoder(target):
                wanted = all_users or not self.graph.is_wide(path) or self.graph.is_tested_by(source, program)
            else:
                wanted = target in linked and (all_users or self._includes(source, path))
            if wanted:
                yield target

    def _includes(self, source: str, header: str) -> bool:
        return f'#include "{header}"' in (self._tree / source).read_text(encoding="utf-8")

    def _compile(self, path: str, lane: Path, target: str) -> Path | None:
        """The object with the change; None where it does not compile."""
        compilation = self.graph.compilations[target]
        overlay = lane / "overlay"
        made = lane / target.replace("/", "_")
        command = list(compilation.command)
        command[command.index("-o") + 1] = str(made)
        if compilation.source == path:
            command[-1] = str(overlay / path)
        command[1:1] = [f"-I{overlay}", *(self._common if is_within(compilation.source, [DECODERS]) else [])]
        done = subprocess.run(command, cwd=self._build, check=False, stderr=subprocess.DEVNULL)
        return made if done.returncode == 0 else None

    def _link(self, program: str, lane: Path, made: Mapping[str, Path]) -> Path:
        """The test program with the changed objects."""
        linked = lane / Path(program).name
        decoders = {target: path for target, path in made.items() if self.graph.is_decoder(target)}
        command = link_with(self.graph.links[program], made, decoders, linked)
        subprocess.run(command, cwd=self._build, check=True)
        return linked


def link_with(
    link: Sequence[str], made: Mapping[str, Path], decoders: Mapping[str, Path], output: Path
) -> list[str]:
    """A link command with changed objects: in place of the ones that it names, and before all others those of
    the decoders' libraries, so that the linker does not take the unchanged ones out of them. What was made
    for another program is left out."""
    command = list(link)
    command[command.index("-o") + 1] = str(output)
    first = next(i for i, word in enumerate(command) if word.endswith(".o"))
    of_libraries = [str(path) for target, path in decoders.items() if target not in command]
    command = [str(made.get(word, word)) for word in command]
    command[first:first] = of_libraries
    return command
