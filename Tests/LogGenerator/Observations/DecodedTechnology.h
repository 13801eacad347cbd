// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"

#include <memory>
#include <ostream>
#include <string>

namespace velmora {

/// A technology by its drive.
struct DecodedTechnology {
    const char* scenario;
    const char* resource; ///< the template; empty for none

    friend std::ostream& operator<<(std::ostream& out, const DecodedTechnology& decoded) {
        return out << decoded.scenario;
    }
};

inline constexpr DecodedTechnology decodedTechnologies[] = {
    {"gsm", "Ostrel_GSM"},  {"lte", "LTE"}, {"utran", "Ostrel_UTRAN"},
    {"c2k", "C2KTemplate"}, {"ifx", ""},    {"modem", "Modem"}};

/// Its decoder with the template that is shipped, and a state.
class TechnologyUnderTest {
    CapturedLog _log{LogPriority::Emergency};
    FakeClock _clock;
    FakeResources _resources;
    std::unique_ptr<LogGenerator> _decoder;

public:
    explicit TechnologyUnderTest(const DecodedTechnology& technology) {
        const std::string resource = technology.resource;
        if (!resource.empty())
            _resources.put(resource, "plist", shippedResource(resource + ".plist"));
        const std::unique_ptr<Scenario> scenario = scenarioKindNamed(technology.scenario)->make(1);
        _decoder = LogGenerator::generatorFromTechnology(scenario->technology(), _clock);
        _decoder->setKeepsHistory(false);
    }

    [[nodiscard]] LogGenerator& decoder() { return *_decoder; }
    [[nodiscard]] FakeClock& clock() { return _clock; }

    Dictionary state;
};

} // namespace velmora
