#include "Tools/Technologies.h"

#include "Platform/TelephonyService.h"

#include <algorithm>
#include <array>

namespace velmora {

namespace {

constexpr std::array technologies = {
    kVoxLogChannelTechnology_IFX,           kVoxLogChannelTechnology_Ostrel_GSM,
    kVoxLogChannelTechnology_Ostrel_CDMA,   kVoxLogChannelTechnology_Ostrel_LTE,
    kVoxLogChannelTechnology_Ostrel_UTRAN2,
};

} // namespace

std::string technologyNames() {
    std::string names;
    for (const std::string_view technology : technologies) {
        names += names.empty() ? "" : ", ";
        names += shortTechnologyName(technology);
    }
    return names;
}

Result<std::unique_ptr<LogGenerator>> makeDecoder(std::string_view technology, const Clock& clock) {
    if (technology.empty())
        return Failure{"names no technology, wanted one of " + technologyNames()};
    const std::string constant = technologyConstant(technology);
    if (std::find(technologies.begin(), technologies.end(), constant) == technologies.end())
        return Failure{"technology \"" + std::string(technology) + "\" is unknown, wanted one of " +
                       technologyNames()};
    std::unique_ptr<LogGenerator> decoder = LogGenerator::generatorFromTechnology(constant, clock);
    if (!decoder)
        return Failure{"technology " + std::string(shortTechnologyName(constant)) + " has no decoder here"};
    return decoder;
}

} // namespace velmora
