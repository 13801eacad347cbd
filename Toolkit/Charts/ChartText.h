// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>

namespace velmora {

/// "−97.25": exactly that many decimals, with the minus sign of typography, which screen readers speak.
[[nodiscard]] std::string chartNumber(double value, int decimals);
/// "−97.25 dBm", or "no value".
[[nodiscard]] std::string chartValue(std::optional<double> value, int decimals, const std::string& unit);
/// "12:04:31" of local time, with milliseconds after a dot where asked for.
[[nodiscard]] std::string chartTime(std::int64_t time_ns, bool withMilliseconds);
/// "5 minutes", "90 seconds", "2 hours 5 minutes": rounded to what matters.
[[nodiscard]] std::string chartDuration(std::chrono::nanoseconds duration);

} // namespace velmora
