// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/DriveView/PlayedDriveFixture.h"

#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QImage>
#include <QPalette>
#include <QPixmap>
#include <QWidget>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

// The pictures of the drive view that README and the description for software centres show. They are drawn
// into "pictures" of the build directory; those of the source tree must look the same. After a change that is
// meant, `cp build/pictures/*.png Documentation/pictures/`.

namespace velmora {
namespace {

struct Picture {
    const char* name;
    int width;
    int height;
    bool isDark = false;
    bool isRecording = false;
    bool hasLargeText = false; ///< QT_FONT_DPI=144 QT_ENABLE_HIGHDPI_SCALING=0
    int scale = 1;             ///< VELMORA_TEST_SCALE=2
};

constexpr Picture pictures[] = {
    {"drive-light", 1280, 800},
    {"recording-dark", 1280, 800, true, true},
    {"drive-phone-light", 360, 640},
    {"drive-phone-dark", 360, 640, true},
    {"drive-phone-large-text", 360, 640, false, false, true},
    {"drive-phone-scale-2", 360, 640, false, false, false, 2},
};

/// Small enough that what fonts' edges look like makes no difference.
QImage reduced(const QImage& image) {
    return image
        .scaled(image.width() / 16, image.height() / 16, Qt::IgnoreAspectRatio, Qt::SmoothTransformation)
        .convertToFormat(QImage::Format_RGB32);
}

/// In its most frequent colours, which make a small file.
QImage inFewColours(const QImage& image) {
    std::map<QRgb, int> counts;
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x)
            ++counts[image.pixel(x, y) | 0xff000000U];
    std::vector<std::pair<int, QRgb>> colours;
    for (const auto& [colour, count] : counts)
        colours.emplace_back(count, colour);
    std::sort(colours.rbegin(), colours.rend());
    QList<QRgb> table;
    for (std::size_t i = 0; i < std::min<std::size_t>(colours.size(), 96); ++i)
        table.append(colours[i].second);
    return image.convertToFormat(QImage::Format_RGB32)
        .convertToFormat(QImage::Format_Indexed8, table, Qt::ThresholdDither | Qt::AvoidDither);
}

/// The mean difference of the channels, of 255; absent for pictures of different sizes.
std::optional<double> differenceOf(const QImage& one, const QImage& other) {
    if (one.size() != other.size())
        return std::nullopt;
    const QImage a = reduced(one);
    const QImage b = reduced(other);
    double sum = 0;
    for (int y = 0; y < a.height(); ++y)
        for (int x = 0; x < a.width(); ++x) {
            const QRgb p = a.pixel(x, y);
            const QRgb q = b.pixel(x, y);
            sum +=
                std::abs(qRed(p) - qRed(q)) + std::abs(qGreen(p) - qGreen(q)) + std::abs(qBlue(p) - qBlue(q));
        }
    return sum / (3.0 * a.width() * a.height());
}

class PicturesTest : public PlayedDriveFixture, public testing::WithParamInterface<Picture> {
protected:
    static constexpr double tolerance = 3;
    static constexpr qint64 largestFile = 60'000;

    PicturesTest() {
        if (!GetParam().isDark)
            return;
        QPalette palette(QColor(0x2b, 0x2b, 0x2e), QColor(0x1c, 0x1c, 0x1e));
        palette.setColor(QPalette::Base, QColor(0x24, 0x24, 0x27));
        palette.setColor(QPalette::Highlight, QColor(0x3d, 0x84, 0xc6));
        QApplication::setPalette(palette);
    }
    ~PicturesTest() override { QApplication::setPalette(QPalette()); }

    [[nodiscard]] QImage drawn() const { return inFewColours(window()->grab().toImage()); }
};

TEST_P(PicturesTest, LooksLikeThePictureThatIsShown) {
    const Picture& picture = GetParam();
    if (picture.hasLargeText != (qEnvironmentVariable("QT_FONT_DPI") == "144") ||
        picture.scale != std::lround(qApp->devicePixelRatio()))
        GTEST_SKIP() << "needs another setting of this process";
    if (picture.isRecording) {
        openIn(picture.width, picture.height, record("lte", 3000));
        playback().seekToMessage(2000);
    } else {
        launchIn(picture.width, picture.height);
        if (!app.drive().isShown())
            press(Qt::Key_D, Qt::ControlModifier);
        drive(100);
    }
    ASSERT_TRUE(app.drive().isShown());
    app.drive().controller().refreshNow();
    runUntilIdle();
    const QImage image = drawn();
    QDir().mkpath(VELMORA_BUILD_DIR "/pictures");
    const QString made = QString(VELMORA_BUILD_DIR "/pictures/%1.png").arg(picture.name);
    ASSERT_TRUE(image.save(made, "PNG", 0));
    const QString shown = QString(VELMORA_SOURCE_DIR "/Documentation/pictures/%1.png").arg(picture.name);
    const QImage known(shown);
    ASSERT_FALSE(known.isNull()) << "there is no " << shown.toStdString();
    const std::optional<double> difference = differenceOf(image, known);
    ASSERT_TRUE(difference) << "another size: " << made.toStdString();
    EXPECT_LT(*difference, tolerance) << made.toStdString();
    EXPECT_LE(QFileInfo(shown).size(), largestFile);
}

INSTANTIATE_TEST_SUITE_P(All, PicturesTest, testing::ValuesIn(pictures), [](const auto& row) {
    std::string name = row.param.name;
    for (char& each : name)
        each = each == '-' ? '_' : each;
    return name;
});

} // namespace
} // namespace velmora
