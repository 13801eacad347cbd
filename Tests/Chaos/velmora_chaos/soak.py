# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Recorded hours at full speed, and the memory that they take.

A drive of so many hours goes through velmora-log decode, which prints each refresh, and, played by the service to the
application, through the ports to the screen. From the sixth refresh on the memory of neither grows by 1 MiB.

usage: soak BUILD_DIRECTORY [--hours H] [--scenario NAME] [--only decode|live] [--live-seconds S]

The live drive is H hours within S seconds, or as many as the machine can.
"""

import argparse
import os
import subprocess
import sys
import tempfile
import time

from velmora_chaos.sandbox import House, Problem, expect, next_event, redraws, resident_kib

REFRESHES = 5  # after them the history is full
GROWTH_KIB = 1024
REFRESH_S = 2


def told(name, refreshes, first, most):
    print(
        f"{name}: {refreshes} refreshes; {first} KiB after the first {REFRESHES}, "
        f"at most {most - first:+d} KiB later",
        flush=True,
    )
    expect(refreshes > 2 * REFRESHES, "too few refreshes to tell")
    expect(most - first < GROWTH_KIB, f"{name}: grew by {most - first} KiB, wanted less than {GROWTH_KIB}")


def decode(options):
    """The refreshes are taken as they come, so that the program is never far ahead of what is looked at."""
    drive = subprocess.Popen(
        [os.path.join(options.build, "tests", "make-drive"), options.scenario, "1", f"{options.hours}h", "-"],
        stdout=subprocess.PIPE,
    )
    tool = subprocess.Popen(
        [os.path.join(options.build, "velmora-log"), "decode", "--log-level", "0", "--format", "jsonl", "-"],
        stdin=drive.stdout,
        stdout=subprocess.PIPE,
        stderr=subprocess.PIPE,
    )
    drive.stdout.close()
    begun = time.monotonic()
    refreshes = first = most = size = 0
    while chunk := tool.stdout.read1(1 << 18):
        refreshes += chunk.count(b"\n")
        size += len(chunk)
        if refreshes > REFRESHES and size > 1 << 20:  # the buffers of the output have been filled, too
            memory = resident_kib(tool)
            first = first or memory
            most = max(most, memory)
    errors = tool.stderr.read().decode()
    expect(drive.wait() == 0 and tool.wait() == 0, f"failed: {errors[-500:]}")
    expect(refreshes >= 0.9 * options.hours * 3600 / REFRESH_S, f"{refreshes} refreshes")
    name = f"decode, {options.hours:g} h of {options.scenario} within {time.monotonic() - begun:.1f} s"
    told(name, refreshes, first, most)


def live(options):
    speed = options.hours * 3600 / options.live_seconds
    with tempfile.TemporaryDirectory() as directory, House(options.build, directory) as house:
        service = house.service(f"scenario:{options.scenario},seed=1,speed={speed:.0f}")
        screen = house.screen()
        next_event(screen, "redraw", 30)
        service_first = 0
        end = time.monotonic() + options.live_seconds
        while time.monotonic() < end:
            next_event(screen, "redraw", 30)
            if not service_first and len(redraws(screen)) > REFRESHES:
                service_first = resident_kib(service)
        seen = [memory for _, _, memory in redraws(screen)][REFRESHES:]
        name = f"live, {options.hours:g} h of {options.scenario} within {options.live_seconds:g} s, the application"
        told(name, len(seen) + REFRESHES, seen[0], max(seen))
        service_last = resident_kib(service)
        told("the service", len(seen) + REFRESHES, service_first, max(service_first, service_last))
        expect(service.lines.count("messages dropped") == 0, "messages were dropped")


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build")
    parser.add_argument("--hours", type=int, default=24)
    parser.add_argument("--scenario", default="gsm")
    parser.add_argument("--only", default="")
    parser.add_argument("--live-seconds", type=float, default=60)
    options = parser.parse_args()
    options.build = os.path.abspath(options.build)
    try:
        for part in (decode, live):
            if options.only in part.__name__:
                part(options)
    except Problem as problem:
        print(problem, file=sys.stderr)
        return 1
    return 0
