# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The measure-events command: precision and recall of each kind of events."""

import argparse
import sys
from collections.abc import Iterator, Sequence
from concurrent.futures import ThreadPoolExecutor
from pathlib import Path

from velmora_events.drives import ROUNDS_S, Drive, Problem
from velmora_events.events import Event
from velmora_events.figures import Figures, Table, as_markdown, as_text, rows, short_kinds
from velmora_events.kinds import SHOWN_ONLY
from velmora_events.matching import Outcome, match

DESCRIPTION = """Precision and recall of each kind of events.

make-drive writes a round of each scenario with each seed, and what its phone did (--truth); velmora-log events
lists what it finds in the recording. Each event that happened is matched with at most one that was found, of the
same kind and within the kind's tolerance. What no record states is not counted. Scenarios that have a round of
incidents, as lost calls, are measured in both rounds. Gaps and clock jumps are those of a
copy of each recording with silences and clocks that go back, and changes of an address those of another.

The exit status is 1 when a kind that records state is not found exactly, or a derived one with less than 0.98 of
either figure, and 2 when the call was wrong or a program failed. A few kinds are short in a scenario for a known
reason: these are only shown.
"""


def numbers(text: str) -> list[int]:
    """All from 1 to 5 of "1-5"."""
    first, _, last = text.partition("-")
    return list(range(int(first), int(last or first) + 1))


def parse_options(arguments: Sequence[str] | None = None) -> argparse.Namespace:
    """The options of a command line; exits with status 2 on a usage error."""
    parser = argparse.ArgumentParser(
        prog="measure-events", description=DESCRIPTION, formatter_class=argparse.RawDescriptionHelpFormatter
    )
    parser.add_argument("build", type=Path, metavar="BUILD_DIRECTORY")
    parser.add_argument("--seeds", type=numbers, default=numbers("1-100"), metavar="A-B", help="of the drives (1-100)")
    parser.add_argument(
        "--scenario", action="append", choices=ROUNDS_S, metavar="NAME", help="only this one; may be repeated"
    )
    parser.add_argument("--rounds", type=int, default=1, metavar="N", help="of each drive (1)")
    parser.add_argument("-j", "--jobs", type=int, default=2, metavar="N", help="drives at a time (2)")
    parser.add_argument("--markdown", action="store_true", help="print the table as Markdown")
    parser.add_argument("--differences", type=int, default=0, metavar="N", help="print N of each kind and sort")
    return parser.parse_args(arguments)


def _line(sort: str, drive: Drive, event: Event, start: float) -> str:
    fields = " ".join(f"{name}={value}" for name, value in event.fields.items())
    end = f"-{event.end - start:.3f}" if event.end is not None else ""
    return f"{sort} {event.kind} {drive.name} at {event.time - start:.3f}{end} s: {fields}"


def difference_lines(drive: Drive, outcomes: dict[str, Outcome], start: float) -> Iterator[tuple[str, str]]:
    """What one of the two has alone, each with the sort that it is counted by."""
    for kind, outcome in outcomes.items():
        for sort, events in (("missed", outcome.missed), ("wrong", outcome.wrong)):
            for event in events:
                yield f"{sort} {kind} {drive.scenario}", _line(sort, drive, event, start)


class Measurement:
    """The figures of all drives so far."""

    def __init__(self, differences: int) -> None:
        self.table: Table = {}
        self._differences = differences
        self._printed: dict[str, int] = {}

    def add(self, drive: Drive, truths: list[Event], found: list[Event]) -> None:
        outcomes = match(truths, found)
        for kind, outcome in outcomes.items():
            self.table.setdefault((kind, drive.scenario), Figures()).add(outcome)
        start = min((event.time for event in truths), default=0.0) // 3600 * 3600
        for sort, line in difference_lines(drive, outcomes, start):
            self._printed[sort] = self._printed.get(sort, 0) + 1
            if self._printed[sort] <= self._differences:
                print(line)


def main(arguments: Sequence[str] | None = None) -> int:
    """The exit status."""
    options = parse_options(arguments)
    drives = [
        Drive(options.build.resolve(), scenario, seed, options.rounds)
        for scenario in options.scenario or ROUNDS_S
        for seed in options.seeds
    ]
    measurement = Measurement(options.differences)
    try:
        with ThreadPoolExecutor(options.jobs) as pool:
            for drive, (truths, found) in zip(drives, pool.map(Drive.measure, drives), strict=True):
                measurement.add(drive, truths, found)
    except (Problem, OSError) as problem:
        print(f"measure-events: {problem}", file=sys.stderr)
        return 2
    print(as_markdown(measurement.table) if options.markdown else as_text(rows(measurement.table)))
    short = short_kinds(measurement.table)
    for each in short:
        print(f"short: {each}")
    for (kind, scenario), reason in SHOWN_ONLY.items():
        if (kind, scenario) in measurement.table:
            print(f"only shown: {kind} of {scenario}: {reason}")
    return 1 if short else 0
