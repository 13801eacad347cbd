// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/DecodeJobs.h"

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Tools/ExitStatus.h"
#include "Tools/Output.h"
#include "Tools/Report.h"

#include <cerrno>
#include <csignal>
#include <cstdint>
#include <cstdlib>
#include <deque>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::size_t pieceSize = std::size_t{256} << 10;
constexpr std::uint64_t largestSpool = std::uint64_t{256} << 20;

/// How a job's process ends where its input was bad and the next job is to be done all the same. One that a
/// decoder ended has ExitStatus::BadInput.
constexpr int badButOver = 3;
static_assert(badButOver != ExitStatus::Done && badButOver != ExitStatus::BadInput);

/// Output that waits for its turn: a file without a name.
class Spool {
public:
    Spool() {
        const char* const directory = std::getenv("TMPDIR");
        _file = FileDescriptor(
            ::open(directory && *directory ? directory : "/tmp", O_TMPFILE | O_RDWR | O_CLOEXEC, 0600));
    }

    [[nodiscard]] bool hasRoom() const { return _file.get() >= 0 && _size < largestSpool; }

    /// False where not all of it could be kept; then none of it is.
    bool append(std::string_view text) {
        std::string_view rest = text;
        auto at = static_cast<off_t>(_size);
        while (!rest.empty()) {
            const ssize_t count = ::pwrite(_file.get(), rest.data(), rest.size(), at);
            if (count < 0 && errno == EINTR)
                continue;
            if (count <= 0)
                return false;
            rest.remove_prefix(static_cast<std::size_t>(count));
            at += count;
        }
        _size += text.size();
        return true;
    }

    /// Writes all of it to the output. False where it cannot be read back.
    bool moveTo(Output& output, std::vector<char>& buffer) {
        for (std::uint64_t at = 0; at < _size && output.isOpen();) {
            const ssize_t count = ::pread(_file.get(), buffer.data(), buffer.size(), static_cast<off_t>(at));
            if (count < 0 && errno == EINTR)
                continue;
            if (count <= 0)
                return false;
            output.put(std::string_view(buffer.data(), static_cast<std::size_t>(count)));
            at += static_cast<std::uint64_t>(count);
        }
        _file.reset();
        return true;
    }

private:
    FileDescriptor _file;
    std::uint64_t _size = 0;
};

struct Pipe {
    FileDescriptor reading;
    FileDescriptor writing;
};

Pipe openPipe() {
    int ends[2];
    if (::pipe2(ends, O_CLOEXEC) != 0)
        throw std::system_error(errno, std::generic_category(), "no pipe for a job");
    return {FileDescriptor(ends[0]), FileDescriptor(ends[1])};
}

/// Reads what is there. None where there is nothing at the moment; empty at the end.
std::optional<std::string_view> readPiece(int descriptor, std::vector<char>& buffer) {
    const ssize_t count = ::read(descriptor, buffer.data(), buffer.size());
    if (count < 0 && (errno == EINTR || errno == EAGAIN))
        return std::nullopt;
    return std::string_view(buffer.data(), count > 0 ? static_cast<std::size_t>(count) : 0);
}

/// Where a job's output and errors go once it is its turn.
struct Outlets {
    Output& output;
    Output& errors;
};

/// A process that does one job, and the pipes that its output and its errors come from. Killed in the end.
class JobProcess {
public:
    JobProcess(std::size_t index, const DecodeJob& job) {
        Pipe output = openPipe();
        Pipe errors = openPipe();
        const pid_t parent = ::getpid();
        _id = ::fork();
        if (_id < 0)
            throw std::system_error(errno, std::generic_category(), "no process for a job");
        if (_id > 0) {
            _output = std::move(output.reading);
            _errors = std::move(errors.reading);
            return;
        }
        // Nobody waits for what a parent that was killed would have printed.
        ::prctl(PR_SET_PDEATHSIG, SIGKILL);
        if (::getppid() != parent || ::dup2(errors.writing.get(), STDERR_FILENO) < 0)
            ::_exit(ExitStatus::BadInput);
        bool good = false;
        {
            Output part(output.writing.get(), "to the process that prints");
            good = job(index, part);
        }
        ::_exit(good ? ExitStatus::Done : badButOver);
    }
    ~JobProcess() {
        if (_status)
            return;
        ::kill(_id, SIGKILL);
        static_cast<void>(exitStatus());
    }
    JobProcess(const JobProcess&) = delete;
    JobProcess& operator=(const JobProcess&) = delete;

    [[nodiscard]] bool hasEnded() const { return !_output && !_errors; }

    /// Adds what may be read of it: nothing that it would have to keep without room.
    void watch(std::vector<pollfd>& watched, bool isFront) const {
        if (_output && _heldOutput.empty() && (isFront || _spool.hasRoom()))
            watched.push_back({_output.get(), POLLIN, 0});
        if (_errors && (isFront || _heldErrors.size() < mostHeldErrors))
            watched.push_back({_errors.get(), POLLIN, 0});
    }

    /// Takes what the pipe of that descriptor holds, if it is one of its own: on to the outlets where it is
    /// its turn, else for later.
    void read(int descriptor, const Outlets* turn, std::vector<char>& buffer) {
        if (descriptor == _output.get()) {
            const std::optional<std::string_view> piece = readPiece(descriptor, buffer);
            if (piece && piece->empty())
                _output.reset();
            else if (piece && turn)
                turn->output.put(*piece);
            else if (piece && !_spool.append(*piece))
                _heldOutput = *piece; // a full disk only keeps the process from going ahead
        } else if (descriptor == _errors.get()) {
            const std::optional<std::string_view> piece = readPiece(descriptor, buffer);
            if (piece && piece->empty())
                _errors.reset();
            else if (piece)
                _heldErrors += *piece;
            if (turn)
                passErrors(*turn);
        }
    }

    /// It is its turn: what has waited goes first. False where it cannot be read back.
    [[nodiscard]] bool takeTurn(const Outlets& outlets, std::vector<char>& buffer) {
        const bool whole = _spool.moveTo(outlets.output, buffer);
        outlets.output.put(_heldOutput);
        _heldOutput.clear();
        passErrors(outlets);
        return whole;
    }

    /// Waits for the end. 128 and the number for a signal.
    [[nodiscard]] int exitStatus() {
        if (!_status) {
            int status = 0;
            while (::waitpid(_id, &status, 0) < 0 && errno == EINTR) {
            }
            _status = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
        }
        return *_status;
    }

private:
    static constexpr std::size_t mostHeldErrors = std::size_t{1} << 20;

    void passErrors(const Outlets& outlets) {
        outlets.errors.put(_heldErrors);
        outlets.errors.flush();
        _heldErrors.clear();
    }

    pid_t _id = -1;
    FileDescriptor _output;
    FileDescriptor _errors;
    Spool _spool;
    std::string _heldOutput; ///< what the spool had no room for; nothing more is read before it has gone
    std::string _heldErrors;
    std::optional<int> _status;
};

using JobProcesses = std::deque<std::unique_ptr<JobProcess>>; // in the order of the output

/// Waits until a process has written something, or ended, and takes that.
void serve(JobProcesses& processes, const Outlets& outlets, std::vector<char>& buffer) {
    std::vector<pollfd> watched;
    for (const auto& process : processes)
        process->watch(watched, process == processes.front());
    if (::poll(watched.data(), watched.size(), -1) < 0)
        return;
    for (const pollfd& each : watched)
        if (each.revents != 0)
            for (const auto& process : processes)
                process->read(each.fd, process == processes.front() ? &outlets : nullptr, buffer);
}

} // namespace

bool runDecodeJobs(std::size_t count, std::size_t jobs, const DecodeJob& job, Output& output) {
    output.flush(); // what is there already is this process's to write
    Output errors(STDERR_FILENO, "standard error");
    const Outlets outlets{output, errors};
    std::vector<char> buffer(pieceSize);
    JobProcesses processes;
    std::size_t started = 0;
    const auto startMore = [&] {
        // Those that have ended and wait for their turn do not count.
        std::size_t running = 0;
        for (const auto& process : processes)
            running += process->hasEnded() ? 0 : 1;
        for (; running < jobs && started < count; ++running)
            processes.push_back(std::make_unique<JobProcess>(started++, job));
    };
    bool good = true;
    for (std::size_t done = 0; done < count; ++done) {
        startMore();
        JobProcess& front = *processes.front();
        if (!front.takeTurn(outlets, buffer)) {
            report("what a job has written cannot be read back");
            return false;
        }
        while (!front.hasEnded() && output.isOpen()) {
            serve(processes, outlets, buffer);
            startMore();
        }
        if (!output.isOpen())
            break;
        const int status = front.exitStatus();
        if (status != ExitStatus::Done && status != badButOver)
            return false;
        good = good && status == ExitStatus::Done;
        processes.pop_front();
    }
    return good;
}

} // namespace velmora
