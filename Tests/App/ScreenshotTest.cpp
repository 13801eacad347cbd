// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileResources.h"
#include "Platform/Resources.h"
#include "Telephony/Sources/SourceFactory.h"
#include "Tests/App/AppFixture.h"

#include <QApplication>
#include <QCursor>
#include <QDir>
#include <QPalette>
#include <QPixmap>
#include <QWidget>

#include <chrono>
#include <memory>
#include <string>

namespace velmora {
namespace {

using namespace std::chrono_literals;

struct Look {
    const char* name;
    bool isDark;
};

/// Draws the screens during a synthetic drive into "screenshots" beside the tests.
class ScreenshotTest : public AppFixture, public testing::WithParamInterface<Look>, public LogSink {
protected:
    ScreenshotTest() {
        if (GetParam().isDark) {
            QPalette palette(QColor(0x2b, 0x2b, 0x2e), QColor(0x1c, 0x1c, 0x1e));
            palette.setColor(QPalette::Base, QColor(0x24, 0x24, 0x27));
            palette.setColor(QPalette::Highlight, QColor(0x3d, 0x84, 0xc6));
            QApplication::setPalette(palette);
        }
        setResources(&_files);
        technology = kVoxLogChannelTechnology_Ostrel_GSM;
    }
    ~ScreenshotTest() override { setResources(&resources); }

    void receive(const Data& message) override {
        static_cast<void>(platform.ports.deliver(logChannelPortName(), 0, message));
    }
    [[nodiscard]] bool hasRoom() const override { return true; }

    /// Opens the section of that name from the pane on top.
    void open(const std::string& name) {
        const auto pane = topPane();
        const std::size_t count = pane->tableView().numberOfRowsInSection(0);
        for (std::size_t row = 0; row < count; ++row) {
            pane->tableView().scrollToRow(IndexPath(0, row));
            runUntilIdle();
            const auto shown = cell(*pane, row);
            if (shown && shown->key().text() == name) {
                clickRow(row);
                return;
            }
        }
        ADD_FAILURE() << "no row " << name << " in " << pane->path();
    }
    void back() {
        static_cast<void>(app.navController().popViewController(false));
        runUntilIdle();
    }
    void shoot(const std::string& name) {
        QWidget* window = app.navController().view().widget()->window();
        runUntilIdle();
        const QString file = QString::fromStdString(std::string(VELMORA_BUILD_DIR "/screenshots/") + name +
                                                    "-" + GetParam().name + ".png");
        const QImage image = window->grab().toImage();
        // A screen that shows anything has more than its ground.
        int colours = 0;
        for (int y = 0; y < image.height(); y += 3)
            for (int x = 1; x < image.width(); x += 3)
                colours += image.pixel(x, y) != image.pixel(x - 1, y);
        EXPECT_GT(colours, 50) << name;
        EXPECT_TRUE(image.convertToFormat(QImage::Format_RGB32).save(file, "PNG", 0)) << file.toStdString();
    }

private:
    FileResources _files;
};

TEST_P(ScreenshotTest, ShowsADrive) {
    ASSERT_TRUE(QDir().mkpath(VELMORA_BUILD_DIR "/screenshots"));
    std::filesystem::create_directories(directory / marker);
    launchAndConnect();
    // The pointer rests where nothing shows that it is there.
    QWidget* window = app.navController().view().widget()->window();
    QCursor::setPos(window->mapToGlobal(QPoint(window->width() / 2, window->height() - 120)));
    runUntilIdle();
    const auto choice = parseSource("scenario:gsm,seed=1");
    ASSERT_TRUE(choice);
    const auto source = makeSource(*choice, platform.queue, platform.clock);
    ASSERT_TRUE(source);
    (*source)->start(*this);
    platform.queue.advance(30s);
    runUntilIdle();
    shoot("root");
    open("GSM");
    shoot("sections");
    open("Neighboring Cells");
    shoot("neighbours");
    open("0");
    shoot("neighbour");
    back();
    back();
    back();
    open("Registration");
    open("Serving PLMN");
    shoot("section");
    app.showSaveView();
    saveScreen()->saveDescription().setText("north gate, ground floor");
    shoot("save");
    (*source)->stop();
}

INSTANTIATE_TEST_SUITE_P(Looks, ScreenshotTest, testing::Values(Look{"light", false}, Look{"dark", true}),
                         [](const auto& row) { return std::string(row.param.name); });

} // namespace
} // namespace velmora
