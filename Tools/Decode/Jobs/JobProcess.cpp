// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/JobProcess.h"

#include "Tools/Output.h"

#include <cerrno>
#include <csignal>
#include <string_view>
#include <utility>

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::size_t maximumHeldErrors = std::size_t{1} << 20;

struct Pipe {
    FileDescriptor reading;
    FileDescriptor writing;
};

Pipe openPipe() {
    int ends[2];
    if (::pipe2(ends, O_CLOEXEC) != 0)
        throw NoRoomForJob(errno, "no pipe for a job");
    return {FileDescriptor(ends[0]), FileDescriptor(ends[1])};
}

/// Reads the available bytes. Absent if there are none yet; empty at the end.
std::optional<std::string_view> readPiece(int descriptor, std::vector<char>& buffer) {
    const ssize_t count = ::read(descriptor, buffer.data(), buffer.size());
    if (count < 0 && (errno == EINTR || errno == EAGAIN))
        return std::nullopt;
    return std::string_view(buffer.data(), count > 0 ? static_cast<std::size_t>(count) : 0);
}

/// All that the new process does, with the writing ends of its pipes.
[[noreturn]] void runJob(std::size_t index, const Job& job, pid_t parent, const FileDescriptor& output,
                         FileDescriptor errors) {
    // A parent that was killed prints nothing any more.
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    if (::getppid() != parent || ::dup2(errors.get(), STDERR_FILENO) < 0)
        ::_exit(ExitStatus::BadInput);
    errors.reset();
    bool good = false;
    {
        Output part(output.get(), "to the process that prints");
        good = job(index, part);
    }
    ::_exit(good ? ExitStatus::Done : JobProcess::badButOver);
}

} // namespace

JobProcess::JobProcess(std::size_t index, const Job& job, const std::function<void()>& inNewProcess) {
    Pipe output = openPipe();
    Pipe errors = openPipe();
    const pid_t parent = ::getpid();
    _id = ::fork();
    if (_id < 0)
        throw NoRoomForJob(errno, "no process for a job");
    _output = std::move(output.reading);
    _errors = std::move(errors.reading);
    if (_id == 0) {
        closeCopies();
        inNewProcess();
        runJob(index, job, parent, output.writing, std::move(errors.writing));
    }
}

void JobProcess::closeCopies() {
    _output.reset();
    _errors.reset();
    _spool.closeCopy();
}

JobProcess::~JobProcess() {
    if (_status)
        return;
    ::kill(_id, SIGKILL);
    static_cast<void>(exitStatus());
}

void JobProcess::watch(std::vector<pollfd>& watched, bool isFirst) const {
    if (_output && _heldOutput.empty() && (isFirst || _spool.hasRoom()))
        watched.push_back({_output.get(), POLLIN, 0});
    if (_errors && (isFirst || _heldErrors.size() < maximumHeldErrors))
        watched.push_back({_errors.get(), POLLIN, 0});
}

void JobProcess::read(int descriptor, const JobOutlets* outlets, std::vector<char>& buffer) {
    if (descriptor == _output.get())
        readOutput(outlets, buffer);
    else if (descriptor == _errors.get())
        readErrors(outlets, buffer);
}

void JobProcess::readOutput(const JobOutlets* outlets, std::vector<char>& buffer) {
    const std::optional<std::string_view> piece = readPiece(_output.get(), buffer);
    if (piece && piece->empty())
        _output.reset();
    else if (piece && outlets)
        outlets->output.put(*piece);
    else if (piece && !_spool.append(*piece))
        _heldOutput = *piece; // a full disk only keeps the process from going ahead
}

void JobProcess::readErrors(const JobOutlets* outlets, std::vector<char>& buffer) {
    const std::optional<std::string_view> piece = readPiece(_errors.get(), buffer);
    if (piece && piece->empty())
        _errors.reset();
    else if (piece)
        _heldErrors += *piece;
    if (outlets)
        passErrors(*outlets);
}

bool JobProcess::becomeFirst(const JobOutlets& outlets, std::vector<char>& buffer) {
    const bool isWhole = _spool.moveTo(outlets.output, buffer);
    outlets.output.put(_heldOutput);
    _heldOutput.clear();
    passErrors(outlets);
    return isWhole;
}

void JobProcess::passErrors(const JobOutlets& outlets) {
    outlets.errors.put(_heldErrors);
    outlets.errors.flush();
    _heldErrors.clear();
}

int JobProcess::exitStatus() {
    if (!_status) {
        int status = 0;
        while (::waitpid(_id, &status, 0) < 0 && errno == EINTR) {
        }
        _status = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
    }
    return *_status;
}

} // namespace velmora
