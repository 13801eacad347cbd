// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Recording/RecordingSwitch.h"
#include "App/Report/ReportSwitch.h"
#include "Tests/App/DriveView/PlayedDriveFixture.h"
#include "Tests/Support/ShellCommand.h"

#include <QDesktopServices>
#include <QLabel>
#include <QMessageBox>
#include <QPushButton>
#include <QTextBrowser>
#include <QUrl>
#include <QWidget>

#include <filesystem>
#include <fstream>
#include <iterator>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using namespace std::chrono_literals;

/// Takes the place of the browser.
class Browser : public QTextBrowser {
public:
    Browser() { QDesktopServices::setUrlHandler("file", this, "setSource"); }
    ~Browser() override { QDesktopServices::unsetUrlHandler("file"); }

    std::vector<std::string> opened;

protected:
    void doSetSource(const QUrl& url, QTextDocument::ResourceType /*type*/) override {
        opened.push_back(url.toLocalFile().toStdString());
    }
};

std::string contentOf(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

class ReportTest : public PlayedDriveFixture {
protected:
    void ask() { press(Qt::Key_R, Qt::ControlModifier | Qt::ShiftModifier); }
    [[nodiscard]] QMessageBox* question() const { return window()->findChild<QMessageBox*>("velmora.alert"); }
    [[nodiscard]] std::vector<std::string> answers() const {
        std::vector<std::string> titles;
        for (const QAbstractButton* const each : question()->buttons())
            titles.push_back(each->text().toStdString());
        return titles;
    }
    void answer(const std::string& title) {
        ASSERT_TRUE(question());
        for (QAbstractButton* const each : question()->buttons())
            if (each->text().toStdString() == title) {
                each->click();
                break;
            }
        runUntilIdle();
    }
    /// The files of pages.
    [[nodiscard]] std::vector<std::string> pages() const {
        std::vector<std::string> found;
        for (const auto& each : std::filesystem::directory_iterator(directory / "logs"))
            if (each.path().extension() == ".html")
                found.push_back(each.path().string());
        return found;
    }
    void waitForPage() {
        for (int i = 0; i < 2000 && app.report().isOn(); ++i)
            platform.queue.advance(5ms);
        runUntilIdle();
    }
    [[nodiscard]] std::string notice() const {
        const auto* const label = window()->findChild<QLabel*>("velmora.notice");
        return label && label->isVisible() ? label->text().toStdString() : std::string();
    }

    Browser browser;
};

TEST_F(ReportTest, IsThePageThatTheCommandMakesAndOpensInTheBrowser) {
    const std::string path = record("lte", 2000);
    openIn(1280, 800, path);
    ask();
    ASSERT_TRUE(question());
    EXPECT_THAT(question()->informativeText().toStdString(), HasSubstr("are left out"));
    answer("Make Report");
    EXPECT_TRUE(app.report().isOn());
    EXPECT_THAT(notice(), HasSubstr("The report is being made: "));
    waitForPage();
    ASSERT_EQ(pages().size(), 1U);
    EXPECT_THAT(browser.opened, ElementsAre(pages().front()));
    EXPECT_THAT(notice(), HasSubstr("The report is " + pages().front()));
    const std::string expected = (directory / "expected.html").string();
    ASSERT_EQ(runShell(shellQuoted(VELMORA_BUILD_DIR "/velmora-log") + " report " + shellQuoted(path) +
                       " -o " + shellQuoted(expected))
                      .status &
                  ~1,
              0);
    std::string page = contentOf(expected);
    const std::string generator = "velmora-log report";
    for (auto at = page.find(generator); at != std::string::npos; at = page.find(generator))
        page.replace(at, generator.size(), "Velmora");
    EXPECT_TRUE(contentOf(pages().front()) == page);
}

TEST_F(ReportTest, HasIdentitiesOnlyWhereTheyAreAskedFor) {
    const std::string path = record("modem", 2000);
    openIn(1280, 800, path);
    ask();
    EXPECT_THAT(answers(), testing::UnorderedElementsAre("Make Report", "With Identities", "Cancel"));
    answer("With Identities");
    waitForPage();
    ASSERT_EQ(pages().size(), 1U);
    const std::string with = contentOf(pages().front());
    platform.queue.advance(1s);
    ask();
    answer("Make Report");
    waitForPage();
    ASSERT_EQ(pages().size(), 2U);
    const std::string without = contentOf(browser.opened.back());
    // An address that the drive's contexts have.
    EXPECT_NE(with.find("198.51.100.17"), std::string::npos);
    EXPECT_EQ(without.find("198.51.100.17"), std::string::npos);
}

TEST_F(ReportTest, IsMaskedWhileIdentitiesAre) {
    const std::string path = record("modem", 2000);
    openIn(1280, 800, path);
    app.togglePrivacy();
    runUntilIdle();
    ask();
    EXPECT_THAT(answers(), testing::UnorderedElementsAre("Make Report", "Cancel"));
    answer("Make Report");
    waitForPage();
    ASSERT_EQ(pages().size(), 1U);
    EXPECT_EQ(contentOf(pages().front()).find("198.51.100.17"), std::string::npos);
}

TEST_F(ReportTest, CanBeCancelled) {
    openIn(1280, 800, record("lte", 3000));
    ask();
    answer("Cancel");
    EXPECT_FALSE(app.report().isOn());
    ask();
    answer("Make Report");
    ASSERT_TRUE(app.report().isOn());
    app.navController().notice().action();
    EXPECT_FALSE(app.report().isOn());
    waitForPage();
    EXPECT_TRUE(pages().empty());
    EXPECT_THAT(notice(), HasSubstr("The report is cancelled."));
}

TEST_F(ReportTest, IsAboutTheRecordingThatIsMadeWhereNoneIsShown) {
    launchIn(1280, 800);
    ask();
    EXPECT_FALSE(question());
    EXPECT_THAT(notice(), HasSubstr("There is no recording to report on."));
    press(Qt::Key_R, Qt::ControlModifier);
    drive(30);
    ask();
    answer("Make Report");
    waitForPage();
    ASSERT_EQ(pages().size(), 1U);
    EXPECT_THAT(contentOf(pages().front()), HasSubstr("VelmoraRecording-"));
    EXPECT_TRUE(app.recording().isOn());
}

TEST_F(ReportTest, SaysWhyThereIsNone) {
    const std::string path = record("lte", 500);
    openIn(1280, 800, path);
    std::filesystem::remove(path);
    ask();
    answer("Make Report");
    waitForPage();
    EXPECT_THAT(notice(), HasSubstr("There is no report: "));
    EXPECT_TRUE(pages().empty());
}

TEST_F(ReportTest, TheQuestionFitsAPhone) {
    openIn(360, 640, record("lte", 500));
    ask();
    ASSERT_TRUE(question());
    EXPECT_LE(question()->width(), 360);
    for (const QAbstractButton* const each : question()->buttons())
        EXPECT_GE(each->height(), 44);
    answer("Cancel");
}

} // namespace
} // namespace velmora
