// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>
#include <cstddef>
#include <vector>

namespace velmora {

/// The spans of time that recordings cover. Recordings of different days, and long silences, do not push what
/// was recorded together on a time axis.
class TimeSpans {
public:
    static constexpr std::chrono::minutes longestSilence{10};
    static constexpr std::size_t most = 64;

    struct Span {
        Time begin;
        Time end;
    };

    void add(Time time);
    /// Sorted, and apart by more than that silence where there are not too many.
    [[nodiscard]] std::vector<Span> spans() const;

private:
    std::vector<Span> _spans; ///< in the order of the messages
};

/// An axis over spans of time, from 0 to 1.
class TimeAxis {
public:
    explicit TimeAxis(std::vector<TimeSpans::Span> spans);

    [[nodiscard]] const std::vector<TimeSpans::Span>& spans() const { return _spans; }
    /// The place of a time; that of the nearest span's begin or end where no span contains it.
    [[nodiscard]] double place(Time time) const;

private:
    std::vector<TimeSpans::Span> _spans;
    double _seconds = 0; ///< of all spans
};

} // namespace velmora
