// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/SampleBlock.h"
#include "Toolkit/Charts/SampleStore.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace velmora {
namespace {

constexpr std::int64_t limit_ns = 100;

TEST(SampleRing, HasWhatWasAppendedAsItWas) {
    SampleStore store;
    const auto ring = store.makeSeries(limit_ns);
    EXPECT_EQ(ring->at(0), std::nullopt);
    EXPECT_EQ(ring->oldest_ns(), std::nullopt);
    EXPECT_TRUE(ring->append(10, -97.25));
    EXPECT_TRUE(ring->append(20, 268'435'457)); // more digits than a float has
    EXPECT_EQ(ring->at(9), std::nullopt);
    EXPECT_EQ(ring->at(10), (Sample{10, -97.25}));
    EXPECT_EQ(ring->at(19), (Sample{10, -97.25}));
    EXPECT_EQ(ring->at(20), (Sample{20, 268'435'457}));
    EXPECT_EQ(ring->oldest_ns(), 10);
    EXPECT_EQ(ring->newest_ns(), 20);
}

TEST(SampleRing, AValueCountsNoLongerThanTheGapLimit) {
    SampleStore store;
    const auto ring = store.makeSeries(limit_ns);
    EXPECT_TRUE(ring->append(0, 5));
    EXPECT_EQ(ring->at(100), (Sample{0, 5}));
    EXPECT_EQ(ring->at(101), std::nullopt);
    EXPECT_TRUE(ring->append(101, 6));
    EXPECT_TRUE(ring->isGapAfter(0));
    EXPECT_TRUE(ring->append(201, 7));
    EXPECT_FALSE(ring->isGapAfter(1));
    EXPECT_EQ(ring->gapCount(0, 1000), 1U);
}

TEST(SampleRing, AGapEndsTheValueBeforeIt) {
    SampleStore store;
    const auto ring = store.makeSeries(limit_ns);
    EXPECT_TRUE(ring->append(0, 5));
    EXPECT_TRUE(ring->appendGap(10));
    EXPECT_TRUE(ring->appendGap(12));
    EXPECT_EQ(ring->size(), 2U);
    EXPECT_EQ(ring->at(9), (Sample{0, 5}));
    EXPECT_EQ(ring->at(10), std::nullopt);
    EXPECT_EQ(ring->gapCount(0, 1000), 0U); // none between samples so far
    EXPECT_TRUE(ring->append(20, 6));
    EXPECT_EQ(ring->gapCount(0, 1000), 1U);
    EXPECT_EQ(ring->before(20), (Sample{0, 5}));
    EXPECT_EQ(ring->after(0), (Sample{20, 6}));
    EXPECT_EQ(ring->after(20), std::nullopt);
    EXPECT_EQ(ring->extremes(0, 100), (Extremes{5, 6}));
}

TEST(SampleRing, RefusesEarlierTimesAndWhatIsNoNumber) {
    SampleStore store;
    const auto ring = store.makeSeries(limit_ns);
    EXPECT_TRUE(ring->append(10, 1));
    EXPECT_FALSE(ring->append(9, 2));
    EXPECT_FALSE(ring->appendGap(9));
    EXPECT_FALSE(ring->append(11, std::numeric_limits<double>::quiet_NaN()));
    EXPECT_FALSE(ring->append(11, std::numeric_limits<double>::infinity()));
    EXPECT_TRUE(ring->append(10, 3));
    EXPECT_EQ(ring->size(), 2U);
    EXPECT_EQ(ring->at(10), (Sample{10, 3})); // the later of both
    EXPECT_EQ(ring->countBefore(10), 0U);
    EXPECT_EQ(ring->countBefore(10, true), 2U);
}

TEST(SampleRing, CanBeEmptiedAndFilledFromAnEarlierTime) {
    SampleStore store;
    const auto ring = store.makeSeries(limit_ns);
    EXPECT_TRUE(ring->append(1000, 1));
    const auto before = ring->revision();
    ring->clear();
    EXPECT_NE(ring->revision(), before);
    EXPECT_EQ(ring->size(), 0U);
    EXPECT_TRUE(ring->append(10, 2));
    EXPECT_EQ(ring->at(10), (Sample{10, 2}));
}

TEST(SampleStore, HoldsADayOfTwentySeriesInItsMemory) {
    SampleStore store;
    std::vector<std::shared_ptr<SampleRing>> series;
    for (int number = 0; number < 20; ++number)
        series.push_back(store.makeSeries(5'000'000'000));
    constexpr int day = 24 * 3600;
    for (int second = 0; second < day; ++second)
        for (const auto& ring : series)
            ASSERT_TRUE(ring->append(second * 1'000'000'000LL, second));
    EXPECT_LE(store.byteCount(), std::size_t(32) << 20);
    for (const auto& ring : series) {
        EXPECT_EQ(ring->size(), static_cast<std::size_t>(day));
        EXPECT_EQ(ring->oldest_ns(), 0);
    }
    // The second day displaces the first, and takes no more.
    for (int second = day; second < 2 * day; ++second)
        for (const auto& ring : series)
            ASSERT_TRUE(ring->append(second * 1'000'000'000LL, second));
    EXPECT_LE(store.byteCount(), std::size_t(32) << 20);
    for (const auto& ring : series) {
        EXPECT_GE(ring->size(), static_cast<std::size_t>(day));
        EXPECT_EQ(ring->newest_ns(), (2 * day - 1) * 1'000'000'000LL);
        // Only the oldest are gone: the rest has no holes.
        EXPECT_EQ(ring->gapCount(0, 2 * day * 1'000'000'000LL), 0U);
    }
}

TEST(SampleStore, ALongSeriesTakesNothingFromTheShareOfOthers) {
    SampleStore store(10 * (sizeof(SampleBlock) + 100));
    const auto quiet = store.makeSeries(limit_ns);
    const auto busy = store.makeSeries(limit_ns);
    for (int time = 0; time < 3000; ++time) // three blocks of ten
        EXPECT_TRUE(quiet->append(time, time));
    for (int time = 0; time < 100'000; ++time)
        EXPECT_TRUE(busy->append(time, time));
    EXPECT_EQ(quiet->size(), 3000U);
    EXPECT_GE(busy->size(), 6 * SampleBlock::capacity);
    EXPECT_EQ(busy->newest_ns(), 99'999);
    EXPECT_EQ(static_cast<std::size_t>(*busy->oldest_ns()), 100'000 - busy->size());
}

TEST(SampleStore, ASeriesThatGoesLeavesItsMemoryToOthers) {
    SampleStore store(4 * (sizeof(SampleBlock) + 100));
    auto gone = store.makeSeries(limit_ns);
    for (int time = 0; time < 10'000; ++time)
        EXPECT_TRUE(gone->append(time, 0));
    const std::size_t full = store.byteCount();
    gone.reset();
    const auto kept = store.makeSeries(limit_ns);
    for (int time = 0; time < 10'000; ++time)
        EXPECT_TRUE(kept->append(time, time));
    EXPECT_EQ(store.byteCount(), full);
    EXPECT_GE(kept->size(), 3 * SampleBlock::capacity);
}

TEST(SampleStore, MayGoBeforeItsSeries) {
    auto store = std::make_unique<SampleStore>();
    const auto ring = store->makeSeries(limit_ns);
    store.reset();
    EXPECT_TRUE(ring->append(0, 1));
    EXPECT_EQ(ring->at(0), (Sample{0, 1}));
}

} // namespace
} // namespace velmora
