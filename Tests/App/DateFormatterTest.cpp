// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DateFormatter.h"
#include "Tests/Support/FakeClock.h"

#include <gtest/gtest.h>

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;

TEST(DateFormatter, WritesTheStatusLine) {
    FakeClock clock; // 2026-11-16 05:00:00 UTC
    const DateFormatter formatter(clock, "'Updated' yyyy-MM-dd 'at' HH:mm:ss");
    EXPECT_EQ(formatter.stringFromDate(clock.now() + 160s), "Updated 2026-11-16 at 05:02:40");
}

TEST(DateFormatter, WritesLocalTime) {
    FakeClock clock;
    clock.setZone({-6h, false});
    EXPECT_EQ(DateFormatter(clock, "yyyy-MM-dd HH:mm:ss").stringFromDate(clock.now()), "2026-11-15 23:00:00");
}

struct PatternRow {
    const char* name;
    const char* pattern;
    const char* text;
};

class DateFormatterPatternTest : public testing::TestWithParam<PatternRow> {};

TEST_P(DateFormatterPatternTest, IsWritten) {
    const FakeClock clock;
    EXPECT_EQ(DateFormatter(clock, GetParam().pattern).stringFromDate(clock.now()), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(Patterns, DateFormatterPatternTest,
                         testing::Values(PatternRow{"Empty", "", ""},
                                         PatternRow{"FieldsSideBySide", "yyyyMMddHHmmss", "20261116050000"},
                                         PatternRow{"QuotedFields", "'yyyy' yyyy", "yyyy 2026"},
                                         PatternRow{"Apostrophes", "'o''clock' HH ''", "o'clock 05 '"},
                                         PatternRow{"OpenQuote", "dd 'of MM", "16 of MM"},
                                         PatternRow{"UnknownField", "EEE dd", "EEE 16"}),
                         [](const auto& row) { return std::string(row.param.name); });

} // namespace
} // namespace velmora
