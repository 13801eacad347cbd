// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/DriveEvents.h"

#include <array>
#include <cstdio>

namespace velmora {

std::vector<std::string> KeptEvents::lines(Time from) const {
    std::vector<std::string> lines;
    for (const Event& each : events) {
        std::array<char, 32> time{};
        std::snprintf(time.data(), time.size(), "%.3f ",
                      std::chrono::duration<double>(each.time - from).count());
        lines.push_back(time.data() + each.kind + ": " + each.text);
    }
    return lines;
}

EngineUnderTest::EngineUnderTest(const DecodedTechnology& decoded)
    : technology(decoded), engine(technology.decoder().catalogue(), kept) {
    technology.decoder().setObservationSink(this);
}

EngineUnderTest::~EngineUnderTest() {
    technology.decoder().setObservationSink(nullptr);
}

void EngineUnderTest::decode(const Data& message, Time arrival) {
    technology.clock().setNow(arrival);
    technology.decoder().updateState(technology.state, message);
}

void EngineUnderTest::observed(const ObservedMessage& message) {
    engine.report({{0, ++messages}, message.arrival, message});
}

std::vector<ScenarioEvent> messagesOf(const DecodedTechnology& technology, std::uint64_t seed,
                                      std::size_t count) {
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed(technology.scenario)->make(seed);
    std::vector<ScenarioEvent> messages;
    while (messages.size() < count)
        messages.push_back(scenario->next());
    return messages;
}

KeptEvents eventsOf(const DecodedTechnology& technology, const std::vector<ScenarioEvent>& messages) {
    EngineUnderTest engine(technology);
    for (const ScenarioEvent& each : messages)
        engine.decode(each.message, FakeClock::defaultNow() + each.offset);
    engine.engine.finish();
    return engine.kept;
}

} // namespace velmora
