# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""100,000 messages a second to the application and to a client that never reads."""

import signal
import statistics
import tempfile
import time
from collections.abc import Iterable, Sequence
from dataclasses import dataclass
from pathlib import Path

from velmora_chaos.checks import expect, wait_for
from velmora_chaos.options import Options
from velmora_chaos.program import Program
from velmora_chaos.raw_client import RawClient
from velmora_chaos.redraws import HISTORY, Redraw, longest_gap_s, next_redraw, redraws
from velmora_chaos.sandbox import APPLICATION_PORT, Sandbox

RATE = 100_000  # messages a second
OWN_RATE = 20  # messages a second of the scenario at speed 1
SLOW = "messages dropped because the peer is slow: "
SERVICE_GROWTH_KIB = 4096
STRICT_LATE_MS = 50
LATE_MS = 1000
STOPPED_S = 3


def dropped_counts(lines: Iterable[str]) -> list[int]:
    """The counts that the service has logged for clients that are too slow."""
    return [int(line.split(SLOW)[1]) for line in lines if SLOW in line]


def dropped(service: Program) -> list[int]:
    """The same, of a running service."""
    return dropped_counts(line.text for line in service.lines.all())


@dataclass(frozen=True)
class FloodResult:
    """What was measured during the flood."""

    passed_s: float
    dropped: Sequence[int]  # by log line
    redraws: Sequence[Redraw]  # from the first of the application on
    gap_s: float
    service_before_kib: int
    service_after_kib: int

    @property
    def rate(self) -> float:
        """Messages a second that were sent to the client that never reads."""
        return sum(self.dropped) / self.passed_s

    @property
    def late_ms(self) -> list[float]:
        """The delay of the screen's event loop, by redraw."""
        return [redraw.late_ms for redraw in self.redraws]

    @property
    def screen_before_kib(self) -> int:
        """The application's memory once its history is full; messages gather between two redraws, so that
        memory is compared at redraws alone."""
        return max(redraw.resident_kib for redraw in self.redraws[HISTORY : HISTORY + 2])

    @property
    def screen_growth_kib(self) -> int:
        """How much the application has grown since then."""
        return max(redraw.resident_kib for redraw in self.redraws[HISTORY + 2 :]) - self.screen_before_kib

    @property
    def service_growth_kib(self) -> int:
        """How much the service has grown."""
        return self.service_after_kib - self.service_before_kib

    def __str__(self) -> str:
        return (
            f"flood: {self.rate:.0f} messages a second sent to a client that never reads, all counted as "
            f"dropped in {len(self.dropped)} lines; the screen's loop late by "
            f"{statistics.median(self.late_ms):.1f} ms in the median redraw, {max(self.late_ms):.1f} ms at "
            f"most; longest time without a redraw {self.gap_s:.2f} s; "
            f"memory: service {self.service_before_kib} {self.service_growth_kib:+d} KiB, "
            f"application {self.screen_before_kib} {self.screen_growth_kib:+d} KiB"
        )

    def check(self, strict: bool) -> None:
        """Raises Problem for memory that grows, a screen that answers late, or, if strict, too low a rate."""
        expect(
            self.service_growth_kib < SERVICE_GROWTH_KIB, f"the service grew by {self.service_growth_kib} KiB"
        )
        # The number of messages within an interval varies, and with it the memory at a redraw.
        expect(
            self.screen_growth_kib < self.screen_before_kib / 4,
            f"the application grew by {self.screen_growth_kib} KiB",
        )
        limit = STRICT_LATE_MS if strict else LATE_MS
        expect(
            max(self.late_ms) <= limit,
            f"the screen answered after {max(self.late_ms):.0f} ms, wanted {limit} ms",
        )
        if strict:
            expect(self.rate >= 0.95 * RATE, f"{self.rate:.0f} messages a second, wanted {RATE}")


def measure_flood(service: Program, screen: Program, seconds: int, begin_s: float) -> FloodResult:
    """Measures for so long, once the queue of the client that never reads and the history are full."""
    wait_for("the first log line of dropped messages", lambda: dropped(service), 60)
    wait_for("the history", lambda: len(redraws(screen)) > HISTORY + 2, 60)
    service_before = service.resident_kib()
    logged = len(dropped(service))
    start = time.monotonic()
    time.sleep(seconds)
    passed = time.monotonic() - start
    logged_meanwhile = dropped(service)[logged:]

    def redraws_since() -> list[Redraw]:
        return [redraw for redraw in redraws(screen) if redraw.when_s > begin_s]

    wait_for("a redraw once the history is full", lambda: len(redraws_since()) > HISTORY + 2)
    since = redraws_since()
    return FloodResult(
        passed_s=passed,
        dropped=logged_meanwhile,
        redraws=since,
        gap_s=longest_gap_s(redraws(screen), begin_s),
        service_before_kib=service_before,
        service_after_kib=service.resident_kib(),
    )


def stop_and_continue(service: Program, screen: Program) -> None:
    """Stops the application until the service has logged what it misses; its screen is live afterwards."""
    text = f"Message port {APPLICATION_PORT}: messages dropped"
    before = service.lines.count(text)
    screen.send_signal(signal.SIGSTOP)
    time.sleep(STOPPED_S)
    # A busy machine takes longer to send as many messages as the queue holds.
    wait_for(
        "the log line of what the stopped application missed", lambda: service.lines.count(text) > before, 60
    )
    screen.send_signal(signal.SIGCONT)
    next_redraw(screen, since_s=time.monotonic())


def run_flood(options: Options) -> None:
    """Floods, prints what was measured and checks it."""
    with tempfile.TemporaryDirectory() as directory, Sandbox(options.build, Path(directory)) as sandbox:
        service = sandbox.service(f"scenario:gsm,seed=1,speed={RATE // OWN_RATE}")
        screen = sandbox.screen()
        begin = next_redraw(screen)
        silent = RawClient(sandbox, "silent")
        silent.start_streaming()
        result = measure_flood(service, screen, options.seconds, begin)
        print(result, flush=True)
        stop_and_continue(service, screen)
        result.check(options.strict)
        silent.close()
        screen.end_cleanly()
        service.end_cleanly()
