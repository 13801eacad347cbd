// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

const TechnologyTable& technologyTable(std::string_view name) {
    static const TechnologyTable none{};
    for (const TechnologyTable* each :
         {&technologies::ifx, &technologies::ostrelCDMA, &technologies::ostrelGSM, &technologies::ostrelLTE,
          &technologies::ostrelUTRAN2, &technologies::modem})
        if (each->name == name)
            return *each;
    return none;
}

std::optional<RadioTechnology> technologyOf(std::int64_t raw, const TechnologyTable& table) {
    for (const TechnologyNumber& each : table.technologyNumbers)
        if (each.raw == raw)
            return each.technology;
    return std::nullopt;
}

bool isAtOrBelow(std::string_view leaf, std::string_view path) {
    return leaf.starts_with(path) &&
           (leaf.size() == path.size() || path.ends_with('/') || leaf[path.size()] == '/');
}

} // namespace velmora
