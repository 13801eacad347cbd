// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Bars/SaveButton.h"

#include <QTest>

#include <stdexcept>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class NavigationTest : public ::testing::Test, public NavigationControllerDelegate {
protected:
    NavigationTest() : stage(make("root")) { stage.stack->setDelegate(this); }

    void willShowViewController(NavigationController& navigationController, ViewController& viewController,
                                bool animated) override {
        EXPECT_EQ(navigationController.topViewController().get(), &viewController);
        diary.push_back(viewController.title() + (animated ? ":will show animated" : ":will show"));
    }
    std::shared_ptr<ListPane> make(const std::string& title) {
        auto pane = std::make_shared<ListPane>(numberedTexts(3), title);
        pane->diary = &diary;
        return pane;
    }
    std::shared_ptr<ListPane> push(const std::string& title, bool animated = false) {
        auto pane = make(title);
        stage.stack->pushViewController(pane, animated);
        return pane;
    }
    [[nodiscard]] std::vector<std::string> titles() const {
        std::vector<std::string> found;
        for (const auto& pane : stage.stack->viewControllers())
            found.push_back(pane->title());
        return found;
    }
    void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
        QTest::keyClick(stage.window.widget()->focusWidget(), key, modifiers);
    }

    std::vector<std::string> diary;
    Stage stage;
    ReducedMotion noMotion;
};

TEST_F(NavigationTest, TheRootIsAnnouncedAsTheStackComesOntoTheScreen) {
    EXPECT_THAT(diary, IsEmpty());
    stage.show();
    EXPECT_THAT(diary, ElementsAre("root:will show", "root:will appear", "root:did appear"));
    EXPECT_EQ(textOf(find(stage.window, "velmora.title")), "root");
    EXPECT_EQ(find(stage.window, "velmora.back"), nullptr);
    EXPECT_EQ(stage.window.widget()->windowTitle().toStdString(), "root");
}

TEST_F(NavigationTest, PushShowsTheNewPane) {
    stage.show();
    diary.clear();
    const auto pane = push("child");
    EXPECT_THAT(diary, ElementsAre("root:will disappear", "child:will show", "child:will appear",
                                   "root:did disappear", "child:did appear"));
    EXPECT_THAT(titles(), ElementsAre("root", "child"));
    EXPECT_EQ(stage.stack->topViewController(), pane);
    EXPECT_EQ(pane->navigationController(), stage.stack.get());
    EXPECT_EQ(textOf(find(stage.window, "velmora.title")), "child");
    EXPECT_EQ(textOf(find(stage.window, "velmora.back")), "root");
    EXPECT_TRUE(pane->view().widget()->isVisible());
    EXPECT_FALSE(stage.root->view().widget()->isVisible());
    EXPECT_TRUE(pane->tableView().isFirstResponder());
}

TEST_F(NavigationTest, PopUncoversThePaneBelow) {
    stage.show();
    const auto pane = push("child");
    diary.clear();
    EXPECT_EQ(stage.stack->popViewController(false), pane);
    EXPECT_THAT(diary, ElementsAre("child:will disappear", "root:will show", "root:will appear",
                                   "child:did disappear", "root:did appear"));
    EXPECT_EQ(pane->navigationController(), nullptr);
    EXPECT_TRUE(stage.root->tableView().isFirstResponder());
    EXPECT_EQ(find(stage.window, "velmora.back"), nullptr);
    diary.clear();
    EXPECT_EQ(stage.stack->popViewController(false), nullptr);
    EXPECT_THAT(diary, IsEmpty());
}

TEST_F(NavigationTest, PopToAGivenPaneSkipsThoseBetween) {
    stage.show();
    push("one");
    push("two");
    push("three");
    diary.clear();
    const auto popped = stage.stack->popToViewController(*stage.root, true);
    ASSERT_EQ(popped.size(), 3U);
    EXPECT_EQ(popped[0]->title(), "one");
    EXPECT_EQ(popped[2]->title(), "three");
    EXPECT_THAT(diary, ElementsAre("three:will disappear", "root:will show animated", "root:will appear",
                                   "three:did disappear", "root:did appear"));
    EXPECT_THAT(stage.stack->popToViewController(*stage.root, false), IsEmpty());
    EXPECT_THAT(stage.stack->popToViewController(*popped[0], false), IsEmpty());
}

TEST_F(NavigationTest, TheBackButtonAndTheKeysGoBack) {
    stage.show();
    push("one");
    push("two");
    push("three");
    push("four");
    diary.clear();
    QTest::mouseClick(find(stage.window, "velmora.back"), Qt::LeftButton);
    EXPECT_THAT(titles(), ElementsAre("root", "one", "two", "three"));
    EXPECT_EQ(diary[1], "three:will show animated");
    press(Qt::Key_Escape);
    EXPECT_THAT(titles(), ElementsAre("root", "one", "two"));
    press(Qt::Key_Left, Qt::AltModifier);
    EXPECT_THAT(titles(), ElementsAre("root", "one"));
    press(Qt::Key_Back);
    EXPECT_THAT(titles(), ElementsAre("root"));
    press(Qt::Key_Escape);
    EXPECT_THAT(titles(), ElementsAre("root"));
}

TEST_F(NavigationTest, EnterOnAFocusedBackButtonPops) {
    stage.show();
    push("one");
    QWidget* const back = find(stage.window, "velmora.back");
    back->setFocus();
    QTest::keyClick(back, Qt::Key_Return);
    EXPECT_THAT(titles(), ElementsAre("root"));
}

TEST_F(NavigationTest, TheWholeWayByKeyboard) {
    stage.root->onChoose = [this](std::size_t row) { push("child " + std::to_string(row)); };
    stage.show();
    press(Qt::Key_Down);
    press(Qt::Key_Down);
    press(Qt::Key_Return);
    EXPECT_THAT(titles(), ElementsAre("root", "child 2"));
    press(Qt::Key_Escape);
    EXPECT_THAT(titles(), ElementsAre("root"));
    EXPECT_EQ(stage.root->tableView().indexPathForFocusRow(), IndexPath(0, 2));
    EXPECT_TRUE(stage.root->tableView().indexPathForSelectedRow().isNull()); // unselected as it comes back
}

TEST_F(NavigationTest, PanesPushedBeforeTheStackIsShown) {
    push("one");
    EXPECT_THAT(diary, IsEmpty());
    stage.show();
    EXPECT_THAT(diary, ElementsAre("one:will show", "one:will appear", "one:did appear"));
    EXPECT_EQ(textOf(find(stage.window, "velmora.back")), "root");
}

TEST_F(NavigationTest, AHiddenWindowsStackMayChange) {
    stage.show();
    push("one");
    stage.window.setHidden(true);
    EXPECT_TRUE(stage.window.isHidden());
    stage.stack->popViewController(true);
    diary.clear();
    stage.window.setHidden(false);
    EXPECT_THAT(diary, ElementsAre("root:will show", "root:will appear", "root:did appear"));
    EXPECT_TRUE(stage.root->view().widget()->isVisible());
}

TEST_F(NavigationTest, TitlesFollow) {
    stage.show();
    push("child");
    stage.stack->topViewController()->setTitle("renamed");
    EXPECT_EQ(textOf(find(stage.window, "velmora.title")), "renamed");
    stage.root->setTitle("home");
    EXPECT_EQ(textOf(find(stage.window, "velmora.back")), "home");
}

TEST_F(NavigationTest, WhatIsOnAStackCantBePushed) {
    stage.show();
    EXPECT_THROW(stage.stack->pushViewController(stage.root, false), std::invalid_argument);
    EXPECT_THROW(stage.stack->pushViewController(nullptr, false), std::invalid_argument);
    EXPECT_THROW(NavigationController(nullptr), std::invalid_argument);
    EXPECT_THAT(titles(), ElementsAre("root"));
}

/// With animations enabled.
class NavigationMotionTest : public NavigationTest {
protected:
    NavigationMotionTest() { qunsetenv("VELMORA_REDUCED_MOTION"); }
};

TEST_F(NavigationMotionTest, AnAnimatedPushMovesInFromTheRight) {
    stage.show();
    diary.clear();
    const auto pane = push("child", true);
    EXPECT_THAT(diary, ElementsAre("root:will disappear", "child:will show animated", "child:will appear"));
    EXPECT_EQ(stage.stack->topViewController(), pane);
    EXPECT_EQ(pane->view().widget()->x(), 400);
    EXPECT_TRUE(stage.root->view().widget()->isVisible());
    EXPECT_TRUE(eventually([&] { return diary.back() == "child:did appear"; }));
    EXPECT_EQ(pane->view().widget()->x(), 0);
    EXPECT_FALSE(stage.root->view().widget()->isVisible());
}

TEST_F(NavigationMotionTest, TheNextOperationCutsAMovementShort) {
    stage.show();
    push("child", true);
    diary.clear();
    stage.stack->popViewController(true);
    EXPECT_THAT(diary, ElementsAre("root:did disappear", "child:did appear", "child:will disappear",
                                   "root:will show animated", "root:will appear"));
    EXPECT_TRUE(eventually([&] { return diary.back() == "root:did appear"; }));
    EXPECT_TRUE(stage.root->view().widget()->isVisible());
    EXPECT_EQ(stage.root->view().widget()->x(), 0);
}

TEST_F(NavigationMotionTest, AClickOnThePaneThatLeavesDoesNothing) {
    stage.root->onChoose = [this](std::size_t) { push("child", true); };
    stage.show();
    QWidget* const window = stage.window.widget();
    QTest::mouseClick(window->windowHandle(), Qt::LeftButton, {}, QPoint(20, 60));
    QTest::mouseClick(window->windowHandle(), Qt::LeftButton, {}, QPoint(20, 60));
    EXPECT_THAT(titles(), ElementsAre("root", "child"));
}

TEST_F(NavigationMotionTest, NothingMovesUnasked) {
    stage.show();
    const auto pane = push("child", false);
    EXPECT_EQ(pane->view().widget()->x(), 0);
    EXPECT_EQ(diary.back(), "child:did appear");
}

TEST_F(NavigationMotionTest, AWindowThatIsResizedEndsTheMovement) {
    stage.show();
    push("child", true);
    stage.window.widget()->resize(500, 604);
    runUntilIdle();
    EXPECT_EQ(diary.back(), "child:did appear");
    EXPECT_EQ(stage.stack->topViewController()->view().frame(), (Rect{0, 0, 500, 552}));
}

/// A stack may go while panes are on it and on their way.
TEST_F(NavigationMotionTest, AStackMayGoInMidMovement) {
    const auto root = make("root");
    auto stack = std::make_shared<NavigationController>(root);
    Window window({0, 0, 300, 400});
    window.setRootViewController(stack);
    window.makeKeyAndVisible();
    stack->pushViewController(make("child"), true);
    window.setRootViewController(nullptr);
    stack.reset();
    EXPECT_EQ(root->navigationController(), nullptr);
    runUntilIdle();
}

} // namespace
} // namespace velmora
