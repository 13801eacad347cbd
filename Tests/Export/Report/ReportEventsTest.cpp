// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/ReportEvents.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

Event eventOf(std::string kind, std::string text) {
    Event event;
    event.kind = std::move(kind);
    event.text = std::move(text);
    event.technology = "Modem";
    return event;
}

std::string shownText(bool hasIdentities, const Event& event) {
    ReportEvents events(hasIdentities, {{"mine", "level {serving.level} of {/SIM/IMSI}"}});
    events.happened(event);
    events.finish();
    return events.name(events.items().front().text);
}

TEST(ReportEvents, LeaveIdentitiesOut) {
    Event up = eventOf("context-up", "context 5: 192.0.2.17");
    up.fields.push_back({"context", std::string("5"), Unit::None});
    up.fields.push_back({"address", std::string("192.0.2.17"), Unit::None});
    EXPECT_EQ(shownText(false, up), "context 5");
    EXPECT_EQ(shownText(true, up), "context 5: 192.0.2.17");
    Event change = eventOf("address-change", "context 5: 192.0.2.17 to 192.0.2.18");
    change.fields.push_back({"context", std::string("5"), Unit::None});
    EXPECT_EQ(shownText(false, change), "context 5: another address");
    EXPECT_EQ(shownText(false, eventOf("sim-change", "89440000 to 89440001")), "another SIM");
}

TEST(ReportEvents, LeaveOutWhatARuleShowsOfTheDisplay) {
    EXPECT_EQ(shownText(false, eventOf("mine", "level -80 dBm of 001010123456789")),
              "level {serving.level} of {/SIM/IMSI}");
    EXPECT_EQ(shownText(false, eventOf("weak-coverage", "weak coverage: -115 dBm")),
              "weak coverage: -115 dBm");
}

TEST(ReportEvents, AreSortedByTheirBegin) {
    ReportEvents events(false, {});
    for (const int seconds : {3, 1, 2}) {
        Event event = eventOf("gap", std::to_string(seconds));
        event.time = Time(std::chrono::seconds(seconds));
        events.happened(event);
    }
    events.finish();
    std::string order;
    for (const ReportEvents::Item& each : events.items())
        order += events.name(each.text);
    EXPECT_EQ(order, "123");
}

TEST(ReportEvents, AreCountedBeyondTheMost) {
    ReportEvents events(false, {});
    Event event = eventOf("gap", "gap");
    event.severity = Severity::Critical;
    for (std::size_t i = 0; i < ReportEvents::most[2] + 5; ++i)
        events.happened(event);
    events.happened(eventOf("radio-state", "idle"));
    events.finish();
    EXPECT_EQ(events.items().size(), ReportEvents::most[2] + 1);
    EXPECT_EQ(events.count(Severity::Critical), ReportEvents::most[2] + 5);
    EXPECT_EQ(events.omitted(), 5U);
}

} // namespace

} // namespace velmora
