// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// What is drawn of a chart, read back from pictures of it, and when.

#include "Tests/Toolkit/Charts/ChartTest.h"
#include "Toolkit/Widgets/Contrast.h"

#include <QApplication>
#include <QPalette>
#include <QStyle>

#include <cmath>

namespace velmora {
namespace {

class ChartDrawingTest : public ChartTest {
protected:
    ~ChartDrawingTest() override {
        QApplication::setPalette(QApplication::style()->standardPalette());
        QApplication::setLayoutDirection(Qt::LeftToRight);
    }
    /// In points.
    [[nodiscard]] static QColor colorAt(const QImage& image, double x, double y) {
        const double ratio = image.devicePixelRatio();
        return image.pixelColor(static_cast<int>(x * ratio), static_cast<int>(y * ratio));
    }
    /// The middle of the point that a time lies in.
    [[nodiscard]] double middleOf(std::int64_t time_ns) const { return std::floor(xAt(time_ns)) + 0.5; }
};

TEST_F(ChartDrawingTest, TheExtremeOfOneSampleAmongAMillionIsDrawnInItsColumn) {
    constexpr std::int64_t count = 1'000'000;
    constexpr std::int64_t step_ns = 60 * second_ns / count;
    const std::int64_t spike = 612'345;
    for (std::int64_t number = 0; number < count; ++number)
        ASSERT_TRUE(level->append(noon_ns - 60 * second_ns + number * step_ns, number == spike ? -40 : -110));
    chart.samplesChanged();
    const QImage image = picture();
    const double x = xAt(noon_ns - 60 * second_ns + spike * step_ns);
    const double height = layout().panels().front().plot.height();
    EXPECT_GT(inkAt(image, x), height * 0.6 * image.devicePixelRatio());
    // Its neighbour joins it to the line, and no other column has more than the level line.
    EXPECT_LE(inkAt(image, x - 1), 6);
    EXPECT_LE(inkAt(image, x + 2), 6);
    EXPECT_GE(inkAt(image, x - 20), 1);
}

TEST_F(ChartDrawingTest, NothingIsDrawnAcrossAGap) {
    for (int number = 0; number < 6000; ++number) { // 100 a second, none from 20 s to 40 s
        if (number >= 2000 && number < 4000)
            continue;
        ASSERT_TRUE(level->append(noon_ns - 60 * second_ns + number * second_ns / 100, -90));
    }
    chart.samplesChanged();
    const QImage image = picture();
    EXPECT_GE(inkAt(image, middleOf(noon_ns - 45 * second_ns)), 1);
    for (int second = 39; second > 21; --second)
        EXPECT_EQ(inkAt(image, middleOf(noon_ns - second * second_ns)), 0) << second;
    EXPECT_GE(inkAt(image, middleOf(noon_ns - 15 * second_ns)), 1);
}

TEST_F(ChartDrawingTest, NorAmongFewSamples) {
    for (const int second : {60, 59, 58, 30, 29, 28}) // the gap limit is 5 s
        ASSERT_TRUE(level->append(noon_ns - second * second_ns, -90));
    chart.samplesChanged();
    const QImage image = picture();
    EXPECT_GE(inkAt(image, middleOf(noon_ns - 59 * second_ns + second_ns / 2)), 1);
    for (int second = 56; second > 31; --second)
        EXPECT_EQ(inkAt(image, middleOf(noon_ns - second * second_ns)), 0) << second;
    EXPECT_GE(inkAt(image, middleOf(noon_ns - 29 * second_ns + second_ns / 2)), 1);
}

TEST_F(ChartDrawingTest, ALoneSampleIsDrawn) {
    ASSERT_TRUE(level->append(noon_ns - 30 * second_ns, -90));
    chart.samplesChanged();
    EXPECT_GE(inkAt(picture(), xAt(noon_ns - 30 * second_ns)), 2);
}

TEST_F(ChartDrawingTest, LinesOfDashesStillShowEveryExtreme) {
    ChartPanel dashed = panelOf("Level", level);
    dashed.series.front().line = ChartLine::dotted;
    chart.setPanel(panel, dashed);
    for (int number = 0; number < 60'000; ++number)
        ASSERT_TRUE(level->append(noon_ns - 60 * second_ns + number * second_ns / 1000,
                                  number % 3000 == 1500 ? -40 : -110));
    chart.samplesChanged();
    const QImage image = picture();
    for (int second = 1; second < 60; second += 3)
        EXPECT_GT(inkAt(image, xAt(noon_ns - second * second_ns - second_ns / 2)), 30) << second;
}

TEST_F(ChartDrawingTest, LinesAcrossTheViewToFarSamplesAreDrawn) {
    const auto rare = store.makeSeries(24 * 3600 * second_ns);
    ChartPanel dotted = panelOf("Level", rare);
    dotted.series.front().line = ChartLine::dotted;
    chart.setPanel(panel, dotted);
    ASSERT_TRUE(rare->append(noon_ns - 10 * 3600 * second_ns, -90));
    ASSERT_TRUE(rare->append(noon_ns + 10 * 3600 * second_ns, -90));
    chart.setRange({noon_ns, noon_ns + second_ns / 100}); // of which the line is a hundred million pixels
    const QImage image = picture();
    int columns = 0;
    for (int x = static_cast<int>(layout().left()); x < 390; ++x)
        columns += inkAt(image, x) > 0 ? 1 : 0;
    EXPECT_NEAR(columns, layout().width() / 2, layout().width() / 5); // dashes of 2, spaces of 3
}

TEST_F(ChartDrawingTest, NothingIsDrawnWhileItIsHidden) {
    addMinute();
    chart.setHidden(true);
    chart.widget()->hide();
    runUntilIdle();
    const std::size_t before = widget().paintCount();
    ASSERT_TRUE(level->append(noon_ns + second_ns, 5));
    chart.samplesChanged();
    chart.setNow(noon_ns + 2 * second_ns);
    chart.setCursor(noon_ns);
    runUntilIdle();
    EXPECT_EQ(widget().paintCount(), before);
}

TEST_F(ChartDrawingTest, NothingIsDrawnWhenNothingInTheRangeIsDifferent) {
    addMinute();
    chart.samplesChanged();
    chart.setRange({noon_ns - 60 * second_ns, noon_ns - 30 * second_ns});
    runUntilIdle();
    const std::size_t before = widget().paintCount();
    chart.samplesChanged();
    for (int second = 1; second <= 10; ++second) {
        ASSERT_TRUE(level->append(noon_ns + second * second_ns, 5));
        chart.samplesChanged();
        chart.setNow(noon_ns + second * second_ns);
        runUntilIdle();
    }
    EXPECT_EQ(widget().paintCount(), before);
    chart.setRange({noon_ns - 60 * second_ns, noon_ns + 30 * second_ns});
    runUntilIdle();
    EXPECT_EQ(widget().paintCount(), before + 1);
    ASSERT_TRUE(level->append(noon_ns + 11 * second_ns, 5));
    chart.samplesChanged();
    runUntilIdle();
    EXPECT_EQ(widget().paintCount(), before + 2);
}

TEST_F(ChartDrawingTest, BandsAndEventsAreDrawnAgainOnlyWhenTheyAreOthers) {
    const std::vector<ChartBand> bands = {{0, noon_ns - 30 * second_ns, {}, "LTE", ChartColor::first}};
    const std::vector<ChartTick> ticks = {{noon_ns - 20 * second_ns, ChartSeverity::critical, "Call lost"}};
    const QImage without = picture();
    chart.setBands(bands);
    chart.setTicks(ticks);
    EXPECT_NE(picture(), without);
    runUntilIdle();
    const std::size_t before = widget().paintCount();
    chart.setBands(bands);
    chart.setTicks(ticks);
    runUntilIdle();
    EXPECT_EQ(widget().paintCount(), before);
}

TEST_F(ChartDrawingTest, ABandReachesFromItsBeginToItsEnd) {
    chart.setBands({{0, noon_ns - 40 * second_ns, noon_ns - 20 * second_ns, "", ChartColor::first}});
    const QImage image = picture();
    const auto at = [&](int second) {
        return colorAt(image, xAt(noon_ns - second * second_ns), layout().lane(0).center().y());
    };
    const ChartTheme theme(widget().palette());
    EXPECT_EQ(at(41), theme.ground());
    EXPECT_EQ(at(38), theme.band(ChartColor::first));
    EXPECT_EQ(at(21), theme.band(ChartColor::first));
    EXPECT_EQ(at(19), theme.ground());
}

TEST_F(ChartDrawingTest, OfEventsAtOnePlaceTheGravestIsDrawn) {
    const auto mark = [this](const std::vector<ChartTick>& ticks) {
        chart.setTicks(ticks);
        const QImage image = picture();
        return colorAt(image, xAt(noon_ns - 30 * second_ns), layout().eventMarks().center().y());
    };
    const std::int64_t time_ns = noon_ns - 30 * second_ns;
    const ChartTheme theme(widget().palette());
    EXPECT_EQ(mark({{time_ns, ChartSeverity::info, ""}}), theme.mark(ChartSeverity::info));
    EXPECT_EQ(mark({{time_ns, ChartSeverity::critical, ""}, {time_ns + 1, ChartSeverity::info, ""}}),
              theme.mark(ChartSeverity::critical));
}

TEST_F(ChartDrawingTest, TimeThatMovesTheRangeByLessThanAPixelDrawsNothing) {
    addMinute();
    chart.setSpan(std::chrono::hours(1)); // about ten seconds a pixel
    runUntilIdle();
    const std::size_t before = widget().paintCount();
    for (int step = 0; step < 4; ++step) {
        chart.setNow(noon_ns + step * second_ns / 10);
        runUntilIdle();
    }
    EXPECT_LE(widget().paintCount(), before + 1);
}

TEST_F(ChartDrawingTest, AValueThatBecomesTooOldIsNoLongerShown) {
    addMinute();
    chart.setSpan(std::chrono::hours(24));
    runUntilIdle();
    const std::size_t before = widget().paintCount();
    EXPECT_EQ(chart.readings().front().text, "60 dBm");
    chart.setNow(noon_ns + 6 * second_ns);
    runUntilIdle();
    EXPECT_EQ(chart.readings().front().text, "no value");
    EXPECT_GT(widget().paintCount(), before);
}

TEST_F(ChartDrawingTest, LinesAreReadableOnAnyPalette) {
    for (const QColor& ground : {QColor(Qt::white), QColor(Qt::black), QColor(36, 36, 40),
                                 QColor(250, 240, 220), QColor(120, 120, 120)}) {
        QPalette palette;
        palette.setColor(QPalette::Base, ground);
        palette.setColor(QPalette::Text, ground.lightness() < 128 ? Qt::white : Qt::black);
        const ChartTheme theme(palette);
        for (int color = 0; color < 6; ++color)
            EXPECT_GE(contrast(theme.line(static_cast<ChartColor>(color)), ground), 3)
                << ground.name().toStdString() << color;
        for (int severity = 0; severity < 4; ++severity)
            EXPECT_GE(contrast(theme.mark(static_cast<ChartSeverity>(severity)), ground), 3);
        EXPECT_GE(contrast(theme.text(), ground), 4.5) << ground.name().toStdString();
    }
}

TEST_F(ChartDrawingTest, APaletteThatChangesIsTakenUp) {
    QPalette dark;
    dark.setColor(QPalette::Base, QColor(10, 11, 12));
    dark.setColor(QPalette::Text, Qt::white);
    QApplication::setPalette(dark);
    EXPECT_EQ(colorAt(picture(), 399, 299), QColor(10, 11, 12));
}

TEST_F(ChartDrawingTest, LabelsAreMirroredButTimeIsNot) {
    addMinute();
    const double left = layout().left();
    EXPECT_GT(left, 16); // labels of values
    EXPECT_LT(xAt(noon_ns - 50 * second_ns), xAt(noon_ns - 10 * second_ns));
    const double title = layout().panels().front().title.left();
    QApplication::setLayoutDirection(Qt::RightToLeft);
    runUntilIdle();
    EXPECT_EQ(layout().left(), ChartLayout::space);
    EXPECT_LT(layout().left() + layout().width(), 400 - 16);
    EXPECT_LT(xAt(noon_ns - 50 * second_ns), xAt(noon_ns - 10 * second_ns));
    EXPECT_GT(layout().panels().front().title.left(), title);
}

TEST_F(ChartDrawingTest, EverythingIsInViewOnAPhoneAndWithLargeText) {
    chart.addPanel(panelOf("Quality", level));
    addMinute();
    QFont large = widget().font();
    large.setPointSizeF(large.pointSizeF() * 2);
    for (const QFont& font : {widget().font(), large}) {
        widget().setFont(font);
        chart.setFrame({0, 0, 360, 0});
        chart.sizeToFit();
        const ChartLayout places = layout();
        EXPECT_LE(places.timeAxis().bottom(), chart.frame().height);
        double y = 0;
        for (const ChartLayout::Panel& place : places.panels()) {
            EXPECT_GE(place.title.top(), y);
            for (const QRectF& entry : place.entries) {
                EXPECT_LE(entry.right(), 360);
                EXPECT_LE(entry.bottom(), place.plot.top());
            }
            EXPECT_GE(place.plot.height(), 4 * places.digits().metrics().height());
            EXPECT_GE(place.axis.marks.size(), 2U);
            y = place.plot.bottom();
        }
        EXPECT_GE(places.timeAxis().top(), y);
    }
}

TEST_F(ChartDrawingTest, PanelsCanBeAddedAndRemoved) {
    addMinute();
    const double alone = layout().panels().front().plot.height();
    const auto pinned = chart.addPanel(panelOf("Pinned", level));
    EXPECT_EQ(chart.panelCount(), 2U);
    EXPECT_LT(layout().panels().front().plot.height(), alone);
    chart.removePanel(pinned);
    chart.removePanel(pinned);
    EXPECT_EQ(chart.panelCount(), 1U);
    EXPECT_EQ(layout().panels().front().plot.height(), alone);
    EXPECT_NE(chart.addPanel(panelOf("Another", level)), pinned);
}

} // namespace
} // namespace velmora
