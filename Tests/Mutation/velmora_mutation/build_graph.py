# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""How the objects and test programs of a build tree are made, as Ninja and the compilation database say."""

import shlex
from collections.abc import Iterable, Mapping, Sequence
from dataclasses import dataclass
from pathlib import Path
from typing import Any

from velmora_mutation.source_tree import ROOTS, TESTS, is_within, technology_of

WIDE = 20  # a header that more objects than these use takes long to try
PROGRAM_RULE = "CXX_EXECUTABLE_LINKER"


@dataclass(frozen=True)
class Compilation:
    """The command that makes an object, and its source relative to the source tree."""

    command: Sequence[str]
    source: str


@dataclass(frozen=True)
class BuildGraph:
    """Compilations by object, users (the objects made of a file) by path, link commands by test program."""

    technologies: frozenset[str]
    compilations: Mapping[str, Compilation]
    users: Mapping[str, Sequence[str]]
    links: Mapping[str, Sequence[str]]

    def is_decoder(self, target: str) -> bool:
        """Whether an object is made of a file that may be changed; they all lie in static libraries."""
        return is_within(self.compilations[target].source, ROOTS)

    def is_wide(self, path: str) -> bool:
        """Whether so many objects use a header that it is tried with one technology after the other."""
        return path.endswith(".h") and len(self.users.get(path, [])) > WIDE

    def technology_of(self, path: str) -> str | None:
        """The technology of a source; None for what is shared."""
        return technology_of(path, self.technologies)

    def program_technology(self, program: str) -> str | None:
        """The one technology that a test program's own sources belong to; None for a program of several."""
        sources = [
            self.compilations[word].source for word in self.links[program] if word in self.compilations
        ]
        found = {self.technology_of(source) for source in sources if is_within(source, TESTS)}
        return found.pop() if len(found) == 1 else None

    def programs_for(self, path: str) -> list[str]:
        """The test programs that a change of the file is tried with, the likeliest to notice first.

        A technology's own, then the shared ones; where it has none of its own, and for what is shared, all.
        """
        technology = self.technology_of(path)
        of_program = {program: self.program_technology(program) for program in sorted(self.links)}
        own = [program for program, of in of_program.items() if of == technology and technology]
        shared = [program for program, of in of_program.items() if of is None]
        others = [program for program in of_program if program not in own and program not in shared]
        return own + shared + ([] if own else others)

    def is_tested_by(self, source: str, program: str) -> bool:
        """Whether a program is the first choice for a source: shared sources suit all, others their own."""
        technology = self.technology_of(source)
        return technology is None or program in self.programs_for(source)[:1]


def parse_compilations(entries: Iterable[Mapping[str, Any]], tree: Path) -> dict[str, Compilation]:
    """The compilations of compile_commands.json by object, relative to the build tree."""
    found = {}
    for entry in entries:
        command = shlex.split(entry["command"])
        source = Path(entry["file"]).resolve()
        if source.is_relative_to(tree):
            found[command[command.index("-o") + 1]] = Compilation(
                command, source.relative_to(tree).as_posix()
            )
    return found


def parse_users(lines: Iterable[str], tree: Path, objects: Iterable[str]) -> dict[str, list[str]]:
    """The objects made of each file of the tree, from the output of `ninja -t deps`."""
    known = set(objects)
    relative: dict[str, str | None] = {}  # resolving a path asks the file system
    users: dict[str, list[str]] = {}
    target = ""
    for line in lines:
        if line and not line[0].isspace():
            target = line.split(": #deps")[0]
        elif target in known and line.strip():
            name = line.strip()
            if name not in relative:
                path = Path(name).resolve()
                relative[name] = path.relative_to(tree).as_posix() if path.is_relative_to(tree) else None
            used = relative[name]
            if used:
                users.setdefault(used, []).append(target)
    return users


def parse_programs(lines: Iterable[str]) -> list[str]:
    """The executables of the tests folder, from the output of `ninja -t targets all`."""
    targets = (line.split(": ") for line in lines if line.startswith("tests/"))
    return sorted(target for target, rule in targets if rule.startswith(PROGRAM_RULE))


def parse_link(line: str, program: str) -> list[str]:
    """The command that links a program, out of the commands that a build step joins with &&."""
    words = shlex.split(line)
    starts = [0, *(i + 1 for i, word in enumerate(words) if word == "&&")]
    for start in starts:
        end = words.index("&&", start) if "&&" in words[start:] else len(words)
        command = words[start:end]
        if "-o" in command and command[command.index("-o") + 1] == program:
            return command
    raise ValueError(f"no command that links {program}: {line}")


def tests_decoders(link: Iterable[str], compilations: Mapping[str, Compilation]) -> bool:
    """Whether a program has sources in the folders of the decoders' tests."""
    return any(word in compilations and is_within(compilations[word].source, TESTS) for word in link)
