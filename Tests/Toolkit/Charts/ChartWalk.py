# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Uses a chart as a screen reader does: from another process, through the accessibility tree.

The program's series has a value a second from 11:59:00 to 12:00:00 UTC, -100 dBm and a quarter more each time.
"""

import os
import sys

sys.dont_write_bytecode = True
sys.path.insert(0, os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..", "App"))

from ScreenReader import Atspi, ScreenReader  # noqa: E402


class ChartWalk(ScreenReader):
    def __init__(self, build, directory):
        super().__init__(build, directory)
        self.environment["TZ"] = "UTC"
        self.names = []

    def act(self, item, name):
        names = [item.get_action_name(index) for index in range(item.get_n_actions())]
        assert item.do_action(names.index(name)), name

    def heard(self, name):
        self.wait(f"an announcement of {name!r}", lambda: name in self.names)

    def check_size(self, chart):
        place = chart.get_extents(Atspi.CoordType.WINDOW)
        assert (place.width, place.height) == (400, 300), (place.width, place.height)

    def check_table(self):
        table = self.see("table", "Values, Over time")
        assert (table.get_n_rows(), table.get_n_columns()) == (61, 2)
        assert table.get_column_description(1) == "Level, Serving (dBm)"
        cells = [table.get_accessible_at(row, column).get_name() for row in (0, 60) for column in (0, 1)]
        assert cells == ["11:59:00", "\u2212100.00", "12:00:00", "\u221285.00"], cells

    def run(self):
        self.application = self.start("tests/chart-window")
        listener = Atspi.EventListener.new(lambda event: self.names.append(event.source.get_name()))
        listener.register("object:property-change:accessible-name")
        chart = self.see("chart", "Over time")
        assert chart.get_description() == (
            "Level, Serving, \u221285.00 dBm now, minimum \u2212100.00, maximum \u221285.00 over 1 minute"
        ), chart.get_description()
        self.settled(lambda: self.check_size(chart))

        self.act(chart, "Decrease")
        self.heard("Over time, 12:00:00, Level, Serving \u221285.00 dBm")
        self.act(chart, "Decrease")
        self.heard("Over time, 11:59:59, Level, Serving \u221285.25 dBm")
        self.act(chart, "Increase")
        self.see("chart", "Over time, 12:00:00")

        self.act(chart, "Toggle")
        self.settled(self.check_table)
        self.act(chart, "Toggle")
        self.wait("the chart without its table", lambda: self.find("table") is None)


if __name__ == "__main__":
    walk = ChartWalk(sys.argv[1], sys.argv[2])
    try:
        walk.run()
    finally:
        walk.end()
