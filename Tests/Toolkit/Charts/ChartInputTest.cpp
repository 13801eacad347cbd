// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/Charts/ChartTest.h"

#include <QPointingDevice>
#include <QScrollArea>
#include <QScrollBar>
#include <QTest>
#include <QWheelEvent>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class ChartInputTest : public ChartTest {
protected:
    ChartInputTest() {
        addMinute();
        chart.samplesChanged();
        chart.setOnCursorMoved([this](std::optional<std::int64_t> time_ns) { moves.push_back(time_ns); });
        chart.setOnRangeChanged([this] { ++changes; });
    }
    void key(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
        QTest::keyClick(&widget(), key, modifiers);
    }
    void wheel(const QPoint& angle, Qt::KeyboardModifiers modifiers = {}) {
        const QPointF place(200, 150);
        QWheelEvent event(place, widget().mapToGlobal(place), {}, angle, Qt::NoButton, modifiers,
                          Qt::NoScrollPhase, false);
        QApplication::sendEvent(&widget(), &event);
    }
    void finger(QPoint from, QPoint to) {
        QTest::touchEvent(&widget(), device).press(0, from, &widget());
        for (int step = 1; step <= 5; ++step)
            QTest::touchEvent(&widget(), device).move(0, from + (to - from) * step / 5, &widget());
        QTest::touchEvent(&widget(), device).release(0, to, &widget());
        runUntilIdle();
    }
    [[nodiscard]] double seconds() const { return static_cast<double>(chart.range().length_ns()) / 1e9; }

    static inline QPointingDevice* const device = QTest::createTouchDevice();
    std::vector<std::optional<std::int64_t>> moves;
    int changes = 0;
};

TEST_F(ChartInputTest, ArrowsMoveTheCursorFromSampleToSample) {
    key(Qt::Key_Left);
    EXPECT_EQ(chart.cursor(), noon_ns);
    EXPECT_EQ(chart.readings().front().sample, (Sample{noon_ns, 60}));
    key(Qt::Key_Left);
    EXPECT_EQ(chart.readings().front().sample, (Sample{noon_ns - second_ns, 59}));
    key(Qt::Key_Left, Qt::ShiftModifier);
    EXPECT_EQ(chart.readings().front().sample, (Sample{noon_ns - 11 * second_ns, 49}));
    key(Qt::Key_Right);
    EXPECT_EQ(chart.readings().front().text, "50 dBm");
    EXPECT_EQ(moves.size(), 4U);
    key(Qt::Key_Home);
    EXPECT_EQ(chart.cursor(), noon_ns - 60 * second_ns);
    key(Qt::Key_Left);
    EXPECT_EQ(chart.cursor(), noon_ns - 60 * second_ns);
    key(Qt::Key_Escape);
    EXPECT_EQ(chart.cursor(), std::nullopt);
    EXPECT_EQ(moves.back(), std::nullopt);
}

TEST_F(ChartInputTest, TheCursorHasNoValueInAGap) {
    ASSERT_TRUE(level->appendGap(noon_ns + second_ns));
    ASSERT_TRUE(level->append(noon_ns + 4 * second_ns, -90));
    chart.setCursor(noon_ns + 2 * second_ns);
    EXPECT_EQ(chart.readings().front().sample, std::nullopt);
    EXPECT_EQ(chart.readings().front().text, "no value");
    chart.setCursor(noon_ns + 20 * second_ns); // past the gap limit
    EXPECT_EQ(chart.readings().front().sample, std::nullopt);
    chart.setCursor(noon_ns + 9 * second_ns);
    EXPECT_EQ(chart.readings().front().sample, (Sample{noon_ns + 4 * second_ns, -90}));
    EXPECT_THAT(moves, IsEmpty()); // the program moved it, not the user
}

TEST_F(ChartInputTest, TheCursorSettlesOnTheSampleNearATap) {
    const QPoint place(static_cast<int>(xAt(noon_ns - 30 * second_ns)) + 2, 150);
    QTest::mouseClick(&widget(), Qt::LeftButton, {}, place);
    EXPECT_THAT(moves, ElementsAre(std::optional(noon_ns - 30 * second_ns)));
    EXPECT_EQ(chart.readings().front().sample, (Sample{noon_ns - 30 * second_ns, 30}));
    const QPoint other(static_cast<int>(xAt(noon_ns - 10 * second_ns)), 150);
    QTest::touchEvent(&widget(), device).press(0, other, &widget());
    QTest::touchEvent(&widget(), device).release(0, other, &widget());
    runUntilIdle();
    EXPECT_EQ(chart.cursor(), noon_ns - 10 * second_ns);
    EXPECT_TRUE(chart.isFollowing());
}

TEST_F(ChartInputTest, DraggingMovesTheRangeAndNStopsThat) {
    const TimeRange before = chart.range();
    QTest::mousePress(&widget(), Qt::LeftButton, {}, QPoint(200, 150));
    QTest::mouseMove(&widget(), QPoint(250, 150));
    QTest::mouseMove(&widget(), QPoint(300, 160));
    QTest::mouseRelease(&widget(), Qt::LeftButton, {}, QPoint(300, 160));
    EXPECT_FALSE(chart.isFollowing());
    const double moved = static_cast<double>(before.begin_ns - chart.range().begin_ns) / 1e9;
    EXPECT_NEAR(moved, 100 * 60 / layout().width(), 0.5);
    EXPECT_EQ(chart.range().length_ns(), before.length_ns());
    EXPECT_EQ(chart.cursor(), std::nullopt);
    EXPECT_GE(changes, 1);
    chart.setNow(noon_ns + second_ns);
    EXPECT_NE(chart.range().end_ns, noon_ns + second_ns);
    key(Qt::Key_N);
    EXPECT_TRUE(chart.isFollowing());
    EXPECT_EQ(chart.range().end_ns, noon_ns + second_ns);
}

TEST_F(ChartInputTest, AFingerMovesTheRangeToo) {
    finger({100, 150}, {250, 155});
    EXPECT_FALSE(chart.isFollowing());
    EXPECT_LT(chart.range().end_ns, noon_ns - 20 * second_ns);
    EXPECT_THAT(moves, IsEmpty());
}

TEST_F(ChartInputTest, AStrokeUpwardsScrollsWhatTheChartLiesIn) {
    QScrollArea area;
    area.resize(420, 200);
    area.setWidget(chart.widget());
    area.show();
    runUntilIdle();
    finger({200, 180}, {202, 100});
    EXPECT_NEAR(area.verticalScrollBar()->value(), 80, 1);
    EXPECT_TRUE(chart.isFollowing());
    area.takeWidget();
}

TEST_F(ChartInputTest, TwoFingersZoomAroundTheTimeBetweenThem) {
    chart.setRange({noon_ns - 60 * second_ns, noon_ns});
    const double middle = widget().scale().left + widget().scale().width() / 2;
    const auto place = [middle](double distance) { return QPoint(static_cast<int>(middle + distance), 150); };
    const std::int64_t fixed_ns = widget().scale().timeAt(middle);
    QTest::touchEvent(&widget(), device).press(0, place(-40), &widget()).press(1, place(40), &widget());
    QTest::touchEvent(&widget(), device).move(0, place(-60), &widget()).move(1, place(60), &widget());
    QTest::touchEvent(&widget(), device).move(0, place(-80), &widget()).move(1, place(80), &widget());
    QTest::touchEvent(&widget(), device).release(0, place(-80), &widget()).release(1, place(80), &widget());
    runUntilIdle();
    EXPECT_NEAR(seconds(), 30, 0.5);
    EXPECT_NEAR(static_cast<double>(widget().scale().timeAt(middle) - fixed_ns) / 1e9, 0, 0.5);
    EXPECT_EQ(chart.cursor(), std::nullopt);
}

TEST_F(ChartInputTest, TheWheelZoomsAndWithShiftMoves) {
    wheel({0, 120});
    EXPECT_NEAR(seconds(), 40, 0.1);
    EXPECT_TRUE(chart.isFollowing());
    wheel({0, -120});
    EXPECT_NEAR(seconds(), 60, 0.1);
    wheel({0, 120}, Qt::ShiftModifier);
    EXPECT_FALSE(chart.isFollowing());
    EXPECT_LT(chart.range().end_ns, noon_ns);
    EXPECT_NEAR(seconds(), 60, 0.1);
    const std::int64_t end_ns = chart.range().end_ns;
    wheel({-60, 0}); // a touchpad's sideways stroke
    EXPECT_GT(chart.range().end_ns, end_ns);
}

TEST_F(ChartInputTest, KeysChooseTheRange) {
    key(Qt::Key_5);
    EXPECT_EQ(chart.span(), std::chrono::minutes(5));
    key(Qt::Key_3);
    EXPECT_EQ(chart.span(), std::chrono::minutes(30));
    key(Qt::Key_1);
    EXPECT_EQ(chart.span(), std::chrono::minutes(1));
    key(Qt::Key_A);
    EXPECT_EQ(chart.span(), std::nullopt);
    EXPECT_EQ(chart.range(), (TimeRange{noon_ns - 60 * second_ns, noon_ns}));
    key(Qt::Key_Plus);
    EXPECT_NEAR(seconds(), 40, 0.1);
    key(Qt::Key_Minus);
    EXPECT_NEAR(seconds(), 60, 0.1);
    key(Qt::Key_PageUp);
    EXPECT_FALSE(chart.isFollowing());
    EXPECT_NEAR(static_cast<double>(noon_ns - chart.range().end_ns) / 1e9, 30, 0.5);
    key(Qt::Key_End);
    EXPECT_TRUE(chart.isFollowing());
}

TEST_F(ChartInputTest, ACursorThatTheProgramSetsIsBroughtIntoView) {
    chart.setCursor(noon_ns - 300 * second_ns);
    EXPECT_TRUE(chart.range().contains(noon_ns - 300 * second_ns));
    EXPECT_FALSE(chart.isFollowing());
}

TEST_F(ChartInputTest, ACallbackMayDestroyTheChart) {
    auto doomed = std::make_unique<ChartView>();
    doomed->addPanel(panelOf("Level", level));
    doomed->setNow(noon_ns);
    doomed->setFrame({0, 0, 400, 300});
    doomed->widget()->show();
    doomed->setOnCursorMoved([&](auto) { doomed.reset(); });
    QTest::keyClick(doomed->widget(), Qt::Key_Left);
    EXPECT_EQ(doomed, nullptr);
    runUntilIdle();
}

} // namespace
} // namespace velmora
