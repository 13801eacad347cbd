// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveText.h"
#include "Tests/App/DriveView/DriveFixture.h"

#include <QApplication>
#include <QContextMenuEvent>
#include <QMenu>
#include <QTest>
#include <QWidget>

#include <chrono>

namespace velmora {
namespace {

using testing::Contains;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;
using namespace std::chrono_literals;

class DriveViewTest : public DriveFixture {
protected:
    static constexpr const char* levelPath = "/GSM/GSM Serving Cell/RSSI";

    /// Opens the section of that name from the pane on top.
    void open(const std::string& name) {
        const auto pane = topPane();
        for (std::size_t row = 0; row < pane->tableView().numberOfRowsInSection(0); ++row) {
            pane->tableView().scrollToRow(IndexPath(0, row));
            runUntilIdle();
            if (const auto shown = cell(*pane, row); shown && shown->key().text() == name) {
                clickRow(row);
                return;
            }
        }
        ADD_FAILURE() << "no row " << name;
    }
};

TEST_F(DriveViewTest, SaysThatNothingHasBeenReported) {
    launchIn(1280, 800);
    EXPECT_THAT(texts(), Contains("Radio technology not reported"));
    EXPECT_THAT(texts(), Contains("not reported"));
    EXPECT_THAT(texts(), Contains("No event so far"));
}

TEST_F(DriveViewTest, ShowsTheServingCellWithItsClassAndAge) {
    launchIn(1280, 800);
    drive(40);
    const DriveNow now = model().now();
    ASSERT_TRUE(now.technology && now.level && now.channel);
    EXPECT_THAT(texts(), Contains(StartsWith(std::string(nameOf(*now.technology)))));
    EXPECT_THAT(texts(), Contains(numberText(now.level->text)));
    EXPECT_THAT(texts(), Contains(HasSubstr(" s ago")));
    const auto levelClass = model().classes().of(now.technology, Role::ServingLevel, now.level->number);
    ASSERT_TRUE(levelClass);
    EXPECT_THAT(texts(), Contains(StartsWith(std::string(nameOf(*levelClass)) + ", ")));
}

TEST_F(DriveViewTest, SaysThatAValueIsOld) {
    launchIn(1280, 800);
    drive(40);
    ASSERT_TRUE(model().now().level);
    wait(8);
    EXPECT_THAT(texts(), Contains(HasSubstr("s ago, old")));
}

TEST_F(DriveViewTest, ListsTheNeighboursByLevel) {
    launchIn(1280, 800);
    drive(40);
    const auto neighbours = model().neighbours();
    ASSERT_FALSE(neighbours.empty());
    const std::vector<GridRow>& rows = view().neighbours().rows();
    ASSERT_EQ(rows.size(), neighbours.size());
    for (std::size_t i = 0; i < rows.size(); ++i) {
        EXPECT_EQ(rows[i][2].text,
                  neighbours[i].level_dBm ? numberText(*neighbours[i].level_dBm) : "not reported");
        EXPECT_EQ(rows[i][2].bar.has_value(), neighbours[i].level_dBm.has_value());
    }
}

TEST_F(DriveViewTest, SaysThatTheLinkIsLost) {
    launchIn(1280, 800);
    drive(20);
    loseService();
    wait(2);
    EXPECT_THAT(texts(), Contains(StartsWith("Link lost")));
    EXPECT_FALSE(model().now().level);
}

TEST_F(DriveViewTest, ForgetsEverythingWhenIdentitiesAreMasked) {
    launchIn(1280, 800);
    drive(40);
    ASSERT_FALSE(model().events().empty());
    press(Qt::Key_M, Qt::ControlModifier);
    EXPECT_TRUE(model().events().empty());
    EXPECT_EQ(app.drive().history().ring(servingLevelSeries)->size(), 0U);
    EXPECT_THAT(texts(), Contains("Radio technology not reported"));
}

TEST_F(DriveViewTest, ChartsTheSamplesOfTheDrive) {
    launchIn(1280, 800);
    drive(40);
    const DriveNow now = model().now();
    ASSERT_TRUE(now.level);
    const SampleRing& ring = *app.drive().history().ring(servingLevelSeries);
    ASSERT_GT(ring.size(), 0U);
    const auto newest = ring.at(now.level->time.time_since_epoch().count());
    ASSERT_TRUE(newest);
    EXPECT_EQ(newest->value, now.level->number);
    EXPECT_EQ(view().charts().chart().panelCount(), 2U);
}

TEST_F(DriveViewTest, PinsTheRowOfThePaneThatHasTheKeyboard) {
    launchIn(1280, 800);
    drive(20);
    open("GSM");
    open("GSM Serving Cell");
    const auto pane = topPane();
    for (std::size_t row = 0; row < pane->tableView().numberOfRowsInSection(0); ++row)
        if (const auto shown = cell(*pane, row); shown && shown->key().text() == "RSSI")
            pane->tableView().setFocusRow(IndexPath(0, row));
    press(Qt::Key_P, Qt::ControlModifier);
    ASSERT_TRUE(model().isPinned(levelPath));
    drive(10);
    EXPECT_EQ(view().charts().chart().panelCount(), 3U);
    EXPECT_GT(app.drive().history().ring(firstPinnedSeries)->size(), 0U);
    press(Qt::Key_P, Qt::ControlModifier);
    drive(2);
    EXPECT_FALSE(model().isPinned(levelPath));
    EXPECT_EQ(view().charts().chart().panelCount(), 2U);
}

TEST_F(DriveViewTest, RowsWithNumbersHaveAMenuThatPinsThem) {
    launchIn(1280, 800);
    drive(20);
    open("GSM");
    const auto sections = topPane();
    EXPECT_TRUE(sections->menuForRowAtIndexPath(sections->tableView(), IndexPath(0, 0)).empty());
    open("GSM Serving Cell");
    const auto pane = topPane();
    std::size_t menus = 0;
    for (std::size_t row = 0; row < pane->tableView().numberOfRowsInSection(0); ++row)
        menus += pane->menuForRowAtIndexPath(pane->tableView(), IndexPath(0, row)).size();
    EXPECT_GT(menus, 0U);
    for (std::size_t row = 0; row < pane->tableView().numberOfRowsInSection(0); ++row) {
        const auto shown = cell(*pane, row);
        if (!shown || shown->key().text() != "RSSI")
            continue;
        const Rect place = pane->tableView().rectForRow(IndexPath(0, row));
        QWidget* const viewport = pane->tableView().widget()->findChild<QWidget*>("qt_scrollarea_viewport");
        const QPoint middle(static_cast<int>(place.x + 50), static_cast<int>(place.y + place.height / 2));
        QContextMenuEvent event(QContextMenuEvent::Mouse, middle, viewport->mapToGlobal(middle));
        QApplication::sendEvent(viewport, &event);
        runUntilIdle();
        auto* const menu = window()->findChild<QMenu*>("velmora.menu");
        ASSERT_TRUE(menu);
        ASSERT_EQ(menu->actions().size(), 1);
        EXPECT_EQ(menu->actions()[0]->text(), "Pin as Chart");
        menu->actions()[0]->trigger();
        menu->close();
    }
    EXPECT_TRUE(model().isPinned(levelPath));
}

TEST_F(DriveViewTest, ChoosingAnEventMovesTheCursorThere) {
    launchIn(1280, 800);
    drive(60);
    app.drive().controller().refreshNow();
    ASSERT_FALSE(model().events().empty());
    QWidget* grid = nullptr;
    for (QWidget* const each : view().widget()->findChildren<QWidget*>("velmora.grid"))
        if (each->accessibleName() == "Events")
            grid = each;
    ASSERT_TRUE(grid);
    grid->setFocus();
    QTest::keyClick(grid, Qt::Key_Down);
    QTest::keyClick(grid, Qt::Key_Home);
    QTest::keyClick(grid, Qt::Key_Return);
    runUntilIdle();
    ASSERT_TRUE(view().charts().chart().cursor());
    EXPECT_EQ(*view().charts().chart().cursor(), model().events().front().time.time_since_epoch().count());
}

TEST_F(DriveViewTest, TakesNothingOverWhileItIsHidden) {
    launchIn(1280, 800);
    drive(20);
    press(Qt::Key_D, Qt::ControlModifier);
    const std::vector<GridRow> before = view().neighbours().rows();
    drive(30);
    EXPECT_EQ(view().neighbours().rows(), before);
    press(Qt::Key_D, Qt::ControlModifier);
    EXPECT_EQ(view().neighbours().rows().size(), model().neighbours().size());
}

TEST(DriveTextTest, SaysHowLongAgoAMomentWas) {
    const Time now(1000s);
    EXPECT_EQ(ageText(now, now), "0 s ago");
    EXPECT_EQ(ageText(now - 59s, now), "59 s ago");
    EXPECT_EQ(ageText(now - 60s, now), "1 min ago");
    EXPECT_EQ(ageText(now - 7200s, now), "2 h ago");
    EXPECT_EQ(ageText(now + 5s, now), "0 s ago");
    EXPECT_FALSE(isOld(now - 5s, now));
    EXPECT_TRUE(isOld(now - 5001ms, now));
}

} // namespace
} // namespace velmora
