# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Whether programs that are compared do the same work."""

import hashlib
import json
import re
import subprocess
from itertools import zip_longest
from pathlib import Path
from typing import Any

from velmora_compare.programs import Program
from velmora_compare.running import Runner

SECTION = "Serving Cell Measurements"
FIELD = "velmora.lte.serving_cell_measurements."


def same_bytes(one: list[str], other: list[str], runner: Runner) -> bool:
    """Whether two commands write the same bytes, however many."""
    return _hash(one, runner) == _hash(other, runner)


def _hash(command: list[str], runner: Runner) -> str:
    digest = hashlib.sha256()
    with subprocess.Popen(runner.pinned(command), stdin=subprocess.DEVNULL, stdout=subprocess.PIPE,
                          stderr=subprocess.DEVNULL, env=runner.environment("/nonexistent")) as process:
        assert process.stdout
        while piece := process.stdout.read(1 << 20):
            digest.update(piece)
    if process.returncode != 0:
        raise RuntimeError(f"{' '.join(command)}: exit status {process.returncode}")
    return digest.hexdigest()


def different_line(expected: bytes, written: bytes) -> int | None:
    """The number of the first line that has other values, counted from 1."""
    for number, (one, other) in enumerate(zip_longest(expected.splitlines(), written.splitlines()), 1):
        if one is None or other is None or json.loads(one) != json.loads(other):
            return number
    return None


def sections_of(lines: bytes) -> bytes:
    """What jq's `.sections` writes for lines."""
    return b"\n".join(json.dumps(json.loads(line)["sections"]).encode() for line in lines.splitlines())


def field_name(label: str) -> str:
    """How the dissector names a field."""
    return FIELD + re.sub(r"[^a-z0-9]+", "_", label.lower()).strip("_")


def number_of(text: str) -> float | None:
    """The number that a text begins with, as the dissector has it; none for what is not present."""
    if text in ("True", "False"):
        return float(text == "True")
    match = re.match(r"-?\d+(\.\d+)?", text)
    return float(match.group()) if match else None


def fields_of(packet: Any) -> dict[str, str]:
    """All of the section's fields in an object of `tshark -T json`, however deep."""
    fields: dict[str, str] = {}
    if isinstance(packet, dict):
        for name, value in packet.items():
            if isinstance(value, str) and name.startswith(FIELD):
                fields[name] = value
            else:
                fields.update(fields_of(value))
    return fields


def missing_field(line: dict[str, Any], packet: Any) -> str | None:
    """The first label whose value the capture tool shows otherwise. What is not present it leaves out."""
    fields = fields_of(packet)
    for label, text in line["sections"][SECTION].items():
        if number_of(fields.get(field_name(label), "")) != number_of(text):
            return str(label)
    return None


def capture_tool_problem(tshark: Program, lines: Program, recording: Path, runner: Runner) -> str:
    """What the capture tool does not show of a recording of complete records; empty where it shows all values."""
    packets = json.loads(runner.output(tshark.command(recording)))
    written = [json.loads(line) for line in runner.output(lines.command(recording)).splitlines()]
    if len(packets) != len(written):
        return f"{len(packets)} packets, {len(written)} lines"
    shown = 0
    for number, (line, packet) in enumerate(zip(written, packets), 1):
        if not fields_of(packet):
            continue  # too short a record: the line repeats the one before
        shown += 1
        if label := missing_field(line, packet):
            return f"packet {number}: {label}"
    return "" if shown else "no field at all"
