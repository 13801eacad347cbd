// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/DigitText.h"

#include <QFontDatabase>
#include <QStringList>

#include <gtest/gtest.h>

#include <cmath>

namespace velmora {
namespace {

TEST(DigitText, AllDigitsTakeTheSameWidthInEveryFont) {
    for (const QString& family : QFontDatabase::families()) {
        const DigitText text{QFont(family)};
        const double width = text.width("0000.0");
        for (const char* const number : {"1111.1", "4711.7", "8888.8"})
            EXPECT_NEAR(text.width(number), width, 0.1) << family.toStdString() << ' ' << number;
        EXPECT_GT(text.width("\u221297 dBm"), text.width("97 dBm")) << family.toStdString();
    }
}

} // namespace
} // namespace velmora
