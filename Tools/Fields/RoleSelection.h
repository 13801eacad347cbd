// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Role.h"
#include "Platform/Result.h"

#include <string>
#include <string_view>

namespace velmora {

/// Which leaves of the catalogue are wanted, by their role. The default is every leaf, with a role or
/// without.
class RoleSelection {
public:
    RoleSelection() = default;

    /// The role of that name ("serving.level"), or all whose names have it before their dot ("serving").
    /// Fails for any other text, and lists the names.
    [[nodiscard]] static Result<RoleSelection> named(std::string_view name);

    [[nodiscard]] bool isEverything() const { return _name.empty(); }
    [[nodiscard]] bool contains(Role role) const;

private:
    explicit RoleSelection(std::string_view name) : _name(name) {}

    std::string _name; ///< of a role, or the part before the dot; empty for everything
};

} // namespace velmora
