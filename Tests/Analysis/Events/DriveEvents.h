// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/EventEngine.h"
#include "Analysis/Events/EventKind.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/Observation.h"
#include "PropertyLists/Value.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"

#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// Keeps what happened, and what began.
class KeptEvents final : public EventSink {
public:
    void began(const Event& event) override { begun.push_back(event); }
    void happened(const Event& event) override { events.push_back(event); }

    /// "12.5 handover: PCI 1 on EARFCN 1300 to PCI 2 on EARFCN 1300": the time counts from that one.
    [[nodiscard]] std::vector<std::string> lines(Time from) const;

    std::vector<Event> events;
    std::vector<Event> begun;
};

/// A technology's decoder and an engine that gets what it observes.
class EngineUnderTest final : public ObservationSink {
public:
    explicit EngineUnderTest(const DecodedTechnology& technology);
    ~EngineUnderTest() override;

    /// A message that arrived then.
    void decode(const Data& message, Time arrival);
    void observed(const ObservedMessage& message) override;

    TechnologyUnderTest technology;
    KeptEvents kept;
    EventEngine engine;
    std::uint64_t messages = 0;
};

/// The first `count` messages of a drive.
[[nodiscard]] std::vector<ScenarioEvent> messagesOf(const DecodedTechnology& technology, std::uint64_t seed,
                                                    std::size_t count);
/// What they make happen, from 2026-11-16 05:00 UTC on.
[[nodiscard]] KeptEvents eventsOf(const DecodedTechnology& technology,
                                  const std::vector<ScenarioEvent>& messages);

} // namespace velmora
