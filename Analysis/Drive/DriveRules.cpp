// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/DriveRules.h"

#include "LogGenerator/LogGenerator.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

#include <vector>

namespace velmora {

DriveRules driveRules(std::span<const RuleFile> files, const Catalogue& catalogue, const Clock& clock) {
    // A rule may be for another technology, whose paths are no mistakes.
    std::vector<std::unique_ptr<LogGenerator>> decoders;
    std::vector<const Catalogue*> catalogues{&catalogue};
    for (const std::string_view technology : voxTechnologies)
        if (shortTechnologyName(technology) != catalogue.technology())
            if (auto decoder = LogGenerator::generatorFromTechnology(technology, clock)) {
                catalogues.push_back(&decoder->catalogue());
                decoders.push_back(std::move(decoder));
            }
    RuleSet rules(catalogues);
    for (const RuleFile& each : files)
        rules.add(each);
    for (const RuleError& each : rules.errors())
        logLine(LogPriority::Error, each.message());
    return {makeRuleDetector(rules, catalogue), rules.classes()};
}

} // namespace velmora
