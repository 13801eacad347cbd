// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/RoleSelection.h"

#include <algorithm>

namespace velmora {

namespace {

bool isNameOrPrefix(std::string_view wanted, std::string_view name) {
    return name == wanted || (name.starts_with(wanted) && name.substr(wanted.size()).starts_with('.'));
}

} // namespace

Result<RoleSelection> RoleSelection::named(std::string_view name) {
    const std::span<const RoleName> roles = roleNames();
    if (!name.empty() && std::any_of(roles.begin(), roles.end(),
                                     [name](const RoleName& row) { return isNameOrPrefix(name, row.name); }))
        return RoleSelection(name);
    std::string known;
    for (const RoleName& row : roles) {
        known += known.empty() ? "" : ", ";
        known += row.name;
    }
    return Failure{"got " + std::string(name) + ", wanted one of " + known + ", or the part before a dot"};
}

bool RoleSelection::contains(Role role) const {
    return isEverything() || isNameOrPrefix(_name, nameOf(role));
}

} // namespace velmora
