# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The mutate command."""

import resource
import sys
import time
from collections.abc import Iterable, Sequence
from pathlib import Path

from velmora_mutation.campaign import Campaign
from velmora_mutation.changes import Change, ChangeKey, changes_of
from velmora_mutation.equivalents import (
    MalformedList,
    Outdated,
    find_outdated,
    follow_moves,
    parse_equivalents,
)
from velmora_mutation.options import Options, parse_options
from velmora_mutation.sequence import in_turn
from velmora_mutation.source_tree import SHARED, SOURCE, decoder_files
from velmora_mutation.tally import survivors
from velmora_mutation.test_runner import FailsUnchanged
from velmora_mutation.trial import Laboratory
from velmora_mutation.workspace import Workspace

EQUIVALENT = SOURCE / "Tests" / "Mutation" / "mutations-equivalent"
MEMORY = 4 << 30  # a changed program may allocate any amount


def chosen_changes(
    changes: Iterable[Change], places: Sequence[str], earlier: set[ChangeKey] | None
) -> list[Change]:
    """The changes of the named files or lines, and of an earlier report, where these are given."""
    return [
        change
        for change in changes
        if (not places or change.path in places or f"{change.path}:{change.line}" in places)
        and (earlier is None or change.key in earlier)
    ]


def report_outdated(outdated: Sequence[Outdated]) -> None:
    """Prints the entries that do not fit the sources any more."""
    for each in outdated:
        print(f"{EQUIVALENT.name}: {each}")


def check_equivalents(source: Path, listed: Path, moves: bool) -> list[Outdated]:
    """The entries that do not fit the sources; with `moves`, after the paths of moved files are updated."""
    files = decoder_files(source)
    text = listed.read_text(encoding="utf-8")
    outdated = find_outdated(parse_equivalents(text), files)
    if moves and any(each.moved_to for each in outdated):
        text = follow_moves(text, outdated)
        listed.write_text(text, encoding="utf-8")
        outdated = find_outdated(parse_equivalents(text), files)
    return outdated


def try_changes(options: Options) -> int:
    """Builds the copy and tries the chosen changes."""
    known = parse_equivalents(EQUIVALENT.read_text(encoding="utf-8"))
    earlier = survivors(options.again.read_text(encoding="utf-8")) if options.again else None
    laboratory = Laboratory(Workspace(SOURCE, options.directory))
    graph = laboratory.graph
    files = decoder_files(options.directory / "tree")
    every = [change for path, source in files.items() for change in changes_of(path, source)]
    changes = chosen_changes(every, options.places, earlier)
    if not changes:
        print(
            "nothing to change there, wanted FILE or FILE:LINE as LogGenerator/Base.cpp:20", file=sys.stderr
        )
        return 1
    print(f"{len(changes)} changes are possible", flush=True)
    sequence = in_turn(
        changes,
        lambda change: graph.technology_of(change.path) or SHARED,
        lambda change: graph.is_wide(change.path),
        options.seed,
    )
    campaign = Campaign(
        sequence, set(known), options.sample, laboratory.try_change, lambda text: print(text, flush=True)
    )
    start = time.monotonic()
    campaign.run(options.jobs)
    print(campaign.tally.report(time.monotonic() - start))
    outdated = find_outdated(known, files)
    report_outdated(outdated)
    return 1 if campaign.tally.has_survivors() or outdated else 0


def main(arguments: Sequence[str] | None = None) -> int:
    """Exit status 0; 1 if a change survived, if the list is outdated or malformed, or with nothing to try."""
    options = parse_options(arguments)
    try:
        if options.check:
            outdated = check_equivalents(SOURCE, EQUIVALENT, options.follow_moves)
            report_outdated(outdated)
            return 1 if outdated else 0
        resource.setrlimit(resource.RLIMIT_AS, (MEMORY, MEMORY))
        resource.setrlimit(resource.RLIMIT_CORE, (0, 0))
        return try_changes(options)
    except (FailsUnchanged, MalformedList) as error:
        print(error, file=sys.stderr)
        return 1
