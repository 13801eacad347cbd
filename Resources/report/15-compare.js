// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Of two files: the charts over each other, each file from its own start on. All times of the second file are moved to
// those of the first, so that nothing else needs to know; `realTime` leads back. "#sequence" in the address shows one
// file after the other.

const isComparison = data.files.length === 2 && data.files.every((file) => file.first !== undefined);
const isOverlaid = isComparison && location.hash !== "#sequence";
const shift = isOverlaid ? data.files[1].first - data.files[0].first : 0; // ms, of the second file
const fileLetters = ["A", "B"];

// 0 or 1: the file of a message of all files.
function fileOfMessage(number) {
    return isComparison && number > data.files[1].numbersBefore ? 1 : 0;
}

// 0 or 1: the file that was recorded at that time; of two at once the first.
function fileOfTime(time) {
    if (!isComparison) return 0;
    const distance = ({ first, last }) => Math.max(first - time, time - last, 0);
    return distance(data.files[1]) < distance(data.files[0]) ? 1 : 0;
}

function realTime(time, file) {
    return file === 1 ? time + shift : time;
}

// The place in the charts of a time as it was.
function shownTime(time) {
    return fileOfTime(time) === 1 ? time - shift : time;
}

function nameWithFile(name, file) {
    return file === undefined ? name : fileLetters[file] + ": " + name;
}

function sortedBy(order, column) {
    return order.map((index) => column[index]);
}

function overlay() {
    const length = Math.max(...data.files.map((file) => file.last - file.first));
    const begin = data.files[0].first - data.base;
    data.spans = [[begin, begin + length]];
    for (const one of series) if (one.file === 1) one.begin = one.begin.map((time) => time - shift);
    for (const band of bands) if (band.file === 1) band.since = band.since.map((time) => time - shift);
    events.time = events.time.map((time, i) => (events.file[i] === 1 ? time - shift : time));
    const order = [...events.file.keys()].sort((a, b) => events.time[a] - events.time[b] || a - b);
    for (const column of ["duration", "severity", "kind", "technology", "text", "messages", "file"])
        events[column] = sortedBy(order, events[column]);
    events.time = Float64Array.from(sortedBy(order, events.time));
}

events.file = events.messages.map((numbers, i) =>
    (numbers.length ? fileOfMessage(numbers[0]) : fileOfTime(events.time[i])));
if (isOverlaid) overlay();

// What stands above the charts of a comparison: which file is which, and how they lie.
function makeComparison() {
    if (!isComparison) return;
    const names = data.files.map((file, i) => fileLetters[i] + ": " + file.name).join(", ");
    const link = element("a", { href: isOverlaid ? "#sequence" : "#overlaid",
        textContent: isOverlaid ? "one after the other" : "over each other" });
    link.id = "arrangement";
    document.getElementById("live").append(element("p", { className: "files" }, names + "; "
        + (isOverlaid ? "over each other, each from its own start. Show them " : "one after the other. Show them "), link, "."));
    window.addEventListener("hashchange", () => {
        if ((location.hash === "#sequence") === isOverlaid) location.reload();
    });
}
