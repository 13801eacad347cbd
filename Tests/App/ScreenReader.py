# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What a screen reader does with programs of this project: it sees and presses what their accessibility trees show."""

import os
import subprocess
import time

import gi

gi.require_version("Atspi", "2.0")
from gi.repository import Atspi, GLib  # noqa: E402

LIMIT_S = 40  # no step that works comes near it
# The library waits less than a second for an answer by itself. A busy application takes longer, and a press whose answer
# is late would be repeated.
Atspi.set_timeout(10_000, 10_000)
# What an object that has just gone leads to: its own calls fail, and others return None in its place.
GONE = (GLib.Error, AttributeError)


class ScreenReader:
    """The service and the application as processes, in directories of their own, and what is shown on the display."""

    def __init__(self, build, directory):
        self.build = build
        self.ports = os.path.join(directory, "ports")
        self.snapshots = os.path.join(directory, "snapshots")
        root = os.path.join(directory, "root")
        os.makedirs(os.path.join(root, "QuorraInternal/Library/PreferenceBundles/Carrier Settings.bundle"))
        os.makedirs(self.ports, mode=0o700)
        os.makedirs(self.snapshots)
        source = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
        self.environment = dict(
            os.environ,
            QT_QPA_PLATFORM="xcb",
            QT_LINUX_ACCESSIBILITY_ALWAYS_ON="1",
            VELMORA_PORT_DIR=self.ports,
            VELMORA_SYSROOT=root,
            VELMORA_LOG_DIRECTORY=self.snapshots,
            VELMORA_RESOURCES=os.path.join(source, "Resources"),
            XDG_CONFIG_HOME=os.path.join(directory, "config"),
        )
        self.service = None
        self.application = None

    def start(self, program, *arguments):
        return subprocess.Popen([os.path.join(self.build, program), *arguments], env=self.environment)

    def start_service(self, scenario="gsm"):
        self.service = self.start("velmora-telephonyd", "--source", f"scenario:{scenario},seed=1,speed=5")

    def start_application(self):
        self.application = self.start("velmora", "--log", "stderr", "--log-level", "3")

    def end(self):
        for process in (self.application, self.service):
            if process and process.poll() is None:
                process.kill()
                process.wait()

    def wait(self, what, condition):
        """What the condition gives once it gives something."""
        end = time.monotonic() + LIMIT_S
        while time.monotonic() < end:
            GLib.MainContext.default().iteration(False)
            try:
                found = condition()
            except GONE:
                found = None
            if found:
                return found
            time.sleep(0.05)
        raise AssertionError("never seen: " + what + "\n" + self.picture())

    def settled(self, look):
        """What a look at the screen returns once all that it asserts holds: lists are loaded again while it looks."""
        end = time.monotonic() + LIMIT_S
        while True:
            GLib.MainContext.default().iteration(False)
            try:
                return look()
            except (AssertionError, *GONE) as error:
                if time.monotonic() >= end:
                    raise AssertionError(f"{error}\n{self.picture()}") from error
            time.sleep(0.05)

    def objects(self):
        """Every object that is shown, with its role and name, top down."""
        desktop = Atspi.get_desktop(0)
        desktop.clear_cache()
        waiting = [desktop.get_child_at_index(i) for i in range(desktop.get_child_count())]
        while waiting:
            item = waiting.pop(0)
            if item is None:
                continue
            if item.get_state_set().contains(Atspi.StateType.SHOWING):
                yield item, item.get_role_name(), item.get_name()
            waiting[:0] = [item.get_child_at_index(i) for i in range(item.get_child_count())]

    def picture(self):
        try:
            return "\n".join(f"{role}: {name!r}" for _, role, name in self.objects())
        except GONE as error:
            return f"(no picture of the screen: {error})"

    def find(self, role, start=""):
        """The last object shown of the role whose name begins so: what is on top comes last."""
        found = [item for item, its, name in self.objects() if its == role and name.startswith(start)]
        return found[-1] if found else None

    def find_any(self, role, start):
        """As find, but of all objects, shown or further down the page; any role for an empty one."""
        waiting = [Atspi.get_desktop(0)]
        found = None
        while waiting:
            item = waiting.pop(0)
            if item is None:
                continue
            if (not role or item.get_role_name() == role) and item.get_name().startswith(start):
                found = item
            if item.get_role_name() != "table":  # cells
                waiting[:0] = [item.get_child_at_index(i) for i in range(item.get_child_count())]
        return found

    def see(self, role, start=""):
        return self.wait(f"{role} {start!r}", lambda: self.find(role, start))

    def see_pane(self, name):
        """Waits for the pane of that very name: the names of others may begin so."""
        self.wait(f"the pane {name!r}", lambda: any((its, shown) == ("heading", name) for _, its, shown in self.objects()))

    def see_notice(self, sentence):
        """Waits for a notice that says so, among other things."""
        self.wait(f"the notice {sentence!r}", lambda: any(role == "alert" and sentence in text for _, role, text in self.objects()))

    def rows(self, name):
        """The rows of the list on top, which has that name, as a screen reader asks for them."""
        rows = self.see("list", name)
        return [rows.get_child_at_index(i) for i in range(rows.get_child_count())]

    def press(self, role, name):
        self.wait(f"{role} {name!r} pressed", lambda: self.find(role, name).do_action(0))
