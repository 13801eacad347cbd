// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Button.h"
#include "Toolkit/Label.h"

#include <QTest>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class Counting : public View {
public:
    void layoutSubviews() override { ++layouts; }
    int layouts = 0;
};

TEST(ViewTest, FramesReadBackAsTheyWereSet) {
    Counting view;
    view.setFrame({1.25, 2.5, 30.75, 4});
    EXPECT_EQ(view.frame(), (Rect{1.25, 2.5, 30.75, 4}));
    EXPECT_EQ(view.bounds(), (Rect{0, 0, 30.75, 4}));
    EXPECT_EQ(view.widget()->geometry(), QRect(1, 3, 31, 4));
    EXPECT_EQ(view.layouts, 1);
    view.setFrame({9, 9, 30.75, 4}); // moved, not resized
    EXPECT_EQ(view.layouts, 1);
}

TEST(ViewTest, SubviewsAreShownNotOwned) {
    View outer;
    Label first("a");
    auto second = std::make_unique<Label>("b");
    outer.addSubview(first);
    outer.addSubview(*second);
    EXPECT_THAT(outer.subviews(), ElementsAre(&first, second.get()));
    EXPECT_EQ(first.superview(), &outer);
    second.reset();
    EXPECT_THAT(outer.subviews(), ElementsAre(&first));
    View other;
    other.addSubview(first);
    EXPECT_THAT(outer.subviews(), IsEmpty());
    EXPECT_EQ(first.superview(), &other);
    first.removeFromSuperview();
    EXPECT_EQ(first.superview(), nullptr);
}

TEST(ViewTest, ASubviewOutlivesItsSuperview) {
    Label label("text");
    {
        View outer;
        outer.addSubview(label);
    }
    runUntilIdle();
    EXPECT_EQ(label.superview(), nullptr);
    EXPECT_EQ(label.text(), "text");
    EXPECT_NE(label.widget(), nullptr);
}

class ShownView : public ::testing::Test {
protected:
    ShownView() : window({0, 0, 300, 400}), screen(std::make_shared<ViewController>()) {
        window.setRootViewController(screen);
        window.makeKeyAndVisible();
    }
    void click(QPoint place) const {
        QTest::mouseClick(window.widget()->windowHandle(), Qt::LeftButton, {}, place);
    }

    Window window;
    std::shared_ptr<ViewController> screen;
};

TEST_F(ShownView, ATapIsTheBackgroundsUnlessASubviewTakesIt) {
    int taps = 0;
    int presses = 0;
    screen->view().setOnTap([&] { ++taps; });
    Label label("text");
    label.setFrame({0, 0, 100, 50});
    Button button("Press");
    button.setFrame({0, 100, 100, 50});
    button.setAction([&] { ++presses; });
    screen->view().addSubview(label);
    screen->view().addSubview(button);
    click({200, 200});
    EXPECT_EQ(taps, 1);
    click({50, 25}); // a label takes no taps
    EXPECT_EQ(taps, 2);
    click({50, 125});
    EXPECT_EQ(taps, 2);
    EXPECT_EQ(presses, 1);
}

TEST_F(ShownView, AHiddenViewIsNotThere) {
    Button button("Press");
    button.setFrame({0, 0, 100, 50});
    screen->view().addSubview(button);
    EXPECT_TRUE(button.widget()->isVisible());
    button.setHidden(true);
    EXPECT_TRUE(button.isHidden());
    EXPECT_FALSE(button.widget()->isVisible());
    EXPECT_FALSE(button.becomeFirstResponder());
    button.setHidden(false);
    EXPECT_TRUE(button.becomeFirstResponder());
    EXPECT_TRUE(button.isFirstResponder());
    screen->resignFirstResponder();
    EXPECT_FALSE(button.isFirstResponder());
}

TEST_F(ShownView, AnActionMayDestroyItsButton) {
    auto button = std::make_unique<Button>("Go");
    button->setFrame({0, 0, 100, 50});
    button->setAction([&] { button.reset(); });
    screen->view().addSubview(*button);
    click({50, 25});
    EXPECT_EQ(button, nullptr);
    runUntilIdle();
    EXPECT_THAT(screen->view().subviews(), IsEmpty());
}

TEST_F(ShownView, Buttons) {
    int presses = 0;
    Button button("Save & close", ButtonRole::save);
    button.setAction([&] { ++presses; });
    EXPECT_EQ(button.title(), "Save & close");
    button.sizeToFit();
    EXPECT_GE(button.bounds().height, 44);
    button.press();
    EXPECT_EQ(presses, 1);
    button.setEnabled(false);
    button.press();
    EXPECT_EQ(presses, 1);
}

} // namespace
} // namespace velmora
