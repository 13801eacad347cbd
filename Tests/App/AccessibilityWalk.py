# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Uses the application as a screen reader does: from another process, through the accessibility tree.

The real service and the real application run as processes. The walk opens every row of the first pane and what opens in
the panes below, and looks at roles, names, states and positions there; it goes to the drive view and back, saves a
snapshot, sees the service die and come back, then with another technology, starts the application anew, and ends it.
Once more it looks at the screen in a language that is written from right to left.
"""

import os
import plistlib
import signal
import sys

sys.dont_write_bytecode = True

from ScreenReader import LIMIT_S, Atspi, ScreenReader  # noqa: E402


class Walk(ScreenReader):
    def run(self):
        self.start_service()
        self.start_application()

        self.see("label", "Updated ")
        self.wait("the indicator still while connected", lambda: self.find("animation") is None)
        self.wait("the window's name", lambda: self.find("frame").get_name() == "Velmora")
        self.see("tool bar", "Status")
        opened = self.walk_panes()
        assert opened >= 5, f"only {opened} panes seen"

        # Two panes down, and back.
        self.press("list item", "Registration")
        self.see("heading", "Registration")
        self.press("list item", "Serving PLMN")
        self.see("heading", "Serving PLMN")
        # One record has it with zeros, another without.
        heard = ("Mobile Country Code, 001", "Mobile Country Code, 1")
        self.wait("the row's value", lambda: self.find("list item", "Mobile Country Code").get_name() in heard)
        self.press("push button", "Back")
        self.see("heading", "Registration")
        self.press("push button", "Back")
        self.see("heading", "Velmora")

        self.walk_drive()

        # A snapshot.
        self.press("push button", "Save")
        self.see("list item", "DLF binary (")
        self.settled(self.check_save_screen)
        self.press("push button", "Save")
        self.wait("a snapshot", lambda: os.listdir(self.snapshots))
        self.see("alert", "Saved VelmoraSnapshot-")
        self.wait("the save screen closed", lambda: self.find("list item", "DLF binary (") is None)
        with open(os.path.join(self.snapshots, os.listdir(self.snapshots)[0]), "rb") as file:
            snapshot = plistlib.load(file)
        assert list(snapshot) == ["Timestamp", "Data", "Description"], list(snapshot)
        assert snapshot["Data"][-1]["DLF"][:4] == bytes.fromhex("A100FD1F"), "no DLF log in it"

        # The service dies and comes back.
        self.service.send_signal(signal.SIGKILL)
        self.service.wait()
        self.see("label", "Connecting...")
        self.see("animation")
        self.start_service()
        self.see("label", "Updated ")
        self.wait("the indicator hidden", lambda: self.find("animation") is None)
        self.wait("no other notice", lambda: self.find("alert").get_name().startswith("Saved "))

        self.start_anew()

        self.application.terminate()
        assert self.application.wait(LIMIT_S) == 0, "the application did not end well"
        self.application = None
        self.check_mirrored()
        left = [name for name in os.listdir(self.ports) if "BasebandStateReport" in name]
        assert not left, f"left behind: {left}"

    def check_rows(self, name):
        """Every row of the list has a role, a name, its place in the order and on the screen. Returns those that open. To be
        called by `settled`."""
        rows = self.rows(name)
        assert rows, f"no rows in {name!r}"
        top = None
        opening = []
        for index, row in enumerate(rows):
            if row.get_role_name() == "label":
                assert row.get_name() == "Nothing has been reported.", row.get_name()
                continue
            assert row.get_role_name() == "list item", row.get_role_name()
            assert row.get_name(), f"row {index} of {name!r} has no name"
            assert row.get_index_in_parent() == index, f"row {index} of {name!r} is said to be {row.get_index_in_parent()}"
            place = row.get_extents(Atspi.CoordType.SCREEN)
            assert place.width > 100 and place.height >= 44, f"{row.get_name()!r} is {place.width} x {place.height}"
            assert top is None or place.y == top + place.height, f"{row.get_name()!r} is not below the row before it"
            top = place.y
            states = row.get_state_set()
            assert states.contains(Atspi.StateType.SELECTABLE), row.get_name()
            if states.contains(Atspi.StateType.EXPANDABLE):
                assert row.get_description() == "Opens a list", row.get_description()
                opening.append(row.get_name())
        return opening

    def open_row(self, name, row):
        """Presses a row of the list, which may be below the edge of the screen. False where the drive has moved on and the list
        does not have it any more. To be called by `settled`."""
        found = [item for item in self.rows(name) if item.get_name() == row]
        assert not found or found[0].do_action(0), f"{row!r} cannot be pressed"
        return bool(found)

    def walk_panes(self, name="Velmora", depth=0):
        """Opens whatever opens, and goes back each time; of the panes below the first ones, the first row that does. Returns
        how many panes were seen."""
        seen = 1
        opening = self.settled(lambda: self.check_rows(name))
        for row in opening if depth == 0 else opening[:1]:
            if not self.settled(lambda row=row: self.open_row(name, row)):
                continue
            self.see_pane(row)
            seen += self.walk_panes(row, depth + 1)
            self.press("push button", "Back")
            self.see_pane(name)
        return seen

    def check_save_screen(self):
        """The dialog: its name, the field that has the keyboard, the button that Enter presses, and rows that are checked. To be
        called by `settled`."""
        dialog = self.see("dialog", "Save Snapshot")
        assert dialog.get_state_set().contains(Atspi.StateType.MODAL), "the dialog is not modal"
        self.see("heading", "Save Snapshot")
        field = self.see("text", "Description")
        assert field.get_state_set().contains(Atspi.StateType.FOCUSED), "the description has not the focus"
        assert self.see("push button", "Save").get_state_set().contains(Atspi.StateType.IS_DEFAULT), "Save is not the default"
        rows = self.rows("What is saved")
        assert rows
        for row in rows:
            # That they can be checked is a state that Qt 6.4 does not pass on.
            assert row.get_state_set().contains(Atspi.StateType.CHECKED), f"{row.get_name()!r} has no check mark"
        self.check_rows("What is saved")

    def check_mirrored(self):
        """In Arabic the way back is at the right of the title, and the status at the right of Save."""
        self.environment["LC_ALL"] = "ar_EG.UTF-8"
        self.start_application()
        self.see("label", "Updated ")
        pane = self.settled(lambda: self.check_rows("Velmora"))[0]
        self.press("list item", pane)
        self.see("heading", pane)
        self.settled(lambda: self.check_mirrored_pane(pane))
        self.application.terminate()
        assert self.application.wait(LIMIT_S) == 0, "the application did not end well"
        self.application = None

    def check_mirrored_pane(self, pane):
        """To be called by `settled`: bars and titles move while a pane comes up."""
        left = {
            role: self.see(role, name).get_extents(Atspi.CoordType.SCREEN).x
            for role, name in (("push button", "Back"), ("heading", pane), ("label", "Updated "))
        }
        save = self.see("push button", "Save").get_extents(Atspi.CoordType.SCREEN).x
        assert left["push button"] > left["heading"], left
        assert left["label"] > save, (left, save)

    def walk_drive(self):
        """The drive view: what is heard of the serving cell, the tables, the charts, and the way back."""
        self.press("push button", "Drive")
        self.see("heading", "Drive")
        self.settled(self.check_level)
        self.see("label", "PLMN, 001-01")
        self.see("label", "Latest event, ")
        self.settled(self.check_neighbours)
        events = self.wait("the events", lambda: self.find_any("table", "Events"))
        self.wait("events", lambda: events.get_table_iface().get_n_rows() > 0)
        # A severity that is not listed is a button that is not checked.
        info = self.wait("the filter", lambda: self.find_any("", "Info"))
        assert info.get_state_set().contains(Atspi.StateType.CHECKED), "the filter is on, unheard"
        info.do_action(0)
        self.wait("the filter off", lambda: not info.get_state_set().contains(Atspi.StateType.CHECKED))
        info.do_action(0)
        self.wait("the filter on", lambda: info.get_state_set().contains(Atspi.StateType.CHECKED))
        self.wait("the charts", lambda: self.find_any("", "Over time"))
        self.press("push button", "Back to Velmora")
        self.see("heading", "Velmora")
        self.wait("the drive view closed", lambda: self.find("table", "Neighbours") is None)

    def check_level(self):
        """To be called by `settled`."""
        level = self.see("label", "Level, dBm, \u2212").get_name()
        assert " s ago" in level, f"the level's age is not heard: {level!r}"
        assert any(word in level for word in ("poor", "fair", "good", "excellent")), level

    def check_neighbours(self):
        """To be called by `settled`: neighbours come and go."""
        table = self.see("table", "Neighbours").get_table_iface()
        assert table.get_n_rows() > 0, "no rows of neighbours"
        heads = [table.get_column_description(i) for i in range(table.get_n_columns())]
        assert heads[2:] == ["Level, dBm", "Quality, dB", "\u0394 dB"], heads
        spoken = table.get_accessible_at(0, 2).get_name()
        assert spoken.startswith("\u2212") and " dBm" in spoken, f"a level is heard as {spoken!r}"

    def start_anew(self):
        """Another technology: the notice, the save screen that comes first, and the same process again."""
        self.service.terminate()
        self.service.wait()
        self.see_notice("No telephony service answers.")
        self.start_service("lte")
        self.see_notice("Now receiving Ostrel LTE. The panes show Ostrel GSM.")
        self.see("list item", "Registration")
        saved = len(os.listdir(self.snapshots))
        self.press("push button", "Start Anew")
        self.see("list item", "DLF binary (")
        self.press("push button", "Save")
        self.see("list item", "Idle Mode Neighbors")
        self.see("label", "Updated ")
        self.wait("no notice, whose cause is gone", lambda: self.find("alert") is None)
        assert len(os.listdir(self.snapshots)) == saved + 1, "no snapshot from before"
        arguments = open(f"/proc/{self.application.pid}/cmdline", "rb").read().split(b"\0")[1:-1]
        assert arguments == [b"--log", b"stderr", b"--log-level", b"3"], arguments


if __name__ == "__main__":
    walk = Walk(sys.argv[1], sys.argv[2])
    try:
        walk.run()
    finally:
        walk.end()
