// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Bars/PlaybackBar.h"

#include "Tests/Toolkit/ToolkitTest.h"

#include <QImage>
#include <QPalette>
#include <QToolButton>

namespace velmora {
namespace {

TEST(PlaybackBarTest, SymbolsHaveTheColourOfTextOnLightAndDarkGround) {
    static_cast<void>(testApplication());
    PlaybackBar bar({"1x"});
    auto* const button = bar.widget()->findChild<QToolButton*>("velmora.playback.play");
    ASSERT_TRUE(button);
    for (const QColor ink : {QColor(Qt::black), QColor(0xee, 0xee, 0xf0)}) {
        QPalette palette = bar.widget()->palette();
        palette.setColor(QPalette::ButtonText, ink);
        bar.widget()->setPalette(palette);
        const QImage symbol = button->icon().pixmap(button->iconSize()).toImage();
        int inked = 0;
        for (int y = 0; y < symbol.height(); ++y)
            for (int x = 0; x < symbol.width(); ++x)
                if (const QColor pixel = symbol.pixelColor(x, y); pixel.alpha() == 255) {
                    EXPECT_EQ(pixel.rgb(), ink.rgb());
                    ++inked;
                }
        EXPECT_GT(inked, 10);
    }
}

} // namespace
} // namespace velmora
