// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/ChartPanel.h"
#include "Toolkit/Charts/ChartTable.h"
#include "Toolkit/Charts/TimeWindow.h"

#include <map>

namespace velmora {

/// What a chart shows and where its range and cursor are; draws nothing.
class ChartModel {
public:
    using PanelId = std::uint64_t;
    struct Entry {
        PanelId id;
        ChartPanel panel;
    };

    PanelId addPanel(ChartPanel panel);
    /// False for an id that is not there.
    bool setPanel(PanelId id, ChartPanel panel);
    bool removePanel(PanelId id);
    [[nodiscard]] const std::vector<Entry>& panels() const { return _panels; }

    std::vector<ChartBand> bands;
    std::vector<ChartTick> ticks;
    TimeWindow window;
    std::optional<std::int64_t> cursor_ns;

    /// The oldest entry of all series.
    [[nodiscard]] std::optional<std::int64_t> oldest_ns() const;
    [[nodiscard]] TimeRange range() const { return window.range(oldest_ns()); }
    /// The cursor or, without one, the end of the range.
    [[nodiscard]] std::int64_t readingTime_ns() const { return cursor_ns.value_or(range().end_ns); }
    [[nodiscard]] std::vector<ChartReading> readings(std::int64_t time_ns) const;
    /// As `ChartView::summary`.
    [[nodiscard]] std::string summary() const;
    /// "12:04:31, Level, Serving −97 dBm, Best neighbour no value".
    [[nodiscard]] std::string spokenReadings(std::int64_t time_ns) const;
    /// As `ChartView::table`.
    [[nodiscard]] ChartTable table(std::size_t rowLimit) const;

    /// The time of the sample that many samples after `from_ns`, or before for a negative number, of all
    /// series; the last one there is when there are fewer, and none when there is none.
    [[nodiscard]] std::optional<std::int64_t> stepped(std::int64_t from_ns, int samples) const;
    /// The time of the sample nearest to the time, if it is no further away than that.
    [[nodiscard]] std::optional<std::int64_t> nearest(std::int64_t time_ns, std::int64_t within_ns) const;

    /// Whether rings have changed in or across that range since the last call.
    [[nodiscard]] bool takeChanges(const TimeRange& range);

private:
    /// What was seen of a ring.
    struct Seen {
        std::uint64_t revision = 0;
        std::optional<std::int64_t> oldest_ns;
        std::optional<std::int64_t> newest_ns;
    };

    std::vector<Entry> _panels;
    std::map<const SampleRing*, Seen> _seen;
    PanelId _lastId = 0;
};

} // namespace velmora
