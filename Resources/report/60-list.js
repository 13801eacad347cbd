// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// The list of all events beside the charts. It has rows for what is in sight alone: a day has tens of thousands.

const rowHeight = 46;
let listed = []; // indexes of events
let list = null;
let chosen = -1; // an index of an event

function chooseEvent(index) {
    chosen = index;
    goTo(events.time[index], events.duration[index] > 0 ? events.duration[index] : 0);
    const at = listed.indexOf(index);
    if (at >= 0) {
        const top = at * rowHeight;
        if (top < list.box.scrollTop || top + rowHeight > list.box.scrollTop + list.box.clientHeight)
            list.box.scrollTop = top - list.box.clientHeight / 2;
    }
    showList();
}

function eventRow(at) {
    const index = listed[at];
    const duration = events.duration[index];
    const row = element("div", { className: "event s-" + severities[events.severity[index]], id: "event-" + index },
        element("span", { className: "when", textContent: (isComparison ? fileLetters[events.file[index]] + " " : "")
            + clockText(realTime(events.time[index], events.file[index]), true)
            + (duration > 0 ? ", " + spanText(duration) : duration === -1 ? ", no end" : "") }),
        element("span", { className: "kind", textContent: events.names[events.kind[index]] }),
        element("span", { className: "what", textContent: events.names[events.text[index]] }),
        element("span", { className: "m", textContent: events.messages[index].map(messageName).join(" ") }));
    row.setAttribute("role", "option");
    row.setAttribute("aria-selected", String(index === chosen));
    row.setAttribute("aria-setsize", String(listed.length));
    row.setAttribute("aria-posinset", String(at + 1));
    row.setAttribute("aria-label", row.querySelector(".when").textContent + " " + severities[events.severity[index]] + " "
        + row.querySelector(".kind").textContent + ": " + row.querySelector(".what").textContent);
    row.style.top = at * rowHeight + "px";
    row.addEventListener("click", () => chooseEvent(index));
    return row;
}

function showList() {
    const first = Math.max(0, Math.floor(list.box.scrollTop / rowHeight) - 4);
    const last = Math.min(listed.length, first + Math.ceil(list.box.clientHeight / rowHeight) + 8);
    list.rows.style.height = listed.length * rowHeight + "px";
    const rows = [];
    for (let at = first; at < last; ++at) rows.push(eventRow(at));
    list.rows.replaceChildren(...rows);
    const isInSight = rows.some((row) => row.id === "event-" + chosen);
    if (isInSight) list.rows.setAttribute("aria-activedescendant", "event-" + chosen);
    else list.rows.removeAttribute("aria-activedescendant");
}

function filterList() {
    const least = Number(list.severity.value);
    const kind = list.kind.value;
    const words = list.search.value.trim().toLowerCase();
    listed = [];
    for (let i = 0; i < events.count; ++i) {
        const name = events.names[events.kind[i]];
        if (events.severity[i] >= least && (!kind || kind === name)
            && (!words || (name + " " + events.names[events.text[i]]).toLowerCase().includes(words)))
            listed.push(i);
    }
    list.count.textContent = listed.length + " of " + events.count + " events";
    list.box.scrollTop = 0;
    showList();
}

function onListKey(event) {
    const steps = { ArrowDown: 1, ArrowUp: -1, PageDown: 10, PageUp: -10, Home: -Infinity, End: Infinity };
    if (!(event.key in steps) || !listed.length) return;
    const now = listed.indexOf(chosen);
    const at = now < 0 ? 0 : Math.min(Math.max(now + steps[event.key], 0), listed.length - 1);
    chooseEvent(listed[at]);
    event.preventDefault();
}

function choiceOf(label, options) {
    const select = element("select", {}, ...options.map(([value, text]) => element("option", { value, textContent: text })));
    select.addEventListener("change", filterList);
    return [select, element("label", {}, label + " ", select)];
}

function makeList() {
    const beside = document.getElementById("beside");
    if (!events.count) {
        beside.append(element("p", { textContent: "No events." }));
        return;
    }
    const kinds = [...new Set(events.kind)].map((kind) => events.names[kind]).sort();
    const [severity, severityLabel] = choiceOf("Severity", [["0", "all"], ["1", "from warning on"], ["2", "critical"]]);
    const [kind, kindLabel] = choiceOf("Kind", [["", "all"], ...kinds.map((name) => [name, name])]);
    const search = element("input", { type: "search" });
    search.addEventListener("input", filterList);
    const rows = element("div", { className: "rows", tabIndex: 0, id: "list" });
    rows.setAttribute("role", "listbox");
    rows.setAttribute("aria-label", "Events");
    const box = element("div", { className: "box" }, rows);
    list = { box, rows, severity, kind, search, count: element("p", { className: "count", role: "status" }) };
    beside.append(element("h3", { textContent: "Events" }),
        element("div", { className: "filters" }, severityLabel, kindLabel, element("label", {}, "Search ", search)),
        list.count, box);
    box.addEventListener("scroll", () => requestAnimationFrame(showList));
    rows.addEventListener("keydown", onListKey);
    filterList();
}
