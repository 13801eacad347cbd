// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Contrast.h"

#include "Tests/Toolkit/ToolkitTest.h"
#include "Toolkit/Widgets/Text/TabularDigits.h"

#include <QApplication>
#include <QImage>
#include <QPalette>
#include <QStyle>

#include <algorithm>

namespace velmora {
namespace {

/// The strongest contrast of a pixel of the area to the ground.
double strongest(const QImage& image, const QRect& area, const QColor& ground) {
    double found = 1;
    for (int y = area.top(); y <= area.bottom(); ++y)
        for (int x = area.left(); x <= area.right(); ++x)
            found = std::max(found, contrast(image.pixelColor(x, y), ground));
    return found;
}

TEST(ContrastTest, IsThatOfWCAG) {
    EXPECT_NEAR(contrast(Qt::white, Qt::black), 21, 0.001);
    EXPECT_NEAR(contrast(Qt::black, Qt::white), 21, 0.001);
    EXPECT_NEAR(contrast(QColor(0x77, 0x77, 0x77), Qt::white), 4.48, 0.01);
    EXPECT_NEAR(contrast(QColor(255, 0, 0), Qt::white), 4.0, 0.01); // red: 0.2126 of the light
    EXPECT_NEAR(contrast(QColor(12, 34, 56), QColor(12, 34, 56)), 1, 0.001);
}

TEST(ContrastTest, AMarkThatCannotBeSeenHasAnotherColour) {
    EXPECT_EQ(markColor(QColor(0xbe, 0xd6, 0xf0), Qt::white, Qt::black), QColor(Qt::black));
    EXPECT_EQ(markColor(QColor(0, 0, 200), Qt::white, Qt::black), QColor(0, 0, 200));
    // What lets the ground through is judged as it looks there: the same black, once strong, once faint.
    EXPECT_EQ(markColor(QColor(0, 0, 0, 51), Qt::white, Qt::red), QColor(Qt::red));
    EXPECT_NEAR(markColor(QColor(0, 0, 0, 153), Qt::white, Qt::red).red(), 102, 1);
}

TEST(ContrastTest, CheckMarksAndChevronsAreSeenOnAnyPalette) {
    for (const bool isDark : {false, true})
        for (const QColor& highlight : {QColor(0xbe, 0xd6, 0xf0), QColor(0x20, 0x30, 0x40)}) {
            QPalette palette = QApplication::style()->standardPalette();
            palette.setColor(QPalette::Base, isDark ? QColor(0x24, 0x24, 0x27) : QColor(Qt::white));
            palette.setColor(QPalette::Text, isDark ? QColor(Qt::white) : QColor(Qt::black));
            palette.setColor(QPalette::PlaceholderText, QColor(128, 128, 128, 90));
            palette.setColor(QPalette::Highlight, highlight);
            QApplication::setPalette(palette);
            Stage stage(std::make_shared<ListPane>(numberedTexts(3)));
            stage.show();
            for (const TableCellAccessory accessory :
                 {TableCellAccessory::checkMark, TableCellAccessory::disclosureIndicator}) {
                TableCell& cell = *stage.root->cell(0);
                cell.setAccessory(accessory);
                runUntilIdle();
                const QImage image = cell.widget()->grab().toImage();
                EXPECT_GE(strongest(image, {image.width() - 36, 2, 34, 38}, palette.color(QPalette::Base)), 3)
                    << isDark << highlight.name().toStdString();
            }
        }
    QApplication::setPalette(QApplication::style()->standardPalette());
}

/// A font of a later Qt, as far as it matters here.
struct FontWithFeatures {
    struct Tag {
        explicit Tag(const char* tag) : name(tag) {}
        std::string name;
    };
    void setFeature(const Tag& tag, int value) { features.emplace_back(tag.name, value); }
    std::vector<std::pair<std::string, int>> features;
};

TEST(TabularDigitsTest, AreAskedForWhereQtCan) {
    FontWithFeatures font;
    useTabularDigits(font);
    EXPECT_THAT(font.features, ::testing::ElementsAre(::testing::Pair("tnum", 1)));
    int withoutFeatures = 0;
    useTabularDigits(withoutFeatures); // compiles, and does nothing
}

TEST(TabularDigitsTest, DigitsOfTheInterfaceFontAreOfOneWidth) {
    for (const Font& font : {Font::systemFontOfSize(15), Font::boldSystemFontOfSize(15)})
        for (char digit = '1'; digit <= '9'; ++digit)
            EXPECT_EQ(sizeOfText(std::string(10, digit), font), sizeOfText("0000000000", font)) << digit;
}

} // namespace
} // namespace velmora
