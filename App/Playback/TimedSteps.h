// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>

namespace velmora {

/// How long the steps of one turn of the main queue may take, so that input is not kept waiting.
inline constexpr std::chrono::milliseconds stepTime{8};

/// Calls `step` until it returns true or the time for it is over. Whether it has returned true.
template <class Step>
bool inTime(Step step) {
    const auto end = std::chrono::steady_clock::now() + stepTime;
    while (!step())
        if (std::chrono::steady_clock::now() >= end)
            return false;
    return true;
}

} // namespace velmora
