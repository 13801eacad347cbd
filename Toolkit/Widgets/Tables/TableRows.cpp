// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/TableRows.h"

#include <numeric>
#include <utility>

namespace velmora {

TableRows::TableRows(std::vector<std::size_t> counts)
    : _counts(std::move(counts)), _total(std::accumulate(_counts.begin(), _counts.end(), std::size_t{0})) {}

std::size_t TableRows::rows(std::size_t section) const {
    return section < _counts.size() ? _counts[section] : 0;
}

IndexPath TableRows::path(std::optional<std::size_t> row) const {
    if (!row)
        return {};
    std::size_t left = *row;
    for (std::size_t section = 0; section < _counts.size(); ++section) {
        if (left < _counts[section])
            return {section, left};
        left -= _counts[section];
    }
    return {};
}

std::optional<std::size_t> TableRows::row(const IndexPath& path) const {
    if (path.isNull() || path.row() >= rows(path.section()))
        return std::nullopt;
    return std::accumulate(_counts.begin(), _counts.begin() + static_cast<std::ptrdiff_t>(path.section()),
                           path.row());
}

} // namespace velmora
