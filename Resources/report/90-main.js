// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Puts it together once the page has been read.

function makeZoneSwitch() {
    const zone = Intl.DateTimeFormat().resolvedOptions().timeZone || "local";
    const box = element("fieldset", {}, element("legend", { textContent: "Times" }));
    for (const [text, local] of [["UTC", false], ["local (" + zone + ")", true]]) {
        const choice = element("input", { type: "radio", name: "zone", checked: !local });
        choice.addEventListener("change", () => {
            isLocal = local;
            showZone();
            if (list) showList();
            redraw();
        });
        box.append(element("label", {}, choice, " " + text));
    }
    document.getElementById("tools").append(box);
}

// Times of tables lead to the charts.
function linkTimes() {
    for (const time of document.querySelectorAll("#events td time, #contexts td time, #summary td time, #cells td time, #neighbours td time")) {
        const go = button("", "Show in the charts", () => {
            goTo(shownTime(Date.parse(time.dateTime)), 60000);
            document.getElementById("charts").scrollIntoView();
        });
        go.className = "go";
        go.removeAttribute("aria-label");
        time.replaceWith(go);
        go.append(time);
    }
}

readPalette();
if (spans.length) {
    makeStage();
    makeList();
    makeTrack();
    document.getElementById("pictures").hidden = true;
    redraw();
}
makeZoneSwitch();
linkTimes();
for (const query of ["(prefers-color-scheme: dark)", "print"])
    matchMedia(query).addEventListener("change", () => { readPalette(); redraw(); });
document.documentElement.dataset.ready = String(Math.round(performance.now()));
