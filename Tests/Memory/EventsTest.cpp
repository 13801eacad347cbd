// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Engine/EventEngine.h"
#include "LogGenerator/LogGenerator.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Memory/Allocations.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

// Where nothing happens, the engine of events allocates nothing, and its memory does not grow with the
// messages.

namespace velmora {
namespace {

class CountingSink final : public EventSink {
public:
    void happened(const Event&) override { ++events; }
    std::size_t events = 0;
};

/// Reports to an engine and counts what that allocates where no event comes of it.
class CountingEngine final : public ObservationSink {
public:
    explicit CountingEngine(const Catalogue& catalogue) : _engine(catalogue, _sink) {}

    void observed(const ObservedMessage& message) override {
        const std::size_t before = _sink.events;
        const Allocations counted;
        _engine.report({{0, ++_messages}, message.arrival, message});
        if (_sink.events == before)
            allocations += counted.count();
    }

    [[nodiscard]] std::size_t events() const { return _sink.events; }
    std::uint64_t allocations = 0;

private:
    CountingSink _sink;
    EventEngine _engine;
    std::uint64_t _messages = 0;
};

class EventsMemoryTest : public testing::TestWithParam<DecodedTechnology> {};

TEST_P(EventsMemoryTest, NothingIsAllocatedWhereNothingHappens) {
    TechnologyUnderTest technology(GetParam());
    CountingEngine engine(technology.decoder().catalogue());
    technology.decoder().setObservationSink(&engine);
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed(GetParam().scenario)->make(1);
    const auto drive = [&](int messages) {
        engine.allocations = 0;
        for (int i = 0; i < messages; ++i) {
            const ScenarioEvent each = scenario->next();
            technology.clock().setNow(FakeClock::defaultNow() + each.offset);
            technology.decoder().updateState(technology.state, each.message);
        }
        return engine.allocations;
    };
    drive(20000);
    const std::size_t events = engine.events();
    EXPECT_GT(events, 100U);
    // A text that is longer than all before it, or one more neighbour, may need more room; rarely.
    EXPECT_LE(drive(20000), 20U);
    EXPECT_GT(engine.events(), events);
    technology.decoder().setObservationSink(nullptr);
}

INSTANTIATE_TEST_SUITE_P(Drives, EventsMemoryTest,
                         testing::Values(decodedTechnologies[0], decodedTechnologies[1],
                                         decodedTechnologies[2], decodedTechnologies[3],
                                         decodedTechnologies[5]),
                         [](const auto& drive) { return std::string(drive.param.scenario); });

} // namespace
} // namespace velmora
