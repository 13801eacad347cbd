// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/Drives/Truth/KeptTruth.h"

#include "Telephony/Drives/ScenarioRegistry.h"

#include <algorithm>

namespace velmora {

std::vector<TruthEvent> KeptTruth::of(std::string_view kind) const {
    std::vector<TruthEvent> found;
    for (const TruthEvent& event : events)
        if (event.kind == kind && !event.isHidden)
            found.push_back(event);
    std::stable_sort(found.begin(), found.end(),
                     [](const TruthEvent& a, const TruthEvent& b) { return a.at < b.at; });
    return found;
}

std::string fieldOf(const TruthEvent& event, std::string_view name) {
    for (const auto& [each, value] : event.fields)
        if (each == name)
            return value;
    return {};
}

double secondsOf(TruthTime time) {
    return std::chrono::duration<double>(time).count();
}

KeptTruth truthOf(std::string_view scenario, std::uint64_t seed, double duration_s) {
    KeptTruth truth;
    const std::unique_ptr<Scenario> drive = scenarioKindNamed(scenario)->make(seed);
    drive->tellTruth(truth);
    while (secondsOf(drive->next().offset) < duration_s) {
    }
    drive->finishTruth();
    return truth;
}

} // namespace velmora
