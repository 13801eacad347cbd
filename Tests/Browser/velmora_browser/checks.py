# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What holds for a page in a browser. Each check returns the errors that it finds."""

from collections.abc import Callable, Iterator
from pathlib import Path

from .browser import Browser

SHIFT = "\ue008"
ARROW_RIGHT, HOME, TAB = "\ue014", "\ue011", "\ue004"
WIDE, NARROW = (1280, 1000), (360, 740)

READY = "return document.documentElement.dataset.ready"
STAGE = "const box = document.getElementById('stage').getBoundingClientRect();"
RANGE = "return document.querySelector('.range').textContent"
CURSOR = "return document.getElementById('cursor-time').textContent"
# Of each chart the share of its columns, right of the scale, that have more than the ground and the lines of the scale.
DRAWN = """return [...document.querySelectorAll('#stage canvas')].filter((canvas) => canvas.clientHeight > 100).map((canvas) => {
    const { width, height } = canvas;
    const pixels = new Uint32Array(canvas.getContext('2d').getImageData(0, 0, width, height).data.buffer);
    let drawn = 0;
    const left = Math.ceil(width * 60 / canvas.clientWidth);
    for (let x = left; x < width; ++x) {
        let isDrawn = false;
        for (let y = 0; y < height; ++y) isDrawn = isDrawn || pixels[y * width + x] !== pixels[y * width + left];
        drawn += isDrawn ? 1 : 0;
    }
    return drawn / (width - left); });"""
LENGTH = "return Number(document.getElementById('stage')?.dataset.length)"  # of what the charts show, in ms
GROUND = "return getComputedStyle(document.body).backgroundColor"
SELECTED = "document.querySelector('.event[aria-selected=true] .when')"
# The colour of the charts' ground.
PIXEL = "return [...document.querySelector('#stage canvas').getContext('2d').getImageData(2, 2, 1, 1).data]"
HEIGHTS = "return ['live', 'pictures'].map((id) => document.getElementById(id).offsetHeight)"
READOUT = """return [...document.querySelectorAll('#readout tbody tr')].map((row) =>
    [row.querySelector('th').textContent.trim(), row.querySelector('td').textContent])"""
LOADS = 3  # of which the fastest counts: others may keep the machine busy during one
VIOLATIONS = """
return axe.run(document, { resultTypes: ['violations'] }).then((result) => result.violations.map((each) =>
    each.id + ': ' + each.help + ': ' + each.nodes.slice(0, 2).map((node) => node.html.slice(0, 120)).join(' | ')));
"""


def check_start(browser: Browser, page: Path, slowest_ms: int) -> Iterator[str]:
    browser.resize(*WIDE)
    browser.set_dark(False)
    took_ms: list[int] = []
    while len(took_ms) < LOADS and (not took_ms or min(took_ms) > slowest_ms):
        browser.open(page)
        ready, is_ready = browser.read_until(READY, bool)
        if not is_ready:
            yield f"its script did not get to its end: {ready}"
            return
        took_ms.append(int(ready))
    if min(took_ms) > slowest_ms:
        yield f"interactive after {took_ms} ms, wanted at most {slowest_ms} once"
    if not browser.run("return document.getElementById('pictures').hidden"):
        yield "the pictures are shown beside the charts"


def check_drawn(browser: Browser) -> Iterator[str]:
    shares, are_drawn = browser.read_until(DRAWN, lambda found: found and min(found) >= 0.2)
    if not are_drawn:
        yield f"charts are not drawn: {shares} of their columns have a line"


def centre(browser: Browser) -> tuple[int, int]:
    browser.run("document.getElementById('stage').scrollIntoView({ block: 'start' })")
    x, y = browser.run(STAGE + "return [box.left + box.width / 2, box.top + Math.min(box.height, 300) / 2]")
    return int(x), int(y)


def check_changes(browser: Browser, what: str, script: str, action: Callable[[], object]) -> Iterator[str]:
    before, _ = browser.read_until(script, lambda found: True)
    action()
    if not browser.read_until(script, lambda found: found != before)[1]:
        yield f"{what} changes nothing: {before}"


def check_mouse(browser: Browser) -> Iterator[str]:
    x, y = centre(browser)
    yield from check_changes(browser, "the mouse", CURSOR, lambda: browser.move((x, y)))
    yield from check_changes(browser, "dragging with Shift", RANGE, lambda: browser.drag((x - 100, y), (x + 100, y), SHIFT))
    yield from check_changes(browser, "dragging", RANGE, lambda: browser.drag((x, y), (x + 150, y)))
    yield from check_changes(browser, "the button to show all", RANGE, lambda: browser.click("button[title='Show all']"))


def check_keys(browser: Browser) -> Iterator[str]:
    browser.run("document.getElementById('stage').focus()")
    for what, script, keys in (("+", RANGE, "+"), ("the arrow key", CURSOR, ARROW_RIGHT * 3), ("N", CURSOR, "n"), ("P", CURSOR, "p"),
                               ("Home", CURSOR, HOME), ("0", RANGE, "0")):
        yield from check_changes(browser, what, script, lambda keys=keys: browser.press(keys))  # type: ignore[misc]
    yield from check_changes(browser, "Tab", "return document.activeElement.className", lambda: browser.press(TAB))


def check_events(browser: Browser) -> Iterator[str]:
    count = browser.run("return document.querySelectorAll('.event').length")
    if not count:
        yield "no events are listed"
        return
    when = browser.run("const row = document.querySelectorAll('.event')[2], { textContent } = row.querySelector('.when');"
                       "row.click(); return textContent")
    chosen, is_chosen = browser.read_until(f"return {SELECTED}.textContent", lambda found: found == when)
    if not is_chosen:
        yield f"a click at the event of {when} chooses {chosen}"
    cursor, is_there = browser.read_until(CURSOR, lambda found: when[:12] in found)
    if not is_there:
        yield f"the event of {when} has moved the cursor to {cursor}"


def check_touch(browser: Browser) -> Iterator[str]:
    if "pan-y" not in browser.run("return getComputedStyle(document.getElementById('stage')).touchAction"):
        yield "fingers do not reach the charts"
    x, y = centre(browser)
    for what, begin, end, sign in (("fingers that move apart", 60, 240, -1), ("fingers that come together", 240, 60, 1)):
        before, _ = browser.read_until(LENGTH, bool)
        if not browser.pinch((x, y), begin, end):
            return
        after, zoomed = browser.read_until(LENGTH, lambda found, sign=sign, before=before:  # type: ignore[misc]
                                           found and (found - before) * sign > 0)
        if not zoomed:
            yield f"{what} do not zoom: {before} ms before, {after} after"


def check_zone(browser: Browser) -> Iterator[str]:
    script = "return document.querySelector('time').textContent"
    for which, what in ((1, "the choice of the zone"), (0, "the choice of UTC")):
        yield from check_changes(browser, what, script, lambda which=which:  # type: ignore[misc]
                                 browser.run(f"document.querySelectorAll('#tools input')[{which}].click()"))


def check_width(browser: Browser, size: tuple[int, int]) -> Iterator[str]:
    browser.resize(*size)
    widths, fit = browser.read_until("return [innerWidth, document.documentElement.scrollWidth]",
                                     lambda found: found[0] == size[0] and found[1] <= size[0])
    if not fit:
        yield f"window and page are {widths} wide, wanted {size[0]} and no more"


def check_dark(browser: Browser) -> Iterator[str]:
    yield from check_changes(browser, "dark", GROUND, lambda: browser.set_dark(True))
    pixel, is_dark = browser.read_until(PIXEL, lambda found: max(found[:3]) <= 100)
    if not is_dark:
        yield f"the charts stay light in the dark: {pixel}"


def check_accessible(browser: Browser, axe: str | None, where: str) -> Iterator[str]:
    if axe is not None:
        for violation in browser.run(axe + VIOLATIONS):
            yield f"{where}: {violation}"


def check_print(browser: Browser) -> Iterator[str]:
    browser.set_print(True)
    heights, are_printed = browser.read_until(HEIGHTS, lambda found: found[0] == 0 and found[1] > 0)
    if not are_printed:
        yield f"on paper the charts and the pictures are {heights} high, wanted pictures alone"
    browser.set_print(False)
    if not browser.pdf().startswith(b"%PDF"):
        yield "printing makes no document"


def check_page(browser: Browser, page: Path, axe: str | None, slowest_ms: int) -> Iterator[str]:
    """Everything, of a page that has charts and events."""
    yield from check_start(browser, page, slowest_ms)
    for check in (check_drawn, check_mouse, check_keys, check_events, check_touch, check_zone):
        yield from check(browser)
    yield from check_accessible(browser, axe, "light")
    yield from check_dark(browser)
    yield from check_width(browser, NARROW)
    yield from check_accessible(browser, axe, "dark and narrow")
    yield from check_print(browser)
    yield from browser.problems()


def with_values(readout: list[list[str]]) -> set[str]:
    """The letters of the files that have a value at the cursor."""
    return {name[0] for name, value in readout if name[1:3] == ": " and value != "\u2013"}


def check_comparison(browser: Browser, page: Path, lengths_ms: tuple[int, int]) -> Iterator[str]:
    """The charts of two files lie over each other, from the start of each, or one after the other."""
    yield from check_start(browser, page, 60_000)
    yield from check_drawn(browser)
    length, is_longer = browser.read_until(LENGTH, lambda found: abs(found - max(lengths_ms)) <= 1)
    if not is_longer:
        yield f"over each other the charts are {length} ms long, wanted the longer of {lengths_ms}"
    shown, is_relative = browser.read_until(RANGE, lambda found: "since the start" in found)
    if not is_relative:
        yield f"over each other the charts show {shown}"
    names = browser.run("return [...document.querySelectorAll('.legend label')].map((each) => each.textContent.trim())")
    for letter in "AB":
        if not any(name.startswith(letter + ": ") for name in names):
            yield f"no series of file {letter}: {names}"
    # Where both have values, the table below the charts has them, too.
    x, y = centre(browser)
    left = x - browser.run(STAGE + "return box.width / 2") + 58
    shorter = left + (browser.run(STAGE + "return box.width") - 58) * min(lengths_ms) / max(lengths_ms)
    browser.move((int((left + shorter) / 2), y))
    read, have_values = browser.read_until(READOUT, lambda found: with_values(found) >= {"A", "B"})
    if not have_values:
        yield f"at the same time since the start a file has nothing: {read}"
    chosen = "[...document.querySelectorAll('.event')].find((row) => row.querySelector('.when').textContent.startsWith('B '))"
    yield from check_changes(browser, "the choice of an event of the second file", CURSOR, lambda: browser.run(chosen + ".click()"))
    if not browser.loads_page("document.getElementById('arrangement').click()", READY):
        yield "the choice of the other arrangement does not load the page again"
        return
    if browser.run(LENGTH) <= max(lengths_ms) + 1:
        yield f"one after the other the charts are {browser.run(LENGTH)} ms long, wanted more than {lengths_ms}"
    if "UTC" not in browser.run(RANGE):
        yield f"one after the other the charts show {browser.run(RANGE)}"
    yield from check_drawn(browser)
    yield from browser.problems()


def check_hostile(browser: Browser, page: Path, names: list[str]) -> Iterator[str]:
    """A page whose texts try to be more than texts."""
    yield from check_start(browser, page, 60_000)
    yield from check_drawn(browser)
    if (hacked := browser.run("return window.hacked")) is not None:
        yield f"a text of the recording was run: {hacked}"
    if (foreign := browser.run("return document.querySelectorAll('img, iframe, object, svg[onload]').length")) != 0:
        yield f"texts of the recording became {foreign} elements"
    text = browser.run("return document.documentElement.textContent")
    yield from (f"the page does not show {name}" for name in names if name not in text)
    for character in "\u202e\u2066\u200f\u2028\ufeff\0\x1b":
        if character in text:
            yield f"the page has the character U+{ord(character):04X}"
    yield from browser.problems()
