// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Tables/GridView.h"

#include "Tests/Toolkit/ToolkitTest.h"

#include <QApplication>
#include <QHeaderView>
#include <QPaintEvent>
#include <QScrollBar>
#include <QTableView>
#include <QTest>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

/// Adds up what is painted of a widget.
class PaintedRegion : public QObject {
public:
    explicit PaintedRegion(QWidget* widget) : _widget(widget) { widget->installEventFilter(this); }
    QRegion region;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override {
        if (watched == _widget && event->type() == QEvent::Paint)
            region += static_cast<QPaintEvent*>(event)->region();
        return false;
    }

private:
    QWidget* _widget;
};

class GridViewTest : public ::testing::Test {
protected:
    GridViewTest() {
        static_cast<void>(testApplication());
        grid.setColumns({{"Channel", "37999", TextAlignment::right}, {"Cell", ""}});
    }
    void show() {
        grid.setFrame({0, 0, 300, 200});
        grid.widget()->show();
        runUntilIdle();
    }
    static GridRow row(const char* channel, const char* cell) { return {{channel}, {cell}}; }
    [[nodiscard]] QTableView& table() const { return *static_cast<QTableView*>(grid.widget()); }
    [[nodiscard]] std::string shown(int row, int column) const {
        return table().model()->index(row, column).data().toString().toStdString();
    }

    GridView grid;
};

TEST_F(GridViewTest, ShowsItsRowsBelowTheirHead) {
    grid.setRows({row("6300", "62"), row("1650", "7")});
    show();
    EXPECT_EQ(table().model()->headerData(0, Qt::Horizontal).toString(), "Channel");
    EXPECT_EQ(shown(0, 0), "6300");
    EXPECT_EQ(shown(1, 1), "7");
    EXPECT_EQ(table().model()->index(0, 0).data(Qt::TextAlignmentRole).toInt() & Qt::AlignRight,
              Qt::AlignRight);
}

TEST_F(GridViewTest, TheOpenColumnHasTheRestOfTheWidth) {
    show();
    EXPECT_EQ(table().columnWidth(0) + table().columnWidth(1), table().viewport()->width());
    EXPECT_GT(table().columnWidth(1), table().columnWidth(0));
    grid.setFrame({0, 0, 100, 200});
    runUntilIdle();
    EXPECT_LE(table().columnWidth(0) + table().columnWidth(1), table().viewport()->width());
}

TEST_F(GridViewTest, OnlyRowsThatAreDifferentAreDrawn) {
    grid.setRows({row("1", "a"), row("2", "b"), row("3", "c")});
    show();
    PaintedRegion painted(table().viewport());
    grid.setRows({row("1", "a"), row("2", "b"), row("3", "c")});
    runUntilIdle();
    EXPECT_TRUE(painted.region.isEmpty());
    grid.setRows({row("1", "a"), row("9", "b"), row("3", "c")});
    runUntilIdle();
    const QRect changed = painted.region.boundingRect();
    EXPECT_FALSE(changed.isEmpty());
    EXPECT_GE(changed.top(), table().rowViewportPosition(1));
    EXPECT_LE(changed.bottom(), table().rowViewportPosition(2));
}

TEST_F(GridViewTest, TheChosenRowAndTheScrollPositionStay) {
    std::vector<GridRow> rows;
    for (int i = 0; i < 50; ++i)
        rows.push_back({{std::to_string(i)}, {"x"}});
    grid.setRows(rows);
    show();
    table().setCurrentIndex(table().model()->index(30, 0));
    const int position = table().verticalScrollBar()->value();
    EXPECT_GT(position, 0);
    rows[30][1].text = "y";
    rows.push_back({{"50"}, {"x"}});
    grid.setRows(rows);
    runUntilIdle();
    EXPECT_EQ(table().currentIndex().row(), 30);
    EXPECT_EQ(table().verticalScrollBar()->value(), position);
}

TEST_F(GridViewTest, EnterSpaceAndAClickChooseARow) {
    std::vector<std::size_t> chosen;
    grid.setOnChoose([&chosen](std::size_t row) { chosen.push_back(row); });
    grid.setRows({row("1", "a"), row("2", "b"), row("3", "c")});
    show();
    EXPECT_GE(table().rowHeight(0), 44) << "for a finger";
    QTest::keyClick(&table(), Qt::Key_Home);
    QTest::keyClick(&table(), Qt::Key_Down);
    QTest::keyClick(&table(), Qt::Key_Return);
    QTest::keyClick(&table(), Qt::Key_End);
    QTest::keyClick(&table(), Qt::Key_Space);
    QTest::mouseClick(table().viewport(), Qt::LeftButton, {}, QPoint(5, table().rowViewportPosition(0) + 5));
    EXPECT_THAT(chosen, ElementsAre(1U, 2U, 0U));
}

TEST_F(GridViewTest, LeavesEscapeAndCommandsToTheWindow) {
    grid.setRows({row("1", "a")});
    show();
    for (const auto& [key, modifiers] :
         {std::pair(Qt::Key_Escape, Qt::NoModifier), std::pair(Qt::Key_D, Qt::ControlModifier)}) {
        QKeyEvent event(QEvent::KeyPress, key, modifiers);
        event.accept();
        QApplication::sendEvent(&table(), &event);
        EXPECT_FALSE(event.isAccepted());
    }
}

TEST_F(GridViewTest, ScreenReadersGetTheSpokenText) {
    grid.setRows({{{"\u221297", 0.5, Color::good, "\u221297 dBm, good"}, {"62"}}});
    show();
    EXPECT_EQ(table().model()->index(0, 0).data(Qt::AccessibleTextRole).toString().toStdString(),
              "\u221297 dBm, good");
    EXPECT_EQ(table().model()->index(0, 1).data(Qt::AccessibleTextRole).toString().toStdString(), "62");
}

TEST_F(GridViewTest, AnEmptyOneSaysWhy) {
    grid.setPlaceholder("No event so far.");
    EXPECT_EQ(grid.widget()->accessibleDescription().toStdString(), "No event so far.");
}

} // namespace
} // namespace velmora
