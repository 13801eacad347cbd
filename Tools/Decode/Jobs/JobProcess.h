// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Tools/Decode/Jobs/Spool.h"
#include "Tools/ExitStatus.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <system_error>
#include <vector>

#include <poll.h>
#include <sys/types.h>

namespace velmora {

class Output;

/// Runs one job, which writes to the output; returns whether its input was read without losses. May end the
/// process, as decoders do.
using Job = std::function<bool(std::size_t index, Output& output)>;

/// Where the output and the errors of the job that is first in line go.
struct JobOutlets {
    Output& output;
    Output& errors;
};

/// The system has no process or no pipe for a job. No job throws it: what a job throws ends its process.
class NoRoomForJob final : public std::system_error {
public:
    NoRoomForJob(int error, const char* what) : std::system_error(error, std::generic_category(), what) {}
};

/// A process that does one job. The job that is first in line writes to the output by itself. One that is not
/// writes to a spool until that is full, and waits then. Errors come through a pipe and are kept here, up to
/// 1 MiB, and then in the pipe itself. The destructor kills the process.
class JobProcess {
public:
    /// The exit statuses of a process whose input was bad and which does not keep the next job from being
    /// done, and of those whose output was closed by its reader or could not be written. One that a decoder
    /// ended has ExitStatus::BadInput.
    static constexpr int badButOver = 3;
    static constexpr int closed = 4;
    static constexpr int badAndClosed = 5;
    static constexpr int notWritten = 6;
    static_assert(badButOver != ExitStatus::Done && badButOver != ExitStatus::BadInput);

    /// Starts the process, which is first in line if `isFirst`. `output` is flushed. `inNewProcess` runs
    /// there before the job. Throws NoRoomForJob.
    JobProcess(std::size_t index, const Job& job, bool isFirst, Output& output, SpoolBudget& budget,
               const std::function<void()>& inNewProcess);
    ~JobProcess();
    JobProcess(const JobProcess&) = delete;
    JobProcess& operator=(const JobProcess&) = delete;

    /// Closes the copies of its descriptors in another job's process, which needs room for its own. The
    /// object is of no use there afterwards.
    void closeCopies();

    /// Whether the process has closed its errors, as its end does.
    [[nodiscard]] bool hasEnded() const { return !_errors; }

    /// Adds what may be read from: not errors that would have to be kept without room.
    void watch(std::vector<pollfd>& watched, bool isFirst) const;

    /// Reads from that descriptor, if it is one of this process: to the outlets where the job is first in
    /// line, else (null) for later. False where the spool cannot be read back.
    [[nodiscard]] bool read(int descriptor, const JobOutlets* outlets, std::vector<char>& buffer);

    /// The job is first in line now: writes what was kept. False where the spool cannot be read back.
    [[nodiscard]] bool becomeFirst(const JobOutlets& outlets);

    /// Writes what is left in the spool of a process that has ended. False where it cannot be read back.
    [[nodiscard]] bool finish(Output& output);

    /// Waits for the end. 128 and the number for a signal.
    [[nodiscard]] int exitStatus();

private:
    [[nodiscard]] bool openToProcess(Output& output);
    void readErrors(const JobOutlets* outlets, std::vector<char>& buffer);
    void passErrors(const JobOutlets& outlets);

    pid_t _id = -1;
    FileDescriptor _errors;
    FileDescriptor _channel; ///< to the process's JobTurn; none where the output is the process's
    std::optional<Spool> _spool;
    std::string _heldErrors;
    std::optional<int> _status;
};

} // namespace velmora
