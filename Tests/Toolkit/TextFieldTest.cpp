// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/TextField.h"
#include "Toolkit/TextFieldDelegate.h"

#include <QTest>

namespace velmora {
namespace {

class TextFieldTest : public ::testing::Test, public TextFieldDelegate {
protected:
    TextFieldTest() : window({0, 0, 300, 400}), screen(std::make_shared<ViewController>()) {
        window.setRootViewController(screen);
        window.makeKeyAndVisible();
        field.setFrame({10, 10, 200, 0});
        field.sizeToFit();
        field.setDelegate(this);
        screen->view().addSubview(field);
        EXPECT_TRUE(eventually([this] { return window.widget()->isActiveWindow(); }));
    }
    bool textFieldShouldReturn(TextField& textField) override {
        EXPECT_EQ(&textField, &field);
        ++returns;
        textField.resignFirstResponder();
        return true;
    }

    Window window;
    std::shared_ptr<ViewController> screen;
    TextField field;
    int returns = 0;
};

TEST_F(TextFieldTest, TypedTextIsRead) {
    EXPECT_EQ(field.text(), "");
    ASSERT_TRUE(field.becomeFirstResponder());
    QTest::keyClicks(window.widget()->focusWidget(), "dropped call");
    EXPECT_EQ(field.text(), "dropped call");
    field.setText("\xC3\xBC");
    EXPECT_EQ(field.text(), "\xC3\xBC");
}

TEST_F(TextFieldTest, ReturnAsksTheDelegate) {
    ASSERT_TRUE(field.becomeFirstResponder());
    QTest::keyClick(field.widget(), Qt::Key_Return);
    EXPECT_EQ(returns, 1);
    EXPECT_FALSE(field.isFirstResponder());
    field.setDelegate(nullptr);
    ASSERT_TRUE(field.becomeFirstResponder());
    QTest::keyClick(field.widget(), Qt::Key_Return);
    EXPECT_EQ(returns, 1);
}

TEST_F(TextFieldTest, ATapGivesItTheKeyboardAndATapBesideItTakesItAway) {
    screen->view().setOnTap([this] { field.resignFirstResponder(); });
    QTest::mouseClick(window.widget()->windowHandle(), Qt::LeftButton, {}, QPoint(50, 30));
    EXPECT_TRUE(field.isFirstResponder());
    QTest::mouseClick(window.widget()->windowHandle(), Qt::LeftButton, {}, QPoint(50, 300));
    EXPECT_FALSE(field.isFirstResponder());
}

TEST_F(TextFieldTest, ItIsHighEnoughForAFinger) {
    EXPECT_GE(field.bounds().height, 44);
    EXPECT_EQ(field.bounds().width, 200);
}

} // namespace
} // namespace velmora
