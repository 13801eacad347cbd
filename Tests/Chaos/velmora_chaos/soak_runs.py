# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The two parts of the soak: decoding a drive, and playing it to the application."""

import os
import subprocess
import tempfile
import time
from dataclasses import dataclass
from pathlib import Path

from velmora_chaos.checks import expect
from velmora_chaos.growth import Growth
from velmora_chaos.program import process_resident_kib
from velmora_chaos.redraws import HISTORY, REDRAW_S, next_redraw, redraws
from velmora_chaos.sandbox import Sandbox

CHUNK = 1 << 18
BUFFERED = 1 << 20  # bytes of output after which the program's buffers have reached their size


@dataclass(frozen=True)
class Drive:
    """The drive. Live, it is `hours` within `live_seconds`, or as many as the machine can."""

    build: Path
    hours: int
    scenario: str
    live_seconds: float


def measure_decode(drive: Drive) -> Growth:
    """Takes the refreshes as they come, so that the program is never far ahead of the measurement."""
    hours = f"{drive.hours}h"
    with (
        subprocess.Popen(
            [drive.build / "tests" / "make-drive", drive.scenario, "1", hours, "-"], stdout=subprocess.PIPE
        ) as maker,
        subprocess.Popen(
            [drive.build / "velmora-log", "decode", "--log-level", "0", "--format", "jsonl", "-"],
            stdin=maker.stdout,
            stdout=subprocess.PIPE,
            stderr=subprocess.PIPE,
        ) as tool,
    ):
        assert maker.stdout and tool.stdout and tool.stderr
        maker.stdout.close()
        start = time.monotonic()
        refreshes = first = most = size = 0
        while chunk := os.read(tool.stdout.fileno(), CHUNK):
            refreshes += chunk.count(b"\n")
            size += len(chunk)
            if refreshes > HISTORY and size > BUFFERED:
                memory = process_resident_kib(tool.pid)
                first = first or memory
                most = max(most, memory)
        errors = tool.stderr.read().decode(errors="replace")
        expect(maker.wait() == 0 and tool.wait() == 0, f"failed: {errors[-500:]}")
    wanted = 0.9 * drive.hours * 3600 / REDRAW_S
    expect(refreshes >= wanted, f"{refreshes} refreshes, wanted at least {wanted:.0f}")
    took = time.monotonic() - start
    return Growth(f"decode, {drive.hours} h of {drive.scenario} within {took:.1f} s", refreshes, first, most)


def run_decode(drive: Drive) -> None:
    """Decodes the drive, prints and checks the memory."""
    growth = measure_decode(drive)
    print(growth, flush=True)
    growth.check()


def run_live(drive: Drive) -> None:
    """Plays the drive to the application, prints and checks the memory of both."""
    speed = drive.hours * 3600 / drive.live_seconds
    with tempfile.TemporaryDirectory() as directory, Sandbox(drive.build, Path(directory)) as sandbox:
        service = sandbox.service(f"scenario:{drive.scenario},seed=1,speed={speed:.0f}")
        screen = sandbox.screen()
        next_redraw(screen)
        service_first = 0
        end = time.monotonic() + drive.live_seconds
        while time.monotonic() < end:
            next_redraw(screen)
            if not service_first and len(redraws(screen)) > HISTORY:
                service_first = service.resident_kib()
        memory = [redraw.resident_kib for redraw in redraws(screen)]
        expect(len(memory) > HISTORY, f"{len(memory)} refreshes are too few")
        name = f"live, {drive.hours} h of {drive.scenario} within {drive.live_seconds:g} s, the application"
        for growth in (
            Growth(name, len(memory), memory[HISTORY], max(memory[HISTORY:])),
            Growth("the service", len(memory), service_first, max(service_first, service.resident_kib())),
        ):
            print(growth, flush=True)
            growth.check()
        expect(service.lines.count("messages dropped") == 0, "messages were dropped")
