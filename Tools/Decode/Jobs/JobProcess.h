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

/// A process that does one job, and the pipes that its output and its errors come from. A job that is not
/// first in line has its output kept, in a spool and then in the pipe itself, and its errors, up to 1 MiB.
/// The destructor kills the process.
class JobProcess {
public:
    /// The exit status of a process whose input was bad and which does not keep the next job from being done.
    /// One that a decoder ended has ExitStatus::BadInput.
    static constexpr int badButOver = 3;
    static_assert(badButOver != ExitStatus::Done && badButOver != ExitStatus::BadInput);

    /// Starts the process. `inNewProcess` runs there before the job. Throws NoRoomForJob.
    JobProcess(std::size_t index, const Job& job, const std::function<void()>& inNewProcess);
    ~JobProcess();
    JobProcess(const JobProcess&) = delete;
    JobProcess& operator=(const JobProcess&) = delete;

    /// Closes the copies of its descriptors in another job's process, which needs room for its own. The
    /// object is of no use there afterwards.
    void closeCopies();

    /// Whether both pipes have been read to their ends.
    [[nodiscard]] bool hasEnded() const { return !_output && !_errors; }

    /// Adds the pipes that may be read from: not those whose data would have to be kept without room.
    void watch(std::vector<pollfd>& watched, bool isFirst) const;

    /// Reads from the pipe of that descriptor, if it is one of this process: to the outlets where the job is
    /// first in line, else (null) for later.
    void read(int descriptor, const JobOutlets* outlets, std::vector<char>& buffer);

    /// The job is first in line now: writes what was kept. False where the spool cannot be read back.
    [[nodiscard]] bool becomeFirst(const JobOutlets& outlets, std::vector<char>& buffer);

    /// Waits for the end. 128 and the number for a signal.
    [[nodiscard]] int exitStatus();

private:
    void readOutput(const JobOutlets* outlets, std::vector<char>& buffer);
    void readErrors(const JobOutlets* outlets, std::vector<char>& buffer);
    void passErrors(const JobOutlets& outlets);

    pid_t _id = -1;
    FileDescriptor _output;
    FileDescriptor _errors;
    Spool _spool;
    std::string _heldOutput; ///< what the spool did not take; nothing more is read until this is written
    std::string _heldErrors;
    std::optional<int> _status;
};

} // namespace velmora
