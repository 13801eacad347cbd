// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/LinuxAppPlatform.h"
#include "App/VelmoraApp.h"
#include "Platform/Console.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/Linux/Files/LargeAllocations.h"
#include "Platform/Linux/ProgramLog.h"
#include "Platform/Linux/Termination.h"

#include <QTimer>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <memory>
#include <string>

namespace velmora {
namespace {

constexpr int probeInterval_ms = 5;

double now_s() {
    return std::chrono::duration<double>(std::chrono::steady_clock::now().time_since_epoch()).count();
}

/// Resident memory; 0 where the system does not report it.
long resident_KiB() {
    std::ifstream status("/proc/self/status");
    for (std::string line; std::getline(status, line);)
        if (line.starts_with("VmRSS:"))
            return std::strtol(line.c_str() + 6, nullptr, 10);
    return 0;
}

/// Looks at the application from its own loop and prints a line for each redraw: "redraw T LATE MEMORY" - T
/// in seconds of the machine's steady clock, LATE by how many milliseconds the loop was late at most since
/// the line before, MEMORY in KiB.
class ScreenProbe {
public:
    explicit ScreenProbe(VelmoraApp& app) : _app(app) {
        _timer.setTimerType(Qt::PreciseTimer);
        _timer.setInterval(probeInterval_ms);
        QObject::connect(&_timer, &QTimer::timeout, [this] { look(); });
        _timer.start();
    }

private:
    void look() {
        const double now = now_s();
        if (_lastLook > 0)
            _latest_ms = std::max(_latest_ms, (now - _lastLook) * 1000 - probeInterval_ms);
        _lastLook = now;
        // It has the second in it, and redraws are two seconds apart.
        if (_app.updateMessage() != _status && _app.updateMessage().starts_with("Updated")) {
            std::printf("redraw %.6f %.1f %ld\n", now, _latest_ms, resident_KiB());
            _latest_ms = 0;
        }
        _status = _app.updateMessage();
        std::fflush(stdout);
    }

    VelmoraApp& _app;
    QTimer _timer;
    double _lastLook = 0;
    double _latest_ms = 0;
    std::string _status;
};

} // namespace
} // namespace velmora

/// The application with an observer: all but its options are the program's own.
int main(int argc, char** argv) {
    using namespace velmora;
    endOnUncaughtExceptions("screen-probe");
    returnLargeAllocations();
    redirectConsole(stderr);
    const ProgramLog log(LogKind::Stderr, LogPriority::Error, "screen-probe");
    FileResources files;
    setResources(&files);
    VelmoraApp app(argc, argv, [] { return std::make_unique<LinuxAppPlatform>(LinuxFileSystem::Options{}); });
    // From inside the loop, when there is a model.
    std::unique_ptr<ScreenProbe> probe;
    app.platform().model().queue.async([&] { probe = std::make_unique<ScreenProbe>(app); });
    const int status = app.run();
    probe.reset();
    return status;
}
