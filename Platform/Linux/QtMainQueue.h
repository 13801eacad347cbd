// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"

#include <memory>

namespace velmora {

/// The main queue on the event loop of the thread that makes it (the main thread, which alone uses it). The
/// loop is run by its owner: MainLoop in programs without screens. Tasks that are queued when the queue is
/// destroyed do not run; timers outlive it.
///
/// A task that throws ends the program: no handler exists up to the event loop.
class QtMainQueue final : public MainQueue {
public:
    QtMainQueue();
    ~QtMainQueue() override;

    void async(Task task) override;
    void after(std::chrono::nanoseconds delay, Task task) override;
    [[nodiscard]] std::unique_ptr<Timer> repeating(std::chrono::nanoseconds interval, Task action) override;

private:
    class Context;
    std::unique_ptr<Context> _context;
};

} // namespace velmora
