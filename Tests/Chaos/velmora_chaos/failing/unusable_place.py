# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""A program in a place that it cannot work in, and the message that it prints about it."""

import shutil
import subprocess
from collections.abc import Mapping, Sequence
from dataclasses import dataclass, field
from pathlib import Path

from velmora_chaos.checks import expect
from velmora_chaos.failing.case import OLD
from velmora_chaos.failing.injection import LIMIT_S
from velmora_chaos.sandbox import SOURCE, Sandbox


@dataclass(frozen=True)
class UnusablePlace:
    """A command in an unusable place; "@" stands for a directory of its own and a slash.

    The directory holds a regular file named "file", which must not change, and "resources", which cannot be
    written. The texts are looked for on standard error and in the output.
    """

    name: str
    command: Sequence[str]
    status: int
    texts: Sequence[str]
    environment: Mapping[str, str] = field(default_factory=dict)
    output: Path | None = None  # instead of a file that is read
    is_closed: bool = False  # whether the descriptors 0 to 2 are closed, so that nothing is printed

    def check(self, build: Path, directory: Path) -> None:
        """Runs the command; raises Problem for another status, a missing text or a changed file."""
        file = directory / "file"
        file.write_bytes(OLD)
        copy_read_only(SOURCE / "Resources", directory / "resources")
        output = self.output or directory / "output"
        placed = {key: self._placed(value, directory) for key, value in self.environment.items()}
        with Sandbox(build, directory) as sandbox, output.open("w", encoding="utf-8") as stream:
            ended = subprocess.run(
                self._started(build, directory),
                env={**sandbox.environment, **placed},
                stdout=stream,
                stderr=subprocess.PIPE,
                text=True,
                errors="replace",
                timeout=LIMIT_S,
                check=False,
            )
        printed = ended.stderr if self.output else ended.stderr + output.read_text(encoding="utf-8")
        problem = f"{self.name}: ended with {ended.returncode}, wanted {self.status}\n{ended.stderr}"
        expect(ended.returncode == self.status, problem)
        for text in self.texts:
            wanted = self._placed(text, directory)
            expect(wanted in printed, f"{self.name}: did not print {wanted}\n{ended.stderr}")
        if self.is_closed:
            expect(not printed, f"{self.name}: printed {printed}")
        expect(file.read_bytes() == OLD, f"{self.name}: a file has changed")

    def _started(self, build: Path, directory: Path) -> list[str]:
        words = [str(build / self.command[0]), *(self._placed(word, directory) for word in self.command[1:])]
        return ["/bin/sh", "-c", 'exec "$@" <&- >&- 2>&-', "sh", *words] if self.is_closed else words

    @staticmethod
    def _placed(word: str, directory: Path) -> str:
        return word.replace("@", f"{directory}/")


def remove_read_only(directory: Path) -> None:
    """Removes a directory although folders in it cannot be written."""
    for path in directory.rglob("*"):
        if path.is_dir():
            path.chmod(0o700)
    shutil.rmtree(directory)


def copy_read_only(source: Path, copy: Path) -> None:
    """Copies a folder; its owner can read the copy and nothing else."""
    shutil.copytree(source, copy)
    for path in [*copy.rglob("*"), copy]:
        path.chmod(0o500 if path.is_dir() else 0o400)
