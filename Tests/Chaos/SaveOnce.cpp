// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/ProgramLog.h"
#include "Platform/Linux/Termination.h"
#include "Tests/App/AppFixture.h"

#include <QApplication>

#include <chrono>
#include <cstdio>
#include <filesystem>

/// Stops and starts the count of the library that lets calls fail, where that is preloaded.
extern "C" __attribute__((weak)) void velmoraCountCalls(int isCounting);

namespace velmora {
namespace {

void countCalls(bool isCounting) {
    if (velmoraCountCalls)
        velmoraCountCalls(isCounting ? 1 : 0);
}

/// The application with one display, on fakes but for the files, whose directory outlives it.
class SavingApplication : public AppFixture {
public:
    explicit SavingApplication(std::filesystem::path logs) : _logs(std::move(logs)) {
        std::filesystem::remove(directory / "logs");
        std::filesystem::create_directory_symlink(_logs, directory / "logs");
    }

    /// Presses Save once, with the calls counted, and says what came of it.
    void save() {
        launchAndConnect();
        show(dictionary({{"State", "idle"}, {"Cell", "12"}}));
        app.showSaveView();
        runUntilIdle();
        countCalls(true);
        saveScreen()->savePressed();
        countCalls(false);
        const bool refused = eventuallyShown("File Error");
        platform.queue.runPending();
        runUntilIdle();
        // It goes on: the save screen is gone and the next display is shown.
        show(dictionary({{"State", "connected"}, {"Cell", "12"}}));
        std::printf("%s; %s\n", refused ? "refused" : "saved",
                    rows(*topPane()).size() == 2 && !saveScreen() ? "goes on" : "stands still");
    }

private:
    void TestBody() override {}
    [[nodiscard]] bool eventuallyShown(const std::string& title) {
        const auto limit = std::chrono::steady_clock::now() + std::chrono::milliseconds(300);
        while (!isShown(title) && std::chrono::steady_clock::now() < limit)
            runUntilIdle();
        return isShown(title);
    }

    std::filesystem::path _logs;
};

} // namespace
} // namespace velmora

/// The save screen's work on its own, for a library that lets calls fail: save-once LOG_DIRECTORY.
int main(int count, char** arguments) {
    velmora::endOnUncaughtExceptions("save-once");
    if (count != 2) {
        std::fputs("usage: save-once LOG_DIRECTORY\n", stderr);
        return 2;
    }
    velmora::SavingApplication application(std::filesystem::absolute(arguments[1]));
    const velmora::ProgramLog log(velmora::LogKind::Stderr, velmora::LogPriority::Info, "save-once");
    application.save();
    return 0;
}
