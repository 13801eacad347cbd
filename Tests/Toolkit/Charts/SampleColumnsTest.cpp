// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/SampleColumns.h"

#include "Toolkit/Charts/SampleStore.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

class SampleColumnsTest : public ::testing::Test {
protected:
    [[nodiscard]] std::vector<SampleColumn> columns(std::int64_t begin_ns, std::int64_t column_ns,
                                                    std::size_t count) const {
        std::vector<SampleColumn> result;
        reduceToColumns(*ring, begin_ns, column_ns, count, result);
        return result;
    }

    SampleStore store;
    std::shared_ptr<SampleRing> ring = store.makeSeries(30);
};

TEST_F(SampleColumnsTest, KeepExtremesAndTheValuesThatNeighboursAreJoinedTo) {
    for (const auto& [time, value] : {std::pair{0, 3}, {1, 9}, {2, -4}, {3, 5}, {11, 7}})
        ASSERT_TRUE(ring->append(time, value));
    const auto result = columns(0, 10, 3);
    EXPECT_EQ(result[0].extremes, (Extremes{-4, 9}));
    EXPECT_EQ(result[0].first, 3);
    EXPECT_EQ(result[0].last, 5);
    EXPECT_FALSE(result[0].joinsPrevious);
    EXPECT_EQ(result[1].extremes, (Extremes{7, 7}));
    EXPECT_TRUE(result[1].joinsPrevious);
    EXPECT_TRUE(result[2].extremes.isEmpty());
}

TEST_F(SampleColumnsTest, AreNotJoinedOverGaps) {
    ASSERT_TRUE(ring->append(5, 1));
    ASSERT_TRUE(ring->append(36, 2)); // later than the gap limit
    ASSERT_TRUE(ring->appendGap(41));
    ASSERT_TRUE(ring->append(55, 3));
    ASSERT_TRUE(ring->append(65, 4));
    const auto result = columns(0, 10, 7);
    EXPECT_FALSE(result[3].joinsPrevious);
    EXPECT_TRUE(result[4].extremes.isEmpty());
    EXPECT_FALSE(result[5].joinsPrevious);
    EXPECT_TRUE(result[6].joinsPrevious);
}

TEST_F(SampleColumnsTest, TheFirstIsJoinedToTheSampleBeforeTheRange) {
    ASSERT_TRUE(ring->append(-10, 1));
    ASSERT_TRUE(ring->append(5, 2));
    EXPECT_TRUE(columns(0, 10, 1)[0].joinsPrevious);
    EXPECT_EQ(columns(0, 10, 1)[0].extremes, (Extremes{2, 2}));
}

TEST_F(SampleColumnsTest, NoExtremeOfAMillionIsLost) {
    // 2^20 samples and four that stand out: the first and last, and two in the midst of blocks.
    constexpr std::int64_t count = 1 << 20;
    constexpr std::int64_t special[] = {0, 333'333, 777'777, count - 1};
    for (std::int64_t time = 0; time < count; ++time) {
        const bool isSpecial = std::find(std::begin(special), std::end(special), time) != std::end(special);
        ASSERT_TRUE(ring->append(time, isSpecial ? 1000.0 + static_cast<double>(time) : 0));
    }
    const auto result = columns(0, 1000, 1049);
    std::size_t found = 0;
    for (std::size_t column = 0; column < result.size(); ++column)
        found += result[column].extremes.maximum != 0 ? 1 : 0;
    EXPECT_EQ(found, 4U);
    for (const std::int64_t time : special)
        EXPECT_EQ(result[static_cast<std::size_t>(time / 1000)].extremes.maximum,
                  1000.0 + static_cast<double>(time));
}

} // namespace
} // namespace velmora
