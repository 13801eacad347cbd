// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// What the toolkit does where there is too little room, or nothing to show.

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Bars/FlexibleSpace.h"
#include "Toolkit/Bars/LabelItem.h"
#include "Toolkit/Bars/SaveButton.h"
#include "Toolkit/Scrolling/ScrollView.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Scrolling/OverlayScrollBar.h"
#include "Toolkit/Widgets/Scrolling/ScrollSigns.h"
#include "Toolkit/Widgets/Tables/EmptyLabel.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QAccessible>
#include <QPointingDevice>
#include <QScrollBar>
#include <QTest>

namespace velmora {
namespace {

class NarrowTest : public ::testing::Test {
protected:
    NarrowTest() : stage(std::make_shared<ListPane>(numberedTexts(3), "Root")) {
        stage.stack->setToolbarHidden(false);
        stage.show();
    }
    [[nodiscard]] LabelWidget& label(const char* name) const {
        return dynamic_cast<LabelWidget&>(*find(stage.window, name));
    }
    void resize(int width, int height) {
        stage.window.widget()->resize(width, height);
        runUntilIdle();
    }

    Stage stage;
};

TEST_F(NarrowTest, AStatusKeepsItsTime) {
    stage.root->setToolbarItems({std::make_shared<LabelItem>("Updated 2026-11-16 at 05:02:40"),
                                 std::make_shared<FlexibleSpace>(), std::make_shared<SaveButton>(nullptr)},
                                false);
    resize(400, 604);
    EXPECT_EQ(label("velmora.status").shownText(), "Updated 2026-11-16 at 05:02:40");
    resize(250, 604);
    const QString shown = label("velmora.status").shownText();
    EXPECT_TRUE(shown.endsWith("05:02:40")) << shown.toStdString();
    EXPECT_TRUE(shown.startsWith(QChar(0x2026))) << shown.toStdString();
}

TEST_F(NarrowTest, ALongTitleHasTwoLinesBeforeItIsElided) {
    stage.root->setTitle("Idle Mode Neighbors of the Serving Cell in this Area");
    EXPECT_EQ(label("velmora.title").shownText().count('\n'), 1);
    EXPECT_FALSE(label("velmora.title").shownText().contains(QChar(0x2026)));
    EXPECT_EQ(label("velmora.title").shownText().replace('\n', ' '),
              "Idle Mode Neighbors of the Serving Cell in this Area");
    stage.root->setTitle("Short");
    EXPECT_EQ(label("velmora.title").shownText(), "Short");
    QString words;
    for (int i = 0; i < 30; ++i)
        words += "words ";
    stage.root->setTitle(words.toStdString());
    EXPECT_EQ(label("velmora.title").shownText().count('\n'), 1);
    EXPECT_TRUE(label("velmora.title").shownText().contains(QChar(0x2026)));
}

TEST_F(NarrowTest, AHeaderIsAsHighAsItsTitle) {
    QWidget* const header = find(stage.window, "velmora.header");
    EXPECT_EQ(header->height(), 52);
    const double paneTop = stage.root->view().superview()->frame().y;
    // As with text that the user has scaled.
    label("velmora.title").setFont(toQt(Font::boldSystemFontOfSize(40)));
    stage.root->setTitle("Idle Mode Neighbors of the Serving Cell");
    EXPECT_GT(header->height(), 80);
    EXPECT_EQ(label("velmora.title").height(), header->height());
    EXPECT_EQ(stage.root->view().superview()->frame().y, paneTop + header->height() - 52);
    label("velmora.title").setFont(toQt(Font::boldSystemFontOfSize(17)));
    stage.root->setTitle("Root");
    EXPECT_EQ(header->height(), 52);
}

TEST_F(NarrowTest, RowsThatGoOnSayAtWhichEdge) {
    View outer;
    ScrollView view;
    Label text("text");
    outer.addSubview(view);
    view.addSubview(text);
    view.setFrame({0, 0, 100, 50});
    text.setFrame({10, 10, 150, 20});
    view.setContentSize({200, 50});
    outer.widget()->show();
    auto* const signs = dynamic_cast<ScrollSigns*>(view.widget()->findChild<QWidget*>("velmora.scrollSigns"));
    ASSERT_NE(signs, nullptr);
    EXPECT_TRUE(signs->isVisible());
    EXPECT_TRUE(signs->goesOnAtRight());
    EXPECT_FALSE(signs->goesOnAtLeft());
    view.setContentOffset(30);
    EXPECT_TRUE(signs->goesOnAtRight());
    EXPECT_TRUE(signs->goesOnAtLeft());
    view.setContentOffset(100); // to the end: the text ends at 60 of 100
    EXPECT_FALSE(signs->goesOnAtRight());
    EXPECT_TRUE(signs->goesOnAtLeft());
    // It is drawn: without the sign the last points of the row are as the ground.
    view.setContentOffset(0);
    const QImage with = view.widget()->grab(QRect(84, 0, 16, 50)).toImage();
    signs->hide();
    EXPECT_NE(view.widget()->grab(QRect(84, 0, 16, 50)).toImage(), with);
    text.setFrame({10, 10, 50, 20});
    view.setContentSize({100, 50});
    EXPECT_FALSE(signs->isVisible());
}

TEST_F(NarrowTest, AnEmptyTableSaysSo) {
    TableView& table = stage.root->tableView();
    table.setEmptyText("Nothing has been reported.");
    EXPECT_EQ(find(stage.window, "velmora.empty"), nullptr);
    stage.root->texts.clear();
    table.reloadData();
    QWidget* const label = find(stage.window, "velmora.empty");
    ASSERT_NE(label, nullptr);
    EXPECT_EQ(textOf(label), "Nothing has been reported.");
    QAccessibleInterface* const list = QAccessible::queryAccessibleInterface(table.widget());
    ASSERT_EQ(list->childCount(), 1);
    EXPECT_EQ(list->child(0)->text(QAccessible::Name), "Nothing has been reported.");
    EXPECT_EQ(list->child(0)->role(), QAccessible::StaticText);
    EXPECT_EQ(list->indexOfChild(list->child(0)), 0);
    stage.root->texts = numberedTexts(2);
    table.reloadData();
    EXPECT_EQ(find(stage.window, "velmora.empty"), nullptr);
    EXPECT_EQ(list->childCount(), 2);
}

TEST_F(NarrowTest, AnEmptyTableThatFitsItsRowsHasRoomForTheWords) {
    stage.root->texts.clear();
    TableView& table = stage.root->tableView();
    table.reloadData();
    table.sizeToFit();
    EXPECT_EQ(table.frame().height, 0);
    table.setEmptyText("None.");
    table.sizeToFit();
    EXPECT_EQ(table.frame().height, table.rowHeight());
}

TEST_F(NarrowTest, FingersGetAThinScrollBarOverTheRows) {
    static QPointingDevice* const device = QTest::createTouchDevice();
    stage.root->texts = numberedTexts(100);
    stage.root->tableView().reloadData();
    runUntilIdle(); // the ordinary bar comes when the loop turns
    auto& table = dynamic_cast<TableWidget&>(*stage.root->tableView().widget());
    QWidget* const viewport = table.viewport();
    QTest::mouseClick(viewport, Qt::LeftButton, {}, QPoint(20, 20));
    EXPECT_EQ(find(stage.window, "velmora.overlayScrollBar"), nullptr);
    EXPECT_TRUE(table.verticalScrollBar()->isVisible());
    EXPECT_LT(viewport->width(), 400);
    QTest::touchEvent(viewport, device).press(0, QPoint(20, 20), viewport);
    QTest::touchEvent(viewport, device).release(0, QPoint(20, 20), viewport);
    auto* const bar = dynamic_cast<OverlayScrollBar*>(find(stage.window, "velmora.overlayScrollBar"));
    ASSERT_NE(bar, nullptr);
    EXPECT_FALSE(table.verticalScrollBar()->isVisible());
    EXPECT_EQ(viewport->width(), 400);
    EXPECT_EQ(bar->geometry(), QRect(394, 0, 4, viewport->height()));
    EXPECT_EQ(bar->handle().top(), 2);
    EXPECT_LT(bar->handle().height(), viewport->height() / 5); // a tenth of the rows is seen
    stage.root->tableView().setContentOffset(1e6);
    EXPECT_EQ(bar->handle().bottom() + 1, viewport->height() - 2);
    EXPECT_EQ(table.rowAt(QPoint(396, 20)), table.rowAt(QPoint(20, 20))); // it takes no input
    QTest::mouseClick(viewport, Qt::LeftButton, {}, QPoint(20, 20));
    EXPECT_TRUE(table.verticalScrollBar()->isVisible());
    EXPECT_FALSE(bar->isVisible());
}

TEST_F(NarrowTest, ARowThatHasTheKeyboardStaysInSightWhereTheRoomShrinks) {
    stage.root->texts = numberedTexts(20);
    TableView& table = stage.root->tableView();
    table.reloadData();
    for (int i = 0; i < 8; ++i)
        QTest::keyClick(table.widget(), Qt::Key_Down);
    ASSERT_EQ(table.indexPathForFocusRow(), IndexPath(0, 8));
    resize(400, 360);
    const Rect place = table.rectForRow({0, 8});
    EXPECT_GE(place.y, 0);
    EXPECT_LE(place.y + place.height, table.bounds().height);
}

} // namespace
} // namespace velmora
