# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Compares decoding with other programs and with the least that it can take.

Makes recordings - of whole drives, and of one log record alone - and measures whole processes on them, pinned to one
core, in interleaved rounds. A cost is of a message: the difference between a recording and its first tenth, so that
the start of a program does not count. Before that it checks that programs which are compared write the same. Tables
are in the form of PERFORMANCE.md; in brackets is how many times the cost of the program in the second column that is.
Programs that are missing are named and left out.
"""

import sys
import tempfile
from argparse import Namespace
from collections.abc import Sequence
from pathlib import Path

from velmora_compare import instructions, options, programs
from velmora_compare.figures import Cost, sizes_of
from velmora_compare.identity import Identity
from velmora_compare.machine import circumstances
from velmora_compare.programs import Program
from velmora_compare.recordings import RECORD, Maker
from velmora_compare.running import Runner
from velmora_compare.table import table

SLOW_SHARE = 20  # slow programs get a twentieth of the messages

Pair = tuple[str, str]


class Comparison:
    """Measures programs on recordings."""

    def __init__(self, chosen: Namespace, every: dict[str, Program], directory: Path) -> None:
        self._chosen = chosen
        self._programs = every
        self._maker = Maker(chosen.build / "tests" / "make-drive", directory, chosen.seed)
        self._runner = Runner(chosen.core, options.ROOT / "Resources", chosen.time == "wall")

    def pairs(self) -> list[Pair]:
        """Which programs run on which recordings."""
        return [(program.name, recording) for recording in self._chosen.recordings
                for program in self._programs.values() if recording == RECORD or not program.is_of_record]

    def problems(self) -> list[str]:
        """How programs differ that are to write the same."""
        identity = Identity(self._programs, self._maker, self._runner)
        found: list[str] = []
        for recording in self._chosen.recordings:
            found += identity.builds(recording, self._chosen.messages)
            if recording == RECORD:
                found += identity.by_hand(self._chosen.messages)
                found += identity.others(max(self._chosen.messages // SLOW_SHARE, 400))
        return found

    def times(self) -> dict[Pair, Cost]:
        """In nanoseconds."""
        rounds: dict[Pair, list[float]] = {pair: [] for pair in self.pairs()}
        for number in range(self._chosen.rounds):
            for pair in rounds:
                name, recording = pair
                program = self._programs[name]
                sizes = sizes_of(self._chosen.messages // (SLOW_SHARE if program.is_slow else 1))
                large, small = (self._runner.seconds(program.command(self._maker.make(recording, messages)))
                                for messages in (sizes.large, sizes.small))
                rounds[pair].append(sizes.each(large, small) * 1e9)
            print(f"round {number + 1} of {self._chosen.rounds} done", file=sys.stderr)
        return {pair: Cost(each) for pair, each in rounds.items()}

    def instructions(self, counter: instructions.Counter) -> dict[Pair, Cost]:
        costs: dict[Pair, Cost] = {}
        for name, recording in self.pairs():
            program = self._programs[name]
            if counter.is_slow and program.is_tshark and self._chosen.instructions == "quick":
                continue
            messages = self._chosen.counted if counter.is_slow else self._chosen.messages
            sizes = sizes_of(messages // (SLOW_SHARE if program.is_slow else 1))
            counts = [counter.count(program.command(self._maker.make(recording, each)), self._runner)
                      for each in (sizes.large, sizes.small)]
            if counts[0] is not None and counts[1] is not None:
                costs[name, recording] = Cost([sizes.each(counts[0], counts[1])])
            else:
                print(f"{name}: {counter.name} counts nothing on {recording}", file=sys.stderr)
        return costs


def chosen_programs(chosen: Namespace) -> dict[str, Program]:
    """Those that are asked for and there; the others are named."""
    every = programs.every(chosen.build, chosen.before, options.ROOT / "Benchmarks")
    unknown = [name for name in chosen.programs or [] if name not in every]
    if unknown:
        sys.exit(f"compare: no program {', '.join(unknown)}; there are {', '.join(every)}")
    asked = {name: program for name, program in every.items()
             if (name in chosen.programs if chosen.programs else program.is_default)}
    for name, program in asked.items():
        if program.missing:
            print(f"{name} is left out: {program.missing}", file=sys.stderr)
    return {name: program for name, program in asked.items() if not program.missing}


def drives(messages: int, chosen: Namespace) -> str:
    return f"{messages:,} messages, of slow programs {messages // SLOW_SHARE:,}, seed {chosen.seed}"


def run(chosen: Namespace, directory: Path) -> int:
    every = chosen_programs(chosen)
    if not every:
        print("compare: no program is left to measure", file=sys.stderr)
        return 1
    comparison = Comparison(chosen, every, directory)
    problems = comparison.problems()
    for problem in problems:
        print(f"compare: {problem}", file=sys.stderr)
    if problems:
        return 1
    print(circumstances())
    if chosen.time != "none":
        print(f"\n{drives(chosen.messages, chosen)}, {chosen.rounds} rounds, {chosen.time} time\n", flush=True)
        print(table("ns", every, chosen.recordings, comparison.times()), flush=True)
        print(f"\nat the end: {circumstances()}")
    if chosen.instructions == "none":
        return 0
    counter = instructions.counter()
    if counter is None:
        print("instructions are left out: neither perf nor valgrind counts them here", file=sys.stderr)
        return 0
    messages = chosen.counted if counter.is_slow else chosen.messages
    print(f"\n{drives(messages, chosen)}, instructions by {counter.name}\n", flush=True)
    print(table("instructions", every, chosen.recordings, comparison.instructions(counter)))
    return 0


def main(arguments: Sequence[str]) -> int:
    names = programs.every(options.ROOT / "build", options.ROOT / "build", options.ROOT / "Benchmarks")
    known = "programs:\n" + "\n".join(f"  {name:<14} {each.title}" for name, each in names.items())
    chosen = options.parse(list(arguments), __doc__ or "", known)
    try:
        if chosen.directory:
            chosen.directory.mkdir(parents=True, exist_ok=True)
            return run(chosen, chosen.directory)
        with tempfile.TemporaryDirectory() as directory:
            return run(chosen, Path(directory))
    except RuntimeError as failure:
        print(f"compare: {failure}", file=sys.stderr)
        return 1
