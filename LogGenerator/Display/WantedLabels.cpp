// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Display/WantedLabels.h"

#include <algorithm>
#include <string>

namespace velmora {

namespace {

/// What is left below any row, whichever number the paths give.
PathRests belowRows(const PathRests& list) {
    PathRests rows;
    rows.isWhole = list.isWhole;
    for (const std::string& rest : list.rests) {
        const std::size_t end = rest.find('/', 1);
        if (end == std::string::npos)
            rows.isWhole = true;
        else
            rows.rests.push_back(rest.substr(end));
    }
    return rows;
}

} // namespace

WantedLabels::WantedLabels(const PathRests& place, bool isList) : _rests(isList ? belowRows(place) : place) {}

bool WantedLabels::find(std::string_view label) const {
    auto known = std::find_if(_known.begin(), _known.end(),
                              [label](const Known& each) { return isSame(each.label, label); });
    if (known == _known.end())
        known = _known.insert(known, {label, !_rests.below(label, false).isEmpty()});
    _expected = static_cast<std::size_t>(known - _known.begin()) + 1;
    return known->isWanted;
}

std::span<const std::uint16_t> WantedLabels::add(const Layout& layout) const {
    Table& table = _tables.emplace_back(Table{layout.fields, {}});
    for (std::size_t i = 0; i < layout.fields.size(); ++i)
        if (!_rests.below(layout.fields[i].label, false).isEmpty())
            table.wanted.push_back(static_cast<std::uint16_t>(i));
    return table.wanted;
}

} // namespace velmora
