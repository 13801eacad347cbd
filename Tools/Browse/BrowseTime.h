// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Result.h"

#include <string>

namespace velmora {

/// The time that a user names in a recording that begins at `first`, looking at a message of `now`: as the
/// commands' --from takes it, or a time of that day in UTC, "05:02", "05:02:40.5", or seconds before or after
/// that message, "-90", "+12.5".
[[nodiscard]] Result<Time> browsedTime(const std::string& text, Time first, Time now);

} // namespace velmora
