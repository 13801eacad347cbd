// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Analysed/AnalysisClock.h"

#include "Tests/Tools/ToolFixture.h"

namespace velmora {
namespace {

TEST(AnalysisClockTest, ArrivalIgnoresTheModem) {
    MessageTimes times(AnalysisClock::Arrival);
    EXPECT_EQ(times.of(at(5), at(100)), at(5));
    EXPECT_EQ(times.of(at(6), std::nullopt), at(6));
}

TEST(AnalysisClockTest, ModemsClockContinuesWithTheArrivalTimeThatHasPassed) {
    MessageTimes times(AnalysisClock::Modem);
    EXPECT_EQ(times.of(at(5), std::nullopt), at(5)); // no stamp so far
    EXPECT_EQ(times.of(at(10), at(1000)), at(1000));
    EXPECT_EQ(times.of(at(15), std::nullopt), at(1005));
    EXPECT_EQ(times.of(at(25), std::nullopt), at(1015));
    EXPECT_EQ(times.of(at(30), at(1018)), at(1018));
    EXPECT_EQ(times.of(at(31), std::nullopt), at(1019));
    EXPECT_EQ(times.of(at(21), std::nullopt), at(1009)); // the clock of arrival went back
}

TEST(AnalysisClockTest, TimesStayInTheirRange) {
    MessageTimes times(AnalysisClock::Modem);
    EXPECT_EQ(times.of(at(0), Time::max()), Time::max());
    EXPECT_EQ(times.of(at(1), std::nullopt), Time::max());
    MessageTimes early(AnalysisClock::Modem);
    EXPECT_EQ(early.of(Time::min(), at(0)), at(0));
    EXPECT_EQ(early.of(Time::max(), std::nullopt), Time::max());
}

} // namespace
} // namespace velmora
