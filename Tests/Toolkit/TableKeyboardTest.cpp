// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Scrolling/ScrollView.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"

#include <QApplication>
#include <QTest>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class TableKeyboardTest : public ::testing::Test {
protected:
    TableKeyboardTest() : stage(std::make_shared<ListPane>(numberedTexts(100))), pane(*stage.root) {
        stage.show();
    }

    [[nodiscard]] TableView& table() const { return pane.tableView(); }
    void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) const {
        QTest::keyClick(stage.window.widget()->focusWidget(), key, modifiers);
    }
    [[nodiscard]] std::size_t focusRow() const { return table().indexPathForFocusRow().row(); }
    [[nodiscard]] CellWidget& drawnCell(std::size_t row) const {
        return static_cast<CellWidget&>(*pane.cell(row)->widget());
    }

    Stage stage;
    ListPane& pane;
};

TEST_F(TableKeyboardTest, TheTableOfTheScreenHasTheKeyboardFromTheStart) {
    EXPECT_TRUE(table().isFirstResponder());
    EXPECT_EQ(table().indexPathForFocusRow(), IndexPath(0, 0));
}

TEST_F(TableKeyboardTest, ArrowsMoveTheFocusRow) {
    press(Qt::Key_Down);
    press(Qt::Key_Down);
    EXPECT_EQ(focusRow(), 2U);
    press(Qt::Key_Up);
    EXPECT_EQ(focusRow(), 1U);
    press(Qt::Key_Up);
    press(Qt::Key_Up);
    EXPECT_EQ(focusRow(), 0U);
    EXPECT_THAT(pane.chosen, IsEmpty());
}

TEST_F(TableKeyboardTest, PagesAndEnds) {
    press(Qt::Key_End);
    EXPECT_EQ(focusRow(), 99U);
    EXPECT_EQ(table().contentOffset(), 100 * 44 - 552);
    press(Qt::Key_PageUp); // twelve complete rows are a page
    EXPECT_EQ(focusRow(), 87U);
    press(Qt::Key_Home);
    EXPECT_EQ(focusRow(), 0U);
    EXPECT_EQ(table().contentOffset(), 0);
    press(Qt::Key_PageDown);
    EXPECT_EQ(focusRow(), 12U);
    EXPECT_EQ(table().contentOffset(), 13 * 44 - 552);
}

TEST_F(TableKeyboardTest, EnterSelectsTheFocusRow) {
    press(Qt::Key_Down);
    press(Qt::Key_Return);
    EXPECT_THAT(pane.chosen, ElementsAre(1));
    EXPECT_EQ(table().indexPathForSelectedRow(), IndexPath(0, 1));
    press(Qt::Key_Down);
    press(Qt::Key_Enter);
    press(Qt::Key_Space);
    EXPECT_THAT(pane.chosen, ElementsAre(1, 2, 2));
}

TEST_F(TableKeyboardTest, TheFocusFrameShowsForTheKeyboardOnly) {
    EXPECT_FALSE(drawnCell(0).hasFocusFrame());
    press(Qt::Key_Down);
    EXPECT_TRUE(drawnCell(1).hasFocusFrame());
    EXPECT_FALSE(drawnCell(0).hasFocusFrame());
    const QPoint place = drawnCell(4).mapTo(stage.window.widget(), QPoint(20, 20));
    QTest::mouseClick(stage.window.widget()->windowHandle(), Qt::LeftButton, {}, place);
    EXPECT_EQ(focusRow(), 4U);
    EXPECT_FALSE(drawnCell(4).hasFocusFrame());
    EXPECT_THAT(pane.chosen, ElementsAre(4));
}

TEST_F(TableKeyboardTest, AnEmptyTableTakesKeysInItsStride) {
    pane.texts.clear();
    table().reloadData();
    for (const Qt::Key key : {Qt::Key_Down, Qt::Key_Up, Qt::Key_End, Qt::Key_PageDown, Qt::Key_Return})
        press(key);
    EXPECT_TRUE(table().indexPathForFocusRow().isNull());
    EXPECT_THAT(pane.chosen, IsEmpty());
    pane.texts = numberedTexts(3);
    table().reloadData();
    EXPECT_EQ(table().indexPathForFocusRow(), IndexPath(0, 0));
}

TEST_F(TableKeyboardTest, LeftAndRightMoveWhatIsTooWide) {
    ScrollView scroller;
    scroller.setFrame({0, 0, 100, 44});
    scroller.setContentSize({190, 44});
    pane.cell(0)->contentView().addSubview(scroller);
    press(Qt::Key_Right);
    EXPECT_EQ(scroller.contentOffset(), 60);
    press(Qt::Key_Right);
    EXPECT_EQ(scroller.contentOffset(), 90);
    press(Qt::Key_Left);
    EXPECT_EQ(scroller.contentOffset(), 30);
    table().reloadData(); // the same row in the same cell: the place is kept
    EXPECT_EQ(scroller.contentOffset(), 30);
    table().setContentOffset(44); // the cell is reused for another row
    EXPECT_EQ(scroller.contentOffset(), 0);
}

TEST_F(TableKeyboardTest, AClickOutsideOfAnyRowSelectsNone) {
    pane.texts.resize(2);
    table().reloadData();
    auto* const viewport = static_cast<TableWidget*>(table().widget())->viewport();
    QTest::mouseClick(viewport, Qt::LeftButton, {}, QPoint(20, 100));
    EXPECT_THAT(pane.chosen, IsEmpty());
    QTest::mousePress(viewport, Qt::LeftButton, {}, QPoint(20, 20));
    QTest::mouseRelease(viewport, Qt::LeftButton, {}, QPoint(20, 60)); // let go on another row
    EXPECT_THAT(pane.chosen, IsEmpty());
    QTest::mouseClick(viewport, Qt::RightButton, {}, QPoint(20, 20));
    EXPECT_THAT(pane.chosen, IsEmpty());
    QTest::mouseClick(viewport, Qt::LeftButton, {}, QPoint(20, 60));
    EXPECT_THAT(pane.chosen, ElementsAre(1));
}

TEST_F(TableKeyboardTest, ADoubleClickIsOneTap) {
    QApplication::setDoubleClickInterval(10'000);
    QWindow* const window = stage.window.widget()->windowHandle();
    QTest::mouseClick(window, Qt::LeftButton, {}, QPoint(20, 160));
    QTest::mouseClick(window, Qt::LeftButton, {}, QPoint(20, 160));
    QApplication::setDoubleClickInterval(0);
    EXPECT_EQ(pane.chosen.size(), 1U);
}

TEST_F(TableKeyboardTest, TabMovesToTheToolbarAndBack) {
    EXPECT_EQ(stage.window.widget()->focusWidget(), table().widget());
    press(Qt::Key_Tab);
    press(Qt::Key_Tab);
    EXPECT_EQ(stage.window.widget()->focusWidget(), table().widget());
}

} // namespace
} // namespace velmora
