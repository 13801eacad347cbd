// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/Application/LiveRun.h"
#include "Benchmarks/Application/Starts.h"
#include "Platform/Console.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

// What the application costs beside the floor of a bare Qt window with a table of as many rows, in the same
// run: start to the first painted window, memory, and a redraw of 400 rows whose values have all changed.
// Each start is a process of its own. Then, with "--flood SECONDS" and velmora-telephonyd sending at a speed
// of its own, the event loop's latency, how long messages wait for the screen, processor time and memory;
// "--idle SECONDS" leaves out the first two, whose probe wakes the process itself. With "--drive" the drive
// view stands beside the panes, in a window of 1280 by 800 points.
//
//   QT_QPA_PLATFORM=offscreen bench-application [--drive]
//   velmora-telephonyd --source scenario:gsm,seed=1,speed=520 &
//   QT_QPA_PLATFORM=offscreen bench-application --flood 60 [--drive]
//   velmora-telephonyd --source scenario:gsm,seed=1 &
//   QT_QPA_PLATFORM=offscreen bench-application --idle 60 [--drive]

namespace velmora {
namespace {

constexpr int rounds = 9;

/// Runs one mode in a process of its own.
Figures measure(const char* mode) {
    int ends[2];
    if (::pipe(ends) != 0)
        std::abort();
    const std::string begun = std::to_string(now_us());
    const pid_t child = ::fork();
    if (child == 0) {
        ::dup2(ends[1], STDOUT_FILENO);
        ::execl("/proc/self/exe", "bench-application", mode, begun.c_str(), nullptr);
        ::_exit(127);
    }
    ::close(ends[1]);
    Figures figures;
    if (::read(ends[0], &figures, sizeof figures) != sizeof figures)
        std::abort();
    ::close(ends[0]);
    ::waitpid(child, nullptr, 0);
    return figures;
}

double median(std::vector<double> values) {
    std::nth_element(values.begin(), values.begin() + rounds / 2, values.end());
    return values[rounds / 2];
}

int compare(bool hasDrive) {
    std::vector<double> starts[2];
    std::vector<double> residents[2];
    std::vector<double> redraws[2];
    for (int round = 0; round < rounds; ++round)
        for (int which = 0; which < 2; ++which) {
            const Figures figures = measure(which == 0 ? "--floor"
                                            : hasDrive ? "--velmora-drive"
                                                       : "--velmora");
            starts[which].push_back(figures.start_ms);
            residents[which].push_back(figures.resident_MiB);
            redraws[which].push_back(figures.redraw_ms);
        }
    const auto line = [](const char* what, const std::vector<double>* values) {
        const double floor = median(values[0]);
        const double ours = median(values[1]);
        std::printf("%-34s %9.2f %9.2f %8.2f %9.2f\n", what, floor, ours, ours / floor, ours - floor);
    };
    std::printf("%-34s %9s %9s %8s %9s\n", "median of 9 processes", "floor", "velmora", "ratio", "more");
    line("start to first painted window, ms", starts);
    line("resident with 40 rows, MiB", residents);
    line("redraw of 400 rows, ms", redraws);
    std::printf("share of a core at one such redraw every 2 s: %.3f %%\n", median(redraws[1]) / 2000 * 100);
    return 0;
}

} // namespace
} // namespace velmora

int main(int argc, char** argv) {
    using namespace velmora;
    redirectConsole(stderr);
    const bool hasDrive = argc > 1 && std::strcmp(argv[argc - 1], "--drive") == 0;
    if (hasDrive)
        --argc;
    if (argc == 3 && (std::strcmp(argv[1], "--flood") == 0 || std::strcmp(argv[1], "--idle") == 0))
        return runLive(argc, argv, std::atoi(argv[2]), argv[1][2] == 'f', hasDrive);
    if (argc == 3) {
        const std::int64_t begun = std::strtoll(argv[2], nullptr, 10);
        int count = 1;
        const bool floor = std::strcmp(argv[1], "--floor") == 0;
        const bool drive = std::strcmp(argv[1], "--velmora-drive") == 0;
        const Figures figures =
            floor ? bareWindow(count, argv, begun) : application(count, argv, begun, drive);
        return ::write(STDOUT_FILENO, &figures, sizeof figures) == sizeof figures ? 0 : 1;
    }
    return compare(hasDrive);
}
