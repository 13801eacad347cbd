// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <algorithm>
#include <optional>

namespace velmora {

/// When something may have another value although no input changes.
struct Wakeup {
    std::optional<Time> at;
    bool atNextMessage = false;

    void by(Time time) { at = at ? std::min(*at, time) : time; }
};

} // namespace velmora
