// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/DriveView/DriveFixture.h"

#include <QAbstractButton>
#include <QApplication>
#include <QLabel>
#include <QPalette>
#include <QWidget>

namespace velmora {
namespace {

using testing::Contains;
using testing::Not;

struct Shape {
    int width;
    int height;
    bool isDark;
};

class DriveLayoutTest : public DriveFixture, public testing::WithParamInterface<Shape> {
protected:
    DriveLayoutTest() {
        if (!GetParam().isDark)
            return;
        QPalette palette(QColor(0x2b, 0x2b, 0x2e), QColor(0x1c, 0x1c, 0x1e));
        palette.setColor(QPalette::Base, QColor(0x24, 0x24, 0x27));
        QApplication::setPalette(palette);
    }
    ~DriveLayoutTest() override { QApplication::setPalette(QPalette()); }

    [[nodiscard]] QRect placeOf(const QWidget* widget) const {
        return {widget->mapTo(window(), QPoint()), widget->size()};
    }
};

TEST_P(DriveLayoutTest, LeavesNoTextOverAnotherOrOutside) {
    const auto [width, height, isDark] = GetParam();
    launchIn(width, height);
    if (!app.drive().isShown())
        press(Qt::Key_D, Qt::ControlModifier);
    ASSERT_TRUE(app.drive().isShown());
    drive(40);
    const std::string name = std::to_string(width) + 'x' + std::to_string(height) + (isDark ? "-dark" : "");
    shoot(name);
    const std::vector<QLabel*> all = labels();
    ASSERT_GT(all.size(), 15U);
    const QRect room = placeOf(view().widget());
    for (std::size_t i = 0; i < all.size(); ++i) {
        const QRect place = placeOf(all[i]);
        EXPECT_GE(place.left(), room.left()) << all[i]->text().toStdString();
        EXPECT_LE(place.right(), room.right()) << all[i]->text().toStdString();
        for (std::size_t k = i + 1; k < all.size(); ++k)
            EXPECT_FALSE(place.intersects(placeOf(all[k])))
                << all[i]->text().toStdString() << " and " << all[k]->text().toStdString();
    }
    view().setContentOffset(10000);
    runUntilIdle();
    shoot(name + "-end");
}

INSTANTIATE_TEST_SUITE_P(All, DriveLayoutTest,
                         testing::Values(Shape{360, 640, false}, Shape{360, 640, true},
                                         Shape{1280, 800, false}, Shape{1280, 800, true},
                                         Shape{720, 480, false}),
                         [](const auto& row) {
                             return std::to_string(row.param.width) + "x" + std::to_string(row.param.height) +
                                    (row.param.isDark ? "dark" : "");
                         });

class DriveWindowTest : public DriveFixture {};

TEST_F(DriveWindowTest, StandsBesideThePanesOfAWideWindow) {
    launchIn(1280, 800);
    ASSERT_TRUE(app.drive().isShown());
    const QWidget* const panes = app.navController().view().widget();
    EXPECT_EQ(panes->width(), 480);
    EXPECT_TRUE(panes->isVisible());
    EXPECT_TRUE(view().widget()->isVisible());
    EXPECT_GT(view().widget()->mapTo(window(), QPoint()).x(), 479);
    resize(720, 800);
    EXPECT_TRUE(app.drive().isShown());
    EXPECT_LE(panes->width(), 480);
    EXPECT_EQ(view().widget()->width(), 720 - panes->width() - 1);
}

TEST_F(DriveWindowTest, IsClosedBesideThePanesUntilItIsAskedFor) {
    launchIn(1280, 800);
    press(Qt::Key_D, Qt::ControlModifier);
    EXPECT_FALSE(app.drive().isShown());
    EXPECT_EQ(app.navController().view().widget()->width(), 1280);
    EXPECT_TRUE(platform.fakePreferences.boolean("com.velmora.velmora", "DriveViewClosed"));
    auto* const button = window()->findChild<QAbstractButton*>("velmora.headerButton");
    ASSERT_TRUE(button && button->isVisible());
    EXPECT_EQ(button->text(), "Drive");
    click(button);
    EXPECT_TRUE(app.drive().isShown());
    EXPECT_FALSE(platform.fakePreferences.boolean("com.velmora.velmora", "DriveViewClosed"));
}

TEST_F(DriveWindowTest, IsAScreenOfItsOwnOnANarrowWindowWithAWayBack) {
    launchIn(360, 640);
    EXPECT_FALSE(app.drive().isShown());
    drive(10);
    const std::vector<std::string> before = rows(*topPane());
    click(window()->findChild<QAbstractButton*>("velmora.headerButton"));
    ASSERT_TRUE(app.drive().isShown());
    EXPECT_EQ(view().widget()->width(), 360);
    EXPECT_FALSE(app.navController().view().widget()->isVisible());
    press(Qt::Key_Escape);
    EXPECT_FALSE(app.drive().isShown());
    EXPECT_TRUE(app.navController().view().widget()->isVisible());
    EXPECT_EQ(rows(*topPane()), before);
    press(Qt::Key_D, Qt::ControlModifier);
    ASSERT_TRUE(app.drive().isShown());
    for (QAbstractButton* const back : window()->findChildren<QAbstractButton*>("velmora.back"))
        if (back->isVisible())
            click(back);
    EXPECT_FALSE(app.drive().isShown());
}

TEST_F(DriveWindowTest, MovesBesideAndAwayAsTheWindowChanges) {
    launchIn(360, 640);
    EXPECT_FALSE(app.drive().isShown());
    resize(1000, 640);
    EXPECT_TRUE(app.drive().isShown());
    EXPECT_TRUE(app.navController().view().widget()->isVisible());
    resize(360, 640);
    EXPECT_FALSE(app.drive().isShown());
    EXPECT_TRUE(app.navController().view().widget()->isVisible());
}

TEST_F(DriveWindowTest, BeginsWithTheDriveViewWhereThatWasAskedFor) {
    app.setBeginsWithDrive(true);
    launchIn(360, 640);
    EXPECT_TRUE(app.drive().isShown());
    EXPECT_FALSE(app.navController().view().widget()->isVisible());
}

TEST_F(DriveWindowTest, LeavesTheKeyboardWithThePanes) {
    launchIn(1280, 800);
    EXPECT_TRUE(topPane()->tableView().isFirstResponder());
}

} // namespace
} // namespace velmora
