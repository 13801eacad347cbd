// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Tools/Text/TextBuffer.h"

#include <chrono>
#include <cstddef>

namespace velmora {

/// Writes times as "2026-11-16T05:00:00.000000000Z" (RFC 3339, UTC, always nine digits of fraction, so that
/// they sort as text). Caches the day's text: the calendar is the expensive part.
class TimeText {
public:
    static constexpr std::size_t length = 30;

    void append(TextBuffer& out, Time moment);

private:
    std::chrono::sys_days _day = std::chrono::sys_days::max();
    char _date[10] = {};
};

} // namespace velmora
