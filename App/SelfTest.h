// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/VelmoraApp.h"
#include "Platform/MainQueue.h"

#include <chrono>
#include <cstddef>
#include <memory>
#include <vector>

namespace velmora {

/// The application's self-test: waits for the first data, opens every pane that they make and the save
/// screen, as a user would, and ends the application: with status 0, or with 1 and an error line where no
/// data came in time or a screen did not open. Main thread only.
class SelfTest {
public:
    /// Begins once the application's loop is up. `app` must outlive this.
    SelfTest(VelmoraApp& app, std::chrono::nanoseconds timeLimit);

private:
    enum class Stage { Waiting, Panes, SaveScreenOpened, SaveScreenClosed };

    void step();
    void stepThroughPanes();
    void openSaveScreen();
    void end(const char* failure);

    VelmoraApp& _app;
    Time _deadline;
    Stage _stage = Stage::Waiting;
    /// For each pane on the stack, the row to open next.
    std::vector<std::size_t> _nextRows;
    int _panesOpened = 1; ///< the root is open from the start
    std::unique_ptr<Timer> _timer;
};

} // namespace velmora
