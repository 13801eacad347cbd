// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <functional>
#include <memory>

namespace velmora {

/// The event loop of a program without screens, on which main-queue tasks, timers, ports and signals are
/// served. One a process; made on the main thread before anything that uses the loop and destroyed after it.
class MainLoop {
public:
    MainLoop();
    ~MainLoop();
    MainLoop(const MainLoop&) = delete;
    MainLoop& operator=(const MainLoop&) = delete;

    /// Processes events until `quit`; returns its status.
    [[nodiscard]] int run();
    /// Ends `run` with that status once the current event is done. Called before `run`, it makes that return
    /// at once. The first status is used.
    void quit(int status);

    /// Processes events until `done` returns true, which is checked after every iteration of the loop; false
    /// when `limit` has passed before that.
    [[nodiscard]] bool runUntil(const std::function<bool()>& done, std::chrono::nanoseconds limit);

private:
    class Impl;
    std::unique_ptr<Impl> _impl;
};

} // namespace velmora
