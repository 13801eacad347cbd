// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Scrolling/ScrollView.h"

#include "Toolkit/Label.h"

#include <QWidget>

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(ScrollViewTest, ItMovesAsFarAsItsContentIsWider) {
    ScrollView view;
    view.setFrame({5, 6, 320, 50});
    view.setContentSize({620, 50});
    EXPECT_EQ(view.contentSize(), (Size{620, 50}));
    EXPECT_EQ(view.maximumOffset(), 300);
    view.setContentOffset(120);
    EXPECT_EQ(view.contentOffset(), 120);
    view.setContentOffset(1000);
    EXPECT_EQ(view.contentOffset(), 300);
    view.setContentOffset(-1);
    EXPECT_EQ(view.contentOffset(), 0);
}

TEST(ScrollViewTest, WhatFitsStays) {
    ScrollView view;
    view.setFrame({0, 0, 320, 50});
    view.setContentSize({320, 50});
    EXPECT_EQ(view.maximumOffset(), 0);
    view.setContentOffset(10);
    EXPECT_EQ(view.contentOffset(), 0);
}

TEST(ScrollViewTest, AContentThatShrinksPullsTheOffsetAlong) {
    ScrollView view;
    view.setFrame({0, 0, 100, 50});
    view.setContentSize({300, 50});
    view.setContentOffset(200);
    view.setContentSize({150, 50});
    EXPECT_EQ(view.contentOffset(), 50);
}

TEST(ScrollViewTest, SubviewsLieOnTheContent) {
    ScrollView view;
    view.setFrame({0, 0, 100, 50});
    view.setContentSize({300, 50});
    Label label("value");
    view.addSubview(label);
    label.setFrame({160, 10, 80, 18});
    EXPECT_EQ(label.widget()->mapTo(view.widget(), QPoint()), QPoint(160, 10));
    view.setContentOffset(100);
    EXPECT_EQ(label.widget()->mapTo(view.widget(), QPoint()), QPoint(60, 10));
    EXPECT_EQ(label.frame(), (Rect{160, 10, 80, 18}));
    EXPECT_EQ(label.superview(), &view);
}

} // namespace
} // namespace velmora
