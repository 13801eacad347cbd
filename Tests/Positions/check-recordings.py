#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Checks that recordings keep their positions, and that samples have them on the road of the drive.

usage: check-recordings.py BUILD

BUILD has velmora-log, velmora.lua and tests/make-drive. Capture tools are editcap, mergecap and tshark.
"""

from __future__ import annotations

import csv
import io
import json
import math
import re
import sys
import tempfile
from collections import defaultdict
from datetime import datetime, timedelta
from pathlib import Path

from positions import distance_from_road, expect, finish, need, run, samples, sentence

need("editcap", "mergecap", "tshark")
BUILD = Path(sys.argv[1])
LOG, DRIVE = BUILD / "velmora-log", BUILD / "tests" / "make-drive"


def fixes_of(recording: Path) -> int:
    (technologies,) = [json.loads(run(LOG, "info", "--format", "json", recording))]
    positions = technologies.get("positions")
    return int(positions["fixes"]) if positions else 0


def check_road(recording: Path, scenario: str) -> None:
    rows = samples(LOG, recording)
    placed = [row for row in rows if row["latitude"]]
    expect(len(placed) > 0.95 * len(rows), f"{scenario}: {len(placed)} of {len(rows)} samples have a position")
    for row in placed:
        distance = distance_from_road(float(row["latitude"]), float(row["longitude"]))
        expect(distance < 1, f"{scenario}: record {row['record']} is {distance} m from the road")
        expect(0 <= float(row["fix_age"]) <= 1, f"{scenario}: record {row['record']} has age {row['fix_age']}")
        expect(row["hdop"] == "0.90" and row["altitude"] == "12.50", f"{scenario}: record {row['record']}: {row}")


def square_of(latitude: float, longitude: float, size: float) -> str:
    """The square's name, as Documentation/positions.md defines it."""
    degree = 2 * math.pi * 6_371_008.8 / 360
    row = math.floor(latitude * degree / size)
    middle = (row + 0.5) * size / degree
    columns = max(1, round(360 * degree * math.cos(math.radians(middle)) / size))
    column = math.floor((longitude + 180) * columns / 360)
    return f"{middle:.6f},{(column + 0.5) * 360 / columns - 180:.6f}"


def check_squares(recording: Path) -> None:
    """Count and median of each square, of the samples' own positions."""
    path = "/GSM/GSM Serving Cell/RSSI"
    values = defaultdict(list)
    for row in samples(LOG, recording, "--select", path):
        if row["value"]:
            name = square_of(float(row["latitude"]), float(row["longitude"]), 50) if row["latitude"] else None
            values[name].append(float(row["value"]))
    text = run(LOG, "stats", "--by", "square:50m", "--select", path, "--format", "json", recording)
    decoder, at, found = json.JSONDecoder(), 0, {}
    while text[at:].strip():
        group, length = decoder.raw_decode(text[at:].lstrip())
        at = len(text) - len(text[at:].lstrip()) + length
        for technology in group["technologies"]:
            for field in technology["numbers"]:
                if field.get("samples"):
                    found[group["square"]] = (field["samples"], field["p50"])
    wanted = {name: (len(each), sorted(each)[max(1, -(-len(each) // 2)) - 1]) for name, each in values.items()}
    expect(len(wanted) > 5, f"{len(wanted)} squares")
    for name in {*wanted, *found}:
        expect(found.get(name) == wanted.get(name),
               f"square {name}: count and median {found.get(name)}, wanted {wanted.get(name)}")


def check_samples_without(recording: Path, plain: Path, scenario: str) -> None:
    """Positions change nothing unless they are asked for, but for the records' numbers."""

    def without_numbers(path: Path) -> list[str]:
        text = run(LOG, "decode", "--samples", "--format", "csv", path)
        return [line.rpartition(",")[0] for line in text.splitlines()]

    expect(without_numbers(recording) == without_numbers(plain), f"{scenario}: samples differ without --positions")
    expect(run(LOG, "decode", recording) == run(LOG, "decode", plain), f"{scenario}: displays differ")


def check_part(recording: Path, part: Path, *options: str) -> None:
    """A part has the fixes of its time and one at each side, and its samples lie where they lie in the whole."""
    run(LOG, "convert", "--force", *options, recording, part)
    whole, rows = ([{name: row[name] for name in ("time", "path", "value", "latitude", "longitude", "fix_age")}
                    for row in samples(LOG, each, *ranged)] for each, ranged in ((recording, options), (part, ())))
    expect(whole == rows and len(rows) > 10 and all(row["latitude"] for row in rows),
           f"part {options}: {len(rows)} samples, {len(whole)} in the whole")
    (start, end) = (datetime.fromisoformat(json.loads(run(LOG, "info", "--format", "json", part))["positions"][name]
                                           .replace("Z", "+00:00")) for name in ("first", "last"))
    times = [datetime.fromisoformat(row["time"].replace("Z", "+00:00")[:26] + "+00:00") for row in rows]
    second = timedelta(seconds=1)
    expect(min(times) - 2 * second <= start <= min(times), f"part {options}: first fix at {start}")
    expect(max(times) <= end <= max(times) + 2 * second, f"part {options}: last fix at {end}")


def check_events(recording: Path) -> None:
    """Events lie on the road, where their samples lie, in all formats."""
    rows = list(csv.DictReader(io.StringIO(run(LOG, "events", "--format", "csv", recording))))
    placed = [row for row in rows if row["latitude"] and row["longitude"]]
    expect(len(placed) > 10 and len(placed) > 0.9 * len(rows), f"{len(placed)} of {len(rows)} events have a position")
    places = {row["time"]: (row["latitude"], row["longitude"]) for row in samples(LOG, recording) if row["latitude"]}
    for row in placed:
        place = (row["latitude"], row["longitude"])
        expect(distance_from_road(*map(float, place)) < 1, f"event {row['kind']} at {row['time']} is not on the road")
        expect(places.get(row["time"], place) == place, f"event {row['kind']} at {row['time']}: {place}")
    expect(sum(1 for row in placed if row["time"] in places) > 10, "events at the times of samples")
    lines = [json.loads(line) for line in run(LOG, "events", "--format", "jsonl", recording).splitlines()]
    found = [(f"{line['latitude']:.7f}", f"{line['longitude']:.7f}") if "latitude" in line else ("", "") for line in lines]
    expect(found == [(row["latitude"], row["longitude"]) for row in rows], "jsonl has other positions than csv")
    text = run(LOG, "events", "--positions", recording).splitlines()
    for row, line in zip(rows, text, strict=True):
        shown = re.search(r"  (-?\d+\.\d{6}) (-?\d+\.\d{6})  ", line)
        expect(bool(shown) == bool(row["latitude"]), f"text: {line}")
        for text_place, column in zip(shown.groups() if shown else (), ("latitude", "longitude")):
            expect(abs(float(text_place) - float(row[column])) < 6e-7, f"text, {column} {row[column]}: {line}")
    expect(not re.search(r"\.\d{6} ", run(LOG, "events", recording)), "text has positions without --positions")
    for options in (("--clock", "modem"), ("--mask=all",)):
        hidden = csv.DictReader(io.StringIO(run(LOG, "events", "--format", "csv", *options, recording)))
        expect(not any(row["latitude"] or row["longitude"] for row in hidden), f"positions with {options}")
    run(LOG, "events", "--positions", "--clock", "modem", recording, status=2)
    run(LOG, "events", "--positions", "--format", "csv", recording, status=2)
    run(LOG, "events", "--positions", "--duration", "1", status=2)


with tempfile.TemporaryDirectory() as temporary:
    directory = Path(temporary)
    for scenario in ("gsm", "c2k", "lte", "utran", "ifx", "modem"):
        recording, plain = directory / f"{scenario}.pcapng", directory / f"{scenario}-plain.pcapng"
        run(DRIVE, scenario, "7", "60s", recording, "--positions")
        run(DRIVE, scenario, "7", "60s", plain)
        check_road(recording, scenario)
        check_samples_without(recording, plain, scenario)
        # One at every full second up to the last step that has a message.
        expect(fixes_of(recording) in (59, 60), f"{scenario}: {fixes_of(recording)} fixes, wanted 60")
        expect(fixes_of(plain) == 0, f"{scenario}: fixes without positions")

    gsm, lte = directory / "gsm.pcapng", directory / "lte.pcapng"
    # Capture tools, and what we write of a recording.
    cut, merged, copied = (directory / name for name in ("cut.pcapng", "merged.pcapng", "copied.pcapng"))
    run("editcap", "-A", "2026-01-05T08:00:10Z", "-B", "2026-01-05T08:00:20Z", gsm, cut)
    expect(9 <= fixes_of(cut) <= 11, f"{fixes_of(cut)} fixes after editcap, wanted 10")
    run("mergecap", "-w", merged, gsm, lte)
    both = samples(LOG, merged)
    expect({row["technology"] for row in both} == {"Ostrel_GSM", "Ostrel_LTE"}, "merging loses a technology")
    expect(sum(1 for row in both if row["latitude"]) > 0.97 * len(both), "merging loses positions")
    run(LOG, "convert", gsm, copied)
    expect(copied.read_bytes() == gsm.read_bytes(), "a copy of a recording differs")

    check_squares(gsm)
    check_events(gsm)
    check_part(gsm, directory / "part.pcapng", "--from", "+20", "--to", "+30")
    check_part(merged, directory / "part.pcapng", "--from", "2026-01-05T08:00:20.5Z", "--to", "2026-01-05T08:00:21.5Z")

    # What masking and other forms leave of them.
    key = directory / "key"
    run(LOG, "mask", "--new-key", key)
    for level, kept in (("identity", True), ("location", True), ("all", False)):
        masked = directory / f"{level}.pcapng"
        run(LOG, "mask", "--key", key, "--level", level, gsm, masked)
        expect((fixes_of(masked) > 50) == kept, f"mask --level {level}: {fixes_of(masked)} fixes")
        expect((b"$GNRMC" in masked.read_bytes()) == kept, f"mask --level {level}: sentences")
    snapshot = directory / "gsm.velmora"
    run(LOG, "convert", gsm, snapshot)
    expect(fixes_of(snapshot) == 0, "a snapshot has fixes")

    # A track that is added later gives the same positions as one that was recorded.
    track = directory / "track.gpx"
    run(LOG, "convert", gsm, track)
    added = directory / "added.pcapng"
    run(LOG, "convert", "--track", track, directory / "gsm-plain.pcapng", added)
    for recorded, late in zip(samples(LOG, gsm), samples(LOG, added), strict=True):
        for column in ("latitude", "longitude", "speed"):
            same = (not recorded[column] and not late[column]) or (
                recorded[column] and late[column] and abs(float(recorded[column]) - float(late[column])) < 2e-2
                and (column == "speed" or abs(float(recorded[column]) - float(late[column])) < 3e-7))
            expect(bool(same), f"added track: {column} {late[column]}, recorded {recorded[column]}")
    run(LOG, "convert", "--track", track, gsm, directory / "twice.pcapng", status=1)
    expect(not (directory / "twice.pcapng").exists(), "positions were added twice")
    merged_plain = directory / "merged-plain.pcapng"
    run("mergecap", "-w", merged_plain, directory / "gsm-plain.pcapng", directory / "lte-plain.pcapng")
    run(LOG, "convert", "--track", track, merged_plain, directory / "several.pcapng")
    expect(fixes_of(directory / "several.pcapng") == 60, "a track in a recording of two technologies")

    # NMEA across midnight, with the dates of RMC alone; without a fix in the recording's time it is refused.
    night = directory / "night.nmea"
    night.write_text("".join(
        sentence(f"GPGGA,{clock},5920.0000,N,01803.000{i},E,1,08,0.9,12.0,M,,M,,")
        + sentence(f"GPRMC,{clock},A,5920.0000,N,01803.000{i},E,0.0,,{date},,,A")
        for i, (clock, date) in enumerate((("235958", "040126"), ("235959", "040126"), ("000000", "050126")))),
        encoding="ascii")
    run(LOG, "convert", "--track", night, directory / "gsm-plain.pcapng", directory / "night.pcapng", status=1)
    morning = directory / "morning.nmea"
    morning.write_text(night.read_text().replace("235958", "080001").replace("235959", "080002")
                       .replace("000000", "080003"), encoding="ascii")
    run(LOG, "convert", "--track", morning, directory / "gsm-plain.pcapng", directory / "bad.pcapng", status=1)

    # The capture tool's dissector.
    dissector = BUILD / "velmora.lua"
    if dissector.exists():
        shown = run("tshark", "-X", f"lua_script:{dissector}", "-r", gsm, "-Y", "velmora_position.fix == 1", "-T", "fields",
                    "-e", "velmora_position.kind", "-e", "velmora_position.latitude", "-e", "velmora_position.longitude")
        lines = [line.split("\t") for line in shown.splitlines()]
        expect(len(lines) == 120 and {kind for kind, _, _ in lines} == {"GGA", "RMC"}, f"{len(lines)} sentences shown")
        for _, latitude, longitude in lines:
            expect(distance_from_road(float(latitude), float(longitude)) < 1, "the dissector's place")
finish()
