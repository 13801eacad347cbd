// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/UTF8.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(UTF8, AppendsAndReadsTheEdgesOfEveryLength) {
    const struct {
        char32_t character;
        std::string bytes;
    } cases[] = {
        {0x00, std::string(1, '\0')},
        {0x7F, "\x7F"},
        {0x80, "\xC2\x80"},
        {0x7FF, "\xDF\xBF"},
        {0x800, "\xE0\xA0\x80"},
        {0xD7FF, "\xED\x9F\xBF"},
        {0xE000, "\xEE\x80\x80"},
        {0xFFFF, "\xEF\xBF\xBF"},
        {0x10000, "\xF0\x90\x80\x80"},
        {0x10FFFF, "\xF4\x8F\xBF\xBF"},
    };
    for (const auto& [character, bytes] : cases) {
        std::string text;
        appendUTF8(text, character);
        EXPECT_EQ(text, bytes);
        std::size_t offset = 0;
        EXPECT_EQ(nextCharacter(bytes, offset), character);
        EXPECT_EQ(offset, bytes.size());
    }
}

TEST(UTF8, RefusesWhatIsNoCharacter) {
    for (const char* text : {"\x80", "\xBF", "\xC0\x80", "\xC1\xBF", "\xC3", "\xC3(", "\xE0\x9F\xBF",
                             "\xE2\x82", "\xE2(\xAC", "\xED\xA0\x80", "\xED\xBF\xBF", "\xF0\x8F\xBF\xBF",
                             "\xF4\x90\x80\x80", "\xF0\x9F\x93", "\xF8\x88\x80\x80\x80", "\xFE", "\xFF"}) {
        const std::string before = std::string("ab") + text;
        std::size_t offset = 2;
        EXPECT_EQ(nextCharacter(before, offset), std::nullopt);
        EXPECT_EQ(offset, 2U);
        EXPECT_EQ(firstInvalidUTF8(before + "c"), 2U);
    }
    std::size_t end = 0;
    EXPECT_EQ(nextCharacter("", end), std::nullopt);
    EXPECT_EQ(firstInvalidUTF8("a\xC3\xA9\xE2\x82\xAC\xF0\x9F\x93\xB6"), std::nullopt);
    EXPECT_EQ(firstInvalidUTF8(""), std::nullopt);
}

} // namespace
} // namespace velmora
