// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/VelmoraSaveView.h"
#include "Tests/App/SaveScreenFixture.h"
#include "Toolkit/Screen.h"

#include <QTest>
#include <QWidget>
#include <QWindow>

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

/// What the save screen shows and does under real clicks and keys.
class SaveScreenTest : public SaveScreenFixture {
protected:
    [[nodiscard]] VelmoraSaveView& view() const {
        return dynamic_cast<VelmoraSaveView&>(saveScreen()->view());
    }
    void type(const std::string& text) {
        for (const char c : text)
            QTest::keyClick(field(), c);
        runUntilIdle();
    }
    void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
        QTest::keyClick(field()->window()->windowHandle(), key, modifiers);
        runUntilIdle();
    }
    [[nodiscard]] QWidget* field() const { return saveScreen()->saveDescription().widget(); }
};

TEST_F(SaveScreenTest, ListsEveryEntryWithItsDescriptionAndACheckMark) {
    launchAndConnect();
    for (int i = 0; i < 7; ++i)
        show(display(std::to_string(i)));
    open();
    // The history keeps five; the first was drawn 2 s after the start.
    EXPECT_THAT(listed(),
                ElementsAre("Snapshot (2026-11-16 05:00:06 +0000)", "Snapshot (2026-11-16 05:00:08 +0000)",
                            "Snapshot (2026-11-16 05:00:10 +0000)", "Snapshot (2026-11-16 05:00:12 +0000)",
                            "Snapshot (2026-11-16 05:00:14 +0000)"));
    TableView& table = saveScreen()->saveContentTable();
    EXPECT_EQ(table.numberOfSections(), 1u);
    for (std::size_t row = 0; row < 5; ++row) {
        const auto cell = table.cellForRow(IndexPath(0, row));
        ASSERT_NE(cell, nullptr);
        EXPECT_EQ(cell->accessory(), TableCellAccessory::checkMark);
        EXPECT_EQ(cell->style(), TableCellStyle::plain);
        EXPECT_EQ(cell->reuseIdentifier(), "SaveHistoryContentCell");
        EXPECT_EQ(cell->textLabel().font(), Font::named("Helvetica", 13));
        EXPECT_TRUE(cell->textLabel().widget()->isVisible());
    }
}

TEST_F(SaveScreenTest, ListKeepsWhatWasThereWhenTheScreenWasOpened) {
    launchAndConnect();
    show(display("one"));
    open();
    show(display("two"));
    EXPECT_THAT(listed(), ElementsAre("Snapshot (2026-11-16 05:00:02 +0000)"));
}

TEST_F(SaveScreenTest, WithoutADecoderTheListIsEmpty) {
    launch();
    open();
    EXPECT_THAT(listed(), IsEmpty());
    EXPECT_EQ(saveScreen()->saveContentTable().numberOfRowsInSection(0), 0u);
}

TEST_F(SaveScreenTest, PartsLieBelowEachOtherInsideTheScreen) {
    launchAndConnect();
    show(display("one"));
    open();
    const Rect screen = saveScreen()->view().bounds();
    EXPECT_EQ(screen.width, Screen::mainApplicationFrame().width);
    const Rect cancel = view().cancelButton().frame();
    const Rect saveButton = view().saveButton().frame();
    const Rect description = saveScreen()->saveDescription().frame();
    const Rect list = saveScreen()->saveContentTable().frame();
    EXPECT_LT(cancel.x + cancel.width, saveButton.x);
    EXPECT_LE(saveButton.x + saveButton.width, screen.width);
    EXPECT_GE(cancel.height, 44);
    EXPECT_GE(description.y, cancel.y + cancel.height);
    EXPECT_GE(description.height, 44);
    EXPECT_GE(list.y, description.y + description.height);
    // The list is as high as its one row.
    EXPECT_EQ(list.height, saveScreen()->saveContentTable().rowHeight());
}

TEST_F(SaveScreenTest, TakesUpTheApplicationsFrameAsItAppears) {
    launch();
    VelmoraSaveViewController screen(nullptr, app);
    screen.view().setFrame({0, 0, 10, 10});
    screen.viewWillAppear(true);
    EXPECT_EQ(screen.view().frame(), Screen::mainApplicationFrame());
}

TEST_F(SaveScreenTest, SaveButtonWritesAndCloses) {
    launchAndConnect();
    show(display("one"));
    open();
    click(view().saveButton().widget());
    EXPECT_THAT(files(), ElementsAre("VelmoraSnapshot-1794805202.velmora"));
    // Closing is queued, never done within the press.
    EXPECT_NE(saveScreen(), nullptr);
    platform.queue.runPending();
    EXPECT_EQ(saveScreen(), nullptr);
}

TEST_F(SaveScreenTest, CancelButtonClosesAndWritesNothing) {
    launchAndConnect();
    show(display("one"));
    open();
    click(view().cancelButton().widget());
    EXPECT_NE(saveScreen(), nullptr);
    platform.queue.runPending();
    EXPECT_EQ(saveScreen(), nullptr);
    EXPECT_THAT(files(), IsEmpty());
}

TEST_F(SaveScreenTest, EscapeCancels) {
    launchAndConnect();
    open();
    press(Qt::Key_Escape);
    platform.queue.runPending();
    EXPECT_EQ(saveScreen(), nullptr);
    EXPECT_THAT(files(), IsEmpty());
}

TEST_F(SaveScreenTest, TypedDescriptionIsSaved) {
    launchAndConnect();
    show(display("one"));
    open();
    click(field());
    type("north gate");
    EXPECT_EQ(saveScreen()->saveDescription().text(), "north gate");
    save();
    EXPECT_EQ((*content(startSeconds + 2).asDictionary())["Description"], Value("north gate"));
}

TEST_F(SaveScreenTest, ReturnTakesTheKeyboardAwayAndIsAnsweredTrue) {
    launchAndConnect();
    open();
    ASSERT_TRUE(saveScreen()->saveDescription().becomeFirstResponder());
    QTest::keyClick(field(), Qt::Key_Return);
    runUntilIdle();
    EXPECT_FALSE(saveScreen()->saveDescription().isFirstResponder());
    EXPECT_NE(saveScreen(), nullptr);
    EXPECT_THAT(files(), IsEmpty());
    EXPECT_TRUE(saveScreen()->textFieldShouldReturn(saveScreen()->saveDescription()));
}

TEST_F(SaveScreenTest, TouchingTheBackgroundTakesTheKeyboardAway) {
    launchAndConnect();
    open();
    ASSERT_TRUE(saveScreen()->saveDescription().becomeFirstResponder());
    QWidget* background = view().widget();
    click(background, background->width() / 2.0, background->height() - 5.0);
    EXPECT_FALSE(saveScreen()->saveDescription().isFirstResponder());
}

TEST_F(SaveScreenTest, ChoosingARowOnlyTakesTheKeyboardAway) {
    launchAndConnect();
    show(display("one"));
    open();
    ASSERT_TRUE(saveScreen()->saveDescription().becomeFirstResponder());
    clickRow(saveScreen()->saveContentTable(), 0);
    EXPECT_FALSE(saveScreen()->saveDescription().isFirstResponder());
    EXPECT_EQ(saveScreen()->saveContentTable().cellForRow(IndexPath(0, 0))->accessory(),
              TableCellAccessory::checkMark);
    EXPECT_NE(saveScreen(), nullptr);
}

TEST_F(SaveScreenTest, FailureLeavesANoticeThatDoesNotBlock) {
    std::filesystem::remove(directory / "logs");
    launchAndConnect();
    show(display("one"));
    open();
    save();
    EXPECT_EQ(saveScreen(), nullptr);
    EXPECT_TRUE(
        log.contains(LogPriority::Error, "Unable to write snapshot to " + file(startSeconds + 2).string()));
    ASSERT_TRUE(eventually([] { return isShown("Unable to write file to disk"); }));
    EXPECT_TRUE(isShown("File Error"));
    const auto buttons = shownWidgets("Close");
    ASSERT_EQ(buttons.size(), 1u);
    click(buttons[0]);
    EXPECT_TRUE(eventually([] { return !isShown("Unable to write file to disk"); }));
    EXPECT_EQ(app.navController().viewControllers().size(), 1u);
}

TEST_F(SaveScreenTest, SuccessShowsNoNotice) {
    launchAndConnect();
    show(display("one"));
    open();
    save();
    EXPECT_FALSE(isShown("File Error"));
    EXPECT_THAT(log.lines(), Not(testing::Contains(
                                 testing::Field(&CapturedLog::Line::text, testing::HasSubstr("snapshot")))));
}

TEST_F(SaveScreenTest, NoticesOfTheToolkitAreForwarded) {
    launch();
    open();
    saveScreen()->didReceiveMemoryWarning();
    saveScreen()->viewDidUnload();
    EXPECT_TRUE(saveScreen()->isViewLoaded());
}

} // namespace
} // namespace velmora
