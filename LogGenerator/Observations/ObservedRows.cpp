// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/ObservedRows.h"

namespace velmora {

ObservedRows::Numbers ObservedRows::addDeep(Numbers outer, std::uint32_t number) {
    if (_usedDeepRows == _deepRows.size())
        _deepRows.emplace_back();
    std::vector<std::uint32_t>& row = _deepRows[_usedDeepRows++];
    row.assign(outer.begin(), outer.end());
    row.push_back(number);
    return row;
}

} // namespace velmora
