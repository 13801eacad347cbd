// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/ColumnRange.h"

#include <gtest/gtest.h>

#include <bit>
#include <limits>

namespace velmora {
namespace {

std::string stored(std::uint64_t word) {
    std::string text(sizeof word, '\0');
    for (std::size_t i = 0; i < text.size(); ++i)
        text[i] = static_cast<char>(word >> (8 * i));
    return text;
}

std::string stored(double number) {
    return stored(std::bit_cast<std::uint64_t>(number));
}

auto rangeOf(const std::vector<double>& numbers) {
    std::vector<std::uint64_t> words;
    for (const double number : numbers)
        words.push_back(std::bit_cast<std::uint64_t>(number));
    ColumnRange range(StoredType::Number);
    range.add(words);
    return range.result();
}

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

TEST(ColumnRange, isAbsentWithoutValues) {
    EXPECT_EQ(rangeOf({}), std::nullopt);
}

TEST(ColumnRange, isTheLeastAndTheGreatest) {
    EXPECT_EQ(rangeOf({-71.5, 3, -140}), std::pair(stored(-140.0), stored(3.0)));
}

TEST(ColumnRange, leavesOutWhatHasNoOrder) {
    EXPECT_EQ(rangeOf({notANumber, 2, notANumber}), std::pair(stored(2.0), stored(2.0)));
    EXPECT_EQ(rangeOf({notANumber}), std::nullopt);
}

TEST(ColumnRange, holdsBothZeros) {
    EXPECT_EQ(rangeOf({0.0}), std::pair(stored(-0.0), stored(0.0)));
    EXPECT_EQ(rangeOf({-0.0, 5}), std::pair(stored(-0.0), stored(5.0)));
}

TEST(ColumnRange, holdsInfinity) {
    const double infinity = std::numeric_limits<double>::infinity();
    EXPECT_EQ(rangeOf({infinity, -infinity}), std::pair(stored(-infinity), stored(infinity)));
}

TEST(ColumnRange, comparesIntegersWithTheirSign) {
    ColumnRange range(StoredType::Integer);
    const std::vector<std::uint64_t> words = {1, ~std::uint64_t{0}, 0};
    range.add(words);
    EXPECT_EQ(range.result(), std::pair(stored(~std::uint64_t{0}), stored(std::uint64_t{1})));
}

TEST(ColumnRange, comparesTextsByTheirBytesWithoutSign) {
    ColumnRange range(StoredType::Text);
    for (const std::string_view text : {"b", "\u00e4", "a"})
        range.add(text);
    EXPECT_EQ(range.result(), std::pair(std::string("a"), std::string("\u00e4")));
}

TEST(ColumnRange, isAbsentWithATextThatIsLong) {
    ColumnRange range(StoredType::Text);
    const std::string longest(64, 'x');
    range.add(longest);
    EXPECT_EQ(range.result(), std::pair(longest, longest));
    const std::string longer(65, 'x');
    range.add(longer);
    EXPECT_EQ(range.result(), std::nullopt);
}

} // namespace
} // namespace velmora
