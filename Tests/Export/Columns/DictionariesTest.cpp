// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/TextDictionary.h"
#include "Export/Columns/Parquet/WordDictionary.h"

#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

TEST(WordDictionary, numbersValuesInTheirOrder) {
    WordDictionary dictionary;
    EXPECT_EQ(dictionary.indexOf(0), 0);
    EXPECT_EQ(dictionary.indexOf(7), 1);
    EXPECT_EQ(dictionary.indexOf(0), 0);
    EXPECT_EQ(dictionary.indexOf(7), 1);
    EXPECT_EQ(dictionary.values(), (std::vector<std::uint64_t>{0, 7}));
}

TEST(WordDictionary, findsEachOfAsManyAsItHasRoomFor) {
    WordDictionary dictionary;
    for (std::size_t i = 0; i < WordDictionary::mostValues; ++i)
        ASSERT_EQ(dictionary.indexOf(i << 40), i);
    EXPECT_EQ(dictionary.indexOf(1), std::nullopt);
    for (std::size_t i = 0; i < WordDictionary::mostValues; ++i)
        ASSERT_EQ(dictionary.indexOf(i << 40), i);
}

TEST(TextDictionary, numbersTextsInTheirOrder) {
    TextDictionary dictionary;
    EXPECT_EQ(dictionary.indexOf(""), 0);
    EXPECT_EQ(dictionary.indexOf("a"), 1);
    EXPECT_EQ(dictionary.indexOf(""), 0);
    EXPECT_EQ(dictionary.at(1), "a");
    EXPECT_EQ(dictionary.count(), 2U);
}

TEST(TextDictionary, findsEachOfAsManyAsItHasRoomFor) {
    TextDictionary dictionary;
    for (std::size_t i = 0; i < TextDictionary::mostTexts; ++i)
        ASSERT_EQ(dictionary.indexOf(std::to_string(i)), i);
    EXPECT_EQ(dictionary.indexOf("x"), std::nullopt);
    EXPECT_EQ(dictionary.indexOf("16383"), 16383);
}

TEST(TextDictionary, takesNoMoreBytesThanItHasRoomFor) {
    TextDictionary dictionary;
    EXPECT_EQ(dictionary.indexOf(std::string(TextDictionary::mostBytes - 1, 'x')), 0);
    EXPECT_EQ(dictionary.indexOf("ab"), std::nullopt);
    EXPECT_EQ(dictionary.indexOf("a"), 1);
}

} // namespace
} // namespace velmora
