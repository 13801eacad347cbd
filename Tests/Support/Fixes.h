// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Fix.h"

#include <chrono>

namespace velmora {

/// A fix of a place and nothing else.
[[nodiscard]] inline Fix fixAt(std::chrono::milliseconds time, double latitude, double longitude = 18) {
    Fix fix;
    fix.time = Time(time);
    fix.latitude = latitude;
    fix.longitude = longitude;
    return fix;
}

} // namespace velmora
