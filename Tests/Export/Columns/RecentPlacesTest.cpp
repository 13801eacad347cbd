// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/RecentPlaces.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

Time second(std::int64_t seconds) {
    return Time(std::chrono::seconds(seconds));
}

TEST(RecentPlaces, knowWhereAMessageArrived) {
    RecentPlaces places;
    places.add(second(1), {10, 20});
    places.add(second(2), {11, 21});
    ASSERT_TRUE(places.at(second(1)));
    EXPECT_EQ(places.at(second(1))->latitude, 10);
    EXPECT_EQ(places.at(second(2))->longitude, 21);
    EXPECT_FALSE(places.at(second(3)));
}

TEST(RecentPlaces, haveTheLatestOfSeveralAtOneTime) {
    RecentPlaces places;
    places.add(second(1), {10, 20});
    places.add(second(1), {11, 21});
    EXPECT_EQ(places.at(second(1))->latitude, 11);
}

TEST(RecentPlaces, forgetTheEarliestBeyondTheirNumber) {
    RecentPlaces places;
    for (std::int64_t i = 0; i <= static_cast<std::int64_t>(RecentPlaces::most); ++i)
        places.add(second(i), {i, i});
    EXPECT_FALSE(places.at(second(0)));
    EXPECT_EQ(places.at(second(1))->latitude, 1);
    EXPECT_EQ(places.at(second(RecentPlaces::most))->latitude, 4096);
}

} // namespace
} // namespace velmora
