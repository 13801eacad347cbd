// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/JobProcess.h"

#include "Tools/Decode/Jobs/JobTurn.h"
#include "Tools/Decode/Jobs/TurnMessage.h"
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

struct Ends {
    FileDescriptor own;
    FileDescriptor job;
};

Ends openPipe() {
    int ends[2];
    if (::pipe2(ends, O_CLOEXEC) != 0)
        throw NoRoomForJob(errno, "no pipe for a job");
    return {FileDescriptor(ends[0]), FileDescriptor(ends[1])};
}

Ends openChannel() {
    int ends[2];
    if (::socketpair(AF_UNIX, SOCK_SEQPACKET | SOCK_CLOEXEC, 0, ends) != 0)
        throw NoRoomForJob(errno, "no sockets for a job");
    return {FileDescriptor(ends[0]), FileDescriptor(ends[1])};
}

/// Reads the available bytes. Absent if there are none yet; empty at the end.
std::optional<std::string_view> readPiece(int descriptor, std::vector<char>& buffer) {
    const ssize_t count = ::read(descriptor, buffer.data(), buffer.size());
    if (count < 0 && (errno == EINTR || errno == EAGAIN))
        return std::nullopt;
    return std::string_view(buffer.data(), count > 0 ? static_cast<std::size_t>(count) : 0);
}

int statusOf(bool good, Output::State state) {
    switch (state) {
    case Output::State::Open: break;
    case Output::State::Closed: return good ? JobProcess::closed : JobProcess::badAndClosed;
    case Output::State::Failed: return JobProcess::notWritten;
    }
    return good ? ExitStatus::Done : JobProcess::badButOver;
}

/// All that the new process does, with its end of the pipe.
[[noreturn]] void runJob(std::size_t index, const Job& job, pid_t parent, Output& output,
                         FileDescriptor errors) {
    // A parent that was killed prints nothing any more.
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    if (::getppid() != parent || ::dup2(errors.get(), STDERR_FILENO) < 0)
        ::_exit(ExitStatus::BadInput);
    errors.reset();
    const bool good = job(index, output);
    output.flush();
    ::_exit(statusOf(good, output.state()));
}

} // namespace

JobProcess::JobProcess(std::size_t index, const Job& job, bool isFirst, Output& output, SpoolBudget& budget,
                       const std::function<void()>& inNewProcess) {
    Ends errors = openPipe();
    Ends channel = isFirst ? Ends{} : openChannel();
    if (!isFirst)
        _spool.emplace(budget);
    const pid_t parent = ::getpid();
    _id = ::fork();
    if (_id < 0)
        throw NoRoomForJob(errno, "no process for a job");
    if (_id == 0) {
        errors.own.reset();
        channel.own.reset();
        inNewProcess();
        std::optional<JobTurn> turn;
        if (!isFirst)
            output.setDetour(&turn.emplace(std::move(channel.job), *_spool));
        runJob(index, job, parent, output, std::move(errors.job));
    }
    _errors = std::move(errors.own);
    _channel = std::move(channel.own);
}

void JobProcess::closeCopies() {
    _errors.reset();
    _channel.reset();
    if (_spool)
        _spool->close();
}

JobProcess::~JobProcess() {
    if (_status)
        return;
    ::kill(_id, SIGKILL);
    static_cast<void>(exitStatus());
}

void JobProcess::watch(std::vector<pollfd>& watched, bool isFirst) const {
    if (_channel && isFirst)
        watched.push_back({_channel.get(), POLLIN, 0});
    if (_errors && (isFirst || _heldErrors.size() < maximumHeldErrors))
        watched.push_back({_errors.get(), POLLIN, 0});
}

bool JobProcess::read(int descriptor, const JobOutlets* outlets, std::vector<char>& buffer) {
    if (descriptor == _errors.get())
        readErrors(outlets, buffer);
    else if (descriptor == _channel.get() && outlets)
        return openToProcess(outlets->output);
    return true;
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

bool JobProcess::becomeFirst(const JobOutlets& outlets) {
    const bool isWhole = !_spool || _spool->moveTo(outlets.output);
    outlets.output.flush();
    passErrors(outlets);
    // A process that the message does not reach has ended; the rest of its spool is written once that shows.
    if (_channel && !send(_channel, TurnMessage::IsFirst))
        _channel.reset();
    return isWhole;
}

/// Answers the process that it may write, after all that it has kept.
bool JobProcess::openToProcess(Output& output) {
    if (receive(_channel) != TurnMessage::IsHeld) {
        _channel.reset(); // it has ended
        return true;
    }
    const bool isWhole = finish(output);
    static_cast<void>(send(_channel, TurnMessage::MayWrite));
    _channel.reset();
    return isWhole;
}

bool JobProcess::finish(Output& output) {
    if (!_spool)
        return true;
    const bool isWhole = _spool->moveTo(output);
    _spool->discard();
    _spool.reset();
    output.flush();
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
