# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Options of the chaos command."""

import argparse
from collections.abc import Sequence
from dataclasses import dataclass
from pathlib import Path

DESCRIPTION = """Stress tests of the telephony service and the application, observed at the screen.

  restarts  the service, then the application, is killed and restarted at a random moment under load, N times
            each; the screen is live again within 6 s every time
  clients   ten clients at once beside one that never reads and one that sends malformed frames
  hostile   a thousand hostile connections, to the service, its log channel and the application, beside an
            honest client that misses at most one redraw
  crowd     as many idle connections as a port takes, unfinished frames of 180 MiB, and requests for channels to
            the service itself: a new client is served, memory and the log stay bounded
  closed    the service and a recorder without standard descriptors: no log line goes into another file
  recordings  files are removed, truncated, moved and replaced while a recorder writes to them, and a second
            recorder wants them; the recorder says so within a second, and no message is lost
  flood     100,000 messages a second: the screen answers in time, memory stays bounded, and what a slow
            client does not take is counted and logged
"""
STRICT = (
    "apply the limits of an idle machine: live within 6 s, answers within 50 ms, 100,000 messages a second"
)


@dataclass(frozen=True)
class Options:
    """What to run, and how long."""

    build: Path
    rounds: int
    lanes: int
    seconds: int
    seed: int
    only: str
    strict: bool


def positive(text: str) -> int:
    """A whole number from 1 on."""
    number = int(text)
    if number < 1:
        raise argparse.ArgumentTypeError(f"{number} is not positive")
    return number


def parse_options(arguments: Sequence[str] | None = None) -> Options:
    """The options of a command line; exits with status 2 on a usage error."""
    parser = argparse.ArgumentParser(
        prog="chaos", description=DESCRIPTION, formatter_class=argparse.RawDescriptionHelpFormatter
    )
    parser.add_argument("build", type=Path, metavar="BUILD_DIRECTORY")
    parser.add_argument("--rounds", type=positive, default=5, metavar="N", help="restarts of each program")
    parser.add_argument("--lanes", type=positive, default=4, metavar="N", help="restarts in parallel")
    parser.add_argument(
        "--seconds", type=positive, default=6, metavar="N", help="duration of clients and flood"
    )
    parser.add_argument("--seed", type=int, default=1, metavar="N", help="of the random numbers")
    parser.add_argument("--only", default="", metavar="WORD", help="experiments whose name contains the word")
    parser.add_argument("--strict", action="store_true", help=STRICT)
    parsed = parser.parse_args(arguments)
    return Options(
        build=parsed.build.resolve(),
        rounds=parsed.rounds,
        lanes=parsed.lanes,
        seconds=parsed.seconds,
        seed=parsed.seed,
        only=parsed.only,
        strict=parsed.strict,
    )
