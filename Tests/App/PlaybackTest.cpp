// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/PlaybackFixture.h"

#include "Model/Snapshot.h"

#include <QDropEvent>
#include <QLineEdit>
#include <QMenu>
#include <QMimeData>
#include <QSlider>
#include <QTest>
#include <QToolButton>
#include <QUrl>

#include <fstream>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class PlaybackScreenTest : public PlaybackFixture {};

TEST_F(PlaybackScreenTest, ShowsTheRecordingInsteadOfConnecting) {
    openPaused(write("a.pcapng", fiveBands()));
    EXPECT_FALSE(app.model().isConnected());
    EXPECT_EQ(platform.queue.delayedCount(), 0U) << "an attempt to connect is due";
    EXPECT_EQ(status(*topPane()), "At the start");
    press(Qt::Key_Period);
    EXPECT_THAT(rows(*topPane()), ElementsAre("Band: A", "Cell: 12"));
    EXPECT_EQ(status(*topPane()), "Updated 2026-11-16 at 05:00:00");
    EXPECT_FALSE(isSpinning(*topPane()));
    EXPECT_EQ(shownNotice(), "");
}

TEST_F(PlaybackScreenTest, PlaysFromTheFrontAtTheSpeedOfTheDrive) {
    app.setRecording(write("a.pcapng", fiveBands()), {});
    launch();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_TRUE(app.playback()->isPlaying());
    pass(50ms);
    EXPECT_EQ(shownBand(), "A");
    pass(400ms);
    EXPECT_EQ(shownBand(), "A");
    pass(100ms);
    EXPECT_EQ(shownBand(), "B");
    pass(1000ms);
    EXPECT_EQ(shownBand(), "C");
    pass(3000ms);
    EXPECT_EQ(shownBand(), "E");
    EXPECT_FALSE(app.playback()->isPlaying()) << "that was the end";
    press(Qt::Key_Space);
    pass(50ms);
    EXPECT_EQ(shownBand(), "A") << "once more";
}

TEST_F(PlaybackScreenTest, SpacePausesAndPlaysOn) {
    openPaused(write("a.pcapng", fiveBands()));
    press(Qt::Key_Space);
    pass(600ms);
    EXPECT_EQ(shownBand(), "B");
    press(Qt::Key_Space);
    pass(10s);
    EXPECT_EQ(shownBand(), "B");
    EXPECT_EQ(part("velmora.playback.play")->accessibleName(), "Play");
    press(Qt::Key_Space);
    EXPECT_EQ(part("velmora.playback.play")->accessibleName(), "Pause");
    // From B's time on: C is a second later.
    pass(900ms);
    EXPECT_EQ(shownBand(), "B");
    pass(150ms);
    EXPECT_EQ(shownBand(), "C");
}

TEST_F(PlaybackScreenTest, KeysStepByMessageAndByRefreshBothWays) {
    openPaused(write("a.pcapng", fiveBands()));
    std::string shown;
    for (const int key : {Qt::Key_Period, Qt::Key_Period, Qt::Key_Comma, Qt::Key_Greater, Qt::Key_Greater,
                          Qt::Key_Greater, Qt::Key_Less, Qt::Key_Less, Qt::Key_Comma}) {
        press(key);
        shown += shownBand();
    }
    EXPECT_EQ(shown, "ABACDEDCB");
}

TEST_F(PlaybackScreenTest, BracketsGoToEvents) {
    // Two silences of more than 30 s.
    openPaused(
        write("a.pcapng", {{0, band("A")}, {40'000, band("B")}, {41'000, band("C")}, {99'000, band("D")}}));
    press(Qt::Key_BracketRight);
    EXPECT_EQ(shownBand(), "A");
    EXPECT_EQ(shownNotice(), "gap: no message for 40.000 s");
    press(Qt::Key_BracketRight);
    EXPECT_EQ(shownBand(), "C");
    EXPECT_EQ(shownNotice(), "gap: no message for 58.000 s");
    press(Qt::Key_BracketRight);
    EXPECT_EQ(shownBand(), "C") << "there is none after it";
    press(Qt::Key_BracketLeft);
    EXPECT_EQ(shownBand(), "A");
    EXPECT_EQ(shownNotice(), "gap: no message for 40.000 s");
    press(Qt::Key_Period);
    EXPECT_EQ(shownNotice(), "");
}

TEST_F(PlaybackScreenTest, SpeedMultipliesTime) {
    openPaused(write("a.pcapng", {{0, band("A")}, {50'000, band("B")}, {99'000, band("C")}}));
    auto* const speed = qobject_cast<QToolButton*>(part("velmora.playback.speed"));
    ASSERT_NE(speed, nullptr);
    EXPECT_EQ(speed->text(), "1×");
    ASSERT_EQ(speed->menu()->actions().size(), 10);
    EXPECT_EQ(speed->menu()->actions().front()->text(), "0.1×");
    speed->menu()->actions().back()->trigger();
    EXPECT_EQ(speed->accessibleName(), "Speed 100×");
    press(Qt::Key_Space);
    pass(450ms);
    EXPECT_EQ(shownBand(), "A");
    pass(100ms);
    EXPECT_EQ(shownBand(), "B");
    speed->menu()->actions().front()->trigger();
    pass(10s);
    EXPECT_EQ(shownBand(), "B");
}

TEST_F(PlaybackScreenTest, SliderAndTypedTimesSeek) {
    openPaused(write("a.pcapng", fiveBands()));
    auto* const slider = qobject_cast<QSlider*>(part("velmora.playback.slider"));
    auto* const time = qobject_cast<QLineEdit*>(part("velmora.playback.time"));
    ASSERT_TRUE(slider && time);
    EXPECT_EQ(slider->accessibleName(), "Moment");
    slider->setValue(slider->maximum() / 2); // 2.25 s
    EXPECT_EQ(shownBand(), "C");
    EXPECT_EQ(time->text(), "2026-11-16 05:00:01");
    EXPECT_EQ(slider->accessibleDescription(), time->text());
    slider->setValue(slider->maximum());
    EXPECT_EQ(shownBand(), "E");
    click(time);
    time->setText("05:00:02");
    QTest::keyClick(time, Qt::Key_Return);
    EXPECT_EQ(shownBand(), "C");
    click(time);
    time->setText("never");
    QTest::keyClick(time, Qt::Key_Return);
    EXPECT_EQ(shownBand(), "C");
    // A text field has the keys for itself.
    time->setText("");
    QTest::keyClick(time, Qt::Key_Period);
    EXPECT_EQ(shownBand(), "C");
    EXPECT_EQ(time->text(), ".");
}

TEST_F(PlaybackScreenTest, PanesBelowTheRootFollow) {
    const auto cell = [](const char* channel) {
        return dictionary({{"Cells", dictionary({{"Serving", dictionary({{"ARFCN", channel}, {"C1", "5"}})},
                                                 {"Other", "none"}})},
                           {"State", "idle"}});
    };
    openPaused(write("a.pcapng", {{0, cell("17")}, {100, cell("18")}}));
    press(Qt::Key_Period);
    clickRow(0);
    ASSERT_TRUE(eventually([this] { return depth() == 2; }));
    clickRow(0);
    ASSERT_TRUE(eventually([this] { return depth() == 3; }));
    EXPECT_THAT(rows(*topPane()), ElementsAre("ARFCN: 17", "C1: 5"));
    press(Qt::Key_Period);
    EXPECT_THAT(rows(*topPane()), ElementsAre("ARFCN: 18", "C1: 5"));
}

TEST_F(PlaybackScreenTest, SaveScreenSavesTheMoment) {
    openPaused(write("a.pcapng", fiveBands()));
    app.playback()->seekToMessage(4);
    open();
    EXPECT_THAT(listed(),
                ElementsAre("Snapshot (2026-11-16 05:00:02 +0000)", "Snapshot (2026-11-16 05:00:04 +0000)"));
    save();
    const Value snapshot = content(startSeconds);
    const Player::Saved saved = app.playback()->saved();
    EXPECT_EQ(snapshot, Value(makeSnapshot(FakeClock::defaultNow() + 4s, saved.contents, "")));
}

TEST_F(PlaybackScreenTest, MaskedIdentitiesAreMaskedInRecordingsToo) {
    const auto sim = [](const char* iccid) { return dictionary({{"ICCID", iccid}, {"State", "Ready"}}); };
    openPaused(write("a.pcapng", {{0, sim("8949027500001234568")}, {100, sim("8949027500001234568")}}));
    app.playback()->seekToMessage(2);
    EXPECT_THAT(rows(*topPane()), ElementsAre("ICCID: 8949027500001234568", "State: Ready"));
    app.togglePrivacy();
    runUntilIdle();
    ASSERT_THAT(rows(*topPane()), testing::SizeIs(2));
    EXPECT_THAT(rows(*topPane())[0], testing::MatchesRegex("ICCID: 89[0-9]{17}"));
    EXPECT_NE(rows(*topPane())[0], "ICCID: 8949027500001234568");
    EXPECT_EQ(app.playback()->player().position(), 2U);
    EXPECT_EQ(shownNotice(), "Identities are masked. Ctrl-M shows them.");
    EXPECT_FALSE(app.model().isConnected());
}

TEST_F(PlaybackScreenTest, DamageIsSaidWithRecordAndOffset) {
    const std::string path = write("a.pcapng", fiveBands());
    const auto whole = std::filesystem::file_size(path);
    std::filesystem::resize_file(path, whole - 10);
    openPaused(path);
    EXPECT_EQ(app.playback()->index().messages(), 4U);
    EXPECT_THAT(shownNotice(), testing::MatchesRegex("a\\.pcapng is cut off in record 5 at offset [0-9]+ "
                                                     "\\(block cut off after [0-9]+ of [0-9]+ bytes\\)\\."));
    app.playback()->seekToMessage(9);
    EXPECT_EQ(shownBand(), "D");
}

TEST_F(PlaybackScreenTest, AFileThatChangesIsSaid) {
    const std::string path = write("a.pcapng", fiveBands());
    openPaused(path);
    std::ofstream(path, std::ios::app) << "more";
    press(Qt::Key_Period);
    EXPECT_EQ(shownNotice(), "a.pcapng has grown since it was opened; open it again to see the rest.");
    EXPECT_EQ(shownBand(), "A");
}

TEST_F(PlaybackScreenTest, WhatCannotBeOpenedIsSaidAndChangesNothing) {
    launchAndConnect();
    show(band("live"));
    app.openRecording((directory / "missing.pcapng").string());
    runUntilIdle();
    EXPECT_TRUE(
        isShown((directory / "missing.pcapng").string() + ": cannot open: No such file or directory"));
    EXPECT_EQ(app.playback(), nullptr);
    EXPECT_EQ(shownBand(), "live");
}

TEST_F(PlaybackScreenTest, ADroppedFileIsShownUntilItIsClosed) {
    const std::string path = write("a.pcapng", fiveBands());
    launchAndConnect();
    show(band("live"));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(QString::fromStdString(path))});
    QDragEnterEvent enter(QPoint(10, 10), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(window(), &enter);
    EXPECT_TRUE(enter.isAccepted());
    QDropEvent drop(QPointF(10, 10), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(window(), &drop);
    runUntilIdle();
    ASSERT_NE(app.playback(), nullptr);
    press(Qt::Key_Space);
    press(Qt::Key_Period);
    EXPECT_EQ(shownBand(), "A");
    show(band("still live"));
    EXPECT_EQ(shownBand(), "A") << "what is received is not shown";
    QTest::keyClick(window(), Qt::Key_W, Qt::ControlModifier);
    runUntilIdle();
    EXPECT_EQ(app.playback(), nullptr);
    EXPECT_EQ(part("velmora.playback"), nullptr);
    EXPECT_EQ(shownBand(), "still live");
}

TEST_F(PlaybackScreenTest, FitsAPhoneAndAWideWindow) {
    openPaused(write("a.pcapng", fiveBands()));
    for (const int width : {360, 700}) {
        window()->resize(width, 640);
        runUntilIdle();
        const QWidget* const bar = part("velmora.playback");
        EXPECT_EQ(bar->width(), width);
        EXPECT_EQ(bar->height(), width == 360 ? 96 : 48);
        for (const char* name : {"play", "earlierMessage", "nextMessage", "earlierRefresh", "nextRefresh",
                                 "slider", "time", "speed"}) {
            const QWidget* const each = part((std::string("velmora.playback.") + name).c_str());
            ASSERT_NE(each, nullptr) << name;
            EXPECT_TRUE(bar->rect().contains(each->geometry())) << name << " at " << width;
            EXPECT_GE(each->height(), 44) << name;
            EXPECT_GE(each->width(), 44) << name;
            for (const QWidget* const other :
                 bar->findChildren<QWidget*>(QString(), Qt::FindDirectChildrenOnly))
                EXPECT_TRUE(other == each || !other->geometry().intersects(each->geometry()))
                    << name << " at " << width;
        }
        EXPECT_GE(part("velmora.table")->height(), 300);
    }
}

} // namespace
} // namespace velmora
