// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/SourceNumber.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

/// Whether a field of that place, format and meaning holds a signed raw number.
bool isSigned(const Place& place, const TextFormat& format, Sign sign = Sign::AsShown) {
    return numberOf({"", place, format, {.sign = sign}}).isSigned;
}

TEST(SourceNumberTest, SignIsThePlacesUnlessTheFieldMeansAnother) {
    EXPECT_FALSE(isSigned(u8At(13), integer("%d")));
    EXPECT_TRUE(isSigned(i8At(13), integer("%d")));
    EXPECT_TRUE(isSigned(i16At(13), real("%.1f")));
    EXPECT_FALSE(isSigned(bitsAt(13, 2, 9), integer("%d")));
    EXPECT_TRUE(isSigned(bitsAt(13, 2, 9), integer("%d"), Sign::Signed));
    EXPECT_FALSE(isSigned(i8At(13), integer("%d"), Sign::Unsigned));
}

TEST(SourceNumberTest, IntegersOf32BitsHaveTheSignOfTheirConversion) {
    EXPECT_TRUE(isSigned(u32At(13), integer("%d")));
    EXPECT_FALSE(isSigned(i32At(13), integer("%u")));
    EXPECT_FALSE(isSigned(u32At(13), integer("%d"), Sign::Unsigned));
    EXPECT_FALSE(isSigned(u32At(13), hexadecimal()));
    EXPECT_FALSE(isSigned(u32At(13), real("%.1f")));
}

TEST(SourceNumberTest, ScaleAndOffsetAreTheFormatsAndThenTheMeanings) {
    // The display shows raw * 2 - 30; the physical value is the negative of that, plus 0.5.
    const SourceNumber number =
        numberOf({"", u8At(13), integer("%d", -30, 2), {.unit = Unit::DBm, .scale = negated, .offset = 0.5}});
    EXPECT_EQ(number.scale, -2);
    EXPECT_EQ(number.offset, 30.5);
}

TEST(SourceNumberTest, UnitOfTheFormatCounts) {
    // The display's kilobit has 1024 bits.
    const SourceNumber number = numberOf({"", u8At(13), real("%.0f kbps", 10, 5)});
    EXPECT_EQ(number.scale, 10.24);
    EXPECT_EQ(number.offset, 5.12);
}

} // namespace
} // namespace velmora
