// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Bands/GSMBands.h"
#include "Tests/LogGenerator/Modem/Bands/CarrierTesting.h"

#include <gtest/gtest.h>

namespace velmora::Bands {
namespace {

/// The edges of the ranges of 3GPP TS 45.005, table 2-2.
constexpr CarrierRow carriers[] = {
    {0, "E-GSM 900", 935, 890},        {1, "P-GSM 900", 935.2, 890.2},   {124, "P-GSM 900", 959.8, 914.8},
    {128, "GSM 850", 869.2, 824.2},    {251, "GSM 850", 893.8, 848.8},   {259, "GSM 450", 460.6, 450.6},
    {293, "GSM 450", 467.4, 457.4},    {306, "GSM 480", 489, 479},       {340, "GSM 480", 495.8, 485.8},
    {438, "GSM 750", 747.2, 777.2},    {511, "GSM 750", 761.8, 791.8},   {512, "DCS 1800 PCS 1900", 0, 0},
    {810, "DCS 1800 PCS 1900", 0, 0},  {811, "DCS 1800", 1865, 1770},    {885, "DCS 1800", 1879.8, 1784.8},
    {940, "ER-GSM 900", 918.2, 873.2}, {954, "ER-GSM 900", 921, 876},    {955, "R-GSM 900", 921.2, 876.2},
    {974, "R-GSM 900", 925, 880},      {975, "E-GSM 900", 925.2, 880.2}, {1023, "E-GSM 900", 934.8, 889.8},
};

TEST(GSMBands, KnowTheFirstAndTheLastChannelOfEachBand) {
    expectCarriers(carrierOfARFCN, carriers);
}

TEST(GSMBands, KnowNothingOfOtherNumbers) {
    constexpr std::int64_t others[] = {-1, 125, 127, 252, 258, 294, 305, 341, 437, 886, 939, 1024, 65535};
    expectNoCarriers(carrierOfARFCN, others);
}

TEST(GSMBands, TellTheFrequenciesOfASharedNumberByBand) {
    const Carrier carrier = carrierOfARFCN(661);
    ASSERT_EQ(carrier.bands().size(), 2U);
    // 1710.2 + 0.2 * 149 + 95 and 1850.2 + 0.2 * 149 + 80
    EXPECT_EQ(carrier.bands()[0].downlink_kHz, 1'835'000);
    EXPECT_EQ(carrier.bands()[0].uplink_kHz, 1'740'000);
    EXPECT_EQ(carrier.bands()[1].downlink_kHz, 1'960'000);
    EXPECT_EQ(carrier.bands()[1].uplink_kHz, 1'880'000);
}

} // namespace
} // namespace velmora::Bands
