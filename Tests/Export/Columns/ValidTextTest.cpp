// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/ValidText.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

std::string valid(std::string_view text) {
    std::string storage;
    return std::string(validText(text, storage));
}

TEST(ValidText, leavesUTF8AsItIs) {
    for (const std::string_view text : {"", "RR_IDLE", "\u00e4\u20ac\U0001f4f6"})
        EXPECT_EQ(valid(text), text);
}

TEST(ValidText, replacesEachByteThatIsNone) {
    EXPECT_EQ(valid("a\xFF"
                    "b"),
              "a\uFFFD"
              "b");
    EXPECT_EQ(valid("\xE2\x82"), "\uFFFD\uFFFD"); // two of the euro sign's three bytes
    EXPECT_EQ(valid("\xC0\x80\u00e4"), "\uFFFD\uFFFD\u00e4");
}

} // namespace
} // namespace velmora
