// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <chrono>

namespace velmora {

/// The dates that both forms of a property list can represent: the years 0001 to 9999, which is what the XML
/// form has digits for. Holding the binary form to the same keeps every list that was read writable in
/// either.
inline constexpr Date earliestDate = std::chrono::sys_days{std::chrono::year{1} / 1 / 1};
inline constexpr Date latestDate =
    std::chrono::sys_days{std::chrono::year{10000} / 1 / 1} - std::chrono::seconds{1};

/// The epoch of the binary form.
inline constexpr Date binaryDateEpoch = std::chrono::sys_days{std::chrono::year{2001} / 1 / 1};

[[nodiscard]] constexpr bool isPropertyListDate(Date date) {
    return date >= earliestDate && date <= latestDate;
}

} // namespace velmora
