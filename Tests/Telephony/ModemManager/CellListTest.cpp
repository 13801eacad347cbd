// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/CellsFixture.h"

/// The list of cells as a whole: its order, its length, and what is added to the serving cells.

namespace velmora {
namespace {

using CellListTest = CellsFixture;

constexpr auto lte = kVoxCellMonitorRadioAccessTechnologyLTE;
constexpr auto nr = kVoxCellMonitorRadioAccessTechnologyNR;
constexpr auto umts = kVoxCellMonitorRadioAccessTechnologyUMTS;

/// That many neighbours of rising level, and then a serving cell.
CellList longList(uint neighbors) {
    CellList list;
    for (uint i = 0; i < neighbors; ++i)
        list.push_back({{"cell-type", 5U},
                        {"serving", false},
                        {"operator-id", "00101"},
                        {"tac", "1005"},
                        {"physical-ci", QString::number(i % 504, 16)},
                        {"earfcn", i},
                        {"rsrp", -140.0 + i * 0.01},
                        {"rsrq", -10.0 - i * 0.001}});
    list.push_back({{"cell-type", 5U}, {"serving", true}, {"earfcn", 1300U}, {"tac", "7"}});
    return list;
}

TEST_F(CellListTest, aHundredNeighborsAreAllThere) {
    putModem(lteAccess);
    setCells(longList(100));
    follow();
    listen();
    const Value list = cells();
    ASSERT_EQ(list.asArray()->size(), 101U);
    EXPECT_EQ(at(list, {"0"}), serving(lte, {{"kVoxCellMonitorEARFCN", 1300}, {"kVoxCellMonitorTAC", 7}}));
    EXPECT_EQ(at(list, {"1", "kVoxCellMonitorEARFCN"}), Value(99)) << "the strongest";
    EXPECT_EQ(at(list, {"100", "kVoxCellMonitorEARFCN"}), Value(0)) << "the weakest";
    EXPECT_TRUE(inCells("kVoxModemCellsLeftOut").isNone());
}

TEST_F(CellListTest, ofTooManyTheWeakestAreLeftOut) {
    putModem(lteAccess);
    setCells(longList(1500));
    follow();
    listen();
    const Value list = cells();
    ASSERT_TRUE(list.asArray());
    const std::size_t shown = list.asArray()->size();
    // A neighbour has ten values of at most 9 bytes and their keys, referred to by 2 bytes each, and 3 bytes
    // of the offset table for each: less than 164 bytes, of which 65523 hold 399.
    EXPECT_GE(shown, 399U);
    EXPECT_LT(shown, 1501U);
    EXPECT_EQ(inCells("kVoxModemCellsLeftOut"), Value(1501 - shown));
    EXPECT_EQ(at(list, {"0", "kVoxCellMonitorTAC"}), Value(7)) << "the serving cell came last";
    EXPECT_EQ(at(list, {"1", "kVoxCellMonitorEARFCN"}), Value(1499)) << "the strongest";
}

TEST_F(CellListTest, servingCellsComeFirstAndNeighborsByLevelWhateverTheirTechnology) {
    putModem(lteAccess | nrAccess);
    setCells({
        {{"cell-type", 5U}, {"serving", false}, {"earfcn", 1U}},
        {{"cell-type", 3U}, {"serving", false}, {"psc", 1U}, {"rscp", -90.0}},
        {{"cell-type", 6U}, {"serving", true}, {"nrarfcn", 431000U}},
        {{"cell-type", 5U}, {"serving", false}, {"earfcn", 2U}, {"rsrp", -80.0}},
        {{"cell-type", 5U}, {"serving", true}, {"earfcn", 3U}},
        {{"cell-type", 6U}, {"serving", false}, {"nrarfcn", 4U}, {"rsrp", -85.0}},
    });
    follow();
    listen();
    EXPECT_EQ(cells(), array({
                           serving(lte, {{"kVoxCellMonitorEARFCN", 3}}),
                           serving(nr, {{"kVoxCellMonitorNRARFCN", 431000}}),
                           neighbor(lte, {{"kVoxCellMonitorEARFCN", 2}, {"kVoxCellMonitorRSRP", -80.0}}),
                           neighbor(nr, {{"kVoxCellMonitorNRARFCN", 4}, {"kVoxCellMonitorRSRP", -85.0}}),
                           neighbor(umts, {{"kVoxCellMonitorSCN", 1}, {"kVoxCellMonitorRSCP", -90.0}}),
                           neighbor(lte, {{"kVoxCellMonitorEARFCN", 1}}),
                       }));
}

TEST_F(CellListTest, aServingCellGetsTheLevelsThatItLacks) {
    putModem(lteAccess,
             {{"Rate", 5U},
              {"Lte", QVariantMap{{"rsrp", -95.25}, {"rsrq", -11.0}, {"snr", 13.0}, {"rssi", -62.0}}},
              {"Umts", QVariantMap{{"rscp", -70.0}}}});
    setCells({{{"cell-type", 5U}, {"serving", true}, {"earfcn", 1300U}, {"rsrq", -9.5}},
              {{"cell-type", 5U}, {"serving", false}, {"earfcn", 1301U}}});
    follow();
    listen();
    EXPECT_EQ(cells(), array({serving(lte, {{"kVoxCellMonitorEARFCN", 1300},
                                            {"kVoxCellMonitorRSRQ", -9.5},
                                            {"kVoxCellMonitorRSRP", -95.25},
                                            {"kVoxCellMonitorSINR", 13.0},
                                            {"kVoxCellMonitorRSSI", -62.0}}),
                              neighbor(lte, {{"kVoxCellMonitorEARFCN", 1301}})}));
}

TEST_F(CellListTest, nonStandaloneHasTheCellOfNRToo) {
    putModem(lteAccess | nrAccess,
             {{"Rate", 5U}, {"Nr5g", QVariantMap{{"rsrp", -85.0}, {"rsrq", -10.5}, {"snr", 17.0}}}});
    setCells({{{"cell-type", 5U}, {"serving", true}, {"earfcn", 1300U}}});
    follow();
    listen();
    EXPECT_EQ(cells(), array({serving(lte, {{"kVoxCellMonitorEARFCN", 1300}}),
                              serving(nr, {{"kVoxCellMonitorRSRP", -85.0},
                                           {"kVoxCellMonitorRSRQ", -10.5},
                                           {"kVoxCellMonitorSINR", 17.0}})}));
    EXPECT_EQ(inCells("kVoxModemNeighborReport"), number(ModemCellReport::Unsupported));
    // The modem leaves NR: its cell goes with it.
    mock.change(Mock::modemPath(0), Mock::modem, {{"AccessTechnologies", lteAccess}});
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxCellMonitorCells"},
                        array({serving(lte, {{"kVoxCellMonitorEARFCN", 1300}})})));
}

TEST_F(CellListTest, theLevelsOfAModemThatReportsNoCellsAreAServingCell) {
    putModem(umtsAccess, {{"Rate", 5U}, {"Umts", QVariantMap{{"rscp", -88.6}, {"ecio", -9.0}}}});
    refuse("GetCellInfo", QString::fromUtf8(unsupported.data()), "no cells");
    follow();
    listen();
    EXPECT_EQ(cells(),
              array({serving(umts, {{"kVoxCellMonitorRSCP", -88.6}, {"kVoxCellMonitorECN0", -9.0}})}));
    EXPECT_EQ(inCells("kVoxModemCellReport"), number(ModemCellReport::Unsupported));
    EXPECT_EQ(inCells("kVoxModemReason"), Value(std::string(unsupported) + ": no cells"));
    EXPECT_TRUE(inCells("kVoxModemNeighborReport").isNone());
}

TEST_F(CellListTest, neighborsStayReportedWhileThereAreNone) {
    putModem(lteAccess);
    setCells({});
    follow();
    listen();
    EXPECT_EQ(cells(), array({}));
    EXPECT_EQ(inCells("kVoxModemNeighborReport"), number(ModemCellReport::NotYet));
    setCells({{{"cell-type", 5U}, {"serving", true}, {"earfcn", 1U}},
              {{"cell-type", 5U}, {"serving", false}, {"earfcn", 2U}}});
    EXPECT_TRUE(
        becomes(LiveModemCode::cells, {"kVoxModemNeighborReport"}, number(ModemCellReport::Reported)));
    setCells({{{"cell-type", 5U}, {"serving", true}, {"earfcn", 3U}}});
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorEARFCN"}, 3));
    EXPECT_EQ(inCells("kVoxModemNeighborReport"), number(ModemCellReport::Reported));
}

} // namespace
} // namespace velmora
