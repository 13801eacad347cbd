// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Charts/ChartView.h"
#include "Toolkit/Charts/SampleStore.h"
#include "Toolkit/Widgets/Charts/ChartLayout.h"
#include "Toolkit/Widgets/Charts/ChartTheme.h"
#include "Toolkit/Widgets/Charts/ChartWidget.h"

#include <QImage>

#include <cstdint>
#include <memory>
#include <string>

namespace velmora {

constexpr std::int64_t second_ns = 1'000'000'000;
/// A round time: 2026-11-22 12:00:00 UTC.
constexpr std::int64_t noon_ns = 1'795'348'800 * second_ns;

/// A shown chart of 400 x 300 points with one panel, "Level", whose one series counts for 5 s. The clock is
/// on UTC.
class ChartTest : public ::testing::Test {
protected:
    ChartTest();
    ~ChartTest() override;

    [[nodiscard]] ChartWidget& widget() const { return *static_cast<ChartWidget*>(chart.widget()); }
    [[nodiscard]] static ChartPanel panelOf(const std::string& title, std::shared_ptr<const SampleRing> ring);
    /// Values of 0, 1, 2, ... a second apart, the last at the end of the range, of one minute.
    void addMinute() const;
    [[nodiscard]] QImage picture() const;
    /// How many pixels of a column of the first plot are blue, as the first line is.
    [[nodiscard]] int inkAt(const QImage& image, double x) const;
    [[nodiscard]] double xAt(std::int64_t time_ns) const { return widget().scale().xAt(time_ns); }
    [[nodiscard]] ChartLayout layout() const;

    SampleStore store;
    std::shared_ptr<SampleRing> level = store.makeSeries(5 * second_ns);
    ChartView chart;
    ChartView::PanelId panel = 0;

private:
    std::string _zone;
};

} // namespace velmora
