// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace velmora {

/// From `begin_ns` to before `end_ns`.
struct TimeRange {
    std::int64_t begin_ns = 0;
    std::int64_t end_ns = 0;

    [[nodiscard]] std::int64_t length_ns() const { return end_ns - begin_ns; }
    [[nodiscard]] bool contains(std::int64_t time_ns) const {
        return time_ns >= begin_ns && time_ns < end_ns;
    }
    friend bool operator==(const TimeRange&, const TimeRange&) = default;
};

} // namespace velmora
