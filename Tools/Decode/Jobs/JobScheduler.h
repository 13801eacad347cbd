// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/Jobs/JobProcess.h"
#include "Tools/Decode/Jobs/SpoolBudget.h"
#include "Tools/Output.h"

#include <cstddef>
#include <deque>
#include <memory>
#include <vector>

namespace velmora {

/// Does a number of jobs side by side, each in a process of its own, since the decoders are not made for
/// several threads. Output and standard error are as if the jobs had been done one after the other: the one
/// that is first in line writes to the output itself, and what a later one writes is kept until then. A job
/// that ends its process ends those after it, whose output is dropped. Where the system has no descriptors or
/// processes for as many jobs, fewer run at a time; if for none, they are done here. No other thread may run
/// meanwhile.
class JobScheduler {
public:
    /// Jobs 0 to `count`-1, up to `atATime` of them running. `output` must outlive this; what it still holds
    /// is written here.
    JobScheduler(std::size_t count, std::size_t atATime, Job job, Output& output);

    /// Whether all jobs went well.
    [[nodiscard]] bool run();

private:
    void startMore();
    [[nodiscard]] bool start();
    [[nodiscard]] bool serve();
    [[nodiscard]] bool serveUntilEnd(JobProcess& first);

    std::size_t _count;
    std::size_t _atATime;
    Job _job;
    Output& _output;
    Output _errors;
    std::vector<char> _buffer;
    SpoolBudget _budget; ///< of the processes' spools, and therefore before them
    std::size_t _started = 0;
    std::deque<std::unique_ptr<JobProcess>> _processes; ///< in the order of the output
};

} // namespace velmora
