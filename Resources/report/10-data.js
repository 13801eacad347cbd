// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// The page's data, unpacked: Documentation/report.md describes how it is packed.

const data = JSON.parse(document.getElementById("data").textContent);

// The inverse of differences between neighbours.
function summed(steps, first) {
    const out = new Float64Array(steps.length);
    let sum = first || 0;
    for (let i = 0; i < steps.length; ++i) out[i] = sum += steps[i];
    return out;
}

function unpackSeries(packed) {
    const count = packed.count.length;
    const begin = new Float64Array(count); // ms since 1970
    let index = 0;
    let at = 0;
    for (let i = 0; i < packed.runs.length; i += 2) {
        index += packed.runs[i];
        for (let k = packed.runs[i + 1]; k > 0; --k) begin[at++] = index++ * packed.width;
    }
    let least;
    let greatest;
    if (packed.decimals === undefined) {
        least = Float64Array.from(packed.minimum);
        greatest = Float64Array.from(packed.maximum);
    } else {
        const factor = Math.pow(10, packed.decimals);
        least = summed(packed.minimumSteps);
        greatest = least.map((value, i) => (value + packed.spread[i]) / factor);
        least = least.map((value) => value / factor);
    }
    const leastAt = summed(packed.minimumAtSteps);
    return {
        name: packed.path, file: packed.file, technology: packed.technology, chart: packed.chart, unit: packed.unit,
        isBest: packed.best, width: packed.width, begin, least, greatest, count: packed.count, leastAt,
        greatestAt: leastAt.map((value, i) => value + packed.maximumAtOffset[i]),
    };
}

function unpackBand(packed) {
    const count = packed.steps.length / 2;
    const since = new Float64Array(count);
    const value = new Uint32Array(count);
    let time = data.base;
    for (let i = 0; i < count; ++i) {
        since[i] = time += packed.steps[2 * i];
        value[i] = packed.steps[2 * i + 1];
    }
    return { name: packed.name, file: packed.file, technology: packed.technology, values: packed.values, since, value };
}

function unpackEvents(packed) {
    let first = 0;
    const messages = packed.messageSteps.map((steps) => {
        let last = first;
        const numbers = steps.map((step) => (last += step));
        if (numbers.length) first = numbers[0];
        return numbers;
    });
    return {
        names: packed.names, time: summed(packed.timeSteps, data.base), duration: packed.duration,
        severity: packed.severity, kind: packed.kind, technology: packed.technology, text: packed.text, messages,
        count: packed.kind.length,
    };
}

// The number of a message of all files, as the page writes it: "#12", of several files "#2:12".
function messageName(number) {
    if (data.files.length === 1) return "#" + number;
    let file = data.files.length - 1;
    while (file > 0 && number <= data.files[file].numbersBefore) --file;
    return "#" + (file + 1) + ":" + (number - data.files[file].numbersBefore);
}

// The first index whose element is above the value.
function upperBound(sorted, value) {
    let low = 0;
    let high = sorted.length;
    while (low < high) {
        const middle = (low + high) >> 1;
        if (sorted[middle] <= value) low = middle + 1;
        else high = middle;
    }
    return low;
}

const severities = ["info", "warning", "critical"];
const series = data.series.map(unpackSeries);
const bands = data.bands.map(unpackBand);
const events = unpackEvents(data.events);
