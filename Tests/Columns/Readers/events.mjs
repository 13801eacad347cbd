// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT
// Compares the table of events with what `events --format jsonl` lists.

import fs from "node:fs";
import {nanoseconds, shown, textDifferences} from "./values.mjs";

/** The columns of fields whose names do not follow from the field's. */
const named = {duration: "duration_s", margin: "margin_db"};

function columnOf(field, value) {
    const name = field.replaceAll(/[.-]/g, "_");
    return named[field] ?? (typeof value === "string" ? `${name}_text` : name);
}

const textOf = (value) => (typeof value === "string" ? value : `${value}`);

/** The row that the event should have, without the columns that are null. */
function rowOf(event, time) {
    const row = {
        time: time(nanoseconds(event.time)), end_time: time(nanoseconds(event.end)), kind_text: event.kind,
        severity_text: event.severity, severity_raw: BigInt(["info", "warning", "critical"].indexOf(event.severity)),
        event_text: event.text, technology: event.technology,
    };
    const records = event.evidence.map(({record}) => record);
    if (records.length > 0 && records[0] !== 0) {
        row.message = BigInt(records[0]);
        row.last_message = BigInt(records.at(-1));
    }
    return row;
}

function setFields(row, event, columns) {
    const others = [];
    for (const [field, value] of Object.entries(event.fields)) {
        const column = columnOf(field, value);
        if (field === "value") {
            row[typeof value === "number" ? "value_number" : "value_text"] = typeof value === "number" ? value : textOf(value);
            if (event.units.value && typeof value === "number")
                row.value_unit = event.units.value;
        } else if (columns.has(column)) {
            row[column] = value;
        } else {
            others.push(`${field}=${textOf(value)}`);
        }
    }
    if (others.length > 0)
        row.other_fields_text = others.join("; ");
    return row;
}

const sorted = (row) => shown(Object.fromEntries(Object.entries(row).filter(([, value]) => value !== null)
    .sort(([a], [b]) => (a < b ? -1 : 1))));

export async function eventDifferences(reader, files, listed) {
    const time = (value) => (value !== null && reader.microseconds ? value / 1000n * 1000n : value);
    const actual = [];
    let columns = new Set();
    for (const {file, technology} of files.filter(({table}) => table === "events"))
        for (const {file: _, latitude, longitude, ...row} of await reader.read(file)) {
            columns = new Set(Object.keys(row));
            actual.push(sorted({...row, time: time(row.time), end_time: time(row.end_time), technology}));
        }
    const expected = fs.readFileSync(listed, "utf8").split("\n").filter((line) => line !== "").map((line) => {
        const event = JSON.parse(line);
        return sorted(setFields(rowOf(event, time), event, columns));
    });
    return textDifferences("event", actual, expected);
}
