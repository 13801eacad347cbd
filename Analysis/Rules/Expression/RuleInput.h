// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/ExpressionType.h"
#include "LogGenerator/Fields/Role.h"

#include <cstdint>
#include <string>

namespace velmora {

/// A value that a rule reads.
struct RuleInput {
    enum class Kind : std::uint8_t {
        Role,               ///< of the serving cell, the registration, the radio
        StrongestNeighbour, ///< a neighbour's role, of the strongest one
        EachNeighbour,      ///< the same, of each neighbour in turn
        RadioTechnology,    ///< "LTE": of the serving cell
        RadioMode,          ///< "off", "searching", "idle", "connected"
        Path,               ///< of the display, in one place
        EachRow,            ///< of the display, in each row of a list
    };

    Kind kind = Kind::Role;
    Role role = Role::None; ///< of the first three kinds; `None`: whether the neighbour was detected
    std::string path;       ///< of the last two kinds
    ExpressionType type;

    [[nodiscard]] bool isEach() const { return kind == Kind::EachNeighbour || kind == Kind::EachRow; }
    [[nodiscard]] bool isPath() const { return kind == Kind::Path || kind == Kind::EachRow; }
    [[nodiscard]] bool isNeighbour() const {
        return kind == Kind::StrongestNeighbour || kind == Kind::EachNeighbour;
    }
    friend bool operator==(const RuleInput&, const RuleInput&) = default;
};

} // namespace velmora
