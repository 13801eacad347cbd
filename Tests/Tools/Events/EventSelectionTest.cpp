// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventSelection.h"

#include "Tests/Tools/Events/ExampleEvent.h"

namespace velmora {
namespace {

TimeBound after(int seconds) {
    return {std::chrono::seconds(seconds), true};
}

TEST(EventSelectionTest, ContainsEverythingByDefault) {
    EXPECT_TRUE(EventSelection().contains(eventAt(0), at(0)));
}

TEST(EventSelectionTest, KindAndLeastSeverity) {
    EventSelection selection;
    selection.kinds = {"handover", "gap"};
    selection.least = Severity::Warning;
    EXPECT_FALSE(selection.contains(eventAt(0, "handover", Severity::Info), at(0)));
    EXPECT_TRUE(selection.contains(eventAt(0, "handover", Severity::Warning), at(0)));
    EXPECT_TRUE(selection.contains(eventAt(0, "gap", Severity::Critical), at(0)));
    EXPECT_FALSE(selection.contains(eventAt(0, "call-lost", Severity::Critical), at(0)));
}

TEST(EventSelectionTest, RangeHasItsBeginAndNotItsEnd) {
    EventSelection selection;
    selection.range = {after(1), after(3)};
    const Time first = at(500);
    EXPECT_FALSE(selection.contains(eventAt(1499), first));
    EXPECT_TRUE(selection.contains(eventAt(1500), first));
    EXPECT_TRUE(selection.contains(eventAt(3499), first));
    EXPECT_FALSE(selection.contains(eventAt(3500), first));
}

TEST(EventSelectionTest, AnEventThatReachesIntoTheRangeIsInIt) {
    EventSelection selection;
    selection.range = {after(10), after(20)};
    EXPECT_TRUE(selection.contains(lastingEvent(5'000, 10'000), at(0)));
    EXPECT_TRUE(selection.contains(lastingEvent(5'000, 30'000), at(0)));
    EXPECT_FALSE(selection.contains(lastingEvent(5'000, 9'999), at(0)));
    EXPECT_FALSE(selection.contains(lastingEvent(20'000, 30'000), at(0)));
    Event withoutEnd = lastingEvent(5'000, 0);
    withoutEnd.end.reset();
    EXPECT_TRUE(selection.contains(withoutEnd, at(0)));
}

TEST(EventSelectionTest, BeginAloneIsInTheRangeOrNot) {
    EventSelection selection;
    selection.range.from = after(10);
    EXPECT_FALSE(selection.containsBegin(lastingEvent(5'000, 30'000), at(0)));
    EXPECT_TRUE(selection.containsBegin(lastingEvent(10'000, 30'000), at(0)));
}

} // namespace
} // namespace velmora
