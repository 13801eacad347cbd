// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/LeafChoice.h"
#include "Analysis/Tracks/Square.h"
#include "Platform/Clock.h"

#include <cstdint>
#include <functional>
#include <optional>

namespace velmora {

/// Of what statistics are made, and how they are divided into groups.
struct StatisticsPlan {
    enum class By : std::uint8_t { Nothing, File, Technology, Cell, Minute, Square };

    By by = By::Nothing;
    LeafChoice leaves;
    /// By squares: the one that the present message came from; none without a position.
    std::function<std::optional<Square>()> square = {};
};

/// Which times count: from `from` on and before `to`.
struct CountedTimes {
    std::optional<Time> from;
    std::optional<Time> to;

    [[nodiscard]] bool contains(Time time) const { return (!from || time >= *from) && (!to || time < *to); }
};

} // namespace velmora
