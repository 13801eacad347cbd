// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <optional>

namespace velmora {

/// Limits the rate of a log line that a peer can provoke to one per `interval`.
class LogLimiter {
public:
    explicit LogLimiter(std::chrono::nanoseconds interval) : _interval(interval) {}

    [[nodiscard]] bool passes() {
        const auto now = std::chrono::steady_clock::now();
        if (_last && now - *_last < _interval)
            return false;
        _last = now;
        return true;
    }

private:
    std::chrono::nanoseconds _interval;
    std::optional<std::chrono::steady_clock::time_point> _last;
};

} // namespace velmora
