// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Unit.h"

#include <chrono>
#include <optional>
#include <string>

namespace velmora {

/// Figures for people.

/// "-97.25"; "-" for none. At most three decimals, since means have more.
[[nodiscard]] std::string figureText(const std::optional<double>& number);
/// "-97.25 dBm".
[[nodiscard]] std::string figureText(double number, Unit unit);
/// "90.250".
[[nodiscard]] std::string secondsText(std::chrono::nanoseconds duration);
/// "81.3 %"; "-" of nothing.
[[nodiscard]] std::string shareText(std::chrono::nanoseconds part, std::chrono::nanoseconds whole);

} // namespace velmora
