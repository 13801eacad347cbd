// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Button.h"
#include "Toolkit/TextField.h"

#include <QTest>

#include <stdexcept>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

/// A field and two buttons.
class Form : public ViewController {
public:
    void viewDidLoad() override {
        setTitle("Form");
        field.setFrame({16, 16, 200, 44});
        save.setFrame({16, 70, 90, 44});
        cancel.setFrame({120, 70, 90, 44});
        view().addSubview(field);
        view().addSubview(save);
        view().addSubview(cancel);
        save.setAction([this] { log.emplace_back("save"); });
        cancel.setAction([this] {
            log.emplace_back("cancel");
            dismissModalViewController(false);
        });
    }
    void viewWillAppear(bool animated) override {
        log.emplace_back(animated ? "will appear animated" : "will appear");
        view().setFrame({1, 2, 3, 4}); // the sheet decides
    }
    void viewDidAppear(bool /*animated*/) override { log.emplace_back("did appear"); }
    void viewWillDisappear(bool /*animated*/) override { log.emplace_back("will disappear"); }
    void viewDidDisappear(bool /*animated*/) override { log.emplace_back("did disappear"); }

    TextField field;
    Button save{"Save", ButtonRole::save};
    Button cancel{"Cancel", ButtonRole::cancel};
    std::vector<std::string> log;
};

class ModalTest : public ::testing::Test {
protected:
    ModalTest() : stage(std::make_shared<ListPane>(numberedTexts(3), "root")) { stage.show(); }

    std::shared_ptr<Form> present(bool animated = false) {
        auto form = std::make_shared<Form>();
        stage.stack->presentModalViewController(form, animated);
        return form;
    }
    void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
        QTest::keyClick(stage.window.widget()->focusWidget(), key, modifiers);
    }

    Stage stage;
};

TEST_F(ModalTest, ASheetLiesOverTheStack) {
    const auto form = present();
    EXPECT_THAT(form->log, ElementsAre("will appear", "did appear"));
    EXPECT_EQ(stage.stack->modalViewController(), form);
    EXPECT_EQ(form->presentingViewController(), stage.stack.get());
    EXPECT_EQ(form->view().frame(), (Rect{0, 0, 400, 580})); // 24 points of the stack show above
    EXPECT_TRUE(form->field.widget()->isVisible());
    stage.stack->dismissModalViewController(false);
    EXPECT_THAT(form->log, ElementsAre("will appear", "did appear", "will disappear", "did disappear"));
    EXPECT_EQ(stage.stack->modalViewController(), nullptr);
    EXPECT_EQ(form->presentingViewController(), nullptr);
    EXPECT_EQ(form.use_count(), 1);
    runUntilIdle();
    EXPECT_EQ(find(stage.window, "velmora.sheet"), nullptr);
}

TEST_F(ModalTest, OneSheetAtATime) {
    const auto form = present();
    EXPECT_THROW(present(), std::logic_error);
    EXPECT_THROW(stage.root->presentModalViewController(form, false), std::logic_error);
    EXPECT_EQ(stage.stack->modalViewController(), form);
    stage.stack->dismissModalViewController(false);
    stage.stack->dismissModalViewController(false);
    const auto second = present();
    EXPECT_EQ(stage.stack->modalViewController(), second);
}

TEST_F(ModalTest, AScreenInNoWindowPresentsNone) {
    ListPane lonely({});
    EXPECT_THROW(lonely.presentModalViewController(std::make_shared<Form>(), false), std::logic_error);
}

TEST_F(ModalTest, EscapePressesCancel) {
    const auto form = present();
    press(Qt::Key_Escape);
    EXPECT_THAT(form->log,
                ElementsAre("will appear", "did appear", "cancel", "will disappear", "did disappear"));
    EXPECT_TRUE(stage.root->tableView().isFirstResponder()); // who had the keyboard has it again
}

TEST_F(ModalTest, EscapeDismissesASheetWithoutCancel) {
    const auto plain = std::make_shared<ViewController>();
    stage.stack->presentModalViewController(plain, false);
    press(Qt::Key_Escape);
    EXPECT_TRUE(eventually([&] { return stage.stack->modalViewController() == nullptr; }));
}

TEST_F(ModalTest, CtrlSPressesSave) {
    const auto form = present();
    form->field.becomeFirstResponder();
    press(Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(form->log.back(), "save");
    form->field.resignFirstResponder();
    QTest::keyClick(stage.window.widget(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(std::count(form->log.begin(), form->log.end(), "save"), 2);
}

TEST_F(ModalTest, WindowsCommandIsCalledWhateverHasTheFocus) {
    int calls = 0;
    stage.window.setCommand('M', [&calls] { ++calls; });
    press(Qt::Key_M, Qt::ControlModifier);
    EXPECT_EQ(calls, 1);
    press(Qt::Key_M);
    press(Qt::Key_M, Qt::ControlModifier | Qt::ShiftModifier);
    press(Qt::Key_L, Qt::ControlModifier);
    EXPECT_EQ(calls, 1);
    const auto form = present();
    press(Qt::Key_M, Qt::ControlModifier);
    EXPECT_EQ(calls, 2);
    form->field.becomeFirstResponder();
    press(Qt::Key_M, Qt::ControlModifier);
    EXPECT_EQ(calls, 3);
    EXPECT_EQ(form->field.text(), "");
}

TEST_F(ModalTest, WhatIsBelowIsOutOfReach) {
    const auto form = present();
    QTest::mouseClick(stage.window.widget()->windowHandle(), Qt::LeftButton, {}, QPoint(200, 10));
    QTest::mouseClick(stage.window.widget()->windowHandle(), Qt::LeftButton, {}, QPoint(300, 500));
    EXPECT_THAT(stage.root->chosen, IsEmpty());
    form->field.becomeFirstResponder();
    std::vector<QWidget*> way;
    for (int count = 0; count < 4; ++count) {
        press(Qt::Key_Tab);
        way.push_back(stage.window.widget()->focusWidget());
    }
    EXPECT_THAT(way, ElementsAre(form->save.widget(), form->cancel.widget(), form->field.widget(),
                                 form->save.widget()));
}

TEST_F(ModalTest, AStackBelowMayChangeWithoutTakingTheKeyboard) {
    const auto form = present();
    form->field.becomeFirstResponder();
    stage.stack->pushViewController(std::make_shared<ListPane>(numberedTexts(2), "child"), false);
    EXPECT_TRUE(form->field.isFirstResponder());
    stage.stack->dismissModalViewController(false);
    EXPECT_TRUE(stage.stack->topViewController()->view().isFirstResponder());
}

TEST_F(ModalTest, AnAnimatedSheetSlidesInAndOutAtTheBottom) {
    const auto form = present(true);
    EXPECT_THAT(form->log, ElementsAre("will appear animated"));
    const auto top = [&] { return form->view().widget()->mapTo(stage.window.widget(), QPoint()).y(); };
    EXPECT_EQ(top(), 604);
    EXPECT_TRUE(eventually([&] { return form->log.back() == "did appear"; }));
    EXPECT_EQ(top(), 24);
    std::weak_ptr<Form> watch = form;
    stage.stack->dismissModalViewController(true);
    EXPECT_EQ(stage.stack->modalViewController(), nullptr);
    const auto second = present(true); // while the first is on its way out
    EXPECT_TRUE(eventually([&] { return form->log.back() == "did disappear"; }));
    EXPECT_TRUE(eventually([&] { return second->log.back() == "did appear"; }));
    runUntilIdle();
    EXPECT_EQ(watch.use_count(), 1);
}

TEST_F(ModalTest, NoMotionWhereNoneIsWanted) {
    const ReducedMotion noMotion;
    const auto form = present(true);
    EXPECT_EQ(form->log.back(), "did appear");
    stage.stack->dismissModalViewController(true);
    EXPECT_EQ(form->log.back(), "did disappear");
}

TEST_F(ModalTest, ASheetFollowsItsWindow) {
    const auto form = present();
    stage.window.widget()->resize(800, 700);
    runUntilIdle();
    EXPECT_EQ(form->view().frame(), (Rect{0, 0, 560, 676}));
}

TEST_F(ModalTest, AWindowMayGoWithItsSheet) {
    auto stack = std::make_shared<NavigationController>(std::make_shared<ListPane>(numberedTexts(1)));
    const auto form = std::make_shared<Form>();
    {
        Window window({0, 0, 300, 400});
        window.setRootViewController(stack);
        window.makeKeyAndVisible();
        stack->presentModalViewController(form, false);
    }
    runUntilIdle();
    EXPECT_EQ(stack->modalViewController(), form);
    stack->dismissModalViewController(true);
    EXPECT_EQ(form->log.back(), "did disappear");
    EXPECT_NE(form->view().widget(), nullptr);
}

} // namespace
} // namespace velmora
