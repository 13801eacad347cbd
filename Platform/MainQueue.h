// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <functional>
#include <memory>

namespace velmora {

/// A running repeating timer. Destroying or invalidating it stops it; both are allowed in its own action.
class Timer {
public:
    virtual ~Timer() = default;
    virtual void invalidate() = 0;
};

/// The queue of the main thread: tasks run there one after another, never inside the call that queues them.
class MainQueue {
public:
    using Task = std::function<void()>;

    virtual ~MainQueue() = default;
    /// Runs the task as soon as the main thread is free, after those queued before it.
    virtual void async(Task task) = 0;
    /// Runs the task once the delay has passed.
    virtual void after(std::chrono::nanoseconds delay, Task task) = 0;
    /// Runs the action every `interval` until the timer is stopped. Ticks missed while the thread was busy
    /// are skipped.
    [[nodiscard]] virtual std::unique_ptr<Timer> repeating(std::chrono::nanoseconds interval,
                                                           Task action) = 0;
};

} // namespace velmora
