// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Panes, drive view and save screen on the screens of phones and desktops. The script wayland-screens runs
// these tests on a compositor too.

#include "App/DriveView/DriveScreen.h"
#include "App/VelmoraSaveView.h"
#include "Tests/App/SaveScreenFixture.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QApplication>
#include <QDir>
#include <QInputMethodEvent>
#include <QPalette>
#include <QWidget>

#include <algorithm>
#include <chrono>
#include <cstdlib>

namespace velmora {
namespace {

using namespace std::chrono_literals;

class PhoneScreenTest : public SaveScreenFixture {
protected:
    ~PhoneScreenTest() override { QGuiApplication::setLayoutDirection(Qt::LeftToRight); }

    /// The application with rows to show in a window of that size. A compositor takes its time.
    void start(int width, int height) {
        std::filesystem::create_directories(directory / marker);
        launch();
        resize(width, height);
        ASSERT_TRUE(eventually([this] {
            platform.queue.runPending();
            return app.model().isConnected();
        }));
        auto rows = std::make_shared<Dictionary>();
        rows->set("Cells", dictionary({{"Level", "-80 dBm"}, {"Quality", "-9 dB"}}));
        for (int i = 10; i < 40; ++i)
            rows->set("Measured value " + std::to_string(i), Value("-" + std::to_string(i) + " dBm"));
        rows->set("Description of the Neighbouring Cell", Value("one of which there is a lot to say here"));
        show(Value(rows));
    }
    [[nodiscard]] QWidget* window() const { return app.navController().view().widget()->window(); }
    /// Where the compositor gives every window its size, the test only waits for that.
    void resize(int width, int height) {
        if (!std::getenv("VELMORA_TEST_SIZE_IS_GIVEN"))
            window()->resize(width, height);
        ASSERT_TRUE(eventually([&] { return window()->size() == QSize(width, height); }));
        runUntilIdle();
    }
    [[nodiscard]] bool isInSight(QWidget* widget) const {
        const QRect place(widget->mapTo(window(), QPoint()), widget->size());
        return widget->isVisible() && !place.isEmpty() && window()->rect().contains(place);
    }
    [[nodiscard]] bool isInSight(QWidget* widget, QPoint place) const {
        return widget->isVisible() && window()->rect().contains(widget->mapTo(window(), place));
    }
    [[nodiscard]] bool isInSight(const char* name) const {
        QWidget* const part = window()->findChild<QWidget*>(name);
        return part && isInSight(part);
    }
    void expectPaneInSight() {
        EXPECT_TRUE(isInSight("velmora.title"));
        EXPECT_TRUE(isInSight("velmora.status"));
        EXPECT_TRUE(isInSight("velmora.save"));
        TableView& table = topPane()->tableView();
        EXPECT_TRUE(isInSight(table.widget()));
        const std::size_t rows = table.numberOfRowsInSection(0);
        for (const std::size_t row : {std::size_t{0}, rows - 1}) {
            table.scrollToRow(IndexPath(0, row));
            runUntilIdle();
            ASSERT_NE(cell(*topPane(), row), nullptr) << row;
            EXPECT_TRUE(isInSight(cell(*topPane(), row)->widget())) << row;
        }
        table.scrollToRow(IndexPath(0, 0));
    }
    void expectDriveViewInSight() {
        app.drive().open();
        runUntilIdle();
        ASSERT_TRUE(app.drive().isShown());
        DriveView& view = app.drive().controller().driveView();
        EXPECT_EQ(view.widget()->width(), window()->width());
        EXPECT_TRUE(isInSight(view.widget()));
        const auto buttons = window()->findChildren<QWidget*>("velmora.back");
        EXPECT_TRUE(
            std::any_of(buttons.begin(), buttons.end(), [this](auto* back) { return isInSight(back); }));
        QWidget* const first = view.nowView().widget();
        QWidget* const last = view.events().widget();
        EXPECT_TRUE(isInSight(first, first->rect().topLeft()));
        view.setContentOffset(10000);
        runUntilIdle();
        EXPECT_TRUE(isInSight(last, last->rect().bottomLeft()));
        app.drive().toggle();
        runUntilIdle();
        EXPECT_FALSE(app.drive().isShown());
    }
    void expectSaveScreenInSight() {
        auto& view = dynamic_cast<VelmoraSaveView&>(saveScreen()->view());
        EXPECT_TRUE(isInSight(saveScreen()->saveDescription().widget()));
        EXPECT_TRUE(saveScreen()->saveDescription().isFirstResponder());
        EXPECT_TRUE(isInSight(view.saveButton().widget()));
        EXPECT_TRUE(isInSight(view.cancelButton().widget()));
        EXPECT_TRUE(isInSight(saveScreen()->saveContentTable().widget()));
    }
    /// Types the description as a keyboard on the screen does, which commits text and presses no keys.
    void saveAs(const char* description) {
        ASSERT_NE(window()->focusWidget(), nullptr);
        QInputMethodEvent typed;
        typed.setCommitString(description);
        QApplication::sendEvent(window()->focusWidget(), &typed);
        auto& view = dynamic_cast<VelmoraSaveView&>(saveScreen()->view());
        click(view.saveButton().widget());
        EXPECT_EQ(files().size(), 1u);
        EXPECT_EQ(saveScreen()->saveDescription().text(), description);
        platform.queue.runPending();
        runUntilIdle();
        EXPECT_EQ(saveScreen(), nullptr);
        EXPECT_TRUE(isShown("Open Folder"));
        EXPECT_TRUE(isInSight("velmora.save"));
    }
    void shoot(const std::string& name) const {
        ASSERT_TRUE(QDir().mkpath(VELMORA_BUILD_DIR "/screenshots"));
        EXPECT_TRUE(
            window()->grab().save(QString::fromStdString(VELMORA_BUILD_DIR "/screenshots/" + name + ".png")));
    }
};

TEST_F(PhoneScreenTest, PanesAndSaveScreenFitAPhone) {
    start(360, 720);
    expectPaneInSight();
    clickRow(0);
    ASSERT_EQ(depth(), 2u);
    EXPECT_EQ(rows(*topPane()), (std::vector<std::string>{"Level: -80 dBm", "Quality: -9 dB"}));
    EXPECT_TRUE(isInSight("velmora.back"));
    expectDriveViewInSight();
    open();
    expectSaveScreenInSight();
}

TEST_F(PhoneScreenTest, PanesAndSaveScreenFitHalfOfThatHeight) {
    start(360, 360);
    expectPaneInSight();
    clickRow(0);
    ASSERT_EQ(depth(), 2u);
    EXPECT_TRUE(isInSight("velmora.back"));
    expectDriveViewInSight();
    open();
    expectSaveScreenInSight();
    saveAs("gate");
}

TEST_F(PhoneScreenTest, KeyboardOnTheScreenTakesHalfOfTheHeight) {
    start(360, 720);
    resize(360, 360);
    expectPaneInSight();
    expectDriveViewInSight();
    resize(360, 720);
    open();
    resize(360, 360);
    expectSaveScreenInSight();
    saveAs("gate");
}

TEST_F(PhoneScreenTest, PixelsAreAsTheDisplayHasThem) {
    start(360, 360);
    // The script states what the display has.
    const char* const wanted = std::getenv("VELMORA_TEST_SCALE");
    EXPECT_EQ(window()->devicePixelRatio(), wanted ? std::atof(wanted) : 1.0);
    EXPECT_EQ(window()->grab().size(), window()->size() * window()->devicePixelRatio());
}

TEST_F(PhoneScreenTest, DrawsItsLooks) {
    start(360, 640);
    for (const bool isDark : {false, true}) {
        if (isDark) {
            QPalette palette(QColor(0x2b, 0x2b, 0x2e), QColor(0x1c, 0x1c, 0x1e));
            palette.setColor(QPalette::Base, QColor(0x24, 0x24, 0x27));
            palette.setColor(QPalette::Highlight, QColor(0x3d, 0x84, 0xc6));
            QApplication::setPalette(palette);
        }
        for (const bool isMirrored : {false, true})
            for (const QSize size : {QSize(360, 640), QSize(1280, 800)}) {
                QGuiApplication::setLayoutDirection(isMirrored ? Qt::RightToLeft : Qt::LeftToRight);
                resize(size.width(), size.height());
                const std::string name = std::string(isDark ? "dark" : "light") +
                                         (isMirrored ? "-mirrored-" : "-") + std::to_string(size.width());
                expectPaneInSight();
                shoot("screens-pane-" + name);
                open();
                expectSaveScreenInSight();
                shoot("screens-save-" + name);
                saveScreen()->cancelPressed();
                platform.queue.runPending();
                runUntilIdle();
            }
    }
}

} // namespace
} // namespace velmora
