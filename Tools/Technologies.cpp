// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Technologies.h"

#include "Platform/TelephonyService.h"

namespace velmora {

Result<std::string> technologyNamed(std::string_view name) {
    if (name.empty())
        return Failure{"names no technology, wanted one of " + technologyNames()};
    if (!isTechnology(name))
        return Failure{"technology \"" + std::string(name) + "\" is unknown, wanted one of " +
                       technologyNames()};
    return technologyConstant(name);
}

Result<std::unique_ptr<LogGenerator>> makeDecoder(std::string_view technology, const Clock& clock) {
    const Result<std::string> constant = technologyNamed(technology);
    if (!constant)
        return Failure{constant.reason()};
    std::unique_ptr<LogGenerator> decoder = LogGenerator::generatorFromTechnology(*constant, clock);
    if (!decoder)
        return Failure{"technology " + std::string(shortTechnologyName(*constant)) + " has no decoder here"};
    return decoder;
}

} // namespace velmora
