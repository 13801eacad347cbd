// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Widgets/Accessibility.h"

#include <QAccessible>
#include <QPushButton>
#include <QTest>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class NoticeBarTest : public ::testing::Test {
protected:
    NoticeBarTest() : stage(std::make_shared<ListPane>(numberedTexts(3), "root")) {
        setAnnouncementListener([this](QWidget& widget, QAccessible::Event what) {
            if (what == QAccessible::Alert)
                alerts.push_back(widget.accessibleName().toStdString());
        });
        stage.show();
        runUntilIdle();
    }
    ~NoticeBarTest() override { setAnnouncementListener(nullptr); }

    void set(const std::string& text, const std::string& title = {}, std::function<void()> action = {}) {
        stage.stack->setNotice({text, title, std::move(action)});
        runUntilIdle();
    }
    [[nodiscard]] QWidget* part(const char* name) const { return find(stage.window, name); }
    [[nodiscard]] int paneTop() const {
        const QWidget* const pane = stage.root->view().widget();
        return pane->mapTo(stage.window.widget(), QPoint()).y();
    }

    std::vector<std::string> alerts;
    Stage stage;
};

TEST_F(NoticeBarTest, TakesItsRoomFromThePaneAndGivesItBack) {
    const int top = paneTop();
    EXPECT_EQ(part("velmora.noticeBar"), nullptr);
    set("A notice.");
    const QWidget* const bar = part("velmora.noticeBar");
    ASSERT_NE(bar, nullptr);
    EXPECT_EQ(paneTop(), top + bar->height());
    EXPECT_EQ(part("velmora.noticeButton"), nullptr);
    set("");
    EXPECT_EQ(part("velmora.noticeBar"), nullptr);
    EXPECT_EQ(paneTop(), top);
}

TEST_F(NoticeBarTest, StaysOverEveryPaneOfTheStack) {
    set("A notice.");
    const auto second = std::make_shared<ListPane>(numberedTexts(2), "second");
    stage.stack->pushViewController(second, false);
    runUntilIdle();
    ASSERT_NE(part("velmora.noticeBar"), nullptr);
    EXPECT_EQ(textOf(part("velmora.notice")), "A notice.");
}

TEST_F(NoticeBarTest, ItsButtonIsPressedByMouseAndKeyboard) {
    int pressed = 0;
    set("A notice.", "Go & do", [&pressed] { ++pressed; });
    auto* const button = dynamic_cast<QPushButton*>(part("velmora.noticeButton"));
    ASSERT_NE(button, nullptr);
    EXPECT_EQ(button->accessibleName().isEmpty() ? textOf(button) : "", "Go && do");
    QTest::mouseClick(button, Qt::LeftButton);
    EXPECT_EQ(pressed, 1);
    button->setFocus(Qt::TabFocusReason);
    QTest::keyClick(button, Qt::Key_Return);
    EXPECT_EQ(pressed, 2);
}

TEST_F(NoticeBarTest, ItsActionMayTakeItAway) {
    set("A notice.", "Go", [this] { stage.stack->setNotice({}); });
    QTest::mouseClick(part("velmora.noticeButton"), Qt::LeftButton);
    runUntilIdle();
    EXPECT_EQ(part("velmora.noticeBar"), nullptr);
}

TEST_F(NoticeBarTest, ScreenReadersHearEachTextOnceAsAnAlert) {
    EXPECT_THAT(alerts, IsEmpty());
    set("One.");
    set("One.");
    set("Two.");
    set("");
    set("Two.");
    EXPECT_THAT(alerts, ElementsAre("One.", "Two.", "Two."));
    const QAccessibleInterface* const spoken = QAccessible::queryAccessibleInterface(part("velmora.notice"));
    EXPECT_EQ(spoken->role(), QAccessible::AlertMessage);
    EXPECT_EQ(spoken->text(QAccessible::Name).toStdString(), "Two.");
}

TEST_F(NoticeBarTest, AWordWiderThanTheBarIsBroken) {
    set("short");
    const int line = part("velmora.notice")->height();
    set(std::string(200, 'w'));
    // 200 letters of more than 5 points each, in 376.
    EXPECT_GE(part("velmora.notice")->height(), 3 * line - 2);
}

TEST_F(NoticeBarTest, LeavesHalfOfTheRoomToThePaneHoweverLongItIs) {
    std::string text;
    for (int i = 0; i < 500; ++i)
        text += "words ";
    set(text);
    // The window's 604 points less two bars of 52, or less one where there is no toolbar.
    EXPECT_GE(stage.root->view().bounds().height, 250);
}

TEST_F(NoticeBarTest, CommandsAreNotBrokenAfterTheirDashes) {
    set("velmora");
    const QWidget* const label = part("velmora.notice");
    const int line = label->heightForWidth(1000);
    set("aa --bbbbbb cc");
    // Broken after the dashes it would be "aa --" and "bbbbbb cc".
    const int width = label->fontMetrics().horizontalAdvance("bbbbbb cc") + 3;
    EXPECT_EQ(label->heightForWidth(width), 3 * line);
}

} // namespace
} // namespace velmora
