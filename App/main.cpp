// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/LinuxAppPlatform.h"
#include "App/SelfTest.h"
#include "App/VelmoraApp.h"
#include "Export/Masking/MaskKey.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/Linux/Files/LargeAllocations.h"
#include "Platform/Linux/Files/LinuxFileSystem.h"
#include "Platform/Linux/Files/PrivateFile.h"
#include "Platform/Linux/ProcessRestart.h"
#include "Platform/Linux/ProgramLog.h"
#include "Platform/Linux/ServiceStarter.h"
#include "Platform/Linux/StandardDescriptors.h"
#include "Platform/Linux/Termination.h"
#include "Platform/PrintableText.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"
#include "Playback/PlayedFile.h"

#include <CLI/CLI.hpp>

#include <chrono>
#include <cstdio>
#include <iostream>
#include <memory>
#include <optional>
#include <sstream>
#include <string>
#include <string_view>

namespace {

using namespace velmora;
using namespace std::chrono_literals;

constexpr int done = 0;
constexpr int badInput = 1;
constexpr int badUsage = 2;
constexpr auto selfTestLimit = 60s;
constexpr int cannotRestart = 1;

struct Options {
    LinuxFileSystem::Options files;
    LogKind log = LogKind::Syslog;
    int logLevel = LogPriority::Error;
    bool isSelfTest = false;
    bool startsService = false;
    bool beginsWithDrive = false;
    std::optional<MaskKey> maskKey;
    std::string recording;
    std::string technology;
};

Result<MaskKey> readMaskKey(const std::string& path) {
    constexpr std::size_t longestFile = 4096;
    const Result<Data> content = readPrivateFile(path, longestFile);
    if (!content)
        return Failure{content.reason()};
    const Bytes bytes = content->bytes();
    Result<MaskKey> key =
        MaskKey::read(std::string_view(reinterpret_cast<const char*>(bytes.data()), bytes.size()));
    return key ? key : Failure{path + ": " + key.reason()};
}

void declare(CLI::App& app, Options& options) {
    app.description("Shows live what the cellular modem reports about the radio network.");
    app.set_version_flag("--version", "velmora " VELMORA_VERSION);
    app.add_option("--sysroot", options.files.sysroot, "Put before the paths that the platform fixes")
        ->envname("VELMORA_SYSROOT")
        ->type_name("DIR");
    app.add_option("--log-directory", options.files.logDirectory,
                   "Where snapshots go (default $XDG_STATE_HOME/velmora)")
        ->envname("VELMORA_LOG_DIRECTORY")
        ->type_name("DIR");
    app.add_option_function<std::string>(
           "--mask-key",
           [&options](const std::string& path) {
               const Result<MaskKey> key = readMaskKey(path);
               if (!key)
                   throw CLI::ValidationError("--mask-key", key.reason());
               options.maskKey = *key;
           },
           "The key of masked identities, which velmora-log mask --new-key makes (default a random one)")
        ->envname("VELMORA_MASK_KEY")
        ->type_name("FILE");
    app.add_option_function<std::string>(
           "--log", [&options](const std::string& name) { options.log = *logKindNamed(name); },
           "Where log lines go: syslog or stderr")
        ->default_str("syslog")
        ->check([](const std::string& name) {
            return logKindNamed(name) ? std::string() : '"' + name + "\", wanted syslog or stderr";
        });
    app.add_option("--log-level", options.logLevel, "The least urgent lines that are written, 0 to 7")
        ->check(CLI::Range(0, 7))
        ->capture_default_str();
    app.add_option("FILE", options.recording, "A recording, a snapshot or a DLF log to show instead");
    app.add_option("--technology", options.technology, "Which of the file's technologies to show")
        ->type_name("NAME")
        ->needs("FILE")
        ->check([](const std::string& name) {
            return isTechnology(name) ? std::string() : '"' + name + "\", wanted one of " + technologyNames();
        });
    app.add_flag("--start-service", options.startsService,
                 "Start the telephony service first where none is running");
    app.add_option_function<std::string>(
           "--view", [&options](const std::string& name) { options.beginsWithDrive = name == "drive"; },
           "What is shown at first: panes, or drive, which wide windows show beside the panes")
        ->type_name("VIEW")
        ->check([](const std::string& name) {
            return name == "panes" || name == "drive" ? std::string()
                                                      : '"' + name + "\", wanted panes or drive";
        });
    app.add_flag("--self-test", options.isSelfTest, "Open every screen on the first data, then exit");
    app.footer("Velmora shows what a telephony service sends. With a synthetic drive as the service:\n"
               "  velmora-telephonyd --source scenario:gsm,seed=1 &\n"
               "  velmora\n"
               "With the installed service, on what the modem reports:\n"
               "  velmora --start-service\n"
               "A recording, which plays, pauses, steps and seeks; it can be dropped on the window, too:\n"
               "  velmora drive.pcapng");
}

/// Absent where the application is to be started anew.
std::optional<int> show(const Options& options, char* program) {
    // Before everything else, so that the last lines are still written.
    const ProgramLog log(options.log, options.logLevel, "velmora");
    FileResources files;
    setResources(&files);
    int count = 1;
    char* arguments[] = {program, nullptr};
    VelmoraApp app(count, arguments,
                   [&options] { return std::make_unique<LinuxAppPlatform>(options.files); });
    if (options.startsService)
        app.setWillConnect([] { return startTelephonyService(); });
    app.setBeginsWithDrive(options.beginsWithDrive);
    if (options.maskKey)
        app.setMaskKey(*options.maskKey);
    if (!options.recording.empty())
        app.setRecording(options.recording, options.technology);
    std::unique_ptr<SelfTest> selfTest;
    if (options.isSelfTest)
        selfTest = std::make_unique<SelfTest>(app, selfTestLimit);
    const int status = app.run();
    return app.startsAnew() ? std::nullopt : std::optional(status);
}

} // namespace

int main(int argc, char** argv) {
    openClosedStandardDescriptors();
    endOnUncaughtExceptions("velmora");
    returnLargeAllocations();
    Options options;
    CLI::App app;
    declare(app, options);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        std::ostringstream words;
        const bool isDone = app.exit(error, std::cout, words) == 0;
        std::fputs(printableLines(words.str()).c_str(), stderr);
        return isDone ? done : badUsage;
    }
    if (!options.recording.empty())
        if (const auto file = PlayedFile::open(options.recording); !file) {
            std::fputs(printableLines("velmora: " + options.recording + ": " + file.reason() + "\n").c_str(),
                       stderr);
            return badInput;
        }
    if (const std::optional<int> status = show(options, argv[0]))
        return *status;
    // The display, the ports and the log are closed.
    const Failure failure = restartProcess(argv);
    const ProgramLog log(options.log, options.logLevel, "velmora");
    logLine(LogPriority::Error, failure.reason);
    return cannotRestart;
}
