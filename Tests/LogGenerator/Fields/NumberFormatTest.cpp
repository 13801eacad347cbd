// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/NumberFormat.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdio>
#include <limits>
#include <string>

namespace velmora {
namespace {

std::string integerText(const NumberFormat& format, std::int64_t value) {
    return std::string(NumberText(format, value).text());
}
std::string realText(const NumberFormat& format, double value) {
    return std::string(NumberText(format, value).text());
}

TEST(NumberFormatTest, ShowsIntegersAsPrintfDoes) {
    EXPECT_EQ(integerText("%d", 0), "0");
    EXPECT_EQ(integerText("%d dBm", -80), "-80 dBm");
    EXPECT_EQ(integerText("%d", 2147483647), "2147483647");
    // An unsigned 32-bit field passed for "%d" shows signed, as C does.
    EXPECT_EQ(integerText("%d", 0xFFFFFFFF), "-1");
    EXPECT_EQ(integerText("%d", 0x80000000), "-2147483648");
    EXPECT_EQ(integerText("%u", 0xFFFFFFFF), "4294967295");
    EXPECT_EQ(integerText("%u", -1), "4294967295");
    EXPECT_EQ(integerText("%3d", 7), "  7");
}

TEST(NumberFormatTest, ShowsRealsAsPrintfDoes) {
    EXPECT_EQ(realText("%f dB", -7.5), "-7.500000 dB");
    EXPECT_EQ(realText("%4.2f dBm", -140.0), "-140.00 dBm");
    EXPECT_EQ(realText("%4.2lf dBm", 0.0), "0.00 dBm");
    EXPECT_EQ(realText("%6.2f", 0.5), "  0.50");
    EXPECT_EQ(realText("%+.2f dB", 3.0), "+3.00 dB");
    EXPECT_EQ(realText("%+.2f dB", -3.0), "-3.00 dB");
    EXPECT_EQ(realText("%+6.2f", 3.0), " +3.00");
    // A tie in the written digits rounds by the value that the double holds: 0.125 to even, 2.675 is below.
    EXPECT_EQ(realText("%4.2f", 0.125), "0.12");
    EXPECT_EQ(realText("%4.2f", 2.675), "2.67");
}

TEST(NumberFormatTest, ShowsEveryPartOfAUnitAsPrintfDoes) {
    const auto expectAsPrintf = [](double value) {
        const auto printed = [value](const char* format) {
            std::array<char, 400> text{};
            std::snprintf(text.data(), text.size(), format, value);
            return std::string(text.data());
        };
        EXPECT_EQ(realText("%.0f", value), printed("%.0f"));
        EXPECT_EQ(realText("%.1f", value), printed("%.1f"));
        EXPECT_EQ(realText("%.2f", value), printed("%.2f"));
        EXPECT_EQ(realText("%.4f", value), printed("%.4f"));
        EXPECT_EQ(realText("%.5f", value), printed("%.5f"));
        EXPECT_EQ(realText("%f", value), printed("%f"));
        EXPECT_EQ(realText("%.7f", value), printed("%.7f"));
        EXPECT_EQ(realText("%+9.3f", value), printed("%+9.3f"));
    };
    // Halves of all that is written are among these, which go to the even digit.
    for (int i = -4'096; i <= 4'096; ++i) {
        expectAsPrintf(i / 16.0);
        expectAsPrintf(i / 1'024.0);
        expectAsPrintf(i / 65'536.0);
        expectAsPrintf(i / 131'072.0); // every other one has a place too many for whole numbers
        expectAsPrintf(i / 10.0);
        expectAsPrintf(i * 16'384.0 + 0.5); // to beyond 2^24 on both sides
    }
    expectAsPrintf(-0.0);
    expectAsPrintf(16'777'215.9999847412109375); // the last of whole numbers
    expectAsPrintf(16'777'216.0);
    expectAsPrintf(1e300);
    expectAsPrintf(5e-324);
}

TEST(NumberFormatTest, ShowsWhatIsNoNumber) {
    EXPECT_EQ(realText("%4.2lf dBm", std::numeric_limits<double>::quiet_NaN()), " nan dBm");
    EXPECT_EQ(realText("%+.2f dB", -std::numeric_limits<double>::infinity()), "-inf dB");
    EXPECT_EQ(realText("%+.2f dB", std::numeric_limits<double>::infinity()), "+inf dB");
}

TEST(NumberFormatTest, HoldsTheLargestDouble) {
    EXPECT_EQ(realText("%f", std::numeric_limits<double>::max()).size(), 309u + 1 + 6);
}

TEST(NumberFormatTest, PutsTextsAroundTheNumber) {
    EXPECT_EQ(realText("(ref) %+.1f dB", 2.0), "(ref) +2.0 dB");
    EXPECT_EQ(realText("%.02f%%", 12.5), "12.50%");
    EXPECT_EQ(realText("%.02f%% (old)", 0.0), "0.00% (old)");
    NumberText text;
    text.format("[Reserved ", -7, "]");
    EXPECT_EQ(text.text(), "[Reserved -7]");
}

} // namespace
} // namespace velmora
