# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Firefox by Marionette, its own remote protocol: Debian 12 has no driver for it."""

import base64
import json
import shutil
import socket
import subprocess
import tempfile
import time
from pathlib import Path
from typing import Any

from .browser import IS_DARK, IS_PRINTED, SCRIPT_TIMEOUT_MS, Browser, DriverError, key_actions, pointer_actions

# It must not look for updates and the like: these would be requests of its own.
PREFERENCES = {
    "marionette.port": 0,
    "browser.shell.checkDefaultBrowser": False,
    "datareporting.policy.dataSubmissionEnabled": False,
    "app.update.enabled": False,
    "browser.startup.homepage_override.mstone": "ignore",
    "layout.css.prefers-color-scheme.content-override": 1,
}
DARK, LIGHT = 0, 1
PAGE_ERRORS = """
const page = arguments[0];
return Services.console.getMessageArray()
    .filter((each) => each instanceof Ci.nsIScriptError && each.sourceName.startsWith(page))
    .map((each) => each.errorMessage);
"""


MEDIUM = """
Services.wm.getMostRecentWindow("navigator:browser").gBrowser.selectedBrowser.browsingContext.mediumOverride = arguments[0];
"""
PAGE_SIZE = """
const { style } = Services.wm.getMostRecentWindow("navigator:browser").gBrowser.selectedBrowser;
for (const [name, size] of [["width", arguments[0]], ["height", arguments[1]]])
    for (const limit of [name, "min-" + name, "max-" + name]) style.setProperty(limit, size + "px");
"""


class Firefox(Browser):
    name = "firefox"

    def __init__(self) -> None:
        self._profile = tempfile.TemporaryDirectory()
        lines = [f"user_pref({json.dumps(name)}, {json.dumps(value)});" for name, value in PREFERENCES.items()]
        Path(self._profile.name, "user.js").write_text("\n".join(lines) + "\n")
        self._program = subprocess.Popen([str(shutil.which("firefox-esr")), "--headless", "--marionette", "--no-remote",
                                          "--remote-allow-system-access", "--profile", self._profile.name], stdout=subprocess.DEVNULL,
                                         stderr=subprocess.DEVNULL)
        self._socket = self._connect()
        self._stream = self._socket.makefile("rb")
        self._received()  # the greeting
        self._number = 0
        self._page = ""
        self._call("WebDriver:NewSession", {"acceptInsecureCerts": False})
        self._call("WebDriver:SetTimeouts", {"script": SCRIPT_TIMEOUT_MS})

    def _connect(self) -> socket.socket:
        port = Path(self._profile.name, "MarionetteActivePort")
        until = time.monotonic() + 90
        while time.monotonic() < until:
            if port.exists() and port.read_text().strip():
                try:
                    return socket.create_connection(("127.0.0.1", int(port.read_text())), timeout=SCRIPT_TIMEOUT_MS / 1000 + 20)
                except OSError:
                    pass
            time.sleep(0.1)
        raise RuntimeError("firefox does not answer")

    def _received(self) -> Any:
        digits = b""
        while (character := self._stream.read(1)) != b":":
            if not character:
                raise RuntimeError("firefox ended")
            digits += character
        return json.loads(self._stream.read(int(digits)))

    def _call(self, command: str, parameters: Any = None) -> Any:
        self._number += 1
        content = json.dumps([0, self._number, command, parameters or {}]).encode()
        self._socket.sendall(str(len(content)).encode() + b":" + content)
        _, _, error, result = self._received()
        if error:
            raise DriverError(json.dumps(error)[:2000])
        return result["value"] if isinstance(result, dict) and "value" in result else result

    def _in_chrome(self, script: str, *arguments: Any) -> Any:
        self._call("Marionette:SetContext", {"value": "chrome"})
        try:
            return self._call("WebDriver:ExecuteScript", {"script": script, "args": list(arguments), "newSandbox": True})
        finally:
            self._call("Marionette:SetContext", {"value": "content"})

    def open(self, page: Path) -> None:
        self._page = page.absolute().as_uri()
        self._call("WebDriver:Navigate", {"url": self._page})

    def run(self, script: str, *arguments: Any) -> Any:
        return self._call("WebDriver:ExecuteScript", {"script": script, "args": list(arguments), "sandbox": None})

    def resize(self, width: int, height: int) -> None:
        # The page alone: a window is no narrower than its toolbar.
        self._call("WebDriver:SetWindowRect", {"width": 1400, "height": height + 200})
        self._in_chrome(PAGE_SIZE, width, height)
        self.read_until("return innerWidth", lambda inner: inner == width)
        self.wait_for_drawing()

    def set_dark(self, dark: bool) -> None:
        self._in_chrome("Services.prefs.setIntPref(arguments[0], arguments[1])",
                        "layout.css.prefers-color-scheme.content-override", DARK if dark else LIGHT)
        self.read_until(IS_DARK, lambda found: found == dark)
        self.wait_for_drawing()

    def set_print(self, printed: bool) -> None:
        self._in_chrome(MEDIUM, "print" if printed else "")
        self.read_until(IS_PRINTED, lambda found: found == printed)
        self.wait_for_drawing()

    def _act(self, actions: list[dict[str, Any]]) -> None:
        self._call("WebDriver:PerformActions", {"actions": actions})
        self.wait_for_drawing()

    def press(self, keys: str) -> None:
        self._act(key_actions(keys))

    def drag(self, begin: tuple[int, int], end: tuple[int, int], keys: str = "") -> None:
        self._act(pointer_actions(begin, end, keys))

    def move(self, point: tuple[int, int]) -> None:
        self._act(pointer_actions(point, None, ""))

    def click(self, selector: str) -> None:
        found = self._call("WebDriver:FindElement", {"using": "css selector", "value": selector})
        self._call("WebDriver:ElementClick", {"id": next(iter(found.values()))})
        self.wait_for_drawing()

    def screenshot(self) -> bytes:
        return base64.b64decode(self._call("WebDriver:TakeScreenshot", {"full": False}))

    def pdf(self) -> bytes:
        return base64.b64decode(self._call("WebDriver:Print", {}))

    def problems(self) -> list[str]:
        errors = self._in_chrome(PAGE_ERRORS, self._page)
        requests = self.run("return performance.getEntriesByType('resource').map((each) => each.name)")
        return [*errors, *("request: " + url for url in requests)]

    def close(self) -> None:
        try:
            self._call("Marionette:Quit", {"flags": ["eForceQuit"]})
        except (RuntimeError, OSError):
            self._program.terminate()
        self._program.wait()
        self._stream.close()
        self._socket.close()
        self._profile.cleanup()
