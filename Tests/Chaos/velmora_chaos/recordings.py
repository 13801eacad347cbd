# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Files that are removed, truncated, moved and replaced while a recorder writes to them."""

import os
import random
import subprocess
import tempfile
import time
from collections.abc import Callable, Mapping, Sequence
from pathlib import Path

from velmora_chaos.checks import expect, wait_for
from velmora_chaos.failing.recording import BLOCK, LEAST_BLOCK, messages
from velmora_chaos.options import Options
from velmora_chaos.sandbox import Sandbox

DRIVE = "scenario:gsm,seed=1,speed="
DRIVE_MESSAGES = 12_000  # more than a round records, on a busy machine too
ROUND_SPEED = 20
MOST_ROUNDS = 10
NOTICED_S = 1.0
SLACK_S = 4.0  # of a busy machine
SECOND_S = 60  # for another recorder to say that it cannot record there
LATE = 200  # messages that may arrive between a copy and the truncation after it
FILE = "drive.pcapng"
NEXT_FILE = "drive-2.pcapng"


def replace(path: Path) -> None:
    """Puts another file in its place."""
    other = path.with_suffix(".other")
    other.write_bytes(b"another file")
    os.replace(other, path)


CHANGES: Mapping[str, Callable[[Path], object]] = {
    "was removed": Path.unlink,
    "was truncated": lambda path: os.truncate(path, 0),
    "was moved away": lambda path: path.rename(path.with_suffix(".moved")),
    "was replaced by another file": replace,
}


def whole_blocks(recording: bytes) -> bytes:
    """The recording without a block at its end that is cut off."""
    at = 0
    while at + LEAST_BLOCK <= len(recording):
        _, length = BLOCK.unpack_from(recording, at)
        if not LEAST_BLOCK <= length <= len(recording) - at:
            break
        at += length
    return recording[:at]


def recorded(path: Path) -> list[bytes]:
    """The messages of a file that is being recorded to, none where it is not there yet."""
    return list(messages(whole_blocks(path.read_bytes()))) if path.exists() else []


def gap(drive: Sequence[bytes], before: Sequence[bytes], after: Sequence[bytes]) -> int | None:
    """How many of the drive's messages are missing between what was recorded before and after the change; a few
    may be in both. None where one of the two is not a part of the drive without a gap."""
    if list(drive[: len(before)]) != list(before) or not after:
        return None
    starts = [
        start
        for start in range(len(drive) - len(after) + 1)
        if list(drive[start : start + len(after)]) == list(after)
    ]
    return max(0, starts[0] - len(before)) if starts else None


def try_change(options: Options, drive: Sequence[bytes], change: str, chance: random.Random) -> float:
    """Changes the file of a recorder; returns how long the recorder took to notice, in seconds."""
    with tempfile.TemporaryDirectory() as name, Sandbox(options.build, Path(name)) as sandbox:
        path = Path(name) / FILE
        sandbox.service(f"{DRIVE}{ROUND_SPEED}")
        recorder = sandbox.recorder(path)
        wait_for("the first messages", lambda: path.exists() and path.stat().st_size > 1000)
        second = subprocess.run(
            [str(options.build / "velmora-log"), "record", "--force", str(path)],
            env=sandbox.environment,
            stderr=subprocess.PIPE,
            text=True,
            timeout=SECOND_S,
            check=False,
        )
        expect(second.returncode == 1, f"a second recorder ended with {second.returncode}, wanted 1")
        expect("is being recorded to" in second.stderr, f"a second recorder said {second.stderr}")
        time.sleep(chance.uniform(0, 1.5))
        with path.open("rb") as file:
            before = file.read()
            CHANGES[change](path)
            start = time.monotonic()
            wait_for(f"that the file {change}", lambda: recorder.lines.count(f"{path} {change}; "))
            noticed_s = time.monotonic() - start
            wait_for("messages in the next file", lambda: recorded(path.parent / NEXT_FILE))
            time.sleep(chance.uniform(0, 0.7))
            recorder.end_with(1)
            if change != "was truncated":
                file.seek(0)
                before = file.read()
        after = (path.parent / NEXT_FILE).read_bytes()
    missing = gap(drive, messages(whole_blocks(before)), messages(after))
    expect(missing is not None, f"{change}: the messages differ from the drive's")
    limit = LATE if change == "was truncated" else 0
    expect((missing or 0) <= limit, f"{change}: {missing} messages are missing")
    return noticed_s


def run_recordings(options: Options) -> None:
    """Changes files, prints how soon that was noticed and checks what was recorded."""
    with tempfile.TemporaryDirectory() as name, Sandbox(options.build, Path(name)) as sandbox:
        sandbox.service(f"{DRIVE}200")
        path = Path(name) / FILE
        recorder = sandbox.recorder(path, "--count", str(DRIVE_MESSAGES))
        recorder.wait_for_end(0)
        drive = messages(path.read_bytes())
    chance = random.Random(options.seed)
    rounds = min(options.rounds, MOST_ROUNDS)
    noticed_s = [try_change(options, drive, change, chance) for _ in range(rounds) for change in CHANGES]
    print(
        f"{len(noticed_s)} files of recorders changed by others, noticed after {max(noticed_s):.2f} s at most, "
        "no message lost",
        flush=True,
    )
    expect(max(noticed_s) <= NOTICED_S + (0 if options.strict else SLACK_S), "noticed too late")
