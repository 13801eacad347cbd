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
LONGEST_WAIT_S = 20
# Checking the whole page for accessibility takes a while on a busy machine.
SCRIPT_TIMEOUT_MS = 240_000


class Browser(ABC):
    """One window. Sizes are in CSS pixels."""

    name: str

    @abstractmethod
    def open(self, page: Path) -> None: ...

    @abstractmethod
    def run(self, script: str, *arguments: Any) -> Any:
        """Runs the body of a function in the page and returns its result; waits for promises."""

    def wait_for_drawing(self) -> None:
        self.run(DRAWN)

    def wait_until(self, holds: Callable[[], object]) -> bool:
        """Whether it holds, or comes to hold while the page draws."""
        until = time.monotonic() + LONGEST_WAIT_S
        while not (found := bool(holds())) and time.monotonic() < until:
            self.wait_for_drawing()
        return found

    def loads_page(self, action: Callable[[], object], ready: str) -> bool:
        """Whether the action makes the page load again, up to where the script `ready` returns something."""
        self.run("document.documentElement.dataset.isOldPage = true")
        action()
        until = time.monotonic() + LONGEST_WAIT_S
        while time.monotonic() < until:
            try:
                if self.run("return document.documentElement?.dataset.isOldPage === undefined") and self.run(ready):
                    return True
            except RuntimeError:  # a page that is being replaced runs no scripts
                pass
            time.sleep(0.05)
        return False

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
