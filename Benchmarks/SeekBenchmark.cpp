// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileResources.h"
#include "Playback/Player.h"

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <ctime>
#include <random>
#include <string>
#include <vector>

#include <sys/resource.h>

// bench-seek FILE: the time to index a file, to seek any of its moments and to make there what a snapshot
// saves, and the memory that this takes. Each line is a name and a number.

namespace velmora {
namespace {

using Clock = std::chrono::steady_clock;

double millisecondsSince(Clock::time_point start) {
    return std::chrono::duration<double, std::milli>(Clock::now() - start).count();
}

void print(const char* name, double number) {
    std::printf("%-28s %12.3f\n", name, number);
}

/// Of this process, which other work on the machine does not lengthen.
double processorTime_ms() {
    return 1000.0 * static_cast<double>(std::clock()) / CLOCKS_PER_SEC;
}

void printTimes(const std::string& name, std::vector<double> times) {
    std::sort(times.begin(), times.end());
    print((name + " median ms").c_str(), times[times.size() / 2]);
    print((name + " greatest ms").c_str(), times.back());
}

double peakMemory_MiB() {
    rusage usage = {};
    ::getrusage(RUSAGE_SELF, &usage);
    return static_cast<double>(usage.ru_maxrss) / 1024;
}

int run(const char* path) {
    FileResources resources;
    setResources(&resources);
    const auto start = Clock::now();
    const auto file = PlayedFile::open(path);
    if (!file)
        return std::fprintf(stderr, "%s: %s\n", path, file.reason().c_str()), 1;
    const auto index = RecordingIndex::make(**file, {}, {});
    if (!index)
        return std::fprintf(stderr, "%s: %s\n", path, index.reason().c_str()), 1;
    const double before = peakMemory_MiB();
    while ((*index)->read(100'000)) {
    }
    print("index ms", millisecondsSince(start));
    print("messages", static_cast<double>((*index)->messages()));
    print("checkpoints", static_cast<double>((*index)->checkpoints().size()));
    print("checkpoints MiB", static_cast<double>((*index)->memory()) / (1 << 20));
    print("grown by MiB", peakMemory_MiB() - before);
    const auto player = Player::make(**file, **index, {});
    if (!player)
        return 1;
    std::mt19937_64 random(1);
    std::uniform_int_distribution<std::uint64_t> any(0, (*index)->messages());
    std::vector<double> seeks;
    std::vector<double> seeksOfProcessor;
    std::vector<double> snapshots;
    constexpr int moments = 300;
    for (int i = 0; i < moments; ++i) {
        const auto begin = Clock::now();
        const double processor = processorTime_ms();
        (*player)->seekToMessage(any(random));
        static_cast<void>((*player)->display());
        seeks.push_back(millisecondsSince(begin));
        seeksOfProcessor.push_back(processorTime_ms() - processor);
        const auto saving = Clock::now();
        static_cast<void>((*player)->saved());
        snapshots.push_back(millisecondsSince(saving));
    }
    printTimes("seek", std::move(seeks));
    printTimes("seek CPU", std::move(seeksOfProcessor));
    printTimes("snapshot", std::move(snapshots));
    return (*player)->failure().empty() ? 0 : 1;
}

} // namespace
} // namespace velmora

int main(int argc, char** argv) {
    if (argc != 2)
        return std::fputs("usage: bench-seek FILE\n", stderr), 2;
    return velmora::run(argv[1]);
}
