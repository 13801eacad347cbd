# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Repeats the cases with one failure after the other and collects the problems."""

import shutil
import tempfile
from collections.abc import Sequence
from concurrent.futures import Executor, Future
from dataclasses import dataclass, field
from pathlib import Path

from velmora_chaos.checks import Problem, expect
from velmora_chaos.failing.case import Case, Reference
from velmora_chaos.failing.injection import Injection, Run, counting, injections, run_injected, sampled_calls
from velmora_chaos.failing.unusable_place import UnusablePlace, remove_read_only

ERRORS_SHOWN = 2000  # characters of standard error


@dataclass(frozen=True)
class Extent:
    """A sample of the allocations fails, or each of them; with one error of each kind, or all."""

    sample: int
    all_allocations: bool
    first_error_only: bool

    def calls(self, kind: str, calls: int) -> Sequence[int]:
        """The calls that fail, of so many of the kind."""
        if kind != "memory" or self.all_allocations:
            return range(1, calls + 1)
        return sampled_calls(calls, self.sample)


@dataclass
class Tally:
    """Runs and problems so far."""

    runs: int = 0
    problems: list[str] = field(default_factory=list)

    def add(self, problems: Sequence[str]) -> None:
        """Counts a run with its problems."""
        self.runs += 1
        self.problems.extend(problems)

    def report(self, took_s: float) -> str:
        """The last line of the report."""
        return f"{self.runs} runs in {took_s:.0f} s, {len(self.problems)} problems"

    def status(self) -> int:
        """The exit status: 1 with a problem, or if nothing ran."""
        return 0 if self.runs and not self.problems else 1


class Sweep:
    """Runs cases and unusable places in directories of their own below `directory`."""

    def __init__(self, build: Path, directory: Path, extent: Extent) -> None:
        self.tally = Tally()
        self._build = build
        self._directory = directory
        self._extent = extent
        self._library = build / "tests" / "libfailing-calls.so"

    def try_place(self, place: UnusablePlace) -> None:
        """Runs one command in an unusable place."""
        directory = self._new_directory()
        try:
            place.check(self._build, directory)
            self.tally.add([])
        except Problem as problem:
            self.tally.add([str(problem)])
        remove_read_only(directory)

    def try_case(self, case: Case, pool: Executor) -> str:
        """Runs a case with all its failures; returns a line with the number of calls and runs."""
        case.begin(self._build, self._directory)
        pending: list[Future[list[str]]] = []
        counts = []
        try:
            for kind in case.kinds:
                reference = self._reference(case, kind)
                counts.append(f"{reference.run.calls} {kind}")
                calls = self._extent.calls(kind, reference.run.calls)
                for injection in injections(kind, calls, self._extent.first_error_only):
                    pending.append(pool.submit(self._try_one, case, reference, injection))
        except Problem as problem:  # without a failure already
            self.tally.add([f"{case.name}: {problem}"])
        for each in pending:
            self.tally.add(each.result())
        case.end()
        return f"{case.name}: {', '.join(counts)}; {len(pending)} runs"

    def _new_directory(self) -> Path:
        return Path(tempfile.mkdtemp(dir=self._directory))

    def _reference(self, case: Case, kind: str) -> Reference:
        directory = self._new_directory()
        run, work = self._run(case, counting(kind), directory)
        expect(run.status == case.status, f"ended with {run.status} without a failure: {run.errors}")
        reference = Reference(run, case.content(work))
        shutil.rmtree(directory)
        return reference

    def _try_one(self, case: Case, reference: Reference, injection: Injection) -> list[str]:
        """The problems of one run, at most one."""
        directory = self._new_directory()
        errors = ""
        try:
            run, work = self._run(case, injection, directory)
            errors = run.errors[-ERRORS_SHOWN:]
            case.check(run, work, reference)
        except Problem as problem:
            return [f"{case.name}: {injection}: {problem}\n{errors}"]
        finally:
            shutil.rmtree(directory)
        return []

    def _run(self, case: Case, injection: Injection, directory: Path) -> tuple[Run, Path]:
        """The run, and the work directory that it has left."""
        work = directory / "work"
        work.mkdir()
        case.prepare(work)
        command = [str(self._build / case.program), *case.arguments(work)]
        return run_injected(command, case.environment(), self._library, injection, directory / "counts"), work
