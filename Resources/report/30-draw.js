// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Drawing on canvases. A picture is drawn anew as a whole: of any zoom at most a line a column of pixels.

const leftMargin = 58;
let palette = {};

function readPalette() {
    const style = getComputedStyle(document.documentElement);
    const colour = (name) => style.getPropertyValue("--" + name).trim();
    palette = { series: [] };
    for (let i = 0; i < 8; ++i) palette.series.push(colour("s" + i));
    for (const name of ["ground", "raised", "ink", "dim", "line", "critical", "warning", "info", "none", "poor", "fair",
        "good", "excellent"])
        palette[name] = colour(name);
}

// Makes the canvas as sharp as the screen. Returns its context, in CSS pixels.
function contextOf(canvas, height) {
    const ratio = window.devicePixelRatio || 1;
    const width = canvas.clientWidth;
    if (canvas.width !== Math.round(width * ratio) || canvas.height !== Math.round(height * ratio)) {
        canvas.width = Math.round(width * ratio);
        canvas.height = Math.round(height * ratio);
    }
    const context = canvas.getContext("2d");
    context.setTransform(ratio, 0, 0, ratio, 0, 0);
    context.fillStyle = palette.raised;
    context.fillRect(0, 0, width, height);
    context.font = "12px system-ui, sans-serif";
    return context;
}

function niceStep(range, most) {
    const step = Math.pow(10, Math.floor(Math.log10(range / most)));
    for (const factor of [1, 2, 5, 10]) if (range / (step * factor) <= most) return step * factor;
    return step * 10;
}

// The buckets that the view shows, from one index before another.
function visible(one, view) {
    const from = Math.max(0, upperBound(one.begin, timeAt(view.from) - one.width) - 1);
    const to = Math.min(one.begin.length, upperBound(one.begin, timeAt(view.to)) + 1);
    return [from, to];
}

function rangeOf(shown, view) {
    let least = Infinity;
    let greatest = -Infinity;
    for (const one of shown) {
        const [from, to] = visible(one, view);
        for (let i = from; i < to; ++i) {
            if (one.least[i] < least) least = one.least[i];
            if (one.greatest[i] > greatest) greatest = one.greatest[i];
        }
    }
    if (least > greatest) return [0, 1];
    const room = (greatest - least) * 0.06 || 1;
    return [least - room, greatest + room];
}

function drawSeries(context, one, colour, view, x, y) {
    const [from, to] = visible(one, view);
    context.strokeStyle = colour;
    context.lineWidth = 1.5;
    context.globalAlpha = 0.9;
    context.beginPath();
    let column = -1;
    let low = 0;
    let high = 0;
    let lastEnd = -Infinity;
    let lastX = 0;
    let lastY = 0;
    const flush = () => {
        if (column < 0) return;
        context.moveTo(column + 0.5, y(low) + 0.75);
        context.lineTo(column + 0.5, y(high) - 0.75);
    };
    for (let i = from; i < to; ++i) {
        const place = placeOf(one.begin[i] + one.width / 2);
        const here = Math.floor(x(place));
        const isNext = one.begin[i] <= lastEnd + 2 * one.width;
        if (here === column) {
            if (one.least[i] < low) low = one.least[i];
            if (one.greatest[i] > high) high = one.greatest[i];
        } else {
            flush();
            // A line leads to the next bucket, not across a time without values.
            if (column >= 0 && isNext) {
                context.moveTo(lastX + 0.5, lastY);
                context.lineTo(here + 0.5, y((one.least[i] + one.greatest[i]) / 2));
            }
            column = here;
            low = one.least[i];
            high = one.greatest[i];
        }
        lastX = here;
        lastY = y((low + high) / 2);
        lastEnd = one.begin[i] + one.width;
    }
    flush();
    context.stroke();
    context.globalAlpha = 1;
}

function drawChart(panel, view) {
    const height = panel.height;
    const width = panel.canvas.clientWidth;
    const context = contextOf(panel.canvas, height);
    const shown = panel.series.filter((one) => one.isShown);
    const [least, greatest] = rangeOf(shown, view);
    const x = (place) => leftMargin + ((place - view.from) / (view.to - view.from)) * (width - leftMargin);
    const y = (value) => ((greatest - value) / (greatest - least)) * height;
    const step = niceStep(greatest - least, 4);
    context.lineWidth = 1;
    for (let value = Math.ceil(least / step) * step; value <= greatest; value += step) {
        context.strokeStyle = palette.line;
        context.beginPath();
        context.moveTo(leftMargin, Math.round(y(value)) + 0.5);
        context.lineTo(width, Math.round(y(value)) + 0.5);
        context.stroke();
        context.fillStyle = palette.dim;
        context.fillText(String(Number(value.toPrecision(6))), 4, Math.min(Math.max(y(value) + 4, 11), height - 3));
    }
    context.save();
    context.beginPath();
    context.rect(leftMargin, 0, width - leftMargin, height);
    context.clip();
    for (const one of shown) drawSeries(context, one, palette.series[one.colour], view, x, y);
    context.restore();
}

function bandColour(band, value) {
    const name = band.values[value];
    if (value === 1) return palette.none;
    return palette[name] && name !== "ink" && name !== "line" ? palette[name] : palette.series[(value - 2) % 8];
}

function drawBand(panel, view) {
    const band = panel.band;
    const width = panel.canvas.clientWidth;
    const context = contextOf(panel.canvas, panel.height);
    const x = (place) => leftMargin + ((place - view.from) / (view.to - view.from)) * (width - leftMargin);
    let i = Math.max(0, upperBound(band.since, timeAt(view.from)) - 1);
    const last = timeAt(view.to);
    let drawn = leftMargin - 1;
    for (; i < band.since.length && band.since[i] <= last; ++i) {
        if (band.value[i] === 0) continue;
        const begin = Math.max(leftMargin, x(placeOf(band.since[i])));
        const end = Math.min(width, i + 1 < band.since.length ? x(placeOf(band.since[i + 1])) : width);
        if (end <= drawn) continue;
        context.fillStyle = bandColour(band, band.value[i]);
        context.fillRect(begin, 0, Math.max(end - begin, 1), panel.height);
        drawn = Math.floor(end);
        if (end - begin > 60) {
            context.fillStyle = palette.ground;
            context.fillText(band.values[band.value[i]], begin + 4, 12, end - begin - 8);
        }
    }
}

function drawTicks(panel, view) {
    const width = panel.canvas.clientWidth;
    const context = contextOf(panel.canvas, panel.height);
    const x = (place) => leftMargin + ((place - view.from) / (view.to - view.from)) * (width - leftMargin);
    const worst = new Int8Array(Math.max(width, 1)).fill(-1);
    const to = upperBound(events.time, timeAt(view.to));
    for (let i = Math.max(0, upperBound(events.time, timeAt(view.from)) - 1); i < to; ++i) {
        const column = Math.floor(x(placeOf(events.time[i])));
        if (column >= leftMargin && column < width && events.severity[i] > worst[column]) worst[column] = events.severity[i];
    }
    for (let column = 0; column < width; ++column) {
        if (worst[column] < 0) continue;
        const top = (2 - worst[column]) * 5;
        context.fillStyle = palette[severities[worst[column]]];
        context.fillRect(column, top, worst[column] ? 2 : 1, panel.height - top);
    }
}

function drawAxis(panel, view) {
    const width = panel.canvas.clientWidth;
    const context = contextOf(panel.canvas, panel.height);
    const x = (place) => leftMargin + ((place - view.from) / (view.to - view.from)) * (width - leftMargin);
    context.fillStyle = palette.dim;
    context.strokeStyle = palette.line;
    let free = leftMargin;
    let day = "";
    for (const tick of timeTicks(view.from, view.to, (width - leftMargin) / 110)) {
        const at = x(tick.place);
        const text = isOverlaid ? sinceText(tick.time, tick.step < 1000) : clockText(tick.time, tick.step < 1000);
        context.fillRect(at, 0, 1, 5);
        if (at - 24 < free) continue;
        const isNewDay = !isOverlaid && dayText(tick.time) !== day;
        day = dayText(tick.time);
        context.fillText(text, at - 22, 17);
        if (isNewDay) context.fillText(day, at - 22, 31);
        free = at + (isNewDay ? 56 : 34);
    }
    for (const span of spans.slice(1)) {
        context.fillStyle = palette.warning;
        context.fillRect(x(span.place) - 1, 0, 2, panel.height);
    }
}
