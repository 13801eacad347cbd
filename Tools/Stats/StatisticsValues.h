// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/GroupStatistics.h"
#include "Analysis/Statistics/NumberFigures.h"
#include "PropertyLists/Value.h"

#include <cstdint>

namespace velmora {

/// Parts of statistics as JSON has them.

/// A whole number as an integer; null for none.
[[nodiscard]] Value numberValue(const std::optional<double>& number);
[[nodiscard]] Value countValue(std::uint64_t count);
/// RFC 3339, UTC, nine digits of fraction.
[[nodiscard]] Value timeValue(Time time);
[[nodiscard]] Value secondsValue(std::chrono::nanoseconds duration);
/// A state's value: a raw number, true or false, a text; null for the others.
[[nodiscard]] Value stateValue(const StateCounts& states, std::size_t value);

/// Sets "samples" and, where there are any, the figures; a histogram where it is wanted.
void setNumbers(Dictionary& object, const ValueCounts& numbers, Unit unit, bool hasHistogram);
/// Sets "seconds", "transitions", "values" and the like. `isInList`: without times.
void setStates(Dictionary& object, const StateCounts& states, bool isInList);
/// Of a role that has worse and better minutes; null where none has enough samples.
[[nodiscard]] Value worstMinuteValue(const RoleStatistics& role);

} // namespace velmora
