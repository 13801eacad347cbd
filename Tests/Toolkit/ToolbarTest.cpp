// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Bars/FlexibleSpace.h"
#include "Toolkit/Bars/LabelItem.h"
#include "Toolkit/Bars/SaveButton.h"
#include "Toolkit/BusyIndicator.h"
#include "Toolkit/Widgets/SpinnerWidget.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QTest>

#include <cmath>

namespace velmora {
namespace {

class ToolbarTest : public ::testing::Test {
protected:
    ToolbarTest() : stage(std::make_shared<ListPane>(numberedTexts(3), "root")) {
        stage.stack->setToolbarHidden(false);
        stage.show();
    }

    /// What a measurement pane shows.
    void fill(const std::string& status, bool isLoading, bool offersSave = true) {
        busy = std::make_shared<BusyIndicator>();
        if (isLoading)
            busy->startAnimating();
        label = std::make_shared<LabelItem>(status);
        std::vector<std::shared_ptr<ToolbarItem>> items{busy, label, std::make_shared<FlexibleSpace>()};
        if (offersSave)
            items.push_back(std::make_shared<SaveButton>([this] {
                ++saves;
                if (onSave)
                    onSave();
            }));
        stage.stack->topViewController()->setToolbarItems(std::move(items), true);
        runUntilIdle();
    }
    [[nodiscard]] QWidget* item(const char* name) const { return find(stage.window, name); }

    Stage stage;
    std::shared_ptr<BusyIndicator> busy;
    std::shared_ptr<LabelItem> label;
    int saves = 0;
    std::function<void()> onSave;
};

TEST_F(ToolbarTest, ItemsAreOrderedFromLeftToRight) {
    fill("Connecting...", true);
    QWidget* const toolbar = item("velmora.toolbar");
    ASSERT_NE(toolbar, nullptr);
    EXPECT_EQ(textOf(item("velmora.status")), "Connecting...");
    EXPECT_EQ(textOf(item("velmora.save")), "Save");
    EXPECT_LT(item("velmora.busy")->geometry().right(), item("velmora.status")->x());
    EXPECT_LT(item("velmora.status")->geometry().right(), item("velmora.save")->x());
    EXPECT_EQ(item("velmora.save")->geometry().right() + 1, 400 - 12);
    EXPECT_GE(item("velmora.save")->height(), 44);
    const Size text = sizeOfText("Connecting...", Font::systemFontOfSize(14));
    EXPECT_EQ(item("velmora.status")->width(), static_cast<int>(std::ceil(text.width)));
    EXPECT_EQ(toolbar->geometry().bottom() + 1, 604);
}

TEST_F(ToolbarTest, AStoppedIndicatorIsHiddenAndCostsNothing) {
    fill("", true);
    auto* const spinner = static_cast<SpinnerWidget*>(item("velmora.busy"));
    ASSERT_NE(spinner, nullptr);
    EXPECT_TRUE(spinner->isTurning());
    busy->stopAnimating();
    EXPECT_FALSE(spinner->isVisible());
    EXPECT_FALSE(spinner->isTurning());
    busy->setHidesWhenStopped(false);
    EXPECT_TRUE(spinner->isVisible());
    EXPECT_FALSE(spinner->isTurning());
    busy->startAnimating();
    stage.window.setHidden(true);
    EXPECT_FALSE(spinner->isTurning());
}

TEST_F(ToolbarTest, AnIndicatorIsStillWithReducedMotion) {
    const ReducedMotion noMotion;
    fill("", true);
    auto* const spinner = static_cast<SpinnerWidget*>(item("velmora.busy"));
    ASSERT_NE(spinner, nullptr);
    EXPECT_TRUE(spinner->isSpinning());
    EXPECT_FALSE(spinner->isTurning());
}

TEST_F(ToolbarTest, LikeItemsKeepWhatIsOnTheScreen) {
    fill("Connecting...", true);
    QWidget* const spinner = item("velmora.busy");
    QWidget* const status = item("velmora.status");
    QWidget* const save = item("velmora.save");
    save->setFocus();
    fill("Updated 2026-11-16 at 05:02:40", true);
    EXPECT_EQ(item("velmora.busy"), spinner);
    EXPECT_EQ(item("velmora.status"), status);
    EXPECT_EQ(item("velmora.save"), save);
    EXPECT_EQ(textOf(status), "Updated 2026-11-16 at 05:02:40");
    EXPECT_EQ(stage.window.widget()->focusWidget(), save);
}

TEST_F(ToolbarTest, AClickOutlivesAReplacementUnderTheMouse) {
    fill("one", false);
    QWidget* const save = item("velmora.save");
    QTest::mousePress(save, Qt::LeftButton);
    fill("two", false);
    QTest::mouseRelease(save, Qt::LeftButton);
    EXPECT_EQ(saves, 1);
}

TEST_F(ToolbarTest, ItemsComeAndGo) {
    fill("text", false);
    fill("text", false, false);
    EXPECT_EQ(item("velmora.save"), nullptr);
    EXPECT_EQ(textOf(item("velmora.status")), "text");
    stage.stack->topViewController()->setToolbarItems({}, false);
    EXPECT_EQ(item("velmora.status"), nullptr);
    fill("again", false);
    EXPECT_NE(item("velmora.save"), nullptr);
}

TEST_F(ToolbarTest, SaveByMouseAndKeyboard) {
    fill("text", false);
    QTest::mouseClick(item("velmora.save"), Qt::LeftButton);
    EXPECT_EQ(saves, 1);
    QTest::keyClick(stage.window.widget()->focusWidget(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(saves, 2);
    stage.root->view().becomeFirstResponder();
    for (int count = 0; count < 5 && stage.window.widget()->focusWidget() != item("velmora.save"); ++count)
        QTest::keyClick(stage.window.widget()->focusWidget(), Qt::Key_Tab);
    QTest::keyClick(stage.window.widget()->focusWidget(), Qt::Key_Return);
    EXPECT_EQ(saves, 3);
}

TEST_F(ToolbarTest, TheActionMayReplaceTheItems) {
    onSave = [this] { stage.stack->topViewController()->setToolbarItems({}, false); };
    fill("text", false);
    QTest::mouseClick(item("velmora.save"), Qt::LeftButton);
    EXPECT_EQ(saves, 1);
    runUntilIdle();
    EXPECT_EQ(item("velmora.save"), nullptr);
    QTest::keyClick(stage.window.widget(), Qt::Key_S, Qt::ControlModifier); // nothing to press
    EXPECT_EQ(saves, 1);
}

TEST_F(ToolbarTest, ThePaneOnTopHasTheToolbar) {
    fill("root's", false);
    const auto child = std::make_shared<ListPane>(numberedTexts(1), "child");
    child->setToolbarItems({std::make_shared<LabelItem>("child's")}, false);
    stage.stack->pushViewController(child, false);
    EXPECT_EQ(textOf(item("velmora.status")), "child's");
    EXPECT_EQ(item("velmora.save"), nullptr);
    stage.root->setToolbarItems({std::make_shared<LabelItem>("root's new")}, false);
    EXPECT_EQ(textOf(item("velmora.status")), "child's");
    stage.stack->popViewController(false);
    EXPECT_EQ(textOf(item("velmora.status")), "root's new");
}

TEST_F(ToolbarTest, AHiddenToolbarLeavesItsRoomToThePane) {
    EXPECT_EQ(stage.root->view().bounds().height, 604 - 52 - 52);
    stage.stack->setToolbarHidden(true);
    EXPECT_EQ(stage.root->view().bounds().height, 604 - 52);
    EXPECT_EQ(item("velmora.toolbar"), nullptr);
}

TEST_F(ToolbarTest, AStatusWithoutRoomBeginsWithAnEllipsis) {
    fill(std::string(200, 'm'), false);
    auto* const status = static_cast<LabelWidget*>(item("velmora.status"));
    EXPECT_LT(status->geometry().right(), item("velmora.save")->x());
    EXPECT_TRUE(status->shownText().startsWith(QChar(0x2026)));
    EXPECT_EQ(item("velmora.save")->geometry().right() + 1, 400 - 12);
}

TEST_F(ToolbarTest, ALabelItemIsRedrawnWhenItChanges) {
    fill("one", false);
    label->setText("two");
    EXPECT_EQ(textOf(item("velmora.status")), "two");
    auto* const status = static_cast<LabelWidget*>(item("velmora.status"));
    EXPECT_EQ(status->shownColor(), status->palette().color(QPalette::WindowText));
    label->setTextColor(Color::secondary);
    EXPECT_EQ(status->shownColor(), status->palette().color(QPalette::PlaceholderText));
}

} // namespace
} // namespace velmora
