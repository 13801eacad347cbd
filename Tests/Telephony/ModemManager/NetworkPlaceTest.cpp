// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/CellsFixture.h"

/// The place in the network that replaces a missing serving cell.

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// A place in the network and what it comes to on an access technology; none where it comes to nothing.
struct Place {
    const char* name;
    uint access;
    const char* location;
    Value cell;
};

class PlaceTest : public CellsFixture, public ::testing::WithParamInterface<Place> {
protected:
    void put(uint access) {
        InterfaceMap modem = testModem(access);
        modem[Mock::location] = {{"Capabilities", 1U}, {"Enabled", 1U}};
        mock.put(Mock::modemPath(0), modem);
    }
};

TEST_P(PlaceTest, replacesCellInformation) {
    put(GetParam().access);
    refuse("GetCellInfo", QString::fromUtf8(unsupported.data()), "operation not supported");
    setPlace(GetParam().location);
    follow();
    listen();
    // The place is another reply than the refusal, and may come after it.
    const Value expected = GetParam().cell.isNone() ? array({}) : array({GetParam().cell});
    EXPECT_TRUE(passes([&] { return cells() == expected; }));
    EXPECT_EQ(cells(), expected);
    EXPECT_EQ(inCells("kVoxModemCellReport"), number(ModemCellReport::Unsupported));
    EXPECT_EQ(warnings().size(), 1U);
}

Value place(std::string_view technology, std::initializer_list<Dictionary::Entry> members) {
    const Value cell = serving(technology, members);
    cell.asDictionary()->set("kVoxCellMonitorIsPlace", true);
    return cell;
}

constexpr auto gsm = kVoxCellMonitorRadioAccessTechnologyGSM;
constexpr auto umts = kVoxCellMonitorRadioAccessTechnologyUMTS;
constexpr auto lte = kVoxCellMonitorRadioAccessTechnologyLTE;
constexpr auto nr = kVoxCellMonitorRadioAccessTechnologyNR;

INSTANTIATE_TEST_SUITE_P(All, PlaceTest,
                         ::testing::Values(Place{"lte", lteAccess, "001,01,0000,01A2D003,001005",
                                                 place(lte, {{"kVoxCellMonitorMCC", 1},
                                                             {"kVoxCellMonitorMNC", 1},
                                                             {"kVoxCellMonitorMNCDigits", 2},
                                                             {"kVoxCellMonitorTAC", 4101},
                                                             {"kVoxCellMonitorCellId", 27447299}})},
                                           Place{"lteWith5G", lteAccess | nrAccess, "310,026,FFFE,1,7",
                                                 place(lte, {{"kVoxCellMonitorMCC", 310},
                                                             {"kVoxCellMonitorMNC", 26},
                                                             {"kVoxCellMonitorMNCDigits", 3},
                                                             {"kVoxCellMonitorTAC", 7},
                                                             {"kVoxCellMonitorCellId", 1}})},
                                           Place{"nrAlone", nrAccess, "001,01,0000,800000001,10005",
                                                 place(nr, {{"kVoxCellMonitorMCC", 1},
                                                            {"kVoxCellMonitorMNC", 1},
                                                            {"kVoxCellMonitorMNCDigits", 2},
                                                            {"kVoxCellMonitorTAC", 65541},
                                                            {"kVoxCellMonitorCellId", 34359738369}})},
                                           Place{"withoutArea", lteAccess, "001,01,0000,1,0",
                                                 place(lte, {{"kVoxCellMonitorMCC", 1},
                                                             {"kVoxCellMonitorMNC", 1},
                                                             {"kVoxCellMonitorMNCDigits", 2},
                                                             {"kVoxCellMonitorCellId", 1}})},
                                           Place{"gsm", gsmAccess, "310,260,8BE3,2BAF,0",
                                                 place(gsm, {{"kVoxCellMonitorMCC", 310},
                                                             {"kVoxCellMonitorMNC", 260},
                                                             {"kVoxCellMonitorMNCDigits", 3},
                                                             {"kVoxCellMonitorLAC", 35811},
                                                             {"kVoxCellMonitorCellId", 11183}})},
                                           Place{"umtsOfFourParts", umtsAccess, "250,40,CE00,CEAD8F0",
                                                 place(umts, {{"kVoxCellMonitorMCC", 250},
                                                              {"kVoxCellMonitorMNC", 40},
                                                              {"kVoxCellMonitorMNCDigits", 2},
                                                              {"kVoxCellMonitorLAC", 52736},
                                                              {"kVoxCellMonitorCellId", 216717552}})},
                                           Place{"onNoNetwork", 0, "001,01,0000,1,7", {}},
                                           Place{"withoutCell", gsmAccess, "001,01,1000", {}},
                                           Place{"unknownCell", lteAccess, "001,01,0000,FFFFFFF,7", {}},
                                           Place{"empty", gsmAccess, "", {}},
                                           Place{"tooManyParts", gsmAccess, "001,01,1000,1,1,1", {}},
                                           Place{"cellTooLarge", gsmAccess, "001,01,1000,10000000,1", {}},
                                           Place{"noHexadecimal", gsmAccess, "001,01,1000,xyz,1", {}}),
                         [](const auto& test) { return std::string(test.param.name); });

class PlacesTest : public PlaceTest {};

TEST_F(PlacesTest, aPlaceHasNoChannelOfAnEarlierCell) {
    put(lteAccess);
    setPlace("001,01,0000,1,7");
    setCells({{{"cell-type", 5U}, {"serving", true}, {"earfcn", 1300U}, {"physical-ci", "1"}, {"ci", "1"}}});
    follow();
    listen();
    EXPECT_EQ(at(cells(), {"0", "kVoxCellMonitorEARFCN"}), Value(1300));
    EXPECT_EQ(mock.count("GetLocation"), 0U) << "the serving cell is known";
    setCells({});
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxCellMonitorCells"},
                        array({place(lte, {{"kVoxCellMonitorMCC", 1},
                                           {"kVoxCellMonitorMNC", 1},
                                           {"kVoxCellMonitorMNCDigits", 2},
                                           {"kVoxCellMonitorTAC", 7},
                                           {"kVoxCellMonitorCellId", 1}})})));
}

TEST_F(PlacesTest, aSlowAnswerDelaysTheCellsByASecondAtMost) {
    put(lteAccess);
    setPlace("001,01,0000,1,7");
    setCells({{{"cell-type", 5U}, {"serving", false}, {"earfcn", 1300U}}});
    mock.held = "GetLocation";
    follow();
    listen();
    ASSERT_TRUE(comes([this] { return mock.count("GetLocation") == 1; }));
    queue.advance(1s);
    EXPECT_EQ(cells(), array({neighbor(lte, {{"kVoxCellMonitorEARFCN", 1300}})}));
    // It is not asked again before its answer, which counts although it is late.
    queue.advance(9s);
    drain();
    EXPECT_EQ(mock.count("GetLocation"), 1U);
    mock.release();
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorTAC"}, 7));
    // On another technology it is the place of an earlier cell.
    mock.held = "GetLocation";
    mock.change(Mock::modemPath(0), Mock::modem, {{"AccessTechnologies", nrAccess}});
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxCellMonitorCells"},
                        array({neighbor(lte, {{"kVoxCellMonitorEARFCN", 1300}})})));
}

} // namespace
} // namespace velmora
