// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// The charts above each other, the line of the cursor through them, and the values at it.

let stage = null;
let cursorLine = null;
let range = null;
const readouts = [];

function element(name, properties, ...children) {
    const made = document.createElement(name);
    for (const [key, value] of Object.entries(properties || {}))
        if (key in made) made[key] = value;
        else made.setAttribute(key, value);
    made.append(...children);
    return made;
}

function button(text, label, action) {
    const made = element("button", { type: "button", textContent: text, title: label });
    made.setAttribute("aria-label", label);
    made.addEventListener("click", action);
    return made;
}

function addPanel(title, height, draw, extra, heading) {
    const canvas = element("canvas", {});
    canvas.setAttribute("aria-hidden", "true");
    canvas.style.height = height + "px";
    stage.append(element("div", { className: "panel" }, ...(heading ? [heading] : []), canvas));
    panels.push({ canvas, height, draw, title, ...extra });
}

function addReadout(name, unit, colour) {
    const cell = element("td", {});
    const title = element("th", { scope: "row" });
    if (colour !== undefined) title.append(element("span", { className: "dot d-" + colour }), " ");
    title.append(name);
    const messages = element("td", { className: "m" });
    readouts.push({ cell, messages, unit });
    return element("tr", {}, title, cell, messages);
}

function seriesAt(one, time) {
    const index = upperBound(one.begin, time) - 1;
    return index >= 0 && time < one.begin[index] + 2 * one.width ? index : -1;
}

function addChart(name, rows) {
    const shown = series.filter((one) => one.chart === name);
    if (!shown.length) return;
    const legend = element("ul", { className: "legend" });
    shown.forEach((one, i) => {
        one.colour = i % 8;
        one.isShown = true;
        const box = element("input", { type: "checkbox", checked: true });
        box.addEventListener("change", () => { one.isShown = box.checked; redraw(); });
        const label = nameWithFile(one.name, one.file) + (one.isBest ? " (best)" : "");
        legend.append(element("li", {}, element("label", {}, box, element("span", { className: "dot d-" + one.colour }),
            " ", label)));
        const row = addReadout(label, one.unit, one.colour);
        const out = readouts[readouts.length - 1];
        out.update = (time) => {
            const at = seriesAt(one, time);
            const least = at < 0 ? "" : String(one.least[at]);
            const greatest = at < 0 ? "" : String(one.greatest[at]);
            out.cell.textContent = at < 0 ? "\u2013"
                : (least === greatest ? least : least + " to " + greatest) + " " + one.unit
                    + (one.count[at] > 1 ? ", " + one.count[at] + " samples" : "");
            const from = at < 0 ? "" : messageName(one.leastAt[at]);
            const to = at < 0 ? "" : messageName(one.greatestAt[at]);
            out.messages.textContent = from === to ? from : from + " " + to;
        };
        rows.append(row);
    });
    const title = name + " (" + shown[0].unit + ")";
    addPanel(title, 150, drawChart, { series: shown },
        element("div", { className: "heading" }, element("h3", { textContent: title }), legend));
}

function bandPlace(band) {
    return bands.findIndex((other) => other.name === band.name);
}

function addBand(band, rows) {
    const isOne = bands.every((other) => other === band || other.name !== band.name || other.file !== band.file);
    const name = nameWithFile(isOne ? band.name : band.name + ", " + band.technology, band.file);
    addPanel(name, 16, drawBand, { band }, element("h3", { textContent: name }));
    rows.append(addReadout(name, ""));
    const out = readouts[readouts.length - 1];
    out.update = (time) => {
        const at = upperBound(band.since, time) - 1;
        out.cell.textContent = at < 0 || band.value[at] === 0 ? "\u2013" : band.values[band.value[at]];
    };
}

function showCursor() {
    if (!cursorLine) return;
    cursorLine.hidden = !cursorInView();
    if (cursor === null) return;
    const width = stage.clientWidth - leftMargin;
    const x = leftMargin + ((cursor - view.from) / (view.to - view.from)) * width;
    cursorLine.style.transform = "translateX(" + x + "px)";
    const time = timeAt(cursor);
    for (const each of readouts) each.update(time);
    document.getElementById("cursor-time").textContent = axisText(time);
}

function showRange() {
    stage.dataset.length = String(view.to - view.from); // ms
    range.textContent = axisText(timeAt(view.from)) + " \u2013 " + axisText(timeAt(view.to)) + " ("
        + spanText(view.to - view.from) + ")";
}

function makeStage() {
    const live = document.getElementById("live");
    makeComparison();
    range = element("p", { className: "range" });
    const tools = element("div", { className: "buttons", role: "toolbar" },
        button("+", "Zoom in", () => zoom(0.5)), button("\u2212", "Zoom out", () => zoom(2)),
        button("\u2190", "Earlier", () => pan(-0.5)), button("\u2192", "Later", () => pan(0.5)),
        button("All", "Show all", () => setView(0, axisLength)),
        button("Previous event", "Previous event", () => nextEvent(-1)), button("Next event", "Next event", () => nextEvent(1)));
    tools.setAttribute("aria-label", "Time shown");
    stage = element("div", { className: "stage", tabIndex: 0, id: "stage" });
    stage.setAttribute("role", "group");
    stage.setAttribute("aria-label", "Charts over time");
    stage.setAttribute("aria-describedby", "stage-help");
    const rows = element("tbody", {});
    for (const name of ["level", "quality", "data rate", "error rate"]) addChart(name, rows);
    // Those of two files next to each other.
    for (const band of bands.slice().sort((a, b) => bandPlace(a) - bandPlace(b))) addBand(band, rows);
    if (events.count) addPanel("events", 16, drawTicks, {}, element("h3", { textContent: "events" }));
    addPanel("time", 34, drawAxis, {});
    const selection = element("div", { className: "selection", hidden: true });
    cursorLine = element("div", { className: "cursor", hidden: true });
    stage.append(selection, cursorLine);
    listenTo(stage, selection);
    const help = element("p", { id: "stage-help", className: "help", textContent: "Drag or use Shift and the arrow keys to "
        + "move, Shift and drag, Ctrl and the wheel, two fingers or + and \u2212 to zoom, 0 for all; the arrow keys move the "
        + "cursor, N and P go to the next and previous event." });
    const table = element("table", { className: "readout", id: "readout" },
        element("caption", {}, "At the cursor: ", element("span", { id: "cursor-time", textContent: "\u2013" })),
        element("thead", {}, element("tr", {}, ...["What", "Value", "Messages"].map((text) =>
            element("th", { scope: "col", textContent: text })))), rows);
    live.append(tools, range, element("div", { className: "bench" },
        element("div", { className: "left" }, stage, help, table), element("div", { className: "right", id: "beside" })));
    new ResizeObserver(redraw).observe(stage);
}
