// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/Application/Figures.h"

#include <QWidget>

#include <chrono>
#include <cstdlib>
#include <fstream>
#include <string>
#include <sys/resource.h>

namespace velmora {

std::int64_t now_us() {
    return std::chrono::duration_cast<std::chrono::microseconds>(
               std::chrono::steady_clock::now().time_since_epoch())
        .count();
}

double residentMiB() {
    std::ifstream status("/proc/self/status");
    for (std::string line; std::getline(status, line);)
        if (line.starts_with("VmRSS:"))
            return std::strtod(line.c_str() + 6, nullptr) / 1024;
    return 0;
}

double processorTime_ms() {
    rusage usage = {};
    ::getrusage(RUSAGE_SELF, &usage);
    const auto milliseconds = [](const timeval& time) {
        return static_cast<double>(time.tv_sec) * 1000 + static_cast<double>(time.tv_usec) / 1000;
    };
    return milliseconds(usage.ru_utime) + milliseconds(usage.ru_stime);
}

void widen() {
    for (QWidget* const each : QApplication::topLevelWidgets())
        each->resize(1280, 800);
}

} // namespace velmora
