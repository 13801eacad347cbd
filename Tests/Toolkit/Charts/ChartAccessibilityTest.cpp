// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/Charts/ChartTest.h"

#include "Toolkit/Widgets/Accessibility.h"
#include "Toolkit/Widgets/Charts/ChartTableWidget.h"

#include <QAccessible>
#include <QTest>

namespace velmora {
namespace {

using ::testing::ElementsAre;

class ChartAccessibilityTest : public ChartTest {
protected:
    ChartAccessibilityTest() {
        addMinute();
        setAnnouncementListener([this](QWidget& widget, QAccessible::Event what) {
            if (what == QAccessible::NameChanged)
                announced.push_back(
                    QAccessible::queryAccessibleInterface(&widget)->text(QAccessible::Name).toStdString());
        });
    }
    ~ChartAccessibilityTest() override { setAnnouncementListener(nullptr); }
    [[nodiscard]] QAccessibleInterface& interface() const {
        return *QAccessible::queryAccessibleInterface(chart.widget());
    }
    [[nodiscard]] std::string text(QAccessible::Text which) const {
        return interface().text(which).toStdString();
    }

    std::vector<std::string> announced;
};

TEST_F(ChartAccessibilityTest, AChartSaysWhatItShows) {
    EXPECT_EQ(interface().role(), QAccessible::Chart);
    EXPECT_EQ(text(QAccessible::Name), "Over time");
    EXPECT_EQ(text(QAccessible::Description),
              "Level, Serving, 60 dBm now, minimum 0, maximum 60 over 1 minute");
    EXPECT_TRUE(interface().state().focusable);
}

TEST_F(ChartAccessibilityTest, TheSummaryHasGapsAndWhatIsMissing) {
    const auto other = store.makeSeries(5 * second_ns);
    ChartPanel both = panelOf("Level", level);
    both.decimals = 2;
    both.series.push_back({"Best neighbour", other, ChartColor::second, ChartLine::dashed, false});
    chart.setPanel(panel, both);
    for (const int second : {50, 40, 30})
        ASSERT_TRUE(other->append(noon_ns - second * second_ns, -112.25 + second / 10.0));
    EXPECT_EQ(chart.summary(),
              "Level, Serving, 60.00 dBm now, minimum 0.00, maximum 60.00 over 1 minute. "
              "Level, Best neighbour, no value now, minimum \u2212109.25, maximum \u2212107.25 over 1 "
              "minute, 2 gaps");
    chart.setRange({noon_ns - 400 * second_ns, noon_ns - 100 * second_ns});
    EXPECT_EQ(chart.summary(), "Level, Serving, no value at the end, nothing over 5 minutes. "
                               "Level, Best neighbour, no value at the end, nothing over 5 minutes");
}

TEST_F(ChartAccessibilityTest, TheCursorSpeaksTimeAndValues) {
    QTest::keyClick(chart.widget(), Qt::Key_Left);
    QTest::keyClick(chart.widget(), Qt::Key_Left);
    EXPECT_THAT(announced, ElementsAre("Over time, 12:00:00, Level, Serving 60 dBm",
                                       "Over time, 11:59:59, Level, Serving 59 dBm"));
    EXPECT_EQ(text(QAccessible::Value), "11:59:59, Level, Serving 59 dBm");
    QTest::keyClick(chart.widget(), Qt::Key_Escape);
    EXPECT_EQ(text(QAccessible::Name), "Over time");
}

TEST_F(ChartAccessibilityTest, ActionsMoveTheCursorAndShowTheTable) {
    QAccessibleActionInterface* const actions = interface().actionInterface();
    ASSERT_NE(actions, nullptr);
    EXPECT_TRUE(actions->actionNames().contains(QAccessibleActionInterface::toggleAction()));
    actions->doAction(QAccessibleActionInterface::decreaseAction());
    actions->doAction(QAccessibleActionInterface::decreaseAction());
    actions->doAction(QAccessibleActionInterface::decreaseAction());
    actions->doAction(QAccessibleActionInterface::increaseAction());
    EXPECT_EQ(chart.cursor(), noon_ns - second_ns);
    actions->doAction(QAccessibleActionInterface::toggleAction());
    EXPECT_TRUE(chart.showsTable());
    actions->doAction(QAccessibleActionInterface::toggleAction());
    EXPECT_FALSE(chart.showsTable());
}

TEST_F(ChartAccessibilityTest, TheTableHasARowForEachTimeAndAColumnForEachSeries) {
    chart.widget()->setFocus();
    QTest::keyClick(chart.widget(), Qt::Key_T);
    ASSERT_TRUE(chart.showsTable());
    ChartTableWidget* const table = widget().table();
    EXPECT_TRUE(table->hasFocus());
    ASSERT_EQ(interface().childCount(), 1);
    QAccessibleInterface* const child = interface().child(0);
    EXPECT_EQ(child->role(), QAccessible::Table);
    EXPECT_EQ(child->text(QAccessible::Name), "Values, Over time");
    QAccessibleTableInterface* const cells = child->tableInterface();
    ASSERT_NE(cells, nullptr);
    EXPECT_EQ(cells->rowCount(), 61);
    EXPECT_EQ(cells->columnCount(), 2);
    EXPECT_EQ(cells->columnDescription(1), "Level, Serving (dBm)");
    EXPECT_EQ(cells->cellAt(0, 0)->text(QAccessible::Name), "11:59:00");
    EXPECT_EQ(cells->cellAt(0, 1)->text(QAccessible::Name), "0");
    EXPECT_EQ(cells->cellAt(60, 1)->text(QAccessible::Name), "60");
    EXPECT_EQ(table->currentRow(), 60); // now
}

TEST_F(ChartAccessibilityTest, ARowOfTheTableIsATimeToGoTo) {
    chart.setShowsTable(true);
    ChartTableWidget* const table = widget().table();
    QTest::keyClick(table, Qt::Key_Up);
    QTest::keyClick(table, Qt::Key_Up);
    EXPECT_EQ(table->currentRow(), 58);
    // A sample more, and the oldest one out of the range: the row is still that of its time.
    ASSERT_TRUE(level->append(noon_ns + second_ns, 61));
    chart.setNow(noon_ns + second_ns);
    EXPECT_EQ(table->rowCount(), 61);
    EXPECT_EQ(table->currentRow(), 57);
    QTest::keyClick(table, Qt::Key_Return);
    EXPECT_FALSE(chart.showsTable());
    EXPECT_EQ(chart.cursor(), noon_ns - 2 * second_ns);
    chart.setShowsTable(true);
    QTest::keyClick(table, Qt::Key_T);
    EXPECT_FALSE(chart.showsTable());
}

TEST_F(ChartAccessibilityTest, ATableOfManySamplesIsThinnedToItsLimit) {
    const ChartTable whole = chart.table(61);
    EXPECT_FALSE(whole.isThinned);
    EXPECT_EQ(whole.rows.size(), 61U);
    const ChartTable thin = chart.table(6);
    EXPECT_TRUE(thin.isThinned);
    ASSERT_EQ(thin.rows.size(), 6U);
    EXPECT_THAT(thin.columns, ElementsAre("Time", "Level, Serving (dBm)"));
    EXPECT_THAT(thin.rows.front(), ElementsAre("11:59:10", "10"));
    EXPECT_THAT(thin.rows.back(), ElementsAre("12:00:00", "60"));
}

} // namespace
} // namespace velmora
