// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveScreen.h"
#include "App/LinuxAppPlatform.h"
#include "App/VelmoraApp.h"
#include "App/VelmoraPaneController.h"
#include "Platform/Console.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/Linux/Files/LinuxFileSystem.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/FakeMessagePorts.h"
#include "Tests/Support/FakePreferences.h"
#include "Tests/Support/FakeTelephonyService.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QTableWidget>
#include <QTimer>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <memory>
#include <string>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

// What the application costs beside the floor of a bare Qt window with a table of as many rows, in the same
// run: start to the first painted window, memory, and a redraw of 400 rows whose values have all changed.
// Each start is a process of its own. Then, with "--flood SECONDS" and velmora-telephonyd sending at a speed
// of its own, the event loop's latency, processor time and memory; "--idle SECONDS" leaves out the latency,
// whose probe wakes the process itself. With "--drive" the drive view stands beside the panes, in a window of
// 1280 by 800 points.
//
//   QT_QPA_PLATFORM=offscreen bench-application [--drive]
//   velmora-telephonyd --source scenario:gsm,seed=1,speed=520 &
//   QT_QPA_PLATFORM=offscreen bench-application --flood 60 [--drive]
//   velmora-telephonyd --source scenario:gsm,seed=1 &
//   QT_QPA_PLATFORM=offscreen bench-application --idle 60 [--drive]

namespace velmora {
namespace {

constexpr int startRows = 40;
constexpr int redrawRows = 400;
constexpr int rounds = 9;

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

/// Notes when the first paint event of the process has been handled.
class FirstPaint : public QObject {
public:
    std::int64_t at_us = 0;

protected:
    bool eventFilter(QObject*, QEvent* event) override {
        if (event->type() == QEvent::Paint && at_us == 0)
            at_us = now_us();
        return false;
    }
};

/// What a child process reports.
struct Figures {
    double start_ms = 0;
    double resident_MiB = 0;
    double redraw_ms = 0;
};

Figures report(const FirstPaint& first, std::int64_t begun_us, double redraw_ms, double resident) {
    return {static_cast<double>(first.at_us - begun_us) / 1000, resident, redraw_ms};
}

/// Redraws that a median is taken of.
constexpr int medianOf = 21;

template <class Redraw>
double medianRedraw_ms(Redraw redraw) {
    std::vector<double> times;
    for (int i = 0; i < medianOf; ++i) {
        const std::int64_t begun = now_us();
        redraw(i);
        QApplication::processEvents();
        times.push_back(static_cast<double>(now_us() - begun) / 1000);
    }
    std::nth_element(times.begin(), times.begin() + medianOf / 2, times.end());
    return times[medianOf / 2];
}

Figures bareWindow(int argc, char** argv, std::int64_t begun_us) {
    QApplication app(argc, argv);
    FirstPaint first;
    app.installEventFilter(&first);
    QTableWidget table(startRows, 2);
    const auto fill = [&table](int round) {
        for (int row = 0; row < table.rowCount(); ++row) {
            table.setItem(row, 0, new QTableWidgetItem(QStringLiteral("Value %1").arg(row)));
            table.setItem(row, 1, new QTableWidgetItem(QStringLiteral("%1 dBm").arg(row + round)));
        }
    };
    fill(0);
    table.resize(390, 844);
    table.show();
    while (first.at_us == 0)
        QApplication::processEvents(QEventLoop::WaitForMoreEvents);
    const double resident = residentMiB();
    table.setRowCount(redrawRows);
    fill(0);
    QApplication::processEvents();
    return report(first, begun_us, medianRedraw_ms(fill), resident);
}

/// The application on ports in memory, which this program plays the service on.
class BenchPlatform final : public AppPlatform {
public:
    ModelPlatform model() override {
        return {ports, queue, telephony, clock, [] { return std::optional(logChannelPortName()); }};
    }
    FileSystem& files() override { return linuxFiles; }
    Preferences& preferences() override { return fakePreferences; }

    FakeClock clock;
    FakeMainQueue queue{clock};
    FakeMessagePorts ports;
    FakeTelephonyService telephony;
    FakePreferences fakePreferences;
    LinuxFileSystem linuxFiles{LinuxFileSystem::Options{}};
};

Data serialized(const Value& value) {
    return Data(*writeBinaryPropertyList(value));
}

Data displayMessage(int rows, int round) {
    const DictionaryRef display = makeDictionary();
    for (int row = 0; row < rows; ++row)
        display->set("Value " + std::to_string(row), std::to_string(row + round) + " dBm");
    return serialized(display);
}

/// Makes the window so wide that the drive view stands beside the panes.
void widen() {
    for (QWidget* const each : QApplication::topLevelWidgets())
        each->resize(1280, 800);
}

double processorTime_ms() {
    rusage usage = {};
    ::getrusage(RUSAGE_SELF, &usage);
    const auto milliseconds = [](const timeval& time) {
        return static_cast<double>(time.tv_sec) * 1000 + static_cast<double>(time.tv_usec) / 1000;
    };
    return milliseconds(usage.ru_utime) + milliseconds(usage.ru_stime);
}

Figures application(int argc, char** argv, std::int64_t begun_us, bool hasDrive) {
    BenchPlatform* platform = nullptr;
    VelmoraApp app(argc, argv, [&platform] {
        auto made = std::make_unique<BenchPlatform>();
        platform = made.get();
        return made;
    });
    FirstPaint first;
    QApplication::instance()->installEventFilter(&first);
    platform->ports.serve("com.velmora.test.channel", [](std::int32_t, const Data&, bool wantsReply) {
        RemotePort::Answer answer;
        if (wantsReply) {
            const DictionaryRef technology = makeDictionary();
            technology->set("GetTechnology", kVoxLogChannelTechnology_IFX);
            answer.reply = serialized(technology);
        }
        return answer;
    });
    app.applicationDidFinishLaunching(app);
    if (hasDrive)
        widen();
    platform->queue.runPending();
    while (!app.model().isConnected()) // which takes a window that is on the screen
        QApplication::processEvents(QEventLoop::WaitForMoreEvents);
    const auto show = [platform](const Data& message) {
        platform->ports.deliver(logChannelPortName(), 0, message);
        platform->queue.advance(std::chrono::seconds(2));
    };
    show(displayMessage(startRows, 0));
    while (first.at_us == 0)
        QApplication::processEvents(QEventLoop::WaitForMoreEvents);
    const double resident = residentMiB();
    show(displayMessage(redrawRows, 0));
    QApplication::processEvents();
    std::vector<Data> messages; // what the service does is not the screen's
    messages.reserve(medianOf);
    for (int i = 0; i < medianOf; ++i)
        messages.push_back(displayMessage(redrawRows, i));
    return report(first, begun_us,
                  medianRedraw_ms([&](int i) { show(messages[static_cast<std::size_t>(i)]); }), resident);
}

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

/// How the application does while messages arrive. `probes`: whether the event loop's latency is measured.
int run(int argc, char** argv, int seconds, bool probes, bool hasDrive) {
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
    if (probes)
        probe.start();
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
    std::printf("the event loop was late by: median %.2f ms, 99 %% %.2f ms, most %.2f ms (%zu probes)\n",
                late_ms[late_ms.size() / 2], late_ms[late_ms.size() * 99 / 100], late_ms.back(),
                late_ms.size());
    return status;
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
        return run(argc, argv, std::atoi(argv[2]), argv[1][2] == 'f', hasDrive);
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
