#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Reads the tracks that velmora-log writes with GDAL's ogrinfo, and compares places and values with its samples.

usage: check-tracks.py BUILD

BUILD has velmora-log and tests/make-drive.
"""

from __future__ import annotations

import json
import re
import sys
import tempfile
import xml.etree.ElementTree as ElementTree
from collections import Counter
from pathlib import Path

from positions import distance_from_road, expect, finish, need, run, samples

need("ogrinfo")
BUILD = Path(sys.argv[1])
LOG, DRIVE = BUILD / "velmora-log", BUILD / "tests" / "make-drive"
GPX = "{http://www.topografix.com/GPX/1/1}"
LEVEL = "level=/GSM/GSM Serving Cell/RSSI"
# What GPX 1.1 allows in a point, in its order.
ORDER = ["ele", "time", "magvar", "geoidheight", "name", "cmt", "desc", "src", "link", "sym", "type", "fix", "sat", "hdop",
         "vdop", "pdop", "ageofdgpsdata", "dgpsid", "extensions"]


def features(path: Path, *options: str) -> list[dict[str, str]]:
    """What ogrinfo prints of each feature: its attributes, and its geometry as "geometry"."""
    found: list[dict[str, str]] = []
    for line in run("ogrinfo", "-ro", "-al", *options, path).splitlines():
        if line.startswith("OGRFeature("):
            found.append({"layer": line[len("OGRFeature("):].partition(")")[0]})
        elif found and (attribute := re.match(r"  (\S.*?) \(\w+(?:\(\w+\))?\) = (.*)", line)):
            found[-1][attribute[1]] = attribute[2]
        elif found and re.match(r"  (MULTI)?(POINT|LINESTRING|GEOMETRYCOLLECTION)", line):
            found[-1]["geometry"] = line.strip()
    return found


def place(feature: dict[str, str]) -> tuple[float, float]:
    numbers = re.findall(r"-?\d+(?:\.\d+)?(?:e-?\d+)?", feature["geometry"])
    return float(numbers[1]), float(numbers[0])


def check_places(name: str, points: list[dict[str, str]], count: int) -> None:
    expect(len(points) == count, f"{name}: {len(points)} points, wanted {count}")
    for point in points:
        expect(distance_from_road(*place(point)) < 1, f"{name}: {point['geometry']} is not on the road")


def values_by_time(rows: list[dict[str, str]]) -> list[tuple[str, float]]:
    return [(row["time"], float(row["value"])) for row in rows if row["value"]]


with tempfile.TemporaryDirectory() as temporary:
    directory = Path(temporary)
    recording = directory / "drive.pcapng"
    run(DRIVE, "gsm", "3", "300s", recording, "--positions")
    levels = values_by_time(samples(LOG, recording, "--select", LEVEL))
    events = [json.loads(line) for line in run(LOG, "events", "--format", "jsonl", recording).splitlines()]
    tracks = {suffix: directory / f"drive.{suffix}" for suffix in ("geojson", "gpx", "kml")}
    for track in tracks.values():
        run(LOG, "convert", "--select", LEVEL, recording, track)

    def level_at(time: str) -> float | None:
        """The latest before that time; all are of the same day, so that times compare as texts do."""
        exact = time if "." in time else time.replace("Z", ".000Z")
        earlier = [value for moment, value in levels if moment[:26] <= exact.replace("Z", "000")]
        return earlier[-1] if earlier else None

    # GeoJSON, by GDAL and by itself.
    read = features(tracks["geojson"])
    kinds = Counter(feature["feature"] for feature in read)
    check_places("GeoJSON", [feature for feature in read if feature["feature"] == "fix"], 300)
    expect(kinds["track"] == 1, f"GeoJSON: {kinds['track']} lines, wanted 1")
    expect(kinds["event"] == len(events), f"GeoJSON: {kinds['event']} events, wanted {len(events)}")
    document = json.loads(tracks["geojson"].read_text())
    expect(document["type"] == "FeatureCollection" and "crs" not in document, "GeoJSON: not as RFC 7946 has it")
    compared = 0
    for feature in document["features"]:
        properties = feature["properties"]
        if properties["feature"] != "fix":
            continue
        if properties.get("level") is not None:
            compared += 1
            expect(properties["level"] == level_at(properties["time"]),
                   f"GeoJSON: level {properties['level']} at {properties['time']}, wanted {level_at(properties['time'])}")
        expect(len(feature["geometry"]["coordinates"]) == 3, "GeoJSON: a fix without altitude")
    expect(compared > 100, f"GeoJSON: {compared} levels")
    told = Counter((event["kind"], event["text"]) for event in events)
    drawn = Counter((feature["properties"]["kind"], feature["properties"]["text"]) for feature in document["features"]
                    if feature["properties"]["feature"] == "event")
    expect(told == drawn, f"GeoJSON: other events: {drawn - told}, {told - drawn}")

    # GPX, by GDAL, and its structure.
    points = features(tracks["gpx"], "-q", "-where", "1=1")
    check_places("GPX", [point for point in points if point["layer"] == "track_points"], 300)
    expect(sum(1 for point in points if point["layer"] == "tracks") == 1, "GPX: not one track")
    root = ElementTree.parse(tracks["gpx"]).getroot()
    expect(root.tag == GPX + "gpx" and root.get("version") == "1.1" and bool(root.get("creator")), "GPX: its root")
    expect([child.tag for child in root if child.tag != GPX + "wpt"] == [GPX + "metadata", GPX + "trk"], "GPX: its order")
    for point in (*root.iter(GPX + "trkpt"), *root.iter(GPX + "wpt")):
        names = [ORDER.index(child.tag.removeprefix(GPX)) for child in point]
        expect(names == sorted(set(names)), "GPX: the order in a point")
        for child in point.iter():
            expect(child is point or child.tag.startswith(GPX) or child.tag.startswith("{urn:velmora:track:1}"),
                   f"GPX: {child.tag}")

    # KML, by GDAL.
    marks = features(tracks["kml"])
    placed = [mark for mark in marks if mark["layer"] == "events"]
    expect(0 < len(placed) <= len(events), f"KML: {len(placed)} events, {len(events)} in all")
    for mark in placed:
        expect(distance_from_road(*place(mark)) < 1, f"KML: {mark['geometry']} is not on the road")
    lines = [mark for mark in marks if mark["layer"] == "track"]
    classes = {mark["Name"] for mark in lines}
    expect(1 < len(classes) <= 6, f"KML: classes {classes}")
    if levels:
        low, high = min(value for _, value in levels), max(value for _, value in levels)
        for name in classes:
            bounds = re.search(r"level \(dBm\): (-?[\d.]+) to (-?[\d.]+)$", name)
            expect(name.endswith(": none") or (bounds is not None and low <= float(bounds[1]) < float(bounds[2]) <= high),
                   f"KML: class {name}, levels {low} to {high}")

    # A range of times, and a recording without positions.
    part = directory / "part.geojson"
    run(LOG, "convert", "--from", "+60", "--to", "+120", recording, part)
    fixes = [feature for feature in json.loads(part.read_text())["features"] if feature["properties"]["feature"] == "fix"]
    expect(59 <= len(fixes) <= 61, f"{len(fixes)} fixes in a minute")
    run(DRIVE, "gsm", "3", "10s", directory / "plain.pcapng")
    run(LOG, "convert", directory / "plain.pcapng", directory / "plain.gpx", status=1)
    expect(not (directory / "plain.gpx").exists(), "a track without positions")
finish()
