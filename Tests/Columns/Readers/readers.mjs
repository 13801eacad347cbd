// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT
// Three programs that read Parquet files. Each has an operation `read(path)`, which returns the rows as objects by
// column: integers and times (in nanoseconds) as bigint, degrees (in units of 1e-7) too, numbers, texts, flags, bytes as
// text of hexadecimal digits, null for none.

import fs from "node:fs";
import {DuckDBInstance, DuckDBBlobValue, DuckDBDecimalValue, DuckDBTimestampTZValue} from "@duckdb/node-api";
import {tableFromIPC, Type} from "apache-arrow";
import {parquetMetadata, parquetReadObjects} from "hyparquet";
import {compressors} from "hyparquet-compressors";
import * as wasm from "parquet-wasm";

function bufferOf(path) {
    const content = fs.readFileSync(path);
    return content.buffer.slice(content.byteOffset, content.byteOffset + content.byteLength);
}

const hexadecimal = (bytes) => Buffer.from(bytes).toString("hex");

/** What the file says of its columns: its key-value metadata. */
export function propertiesOf(path) {
    const metadata = parquetMetadata(bufferOf(path));
    return Object.fromEntries((metadata.key_value_metadata ?? []).map(({key, value}) => [key, value]));
}

async function duckdb() {
    const connection = await (await DuckDBInstance.create(":memory:")).connect();
    const plain = (value) => {
        if (value instanceof DuckDBTimestampTZValue)
            return value.micros * 1000n;
        if (value instanceof DuckDBDecimalValue)
            return value.value;
        return value instanceof DuckDBBlobValue ? hexadecimal(value.bytes) : value;
    };
    return {
        name: "DuckDB",
        microseconds: true, // its times with a zone have no nanoseconds
        async read(path) {
            const quoted = path.replaceAll("'", "''");
            const result = await connection.runAndReadAll(
                `SELECT * FROM read_parquet('${quoted}', hive_partitioning = false)`);
            return result.getRowObjects().map((row) =>
                Object.fromEntries(Object.entries(row).map(([name, value]) => [name, plain(value)])));
        },
    };
}

/** The decimal numbers of a reader that makes doubles of them. */
const degrees = (name, value) =>
    (value !== null && ["latitude", "longitude"].includes(name) ? BigInt(Math.round(value * 1e7)) : value);

const hyparquet = {
    name: "hyparquet",
    async read(path) {
        const parsers = {
            timestampFromNanoseconds: (nanoseconds) => nanoseconds,
            stringFromBytes: (bytes) => bytes && new TextDecoder("utf-8", {fatal: true}).decode(bytes),
        };
        const rows = await parquetReadObjects({file: bufferOf(path), compressors, parsers, utf8: false});
        for (const row of rows)
            for (const [name, value] of Object.entries(row))
                row[name] = value instanceof Uint8Array ? hexadecimal(value) : degrees(name, value ?? null);
        return rows;
    },
};

function arrowValues(column) {
    const values = [];
    for (const part of column.data)
        for (let i = 0; i < part.length; ++i)
            if (!part.getValid(i))
                values.push(null);
            else if (part.type.typeId === Type.Timestamp)
                values.push(part.values[i]); // an integer: what the library makes of it has a number's precision
            else
                values.push(undefined);
    for (let i = 0; i < values.length; ++i)
        if (values[i] === undefined) {
            let value = column.get(i);
            if (column.type.typeId === Type.Decimal) // 128 bits, the lowest first
                value = BigInt.asIntN(64, BigInt(value[0]) | BigInt(value[1]) << 32n);
            values[i] = value instanceof Uint8Array ? hexadecimal(value) : value;
        }
    return values;
}

const parquetWasm = {
    name: "parquet-wasm",
    async read(path) {
        const table = tableFromIPC(wasm.readParquet(new Uint8Array(bufferOf(path))).intoIPCStream());
        const rows = Array.from({length: table.numRows}, () => ({}));
        for (const {name} of table.schema.fields)
            arrowValues(table.getChild(name)).forEach((value, i) => { rows[i][name] = value; });
        return rows;
    },
};

export async function allReaders() {
    return [await duckdb(), hyparquet, parquetWasm];
}
