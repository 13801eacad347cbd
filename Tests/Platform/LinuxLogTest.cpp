// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/ProgramLog.h"
#include "Platform/Linux/StderrLog.h"
#include "Platform/Linux/SyslogLog.h"

#include <gmock/gmock.h>
#include <sys/socket.h>
#include <syslog.h>

#include <cstdarg>
#include <cstdio>
#include <string>
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

TEST(LinuxSyslogLog, LinesGoToSyslogUnderTheProgramsName) {
    syslogCalls.clear();
    {
        SyslogLog log("velmora");
        log.write(3, "100%s as it is");
        log.write(LOG_DAEMON | 5, std::string_view("cut short", 3));
    }
    EXPECT_THAT(syslogCalls, ElementsAre("open velmora with pid as user", "3 100%s as it is",
                                         std::to_string((3 << 3) | 5) + " cut", "close"));
}

TEST_F(LinuxStderrLog, WhatOthersSayControlsNoTerminal) {
    StderrLog log(_near.get());
    log.write(3, "no port named \x1b]0;title\a\u202Egnp.exe\r\n");
    EXPECT_THAT(writes(), ElementsAre("<3>no port named \\x1B]0;title\\x07\\u{202E}gnp.exe\\r\n"));
}

TEST(LinuxSyslogLog, WhatOthersSayIsOneLine) {
    syslogCalls.clear();
    SyslogLog("velmora").write(3, "no port named a\n<0>forged\x1b[1m\n");
    EXPECT_THAT(syslogCalls,
                ElementsAre("open velmora with pid as user", "3 no port named a <0>forged\\x1B[1m", "close"));
}

TEST(LinuxProgramLog, TheOptionsChooseTheLogAndTheLevel) {
    EXPECT_EQ(logKindNamed("syslog"), LogKind::Syslog);
    EXPECT_EQ(logKindNamed("stderr"), LogKind::Stderr);
    EXPECT_EQ(logKindNamed("Stderr"), std::nullopt);
    EXPECT_EQ(logKindNamed(""), std::nullopt);

    syslogCalls.clear();
    {
        const ProgramLog log(LogKind::Syslog, 4, "velmora-log");
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
