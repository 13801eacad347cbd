// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/ProgramLog.h"
#include "Platform/Linux/StderrLog.h"
#include "Platform/Linux/SyslogLog.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <syslog.h>

#include <cstdarg>
#include <cstdio>
#include <string>
#include <thread>
#include <vector>

namespace {

/// What the program has said to syslog, whose functions the ones below take the place of.
std::vector<std::string> syslogCalls;

std::string formatted(const char* format, std::va_list arguments) {
    char text[256];
    std::vsnprintf(text, sizeof text, format, arguments);
    return text;
}

} // namespace

// The names are the library's, those of its parameters not.
// NOLINTBEGIN(bugprone-reserved-identifier,readability-inconsistent-declaration-parameter-name)

extern "C" void openlog(const char* identity, int options, int facility) {
    syslogCalls.push_back(std::string("open ") + identity + (options & LOG_PID ? " with pid" : "") +
                          (facility == LOG_USER ? " as user" : ""));
}

extern "C" void closelog() {
    syslogCalls.emplace_back("close");
}

extern "C" void syslog(int priority, const char* format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    syslogCalls.push_back(std::to_string(priority) + " " + formatted(format, arguments));
    va_end(arguments);
}

// What syslog becomes in a fortified build, where the library's header knows it.
// NOLINTNEXTLINE(readability-redundant-declaration)
extern "C" void __syslog_chk(int priority, int, const char* format, ...);
extern "C" void __syslog_chk(int priority, int, const char* format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    syslogCalls.push_back(std::to_string(priority) + " " + formatted(format, arguments));
    va_end(arguments);
}

// NOLINTEND(bugprone-reserved-identifier,readability-inconsistent-declaration-parameter-name)

namespace velmora {

namespace {

using testing::ElementsAre;

/// The two ends of a connection that keeps each write(2) apart.
class LinuxStderrLog : public testing::Test {
protected:
    LinuxStderrLog() {
        int ends[2];
        EXPECT_EQ(::socketpair(AF_UNIX, SOCK_SEQPACKET | SOCK_CLOEXEC, 0, ends), 0);
        _near = FileDescriptor(ends[0]);
        _far = FileDescriptor(ends[1]);
    }

    std::vector<std::string> writes() {
        std::vector<std::string> all;
        char bytes[70000];
        for (;;) {
            const auto count = ::recv(_far.get(), bytes, sizeof bytes, MSG_DONTWAIT);
            if (count <= 0)
                return all;
            all.emplace_back(bytes, static_cast<std::size_t>(count));
        }
    }

    FileDescriptor _near;
    FileDescriptor _far;
};

TEST_F(LinuxStderrLog, EachLineIsOneWriteInTheFormOfServiceManagers) {
    StderrLog log(_near.get());
    log.write(3, "plain");
    log.write(4, "ends itself\n");
    log.write(7, "two\nin one\n");
    log.write(6, "ends twice\n\n");
    log.write(0, "");
    log.write(8 + 5, "with a facility");
    log.write(3, std::string(60'000, 'x'));
    EXPECT_THAT(writes(),
                ElementsAre("<3>plain\n", "<4>ends itself\n", "<7>two in one\n", "<6>ends twice \n", "<0>\n",
                            "<5>with a facility\n", "<3>" + std::string(60'000, 'x') + "\n"));
}

/// A directory with, or without, a log daemon's socket.
class LinuxSyslogLog : public testing::Test {
protected:
    LinuxSyslogLog() { syslogCalls.clear(); }

    void startDaemon(int type = SOCK_DGRAM) {
        _daemon = FileDescriptor(::socket(AF_UNIX, type | SOCK_CLOEXEC, 0));
        sockaddr_un address = {};
        address.sun_family = AF_UNIX;
        _socket.copy(address.sun_path, sizeof address.sun_path - 1);
        EXPECT_EQ(::bind(_daemon.get(), reinterpret_cast<sockaddr*>(&address), sizeof address), 0);
        if (type == SOCK_STREAM) {
            EXPECT_EQ(::listen(_daemon.get(), 1), 0);
        }
    }

    TemporaryDirectory _directory;
    std::string _socket = (_directory / "log").string();
    FileDescriptor _daemon;
};

TEST_F(LinuxSyslogLog, LinesGoToSyslogUnderTheProgramsName) {
    startDaemon();
    {
        SyslogLog log("velmora", _socket);
        log.write(3, "100%s as it is");
        log.write(LOG_DAEMON | 5, std::string_view("cut short", 3));
    }
    EXPECT_THAT(syslogCalls, ElementsAre("open velmora with pid as user", "3 100%s as it is",
                                         std::to_string((3 << 3) | 5) + " cut", "close"));
}

TEST_F(LinuxSyslogLog, AStreamSocketIsADaemonsToo) {
    startDaemon(SOCK_STREAM);
    SyslogLog log("velmora", _socket);
    log.write(3, "line");
    EXPECT_THAT(syslogCalls, testing::Contains("3 line"));
}

TEST_F(LinuxSyslogLog, AMissingDaemonIsTriedOnceASecondAndLinesAreCounted) {
    {
        SyslogLog log("velmora", _socket);
        log.write(3, "first");
        startDaemon();
        for (int i = 0; i < 9999; ++i)
            log.write(3, "it is not tried for these");
        EXPECT_THAT(syslogCalls, ElementsAre("open velmora with pid as user"));
        std::this_thread::sleep_for(SyslogLog::retryInterval);
        log.write(4, "it is there");
        log.write(4, "and stays");
    }
    EXPECT_THAT(syslogCalls, ElementsAre("open velmora with pid as user",
                                         "3 10000 log lines were discarded while there was no " + _socket,
                                         "4 it is there", "4 and stays", "close"));
}

TEST_F(LinuxSyslogLog, ASocketWithoutADaemonIsMissing) {
    startDaemon();
    _daemon.reset();
    SyslogLog log("velmora", _socket);
    log.write(3, "line");
    EXPECT_THAT(syslogCalls, ElementsAre("open velmora with pid as user"));
}

TEST_F(LinuxStderrLog, WhatOthersSayControlsNoTerminal) {
    StderrLog log(_near.get());
    log.write(3, "no port named \x1b]0;title\a\u202Egnp.exe\r\n");
    EXPECT_THAT(writes(), ElementsAre("<3>no port named \\x1B]0;title\\x07\\u{202E}gnp.exe\\r\n"));
}

TEST_F(LinuxSyslogLog, WhatOthersSayIsOneLine) {
    startDaemon();
    SyslogLog("velmora", _socket).write(3, "no port named a\n<0>forged\x1b[1m\n");
    EXPECT_THAT(syslogCalls,
                ElementsAre("open velmora with pid as user", "3 no port named a <0>forged\\x1B[1m", "close"));
}

using LinuxProgramLog = LinuxSyslogLog;

TEST_F(LinuxProgramLog, TheOptionsChooseTheLogAndTheLevel) {
    EXPECT_EQ(logKindNamed("syslog"), LogKind::Syslog);
    EXPECT_EQ(logKindNamed("stderr"), LogKind::Stderr);
    EXPECT_EQ(logKindNamed("Stderr"), std::nullopt);
    EXPECT_EQ(logKindNamed(""), std::nullopt);

    startDaemon();
    {
        const ProgramLog log(LogKind::Syslog, 4, "velmora-log", _socket);
        logLine(3, "error");
        logLine(4, "warning");
        logLine(5, "notice");
    }
    logLine(3, "nobody listens any more");
    EXPECT_THAT(syslogCalls,
                ElementsAre("open velmora-log with pid as user", "3 error", "4 warning", "close"));

    testing::internal::CaptureStderr();
    {
        const ProgramLog log(LogKind::Stderr, 3, "velmora-log");
        logLine(3, "error");
        logLine(4, "warning");
    }
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "<3>error\n");
}

} // namespace

} // namespace velmora
