# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Ten live displays beside a client that never reads and one that sends malformed frames."""

import random
import tempfile
import time
from dataclasses import dataclass
from pathlib import Path

from velmora_chaos.checks import expect, wait_for
from velmora_chaos.malformed import malformed_input
from velmora_chaos.options import Options
from velmora_chaos.raw_client import RawClient
from velmora_chaos.redraws import REDRAW_S, SLACK_S, longest_gap_s, next_redraw, redraws
from velmora_chaos.sandbox import DISPLAY, LOAD, Sandbox

CLIENTS = 10
SEND_INTERVAL_S = 0.01


@dataclass(frozen=True)
class ClientsResult:
    """What the clients received while malformed frames were sent."""

    seconds: int
    sent: int
    displays: list[int]  # by client
    gap_s: float

    def __str__(self) -> str:
        return (
            f"{len(self.displays)} clients beside one that never reads and one that sent {self.sent} "
            f"malformed frames: {min(self.displays)} to {max(self.displays)} displays each in "
            f"{self.seconds} s; longest time without a redraw {self.gap_s:.2f} s"
        )

    def check(self) -> None:
        """Raises Problem where a client or the screen was kept waiting."""
        wanted = self.seconds // REDRAW_S - 1
        fewest = min(self.displays)
        expect(fewest >= wanted, f"a client received {fewest} displays, wanted at least {wanted}")
        expect(self.gap_s <= 2 * REDRAW_S + SLACK_S, f"{self.gap_s:.2f} s without a redraw")


def send_malformed(sandbox: Sandbox, client: RawClient, seconds: int, seed: int) -> int:
    """Sends malformed frames for so long, reconnecting where the service hangs up; returns their number."""
    chance = random.Random(seed)
    end = time.monotonic() + seconds
    sent = 0
    while time.monotonic() < end:
        try:
            client.send(malformed_input(chance))
            sent += 1
        except OSError:
            client.reconnect(sandbox.port())
        time.sleep(SEND_INTERVAL_S)
    return sent


def run_clients(options: Options) -> None:
    """Runs the clients, prints what they received and checks it."""
    with tempfile.TemporaryDirectory() as directory, Sandbox(options.build, Path(directory)) as sandbox:
        service = sandbox.service(LOAD)
        screen = sandbox.screen()
        watches = [sandbox.watch() for _ in range(CLIENTS)]
        silent = RawClient(sandbox, "silent")
        silent.start_streaming()
        malformed = RawClient(sandbox, "malformed")
        begin = next_redraw(screen)
        for watch in watches:
            lines = watch.lines
            wait_for("a client's first display", lambda: lines.count(DISPLAY))
        before = [watch.lines.count(DISPLAY) for watch in watches]
        sent = send_malformed(sandbox, malformed, options.seconds, options.seed)
        next_redraw(screen, since_s=begin + REDRAW_S / 2)  # a gap has two ends
        result = ClientsResult(
            seconds=options.seconds,
            sent=sent,
            displays=[watch.lines.count(DISPLAY) - count for watch, count in zip(watches, before)],
            gap_s=longest_gap_s(redraws(screen), begin),
        )
        print(result, flush=True)
        result.check()
        silent.close()
        malformed.close()
        screen.end_cleanly()
        service.end_cleanly()
