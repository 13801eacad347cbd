// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// The way that the recording went, coloured by a value: without a map, since the page asks for nothing.

const trackHeight = 420;
let track = null;

function unpackTrack(packed) {
    const time = summed(packed.timeSteps, data.base);
    const latitude = summed(packed.latitudeSteps).map((value) => value / 1e6);
    const longitude = summed(packed.longitudeSteps).map((value) => value / 1e6);
    const isBegin = new Uint8Array(time.length);
    for (const index of packed.begins) isBegin[index] = 1;
    const least = (values) => values.reduce((a, b) => Math.min(a, b));
    const greatest = (values) => values.reduce((a, b) => Math.max(a, b));
    const south = least(latitude);
    const north = greatest(latitude);
    const narrowing = Math.max(Math.cos((((north + south) / 2) * Math.PI) / 180), 0.01);
    // Of two files: where the second one's fixes begin.
    let second = time.findIndex((each) => fileOfTime(each) === 1);
    if (second < 0) second = time.length;
    const file = new Uint8Array(time.length);
    if (isOverlaid) for (let i = second; i < time.length; ++i) { file[i] = 1; time[i] -= shift; }
    const parts = isOverlaid ? [[0, second], [second, time.length]] : [[0, time.length]];
    return { time, file, parts, latitude, longitude, isBegin, north, south, west: least(longitude), east: greatest(longitude), narrowing };
}

// From red over yellow to green, as levels are.
function valueColour(part) {
    const names = ["poor", "fair", "good", "excellent"];
    return palette[names[Math.min(3, Math.max(0, Math.floor(part * 4)))]];
}

// What that file has of the same field or state; undefined where it has none.
function ofFile(all, one, file) {
    if (one.file === undefined) return one;
    return all.find((each) => each.name === one.name && each.technology === one.technology && each.isBest === one.isBest
        && each.file === file);
}

// The function that gives a time its colour, and what it says below the track.
function colouring() {
    const choice = track.choice.value;
    if (choice === "") return { of: () => palette.series[0], text: "" };
    if (choice[0] === "b") {
        const chosenBand = bands[Number(choice.slice(1))];
        return {
            text: "",
            of: (time, file) => {
                const band = ofFile(bands, chosenBand, file);
                if (!band) return palette.none;
                const at = upperBound(band.since, time) - 1;
                return at < 0 || band.value[at] === 0 ? palette.none : bandColour(band, band.value[at]);
            },
        };
    }
    const one = series[Number(choice.slice(1))];
    const both = [0, 1].map((file) => ofFile(series, one, file));
    const middles = both.map((each) => each && each.least.map((value, i) => (value + each.greatest[i]) / 2));
    const sorted = Float64Array.from(both[0] === both[1] || !middles[1] ? middles[0] || [] : [...(middles[0] || []), ...middles[1]]).sort();
    const low = sorted[Math.floor(sorted.length * 0.02)];
    const high = sorted[Math.floor((sorted.length - 1) * 0.98)];
    return {
        text: "from " + Number(low.toFixed(2)) + " (red) to " + Number(high.toFixed(2)) + " " + one.unit + " (green)",
        of: (time, file) => {
            const at = both[file] ? seriesAt(both[file], time) : -1;
            return at < 0 ? palette.none : valueColour((middles[file][at] - low) / (high - low || 1));
        },
    };
}

function trackScale() {
    const width = track.canvas.clientWidth;
    const margin = 26;
    const scale = Math.min((width - 2 * margin) / Math.max((track.east - track.west) * track.narrowing, 1e-5),
        (trackHeight - 2 * margin) / Math.max(track.north - track.south, 1e-5));
    return {
        x: (i) => margin + (track.longitude[i] - track.west) * track.narrowing * scale,
        y: (i) => margin + (track.north - track.latitude[i]) * scale,
        metre: scale / 111200,
        width,
    };
}

function drawScaleBar(context, map) {
    let length = 1;
    for (let power = 1; power < 1e8; power *= 10)
        for (const factor of [1, 2, 5]) if (power * factor * map.metre < map.width / 3) length = power * factor;
    context.fillStyle = palette.ink;
    context.fillRect(10, trackHeight - 10, length * map.metre, 2);
    context.fillText(length < 1000 ? length + " m" : length / 1000 + " km", 10, trackHeight - 16);
    context.fillText("N", map.width - 20, 34);
    context.beginPath();
    context.moveTo(map.width - 16, 8);
    context.lineTo(map.width - 21, 20);
    context.lineTo(map.width - 11, 20);
    context.fill();
}

function drawTrack() {
    const context = contextOf(track.canvas, trackHeight);
    const map = trackScale();
    const { of, text } = colouring();
    track.legend.textContent = text;
    const from = timeAt(view.from);
    const to = timeAt(view.to);
    let colour = "";
    let isOpen = false;
    const end = () => { if (isOpen) context.stroke(); isOpen = false; };
    for (let i = 1; i < track.time.length; ++i) {
        if (track.isBegin[i]) { end(); continue; }
        const isShown = track.time[i] >= from && track.time[i] <= to;
        const next = isShown ? of(track.time[i], isComparison ? fileOfFix(i) : 0) : palette.line;
        if (!isOpen || next !== colour) {
            end();
            colour = next;
            context.beginPath();
            context.strokeStyle = colour;
            context.lineWidth = isShown ? 4 : 2;
            context.moveTo(map.x(i - 1), map.y(i - 1));
            isOpen = true;
        }
        context.lineTo(map.x(i), map.y(i));
    }
    end();
    drawCellChanges(context, map, from, to);
    drawScaleBar(context, map);
    moveMarker();
}

function fileOfFix(i) {
    return isOverlaid ? track.file[i] : fileOfTime(track.time[i]);
}

// The fix next to a time; of files that lie over each other that file's.
function fixAt(time, file) {
    const [begin, end] = track.parts[isOverlaid ? file || 0 : 0];
    const at = begin + upperBound(track.time.subarray(begin, end), time) - 1;
    const next = at + 1 < end && (at < begin || track.time[at + 1] - time < time - track.time[at]) ? at + 1 : at;
    return next >= begin && Math.abs(track.time[next] - time) <= 10000 ? next : -1;
}

function drawCellChanges(context, map, from, to) {
    if (!track.cells.checked) return;
    context.fillStyle = palette.ink;
    for (const band of bands) {
        if (band.name !== "serving cell") continue;
        for (let i = 1; i < band.since.length; ++i) {
            if (band.since[i] < from || band.since[i] > to || band.value[i] === 0) continue;
            const at = fixAt(band.since[i], band.file);
            if (at < 0) continue;
            context.beginPath();
            context.arc(map.x(at), map.y(at), 3, 0, 2 * Math.PI);
            context.fill();
        }
    }
}

function moveMarker() {
    const map = trackScale();
    const places = track.markers.map((marker, file) => {
        const at = cursor === null ? -1 : fixAt(timeAt(cursor), file);
        marker.hidden = at < 0;
        if (at < 0) return "";
        marker.style.transform = "translate(" + (map.x(at) - 8) + "px," + (map.y(at) - 8) + "px)";
        return nameWithFile(track.latitude[at].toFixed(5) + ", " + track.longitude[at].toFixed(5), isOverlaid ? file : undefined);
    });
    if (places.some((place) => place)) track.place.textContent = places.filter((place) => place).join("; ");
}

// The place of the track that is nearest to a point moves the cursor.
function goToPoint(event) {
    const box = track.canvas.getBoundingClientRect();
    const map = trackScale();
    let best = -1;
    let distance = 30 * 30;
    for (let i = 0; i < track.time.length; ++i) {
        const x = map.x(i) - (event.clientX - box.left);
        const y = map.y(i) - (event.clientY - box.top);
        if (x * x + y * y < distance) { distance = x * x + y * y; best = i; }
    }
    if (best >= 0) setCursor(placeOf(track.time[best]), true);
}

function makeTrack() {
    if (!data.track || !data.track.timeSteps.length) return;
    track = unpackTrack(data.track);
    // Of two files' ones for both.
    const isFirst = (all) => (one) => one.file === undefined || all.find((each) =>
        each.name === one.name && each.technology === one.technology && each.isBest === one.isBest) === one;
    const levels = series.filter(isFirst(series)).map((one) => ["s" + series.indexOf(one), one.name]);
    const states = bands.filter(isFirst(bands)).map((band) => ["b" + bands.indexOf(band), band.name]);
    const options = [...levels, ...states, ["", "nothing"]];
    track.choice = element("select", {}, ...options.map(([value, textContent]) => element("option", { value, textContent })));
    const level = series.findIndex((one) => one.chart === "level" && !one.isBest);
    track.choice.value = level < 0 ? options[0][0] : "s" + level;
    track.cells = element("input", { type: "checkbox", checked: true });
    track.canvas = element("canvas", {});
    track.canvas.setAttribute("aria-hidden", "true");
    track.canvas.style.height = trackHeight + "px";
    track.markers = track.parts.map(() => element("div", { className: "marker", hidden: true }));
    track.legend = element("span", {});
    track.place = element("span", { className: "m" });
    const map = element("div", { className: "map" }, track.canvas, ...track.markers);
    map.addEventListener("click", goToPoint);
    for (const control of [track.choice, track.cells]) control.addEventListener("change", drawTrack);
    document.getElementById("live-track").append(
        element("div", { className: "filters" }, element("label", {}, "Coloured by ", track.choice),
            element("label", {}, track.cells, " cell changes")),
        map, element("p", { className: "help" }, track.legend, " ", track.place));
    document.getElementById("track-picture").hidden = true;
    panels.push({ draw: drawTrack });
    whenCursorMoves.push(moveMarker);
}
