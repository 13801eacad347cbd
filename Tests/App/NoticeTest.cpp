// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileResources.h"
#include "Tests/App/AppFixture.h"

#include <QDir>
#include <QPixmap>
#include <QPushButton>
#include <QWidget>

#include <algorithm>
#include <chrono>
#include <filesystem>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::Contains;
using testing::ElementsAre;

constexpr const char* change = "Now receiving Ostrel LTE. The panes show Ostrel GSM.";
constexpr const char* noServiceLine =
    "no telephony service answers; the installed one is started by: velmora --start-service, one with a "
    "synthetic drive by: velmora-telephonyd --source scenario:gsm,seed=1";
constexpr const char* noServiceText =
    "No telephony service answers. The installed one is started by: velmora --start-service, one with a "
    "synthetic drive by: velmora-telephonyd --source scenario:gsm,seed=1";

/// The bar above the panes, on the real toolkit and with the shipped templates.
class NoticeTest : public AppFixture {
protected:
    NoticeTest() { setResources(&_files); }
    ~NoticeTest() override { setResources(&resources); }

    [[nodiscard]] QWidget* window() const { return app.navController().view().widget()->window(); }
    [[nodiscard]] QWidget* part(const char* name) const {
        auto* const found = window()->findChild<QWidget*>(name);
        return found && found->isVisible() ? found : nullptr;
    }
    /// What the bar says to screen readers and on the screen; empty where there is none.
    [[nodiscard]] std::string notice() const {
        const QWidget* const text = part("velmora.notice");
        return text ? text->accessibleName().toStdString() : "";
    }
    void tick() {
        platform.queue.advance(2s);
        runUntilIdle();
    }
    void connectAs(std::string_view constant) {
        technology = constant;
        platform.ports.sever(channelName);
        tick();
        ASSERT_TRUE(app.model().isConnected());
    }
    void receive(const Data& message) {
        ASSERT_TRUE(platform.ports.deliver(logChannelPortName(), 0, message));
        tick();
    }
    /// A record that every technology with a template drops: it builds the display.
    static Data anyRecord() { return Data(std::vector<std::uint8_t>(20, 0x01)); }
    void changeFromGSMToLTE() {
        technology = kVoxLogChannelTechnology_Ostrel_GSM;
        launchAndConnect();
        receive(anyRecord());
        EXPECT_EQ(notice(), "");
        connectAs(kVoxLogChannelTechnology_Ostrel_LTE);
        EXPECT_EQ(notice(), change);
    }
    void pressStartAnew() {
        auto* const button = static_cast<QPushButton*>(part("velmora.noticeButton"));
        ASSERT_NE(button, nullptr);
        EXPECT_EQ(button->text(), "Start Anew");
        click(button);
    }
    [[nodiscard]] std::ptrdiff_t lines(const std::string& text) const {
        const auto all = log.textsAt(LogPriority::Error);
        return std::count(all.begin(), all.end(), text);
    }
    void shoot(const char* name, int width, int height) {
        ASSERT_TRUE(QDir().mkpath(VELMORA_BUILD_DIR "/screenshots"));
        window()->resize(width, height);
        runUntilIdle();
        EXPECT_TRUE(window()->grab().save(
            QString(VELMORA_BUILD_DIR "/screenshots/notice-%1-%2x%3.png").arg(name).arg(width).arg(height)));
    }

private:
    FileResources _files;
};

TEST_F(NoticeTest, TheStatusFollowsTheConnectionWithoutARedraw) {
    launchAndConnect();
    show(dictionary({{"A", "1"}, {"B", "2"}}));
    ASSERT_EQ(status(*pane(0)), "Updated 2026-11-16 at 05:00:02");
    tick(); // a quiet one
    platform.telephony.available = false;
    platform.ports.sever(channelName);
    tick();
    EXPECT_EQ(status(*pane(0)), "Connecting...");
    EXPECT_TRUE(isSpinning(*pane(0)));
    EXPECT_THAT(rows(*pane(0)), ElementsAre("A: 1", "B: 2"));
    platform.telephony.available = true;
    platform.queue.advance(5s);
    EXPECT_EQ(status(*pane(0)), "Updated 2026-11-16 at 05:00:02");
    EXPECT_FALSE(isSpinning(*pane(0)));
}

TEST_F(NoticeTest, ThereIsNoneWhileAllIsWell) {
    launchAndConnect();
    show(dictionary({{"A", "1"}, {"B", "2"}}));
    EXPECT_EQ(notice(), "");
    EXPECT_EQ(part("velmora.noticeBar"), nullptr);
}

TEST_F(NoticeTest, WithoutAServiceCauseAndWayOutAreOnTheScreenAndOnceInTheLog) {
    platform.telephony.available = false;
    launch();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_EQ(status(*pane(0)), "Connecting...");
    EXPECT_EQ(notice(), noServiceText);
    EXPECT_EQ(part("velmora.noticeButton"), nullptr);
    platform.queue.advance(30s);
    EXPECT_EQ(lines(noServiceLine), 1);
    platform.telephony.available = true;
    platform.queue.advance(5s);
    EXPECT_EQ(notice(), "");
    // The next loss is another problem.
    platform.telephony.available = false;
    platform.ports.sever(channelName);
    tick();
    EXPECT_EQ(notice(), noServiceText);
    EXPECT_EQ(lines(noServiceLine), 2);
}

TEST_F(NoticeTest, ASecondInstanceSaysThatItIsOne) {
    auto first = platform.ports.createLocal(logChannelPortName(), [](auto&&...) { return std::nullopt; });
    launch();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_EQ(notice(), "Velmora is running already. End the other one, and this one connects within five "
                        "seconds.");
    EXPECT_EQ(
        lines("Velmora is running already; end the other one, and this one connects within five seconds"), 1);
    platform.queue.advance(30s);
    EXPECT_EQ(lines(noServiceLine), 0);
    first.port.reset();
    platform.queue.advance(5s);
    EXPECT_EQ(notice(), "");
}

TEST_F(NoticeTest, AnUnusablePortDirectoryIsNamed) {
    platform.ports.failNextLocal("port directory /p has mode 0777, wanted 0700");
    launch();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_EQ(notice(), "Port directory /p has mode 0777, wanted 0700. Mend that, or name another directory "
                        "in VELMORA_PORT_DIR, for the service too.");
    EXPECT_THAT(log.textsAt(LogPriority::Error),
                Contains("port directory /p has mode 0777, wanted 0700; mend that, or name another "
                         "directory in VELMORA_PORT_DIR, for the service too"));
}

TEST_F(NoticeTest, AServiceThatNamesNoTechnologyIsNamed) {
    platform.ports.serve(channelName, [](std::int32_t, const Data&, bool) { return RemotePort::Answer{}; });
    launch();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_EQ(notice(), "The telephony service does not name its technology. It may have no modem yet, which "
                        "its own log says; if it has, restart it.");
    EXPECT_EQ(lines(noServiceLine), 0);
}

TEST_F(NoticeTest, AServiceThatCouldNotBeStartedIsTheCause) {
    platform.telephony.available = false;
    app.setWillConnect([]() -> Result<Done> { return Failure{"x has ended"}; });
    launch();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_EQ(notice(), "The telephony service could not be started: x has ended. Its own log may say more; "
                        "one with a synthetic drive is started by: velmora-telephonyd --source "
                        "scenario:gsm,seed=1");
    EXPECT_EQ(lines("telephony service: x has ended"), 1);
    EXPECT_EQ(lines(noServiceLine), 0);
}

TEST_F(NoticeTest, AChangeOfTechnologyIsSaidUntilThePanesShowIt) {
    changeFromGSMToLTE();
    receive(anyRecord());
    EXPECT_EQ(notice(), change);
    connectAs(kVoxLogChannelTechnology_Ostrel_GSM);
    EXPECT_EQ(notice(), "");
    // A decoder that brings whole displays replaces what is shown.
    connectAs(kVoxLogChannelTechnology_IFX);
    EXPECT_EQ(notice(), "Now receiving IFX. The panes show Ostrel GSM.");
    show(dictionary({{"A", "1"}, {"B", "2"}}));
    EXPECT_EQ(notice(), "");
}

TEST_F(NoticeTest, WithoutAConnectionNothingIsReceived) {
    changeFromGSMToLTE();
    loseService();
    EXPECT_EQ(notice(), noServiceText);
    platform.telephony.available = true;
    platform.queue.advance(5s);
    EXPECT_EQ(notice(), change);
}

TEST_F(NoticeTest, AReconnectionToTheSameTechnologyGoesOn) {
    technology = kVoxLogChannelTechnology_Ostrel_GSM;
    launchAndConnect();
    receive(anyRecord());
    connectAs(kVoxLogChannelTechnology_Ostrel_GSM);
    receive(anyRecord());
    EXPECT_EQ(notice(), "");
    EXPECT_EQ(status(*pane(0)), "Updated 2026-11-16 at 05:00:06");
}

TEST_F(NoticeTest, TheButtonEndsTheApplicationToBeStartedAnew) {
    changeFromGSMToLTE();
    pressStartAnew(); // there is no Save button that could have been pressed before
    EXPECT_TRUE(app.startsAnew());
    EXPECT_EQ(saveScreen(), nullptr);
    EXPECT_EQ(app.run(), 0);
}

TEST_F(NoticeTest, WithASaveButtonTheSaveScreenComesFirst) {
    std::filesystem::create_directories(directory / marker);
    changeFromGSMToLTE();
    pressStartAnew();
    ASSERT_NE(saveScreen(), nullptr);
    EXPECT_FALSE(app.startsAnew());
    saveScreen()->savePressed();
    platform.queue.runPending();
    EXPECT_FALSE(std::filesystem::is_empty(directory / "logs"));
    EXPECT_TRUE(app.startsAnew());
}

TEST_F(NoticeTest, ASnapshotThatIsNotWantedTakesAnotherPress) {
    std::filesystem::create_directories(directory / marker);
    changeFromGSMToLTE();
    pressStartAnew();
    ASSERT_NE(saveScreen(), nullptr);
    saveScreen()->cancelPressed();
    platform.queue.runPending();
    EXPECT_FALSE(app.startsAnew());
    EXPECT_TRUE(eventually([this] { return !saveScreen() && notice() == change; }));
    pressStartAnew();
    EXPECT_TRUE(app.startsAnew());
}

TEST_F(NoticeTest, ASnapshotThatCannotBeWrittenEndsNothing) {
    std::filesystem::create_directories(directory / marker);
    changeFromGSMToLTE();
    std::filesystem::remove_all(directory / "logs");
    pressStartAnew();
    ASSERT_NE(saveScreen(), nullptr);
    saveScreen()->savePressed();
    platform.queue.runPending();
    EXPECT_FALSE(app.startsAnew());
    EXPECT_THAT(log.textsAt(LogPriority::Error),
                Contains(testing::StartsWith("Unable to write snapshot to ")));
}

TEST_F(NoticeTest, StandsAboveThePaneAtAnySize) {
    std::filesystem::create_directories(directory / marker);
    changeFromGSMToLTE();
    shoot("change", 360, 640);
    for (const auto& [width, height] : {std::pair(360, 640), {1024, 768}, {240, 320}}) {
        window()->resize(width, height);
        runUntilIdle();
        const QWidget* const bar = part("velmora.noticeBar");
        ASSERT_NE(bar, nullptr);
        const auto inWindow = [this](const QWidget* widget) {
            return QRect(widget->mapTo(window(), QPoint()), widget->size());
        };
        EXPECT_GE(inWindow(bar).top(), inWindow(part("velmora.header")).bottom());
        EXPECT_LE(inWindow(bar).bottom(), inWindow(topPane()->view().widget()).top());
        EXPECT_EQ(bar->width(), std::min(width, 480)); // beside them there is the drive view
        // Text and button lie in the bar, whole and apart.
        const QWidget* const text = part("velmora.notice");
        const QWidget* const button = part("velmora.noticeButton");
        EXPECT_TRUE(bar->rect().contains(text->geometry()));
        EXPECT_TRUE(bar->rect().contains(button->geometry()));
        EXPECT_FALSE(text->geometry().intersects(button->geometry()));
        EXPECT_GE(text->height(), text->heightForWidth(text->width())) << width;
        EXPECT_GE(button->height(), 44);
    }
    shoot("change", 1024, 768);
    loseService();
    shoot("no-service", 360, 640);
    shoot("no-service", 1024, 768);
    const QWidget* const text = part("velmora.notice");
    EXPECT_GE(text->height(), text->heightForWidth(text->width()));
}

} // namespace
} // namespace velmora
