// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Paths/PathCheck.h"

#include "LogGenerator/Observations/PathPattern.h"

#include <algorithm>

namespace velmora {

namespace {

std::string inQuotes(const std::vector<std::string>& texts) {
    std::string list;
    for (const std::string& text : texts)
        list += (list.empty() ? "\"" : ", \"") + text + "\"";
    return list;
}

} // namespace

std::optional<std::string> impossiblePath(const NodeSelection& selection,
                                          const std::vector<const Catalogue*>& catalogues) {
    if (catalogues.empty())
        return std::nullopt;
    for (const std::string& path : selection.paths()) {
        const PathPattern pattern(path);
        if (std::any_of(catalogues.begin(), catalogues.end(),
                        [&pattern](const Catalogue* catalogue) { return pattern.isPossible(*catalogue); }))
            continue;
        std::string technologies;
        for (const Catalogue* const catalogue : catalogues)
            technologies += (technologies.empty() ? "" : " or ") + catalogue->technology();
        return "no display of " + technologies + " has \"" + path + "\"; the nearest paths are " +
               inQuotes(nearestPaths(catalogues, path));
    }
    return std::nullopt;
}

} // namespace velmora
