// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <functional>
#include <memory>
#include <string_view>

namespace velmora {

class ApplicationDelegate;

/// The connection to the display and the event loop of a program with screens. One a process; made on the
/// main thread before anything else of the toolkit (but Font, Color and geometry) and before anything that
/// uses the loop - main queue, timers, ports - and destroyed after all of these. It takes the toolkit's own
/// options (-platform, -style, ...) out of the arguments. Where the user's language is written from right to
/// left, so is the layout.
class Application {
public:
    /// Ends the program with a message when there is no display.
    Application(int& argc, char** argv);
    virtual ~Application();
    Application(const Application&) = delete;
    Application& operator=(const Application&) = delete;

    /// Null before its construction and after its destruction.
    [[nodiscard]] static Application* shared();

    /// The program's name as the user sees it in window lists ("Velmora") and the base name of its desktop
    /// entry and icon ("velmora").
    void setName(std::string_view displayName, std::string_view desktopName);

    /// Runs the loop, notifying the delegate once it is up; SIGINT and SIGTERM end it as `terminate` does.
    /// Returns the status given to `terminate`, 0 when the user closed the last window. Throws
    /// std::logic_error when it is running.
    [[nodiscard]] int run(ApplicationDelegate& delegate);
    /// Ends the loop after notifying the delegate. The first status is used. Called before `run`, it makes
    /// that return without calling the delegate.
    void terminate(int status = 0);

    /// Processes events until `done` returns true, which is checked after every iteration of the loop; false
    /// when `limit` has passed before that. For tests, and for a program that drives its own screens.
    [[nodiscard]] bool runUntil(const std::function<bool()>& done, std::chrono::nanoseconds limit);

private:
    class Impl;
    std::unique_ptr<Impl> _impl;
};

} // namespace velmora
