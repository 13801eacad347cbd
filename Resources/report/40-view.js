// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// What the charts show, and how it is changed: the view is a part of the axis, the cursor a time.

const view = { from: 0, to: Math.max(axisLength, 1) };
let cursor = null; // a place on the axis
let panels = [];
const whenCursorMoves = [];
let isDrawing = false;

function redraw() {
    if (isDrawing) return;
    isDrawing = true;
    requestAnimationFrame(() => {
        isDrawing = false;
        for (const panel of panels) panel.draw(panel, view);
        showCursor();
        showRange();
    });
}

function setView(from, to) {
    const length = Math.min(Math.max(to - from, 200), Math.max(axisLength, 200));
    view.from = Math.min(Math.max(from, 0), Math.max(axisLength - length, 0));
    view.to = view.from + length;
    redraw();
}

function zoom(factor, around) {
    const middle = around === undefined ? (cursorInView() ? cursor : (view.from + view.to) / 2) : around;
    setView(middle - (middle - view.from) * factor, middle + (view.to - middle) * factor);
}

function pan(part) {
    const step = (view.to - view.from) * part;
    setView(view.from + step, view.to + step);
}

function cursorInView() {
    return cursor !== null && cursor >= view.from && cursor <= view.to;
}

function setCursor(place, doesShow) {
    cursor = Math.min(Math.max(place, 0), axisLength);
    if (doesShow && !cursorInView()) {
        const half = (view.to - view.from) / 2;
        setView(cursor - half, cursor + half);
    }
    requestAnimationFrame(showCursor);
    for (const call of whenCursorMoves) call();
}

// Shows that time of the axis, close enough to see what happened.
function goTo(time, duration) {
    const place = placeOf(time);
    const length = Math.min(view.to - view.from, Math.max(120000, 2 * (duration || 0)));
    setView(place - length / 2, place + length / 2);
    setCursor(place, true);
}

function placeAtPixel(stage, clientX) {
    const box = stage.getBoundingClientRect();
    const part = (clientX - box.left - leftMargin) / Math.max(box.width - leftMargin, 1);
    return view.from + Math.min(Math.max(part, 0), 1) * (view.to - view.from);
}

function nextEvent(direction) {
    if (!events.count) return;
    const time = cursor === null ? timeAt(view.from) : timeAt(cursor);
    let index = direction > 0 ? upperBound(events.time, time + 0.5) : upperBound(events.time, time - 0.5) - 1;
    index = Math.min(Math.max(index, 0), events.count - 1);
    chooseEvent(index);
}

function onKey(event) {
    const perPixel = (view.to - view.from) / Math.max(event.currentTarget.clientWidth - leftMargin, 1);
    const from = cursor === null ? (view.from + view.to) / 2 : cursor;
    const actions = {
        ArrowLeft: () => (event.shiftKey ? pan(-0.1) : setCursor(from - (event.altKey ? 10 : 1) * perPixel * 4, true)),
        ArrowRight: () => (event.shiftKey ? pan(0.1) : setCursor(from + (event.altKey ? 10 : 1) * perPixel * 4, true)),
        PageUp: () => pan(-0.9), PageDown: () => pan(0.9),
        Home: () => setCursor(0, true), End: () => setCursor(axisLength, true),
        "+": () => zoom(0.5), "=": () => zoom(0.5), "-": () => zoom(2), "0": () => setView(0, axisLength),
        n: () => nextEvent(1), p: () => nextEvent(-1),
    };
    if (event.ctrlKey || event.metaKey || !actions[event.key]) return;
    actions[event.key]();
    event.preventDefault();
}

// Dragging moves the charts, with Shift it chooses what to zoom to; two fingers zoom; a tap sets the cursor.
function listenTo(stage, selection) {
    const pointers = new Map();
    let begin = null;
    const place = (event) => placeAtPixel(stage, event.clientX);
    const pinch = () => {
        const [a, b] = [...pointers.values()];
        return { middle: (a + b) / 2, distance: Math.max(Math.abs(a - b), 10) };
    };
    stage.addEventListener("pointerdown", (event) => {
        if (event.button !== 0) return;
        pointers.set(event.pointerId, event.clientX);
        begin = { x: event.clientX, from: view.from, to: view.to, place: place(event), isZoom: event.shiftKey, isMoved: false };
        if (pointers.size === 2) begin.pinch = pinch();
        stage.setPointerCapture(event.pointerId);
    });
    stage.addEventListener("pointermove", (event) => {
        if (!pointers.has(event.pointerId)) {
            if (event.pointerType === "mouse") setCursor(place(event), false);
            return;
        }
        pointers.set(event.pointerId, event.clientX);
        const perPixel = (begin.to - begin.from) / Math.max(stage.clientWidth - leftMargin, 1);
        if (pointers.size === 2 && begin.pinch) {
            const now = pinch();
            const factor = begin.pinch.distance / now.distance;
            const left = stage.getBoundingClientRect().left + leftMargin;
            const still = begin.from + (begin.pinch.middle - left) * perPixel;
            const from = still - (now.middle - left) * perPixel * factor;
            setView(from, from + (begin.to - begin.from) * factor);
        } else if (begin.isZoom) {
            const end = event.clientX;
            const left = stage.getBoundingClientRect().left;
            selection.hidden = false;
            selection.style.left = Math.min(begin.x, end) - left + "px";
            selection.style.width = Math.abs(end - begin.x) + "px";
        } else if (begin.isMoved || Math.abs(event.clientX - begin.x) > 4) {
            begin.isMoved = true;
            const step = (begin.x - event.clientX) * perPixel;
            setView(begin.from + step, begin.to + step);
        }
    });
    const end = (event) => {
        if (!pointers.delete(event.pointerId) || !begin) return;
        selection.hidden = true;
        const isFar = Math.abs(event.clientX - begin.x) > 4;
        if (event.type === "pointerup" && begin.isZoom && isFar)
            setView(Math.min(begin.place, place(event)), Math.max(begin.place, place(event)));
        else if (event.type === "pointerup" && !begin.isMoved && !begin.pinch) setCursor(place(event), true);
        if (pointers.size === 0) begin = null;
    };
    stage.addEventListener("pointerup", end);
    stage.addEventListener("pointercancel", end);
    stage.addEventListener("dblclick", (event) => zoom(0.4, place(event)));
    stage.addEventListener("wheel", (event) => {
        // The wheel alone scrolls the page, unless the charts have the focus.
        if (!event.ctrlKey && document.activeElement !== stage) return;
        event.preventDefault();
        if (Math.abs(event.deltaX) > Math.abs(event.deltaY)) pan(Math.sign(event.deltaX) * 0.1);
        else zoom(event.deltaY > 0 ? 1.25 : 0.8, place(event));
    }, { passive: false });
    stage.addEventListener("keydown", onKey);
}
