// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT
// What comparisons have in common.

/** Nanoseconds of "2026-01-05T08:00:00.162000000Z"; null of nothing. */
export function nanoseconds(text) {
    if (text === undefined || text === null)
        return null;
    const [, seconds, fraction] = /^(.*)\.(\d{9})Z$/.exec(text);
    return BigInt(Date.parse(`${seconds}Z`)) * 1_000_000n + BigInt(fraction);
}

export const shown = (value) => JSON.stringify(value, (_, each) => (typeof each === "bigint" ? `${each}` : each));

/** Whether the times are the same, as far as the reader has them. */
export function sameTime(reader, actual, expected) {
    if (actual === null || expected === null)
        return actual === expected;
    return reader.microseconds ? actual / 1000n === expected / 1000n : actual === expected;
}

/** Whether both lists have the same texts, in whatever order; else what differs. */
export function textDifferences(title, actual, expected) {
    const left = [...expected];
    const found = [];
    for (const each of actual) {
        const at = left.indexOf(each);
        if (at < 0)
            found.push(`${title} in the columns alone: ${each}`);
        else
            left.splice(at, 1);
    }
    return [...found, ...left.map((each) => `${title} not in the columns: ${each}`)];
}
