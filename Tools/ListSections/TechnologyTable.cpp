// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ListSections/TechnologyTable.h"

#include "LogGenerator/C2K/LogCodeParsers.h"
#include "LogGenerator/LTE/LTEClassIndex.h"
#include "LogGenerator/Modem/ModemClassIndex.h"
#include "LogGenerator/OstrelGSM/Ostrel_GSMClassIndex.h"
#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Platform/TelephonyService.h"

#include <algorithm>

namespace velmora {

namespace {

template <class Index>
TechnologyTable tableOfSections(std::string_view technology) {
    TechnologyTable table{shortTechnologyName(technology), {}, {}};
    const Index index;
    for (const std::string& text : index.getAllLogCodes()) {
        const auto code = static_cast<std::uint32_t>(std::stoul(text));
        std::vector<std::string>& names = table.sections[code];
        for (const Base* section : *index.getSubscribers(code)) {
            std::string name(section->getSectionName());
            if (std::find(names.begin(), names.end(), name) == names.end())
                names.push_back(std::move(name));
        }
    }
    return table;
}

TechnologyTable tableOfRecords(std::string_view technology) {
    TechnologyTable table{shortTechnologyName(technology), {}, {}};
    for (const C2K::LogCodeParser* parser : C2K::logCodeParsers())
        table.records[parser->logCode()] = parser->name();
    return table;
}

} // namespace

std::vector<TechnologyTable> technologyTables() {
    return {
        tableOfSections<Ostrel_GSMClassIndex>(kVoxLogChannelTechnology_Ostrel_GSM),
        tableOfRecords(kVoxLogChannelTechnology_Ostrel_CDMA),
        tableOfSections<LTEClassIndex>(kVoxLogChannelTechnology_Ostrel_LTE),
        tableOfSections<UTRANClassIndex>(kVoxLogChannelTechnology_Ostrel_UTRAN2),
        tableOfSections<ModemClassIndex>(kVoxLogChannelTechnology_Modem),
    };
}

} // namespace velmora
