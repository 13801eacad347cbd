// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/ChannelBand.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(ChannelBandTest, IsThatOfTheStandardsTables) {
    EXPECT_EQ(bandOf(RadioTechnology::LTE, 6300), "band 20 (800 MHz)");
    EXPECT_EQ(bandOf(RadioTechnology::LTE, 1300), "band 3 (1800 MHz)");
    EXPECT_EQ(bandOf(RadioTechnology::UMTS, 10588), "band 1 (2100 MHz)");
    EXPECT_EQ(bandOf(RadioTechnology::GSM, 33), "GSM 900");
    EXPECT_EQ(bandOf(RadioTechnology::GSM, 0), "GSM 900");
    EXPECT_EQ(bandOf(RadioTechnology::GSM, 700), "DCS 1800 or PCS 1900");
    EXPECT_EQ(bandOf(RadioTechnology::TDSCDMA, 10080), "band a (2010 MHz)");
}

TEST(ChannelBandTest, IncludesTheFirstAndTheLastChannelOfABand) {
    EXPECT_EQ(bandOf(RadioTechnology::LTE, 6149), "band 19 (850 MHz)");
    EXPECT_EQ(bandOf(RadioTechnology::LTE, 6150), "band 20 (800 MHz)");
    EXPECT_EQ(bandOf(RadioTechnology::LTE, 6449), "band 20 (800 MHz)");
    EXPECT_EQ(bandOf(RadioTechnology::LTE, 6450), "band 21 (1500 MHz)");
}

TEST(ChannelBandTest, IsEmptyWhereTheNumberNamesNone) {
    EXPECT_EQ(bandOf(RadioTechnology::LTE, 70000), "");
    EXPECT_EQ(bandOf(RadioTechnology::UMTS, -1), "");
    EXPECT_EQ(bandOf(RadioTechnology::NR, 620000), "");
    EXPECT_EQ(bandOf(RadioTechnology::CDMA1x, 283), "");
}

} // namespace
} // namespace velmora
