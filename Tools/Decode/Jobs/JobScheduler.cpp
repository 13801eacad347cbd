// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/JobScheduler.h"

#include "Tools/ExitStatus.h"
#include "Tools/Report.h"

#include <utility>

#include <poll.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::size_t pieceSize = std::size_t{256} << 10;

} // namespace

JobScheduler::JobScheduler(std::size_t count, std::size_t atATime, Job job, Output& output)
    : _count(count), _atATime(atATime), _job(std::move(job)), _output(output),
      _errors(STDERR_FILENO, "standard error"), _buffer(pieceSize),
      _budget(SpoolBudget::limitIn(Spool::directory())) {
    output.flush(); // else the new processes would have a copy of it
}

bool JobScheduler::run() {
    const JobOutlets outlets{_output, _errors};
    bool good = true;
    for (std::size_t done = 0; done < _count && _output.isOpen(); ++done) {
        startMore();
        if (_processes.empty()) {
            good = _job(_started++, _output) && good;
            continue;
        }
        JobProcess& first = *_processes.front();
        if (!first.becomeFirst(outlets) || !serveUntilEnd(first)) {
            report("what a job has written cannot be read back");
            return false;
        }
        if (!_output.isOpen())
            break;
        const int status = first.exitStatus();
        if (status == JobProcess::closed)
            break;
        if (status != ExitStatus::Done && status != JobProcess::badButOver)
            return false;
        good = good && status == ExitStatus::Done;
        _processes.pop_front();
    }
    return good;
}

/// Until the job that is first in line has ended, or the output is closed. False where its spool cannot be
/// read back.
bool JobScheduler::serveUntilEnd(JobProcess& first) {
    while (!first.hasEnded() && _output.isOpen()) {
        if (!serve())
            return false;
        startMore();
    }
    return first.finish(_output);
}

void JobScheduler::startMore() {
    // Those that have ended and are not first in line yet do not count.
    std::size_t running = 0;
    for (const auto& process : _processes)
        running += process->hasEnded() ? 0 : 1;
    while (running < _atATime && _started < _count && start())
        ++running;
}

/// Whether there is a process for the next job.
bool JobScheduler::start() {
    const auto closeCopies = [this] {
        for (const auto& process : _processes)
            process->closeCopies();
    };
    try {
        _processes.push_back(
            std::make_unique<JobProcess>(_started, _job, _processes.empty(), _output, _budget, closeCopies));
    } catch (const NoRoomForJob&) {
        return false; // another attempt follows once a process has ended
    }
    ++_started;
    return true;
}

/// Waits until a process has written an error, has stopped for its turn, or has ended, and reads that. False
/// where the first one's spool cannot be read back.
bool JobScheduler::serve() {
    const JobOutlets outlets{_output, _errors};
    std::vector<pollfd> watched;
    for (const auto& process : _processes)
        process->watch(watched, process == _processes.front());
    if (::poll(watched.data(), watched.size(), -1) < 0)
        return true;
    bool isWhole = true;
    for (const pollfd& each : watched)
        if (each.revents != 0)
            for (const auto& process : _processes)
                isWhole =
                    process->read(each.fd, process == _processes.front() ? &outlets : nullptr, _buffer) &&
                    isWhole;
    return isWhole;
}

} // namespace velmora
