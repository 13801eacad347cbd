# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The soak command: hours of recorded messages at full speed, and the memory that they take."""

import argparse
import sys
from collections.abc import Sequence
from dataclasses import dataclass
from pathlib import Path

from velmora_chaos.checks import Problem
from velmora_chaos.soak_runs import Drive, run_decode, run_live

DESCRIPTION = """Hours of recorded messages at full speed, and the memory that they take.

A drive of so many hours passes through velmora-log decode, which prints each refresh, and, played by the
service, through the ports to the application's screen. From the sixth refresh on neither grows by 1 MiB.
"""
PARTS = {"decode": run_decode, "live": run_live}


@dataclass(frozen=True)
class Options:
    """The drive, and the parts that it is used for."""

    drive: Drive
    parts: list[str]


def parse_options(arguments: Sequence[str] | None = None) -> Options:
    """The options of a command line; exits with status 2 on a usage error."""
    parser = argparse.ArgumentParser(
        prog="soak", description=DESCRIPTION, formatter_class=argparse.RawDescriptionHelpFormatter
    )
    parser.add_argument("build", type=Path, metavar="BUILD_DIRECTORY")
    parser.add_argument("--hours", type=int, default=24, metavar="H", help="recorded hours")
    parser.add_argument("--scenario", default="gsm", metavar="NAME", help="of the service")
    parser.add_argument("--only", choices=PARTS, default="", help="one of the two parts")
    parser.add_argument(
        "--live-seconds", type=float, default=60, metavar="S", help="duration of the live drive"
    )
    parsed = parser.parse_args(arguments)
    return Options(
        drive=Drive(parsed.build.resolve(), parsed.hours, parsed.scenario, parsed.live_seconds),
        parts=[parsed.only] if parsed.only else list(PARTS),
    )


def main(arguments: Sequence[str] | None = None) -> int:
    """Exit status 0, or 1 after the first check that fails."""
    options = parse_options(arguments)
    try:
        for part in options.parts:
            PARTS[part](options.drive)
    except Problem as problem:
        print(problem, file=sys.stderr)
        return 1
    return 0
