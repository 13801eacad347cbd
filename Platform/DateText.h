// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The date description without locale: "2026-11-16 05:00:00 +0000", UTC, sortable as text.
[[nodiscard]] std::string dateDescription(Time moment);

/// The moment that a date description names, whatever its zone; none for any other text, and for years that
/// lie outside of 1678 to 2261.
[[nodiscard]] std::optional<Time> timeOfDateDescription(std::string_view text);

/// Local date and time through the clock's zone: "2026-11-16 at 06:00:00" with the separator " at ".
[[nodiscard]] std::string localDateAndTime(const Clock& clock, Time moment, const char* separator);

} // namespace velmora
