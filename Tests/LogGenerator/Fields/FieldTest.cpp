// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/Field.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdio>
#include <limits>

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

constexpr EnumText colourRows[] = {{1, "one"}, {4, "four"}};
constexpr EnumTexts colours(colourRows, "Unknown");

constexpr Field fields[] = {
    {"Byte", u8At(0), integer("%d")},
    {"Signed Byte", i8At(0), integer("%d dBm")},
    {"Word", u16At(1), integer("%d")},
    {"Signed Word", i16At(1), integer("%d")},
    {"Big", u16BigEndianAt(1), integer("%d")},
    {"Long", u32At(3), integer("%d")},
    {"Unsigned Long", u32At(3), integer("%u")},
    {"Whole Long", u32At(3), real("%.0f")},
    {"Signed Long", i32At(3), real("%.0f dB")},
    {"Scaled", u8At(7), integer("%d dB", -140, 2)},
    {"Real", u8At(7), real("%4.2f dBm", 0.25, -140)},
    {"Bits", bitsAt(8, 1, 9), integer("%d")},
    {"Colour", u8At(7), text(colours)},
    {"Hole", u8At(10), text(colours)},
    {"Flag", u8At(7), flag("ON", "OFF")},
    {"Clear", u8At(10), flag("ON", "OFF")},
    {"Absent", u8At(7), unless(4, "Not Present", integer("%d dBm", -30))},
    {"Present", u8At(10), unless(4, "Not Present", integer("%d dBm", -30))},
};
constexpr Layout table = layout(11, fields);

TEST(FieldTest, WalksItsTable) {
    const Data data = hex("F6          // byte: 246, signed -10\n"
                          "FE FF       // word: 65534, signed -2, big-endian 0xFEFF\n"
                          "00 00 00 80 // long: 2^31\n"
                          "04          // scaled: 4 x 2 - 140, real: 4 x 0.25 - 140\n"
                          "02 03       // bits: 0x302 >> 1 is 385\n"
                          "00");
    Dictionary node;
    writeFields(node, Record(data), table);
    const Dictionary expected = {
        {"Byte", "246"},
        {"Signed Byte", "-10 dBm"},
        {"Word", "65534"},
        {"Signed Word", "-2"},
        {"Big", "65279"},
        {"Long", "-2147483648"},
        {"Unsigned Long", "2147483648"},
        {"Whole Long", "2147483648"},
        {"Signed Long", "-2147483648 dB"},
        {"Scaled", "-132 dB"},
        {"Real", "-139.00 dBm"},
        {"Bits", "385"},
        {"Colour", "four"},
        {"Hole", "Unknown"},
        {"Flag", "ON"},
        {"Clear", "OFF"},
        {"Absent", "Not Present"},
        {"Present", "-30 dBm"},
    };
    ASSERT_EQ(node.size(), expected.size());
    for (auto shown = node.begin(), wanted = expected.begin(); shown != node.end(); ++shown, ++wanted) {
        EXPECT_EQ(shown->key, wanted->key);
        EXPECT_EQ(*shown->value.asString(), *wanted->value.asString()) << wanted->key;
    }
}

} // namespace
} // namespace velmora
