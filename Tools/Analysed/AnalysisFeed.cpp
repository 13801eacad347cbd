// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Analysed/AnalysisFeed.h"

#include "Platform/TelephonyService.h"

#include <algorithm>
#include <utility>

namespace velmora {

AnalysisFeed::AnalysisFeed(AnalysisClock clock, MakeAnalysis make) : _clock(clock), _make(std::move(make)) {}

Result<TechnologyFeed*> AnalysisFeed::of(const std::string& technology) {
    const std::string_view name = shortTechnologyName(technology);
    const auto found = std::find_if(_technologies.begin(), _technologies.end(),
                                    [name](const auto& each) { return each->technology() == name; });
    if (found != _technologies.end())
        return found->get();
    Result<std::unique_ptr<TechnologyFeed>> made =
        TechnologyFeed::make(std::string(name), _clock, _make, _first);
    if (!made)
        return Failure{made.reason()};
    return _technologies.emplace_back(*std::move(made)).get();
}

void AnalysisFeed::reportLoss(const InputLoss& loss) {
    for (const auto& each : _technologies)
        each->analysis().reportLoss(loss);
}

void AnalysisFeed::interrupt() {
    for (const auto& each : _technologies)
        each->analysis().interrupt();
}

void AnalysisFeed::finish() {
    for (const auto& each : _technologies)
        each->analysis().finish();
}

} // namespace velmora
