// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/DriveEvents.h"

#include <gtest/gtest.h>

#include <chrono>

namespace velmora {
namespace {

Event eventAt(int seconds, const std::string& kind, bool lasts = false) {
    Event event;
    event.time = Time(std::chrono::seconds(seconds));
    event.kind = kind;
    event.lasts = lasts;
    return event;
}

std::string kindsOf(const DriveEvents& list) {
    std::string kinds;
    for (const Event& each : list.events())
        kinds += (kinds.empty() ? "" : " ") + each.kind + (each.lasts && !each.end ? "..." : "");
    return kinds;
}

TEST(DriveEventsListTest, HasTheNewestFirstWheneverItBecomesKnown) {
    DriveEvents list;
    list.happened(eventAt(1, "handover"));
    list.happened(eventAt(5, "gap"));
    list.happened(eventAt(3, "late"));
    EXPECT_EQ(kindsOf(list), "gap late handover");
}

TEST(DriveEventsListTest, HasWhatLastsOnceFromItsBeginOn) {
    DriveEvents list;
    list.began(eventAt(1, "out-of-service", true));
    list.happened(eventAt(2, "handover"));
    EXPECT_EQ(kindsOf(list), "handover out-of-service...");
    Event ended = eventAt(1, "out-of-service", true);
    ended.end = Time(std::chrono::seconds(4));
    list.happened(ended);
    EXPECT_EQ(kindsOf(list), "handover out-of-service");
}

TEST(DriveEventsListTest, LeavesOutTheOldestOfTooMany) {
    DriveEvents list;
    for (int i = 0; i < static_cast<int>(DriveEvents::most) + 10; ++i)
        list.happened(eventAt(i, "malformed"));
    ASSERT_EQ(list.events().size(), DriveEvents::most);
    EXPECT_EQ(list.events().back().time, Time(std::chrono::seconds(10)));
}

TEST(DriveEventsListTest, HasAnotherRevisionAfterEachChange) {
    DriveEvents list;
    const std::uint64_t before = list.revision();
    list.happened(eventAt(1, "handover"));
    EXPECT_NE(list.revision(), before);
}

} // namespace
} // namespace velmora
