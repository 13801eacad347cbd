# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Connections that only take up room: idle ones, frames that never end, channels to the service itself."""

import re
import socket
import tempfile
import threading
import time
from collections.abc import Iterator
from contextlib import contextmanager
from dataclasses import dataclass
from pathlib import Path

from velmora_chaos.checks import expect, wait_for
from velmora_chaos.options import Options
from velmora_chaos.program import Program
from velmora_chaos.raw_client import HEADER, ONE_WAY, RawClient, call, connect
from velmora_chaos.sandbox import DISPLAY, LOAD, SERVER_PORT, Sandbox

MOST_CONNECTIONS = 64  # of a port
IDLE_S = 10
RETRY_S = 5  # a client that is refused tries again
SLACK_S = 10  # of a machine that is busy with other tests
HOARDERS = 12
HOARD = 15 << 20
MOST_HOARDED_KIB = 64 << 10
GROWTH_KIB = 40 << 10  # besides, for its clients and the allocator; without a bound it is three times as much
REFUSED = 5_000
REFUSED_KIND = "refused requests for log channels"
LINES_PER_SECOND = 11  # of a kind, with the count of those left out


@dataclass(frozen=True)
class CrowdResult:
    """What the service did meanwhile."""

    late_s: float
    growth_kib: int
    displays: int
    refused_s: float
    lines: int
    counted: int

    def __str__(self) -> str:
        return (
            f"a new client beside {MOST_CONNECTIONS} idle connections: first display after {self.late_s:.1f} s; "
            f"{HOARDERS} unfinished frames of {HOARD >> 20} MiB took {self.growth_kib} KiB, and it received "
            f"{self.displays} displays meanwhile; {REFUSED} requests for channels to the service itself were "
            f"refused in {self.refused_s:.1f} s, {self.lines} lines and {self.counted} counted"
        )

    def check(self) -> None:
        """Raises Problem where the crowd took more than it may."""
        limit_s = IDLE_S + RETRY_S + SLACK_S
        expect(self.late_s <= limit_s, f"{self.late_s:.1f} s until a display, wanted at most {limit_s}")
        most_kib = MOST_HOARDED_KIB + GROWTH_KIB
        expect(self.growth_kib <= most_kib, f"grew by {self.growth_kib} KiB, wanted at most {most_kib}")
        expect(self.displays >= 1, "no display beside unfinished frames")
        most = LINES_PER_SECOND * (int(self.refused_s) + 2)
        expect(self.lines <= most, f"{self.lines} lines about refused requests, wanted at most {most}")
        told = self.lines + self.counted
        expect(told >= REFUSED, f"{told} of {REFUSED} refused requests were logged or counted")


@contextmanager
def idle_crowd(port: Path) -> Iterator[None]:
    """Holds as many connections as the port takes, and replaces none that the service closes."""
    held = [connect(port) for _ in range(MOST_CONNECTIONS)]
    try:
        yield
    finally:
        for each in held:
            each.close()


def time_to_display(sandbox: Sandbox) -> tuple[float, Program]:
    """How long a new client takes until its first display, and the client."""
    start = time.monotonic()
    watch = sandbox.watch()
    limit_s = IDLE_S + 2 * RETRY_S + 2 * SLACK_S
    wait_for("a display beside idle connections", lambda: watch.lines.count(DISPLAY), limit_s)
    return time.monotonic() - start, watch


def hoard(connection: socket.socket) -> None:
    """Sends a frame that lacks its end; ends early where the service closes the connection."""
    try:
        connection.sendall(HEADER.pack(HOARD + 1, 0, ONE_WAY, 0) + bytes(HOARD))
    except OSError:
        pass


def hoard_all(ports: list[Path], service: Program) -> int:
    """The growth in KiB of the service while unfinished frames are sent to its ports."""
    before_kib = service.resident_kib()
    connections = [connect(ports[number % len(ports)]) for number in range(HOARDERS)]
    threads = [threading.Thread(target=hoard, args=(each,)) for each in connections]
    for thread in threads:
        thread.start()
    most_kib = 0
    while any(thread.is_alive() for thread in threads):
        most_kib = max(most_kib, service.resident_kib())
        time.sleep(0.01)
    time.sleep(0.5)
    most_kib = max(most_kib, service.resident_kib())
    for each in connections:
        each.close()
    return most_kib - before_kib


def ask_for_itself(port: Path) -> float:
    """Asks the service for channels to its own names, and returns how long that took."""
    start = time.monotonic()
    with connect(port) as server:
        for number in range(REFUSED):
            name = SERVER_PORT if number % 2 else f"{SERVER_PORT}.channel.{number}"
            reply = call(server, {"CreateLogChannel": name})
            expect(reply == {"Error": 5}, f"a channel to {name}: {reply}, wanted an error of 5")
    return time.monotonic() - start


def counted_lines(texts: list[str], kind: str) -> int:
    """The sum of the counts that were logged for lines of that kind that were left out."""
    counts = [re.search(rf"{kind}: (\d+) more within a second$", text) for text in texts]
    return sum(int(found[1]) for found in counts if found)


def refused_lines(texts: list[str]) -> int:
    """How many lines say that a channel to the service itself was refused."""
    return sum("that name is the service's own" in text for text in texts)


def reported(service: Program) -> int:
    """How many refused requests the service has logged or counted."""
    texts = [line.text for line in service.lines.all()]
    return refused_lines(texts) + counted_lines(texts, REFUSED_KIND)


def run_crowd(options: Options) -> None:
    """Runs the crowd, prints what the service did and checks it."""
    with tempfile.TemporaryDirectory() as directory, Sandbox(options.build, Path(directory)) as sandbox:
        service = sandbox.service(LOAD)
        with idle_crowd(sandbox.port()):
            late_s, watch = time_to_display(sandbox)
        client = RawClient(sandbox, "client")
        before = watch.lines.count(DISPLAY)
        growth_kib = hoard_all([sandbox.port(), *sandbox.ports("*.channel.*[0-9]")], service)
        wait_for("a display beside unfinished frames", lambda: watch.lines.count(DISPLAY) > before)
        displays = watch.lines.count(DISPLAY) - before
        refused_s = ask_for_itself(sandbox.port())
        wait_for("the last count, which comes when its second is over", lambda: reported(service) >= REFUSED)
        texts = [line.text for line in service.lines.all()]
        result = CrowdResult(
            late_s=late_s,
            growth_kib=growth_kib,
            displays=displays,
            refused_s=refused_s,
            lines=refused_lines(texts),
            counted=counted_lines(texts, REFUSED_KIND),
        )
        print(result, flush=True)
        result.check()
        client.close()
        service.end_cleanly()
