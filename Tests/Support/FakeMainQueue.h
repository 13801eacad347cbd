// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Tests/Support/FakeClock.h"

#include <chrono>
#include <cstdint>
#include <deque>
#include <memory>
#include <vector>

namespace velmora {

/// A main queue in virtual time. Nothing runs on its own; time passes only in `advance`, and the clock goes
/// with it. Setting the clock manually does not move tasks. A timer may be stopped after the queue is gone.
class FakeMainQueue final : public MainQueue {
public:
    explicit FakeMainQueue(FakeClock& clock) : _clock(clock) {}
    FakeMainQueue(const FakeMainQueue&) = delete;
    FakeMainQueue& operator=(const FakeMainQueue&) = delete;

    void async(Task task) override;
    void after(std::chrono::nanoseconds delay, Task task) override;
    [[nodiscard]] std::unique_ptr<Timer> repeating(std::chrono::nanoseconds interval, Task action) override;

    /// Runs the tasks that `async` queued, in order, including those that they queue. Delayed tasks wait for
    /// `advance`. Throws std::runtime_error when the tasks never come to an end.
    void runPending();

    /// Lets time pass: runs what is pending, then delayed tasks and timer ticks in the order of their time
    /// (those of the same moment in the order in which they were made), each followed by what it queued. The
    /// clock shows each one's time while it runs, and `duration` more than at the start in the end.
    void advance(std::chrono::nanoseconds duration);

    /// Tasks queued with `async` that have not run.
    [[nodiscard]] std::size_t pendingCount() const { return _pending.size(); }
    /// Tasks queued with `after` that have not run.
    [[nodiscard]] std::size_t delayedCount() const { return _delayed.size(); }
    /// Timers that have not been stopped.
    [[nodiscard]] std::size_t timerCount() const;

private:
    struct Delayed {
        std::chrono::nanoseconds due;
        std::uint64_t sequence;
        Task task;
    };
    struct TimerState {
        std::chrono::nanoseconds due;
        std::uint64_t sequence;
        std::chrono::nanoseconds interval;
        Task action;
        bool running = true;
        bool ticking = false;
    };
    class FakeTimer;

    /// Runs the first thing that is due at `until` or before; false when there is none.
    bool runNext(std::chrono::nanoseconds until);
    void tick(const std::shared_ptr<TimerState>& timer);
    void moveTo(std::chrono::nanoseconds moment);

    FakeClock& _clock;
    std::chrono::nanoseconds _elapsed{0};
    std::uint64_t _sequence = 0;
    std::deque<Task> _pending;
    std::vector<Delayed> _delayed;
    std::vector<std::shared_ptr<TimerState>> _timers;
};

} // namespace velmora
