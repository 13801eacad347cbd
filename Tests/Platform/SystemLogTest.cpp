// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/SystemLog.h"
#include "Tests/Support/CapturedLog.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

using testing::ElementsAre;
using Line = CapturedLog::Line;

TEST(SystemLog, WritesTextUnchanged) {
    CapturedLog log;
    logLine(LogPriority::Error, "100 %s, no format\n");
    logLine(LogPriority::Info, "");
    EXPECT_THAT(log.lines(),
                ElementsAre(Line{LogPriority::Error, "100 %s, no format\n"}, Line{LogPriority::Info, ""}));
}

TEST(SystemLog, FormatsAsPrintfDoes) {
    CapturedLog log;
    logFormat(LogPriority::Error, "Record 0x%04X: %d of %d entries", 0xB0C1, 3, 7);
    const std::string text(5000, 'x');
    logFormat(LogPriority::Warning, "%s", text.c_str());
    EXPECT_THAT(log.lines(), ElementsAre(Line{LogPriority::Error, "Record 0xB0C1: 3 of 7 entries"},
                                         Line{LogPriority::Warning, text}));
}

TEST(SystemLog, LeavesOutWhatIsAboveTheLevel) {
    CapturedLog log(LogPriority::Warning);
    for (int priority = 0; priority <= 7; ++priority)
        logFormat(priority, "%d", priority);
    std::vector<std::string> texts;
    for (const Line& line : log.lines())
        texts.push_back(line.text);
    EXPECT_THAT(texts, ElementsAre("0", "1", "2", "3", "4"));
    EXPECT_TRUE(isLogged(LogPriority::Warning));
    EXPECT_FALSE(isLogged(LogPriority::Notice));
}

TEST(SystemLog, LooksAtThePriorityWithoutTheFacility) {
    CapturedLog log(LogPriority::Error);
    logLine((16 << 3) | LogPriority::Error, "kept");
    logLine((16 << 3) | LogPriority::Debug, "left out");
    EXPECT_THAT(log.lines(), ElementsAre(Line{131, "kept"}));
}

TEST(SystemLog, IsNowhereUntilOneIsSet) {
    CapturedLog log;
    SystemLog* earlier = setSystemLog(nullptr);
    EXPECT_EQ(earlier, &log);
    EXPECT_FALSE(isLogged(LogPriority::Emergency));
    logLine(LogPriority::Emergency, "lost");
    EXPECT_EQ(setSystemLog(&log), nullptr);
    logLine(LogPriority::Emergency, "kept");
    EXPECT_THAT(log.textsAt(LogPriority::Emergency), ElementsAre("kept"));
}

} // namespace
} // namespace velmora
