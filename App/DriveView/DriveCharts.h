// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/DriveView/DriveSource.h"
#include "Toolkit/Button.h"
#include "Toolkit/Charts/ChartView.h"

#include <chrono>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// The drive over time: level and quality of the serving cell and the best neighbours, pinned rows, events,
/// bands of radio technology and state; with buttons for the span of time.
class DriveCharts final : public View {
public:
    /// It must outlive this, until another takes its place.
    explicit DriveCharts(DriveSource& source);
    ~DriveCharts() override;

    /// Shows another drive: the whole of a recording, the last minutes of what is received.
    void setSource(DriveSource& source);
    /// Takes over what is new.
    void update();
    /// Brings the moment of a recording into view.
    void updateMoment();
    /// Brings the moment into view and shows the values that counted then.
    void showMoment(Time time);
    [[nodiscard]] ChartView& chart() { return _chart; }
    /// In which everything is readable.
    [[nodiscard]] double wantedHeight(double width);
    void layoutSubviews() override;

private:
    /// What a panel is made of, so that it is made anew only when that changes.
    struct Panel {
        std::string key;
        ChartView::PanelId id;
    };

    void updatePanels();
    void updatePanel(std::size_t index, ChartPanel panel);
    [[nodiscard]] ChartPanel rolePanel(const char* title, const char* unit, Role role,
                                       std::size_t first) const;
    [[nodiscard]] ChartPanel pinnedPanel(const DriveSeries& series, std::size_t number) const;
    void updateTicks();
    void chooseSpan(std::optional<std::chrono::nanoseconds> span);
    void chooseNow();
    void markSpan();

    DriveSource* _source;
    ChartView _chart;
    std::vector<std::unique_ptr<Button>> _buttons;
    std::vector<Panel> _panels;
    std::uint64_t _eventsRevision = 0;
    std::uint64_t _bandsRevision = 0;
    std::uint64_t _messages = 0;
};

} // namespace velmora
