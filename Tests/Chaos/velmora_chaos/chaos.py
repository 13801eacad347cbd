# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The chaos command: runs the chosen experiments one after the other."""

import sys
from collections.abc import Callable, Mapping, Sequence

from velmora_chaos.checks import Problem
from velmora_chaos.clients import run_clients
from velmora_chaos.closed import run_closed
from velmora_chaos.crowd import run_crowd
from velmora_chaos.flood import run_flood
from velmora_chaos.hostile import run_hostile
from velmora_chaos.options import Options, parse_options
from velmora_chaos.recordings import run_recordings
from velmora_chaos.restarts import Victim, run_restarts

Experiment = Callable[[Options], None]

EXPERIMENTS: Mapping[str, Experiment] = {
    "service_restarts": lambda options: run_restarts(options, Victim.SERVICE),
    "application_restarts": lambda options: run_restarts(options, Victim.APPLICATION),
    "clients": run_clients,
    "hostile": run_hostile,
    "crowd": run_crowd,
    "closed": run_closed,
    "recordings": run_recordings,
    "flood": run_flood,
}


def chosen(only: str, experiments: Mapping[str, Experiment] = EXPERIMENTS) -> list[Experiment]:
    """The experiments whose name contains the word, in the order of the table."""
    return [experiment for name, experiment in experiments.items() if only in name]


def main(arguments: Sequence[str] | None = None) -> int:
    """Exit status 0, or 1 after the first check that fails."""
    options = parse_options(arguments)
    experiments = chosen(options.only)
    if not experiments:
        print(f"no experiment named {options.only}, wanted one of {', '.join(EXPERIMENTS)}", file=sys.stderr)
        return 2
    try:
        for experiment in experiments:
            experiment(options)
    except Problem as problem:
        print(problem, file=sys.stderr)
        return 1
    return 0
