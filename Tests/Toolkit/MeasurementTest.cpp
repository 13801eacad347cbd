// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Font.h"
#include "Toolkit/Label.h"
#include "Toolkit/Screen.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QApplication>
#include <QFontInfo>
#include <QFontMetricsF>

#include <cmath>

namespace velmora {
namespace {

QFont pixels(QFont font, double size, bool isBold) {
    font.setPointSizeF(size * 0.75); // 96 of the toolkit's points to the inch, 72 of the font's
    font.setBold(isBold);
    return font;
}

TEST(MeasurementTest, TextIsMeasuredAsItIsDrawn) {
    const QFontMetricsF regular(pixels(QApplication::font(), 15, false));
    const QFontMetricsF bold(pixels(QApplication::font(), 15, true));
    const QFontMetricsF named(pixels(QFont("Helvetica"), 13, false));
    const QString text = QStringLiteral("Physical Cell ID \u00fc");
    const std::string utf8 = text.toStdString();
    EXPECT_EQ(sizeOfText(utf8, Font::systemFontOfSize(15)),
              (Size{regular.horizontalAdvance(text), regular.height()}));
    EXPECT_EQ(sizeOfText(utf8, Font::boldSystemFontOfSize(15)),
              (Size{bold.horizontalAdvance(text), bold.height()}));
    EXPECT_EQ(sizeOfText(utf8, Font::named("Helvetica", 13)),
              (Size{named.horizontalAdvance(text), named.height()}));
    EXPECT_GT(sizeOfText(utf8, Font::boldSystemFontOfSize(15)).width,
              sizeOfText(utf8, Font::systemFontOfSize(15)).width);
}

TEST(MeasurementTest, NoTextHasTheHeightOfALine) {
    const Size none = sizeOfText("", Font::systemFontOfSize(15));
    EXPECT_EQ(none.width, 0);
    EXPECT_EQ(none.height, sizeOfText("x", Font::systemFontOfSize(15)).height);
    EXPECT_EQ(sizeOfText("a\nb", Font::systemFontOfSize(15)), sizeOfText("a b", Font::systemFontOfSize(15)));
}

TEST(MeasurementTest, TextIsShownEscapedWhereItWouldDisturbItsLine) {
    const std::string hostile = "a\u202Eb\x1b\tc\nd";
    const char* const shown = "a\\u{202E}b\\x1B\\tc d";
    Label label(hostile);
    label.sizeToFit();
    EXPECT_EQ(label.text(), hostile);
    EXPECT_EQ(static_cast<LabelWidget*>(label.widget())->shownText(), shown);
    EXPECT_EQ(sizeOfText(hostile, Font::systemFontOfSize(15)), sizeOfText(shown, Font::systemFontOfSize(15)));
}

TEST(MeasurementTest, FontsAreInTheSameUnitAsFrames) {
    Label label("x");
    label.setFont(Font::systemFontOfSize(20));
    EXPECT_EQ(QFontInfo(label.widget()->font()).pixelSize(), 20);
    label.setFont(Font::boldSystemFontOfSize(15));
    EXPECT_EQ(QFontInfo(label.widget()->font()).pixelSize(), 15);
    EXPECT_TRUE(label.widget()->font().bold());
}

TEST(MeasurementTest, ALabelFitsItsText) {
    Label label("RSSI");
    label.setFont(Font::boldSystemFontOfSize(15));
    label.setFrame({10, 7.5, 1, 1});
    label.sizeToFit();
    const Size size = sizeOfText("RSSI", Font::boldSystemFontOfSize(15));
    EXPECT_EQ(label.frame(), (Rect{10, 7.5, size.width, size.height}));
    auto* const drawn = static_cast<LabelWidget*>(label.widget());
    EXPECT_EQ(drawn->shownText(), "RSSI");
    EXPECT_EQ(drawn->geometry(), QRect(10, 8, static_cast<int>(std::ceil(size.width)),
                                       static_cast<int>(std::ceil(size.height))));
    label.setFrame({10, 7.5, size.width / 2, size.height});
    EXPECT_TRUE(drawn->shownText().endsWith(QChar(0x2026)));
}

TEST(MeasurementTest, MarkupIsText) {
    Label label("<b>x</b>&amp;");
    EXPECT_EQ(label.text(), "<b>x</b>&amp;");
    label.setFrame({0, 0, 500, 20});
    EXPECT_EQ(static_cast<LabelWidget*>(label.widget())->shownText(), "<b>x</b>&amp;");
}

TEST(MeasurementTest, ALabelStartsPlain) {
    const Label label;
    EXPECT_EQ(label.text(), "");
    EXPECT_EQ(label.font(), Font::systemFontOfSize(17));
    EXPECT_EQ(label.textAlignment(), TextAlignment::left);
}

TEST(MeasurementTest, TheScreenIsAPhonesOnADesktop) {
    // The unseen screen is 800 x 800, so that the height is what it has.
    EXPECT_EQ(Screen::mainBounds(), (Rect{0, 0, 390, 800}));
    EXPECT_EQ(Screen::mainApplicationFrame(), Screen::mainBounds());
    Window window({0, 0, 320, 480});
    window.makeKeyAndVisible();
    EXPECT_EQ(window.bounds(), (Rect{0, 0, 320, 480}));
    EXPECT_EQ(Screen::mainApplicationFrame(), (Rect{0, 0, 320, 480}));
}

} // namespace
} // namespace velmora
