// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/LogOverride.h"

#include "Platform/Console.h"
#include "Tests/Support/CapturedLog.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;

TEST(DeferredLogTest, WritesDeferredLinesAtTheLogsOwnLevel) {
    CapturedLog log(LogPriority::Error);
    {
        DeferredLog held;
        logLine(LogPriority::Error, "first");
        logLine(LogPriority::Warning, "not wanted");
        logLine(LogPriority::Error, "second");
        EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre());
    }
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("first", "second"));
    logLine(LogPriority::Warning, "still not wanted");
    logLine(LogPriority::Error, "third");
    EXPECT_THAT(log.textsAt(LogPriority::Warning), ElementsAre());
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("first", "second", "third"));
}

TEST(DeferredLogTest, KeepsTheLatestLinesAndCountsTheOthers) {
    CapturedLog log;
    {
        DeferredLog held;
        for (std::size_t i = 0; i < DeferredLog::maximumLines + 3; ++i)
            logLine(LogPriority::Notice, "line " + std::to_string(i));
    }
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("3 earlier lines left out"));
    const auto lines = log.textsAt(LogPriority::Notice);
    ASSERT_EQ(lines.size(), DeferredLog::maximumLines);
    EXPECT_EQ(lines.front(), "line 3");
    EXPECT_EQ(lines.back(), "line 202");
}

TEST(DeferredLogTest, DefersTheConsoleTooAndRepeatsNothing) {
    testing::internal::CaptureStderr();
    std::FILE* earlier = redirectConsole(stderr);
    {
        DeferredLog held;
        printLine("gone");
        std::fputs("between ", stderr);
        held.release();
    }
    redirectConsole(earlier);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "between gone\n");
}

TEST(DeferredLogTest, LeavesTheConsoleWhereItWas) {
    std::FILE* const place = std::tmpfile();
    ASSERT_NE(place, nullptr);
    std::FILE* const earlier = redirectConsole(place);
    testing::internal::CaptureStderr();
    {
        DeferredLog held;
        printLine("a line");
    }
    redirectConsole(earlier);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
    std::rewind(place);
    char text[16] = {};
    EXPECT_EQ(std::fread(text, 1, sizeof text, place), 7U);
    EXPECT_STREQ(text, "a line\n");
    std::fclose(place);
}

TEST(DeferredLogTest, WritesAtOnceAfterItsRelease) {
    CapturedLog log;
    DeferredLog held;
    logLine(LogPriority::Error, "first");
    held.release();
    logLine(LogPriority::Error, "second");
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("first", "second"));
}

TEST(ProgressLineTest, LogLinesTakeItsPlace) {
    CapturedLog log;
    testing::internal::CaptureStderr();
    {
        ProgressLine progress;
        progress.show("1 messages");
        progress.show("2 messages");
        logLine(LogPriority::Error, "a line");
        logLine(LogPriority::Error, "another");
        progress.show("3 messages");
    }
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
              "1 messages\r\x1b[K2 messages\r\x1b[K3 messages\r\x1b[K");
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("a line", "another"));
}

} // namespace
} // namespace velmora
