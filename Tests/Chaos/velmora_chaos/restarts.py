# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Kills the service or the application under load and measures how soon the screen is live again."""

import random
import tempfile
import time
from collections.abc import Sequence
from concurrent.futures import ThreadPoolExecutor
from dataclasses import dataclass
from enum import Enum
from pathlib import Path

from velmora_chaos.checks import expect, wait_for
from velmora_chaos.figures import shares, summary
from velmora_chaos.lines import Line
from velmora_chaos.options import Options
from velmora_chaos.redraws import REDRAW_S, SLACK_S, next_redraw
from velmora_chaos.sandbox import APPLICATION_PORT, LOAD, Sandbox

RECOVERY_S = 6
RETRY_S = 5  # a program that starts more slowly than the first attempt to connect waits for the second
# The tick that finds the service gone may redraw messages from before the restart; the next one is a whole interval later.
LEAST_REDRAWN_S = REDRAW_S / 2
MOST_PORTS = 12


class Victim(Enum):
    """The program that is killed."""

    SERVICE = "service"
    APPLICATION = "application"


@dataclass(frozen=True)
class Recovery:
    """The time from a restart until messages arrive, and until the screen shows them."""

    streaming_s: float
    redrawn_s: float


def streaming_since(lines: Sequence[Line], start_s: float) -> float | None:
    """The time after `start_s` at which the service began to send to the application."""
    for line in lines:
        if line.when_s > start_s and line.text.endswith(f": streaming to {APPLICATION_PORT}"):
            return line.when_s
    return None


def recovery_limit_s(strict: bool) -> float:
    """The longest time until the screen is live again."""
    return RECOVERY_S if strict else RETRY_S + LEAST_REDRAWN_S + REDRAW_S + SLACK_S


def measure_lane(build: Path, rounds: int, seed: int, victim: Victim) -> list[Recovery]:
    """Restarts the victim so many times in a sandbox of its own."""
    chance = random.Random(seed)
    measured = []
    with tempfile.TemporaryDirectory() as directory, Sandbox(build, Path(directory)) as sandbox:
        service = sandbox.service(LOAD)
        screen = sandbox.screen()
        next_redraw(screen)
        for _ in range(rounds):
            time.sleep(chance.uniform(0, REDRAW_S))
            if victim is Victim.SERVICE:
                service.kill()
                start = time.monotonic()
                service = sandbox.service(LOAD, wait=False)
            else:
                screen.kill()
                start = time.monotonic()
                screen = sandbox.screen()
            log = service.lines
            streaming = wait_for("the stream", lambda: streaming_since(log.all(), start))
            redrawn = next_redraw(screen, since_s=streaming + LEAST_REDRAWN_S)
            measured.append(Recovery(streaming - start, redrawn - start))
            ports = sandbox.ports()
            expect(len(ports) < MOST_PORTS, f"sockets pile up: {[port.name for port in ports]}")
    return measured


def run_restarts(options: Options, victim: Victim) -> None:
    """Restarts in parallel lanes, prints the times and checks the longest."""
    lanes = min(options.lanes, options.rounds)
    with ThreadPoolExecutor(lanes) as pool:
        runs = [
            pool.submit(measure_lane, options.build, rounds, options.seed + lane, victim)
            for lane, rounds in enumerate(shares(options.rounds, lanes))
        ]
        measured = [recovery for run in runs for recovery in run.result()]
    name = f"{victim.value} restarted under load"
    redrawn = [recovery.redrawn_s for recovery in measured]
    print(summary(f"{name}, streaming again after", "s", [recovery.streaming_s for recovery in measured]))
    print(summary(f"{name}, redrawn after", "s", redrawn), flush=True)
    limit = recovery_limit_s(options.strict)
    expect(max(redrawn) <= limit, f"redrawn after {max(redrawn):.2f} s, wanted at most {limit:g} s")
