// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT
// usage: node rows.mjs DIRECTORY
// Prints, for each reader and table of a directory of columns, how many rows there are and a hash of them all, in
// whatever files they are.

import crypto from "node:crypto";
import {allReaders} from "./readers.mjs";
import {filesIn} from "./tables.mjs";

const text = (row) => JSON.stringify(row, (_, value) => (typeof value === "bigint" ? `${value}` : value));

const tables = new Map();
for (const each of filesIn(process.argv[2]))
    tables.set(each.table, [...(tables.get(each.table) ?? []), each]);
for (const reader of await allReaders())
    for (const table of [...tables.keys()].sort()) {
        const rows = [];
        for (const {file} of tables.get(table))
            rows.push(...(await reader.read(file)).map(text));
        const hash = crypto.createHash("sha256").update(rows.sort().join("\n")).digest("hex");
        console.log(`${reader.name} ${table}: ${rows.length} rows, ${hash}`);
    }
