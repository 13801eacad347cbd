// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Resources/DissectorSections.h"

#include "LogGenerator/C2K/LogCodeParsers.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/OstrelLogGenerator2.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/TelephonyService.h"
#include "Tests/Support/FakeClock.h"

#include <algorithm>
#include <map>
#include <memory>

namespace velmora {

namespace {

constexpr std::string_view technologies[] = {
    kVoxLogChannelTechnology_Ostrel_GSM,    kVoxLogChannelTechnology_Ostrel_LTE,
    kVoxLogChannelTechnology_Ostrel_UTRAN2, kVoxLogChannelTechnology_Ostrel_CDMA,
    kVoxLogChannelTechnology_Modem,
};

const FakeClock clock;

/// The decoders of all technologies, which look for their templates when they are made.
class Decoders {
public:
    Decoders() {
        FileResources shipped({VELMORA_SOURCE_DIR "/Resources"});
        Resources* const earlier = setResources(&shipped);
        for (const std::string_view technology : technologies)
            _decoders[std::string(shortTechnologyName(technology))] =
                LogGenerator::generatorFromTechnology(technology, _clock);
        setResources(earlier);
    }

    /// The decoder's index of sections; null where it has none.
    [[nodiscard]] const ClassIndex* indexOf(std::string_view technology) const {
        const auto decoder = _decoders.find(std::string(technology));
        if (decoder == _decoders.end())
            return nullptr;
        const auto* sections = dynamic_cast<const OstrelLogGenerator2*>(decoder->second.get());
        return sections ? &sections->classIndex() : nullptr;
    }

private:
    FakeClock _clock;
    std::map<std::string, std::unique_ptr<LogGenerator>> _decoders;
};

const ClassIndex* indexOf(std::string_view technology) {
    static const Decoders decoders;
    return decoders.indexOf(technology);
}

} // namespace

std::vector<std::string> recordTechnologies() {
    std::vector<std::string> names;
    for (const std::string_view technology : technologies)
        names.emplace_back(shortTechnologyName(technology));
    return names;
}

std::vector<std::string> sectionsWanting(std::string_view technology, std::uint32_t code) {
    std::vector<std::string> names;
    const ClassIndex* index = indexOf(technology);
    if (const std::vector<Base*>* sections = index ? index->getSubscribers(code) : nullptr)
        for (const Base* section : *sections) {
            std::string name(section->getSectionName());
            if (std::find(names.begin(), names.end(), name) == names.end())
                names.push_back(std::move(name));
        }
    return names;
}

std::string recordName(std::uint32_t code) {
    const C2K::LogCodeParser* parser = C2K::parserOfCode(code);
    return parser ? std::string(parser->name()) : "";
}

} // namespace velmora
