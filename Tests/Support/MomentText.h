// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <string>

namespace velmora {

/// A time in UTC with all its nanoseconds: "2026-01-05T08:00:12.345000000Z". It uses no code of the project,
/// so that it can be compared with what that writes.
[[nodiscard]] std::string momentText(Time time);

} // namespace velmora
