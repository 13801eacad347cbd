#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Records positions of the modem, of track files by their times and of a pipe, as programs that run.

usage: check-record.py BUILD

BUILD has velmora-log and velmora-telephonyd.
"""

from __future__ import annotations

import json
import os
import subprocess
import sys
import tempfile
import threading
import time
from datetime import datetime, timedelta, timezone
from pathlib import Path

from positions import distance_from_road, expect, finish, run, samples, sentence

BUILD = Path(sys.argv[1])
LOG = BUILD / "velmora-log"
DURATION = 7
NORTH = 0.0002  # degrees a second


def gpx(start: datetime, seconds: range) -> str:
    """A track that goes north from the equator at the start, a point a second."""
    points = "".join(f'<trkpt lat="{i * NORTH:.6f}" lon="18.05"><time>{start + timedelta(seconds=i):%Y-%m-%dT%H:%M:%SZ}'
                     "</time></trkpt>\n" for i in seconds)
    return f'<gpx version="1.1" creator="test"><trk><trkseg>\n{points}</trkseg></trk></gpx>\n'


def rmc(moment: datetime, latitude: float) -> str:
    return sentence(f"GPRMC,{moment:%H%M%S}.00,A,{int(latitude):02d}{latitude % 1 * 60:07.4f},N,01803.0000,E,0.0,,"
                    f"{moment:%d%m%y},,,A")


def positions_of(recording: Path) -> dict[str, int]:
    found: dict[str, int] = json.loads(run(LOG, "info", "--format", "json", recording)).get("positions", {})
    return found


def record(recording: Path, gps: str | Path) -> subprocess.Popen[str]:
    return subprocess.Popen([str(LOG), "record", "--gps", str(gps), "--duration", str(DURATION), str(recording)],
                            stderr=subprocess.PIPE, text=True)


def check_by_time(recording: Path, start: datetime) -> None:
    """Each sample lies where the track is at its time."""
    rows = [row for row in samples(LOG, recording) if row["latitude"]]
    expect(len(rows) > 100, f"{recording.name}: {len(rows)} samples have a position")
    for row in rows:
        moment = datetime.fromisoformat(row["time"][:26] + "+00:00")
        wanted = (moment - start).total_seconds() * NORTH
        expect(abs(float(row["latitude"]) - wanted) < 2e-6 and abs(float(row["longitude"]) - 18.05) < 2e-6,
               f"{recording.name}: {row['latitude']} {row['longitude']} at {moment}, wanted {wanted}")


def check_errors(directory: Path) -> None:
    """What cannot be read is refused before anything is recorded, with the file and the line."""
    (directory / "empty.gpx").touch()
    (directory / "other.csv").write_text("time,latitude\n1,2\n", encoding="ascii")
    (directory / "cut.gpx").write_text(gpx(datetime.now(timezone.utc), range(9))[:300], encoding="ascii")
    (directory / "map.kml").write_text('<?xml version="1.0"?>\n<kml/>\n', encoding="ascii")
    (directory / "untimed.gpx").write_text('<gpx><trk>\n<trkseg>\n<trkpt lat="1" lon="2"/></trkseg></trk></gpx>',
                                           encoding="ascii")
    out = directory / "refused.pcapng"
    for name, reason in (("missing.gpx", "cannot be opened: No such file or directory"),
                         ("empty.gpx", "empty, wanted GPX or NMEA sentences"),
                         ("other.csv", "line 1: no NMEA sentence and no GPX"),
                         ("cut.gpx", "line 5: no GPX: "),
                         ("map.kml", "line 2: root element is kml, wanted gpx"),
                         ("untimed.gpx", "line 3: none of 1 track points has a place and a time")):
        for command in (("record", "--gps", directory / name, out),
                        ("convert", "--track", directory / name, directory / "modem.pcapng", out)):
            ended = subprocess.run([str(LOG), *map(str, command)], capture_output=True, text=True, check=False)
            wanted = f"velmora-log: {directory / name}: {reason}"
            expect(ended.returncode == 1 and wanted in ended.stderr,
                   f"{command[0]} with {name}: status {ended.returncode}, {ended.stderr!r}, wanted {wanted!r}")
            expect(not out.exists(), f"{command[0]} with {name} leaves a file")


def feed(pipe: Path, start: datetime) -> None:
    """A receiver: a sentence each half second, with its time, and what a logger adds."""
    with pipe.open("w", encoding="ascii", buffering=1) as out:
        for number in range(2 * DURATION - 4):
            out.write("# noise\n" + rmc(start + timedelta(seconds=number / 2), 59.5))
            time.sleep(0.5)


with tempfile.TemporaryDirectory() as temporary:
    directory = Path(temporary)
    os.environ["VELMORA_PORT_DIR"] = str(directory / "ports")
    (directory / "ports").mkdir(mode=0o700)
    start = datetime.now(timezone.utc).replace(microsecond=0)
    track, log, old, pipe = (directory / name for name in ("track.gpx", "log.nmea", "old.gpx", "receiver"))
    track.write_text(gpx(start, range(-5, 120)), encoding="ascii")
    log.write_text("".join(rmc(start + timedelta(seconds=i), i * NORTH) for i in range(120)), encoding="ascii")
    old.write_text(gpx(start - timedelta(days=1), range(10)), encoding="ascii")
    os.mkfifo(pipe)
    service = subprocess.Popen([str(BUILD / "velmora-telephonyd"), "--source", "scenario:modem,seed=7,speed=8"],
                               stderr=subprocess.DEVNULL)
    sender = threading.Thread(target=feed, args=(pipe, start), daemon=True)
    sender.start()
    try:
        sources: dict[str, str | Path] = {"modem": "modem", "gpx": track, "nmea": log, "old": old, "pipe": pipe}
        recorders = {name: record(directory / f"{name}.pcapng", source) for name, source in sources.items()}
        errors = {name: recorder.communicate(timeout=60)[1] for name, recorder in recorders.items()}
    finally:
        service.terminate()
        service.wait()
    for name, recorder in recorders.items():
        expect(recorder.returncode == 0, f"record --gps {name}: status {recorder.returncode}: {errors[name]}")
    for name in ("gpx", "nmea"):
        found = positions_of(directory / f"{name}.pcapng").get("fixes", 0)
        expect(DURATION - 3 <= found <= DURATION + 1, f"{name}: {found} fixes")
        check_by_time(directory / f"{name}.pcapng", start)
    expect(positions_of(directory / "modem.pcapng").get("fixes", 0) >= 2, "too few fixes of the modem")
    placed = [row for row in samples(LOG, directory / "modem.pcapng", "--max-gap", "5") if row["latitude"]]
    expect(len(placed) > 50, f"modem: {len(placed)} samples have a position")
    for row in placed:
        expect(distance_from_road(float(row["latitude"]), float(row["longitude"])) < 5, f"modem: {row}")
    expect(not positions_of(directory / "old.pcapng"), "fixes of yesterday")
    expect("all of its fixes are before now" in errors["old"], f"not said: {errors['old']}")
    expect(positions_of(directory / "pipe.pcapng").get("fixes", 0) >= 4, "too few fixes of the pipe")
    expect(f"{pipe} has ended; recording goes on without positions" in errors["pipe"], f"not said: {errors['pipe']}")
    check_errors(directory)
finish()
