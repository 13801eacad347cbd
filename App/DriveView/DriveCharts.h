// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Drive/DriveModel.h"
#include "App/DriveView/DriveHistory.h"
#include "Toolkit/Button.h"
#include "Toolkit/Charts/ChartView.h"

#include <array>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// The drive over time: level and quality of the serving cell and the best neighbours, pinned rows, events,
/// bands of radio technology and state; with buttons for the span of time.
class DriveCharts final : public View {
public:
    /// Both must outlive it.
    DriveCharts(const DriveModel& model, const DriveHistory& history);
    ~DriveCharts() override;

    /// Takes over what is new, up to that time.
    void update(Time now);
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
    void markSpan();

    const DriveModel& _model;
    const DriveHistory& _history;
    ChartView _chart;
    std::vector<std::unique_ptr<Button>> _buttons;
    std::vector<Panel> _panels;
    std::uint64_t _eventsRevision = 0;
    std::uint64_t _bandsRevision = 0;
    std::uint64_t _messages = 0;
};

} // namespace velmora
