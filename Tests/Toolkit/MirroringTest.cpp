// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// The layout of languages that are written from right to left.

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Bars/FlexibleSpace.h"
#include "Toolkit/Bars/LabelItem.h"
#include "Toolkit/Bars/SaveButton.h"
#include "Toolkit/Label.h"
#include "Toolkit/Scrolling/ScrollView.h"

#include <QGuiApplication>
#include <QImage>
#include <QTest>

namespace velmora {
namespace {

bool hasInk(const QImage& image, const QRect& area) {
    for (int y = area.top(); y <= area.bottom(); ++y)
        for (int x = area.left(); x <= area.right(); ++x)
            if (image.pixel(x, y) != image.pixel(area.topLeft()))
                return true;
    return false;
}

class MirroringTest : public ::testing::Test {
protected:
    MirroringTest() { QGuiApplication::setLayoutDirection(Qt::RightToLeft); }
    ~MirroringTest() override { QGuiApplication::setLayoutDirection(Qt::LeftToRight); }

    static QImage picture(const std::string& text, TextAlignment alignment) {
        Label label(text);
        label.setTextAlignment(alignment);
        label.setFrame({0, 0, 200, 30});
        return label.widget()->grab().toImage();
    }
};

TEST_F(MirroringTest, FramesCountFromTheRightEdge) {
    View outer;
    outer.setFrame({0, 0, 300, 100});
    View inner;
    inner.setFrame({10, 5, 50, 20});
    outer.addSubview(inner);
    EXPECT_EQ(inner.widget()->geometry(), QRect(240, 5, 50, 20));
    EXPECT_EQ(inner.frame(), (Rect{10, 5, 50, 20}));
    outer.setFrame({0, 0, 400, 100});
    EXPECT_EQ(inner.widget()->x(), 340);
    inner.setFrame({20, 5, 50, 20});
    EXPECT_EQ(inner.widget()->x(), 330);
}

TEST_F(MirroringTest, FollowsAChangeOfTheLayout) {
    Stage stage(std::make_shared<ListPane>(numberedTexts(3)));
    stage.show();
    TableCell& cell = *stage.root->cell(0);
    cell.setAccessory(TableCellAccessory::disclosureIndicator);
    EXPECT_EQ(cell.contentView().widget()->x(), 30);
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    runUntilIdle();
    EXPECT_EQ(cell.contentView().widget()->x(), 0);
}

TEST_F(MirroringTest, TextIsAtTheOtherSideInItsOwnOrder) {
    for (const char* const text : {"-80 dBm", "Connecting...", "[Reserved 4]"}) {
        const QImage mirrored = picture(text, TextAlignment::left);
        const QImage mirroredRight = picture(text, TextAlignment::right);
        QGuiApplication::setLayoutDirection(Qt::LeftToRight);
        EXPECT_EQ(mirrored, picture(text, TextAlignment::right)) << text;
        EXPECT_EQ(mirroredRight, picture(text, TextAlignment::left)) << text;
        EXPECT_NE(mirrored, mirroredRight) << text;
        QGuiApplication::setLayoutDirection(Qt::RightToLeft);
    }
}

TEST_F(MirroringTest, RowsOpenToTheLeft) {
    Stage stage(std::make_shared<ListPane>(numberedTexts(3)));
    stage.show();
    TableCell& cell = *stage.root->cell(0);
    for (const TableCellAccessory accessory :
         {TableCellAccessory::disclosureIndicator, TableCellAccessory::checkMark}) {
        cell.setAccessory(accessory);
        runUntilIdle();
        const QImage image = cell.widget()->grab().toImage();
        EXPECT_TRUE(hasInk(image, {2, 2, 34, 38}));
        EXPECT_FALSE(hasInk(image, {image.width() - 8, 2, 6, 38}));
    }
}

TEST_F(MirroringTest, BarsAreMirrored) {
    Stage stage(std::make_shared<ListPane>(numberedTexts(3), "Root"));
    stage.stack->setToolbarHidden(false);
    stage.show();
    stage.stack->pushViewController(std::make_shared<ListPane>(numberedTexts(3), "Child"), false);
    stage.stack->topViewController()->setToolbarItems({std::make_shared<LabelItem>("Status"),
                                                       std::make_shared<FlexibleSpace>(),
                                                       std::make_shared<SaveButton>(nullptr)},
                                                      false);
    runUntilIdle();
    EXPECT_EQ(find(stage.window, "velmora.back")->geometry().right() + 1, 400 - 4);
    EXPECT_EQ(find(stage.window, "velmora.save")->x(), 12);
    EXPECT_EQ(find(stage.window, "velmora.status")->geometry().right() + 1, 400 - 12);
    EXPECT_NEAR(find(stage.window, "velmora.title")->geometry().center().x(), 200, 1);
    QTest::keyClick(stage.window.widget()->focusWidget(), Qt::Key_Left, Qt::AltModifier);
    EXPECT_EQ(stage.stack->viewControllers().size(), 2u);
    QTest::keyClick(stage.window.widget()->focusWidget(), Qt::Key_Right, Qt::AltModifier);
    EXPECT_EQ(stage.stack->viewControllers().size(), 1u);
}

TEST_F(MirroringTest, WideContentBeginsAtTheRightEdge) {
    View outer;
    outer.setFrame({0, 0, 100, 50});
    ScrollView view;
    outer.addSubview(view);
    view.setFrame({0, 0, 100, 50});
    view.setContentSize({300, 50});
    Label label("value");
    view.addSubview(label);
    label.setFrame({160, 10, 80, 18});
    // 160 from the content's right edge, which is at the view's.
    EXPECT_EQ(label.widget()->mapTo(view.widget(), QPoint()), QPoint(100 - 160 - 80, 10));
    view.setContentOffset(100);
    EXPECT_EQ(label.widget()->mapTo(view.widget(), QPoint()), QPoint(0 - 40, 10));
    view.setContentOffset(1000);
    EXPECT_EQ(view.contentOffset(), 200);
    EXPECT_EQ(label.widget()->mapTo(view.widget(), QPoint()), QPoint(60, 10));
}

} // namespace
} // namespace velmora
