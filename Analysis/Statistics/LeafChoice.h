// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/PathPattern.h"

#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Which leaves an analysis is of: those that a path selects and that have one of the roles. Without paths,
/// or without roles, that choice leaves nothing out.
class LeafChoice {
public:
    /// `name`: as the leaves are called that this path selects first; the path itself for none.
    void addPath(std::string name, const std::string& path) {
        _paths.push_back({std::move(name), PathPattern(path)});
    }
    void addRole(Role role) { _roles.push_back(role); }

    [[nodiscard]] bool isEverything() const { return _paths.empty() && _roles.empty(); }

    struct Leaf {
        std::string name;                    ///< empty for none but its path
        std::vector<PathPattern::Rows> rows; ///< in any of which its observations must be
    };
    /// Absent where the leaf is not chosen.
    [[nodiscard]] std::optional<Leaf> choose(const CatalogueField& leaf) const;

private:
    struct Path {
        std::string name;
        PathPattern pattern;
    };

    std::vector<Path> _paths;
    std::vector<Role> _roles;
};

} // namespace velmora
