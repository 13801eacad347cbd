# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The command line."""

import argparse
import os
from pathlib import Path

from velmora_compare.recordings import DEFAULT, TITLES

ROOT = Path(__file__).resolve().parents[2]


def _names(text: str) -> list[str]:
    return [name for name in text.split(",") if name]


def parse(arguments: list[str], description: str, programs: str) -> argparse.Namespace:
    parser = argparse.ArgumentParser(description=description, epilog=programs,
                                     formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--build", type=Path, default=ROOT / "build", help="build directory (optimised)")
    parser.add_argument("--before", type=Path,
                        help="another build directory, whose velmora-log runs in the same rounds")
    parser.add_argument("--programs", type=_names,
                        help="which, as in lines,by-hand; by default all but stats and events")
    parser.add_argument("--recordings", type=_names, default=list(DEFAULT),
                        help=f"which of {', '.join(TITLES)}; by default {','.join(DEFAULT)}")
    parser.add_argument("--messages", type=int, default=1_000_000, help="slow programs get a twentieth of them")
    parser.add_argument("--rounds", type=int, default=5)
    parser.add_argument("--seed", type=int, default=1)
    parser.add_argument("--time", choices=["cpu", "wall", "none"], default="cpu",
                        help="cpu, the default, is user and system time, for a machine that is not idle")
    parser.add_argument("--instructions", choices=["quick", "all", "none"], default="quick",
                        help="quick: where they are not counted by the processor, leave out tshark, which then takes "
                             "minutes to start")
    parser.add_argument("--counted", type=int, default=20_000,
                        help="messages whose instructions are counted without the processor's counter")
    parser.add_argument("--core", type=int, default=max(os.sched_getaffinity(0)))
    parser.add_argument("--directory", type=Path,
                        help="where recordings are made and kept; by default they are removed")
    chosen = parser.parse_args(arguments)
    unknown = [name for name in chosen.recordings if name not in TITLES]
    if unknown:
        parser.error(f"no recording {', '.join(unknown)}; there are {', '.join(TITLES)}")
    if chosen.messages < 400 or chosen.rounds < 1 or chosen.counted < 400:
        parser.error("at least 400 messages and one round are needed")
    return chosen
