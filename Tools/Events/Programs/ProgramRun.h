// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Result.h"

#include <chrono>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <sys/types.h>

namespace velmora {

/// A program that runs in a process group of its own, with nothing on its standard input, its standard output
/// on our standard error, and a time limit: then the group is terminated, and killed where that does not end
/// it. What it leaves in the background when it ends by itself goes on.
class ProgramRun {
public:
    using Clock = std::chrono::steady_clock;

    /// How long a terminated program has before it is killed.
    static constexpr std::chrono::nanoseconds grace = std::chrono::seconds(1);

    /// Fails where it cannot be started. The arguments, of which the first is the program, found as shells
    /// find it, must not be empty. `environment`: beside our own, whose variables of the same prefix are left
    /// out.
    [[nodiscard]] static Result<std::unique_ptr<ProgramRun>>
    start(const std::vector<std::string>& arguments, const std::vector<std::string>& environment,
          std::chrono::nanoseconds limit);
    /// Kills the group of one that has not ended.
    ~ProgramRun();
    ProgramRun(const ProgramRun&) = delete;
    ProgramRun& operator=(const ProgramRun&) = delete;

    /// Terminates or kills the program where its time is over. Returns whether it has ended.
    bool check(Clock::time_point now);
    /// Waits until it has ended or its next deadline is reached, at most, or a signal arrives.
    void wait(Clock::time_point now) const;
    /// Its time is over.
    void terminate(Clock::time_point now);

    /// Of one that has ended: how, for a message: "ended with status 1", "was ended by signal 9"; empty where
    /// all was well.
    [[nodiscard]] std::string problem() const;
    /// Whether it was terminated for its time limit.
    [[nodiscard]] bool hasTimedOut() const { return _killsAt.has_value(); }

private:
    ProgramRun(pid_t id, FileDescriptor descriptor, Clock::time_point end)
        : _id(id), _descriptor(std::move(descriptor)), _end(end) {}

    [[nodiscard]] bool hasEnded() const;
    void reap();

    pid_t _id;
    FileDescriptor _descriptor; ///< readable once it has ended
    Clock::time_point _end;     ///< of its time
    std::optional<Clock::time_point> _killsAt;
    std::optional<int> _status; ///< as waitpid(2) has it
};

} // namespace velmora
