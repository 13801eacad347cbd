// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/Charts/ChartTest.h"

#include <QApplication>

#include <cmath>
#include <ctime>

namespace velmora {

ChartTest::ChartTest() : _zone(qgetenv("TZ").toStdString()) {
    qputenv("TZ", "UTC");
    ::tzset();
    chart.setAccessibleName("Over time");
    panel = chart.addPanel(panelOf("Level", level));
    chart.setSpan(std::chrono::minutes(1));
    chart.setNow(noon_ns);
    chart.setFrame({0, 0, 400, 300});
    chart.widget()->show();
    runUntilIdle();
}

ChartTest::~ChartTest() {
    if (_zone.empty())
        qunsetenv("TZ");
    else
        qputenv("TZ", _zone.c_str());
    ::tzset();
}

ChartPanel ChartTest::panelOf(const std::string& title, std::shared_ptr<const SampleRing> ring) {
    ChartPanel panel;
    panel.title = title;
    panel.unit = "dBm";
    ChartSeries series;
    series.name = "Serving";
    series.samples = std::move(ring);
    panel.series.push_back(series);
    return panel;
}

void ChartTest::addMinute() const {
    for (int second = 0; second <= 60; ++second)
        ASSERT_TRUE(level->append(noon_ns + (second - 60) * second_ns, second));
}

QImage ChartTest::picture() const {
    runUntilIdle();
    return chart.widget()->grab().toImage();
}

int ChartTest::inkAt(const QImage& image, double x) const {
    const QRectF plot = layout().panels().front().plot;
    const double ratio = image.devicePixelRatio();
    int count = 0;
    for (int y = static_cast<int>(plot.top() * ratio); y < static_cast<int>(plot.bottom() * ratio); ++y) {
        const QColor color = image.pixelColor(static_cast<int>(std::floor(x * ratio)), y);
        count += color.blue() - color.red() > 60 ? 1 : 0; // the rest is grey
    }
    return count;
}

ChartLayout ChartTest::layout() const {
    return {widget().model, widget().size(), widget().font(), widget().isRightToLeft()};
}

} // namespace velmora
