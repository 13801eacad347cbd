// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The time that a text names, for a recording that begins at `first` and stands at `now`, in the clock's
/// zone: "2026-11-16 05:02:40", "05:02:40.5" or "05:02" on the day of `now`, "+90.5" and "-90" seconds from
/// `now`. Absent for any other text.
[[nodiscard]] std::optional<Time> momentNamed(std::string_view text, Time now, const Clock& clock);

} // namespace velmora
