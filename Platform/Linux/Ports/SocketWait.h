// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>

namespace velmora {

/// The moment when `time` has passed from now on; one too long for the clock is a year.
[[nodiscard]] std::chrono::steady_clock::time_point deadlineAfter(std::chrono::nanoseconds time);

/// Blocks until the socket is ready for `events` (as in poll(2)) or has ended; false when the deadline comes
/// first.
[[nodiscard]] bool waitFor(int descriptor, short events, std::chrono::steady_clock::time_point deadline);

} // namespace velmora
