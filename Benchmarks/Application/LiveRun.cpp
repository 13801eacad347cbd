// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/Application/LiveRun.h"

#include "App/DriveView/DriveScreen.h"
#include "App/LinuxAppPlatform.h"
#include "App/VelmoraApp.h"
#include "Benchmarks/Application/Figures.h"
#include "Benchmarks/Application/Repaints.h"
#include "Platform/Linux/Files/FileResources.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QTimer>

#include <algorithm>
#include <cstdio>
#include <memory>
#include <vector>

namespace velmora {

namespace {

void printShares(const char* what, const std::vector<double>& ordered_ms) {
    std::printf("%s: median %.2f ms, 99 %% %.2f ms, most %.2f ms (%zu probes)\n", what,
                ordered_ms[ordered_ms.size() / 2], ordered_ms[ordered_ms.size() * 99 / 100],
                ordered_ms.back(), ordered_ms.size());
}

} // namespace

int runLive(int argc, char** argv, int seconds, bool probes, bool hasDrive) {
    FileResources files;
    setResources(&files);
    VelmoraApp app(argc, argv, [] {
        return std::make_unique<LinuxAppPlatform>(LinuxFileSystem::Options{},
                                                  logChannelPortName("com.velmora.bench"));
    });
    std::vector<double> late_ms;
    QElapsedTimer since;
    QTimer probe;
    probe.setTimerType(Qt::PreciseTimer);
    probe.setInterval(10);
    QObject::connect(&probe, &QTimer::timeout, [&] {
        if (since.isValid() && app.model().isConnected())
            late_ms.push_back(static_cast<double>(since.nsecsElapsed()) / 1e6 - 10);
        since.start();
    });
    Repaints repaints;
    if (probes) {
        probe.start();
        qApp->installEventFilter(&repaints);
    }
    // The start is measured by itself: these figures begin when the screens are up and the charts have some
    // samples.
    constexpr int settled_ms = 5000;
    double begun_ms = 0;
    double used_ms = 0;
    constexpr int shown_ms = 1000;
    QTimer::singleShot(shown_ms, [hasDrive] {
        if (hasDrive)
            widen();
    });
    QTimer::singleShot(settled_ms, [&] {
        begun_ms = processorTime_ms();
        late_ms.clear();
        repaints.clear();
    });
    QTimer::singleShot(settled_ms + seconds * 1000, [&] {
        used_ms = processorTime_ms() - begun_ms;
        std::printf("connected: %s; drive view: %s; messages in it: %llu\n",
                    app.model().isConnected() ? "yes" : "no", app.drive().isShown() ? "shown" : "hidden",
                    static_cast<unsigned long long>(app.drive().model().messages()));
        app.terminate();
    });
    const int status = app.run();
    std::printf("share of a core: %.2f %%; resident: %.1f MiB\n", used_ms / (10.0 * seconds), residentMiB());
    if (!probes)
        return status;
    std::sort(late_ms.begin(), late_ms.end());
    if (late_ms.empty()) {
        std::fputs("no telephony service answered\n", stderr);
        return 1;
    }
    printShares("the event loop was late by", late_ms);
    const std::vector<double> waits_ms = repaints.waits_ms();
    std::printf("painted %zu times\n", repaints.count());
    if (!waits_ms.empty())
        printShares("messages waited for the screen", waits_ms);
    return status;
}

} // namespace velmora
