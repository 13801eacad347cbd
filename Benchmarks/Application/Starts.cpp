// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/Application/Starts.h"

#include "App/VelmoraApp.h"
#include "Platform/Linux/Files/LinuxFileSystem.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/FakeMessagePorts.h"
#include "Tests/Support/FakePreferences.h"
#include "Tests/Support/FakeTelephonyService.h"

#include <QApplication>
#include <QTableWidget>

#include <chrono>
#include <memory>
#include <string>
#include <vector>

namespace velmora {
namespace {

constexpr int startRows = 40;
constexpr int redrawRows = 400;

Figures report(const FirstPaint& first, std::int64_t begun_us, double redraw_ms, double resident) {
    return {static_cast<double>(first.at_us - begun_us) / 1000, resident, redraw_ms};
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

} // namespace

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

} // namespace velmora
