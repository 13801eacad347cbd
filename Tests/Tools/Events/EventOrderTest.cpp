// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventOrder.h"

#include "Tests/Tools/Events/ExampleEvent.h"

#include <gmock/gmock.h>

#include <cstdint>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class EventOrderTest : public testing::Test {
protected:
    std::vector<std::string> _passed;
    EventOrder _order{[this](const Event& event, const auto&) { _passed.push_back(event.kind); }};
};

TEST_F(EventOrderTest, EventsAreSortedByBegin) {
    for (const auto& [time, kind] : {std::pair{30, "c"}, {10, "a"}, {20, "b"}})
        _order.add(eventAt(time, kind));
    EXPECT_THAT(_passed, IsEmpty());
    _order.flush();
    EXPECT_THAT(_passed, ElementsAre("a", "b", "c"));
}

TEST_F(EventOrderTest, SimultaneousEventsAreSortedByKindAndThenAsTheyBecameKnown) {
    std::vector<std::string> texts;
    EventOrder order([&](const Event& event, const auto&) { texts.push_back(event.kind + event.text); });
    for (const auto& [kind, text] : {std::pair{"b", "2"}, {"a", "2"}, {"b", "1"}, {"a", "1"}}) {
        Event event = eventAt(5, kind);
        event.text = text;
        order.add(event);
    }
    order.flush();
    EXPECT_THAT(texts, ElementsAre("a2", "a1", "b2", "b1"));
}

TEST_F(EventOrderTest, TheEarliestIsPassedOnOnceThereAreTooMany) {
    for (std::size_t i = 0; i < EventOrder::mostHeld; ++i)
        _order.add(eventAt(static_cast<std::int64_t>(2 * EventOrder::mostHeld - i), "later"));
    EXPECT_THAT(_passed, IsEmpty());
    _order.add(eventAt(1, "first"));
    EXPECT_THAT(_passed, ElementsAre("first"));
}

} // namespace
} // namespace velmora
