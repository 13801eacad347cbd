// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/CellsFixture.h"

#include <limits>

/// Cells whose members are unknown, out of range or of other types.

namespace velmora {
namespace {

using CellLimitsTest = CellsFixture;

TEST_F(CellLimitsTest, unknownNumbersAreLeftOut) {
    putModem(lteAccess);
    const double notANumber = std::numeric_limits<double>::quiet_NaN();
    setCells({
        {{"cell-type", 5U},
         {"serving", true},
         {"operator-id", ""},
         {"tac", "FFFE"},
         {"ci", "FFFFFFF"},
         {"physical-ci", "FFFF"},
         {"earfcn", unknownNumber},
         {"rsrp", notANumber},
         {"rsrq", 32767.0},
         {"timing-advance", 0xFFFFFFFFU}},
        {{"cell-type", 6U},
         {"serving", true},
         {"tac", "0"},
         {"ci", "FFFFFFFFF"},
         {"physical-ci", "FFFF"},
         {"nrarfcn", 0U},
         {"rsrp", -9999.0},
         {"rsrq", -9999.0},
         {"sinr", 3276.7}},
        {{"cell-type", 2U},
         {"serving", false},
         {"lac", "0"},
         {"arfcn", unknownNumber},
         {"base-station-id", "FF"},
         {"rx-level", 99U}},
        {{"cell-type", 3U},
         {"serving", false},
         {"lac", "FFFF"},
         {"uarfcn", 0U},
         {"psc", unknownNumber},
         {"rscp", -std::numeric_limits<double>::infinity()},
         {"path-loss", 0U}},
    });
    follow();
    listen();
    EXPECT_EQ(cells(), array({serving(kVoxCellMonitorRadioAccessTechnologyLTE, {}),
                              serving(kVoxCellMonitorRadioAccessTechnologyNR, {}),
                              neighbor(kVoxCellMonitorRadioAccessTechnologyGSM, {}),
                              neighbor(kVoxCellMonitorRadioAccessTechnologyUMTS, {})}));
}

TEST_F(CellLimitsTest, membersOfOtherTypesAreLeftOut) {
    putModem(umtsAccess);
    setCells({
        {{"cell-type", 3U},
         {"serving", false},
         {"operator-id", "12"}, // too short
         {"lac", "10005"},      // 17 bits
         {"ci", "10000000"},    // 29 bits
         {"uarfcn", 16384U},    // one more than there are
         {"psc", 512U},         // one more than there are
         {"ecio", 0.6}},
        {{"cell-type", 3U},
         {"serving", false},
         {"operator-id", "00a01"}, // no digits
         {"lac", "0x12"},          // no hexadecimal
         {"ci", "-5"},             //
         {"uarfcn", -1},           // signed, and below 0
         {"psc", "33"},            // text, wanted a number
         {"ecio", -7}},            // whole, wanted a real
        {{"cell-type", 3U},
         {"serving", false},
         {"lac", QString(5000, 'A')}, // a huge text
         {"ci", 11183U},              // a number, wanted text
         {"uarfcn", QVariant::fromValue(std::numeric_limits<qulonglong>::max())},
         {"psc", true},
         {"rscp", "-80"},
         {"ecio", QStringList("-7")}},                        // a list
        {{"cell-type", 3U}, {"serving", "yes"}, {"psc", 1U}}, // serving is no boolean
        {{"cell-type", 3U}, {"psc", 2U}},                     // not said to serve or not
        {{"cell-type", "3"}, {"serving", false}, {"psc", 3U}},
        {{"cell-type", 99U}, {"serving", false}, {"psc", 4U}}, // a type of the future
        {{"cell-type", 0U}, {"serving", false}, {"psc", 4U}},  // an unknown one
        {{"serving", false}, {"psc", 5U}},
        {},
    });
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyUMTS;
    EXPECT_EQ(cells(), array({neighbor(kind, {}), neighbor(kind, {}), neighbor(kind, {})}));
}

TEST_F(CellLimitsTest, anAnswerOfAnotherTypeHasNoCells) {
    putModem(lteAccess);
    follow();
    listen();
    const QVariantList absurd[] = {
        {},
        {QString("cells")},
        {QVariant::fromValue(QStringList{"a", "b"})},
        {QVariantMap{{"cell-type", 5U}}},
        {5U},
    };
    for (const QVariantList& each : absurd) {
        mock.answers["GetCellInfo"] = {each, {}, {}};
        const std::size_t before = mock.count("GetCellInfo");
        ASSERT_TRUE(passes([&] { return mock.count("GetCellInfo") >= before + 2; }));
    }
    EXPECT_EQ(cells(), array({}));
    setCells({{{"cell-type", 5U}, {"serving", true}, {"tac", "7"}}});
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorTAC"}, 7));
}

} // namespace
} // namespace velmora
