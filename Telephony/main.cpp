// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Clock.h"
#include "Platform/Linux/MachineClock.h"
#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Platform/Linux/Ports/PortDirectory.h"
#include "Platform/Linux/ProgramLog.h"
#include "Platform/Linux/QtMainQueue.h"
#include "Platform/Linux/ServiceManager.h"
#include "Platform/Linux/SignalWatcher.h"
#include "Platform/Linux/StandardDescriptors.h"
#include "Platform/Linux/Termination.h"
#include "Platform/PrintableText.h"
#include "Platform/SystemLog.h"
#include "Telephony/Service/LogServer.h"
#include "Telephony/Sources/SourceFactory.h"
#include "Telephony/Sources/SourceString.h"

#include <CLI/CLI.hpp>

#include <csignal>
#include <cstdio>
#include <filesystem>
#include <iostream>
#include <sstream>
#include <string>

namespace {

constexpr int done = 0;
constexpr int badInput = 1;
constexpr int badUsage = 2;

constexpr const char* program = "velmora-telephonyd";

struct Options {
    std::string source;
    velmora::LogKind log = velmora::LogKind::Stderr;
    int logLevel = velmora::LogPriority::Error;
};

void declare(CLI::App& app, Options& options) {
    app.description("The telephony service of Velmora: streams a source's log messages to its clients.");
    app.set_version_flag("--version", std::string(program) + " " VELMORA_VERSION);
    app.add_option("--source", options.source,
                   "Where the messages come from: " + std::string(velmora::sourceForms))
        ->required()
        ->envname("VELMORA_SOURCE")
        ->type_name("SOURCE");
    app.add_option_function<std::string>(
           "--log", [&options](const std::string& name) { options.log = *velmora::logKindNamed(name); },
           "Where log lines go: syslog or stderr")
        ->default_str("stderr")
        ->check([](const std::string& name) {
            return velmora::logKindNamed(name) ? std::string() : '"' + name + "\", wanted syslog or stderr";
        });
    app.add_option("--log-level", options.logLevel, "The least urgent lines that are written, 0 to 7")
        ->check(CLI::Range(0, 7))
        ->capture_default_str();
    app.footer(velmora::sourceHelp(program));
}

void complain(const std::string& reason) {
    std::fprintf(stderr, "%s: %s\n", program, velmora::printableLine(reason).c_str());
}

int serve(const Options& options, const velmora::SourceChoice& choice) {
    using namespace velmora;
    // Before the main loop, so that the last lines of what it serves are still written.
    const ProgramLog log(options.log, options.logLevel, program);
    MainLoop loop;
    QtMainQueue queue;
    const MachineClock clock;
    LinuxMessagePorts ports;
    const ServiceManager manager;

    const auto directory = PortDirectory::openStandard();
    const auto source = makeSource(
        choice, queue, clock,
        {[] { return SignalWatcher::hasSignal(); }, directory ? directory->path() : std::filesystem::path()});
    if (!source) {
        complain(source.reason());
        return badInput;
    }
    // Before there are sockets that a signal would leave in the file system.
    const SignalWatcher signals([&loop](int number) {
        logFormat(LogPriority::Notice, "stopping on signal %d", number);
        loop.quit(done);
    });
    LogServer server(ports, queue, **source);
    const auto listening = server.listen([&loop] { loop.quit(badInput); });
    if (!listening) {
        complain(listening.reason());
        return badInput;
    }
    const std::string serving = "serving " + loggedSource(options.source, choice);
    logLine(LogPriority::Notice, serving);
    manager.ready(serving);
    const int status = loop.run();
    manager.stopping();
    server.stop();
    return status;
}

} // namespace

int main(int argc, char** argv) {
    velmora::openClosedStandardDescriptors();
    velmora::endOnUncaughtExceptions(program);
    Options options;
    CLI::App app;
    declare(app, options);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        std::ostringstream words;
        const bool isDone = app.exit(error, std::cout, words) == 0;
        std::fputs(velmora::printableLines(words.str()).c_str(), stderr);
        return isDone ? done : badUsage;
    }
    const auto choice = velmora::parseSource(options.source);
    if (!choice) {
        complain(choice.reason());
        return badUsage;
    }
    return serve(options, *choice);
}
