// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/SocketWait.h"

#include <poll.h>

#include <algorithm>
#include <cerrno>
#include <ctime>

namespace velmora {

using SteadyClock = std::chrono::steady_clock;

SteadyClock::time_point deadlineAfter(std::chrono::nanoseconds time) {
    constexpr std::chrono::nanoseconds longest = std::chrono::hours(24 * 365); // the sum must not overflow
    return SteadyClock::now() + std::clamp(time, std::chrono::nanoseconds::zero(), longest);
}

bool waitFor(int descriptor, short events, SteadyClock::time_point deadline) {
    for (;;) {
        const auto left = std::max(deadline - SteadyClock::now(), SteadyClock::duration::zero());
        const auto seconds = std::chrono::floor<std::chrono::seconds>(left);
        const timespec time = {static_cast<time_t>(seconds.count()),
                               static_cast<long>((left - seconds).count())};
        pollfd poll = {descriptor, events, 0};
        const int ready = ::ppoll(&poll, 1, &time, nullptr);
        if (ready >= 0)
            return ready > 0;
        if (errno != EINTR)
            return false;
    }
}

} // namespace velmora
