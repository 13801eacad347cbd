# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Chromium by its driver."""

import base64
import json
import shutil
import subprocess
import tempfile
import urllib.error
import urllib.request
from pathlib import Path
from typing import Any

from .browser import IS_DARK, IS_PRINTED, SCRIPT_TIMEOUT_MS, Browser, DriverError, key_actions, pinch_actions, pointer_actions

ELEMENT = "element-6066-11e4-a52e-4f735466cecf"


class Chromium(Browser):
    name = "chromium"

    def __init__(self) -> None:
        self._profile = tempfile.TemporaryDirectory()
        self._driver = subprocess.Popen([str(shutil.which("chromedriver")), "--port=0"], stdout=subprocess.PIPE,
                                        stderr=subprocess.DEVNULL, text=True)
        self._url = self._address()
        arguments = ["--headless=new", "--no-sandbox", "--hide-scrollbars", "--disable-gpu", "--no-first-run",
                     f"--user-data-dir={self._profile.name}"]
        wanted = {"browserName": "chrome", "goog:chromeOptions": {"binary": shutil.which("chromium"), "args": arguments},
                  "goog:loggingPrefs": {"browser": "ALL", "performance": "ALL"}}
        session = self._call("POST", "/session", {"capabilities": {"alwaysMatch": wanted}})
        self._url += "/session/" + session["sessionId"]
        self._call("POST", "/timeouts", {"script": SCRIPT_TIMEOUT_MS})
        self._page = ""
        self._problems: list[str] = []

    def _address(self) -> str:
        assert self._driver.stdout
        for line in self._driver.stdout:
            if "successfully on port " in line:
                return "http://127.0.0.1:" + line.split("on port ")[1].strip(" .\n")
        raise RuntimeError("the driver ended")

    def _call(self, method: str, path: str, body: Any = None) -> Any:
        content = None if body is None else json.dumps(body).encode()
        request = urllib.request.Request(self._url + path, content, {"Content-Type": "application/json"}, method=method)
        try:
            with urllib.request.urlopen(request, timeout=SCRIPT_TIMEOUT_MS / 1000 + 20) as answer:
                return json.load(answer)["value"]
        except urllib.error.HTTPError as error:
            raise DriverError(error.read().decode()[:2000]) from error

    def _developer(self, command: str, **parameters: Any) -> Any:
        return self._call("POST", "/goog/cdp/execute", {"cmd": command, "params": parameters})

    def open(self, page: Path) -> None:
        self._page = page.absolute().as_uri()
        self._call("POST", "/url", {"url": self._page})

    def run(self, script: str, *arguments: Any) -> Any:
        return self._call("POST", "/execute/sync", {"script": script, "args": list(arguments)})

    def resize(self, width: int, height: int) -> None:
        self._developer("Emulation.setDeviceMetricsOverride", width=width, height=height, deviceScaleFactor=1, mobile=False)
        self.read_until("return innerWidth", lambda inner: inner == width)
        self.wait_for_drawing()

    def set_dark(self, dark: bool) -> None:
        value = "dark" if dark else "light"
        self._developer("Emulation.setEmulatedMedia", media="", features=[{"name": "prefers-color-scheme", "value": value}])
        self.read_until(IS_DARK, lambda found: found == dark)
        self.wait_for_drawing()

    def set_print(self, printed: bool) -> None:
        self._developer("Emulation.setEmulatedMedia", media="print" if printed else "")
        self.read_until(IS_PRINTED, lambda found: found == printed)
        self.wait_for_drawing()

    def _act(self, actions: list[dict[str, Any]]) -> None:
        self._call("POST", "/actions", {"actions": actions})
        self.wait_for_drawing()

    def press(self, keys: str) -> None:
        self._act(key_actions(keys))

    def drag(self, begin: tuple[int, int], end: tuple[int, int], keys: str = "") -> None:
        self._act(pointer_actions(begin, end, keys))

    def move(self, point: tuple[int, int]) -> None:
        self._act(pointer_actions(point, None, ""))

    def pinch(self, middle: tuple[int, int], begin: int, end: int) -> bool:
        self._act(pinch_actions(middle, begin, end))
        return True

    def click(self, selector: str) -> None:
        found = self._call("POST", "/element", {"using": "css selector", "value": selector})
        self._call("POST", f"/element/{found[ELEMENT]}/click", {})
        self.wait_for_drawing()

    def screenshot(self) -> bytes:
        return base64.b64decode(self._call("GET", "/screenshot"))

    def pdf(self) -> bytes:
        return base64.b64decode(self._call("POST", "/print", {}))

    def problems(self) -> list[str]:
        for entry in self._call("POST", "/se/log", {"type": "browser"}):
            if entry["level"] == "SEVERE":  # others are advice, such as about how these checks read canvases
                self._problems.append(entry["message"])
        for entry in self._call("POST", "/se/log", {"type": "performance"}):
            message = json.loads(entry["message"])["message"]
            if message["method"] == "Network.requestWillBeSent":
                parameters = message["params"]
                url = parameters["request"]["url"]
                # Chromium's own first page makes requests, too.
                if parameters["documentURL"].split("#")[0] == self._page and url.split("#")[0] != self._page:
                    self._problems.append("request: " + url)
        return self._problems

    def close(self) -> None:
        try:
            self._call("DELETE", "")
        finally:
            self._driver.terminate()
            self._driver.wait()
            self._profile.cleanup()
