# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The failures command: lets the calls of the programs fail one after the other."""

import argparse
import os
import sys
import tempfile
import time
from collections.abc import Sequence
from concurrent.futures import ThreadPoolExecutor
from dataclasses import dataclass
from pathlib import Path

from velmora_chaos.failing.cases import all_cases
from velmora_chaos.failing.sweep import Extent, Sweep
from velmora_chaos.failing.unusable_places import all_unusable_places
from velmora_chaos.options import positive

DESCRIPTION = """Lets calls of the programs fail one after the other - once, three times in a row, for good -
and checks what is left: every allocation, read, write, sync, rename and opening of a file in decode, convert,
info, record and the application's save.

A run with exit status 0 has made what it makes without a failure. Any other ends by itself with status 1 and
a message on standard error. A file that existed is whole afterwards, the old one or the new one; one that did
not is whole or absent, and nothing else is left beside it.

Of the many allocations a sample is taken, spread evenly over the run, unless --all asks for each. --quick
takes a small one, and one error of each kind. Before all this, the programs run in unusable places: no
directory for ports or files, a full disk, resources that cannot be written.
"""
SAMPLE = 24
QUICK_SAMPLE = 8
WAITING = 8  # recorders that run in parallel for each job, since they mostly wait


@dataclass(frozen=True)
class Options:
    """What to run, and how much of it."""

    build: Path
    extent: Extent
    only: str
    jobs: int


def parse_options(arguments: Sequence[str] | None = None) -> Options:
    """The options of a command line; exits with status 2 on a usage error."""
    parser = argparse.ArgumentParser(
        prog="failures", description=DESCRIPTION, formatter_class=argparse.RawDescriptionHelpFormatter
    )
    parser.add_argument("build", type=Path, metavar="BUILD_DIRECTORY")
    parser.add_argument("--all", action="store_true", help="every allocation instead of a sample")
    parser.add_argument(
        "--sample", type=positive, default=SAMPLE, metavar="N", help="allocations of each case"
    )
    parser.add_argument("--quick", action="store_true", help="a small sample, one error of each kind")
    parser.add_argument("--only", default="", metavar="WORD", help="cases whose name contains the word")
    parser.add_argument(
        "--jobs", type=positive, default=2 * (os.cpu_count() or 1), metavar="N", help="runs in parallel"
    )
    parsed = parser.parse_args(arguments)
    extent = Extent(QUICK_SAMPLE if parsed.quick else parsed.sample, parsed.all, parsed.quick)
    return Options(parsed.build.resolve(), extent, parsed.only, parsed.jobs)


def main(arguments: Sequence[str] | None = None) -> int:
    """Exit status 0, or 1 if there were problems."""
    options = parse_options(arguments)
    start = time.monotonic()
    with (
        tempfile.TemporaryDirectory() as directory,
        ThreadPoolExecutor(options.jobs) as pool,
        ThreadPoolExecutor(WAITING * options.jobs) as waiting,
    ):
        sweep = Sweep(options.build, Path(directory), options.extent)
        for place in all_unusable_places():
            if options.only in place.name:
                sweep.try_place(place)
        for case in all_cases():
            if options.only in case.name:
                print(sweep.try_case(case, waiting if case.waits else pool), flush=True)
        for text in sweep.tally.problems:
            print(text, file=sys.stderr)
        print(sweep.tally.report(time.monotonic() - start))
        return sweep.tally.status()
