// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/RowKeys.h"

#include <cstddef>
#include <string>

namespace velmora {

void RowKeys::set(std::span<Observation> row, std::span<const std::string_view> names, TextArena& texts) {
    const std::size_t depth = row.front().rows.size();
    std::string& key = texts.add();
    for (const std::string_view name : names)
        for (const Observation& each : row)
            if (each.rows.size() == depth && each.leaf->node->name() == name) {
                key += key.empty() ? "" : "/";
                key += _text.of(each);
                break;
            }
    for (Observation& each : row)
        each.rowKey = key;
}

} // namespace velmora
