// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Scrolling/PageView.h"

#include "Tests/Toolkit/ToolkitTest.h"
#include "Toolkit/Button.h"

#include <QScrollArea>
#include <QTest>

namespace velmora {
namespace {

/// A page of 300 x 200 points that is 1000 high, with a button at its top and one at its end.
class PageViewTest : public ::testing::Test {
protected:
    PageViewTest() {
        static_cast<void>(testApplication());
        page.setFrame({0, 0, 300, 200});
        page.setContentHeight(1000);
        page.addSubview(top);
        page.addSubview(end);
        top.setFrame({0, 0, 100, 44});
        end.setFrame({0, 900, 100, 44});
        page.widget()->show();
        runUntilIdle();
    }
    [[nodiscard]] bool isInView(const Button& button) const {
        const QRect place(button.widget()->mapTo(page.widget(), QPoint()), button.widget()->size());
        return page.widget()->rect().contains(place);
    }
    void touch(const QPoint& place, const QPoint& to) {
        auto* const viewport = page.widget()->findChild<QWidget*>("qt_scrollarea_viewport");
        static QPointingDevice* const device = QTest::createTouchDevice();
        QTest::touchEvent(viewport, device).press(0, place);
        if (to != place)
            for (int step = 1; step <= 10; ++step) {
                QTest::qWait(5);
                QTest::touchEvent(viewport, device).move(0, place + (to - place) * step / 10);
            }
        QTest::touchEvent(viewport, device).release(0, to);
        runUntilIdle();
    }

    PageView page;
    Button top{"Top"};
    Button end{"End"};
};

TEST_F(PageViewTest, MovesNoFurtherThanItsContent) {
    EXPECT_EQ(page.contentWidth(), 300);
    page.setContentOffset(100);
    EXPECT_EQ(page.contentOffset(), 100);
    page.setContentOffset(5000);
    EXPECT_EQ(page.contentOffset(), 800);
    page.setContentOffset(-5);
    EXPECT_EQ(page.contentOffset(), 0);
}

TEST_F(PageViewTest, WhatFitsStays) {
    page.setContentHeight(150);
    page.setContentOffset(50);
    EXPECT_EQ(page.contentOffset(), 0);
}

TEST_F(PageViewTest, WhatGetsTheKeyboardComesIntoView) {
    EXPECT_FALSE(isInView(end));
    page.widget()->activateWindow();
    ASSERT_TRUE(eventually([this] { return page.widget()->isActiveWindow(); }));
    top.widget()->setFocus();
    QTest::keyClick(top.widget(), Qt::Key_Tab);
    runUntilIdle();
    EXPECT_TRUE(end.widget()->hasFocus());
    EXPECT_TRUE(isInView(end));
}

TEST_F(PageViewTest, ATapPressesWhatLiesThere) {
    int presses = 0;
    top.setAction([&presses] { ++presses; });
    touch({50, 22}, {50, 22});
    EXPECT_EQ(presses, 1);
}

TEST_F(PageViewTest, AStrokeMovesThePageAndPressesNothing) {
    int presses = 0;
    end.setAction([&presses] { ++presses; });
    page.setContentOffset(800);
    touch({50, 120}, {50, 190});
    EXPECT_LT(page.contentOffset(), 800);
    EXPECT_EQ(presses, 0);
}

} // namespace
} // namespace velmora
