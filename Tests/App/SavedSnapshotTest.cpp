// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/VelmoraSaveView.h"
#include "Tests/App/SaveScreenFixture.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QDesktopServices>
#include <QPushButton>
#include <QTest>
#include <QTextBrowser>
#include <QWidget>
#include <QWindow>

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

/// Stands for the file manager: notes which folders it is to open.
class FileManager : public QTextBrowser {
public:
    FileManager() { QDesktopServices::setUrlHandler("file", this, "setSource"); }
    ~FileManager() override { QDesktopServices::unsetUrlHandler("file"); }
    std::vector<std::string> opened;

protected:
    void doSetSource(const QUrl& url, QTextDocument::ResourceType) override {
        opened.push_back(url.toLocalFile().toStdString());
    }
};

/// Saving with the keyboard, and what is said of the file afterwards.
class SavedSnapshotTest : public SaveScreenFixture {
protected:
    void SetUp() override {
        launchAndConnect();
        show(display("one"));
    }
    [[nodiscard]] QWidget* window() const { return app.navController().view().widget()->window(); }
    void press(Qt::Key key) {
        QTest::keyClick(window()->windowHandle(), key);
        runUntilIdle();
    }
    void type(const std::string& text) {
        for (const char c : text)
            QTest::keyClick(window()->windowHandle(), c);
        runUntilIdle();
    }
    /// The whole text of the notice above the panes; empty where there is none.
    [[nodiscard]] std::string notice() const { return app.navController().notice().text; }
    [[nodiscard]] std::string sentence(long seconds) const {
        return "Saved VelmoraSnapshot-" + std::to_string(seconds) + ".velmora in " +
               (directory / "logs").string() + ".";
    }
    [[nodiscard]] VelmoraSaveView& view() const {
        return dynamic_cast<VelmoraSaveView&>(saveScreen()->view());
    }
};

TEST_F(SavedSnapshotTest, TypingGoesIntoTheDescriptionAtOnce) {
    open();
    EXPECT_TRUE(saveScreen()->saveDescription().isFirstResponder());
    type("north gate");
    EXPECT_EQ(saveScreen()->saveDescription().text(), "north gate");
}

TEST_F(SavedSnapshotTest, EnterLeavesTheFieldAndThenSaves) {
    open();
    type("gate");
    press(Qt::Key_Return);
    EXPECT_FALSE(saveScreen()->saveDescription().isFirstResponder());
    EXPECT_THAT(files(), IsEmpty());
    press(Qt::Key_Enter);
    EXPECT_THAT(files(), ElementsAre("VelmoraSnapshot-1794805202.velmora"));
    EXPECT_EQ((*content(startSeconds + 2).asDictionary())["Description"], Value("gate"));
}

TEST_F(SavedSnapshotTest, AHeldEnterOnlyLeavesTheField) {
    open();
    press(Qt::Key_Return);
    QKeyEvent held(QEvent::KeyPress, Qt::Key_Return, {}, "\r", true);
    QApplication::sendEvent(window(), &held);
    EXPECT_THAT(files(), IsEmpty());
}

TEST_F(SavedSnapshotTest, SaveLooksLikeWhatEnterPresses) {
    open();
    EXPECT_TRUE(dynamic_cast<QPushButton&>(*view().saveButton().widget()).isDefault());
    EXPECT_FALSE(dynamic_cast<QPushButton&>(*view().cancelButton().widget()).isDefault());
    view().cancelButton().becomeFirstResponder();
    press(Qt::Key_Return); // belongs to the button that has the keyboard
    platform.queue.runPending();
    EXPECT_EQ(saveScreen(), nullptr);
    EXPECT_THAT(files(), IsEmpty());
}

TEST_F(SavedSnapshotTest, HeadingIsReadInFullAtAnyWidth) {
    open();
    for (const int width : {240, 360, 800}) {
        window()->resize(width, 640);
        runUntilIdle();
        const LabelWidget* shown = nullptr; // the dialog has the same name
        for (const QWidget* const widget : shownWidgets("Save Snapshot"))
            if (const auto* const label = dynamic_cast<const LabelWidget*>(widget))
                shown = label;
        ASSERT_TRUE(shown);
        const LabelWidget& heading = *shown;
        EXPECT_EQ(heading.shownText(), "Save Snapshot") << width;
        const QRect place(heading.mapTo(window(), QPoint()), heading.size());
        EXPECT_TRUE(window()->rect().contains(place)) << width;
        for (const View* button : {&view().cancelButton(), &view().saveButton()})
            EXPECT_FALSE(place.intersects(
                QRect(button->widget()->mapTo(window(), QPoint()), button->widget()->size())))
                << width;
    }
}

TEST_F(SavedSnapshotTest, FileIsNamedWithItsPlaceAndTheFolderOpens) {
    FileManager manager;
    open();
    EXPECT_EQ(notice(), "");
    save();
    EXPECT_EQ(notice(), sentence(startSeconds + 2));
    const auto buttons = shownWidgets("Open Folder");
    ASSERT_EQ(buttons.size(), 1u);
    click(buttons[0]);
    EXPECT_THAT(manager.opened, ElementsAre((directory / "logs").string()));
}

TEST_F(SavedSnapshotTest, NoticeGoesAfterAMinuteAndALaterOneHasItsOwn) {
    open();
    save();
    platform.queue.advance(40s);
    open();
    save();
    platform.queue.advance(30s);
    EXPECT_EQ(notice(), sentence(startSeconds + 42));
    platform.queue.advance(30s);
    EXPECT_EQ(notice(), "");
}

TEST_F(SavedSnapshotTest, ProblemsFollowTheNameOfTheFile) {
    open();
    save();
    loseService();
    EXPECT_EQ(notice().rfind(sentence(startSeconds + 2) + " No telephony service answers.", 0), 0u)
        << notice();
    EXPECT_EQ(app.navController().notice().title, "Open Folder");
}

TEST_F(SavedSnapshotTest, MissingFileManagerIsSaid) {
    open();
    save();
    const auto buttons = shownWidgets("Open Folder");
    ASSERT_EQ(buttons.size(), 1u);
    click(buttons[0]); // the display of the tests has no file manager
    EXPECT_TRUE(isShown("No File Manager"));
    EXPECT_TRUE(isShown("Nothing here opens " + (directory / "logs").string()));
    click(shownWidgets("Close").at(0));
}

TEST_F(SavedSnapshotTest, FailureNamesNoFile) {
    std::filesystem::remove(directory / "logs");
    open();
    save();
    EXPECT_EQ(notice(), "");
    click(shownWidgets("Close").at(0));
}

} // namespace
} // namespace velmora
