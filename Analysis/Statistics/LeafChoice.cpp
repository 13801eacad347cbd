// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/LeafChoice.h"

#include <algorithm>

namespace velmora {

std::optional<LeafChoice::Leaf> LeafChoice::choose(const CatalogueField& leaf) const {
    if (!_roles.empty() && std::find(_roles.begin(), _roles.end(), leaf.role) == _roles.end())
        return std::nullopt;
    Leaf chosen;
    for (const Path& path : _paths)
        if (std::optional<PathPattern::Rows> rows = path.pattern.select(leaf)) {
            if (chosen.rows.empty() && path.name != path.pattern.text())
                chosen.name = path.name;
            chosen.rows.push_back(*std::move(rows));
        }
    if (chosen.rows.empty() && !_paths.empty())
        return std::nullopt;
    return chosen;
}

} // namespace velmora
