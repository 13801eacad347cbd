// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/FixAssembler.h"

#include "Tests/Support/NMEA.h"

#include <chrono>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

struct Line {
    std::chrono::milliseconds time;
    std::string content;
};

std::vector<Fix> fixesOf(const std::vector<Line>& lines) {
    FixAssembler assembler;
    std::vector<Fix> fixes;
    for (const Line& line : lines)
        if (const auto fix = assembler.add({Time(line.time), nmea0183(line.content)}))
            fixes.push_back(*fix);
    if (const auto last = assembler.finish())
        fixes.push_back(*last);
    return fixes;
}

constexpr const char* gga = "GPGGA,123519,4807.038,N,01131.000,E,1,08,0.9,545.4,M,46.9,M,,";
constexpr const char* rmc = "GPRMC,123519,A,4807.038,N,01131.000,E,022.4,084.4,230394,003.1,W";

TEST(FixAssembler, makesOneFixOfTheSentencesOfATime) {
    const std::vector<Fix> fixes = fixesOf({{5000ms, "GNGSA,A,3,04,05,,09,12,,,24,,,,,2.5,1.3,2.1"},
                                            {5010ms, rmc},
                                            {5020ms, gga},
                                            {5030ms, "GNGST,123519,1.5,,,,3.0,4.0,5.0"},
                                            {6010ms, "GPRMC,123520,A,4807.050,N,01131.000,E,,,230394,,"}});
    ASSERT_EQ(fixes.size(), 2U);
    EXPECT_EQ(fixes[0].time, Time(5010ms));
    EXPECT_DOUBLE_EQ(fixes[0].latitude, 48 + 7.038 / 60);
    EXPECT_DOUBLE_EQ(fixes[0].longitude, 11 + 31.0 / 60);
    EXPECT_DOUBLE_EQ(fixes[0].altitude_m.value(), 545.4);
    EXPECT_NEAR(fixes[0].speed_mps.value(), 11.5236, 0.0001); // 22.4 knots
    EXPECT_DOUBLE_EQ(fixes[0].course_degrees.value(), 84.4);
    EXPECT_DOUBLE_EQ(fixes[0].hdop.value(), 0.9);
    EXPECT_DOUBLE_EQ(fixes[0].deviation_m.value(), 5); // 3 m of latitude, 4 m of longitude
    EXPECT_EQ(fixes[1].time, Time(6010ms));
    EXPECT_FALSE(fixes[1].altitude_m || fixes[1].speed_mps || fixes[1].course_degrees || fixes[1].hdop ||
                 fixes[1].deviation_m);
}

TEST(FixAssembler, readsTheOtherSentencesWithAPosition) {
    const std::vector<Fix> fixes =
        fixesOf({{0ms, "GNGNS,123520.50,4807.050,N,01131.010,E,AN,08,0.7,546.0,47.0,,"},
                 {10ms, "GPVTG,054.7,T,034.4,M,005.5,N,010.2,K,A"},
                 {500ms, "GLGLL,4807.038,S,01131.000,W,123521,A,A"},
                 {520ms, "GPVTG,360.0,T,,,,,036.0,K"}});
    ASSERT_EQ(fixes.size(), 2U);
    EXPECT_DOUBLE_EQ(fixes[0].altitude_m.value(), 546);
    EXPECT_NEAR(fixes[0].speed_mps.value(), 2.8294, 0.0001); // 5.5 knots
    EXPECT_DOUBLE_EQ(fixes[0].course_degrees.value(), 54.7);
    EXPECT_DOUBLE_EQ(fixes[1].latitude, -(48 + 7.038 / 60));
    EXPECT_DOUBLE_EQ(fixes[1].longitude, -(11 + 31.0 / 60));
    EXPECT_DOUBLE_EQ(fixes[1].speed_mps.value(), 10);
    EXPECT_DOUBLE_EQ(fixes[1].course_degrees.value(), 0);
}

TEST(FixAssembler, hasNoFixWhereTheReceiverHasNone) {
    const std::vector<std::string> without = {
        "GPGGA,123519,4807.038,N,01131.000,E,0,00,99.9,,M,,M,,", // quality 0, the last position repeated
        "GPGGA,123519,0000.000,N,00000.000,E,,,,,,,,,",
        "GPGGA,123519,,,,,1,08,0.9,545.4,M,46.9,M,,",
        "GPRMC,123519,V,4807.038,N,01131.000,E,,,230394,,",
        "GPRMC,123519,A,4807.038,N,01131.000,E,,,230394,,,N",
        "GPGLL,4807.038,N,01131.000,E,123519,V,N",
        "GNGNS,123519,4807.038,N,01131.000,E,NNN,00,99.99,,,,",
        "GPRMC,123519,A,9107.038,N,01131.000,E,,,230394,,",
        "GPGST,123519,1.5,,,,3.0,4.0,5.0"};
    for (const std::string& content : without)
        EXPECT_TRUE(fixesOf({{0ms, content}}).empty()) << content;
    // One of the sentences is enough.
    EXPECT_TRUE(fixesOf({{0ms, gga}, {10ms, "GPRMC,123519,V,,,,,,,230394,,,N"}}).empty());
}

TEST(FixAssembler, returnsAFixWhenItIsComplete) {
    FixAssembler assembler;
    EXPECT_FALSE(assembler.pending());
    EXPECT_FALSE(assembler.add({Time(100ms), nmea0183(gga)}));
    EXPECT_EQ(assembler.pending(), Time(100ms));
    EXPECT_FALSE(assembler.completeAt(Time(1000ms)));
    EXPECT_TRUE(assembler.completeAt(Time(1001ms)));
    EXPECT_FALSE(assembler.pending());
    // A sentence without a time belongs to a fix of its own by then.
    EXPECT_FALSE(assembler.add({Time(2000ms), nmea0183(gga)}));
    EXPECT_TRUE(assembler.add({Time(2901ms), nmea0183("GPVTG,054.7,T,034.4,M,005.5,N,010.2,K,A")}));
    EXPECT_FALSE(assembler.finish());
}

TEST(FixAssembler, goesOnAfterTheClockWasSetBack) {
    FixAssembler assembler;
    EXPECT_FALSE(assembler.add({Time(100s), nmea0183(gga)}));
    EXPECT_TRUE(assembler.completeAt(Time(50s)));
}

TEST(FixAssembler, countsDamagedSentences) {
    FixAssembler assembler;
    EXPECT_FALSE(assembler.add({Time(0ms), nmea0183(gga)}));
    EXPECT_FALSE(
        assembler.add({Time(1s), "$GPRMC,123519,A,4807.038,N,01131.000,E,022.4,084.4,230394,003.1,W*6B"}));
    EXPECT_EQ(assembler.sentences(), 2U);
    EXPECT_EQ(assembler.damaged(), 1U);
}

} // namespace
} // namespace velmora
