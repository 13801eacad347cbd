// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT
// What the tables of an input hold, as the values that `decode --samples` lists.

import fs from "node:fs";
import path from "node:path";
import {propertiesOf} from "./readers.mjs";

/** The files of a directory of columns: [{file, table, technology, date}]. */
export function filesIn(directory) {
    return fs.readdirSync(directory, {recursive: true, withFileTypes: true})
        .filter((entry) => entry.isFile())
        .map((entry) => {
            const file = path.join(entry.parentPath ?? entry.path, entry.name);
            const [table, technology, date, name, ...rest] = path.relative(directory, file).split(path.sep);
            if (rest.length > 0 || !/^technology=/.test(technology) || !/^date=/.test(date) || !/^[^.].*\.parquet$/.test(name))
                throw new Error(`unexpected file ${file}`);
            return {file, table, technology: technology.slice(11), date: date.slice(5)};
        });
}

/** The columns that hold values of fields: name, path, and of which column the raw number is. */
function fieldColumns(properties) {
    const columns = [];
    for (const [key, value] of Object.entries(properties))
        if (key.startsWith("velmora.path.")) {
            const name = key.slice("velmora.path.".length);
            const raw = name.replace(/_text$/, "_raw");
            if (name.endsWith("_raw") && properties[`velmora.path.${name.replace(/_raw$/, "_text")}`] === value)
                continue; // with its text
            const isEnumeration = raw !== name && properties[`velmora.path.${raw}`] === value;
            columns.push({name, path: value, raw: isEnumeration ? raw : null});
        }
    return columns;
}

// The path with the numbers of rows: "/A/*/B" in row 3 is "/A/3/B".
function placed(pattern, row) {
    const numbers = [row.outer_row, row.row].filter((number) => number !== undefined && number !== null);
    return pattern.replaceAll("/*", () => `/${numbers.shift()}`);
}

function valueOfOther(row) {
    for (const name of ["value_number", "value_raw", "value_text", "value_flag", "value_data"])
        if (row[name] !== null)
            return row[name];
    return null;
}

/** All values of the fields, without those that are null: [{record, path, value, text?, rowKey, time, ...}]. */
export async function valuesOf(files, reader) {
    const values = [];
    const add = (row, place, value, text) => values.push({
        record: row.message, path: place, value, text, rowKey: row.row_key ?? null,
        time: row.time, modemTime: row.modem_time, code: row.code,
        latitude: row.latitude, longitude: row.longitude,
    });
    for (const {file, table} of files) {
        if (["messages", "files", "events", "positions"].includes(table))
            continue;
        const columns = fieldColumns(propertiesOf(file));
        for (const row of await reader.read(file)) {
            if (table === "other_fields") {
                const text = row.value_raw === null ? undefined : row.value_text;
                add(row, row.path, valueOfOther(row), text);
                continue;
            }
            for (const {name, path: pattern, raw} of columns)
                if (row[name] !== null)
                    add(row, placed(pattern, row), raw ? row[raw] : row[name], raw ? row[name] : undefined);
        }
    }
    return values;
}
