// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveText.h"
#include "Tests/App/DriveView/PlayedDriveFixture.h"

#include <QTest>
#include <QWidget>

namespace velmora {
namespace {

using testing::Contains;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;
using namespace std::chrono_literals;

class PlayedDriveTest : public PlayedDriveFixture {
protected:
    static constexpr std::size_t driveLength = 3000;

    void openDrive(int width = 1280, int height = 800) { openIn(width, height, record("lte", driveLength)); }
    [[nodiscard]] ChartView& chart() const { return view().charts().chart(); }
    [[nodiscard]] std::int64_t momentOf(std::size_t message) const {
        return nanosecondsOf(messages[message - 1].time);
    }
    [[nodiscard]] QWidget* gridOfEvents() const {
        for (QWidget* const each : view().widget()->findChildren<QWidget*>("velmora.grid"))
            if (each->accessibleName() == "Events")
                return each;
        return nullptr;
    }
};

TEST_F(PlayedDriveTest, ShowsTheMomentThatThePanesShow) {
    openDrive();
    ASSERT_TRUE(app.drive().isShown());
    EXPECT_THAT(texts(), Contains("Radio technology not reported"));
    playback().seekToMessage(2000);
    const DriveNow now = playback().drive().now();
    ASSERT_TRUE(now.technology && now.level);
    EXPECT_THAT(texts(), Contains(StartsWith(std::string(nameOf(*now.technology)))));
    EXPECT_THAT(texts(), Contains(numberText(now.level->text)));
    EXPECT_EQ(view().neighbours().rows().size(), playback().drive().neighbours().size());
    EXPECT_THAT(texts(), Not(Contains(HasSubstr("Not connected"))));
    shoot("recording-1280x800");
}

TEST_F(PlayedDriveTest, AgesAreThoseOfTheMoment) {
    openDrive();
    playback().seekToMessage(2000);
    const std::vector<std::string> before = texts();
    platform.queue.advance(60s);
    runUntilIdle();
    EXPECT_EQ(texts(), before) << "no time passes in a recording that stands";
}

TEST_F(PlayedDriveTest, TheChartsHaveAllOfItWithTheCursorAtTheMoment) {
    openDrive();
    playback().seekToMessage(1000);
    EXPECT_EQ(chart().cursor(), momentOf(1000));
    EXPECT_LE(chart().range().begin_ns, momentOf(100));
    EXPECT_GE(chart().range().end_ns, momentOf(driveLength));
    playback().seekToMessage(2500);
    EXPECT_EQ(chart().cursor(), momentOf(2500));
}

TEST_F(PlayedDriveTest, MovingTheCursorMovesThePlayer) {
    openDrive();
    playback().seekToMessage(1000);
    QWidget* const shown = chart().widget();
    shown->setFocus();
    const std::uint64_t before = playback().player().position();
    QTest::keyClick(shown, Qt::Key_Right);
    runUntilIdle();
    EXPECT_GT(playback().player().position(), before);
    EXPECT_EQ(chart().cursor(), nanosecondsOf(*playback().player().now()));
    QTest::keyClick(shown, Qt::Key_Left);
    QTest::keyClick(shown, Qt::Key_Left);
    runUntilIdle();
    EXPECT_LE(playback().player().position(), before);
    EXPECT_EQ(chart().cursor(), nanosecondsOf(*playback().player().now()));
}

TEST_F(PlayedDriveTest, ChoosingAnEventMovesThePlayerThere) {
    openDrive();
    const auto& events = playback().drive().model().events();
    ASSERT_GT(events.size(), 2U);
    QWidget* const grid = gridOfEvents();
    ASSERT_TRUE(grid);
    grid->setFocus();
    QTest::keyClick(grid, Qt::Key_Down);
    QTest::keyClick(grid, Qt::Key_Home);
    QTest::keyClick(grid, Qt::Key_Return);
    runUntilIdle();
    ASSERT_TRUE(playback().player().now());
    EXPECT_EQ(*playback().player().now(), events.front().time);
}

TEST_F(PlayedDriveTest, FollowsWhileItPlays) {
    openDrive();
    playback().seekToMessage(1000);
    playback().play();
    for (int i = 0; i < 12; ++i) {
        platform.queue.advance(250ms);
        runUntilIdle();
    }
    EXPECT_GT(playback().player().position(), 1000U);
    EXPECT_GT(*chart().cursor(), momentOf(1000));
    playback().pause();
}

TEST_F(PlayedDriveTest, ARowThatIsPinnedHasTheSamplesOfTheWholeRecording) {
    openDrive();
    playback().seekToMessage(1000);
    const std::uint64_t before = playback().player().position();
    std::string path;
    for (const auto& each : {"/LTE/LTE Serving Cell/RSRP", "/LTE/Serving Cell/RSRP"})
        if (playback().drive().model().canPin(each))
            path = each;
    const Catalogue& catalogue = playback().player().picture().catalogue();
    for (const CatalogueField& each : catalogue.fields())
        if (path.empty() && each.role == Role::ServingLevel)
            path = each.path;
    ASSERT_TRUE(app.drive().source().togglePin(path)) << path;
    for (int i = 0; i < 2000 && !playback().index().isComplete(); ++i)
        platform.queue.advance(2ms);
    runUntilIdle();
    EXPECT_EQ(playback().player().position(), before);
    EXPECT_GT(playback().drive().history().ring(firstPinnedSeries)->size(), 10U);
    platform.queue.advance(3s);
    runUntilIdle();
    EXPECT_EQ(chart().panelCount(), 3U);
}

TEST_F(PlayedDriveTest, ShowsWhatIsReceivedAgainWhenItIsClosed) {
    openDrive();
    playback().seekToMessage(2000);
    press(Qt::Key_W, Qt::ControlModifier);
    EXPECT_EQ(app.playback(), nullptr);
    EXPECT_TRUE(app.drive().isShown());
    EXPECT_THAT(texts(), Contains("Radio technology not reported"));
    EXPECT_FALSE(chart().cursor());
}

TEST_F(PlayedDriveTest, IsAScreenOfItsOwnOnAPhone) {
    openDrive(360, 640);
    playback().seekToMessage(2000);
    EXPECT_FALSE(app.drive().isShown());
    press(Qt::Key_D, Qt::ControlModifier);
    ASSERT_TRUE(app.drive().isShown());
    EXPECT_THAT(texts(), Contains(numberText(playback().drive().now().level->text)));
    shoot("recording-360x640");
    view().setContentOffset(10000);
    runUntilIdle();
    shoot("recording-360x640-end");
}

} // namespace
} // namespace velmora
