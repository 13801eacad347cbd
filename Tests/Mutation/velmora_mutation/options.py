# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Options of the mutate command."""

import argparse
import os
from collections.abc import Sequence
from dataclasses import dataclass
from pathlib import Path

from velmora_mutation.source_tree import SOURCE

DESCRIPTION = """Tests the tests of the decoders: changes one operator, number or statement of LogGenerator/
and LogMessages/ at a time and checks that a test fails.

Of all changes a sample is taken, the same for the same seed, in equal shares from the technologies and from
what they share; with files or lines named, from those alone; --sample 0 takes all. The source tree stays as
it is: a copy is built in the directory (build/mutate), and a changed file is compiled beside it and linked
in front of the library that has the unchanged one.

A change is noticed when a test fails, crashes or times out. One that does not compile (a table may check
itself) is reported and does not count. One that survives must be listed in mutations-equivalent with the
reason why no test can detect it; for any other, and for an entry of the list that does not fit the sources
any more, the exit status is 1.
"""


@dataclass(frozen=True)
class Options:
    """What to try."""

    sample: int
    seed: int
    jobs: int
    directory: Path
    again: Path | None
    check: bool
    follow_moves: bool
    places: Sequence[str]


def whole_number(text: str) -> int:
    """A whole number from 0 on."""
    number = int(text)
    if number < 0:
        raise argparse.ArgumentTypeError(f"{number} is negative")
    return number


def positive(text: str) -> int:
    """A whole number from 1 on."""
    number = whole_number(text)
    if number == 0:
        raise argparse.ArgumentTypeError("0 is not positive")
    return number


def parse_options(arguments: Sequence[str] | None = None) -> Options:
    """The options of a command line; exits with status 2 on a usage error."""
    parser = argparse.ArgumentParser(
        prog="mutate", description=DESCRIPTION, formatter_class=argparse.RawDescriptionHelpFormatter
    )
    directory = SOURCE / "build" / "mutate"
    parser.add_argument(
        "--sample", type=whole_number, default=300, metavar="N", help="so many that compile; 0 for all"
    )
    parser.add_argument("--seed", type=int, default=1, metavar="N", help="of the choice")
    parser.add_argument(
        "--jobs", type=positive, default=os.cpu_count() or 1, metavar="N", help="so many in parallel"
    )
    parser.add_argument("--directory", type=Path, default=directory, metavar="DIR", help="for the copy")
    parser.add_argument(
        "--again", type=Path, metavar="OUTPUT", help="survivors of an earlier run's report alone"
    )
    parser.add_argument("--check", action="store_true", help="check mutations-equivalent and try nothing")
    parser.add_argument(
        "--follow-moves", action="store_true", help="the same, with the paths of moved files updated"
    )
    parser.add_argument("places", nargs="*", metavar="FILE[:LINE]")
    parsed = parser.parse_args(arguments)
    return Options(
        sample=parsed.sample,
        seed=parsed.seed,
        jobs=parsed.jobs,
        directory=parsed.directory.resolve(),
        again=parsed.again,
        check=parsed.check or parsed.follow_moves,
        follow_moves=parsed.follow_moves,
        places=parsed.places,
    )
