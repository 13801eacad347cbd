// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// The time axis, on which long silences between recordings take no room, and how times are written.

const spans = [];
let axisLength = 0; // ms of all spans
for (const [begin, end] of data.spans) {
    const length = Math.max(end - begin, 1);
    spans.push({ begin: data.base + begin, end: data.base + begin + length, place: axisLength });
    axisLength += length;
}

// The place of a time on the axis, in ms from its begin; of one between spans that of the nearest.
function placeOf(time) {
    for (let i = spans.length - 1; i >= 0; --i)
        if (time >= spans[i].begin) return spans[i].place + Math.min(time, spans[i].end) - spans[i].begin;
    return 0;
}

function timeAt(place) {
    for (let i = spans.length - 1; i > 0; --i)
        if (place >= spans[i].place) return spans[i].begin + place - spans[i].place;
    return spans.length ? spans[0].begin + place : 0;
}

let isLocal = false;

function two(number) {
    return String(number).padStart(2, "0");
}

// "0:01:05" since the begin of the files that lie over each other.
function sinceText(time, hasMilliseconds) {
    const ms = Math.max(Math.round(time - spans[0].begin), 0);
    const text = Math.floor(ms / 3600000) + ":" + two(Math.floor(ms / 60000) % 60) + ":" + two(Math.floor(ms / 1000) % 60);
    return hasMilliseconds ? text + "." + String(ms % 1000).padStart(3, "0") : text;
}

// A time of the charts' axis.
function axisText(time) {
    return isOverlaid ? sinceText(time, true) + " since the start" : momentText(time);
}

function dayText(time) {
    const date = new Date(time);
    return isLocal
        ? date.getFullYear() + "-" + two(date.getMonth() + 1) + "-" + two(date.getDate())
        : date.toISOString().slice(0, 10);
}

function clockText(time, hasMilliseconds) {
    const date = new Date(time);
    const text = isLocal
        ? two(date.getHours()) + ":" + two(date.getMinutes()) + ":" + two(date.getSeconds())
        : date.toISOString().slice(11, 19);
    return hasMilliseconds ? text + "." + String(date.getMilliseconds()).padStart(3, "0") : text;
}

function zoneText() {
    return isLocal ? "local" : "UTC";
}

function momentText(time) {
    return dayText(time) + " " + clockText(time, true) + " " + zoneText();
}

function spanText(ms) {
    const seconds = ms / 1000;
    if (seconds < 60) return seconds.toFixed(seconds < 10 ? 1 : 0) + " s";
    const minutes = Math.floor(seconds / 60);
    if (minutes < 60) return minutes + " min " + Math.floor(seconds % 60) + " s";
    return Math.floor(minutes / 60) + " h " + (minutes % 60) + " min";
}

// Round times for the axis between two places, at most so many.
const tickSteps = [0.1, 0.2, 0.5, 1, 2, 5, 10, 15, 30, 60, 120, 300, 600, 900, 1800, 3600, 7200, 10800, 21600, 43200, 86400];

function timeTicks(from, to, most) {
    const needed = (to - from) / 1000 / Math.max(most, 1);
    const step = 1000 * (tickSteps.find((each) => each >= needed) || Math.ceil(needed / 86400) * 86400);
    const ticks = [];
    for (const span of spans) {
        const begin = Math.max(span.begin, timeAt(Math.max(from, span.place)));
        if (span.place > to || span.place + span.end - span.begin < from) continue;
        const end = Math.min(span.end, span.begin + to - span.place);
        const zone = isLocal ? -60000 * new Date(begin).getTimezoneOffset() : 0;
        const shifted = isOverlaid ? -spans[0].begin : zone;
        for (let time = Math.ceil((begin + shifted) / step) * step - shifted; time <= end; time += step)
            ticks.push({ time, place: placeOf(time), step });
    }
    return ticks;
}

// Rewrites all times of the page.
function showZone() {
    for (const element of document.querySelectorAll("time")) {
        const time = Date.parse(element.dateTime);
        if (!Number.isNaN(time)) element.textContent = momentText(time);
    }
}
