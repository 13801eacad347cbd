// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT
// Compares positions: those of messages with `decode --samples --positions`, the recorded fixes with a track.

import fs from "node:fs";
import {shown, textDifferences} from "./values.mjs";

const units = (degrees) => (degrees === undefined ? null : BigInt(Math.round(degrees * 1e7)));

/** Whether a value's row is where its sample is. */
export const hasPlaceOf = (row, sample) =>
    row.latitude === units(sample.latitude) && row.longitude === units(sample.longitude);

/** The columns that the table of messages has besides, by what samples call them. */
const others = {altitude_m: "altitude", speed_m_s: "speed", fix_age_s: "fixAge", hdop: "hdop", deviation_m: "deviation"};

/** Of the messages that have samples, by `samples`. */
export async function positionDifferences(reader, files, samples) {
    const byRecord = new Map();
    for (const [each] of samples.values())
        byRecord.set(each.record, each);
    const found = [];
    for (const {file} of files.filter(({table}) => table === "messages"))
        for (const row of await reader.read(file)) {
            const sample = byRecord.get(Number(row.message));
            if (sample && !(hasPlaceOf(row, sample) &&
                            Object.entries(others).every(([name, key]) => row[name] === (sample[key] ?? null))))
                found.push(`message ${row.message}: ${shown(row)} for ${shown(sample)}`);
        }
    return found;
}

/** The features of that kind of a GeoJSON file, which have their times to the millisecond. */
const featuresOf = (track, kind) => (track === null ? [] :
    JSON.parse(fs.readFileSync(track, "utf8")).features.filter(({properties}) => properties.feature === kind));

/** Where events happened. */
export async function eventPlaceDifferences(reader, files, track) {
    if (track === null)
        return [];
    const expected = featuresOf(track, "event").map(({geometry, properties: {time, kind}}) => shown(
        [Date.parse(time), kind, units(geometry?.coordinates[1]), units(geometry?.coordinates[0])]));
    const actual = [];
    for (const {file} of files.filter(({table}) => table === "events"))
        for (const row of await reader.read(file))
            actual.push(shown([Number(row.time / 1_000_000n), row.kind_text, row.latitude, row.longitude]));
    return textDifferences("place of an event", actual, expected);
}

/** The table of fixes, by the points of a GeoJSON file. */
export async function fixDifferences(reader, files, track) {
    const expected = featuresOf(track, "fix").map(({geometry: {coordinates}, properties}) => shown(
        [Date.parse(properties.time), units(coordinates[1]), units(coordinates[0]), coordinates[2] ?? null]));
    const actual = [];
    for (const {file} of files.filter(({table}) => table === "positions"))
        for (const row of await reader.read(file))
            actual.push(shown([Number(row.time / 1_000_000n), row.latitude, row.longitude, row.altitude_m]));
    return textDifferences("fix", actual, expected);
}
