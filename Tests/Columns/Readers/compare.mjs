// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT
// usage: node compare.mjs CASES
// CASES is a JSON list of {title, columns, samples, events, track, messages}: a directory of one input's columns, what
// `decode --samples --positions --format jsonl` and `events --format jsonl` list of it, the track that `convert` makes of
// it or null, and how many messages it has. Reads the columns with each reader and compares all values. Prints a line for each case; the exit status is 1 where something differs.

import fs from "node:fs";
import {eventDifferences} from "./events.mjs";
import {eventPlaceDifferences, fixDifferences, hasPlaceOf, positionDifferences} from "./positions.mjs";
import {allReaders} from "./readers.mjs";
import {filesIn, valuesOf} from "./tables.mjs";
import {nanoseconds, sameTime, shown} from "./values.mjs";

const mostDifferences = 10;

/** The samples that have a value, by record and path, in their order. */
function samplesIn(file) {
    const samples = new Map();
    for (const line of fs.readFileSync(file, "utf8").split("\n")) {
        if (line === "")
            continue;
        const sample = JSON.parse(line);
        if (sample.value === null)
            continue;
        const key = `${sample.record} ${sample.path}`;
        samples.set(key, [...(samples.get(key) ?? []), sample]);
    }
    return samples;
}

function sameValue(actual, sample) {
    if (typeof actual === "bigint")
        return Number(actual) === sample.value;
    return Object.is(actual, sample.value) || (actual === 0 && sample.value === 0);
}

function isSame(reader, actual, sample) {
    return sameValue(actual.value, sample) && (actual.text === undefined || actual.text === sample.text) &&
        actual.rowKey === (sample.row ?? null) && sameTime(reader, actual.time, nanoseconds(sample.time)) &&
        sameTime(reader, actual.modemTime, nanoseconds(sample.modemTime)) &&
        (actual.code === null ? null : Number(actual.code)) === sample.code && hasPlaceOf(actual, sample);
}

/** What differs between the columns and the samples. */
function differences(reader, values, samples) {
    const found = [];
    for (const actual of values) {
        if (actual.value === null)
            continue;
        const key = `${actual.record} ${actual.path}`;
        const sample = samples.get(key)?.shift();
        if (!sample)
            found.push(`${key}: in the columns alone: ${shown(actual)}`);
        else if (!isSame(reader, actual, sample))
            found.push(`${key}: ${shown(actual)} for ${shown(sample)}`);
    }
    for (const [key, left] of samples)
        for (const sample of left)
            found.push(`${key}: not in the columns: ${shown(sample)}`);
    return found;
}

async function tablesAlone(reader, files, messages) {
    const found = [];
    let count = 0;
    for (const {file, table} of files) {
        if (table === "messages") {
            const rows = await reader.read(file);
            count += rows.length;
            if (rows.some((row, i) => i > 0 && row.message <= rows[i - 1].message))
                found.push("the messages are not in their order");
        } else if (table === "files") {
            const rows = await reader.read(file);
            if (rows.length !== 1)
                found.push(`${rows.length} rows in the table of files`);
        }
    }
    if (count !== messages)
        found.push(`${count} messages, wanted ${messages}`);
    return found;
}

let failed = false;
for (const {title, columns, samples, events, track, messages} of JSON.parse(fs.readFileSync(process.argv[2], "utf8"))) {
    const files = filesIn(columns);
    for (const reader of await allReaders()) {
        let found;
        let count = 0;
        try {
            const values = await valuesOf(files, reader);
            count = values.length;
            const expected = samplesIn(samples);
            found = [...await tablesAlone(reader, files, messages), ...await eventDifferences(reader, files, events),
                     ...await positionDifferences(reader, files, expected), ...await fixDifferences(reader, files, track),
                     ...await eventPlaceDifferences(reader, files, track),
                     ...differences(reader, values, expected)];
        } catch (error) {
            found = [`${error.stack}`];
        }
        console.log(`${title}, ${reader.name}: ${files.length} tables, ${count} values, ${found.length} differences`);
        for (const each of found.slice(0, mostDifferences))
            console.log(`  ${each}`);
        failed ||= found.length > 0;
    }
}
process.exitCode = failed ? 1 : 0;
