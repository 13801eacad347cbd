// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/AppFixture.h"

#include "Toolkit/Screen.h"
#include "Toolkit/Window.h"

#include <QApplication>
#include <QPointer>
#include <QWidget>

#include <chrono>
#include <filesystem>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

class VelmoraAppTest : public AppFixture {
protected:
    static Value threeLevels() {
        return dictionary({{"A", dictionary({{"B", dictionary({{"x", "1"}, {"y", "2"}})}, {"b", "3"}})},
                           {"C", dictionary({{"c", "4"}, {"d", "5"}})}});
    }
    /// Opens A and in it B.
    void openThreePanes() {
        launchAndConnect();
        show(threeLevels());
        clickRow(0);
        clickRow(0);
        ASSERT_EQ(depth(), 3u);
        ASSERT_EQ(topPane()->path(), "/A/B");
    }
};

TEST_F(VelmoraAppTest, LaunchBringsTheScreenUpBeforeTheModelStarts) {
    app.applicationDidFinishLaunching(app);
    ASSERT_EQ(depth(), 1u);
    EXPECT_EQ(pane(0)->path(), "/");
    EXPECT_EQ(app.updateMessage(), "Connecting...");
    // On the screen, and nothing asked of the service yet: that is queued.
    ASSERT_EQ(QApplication::topLevelWidgets().isEmpty(), false);
    EXPECT_TRUE(pane(0)->view().widget()->isVisible());
    EXPECT_EQ(platform.telephony.connectionsAsked(), 0);
    EXPECT_FALSE(platform.ports.isTaken(logChannelPortName()));
    EXPECT_EQ(platform.queue.pendingCount(), 1u);
    // Nor before the display's server has exposed the window, however late that is.
    platform.queue.advance(1min);
    EXPECT_EQ(platform.telephony.connectionsAsked(), 0);
    runUntilIdle();
    EXPECT_EQ(platform.telephony.connectionsAsked(), 1);
    EXPECT_TRUE(app.model().isConnected());
}

TEST_F(VelmoraAppTest, WindowIsAsLargeAsTheMainScreen) {
    launch();
    EXPECT_EQ(app.navController().view().bounds().width, Screen::mainBounds().width);
    EXPECT_EQ(pane(0)->view().widget()->window()->height(), Screen::mainBounds().height);
}

TEST_F(VelmoraAppTest, PaneThatWasNeverShownSaysConnectingWithoutDots) {
    VelmoraPaneController root(nullptr, "/", app);
    root.setStatus("Connecting", true);
    EXPECT_EQ(status(root), "Connecting");
    // The stack's own showing of the root is a navigation that finds the model disconnected.
    launch();
    EXPECT_EQ(status(*pane(0)), "Connecting...");
    EXPECT_TRUE(isSpinning(*pane(0)));
    EXPECT_EQ(pane(0)->title(), "Velmora");
    EXPECT_THAT(rows(*pane(0)), IsEmpty());
}

TEST_F(VelmoraAppTest, PropertiesAndFieldsOfLikeNameAreApart) {
    launch();
    EXPECT_EQ(app.window(), nullptr);
    app.showSaveView();
    EXPECT_NE(saveScreen(), nullptr);
    EXPECT_EQ(app.saveViewController(), nullptr);
}

TEST_F(VelmoraAppTest, WithoutTheMarkerNoPaneOffersTheSaveButton) {
    openThreePanes();
    EXPECT_FALSE(app.allowSaveButton());
    for (std::size_t i = 0; i < depth(); ++i)
        EXPECT_FALSE(offersSave(*pane(i))) << i;
}

TEST_F(VelmoraAppTest, WithTheMarkerEveryPaneDoes) {
    std::filesystem::create_directories(directory / marker);
    openThreePanes();
    EXPECT_TRUE(app.allowSaveButton());
    for (std::size_t i = 0; i < depth(); ++i)
        EXPECT_TRUE(offersSave(*pane(i))) << i;
    // Removed again, which the next access finds.
    std::filesystem::remove_all(directory / "QuorraInternal");
    app.getSaveButtonPref();
    EXPECT_FALSE(app.allowSaveButton());
}

TEST_F(VelmoraAppTest, StatusGoesFromConnectingToTheTimeAndBack) {
    platform.clock.setZone({1h, false});
    launchAndConnect();
    // Connected, but nothing has been drawn since.
    EXPECT_EQ(status(*pane(0)), "Connecting...");
    show(threeLevels());
    EXPECT_EQ(app.updateMessage(), "Updated 2026-11-16 at 06:00:02");
    EXPECT_EQ(status(*pane(0)), "Updated 2026-11-16 at 06:00:02");
    EXPECT_FALSE(isSpinning(*pane(0)));
    EXPECT_EQ(pane(0)->title(), "Velmora");
    EXPECT_THAT(rows(*pane(0)), ElementsAre("A", "C"));

    loseService();
    EXPECT_EQ(status(*pane(0)), "Connecting...");
    clickRow(1);
    EXPECT_EQ(status(*topPane()), "Connecting...");
    EXPECT_TRUE(isSpinning(*topPane()));

    platform.telephony.available = true;
    platform.queue.advance(5s);
    ASSERT_TRUE(app.model().isConnected());
    static_cast<void>(app.navController().popViewController(true));
    EXPECT_EQ(status(*topPane()), "Updated 2026-11-16 at 06:00:02");
    EXPECT_FALSE(isSpinning(*topPane()));
}

TEST_F(VelmoraAppTest, RedrawWhileDisconnectedLeavesTheTimeAndSaysConnecting) {
    launchAndConnect();
    show(threeLevels());
    // A message, and then the service goes before the tick that shows it.
    ASSERT_TRUE(platform.ports.deliver(logChannelPortName(), 0, bytes(dictionary({{"E", "6"}, {"F", "7"}}))));
    loseService();
    ASSERT_FALSE(app.model().isConnected());
    EXPECT_EQ(app.updateMessage(), "Updated 2026-11-16 at 05:00:02");
    EXPECT_EQ(status(*pane(0)), "Connecting...");
    EXPECT_TRUE(isSpinning(*pane(0)));
    // Redrawn all the same; the cells were made for sections, and so show the names only.
    EXPECT_THAT(rows(*pane(0)), ElementsAre("E", "F"));
}

TEST_F(VelmoraAppTest, RedrawWithoutATreeReloadsTheRootPane) {
    launchAndConnect();
    show(threeLevels());
    ASSERT_THAT(rows(*pane(0)), ElementsAre("A", "C"));
    // A decoder that is not known takes the tree away: the connection that asked for it fails.
    technology = "kVoxLogChannelTechnology_Unheard";
    ASSERT_TRUE(platform.ports.deliver(logChannelPortName(), 0, bytes(threeLevels())));
    platform.ports.sever(channelName);
    platform.queue.advance(2s);
    runUntilIdle();
    EXPECT_EQ(pane(0)->title(), "Velmora");
    EXPECT_EQ(pane(0)->tableView().numberOfRowsInSection(0), 0u);
    EXPECT_EQ(status(*pane(0)), "Connecting...");
}

TEST_F(VelmoraAppTest, RedrawReloadsEveryPaneOnTheStack) {
    openThreePanes();
    show(dictionary(
        {{"A", dictionary({{"B", dictionary({{"x", "10"}, {"y", "20"}})}, {"b", "30"}})}, {"C", "40"}}));
    EXPECT_EQ(depth(), 3u);
    EXPECT_THAT(rows(*pane(2)), ElementsAre("x: 10", "y: 20"));
    EXPECT_EQ(pane(1)->numberOfRowsInSection(pane(1)->tableView(), 0), 2u);
    EXPECT_EQ(status(*pane(2)), "Updated 2026-11-16 at 05:00:04");
    static_cast<void>(app.navController().popViewController(false));
    static_cast<void>(app.navController().popViewController(false));
    runUntilIdle();
    EXPECT_EQ(depth(), 1u);
    // What was a section is a value now, in a cell that was made for a section: only its name shows.
    EXPECT_THAT(rows(*pane(0)), ElementsAre("A", "C"));
}

TEST_F(VelmoraAppTest, VanishedMiddlePanePopsToTheRootAndLeavesTheThirdAlone) {
    openThreePanes();
    const auto middle = pane(1);
    const auto third = pane(2);
    // The third pane's own path is there still, as the path of another node: it must not be asked for.
    show(dictionary({{"A/B", dictionary({{"x", "10"}, {"y", "20"}, {"z", "30"}})}, {"C", "4"}}));
    ASSERT_EQ(depth(), 1u);
    EXPECT_EQ(topPane(), pane(0));
    EXPECT_THAT(rows(*pane(0)), ElementsAre("A/B", "C"));
    EXPECT_EQ(status(*pane(0)), "Updated 2026-11-16 at 05:00:04");
    // Neither of the two that were discarded was given a new node.
    EXPECT_EQ(third->numberOfRowsInSection(third->tableView(), 0), 2u);
    EXPECT_EQ(middle->numberOfRowsInSection(middle->tableView(), 0), 2u);
}

TEST_F(VelmoraAppTest, VanishedTopPanePopsToTheOneBelowIt) {
    openThreePanes();
    show(dictionary({{"A", dictionary({{"a", "1"}, {"b", "3"}})}, {"C", "4"}}));
    ASSERT_EQ(depth(), 2u);
    EXPECT_EQ(topPane()->path(), "/A");
    EXPECT_EQ(status(*topPane()), "Updated 2026-11-16 at 05:00:04");
    EXPECT_FALSE(isSpinning(*topPane()));
    EXPECT_EQ(topPane()->numberOfRowsInSection(topPane()->tableView(), 0), 2u);
}

TEST_F(VelmoraAppTest, RedrawAddsOneEntryToTheHistoryHoweverManyPanesThereAre) {
    openThreePanes();
    show(threeLevels());
    EXPECT_EQ(app.model().state()["History"].asArray()->size(), 2u);
}

TEST_F(VelmoraAppTest, SaveScreenIsOpenedOnceAndClosed) {
    launchAndConnect();
    app.closeSaveView(); // nothing to close
    app.showSaveView();
    runUntilIdle();
    const auto first = saveScreen();
    ASSERT_NE(first, nullptr);
    EXPECT_TRUE(first->view().widget()->isVisible());
    app.showSaveView();
    EXPECT_EQ(saveScreen(), first);
    EXPECT_EQ(first->modalViewController(), nullptr);

    const QPointer<QWidget> shown = first->view().widget();
    app.closeSaveView();
    EXPECT_EQ(saveScreen(), nullptr);
    EXPECT_TRUE(eventually([&] { return !shown || !shown->isVisible(); }));
    app.showSaveView();
    EXPECT_NE(saveScreen(), nullptr);
    EXPECT_NE(saveScreen(), first);
}

TEST_F(VelmoraAppTest, SaveScreenCanBeOpenedWhileTheEarlierOneIsStillLeaving) {
    launchAndConnect();
    app.showSaveView();
    app.closeSaveView();
    app.showSaveView();
    runUntilIdle();
    ASSERT_NE(saveScreen(), nullptr);
    EXPECT_TRUE(saveScreen()->view().widget()->isVisible());
}

TEST_F(VelmoraAppTest, RedrawContinuesUnderTheSaveScreen) {
    openThreePanes();
    app.showSaveView();
    runUntilIdle();
    show(dictionary({{"C", "4"}, {"D", "5"}}));
    EXPECT_EQ(depth(), 1u);
    EXPECT_NE(saveScreen(), nullptr);
}

TEST_F(VelmoraAppTest, GSMRSSIIsWrittenSynchronizedAndAnnounced) {
    app._setGSMRSSI(true);
    app._setGSMRSSI(false);
    EXPECT_THAT(platform.fakePreferences.calls,
                ElementsAre("set com.velmora.HomeScreen LantheShowGSMRSSI true",
                            "synchronize com.velmora.HomeScreen",
                            "announce com.velmora.HomeScreen LantheShowGSMRSSI",
                            "set com.velmora.HomeScreen LantheShowGSMRSSI false",
                            "synchronize com.velmora.HomeScreen",
                            "announce com.velmora.HomeScreen LantheShowGSMRSSI"));
}

TEST_F(VelmoraAppTest, ToolkitsNoticeOfTheEndDoesNotShutDown) {
    launchAndConnect();
    static_cast<ApplicationDelegate&>(app).applicationWillTerminate(app);
    EXPECT_THAT(platform.fakePreferences.calls, IsEmpty());
    EXPECT_TRUE(app.model().isConnected());
}

TEST_F(VelmoraAppTest, ShutdownThatNothingCallsSwitchesThePreferenceOffAndLetsGo) {
    launchAndConnect();
    show(threeLevels());
    app.showSaveView();
    QWidget* window = pane(0)->view().widget()->window();
    app.applicationWillTerminate();
    EXPECT_EQ(platform.fakePreferences.calls.front(), "set com.velmora.HomeScreen LantheShowGSMRSSI false");
    EXPECT_EQ(app.updateMessage(), "");
    EXPECT_FALSE(window->isVisible());
    EXPECT_EQ(app.window(), nullptr);
    EXPECT_EQ(app.saveViewController(), nullptr);
    EXPECT_FALSE(platform.ports.isTaken(logChannelPortName())); // the model is gone
    // The fields of like name are untouched: the save screen is still the application's.
    EXPECT_NE(saveScreen(), nullptr);
    app.closeSaveView();
    EXPECT_EQ(saveScreen(), nullptr);
}

TEST_F(VelmoraAppTest, RunBringsTheScreenUpAndReturnsTheStatus) {
    platform.queue.async([] {});
    app.terminate(0);
    EXPECT_EQ(app.run(), 0);
    EXPECT_THAT(platform.fakePreferences.calls, IsEmpty());
}

TEST_F(VelmoraAppTest, EndOfTheApplicationFreesThePortWhileARetryIsDue) {
    launch();
    platform.telephony.available = false;
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_EQ(platform.queue.delayedCount(), 1u);
    EXPECT_FALSE(platform.ports.isTaken(logChannelPortName()));
}

} // namespace
} // namespace velmora
