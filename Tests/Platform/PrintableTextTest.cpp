// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/PrintableText.h"

#include "Platform/UTF8.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>

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

std::string utf8(char32_t character) {
    std::string text;
    appendUTF8(text, character);
    return text;
}

std::string escape(char32_t character) {
    char text[16];
    std::snprintf(text, sizeof text, "\\u{%X}", static_cast<unsigned>(character));
    return text;
}

TEST(PrintableTextTest, CharactersThatHideAreEscaped) {
    struct Range {
        char32_t first;
        char32_t last;
    };
    const Range ranges[] = {
        {0x80, 0x9F},       // the second set of control characters
        {0xAD, 0xAD},       // soft hyphen
        {0x600, 0x605},     // Arabic number signs
        {0x61C, 0x61C},     // Arabic letter mark
        {0x6DD, 0x6DD},     // end of ayah
        {0x70F, 0x70F},     // Syriac abbreviation mark
        {0x115F, 0x1160},   // Hangul fillers
        {0x180E, 0x180E},   // Mongolian vowel separator
        {0x200B, 0x200F},   // zero width space and joiners, left-to-right and right-to-left mark
        {0x2028, 0x202E},   // separators; embeddings and overrides of the direction
        {0x2060, 0x206F},   // word joiner, invisible operators, isolates, deprecated ones; one is unassigned
        {0x3164, 0x3164},   // Hangul filler
        {0xFDD0, 0xFDEF},   // no characters
        {0xFEFF, 0xFEFF},   // byte order mark
        {0xFFA0, 0xFFA0},   // halfwidth Hangul filler
        {0xFFF0, 0xFFFB},   // unassigned, and interlinear annotations
        {0xFFFE, 0xFFFF},   // no characters
        {0x1BCA0, 0x1BCA3}, // shorthand format controls
        {0x1D173, 0x1D17A}, // musical ones
        {0xE0000, 0xE00FF}, // tags, and what is reserved like them
        {0xE01F0, 0xE0FFF}, {0x10FFFE, 0x10FFFF},
    };
    for (const Range& range : ranges)
        for (char32_t character = range.first; character <= range.last; ++character)
            EXPECT_EQ(printable("a" + utf8(character) + "b"), "a" + escape(character) + "b");
}

TEST(PrintableTextTest, LettersOfAllScriptsAreUnchanged) {
    for (const char* const text : {
             "T\u00E9l\u00E9com \u00C5",
             "\u041C\u0422\u0421",
             "\u05E4\u05DC\u05D0\u05E4\u05D5\u05DF",
             "\u0627\u062A\u0635\u0627\u0644\u0627\u062A",
             "\u4E2D\u56FD\u79FB\u52A8",
             "\uD55C\uAD6D",
             "\u0939\u093F\u0928\u094D\u0926\u0940",       // with spacing and other marks
             "\u1019\u103C\u103D\u103E\u102D\u102F\u1037", // six marks on one letter, as Burmese has them
             "\U0001F4E1 \u2192 \u20AC \u00B5",
             "\u00A0\u3000",
         })
        EXPECT_EQ(printable(text), text);
}

TEST(PrintableTextTest, ALetterKeepsEightMarks) {
    const std::string acute = "\u0301";
    std::string marks;
    for (int i = 0; i < 8; ++i)
        marks += acute;
    EXPECT_EQ(printable("e" + marks), "e" + marks);
    EXPECT_EQ(printable("e" + marks + acute + acute + "f" + acute),
              "e" + marks + "\\u{301}\\u{301}f" + acute);
    // Where there is no letter they would combine with what is printed before.
    EXPECT_EQ(printable(acute + "e"), "\\u{301}e");
    EXPECT_EQ(printable("\n" + acute), "\\n\\u{301}");
    EXPECT_EQ(printable("\xFF" + acute), "\uFFFD\\u{301}");
    EXPECT_EQ(printable("e\u20DD\u0903"), "e\u20DD\u0903"); // an enclosing and a spacing one
}

TEST(PrintableTextTest, PrintableTextIsPrintable) {
    for (const std::string text :
         {"a\x1b[1m\u202Eb", "\u0301\u0301", "e\u0301\u0301\u0301\u0301\u0301", "\xFF\xFE"})
        EXPECT_EQ(printable(printable(text)), printable(text));
    EXPECT_TRUE(isPlain(" ~"));
    EXPECT_FALSE(isPlain("\x7F"));
    EXPECT_FALSE(isPlain("\t"));
    EXPECT_FALSE(isPlain("\u00E9"));
}

TEST(PrintableTextTest, LinesEndWhereTheyShould) {
    EXPECT_EQ(printableLine("one\n"), "one");
    EXPECT_EQ(printableLine("one\ntwo\x1b\n\n"), "one two\\x1B ");
    EXPECT_EQ(printableLines("one\x1b\ntwo\u202E\n"), "one\\x1B\ntwo\\u{202E}\n");
    EXPECT_EQ(printableLines("one"), "one");
    EXPECT_EQ(printableLines("\n\ntwo"), "\n\ntwo");
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
