// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClasses.h"
#include "Analysis/Drive/DriveNow.h"
#include "Platform/Clock.h"
#include "Toolkit/Color.h"

#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// What is said where nothing has been reported.
inline constexpr std::string_view notReported = "not reported";

/// How long ago that was: "3 s ago", "2 min ago", "1 h ago"; a moment of the future is 0 s ago.
[[nodiscard]] std::string ageText(Time then, Time now);
/// Whether it is too long ago to be what is now.
[[nodiscard]] bool isOld(Time then, Time now);
/// A number with the minus sign of typography, which screen readers speak: "−97.5".
[[nodiscard]] std::string numberText(std::string_view number);
/// The same of a number, without trailing zeros after at most two decimals.
[[nodiscard]] std::string numberText(double number);
[[nodiscard]] Color colorOf(std::optional<LevelClass> levelClass);
/// "12:04:31" of local time.
[[nodiscard]] std::string clockText(Time time, const Clock& clock);

} // namespace velmora
