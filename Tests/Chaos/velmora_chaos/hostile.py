# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""A thousand hostile connections to every port, beside an honest client."""

import random
import socket
import tempfile
import time
from concurrent.futures import ThreadPoolExecutor
from dataclasses import dataclass
from pathlib import Path

from velmora_chaos.checks import expect, wait_for
from velmora_chaos.malformed import malformed_input
from velmora_chaos.options import Options
from velmora_chaos.raw_client import connect
from velmora_chaos.redraws import REDRAW_S, SLACK_S, longest_gap_s, next_redraw, redraws
from velmora_chaos.sandbox import APPLICATION_PORT, DISPLAY, LOAD, Sandbox

ATTACKERS = 24
CONNECTIONS = 42  # by attacker
PARALLEL = 8
MOST_HELD = 100  # connections that an attacker keeps open


@dataclass(frozen=True)
class HostileResult:
    """What the honest client and the screen saw meanwhile."""

    attack_s: float
    refused: int
    gap_s: float
    displays: int
    passed_s: float

    def __str__(self) -> str:
        return (
            f"{ATTACKERS * CONNECTIONS} hostile connections within {self.attack_s:.2f} s "
            f"({self.refused} refused): longest time without a redraw {self.gap_s:.2f} s; another client "
            f"received {self.displays} displays in {self.passed_s:.1f} s"
        )

    def check(self) -> None:
        """Raises Problem where the honest client or the screen was kept waiting."""
        expect(self.gap_s <= 2 * REDRAW_S + SLACK_S, f"{self.gap_s:.2f} s without a redraw")
        wanted = int(self.passed_s / REDRAW_S) - 2
        expect(
            self.displays >= wanted,
            f"another client received {self.displays} displays, wanted at least {wanted}",
        )


def attack(port: Path, count: int, seed: int) -> int:
    """Opens connections one after the other, keeps half of them open for a while; returns how many failed."""
    chance = random.Random(seed)
    held: list[socket.socket] = []
    refused = 0
    for _ in range(count):
        try:
            connection = connect(port)
            connection.sendall(malformed_input(chance))
        except OSError:
            refused += 1
            continue
        if chance.random() < 0.5:
            connection.close()
        else:
            held.append(connection)
        if len(held) > MOST_HELD:
            held.pop(chance.randrange(len(held))).close()
    for each in held:
        each.close()
    return refused


def attack_all(ports: list[Path], seed: int) -> int:
    """Attacks the ports in parallel; returns how many connections failed."""
    with ThreadPoolExecutor(PARALLEL) as pool:
        attacks = [
            pool.submit(attack, ports[number % len(ports)], CONNECTIONS, seed + number)
            for number in range(ATTACKERS)
        ]
        return sum(each.result() for each in attacks)


def run_hostile(options: Options) -> None:
    """Attacks, prints what the others saw, and checks it and that a new client is served."""
    with tempfile.TemporaryDirectory() as directory, Sandbox(options.build, Path(directory)) as sandbox:
        service = sandbox.service(LOAD)
        screen = sandbox.screen()
        watch = sandbox.watch()
        begin = next_redraw(screen)
        wait_for("the client's first display", lambda: watch.lines.count(DISPLAY))
        before = watch.lines.count(DISPLAY)
        channel = wait_for("the log channel", lambda: sandbox.ports("*.channel.*[0-9]"))[0]
        start = time.monotonic()
        refused = attack_all([sandbox.port(), channel, sandbox.port(APPLICATION_PORT)], options.seed)
        attack_s = time.monotonic() - start
        next_redraw(screen)
        time.sleep(2 * REDRAW_S)
        result = HostileResult(
            attack_s=attack_s,
            refused=refused,
            passed_s=time.monotonic() - start,
            gap_s=longest_gap_s(redraws(screen), begin),
            displays=watch.lines.count(DISPLAY) - before,
        )
        print(result, flush=True)
        result.check()
        late = sandbox.watch()
        wait_for("a new client's display", lambda: late.lines.count(DISPLAY))
        screen.end_cleanly()
        service.end_cleanly()
