// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/NMEASentence.h"

#include "Recording/Positions/NMEAValues.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

TEST(NMEASentence, hasItsKindWhateverTheTalker) {
    for (const char* const text :
         {"$GPRMC,123519,A,4807.038,N,01131.000,E,022.4,084.4,230394,003.1,W*6A",
          "$GBRMC,123521,A,4807.038,N,01131.000,E,022.4,084.4,230394,003.1,W,A*1E\r\n",
          " $GPRMC,123520,V,,,,,,,230394,,,N*5b\n"}) {
        const auto sentence = NMEASentence::parse(text);
        ASSERT_TRUE(sentence) << text;
        EXPECT_EQ(sentence->kind(), "RMC");
    }
    const auto own = NMEASentence::parse("$PUBX,00,123520*18");
    ASSERT_TRUE(own);
    EXPECT_EQ(own->kind(), "");
    EXPECT_EQ(own->field(1), "123520");
}

TEST(NMEASentence, hasEmptyFieldsPastItsEnd) {
    const auto sentence = NMEASentence::parse("$GPGGA,123520.00,,,,,0,00,99.99,,,,,,*61");
    ASSERT_TRUE(sentence);
    EXPECT_EQ(sentence->field(0), "123520.00");
    EXPECT_EQ(sentence->field(1), "");
    EXPECT_EQ(sentence->field(5), "0");
    EXPECT_EQ(sentence->field(13), "");
    EXPECT_EQ(sentence->field(64), "");
}

TEST(NMEASentence, isNoneWhereItIsDamaged) {
    for (const char* const text :
         {"", "$", "*", "$*00x", "GPRMC,123520,V,,,,,,,230394,,,N*5B", "$GPRMC,123520,V,,,,,,,230394,,,N*5C",
          "$GPRMC,123520,V,,,,,,,230394,,,N", "$GPRMC,123520,V,,,,,,,230394,,,N*5",
          "$GPRMC,123520,V,,,,,,,230394,,,N*5BB", "$GPRMC,123520,V,,,,,,,230394,,,N*-5", "$GPRMC,\x01*50",
          "!AIVDM,1,1*00"})
        EXPECT_FALSE(NMEASentence::parse(text)) << text;
    // The checksum of 2000 times the same letter is 0.
    EXPECT_FALSE(NMEASentence::parse("$" + std::string(2000, 'A') + "*00"));
    EXPECT_TRUE(NMEASentence::parse("$" + std::string(1000, 'A') + "*00"));
    EXPECT_TRUE(NMEASentence::parse("$" + std::string(64, ',') + "*00"));
    EXPECT_FALSE(NMEASentence::parse("$" + std::string(66, ',') + "*00"));
}

TEST(NMEAValues, areDegreesOfDegreesAndMinutes) {
    EXPECT_DOUBLE_EQ(nmea::latitude("4807.038", "N").value(), 48 + 7.038 / 60);
    EXPECT_DOUBLE_EQ(nmea::latitude("4807.038", "S").value(), -(48 + 7.038 / 60));
    EXPECT_DOUBLE_EQ(nmea::longitude("01131.000", "W").value(), -(11 + 31.0 / 60));
    EXPECT_DOUBLE_EQ(nmea::latitude("9000.0", "N").value(), 90);
    EXPECT_DOUBLE_EQ(nmea::longitude("18000.0", "E").value(), -180);
    for (const char* const text :
         {"", "48", "480", "9000.1", "4860.0", "48 7.0", "-807.0", "4807.0x", "4807.0e1", "48nan"})
        EXPECT_FALSE(nmea::latitude(text, "N")) << text;
    EXPECT_FALSE(nmea::latitude("4807.038", ""));
    EXPECT_FALSE(nmea::latitude("4807.038", "E"));
    EXPECT_FALSE(nmea::longitude("18000.1", "E"));
}

TEST(NMEAValues, areTimesOfDay) {
    EXPECT_EQ(nmea::timeOfDay("000000"), 0ns);
    EXPECT_EQ(nmea::timeOfDay("123519"), 12h + 35min + 19s);
    EXPECT_EQ(nmea::timeOfDay("235959.25"), 24h - 750ms);
    EXPECT_EQ(nmea::timeOfDay("235960"), 24h);
    EXPECT_EQ(nmea::timeOfDay("000000.1234567899"), 123'456'789ns);
    for (const char* const text :
         {"", "12351", "240000", "126000", "123561", "123519x", "12351 ", "123519.x"})
        EXPECT_FALSE(nmea::timeOfDay(text)) << text;
}

TEST(NMEAValues, areDates) {
    using namespace std::chrono;
    EXPECT_EQ(nmea::date("230394"), sys_days(March / 23 / 1994));
    EXPECT_EQ(nmea::date("010100"), sys_days(January / 1 / 2000));
    EXPECT_EQ(nmea::date("221126"), sys_days(November / 22 / 2026));
    EXPECT_EQ(nmea::date("22", "11", "2126"), sys_days(November / 22 / 2126));
    for (const char* const text : {"", "300226", "001126", "221326", "2211266", "22112"})
        EXPECT_FALSE(nmea::date(text)) << text;
    EXPECT_FALSE(nmea::date("22", "11", "1979"));
}

} // namespace
} // namespace velmora
