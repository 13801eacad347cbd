// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/PrintableText.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(PrintableTextTest, ControlCharactersAreShownAndDoNothing) {
    struct Case {
        const char* text;
        const char* shown;
    };
    const Case cases[] = {
        {"plain -60 dBm", "plain -60 dBm"},
        {"gr\xC3\xBC\xC3\x9F", "gr\xC3\xBC\xC3\x9F"},
        {"line\nfeed\ttab\rreturn", "line\\nfeed\\ttab\\rreturn"},
        {"\x1b[2J", "\\x1B[2J"},
        {"\x7F", "\\x7F"},
        {"\xC2\x9B"
         "2J",
         "\\u{9B}2J"}, // the one-character form of ESC [
        // NOLINTNEXTLINE(misc-misleading-bidirectional) which is the case
        {"a\xE2\x80\xAE"
         "b",
         "a\\u{202E}b"}, // turns the writing direction
        {"a\xFF"
         "b\xC3",
         "a\xEF\xBF\xBD"
         "b\xEF\xBF\xBD"}, // bytes of no character
    };
    for (const Case& row : cases)
        EXPECT_EQ(printable(row.text), row.shown);
}

TEST(PrintableTextTest, WidthCountsTerminalColumns) {
    EXPECT_EQ(displayWidth(""), 0U);
    EXPECT_EQ(displayWidth("abc"), 3U);
    EXPECT_EQ(displayWidth("gr\xC3\xBC\xC3\x9F"), 4U);
    EXPECT_EQ(displayWidth("u\xCC\x88"), 1U);                // u and the dots above it
    EXPECT_EQ(displayWidth("\xE6\x97\xA5\xE6\x9C\xAC"), 4U); // two wide characters
    EXPECT_EQ(displayWidth("\xF0\x9F\x93\xA1"), 2U);         // satellite antenna
    EXPECT_EQ(displayWidth("\xEF\xBF\xBD"), 1U);             // the replacement of invalid bytes
    EXPECT_EQ(displayWidth("\xD9\xB0"), 0U);                 // Arabic letter superscript alef, a mark
    EXPECT_EQ(displayWidth("\xE2\x8F\xB0"), 2U);             // alarm clock, an emoji outside of their block
    EXPECT_EQ(displayWidth("\xEF\xBF\xA5"), 2U);             // fullwidth yen sign
    EXPECT_EQ(displayWidth("\xF0\x9F\x8C\xA1"), 1U);         // thermometer, which shows as text
}

TEST(PrintableTextTest, ClippedTextFitsAndEndsInAnEllipsis) {
    EXPECT_EQ(clipped("abcdef", 6), "abcdef");
    EXPECT_EQ(clipped("abcdef", 5), "abcd…");
    EXPECT_EQ(clipped("abcdef", 1), "…");
    EXPECT_EQ(clipped("abcdef", 0), "");
    // The second wide character would end in the last column, which the mark needs.
    EXPECT_EQ(clipped("\xE6\x97\xA5\xE6\x9C\xAC\xE8\xAA\x9E", 4), "\xE6\x97\xA5…");
}

} // namespace
} // namespace velmora
