# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The table, in the form of PERFORMANCE.md."""

from collections.abc import Mapping, Sequence

from velmora_compare.figures import Cost, ratio, three_digits
from velmora_compare.programs import Program
from velmora_compare.recordings import TITLES

Costs = Mapping[tuple[str, str], Cost]  # by program and recording


def cell(program: Program, recording: str, costs: Costs) -> str:
    """The cost and how many times that of the program that it is compared with."""
    cost = costs.get((program.name, recording))
    if cost is None:
        return ""
    if cost.median <= 0:
        return "-"  # too short to be measured
    times = ratio(cost, costs.get((program.against, recording)))
    return three_digits(cost.median) + (f" ({three_digits(times)})" if times is not None else "")


def spread(program: Program, recordings: Sequence[str], costs: Costs) -> str:
    spreads = [costs[program.name, recording].spread for recording in recordings if (program.name, recording) in costs]
    if not any(spreads):
        return ""
    least, most = (f"{each * 100:.0f}" for each in (min(spreads), max(spreads)))
    return f"{most} %" if least == most else f"{least} to {most} %"


def table(unit: str, programs: Mapping[str, Program], recordings: Sequence[str], costs: Costs) -> str:
    """A row for each program that was measured."""
    measured = {name: program for name, program in programs.items() if any(each == name for each, _ in costs)}
    has_spread = any(cost.spread for cost in costs.values())
    titles = [f"{unit}, a message (times)", "times what", *(TITLES[each] for each in recordings)]
    rows = [titles + ["spread"] * has_spread]
    for name, program in measured.items():
        against = program.against if program.against in measured else ""
        row = [f"{name}: {program.title}", against, *(cell(program, each, costs) for each in recordings)]
        rows.append(row + [spread(program, recordings, costs)] * has_spread)
    lines = ["| " + " | ".join(row) + " |" for row in rows]
    return "\n".join([lines[0], "|" + "---|" * len(rows[0]), *lines[1:]])
