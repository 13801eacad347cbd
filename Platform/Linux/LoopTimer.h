// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <functional>

namespace velmora {

/// A timer on the event loop, initially stopped. The owner may start, stop or destroy it from its own action.
/// Its action runs at most once per iteration of the loop, so that work split by a zero-delay timer is
/// interleaved with sockets, other timers and the screen. Main thread only.
class LoopTimer {
public:
    explicit LoopTimer(std::function<void()> action);
    ~LoopTimer();
    LoopTimer(const LoopTimer&) = delete;
    LoopTimer& operator=(const LoopTimer&) = delete;

    /// Runs the action once when `delay` has passed, never earlier. Starting it again restarts the delay.
    void startOnce(std::chrono::nanoseconds delay);
    /// Runs the action every `interval` (a millisecond at least). Missed ticks are skipped.
    void startRepeating(std::chrono::nanoseconds interval);
    void stop();
    [[nodiscard]] bool isRunning() const;

private:
    class Impl;
    Impl* _impl;
};

/// The event loop's unit: whole milliseconds, rounded up, within what its timers can hold (24 days).
[[nodiscard]] std::chrono::milliseconds loopMilliseconds(std::chrono::nanoseconds time);

} // namespace velmora
