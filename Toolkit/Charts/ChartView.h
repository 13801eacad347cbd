// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/ChartPanel.h"
#include "Toolkit/Charts/ChartTable.h"
#include "Toolkit/Charts/TimeRange.h"
#include "Toolkit/View.h"

#include <chrono>
#include <functional>

namespace velmora {

class ChartWidget;

/// Panels one above the other over one axis of time, with bands and events above them and a cursor that shows
/// all values of its moment. Samples are read from their rings when drawn, never copied.
///
/// The range follows "now" - the time that `setNow` gave - until the user moves it; N, End or `followNow`
/// returns to that. Dragging, the wheel with Shift or sideways, Page Up and Page Down pan; the wheel, a
/// pinch, + and - (around the cursor) zoom; a tap or click and Left and Right (with Shift ten samples at
/// once) set the cursor; Home goes to the oldest sample; Escape removes the cursor; T changes to the table
/// and back. 1, 5, 3 and A choose one minute, five, thirty or all. A stroke of a finger up or down scrolls
/// what the chart lies in.
///
/// Nothing is drawn while the view is hidden, and after `samplesChanged` and `setNow` only when something in
/// the range is different.
class ChartView : public View {
public:
    using PanelId = std::uint64_t;

    ChartView();
    ~ChartView() override;

    /// Below those added before. An id is never used again.
    PanelId addPanel(ChartPanel panel);
    /// Puts another in its place, as when a series is added; nothing for an id that is not there.
    void setPanel(PanelId id, ChartPanel panel);
    void removePanel(PanelId id);
    [[nodiscard]] std::size_t panelCount() const;

    /// In the order of time within each lane.
    void setBands(std::vector<ChartBand> bands);
    /// In the order of time.
    void setTicks(std::vector<ChartTick> ticks);

    /// What "now" is: the clock's time while messages arrive, a recording's position else.
    void setNow(std::int64_t now_ns);
    /// To be called after appending to rings; once for any number of samples.
    void samplesChanged();

    /// How much the range covers while it follows; without a value all that there is.
    void setSpan(std::optional<std::chrono::nanoseconds> span);
    [[nodiscard]] std::optional<std::chrono::nanoseconds> span() const;
    [[nodiscard]] TimeRange range() const;
    /// Stops following.
    void setRange(const TimeRange& range);
    [[nodiscard]] bool isFollowing() const;
    void followNow();

    /// Brings it into view. Does not call the callback.
    void setCursor(std::optional<std::int64_t> time_ns);
    [[nodiscard]] std::optional<std::int64_t> cursor() const;

    /// The user has moved or removed the cursor.
    void setOnCursorMoved(std::function<void(std::optional<std::int64_t> time_ns)> moved);
    /// The range has another span or has begun or ceased to follow, by the user or the program; not called
    /// for each step of following.
    void setOnRangeChanged(std::function<void()> changed);

    /// All series' values at the cursor, or at the end of the range without one.
    [[nodiscard]] std::vector<ChartReading> readings() const;
    /// A sentence for each panel: "Level, Serving, −97 dBm now, minimum −112, maximum −81 over 5 minutes, 2
    /// gaps".
    [[nodiscard]] std::string summary() const;

    /// At most that many rows (at least 1): all times with a sample in the range or, of more, evenly spread
    /// ones.
    [[nodiscard]] ChartTable table(std::size_t rowLimit = 500) const;
    /// Shows the table instead of the panels.
    void setShowsTable(bool shows);
    [[nodiscard]] bool showsTable() const;

    /// The height in which all panels are readable, at the width that it has.
    void sizeToFit() override;

private:
    ChartWidget* _chart;
};

} // namespace velmora
