// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// A window with a chart, for ChartWalk.py.

#include "Toolkit/Application.h"
#include "Toolkit/Charts/ChartView.h"
#include "Toolkit/Charts/SampleStore.h"

#include <QApplication>
#include <QWidget>

#include <chrono>

int main(int argc, char** argv) {
    using namespace velmora;
    constexpr std::int64_t second_ns = 1'000'000'000;
    constexpr std::int64_t noon_ns = 1'795'348'800 * second_ns; // 2026-11-22 12:00:00 UTC
    const Application application(argc, argv);
    SampleStore store;
    const auto level = store.makeSeries(5 * second_ns);
    for (int second = 0; second <= 60; ++second)
        if (!level->append(noon_ns + (second - 60) * second_ns, -100 + second / 4.0))
            return 1;
    ChartPanel panel;
    panel.title = "Level";
    panel.unit = "dBm";
    panel.decimals = 2;
    panel.series.push_back({"Serving", level, ChartColor::first, ChartLine::solid, false});
    ChartView chart;
    chart.addPanel(panel);
    chart.setAccessibleName("Over time");
    chart.setSpan(std::chrono::minutes(1));
    chart.setNow(noon_ns);
    chart.setFrame({0, 0, 400, 300});
    chart.widget()->show();
    return QApplication::exec();
}
