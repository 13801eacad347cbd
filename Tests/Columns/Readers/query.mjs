// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT
// usage: node query.mjs DIRECTORY FILE...
// Runs the queries of files in a directory of columns with DuckDB, in 2 GB of memory. Prints for each file an object of
// JSON: its name, the seconds that it took, those of the processor, the rows, the memory of the process so far.

import fs from "node:fs";
import path from "node:path";
import process from "node:process";
import {DuckDBInstance} from "@duckdb/node-api";

const files = process.argv.slice(3).map((file) => path.resolve(file));
process.chdir(process.argv[2]);
for (const file of files) {
    // A new one for each, so that none has what another read.
    const instance = await DuckDBInstance.create(":memory:", {memory_limit: "2GB"});
    const connection = await instance.connect();
    const begin = performance.now();
    const used = process.cpuUsage();
    const result = await connection.runAndReadAll(fs.readFileSync(file, "utf8"));
    const rows = result.getRowObjectsJson();
    const seconds = (performance.now() - begin) / 1000;
    const {user, system} = process.cpuUsage(used);
    console.log(JSON.stringify({name: path.basename(file, ".sql"), seconds, processor: (user + system) / 1e6, rows,
                                memory: process.resourceUsage().maxRSS * 1024}));
    connection.closeSync();
}
