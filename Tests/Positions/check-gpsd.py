#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Records positions of a gpsd that its own gpsfake feeds, loses it, and gets it back.

usage: check-gpsd.py BUILD

BUILD has velmora-log and velmora-telephonyd.
"""

from __future__ import annotations

import json
import os
import signal
import socket
import subprocess
import sys
import tempfile
import time
from collections.abc import Callable
from pathlib import Path

from positions import expect, finish, need, run, sentence

need("gpsd", "gpsfake")
BUILD = Path(sys.argv[1])
LOG = BUILD / "velmora-log"


def free_port() -> int:
    with socket.socket() as probe:
        probe.bind(("127.0.0.1", 0))
        return int(probe.getsockname()[1])


def drive() -> str:
    """A receiver that goes north by 18.52 m a second, for gpsfake to repeat."""
    text = ""
    for second in range(600):
        clock = f"12{second // 60:02d}{second % 60:02d}.00"
        place = f"59{second * 0.01:07.4f},N,01803.0000,E"
        text += sentence(f"GPGGA,{clock},{place},1,08,0.9,12.0,M,20.0,M,,")
        text += sentence(f"GPRMC,{clock},A,{place},36.0,0.0,221126,,,A")
    return text


class Receiver:
    """gpsfake, with the gpsd that it starts."""

    def __init__(self, log: Path, port: int) -> None:
        command = ["gpsfake", "-q", "-c", "0.05", "-P", str(port), str(log)]
        self.process = subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
                                        start_new_session=True)

    def wait_for(self, port: int) -> None:
        for _ in range(100):
            with socket.socket() as probe:
                if probe.connect_ex(("127.0.0.1", port)) == 0:
                    return
            time.sleep(0.1)
        raise SystemExit("gpsfake's gpsd does not listen")

    def end(self) -> None:
        os.killpg(self.process.pid, signal.SIGTERM)
        self.process.wait()


def wait_until(what: str, holds: Callable[[], bool]) -> None:
    until = time.monotonic() + 60
    while not holds():
        if time.monotonic() > until:
            raise SystemExit(f"{what} did not come")
        time.sleep(0.1)


def fixes_of(recording: Path) -> int:
    """So far; the recorder may be writing its last block."""
    ended = subprocess.run([str(LOG), "info", "--format", "json", str(recording)], capture_output=True, text=True, check=False)
    positions = json.loads(ended.stdout).get("positions") if ended.stdout else None
    return int(positions["fixes"]) if positions else 0


with tempfile.TemporaryDirectory() as temporary:
    directory = Path(temporary)
    os.environ["VELMORA_PORT_DIR"] = str(directory / "ports")
    nmea, recording, port = directory / "drive.nmea", directory / "drive.pcapng", free_port()
    nmea.write_text(drive(), encoding="ascii")
    (directory / "ports").mkdir(mode=0o700)
    service = subprocess.Popen([str(BUILD / "velmora-telephonyd"), "--source", "scenario:gsm,seed=1"],
                               stderr=subprocess.DEVNULL)
    receiver = Receiver(nmea, port)
    receiver.wait_for(port)
    log = directory / "errors"
    with log.open("w", encoding="utf-8") as out:
        recorder = subprocess.Popen([str(LOG), "record", "--gps", f"gpsd:127.0.0.1:{port}", str(recording)], stderr=out)
    try:
        wait_until("ten fixes", lambda: fixes_of(recording) >= 10)
        receiver.end()
        wait_until("the loss", lambda: "is gone" in log.read_text(encoding="utf-8"))
        before = fixes_of(recording)
        receiver = Receiver(nmea, port)
        wait_until("ten more fixes", lambda: fixes_of(recording) >= before + 10)
        recorder.send_signal(signal.SIGINT)
        recorder.wait(timeout=60)
    finally:
        receiver.end()
        recorder.kill()
        recorder.wait()
        service.terminate()
        service.wait()
    errors = log.read_text(encoding="utf-8")
    expect(recorder.returncode == 0, f"record: status {recorder.returncode}: {errors}")
    expect(f"gpsd at 127.0.0.1:{port} is gone" in errors, f"the loss is not said: {errors}")
    expect(f"gpsd at 127.0.0.1:{port} is there" in errors, f"that it is back is not said: {errors}")
    info = json.loads(run(LOG, "info", "--format", "json", recording))
    positions = info.get("positions", {"fixes": 0, "messages": 0})
    expect(positions["fixes"] > 20, f"{positions['fixes']} fixes")
    expect(positions["messages"] > 0, f"{positions['messages']} messages with a position")
    text = run(LOG, "decode", "--samples", "--positions", "--format", "jsonl", recording)
    placed = [line for line in map(json.loads, text.splitlines()) if "latitude" in line]
    expect(bool(placed), "no sample has a position")
    for line in placed:
        expect(59 <= line["latitude"] <= 59.101 and abs(line["longitude"] - 18.05) < 1e-5, f"place {line}")
finish()
