// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class Application;

/// Receives an application's start and end. Outlives the application's `run`.
class ApplicationDelegate {
public:
    virtual ~ApplicationDelegate() = default;
    /// The loop is up.
    virtual void applicationDidFinishLaunching(Application& application) = 0;
    /// The loop is about to end: `terminate`, SIGINT or SIGTERM, or the last window was closed. Called once.
    /// The default does nothing.
    virtual void applicationWillTerminate(Application& application);
};

} // namespace velmora
