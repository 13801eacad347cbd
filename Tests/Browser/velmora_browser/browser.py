# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What the checks ask of a browser."""

import time
from abc import ABC, abstractmethod
from collections.abc import Callable
from pathlib import Path
from typing import Any


# Two frames: what was asked for in the first one is drawn in the second.
DRAWN = "return new Promise((drawn) => requestAnimationFrame(() => requestAnimationFrame(() => drawn(true))))"
IS_DARK = "return matchMedia('(prefers-color-scheme: dark)').matches"
IS_PRINTED = "return matchMedia('print').matches"
LONGEST_WAIT_S = 20
RETRY_S = 0.05
# Checking the whole page for accessibility takes a while on a busy machine.
SCRIPT_TIMEOUT_MS = 240_000


class DriverError(RuntimeError):
    """The browser runs, but could not do what it was asked to, such as a script of a page that is being left."""


class Browser(ABC):
    """One window. Sizes are in CSS pixels."""

    name: str

    @abstractmethod
    def open(self, page: Path) -> None: ...

    @abstractmethod
    def run(self, script: str, *arguments: Any) -> Any:
        """Runs the body of a function in the page and returns its result; waits for promises. NaN and undefined become None.
        Raises DriverError where the function throws or the page is left meanwhile."""

    def wait_for_drawing(self) -> None:
        self.run(DRAWN)

    def read_until(self, script: str, holds: Callable[[Any], object], *arguments: Any) -> tuple[Any, bool]:
        """What the script returns once that holds, and True; what it returned last, and False, after LONGEST_WAIT_S.

        A page is drawn a frame after what changes it, and is loaded anew by some links: until then elements are missing.
        So a script that throws is run again, and None never holds."""
        until = time.monotonic() + LONGEST_WAIT_S
        value: Any = None
        while True:
            try:
                value = self.run(script, *arguments)
                if value is not None and holds(value):
                    return value, True
                self.wait_for_drawing()
            except DriverError as error:
                value = error
                time.sleep(RETRY_S)
            if time.monotonic() >= until:
                return value, False

    def loads_page(self, action: str, ready: str) -> bool:
        """Whether the script `action` makes the page load again, up to where the script `ready` returns something."""
        self.run("document.documentElement.dataset.isOldPage = true")
        self.run(f"setTimeout(() => {{ {action} }})")  # loading begins after the script that asks for it
        is_new, _ = self.read_until("return document.documentElement.dataset.isOldPage === undefined", bool)
        return is_new is True and self.read_until(ready, bool)[1]

    @abstractmethod
    def resize(self, width: int, height: int) -> None: ...

    @abstractmethod
    def set_dark(self, dark: bool) -> None: ...

    @abstractmethod
    def set_print(self, printed: bool) -> None:
        """Shows the page as it is on paper."""

    @abstractmethod
    def press(self, keys: str) -> None:
        """Presses keys one after the other, where the focus is."""

    @abstractmethod
    def drag(self, begin: tuple[int, int], end: tuple[int, int], keys: str = "") -> None: ...

    @abstractmethod
    def move(self, point: tuple[int, int]) -> None: ...

    def pinch(self, middle: tuple[int, int], begin: int, end: int) -> bool:
        """Two fingers that far from the middle go to the other distance. False where the driver has no fingers."""
        del middle, begin, end
        return False

    @abstractmethod
    def click(self, selector: str) -> None: ...

    @abstractmethod
    def screenshot(self) -> bytes: ...

    @abstractmethod
    def pdf(self) -> bytes: ...

    @abstractmethod
    def problems(self) -> list[str]:
        """Errors of the console, violations of the security policy, and requests beside the page, so far."""

    @abstractmethod
    def close(self) -> None: ...


def pointer_actions(begin: tuple[int, int], end: tuple[int, int] | None, keys: str) -> list[dict[str, Any]]:
    """WebDriver's actions: to move to a point and, with an end, to drag from there while keys are held."""
    def pause() -> dict[str, Any]:
        return {"type": "pause", "duration": 30}

    move = [{"type": "pointerMove", "x": begin[0], "y": begin[1], "duration": 30}]
    if end is None:
        return [{"type": "pointer", "id": "mouse", "actions": move}]
    middle = ((begin[0] + end[0]) // 2, (begin[1] + end[1]) // 2)
    path = [*move, {"type": "pointerDown", "button": 0}]
    path += [{"type": "pointerMove", "x": x, "y": y, "duration": 60} for x, y in (middle, end)]
    path += [pause(), {"type": "pointerUp", "button": 0}]
    held = [{"type": "keyDown", "value": key} for key in keys]
    released = [{"type": "keyUp", "value": key} for key in keys]
    pauses = [pause() for _ in range(len(path) - len(held))]
    return [{"type": "key", "id": "keyboard", "actions": [*held, *pauses, pause(), *released]},
            {"type": "pointer", "id": "mouse", "actions": path}]


def pinch_actions(middle: tuple[int, int], begin: int, end: int) -> list[dict[str, Any]]:
    """Two fingers to the left and the right of the middle."""
    def finger(name: str, side: int) -> dict[str, Any]:
        def at(distance: int, duration: int) -> dict[str, Any]:
            return {"type": "pointerMove", "x": middle[0] + side * distance, "y": middle[1], "duration": duration}

        path = [at(begin, 0), {"type": "pointerDown", "button": 0}, at((begin + end) // 2, 60), at(end, 60),
                {"type": "pointerUp", "button": 0}]
        return {"type": "pointer", "id": name, "parameters": {"pointerType": "touch"}, "actions": path}

    return [finger("left", -1), finger("right", 1)]


def key_actions(keys: str) -> list[dict[str, Any]]:
    return [{"type": "key", "id": "keyboard",
             "actions": [{"type": kind, "value": key} for key in keys for kind in ("keyDown", "keyUp")]}]
