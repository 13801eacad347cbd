// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Events/EventWriter.h"
#include "Tools/Events/Programs/ProgramRun.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// Runs a program for each event, at most one at a time for a kind. Main thread only.
class EventPrograms {
public:
    struct Setup {
        std::vector<std::string> arguments; ///< the first is the program
        std::chrono::nanoseconds limit{std::chrono::seconds(10)};
        /// Whether an event waits while its kind's program runs; without, it is counted and has none.
        bool waits = false;
        std::function<bool()> isInterrupted = {}; ///< whether waiting is to end
    };

    /// `names` must outlive it.
    EventPrograms(Setup setup, const EvidenceNames& names) : _setup(std::move(setup)), _names(names) {}

    void run(const Event& event, EventState state);
    /// Notices what has ended, and terminates what has run for too long.
    void check();
    /// Waits for those that run, each of which has its time limit.
    void finish();
    /// Terminates those that run, and waits for that.
    void stop();

    [[nodiscard]] bool isRunning() const;
    /// Whether a program could not be started.
    [[nodiscard]] bool hasFailed() const { return _hasFailed; }

private:
    struct Kind {
        std::unique_ptr<ProgramRun> program; ///< null while none runs
        std::uint64_t skipped = 0;           ///< events that came meanwhile
        bool hasReported = false;            ///< a program that did not end well
    };

    void start(const std::string& name, Kind& kind, const Event& event, EventState state);
    void check(const std::string& name, Kind& kind);
    [[nodiscard]] bool isInterrupted() const { return _setup.isInterrupted && _setup.isInterrupted(); }

    Setup _setup;
    const EvidenceNames& _names;
    std::map<std::string, Kind> _kinds;
    bool _hasFailed = false;
};

} // namespace velmora
