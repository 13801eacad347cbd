// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/Programs/EventEnvironment.h"

#include "Tests/Tools/Events/ExampleEvent.h"

#include <gmock/gmock.h>

#include <algorithm>

namespace velmora {
namespace {

using testing::Contains;
using testing::ElementsAre;
using testing::Not;

TEST(EventEnvironmentTest, HasTheEventAndItsFields) {
    Event event = lastingEvent(1, 2500);
    event.text = "weak";
    event.fields = {{"from", std::string("PCI 1")},
                    {"value", -112.5, Unit::DBm},
                    {"to.physical-cell", 62.0},
                    {"roams", true}};
    event.evidence = {{0, 12}, {0, 15}};
    EXPECT_THAT(
        eventEnvironment(event, EventState::Complete, {{"a.pcapng"}}),
        ElementsAre("VELMORA_EVENT_KIND=weak-coverage", "VELMORA_EVENT_STATE=complete",
                    "VELMORA_EVENT_SEVERITY=warning", "VELMORA_EVENT_TIME=2026-11-16T05:00:00.001000000Z",
                    "VELMORA_EVENT_END=2026-11-16T05:00:02.500000000Z", "VELMORA_EVENT_TECHNOLOGY=Ostrel_LTE",
                    "VELMORA_EVENT_TEXT=weak", "VELMORA_EVENT_EVIDENCE=12 15", "VELMORA_EVENT_FROM=PCI 1",
                    "VELMORA_EVENT_VALUE=-112.5", "VELMORA_EVENT_TO_PHYSICAL_CELL=62",
                    "VELMORA_EVENT_ROAMS=true"));
}

TEST(EventEnvironmentTest, HostileValuesStayText) {
    Event event = eventAt(0);
    event.text = std::string("a\0b\nLD_PRELOAD=/x\x1b[2J", 21);
    event.fields = {{"kind", std::string("other")},                   // does not replace the event's
                    {"a=b\nc", std::string("\xff; rm -rf /")},        // a name may hold anything
                    {"long", std::string(200'000, 'x')},              // more than a variable can hold
                    {"wide", std::string(4095, 'x') + "\u00e9tail"}}; // no half character at the cut
    const std::vector<std::string> variables = eventEnvironment(event, EventState::Begins, {});
    EXPECT_THAT(variables, Contains("VELMORA_EVENT_TEXT=a\\x00b\\nLD_PRELOAD=/x\\x1B[2J"));
    EXPECT_THAT(variables, Contains("VELMORA_EVENT_KIND=handover"));
    EXPECT_THAT(variables, Not(Contains("VELMORA_EVENT_KIND=other")));
    EXPECT_THAT(variables, Contains("VELMORA_EVENT_A_B_C=\uFFFD; rm -rf /"));
    EXPECT_THAT(variables, Contains("VELMORA_EVENT_LONG=" + std::string(4096, 'x')));
    EXPECT_THAT(variables, Contains("VELMORA_EVENT_WIDE=" + std::string(4095, 'x')));
    for (const std::string& variable : variables)
        EXPECT_EQ(variable.find('\0'), std::string::npos) << variable;
}

} // namespace
} // namespace velmora
