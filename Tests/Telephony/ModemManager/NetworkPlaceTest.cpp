// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/CellsFixture.h"

/// The location in the network that replaces missing cells, from the bus to a decoder's display.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;

/// A place in the network and what it comes to on an access technology; none where it comes to nothing.
struct Place {
    const char* name;
    uint access;
    const char* location;
    Value cell;
};

class PlaceTest : public CellsFixture, public ::testing::WithParamInterface<Place> {};

TEST_P(PlaceTest, standsInForCellInformation) {
    InterfaceMap modem = testModem(GetParam().access);
    modem[Mock::location] = {{"Capabilities", 1U}, {"Enabled", 1U}};
    mock.put(Mock::modemPath(0), modem);
    mock.answers["GetCellInfo"] = {
        {}, "org.freedesktop.ModemManager1.Error.Core.Unsupported", "operation not supported"};
    mock.answers["GetLocation"] = {
        {QVariant::fromValue(LocationMap{{1U, QDBusVariant(QString(GetParam().location))}})}, {}, {}};
    follow();
    listen();
    if (GetParam().cell.isNone()) {
        ASSERT_TRUE(passes([this] { return mock.count("GetLocation") >= 2; }));
        EXPECT_EQ(count(cellCode), 0U);
    } else {
        EXPECT_EQ(cells(), array({GetParam().cell}));
    }
    EXPECT_THAT(warnings(),
                ElementsAre("modemmanager: modem 0 does not support cell information "
                            "(org.freedesktop.ModemManager1.Error.Core.Unsupported: operation not "
                            "supported)"));
}

Value servingPlace(std::string_view technology, std::initializer_list<Dictionary::Entry> members) {
    return cell(technology, kVoxCellMonitorCellTypeServing, members);
}

INSTANTIATE_TEST_SUITE_P(
    All, PlaceTest,
    ::testing::Values(
        Place{"lte", lteAccess, "001,01,0000,01A2D003,001005",
              servingPlace(kVoxCellMonitorRadioAccessTechnologyLTE, {{"kVoxCellMonitorMCC", 1},
                                                                     {"kVoxCellMonitorMNC", 1},
                                                                     {"kVoxCellMonitorTAC", 4101},
                                                                     {"kVoxCellMonitorCellId", 27447299}})},
        Place{"lteWith5G", lteAccess | nrAccess, "001,01,FFFE,1,7",
              servingPlace(kVoxCellMonitorRadioAccessTechnologyLTE, {{"kVoxCellMonitorMCC", 1},
                                                                     {"kVoxCellMonitorMNC", 1},
                                                                     {"kVoxCellMonitorTAC", 7},
                                                                     {"kVoxCellMonitorCellId", 1}})},
        Place{"gsm", gsmAccess, "310,260,8BE3,2BAF,0",
              servingPlace(kVoxCellMonitorRadioAccessTechnologyGSM, {{"kVoxCellMonitorMCC", 310},
                                                                     {"kVoxCellMonitorMNC", 260},
                                                                     {"kVoxCellMonitorLAC", 35811},
                                                                     {"kVoxCellMonitorCellId", 11183}})},
        Place{"umtsOfFourParts", umtsAccess, "250,40,CE00,CEAD8F0",
              servingPlace(kVoxCellMonitorRadioAccessTechnologyUMTS, {{"kVoxCellMonitorMCC", 250},
                                                                      {"kVoxCellMonitorMNC", 40},
                                                                      {"kVoxCellMonitorLAC", 52736},
                                                                      {"kVoxCellMonitorCellId", 216717552}})},
        Place{"nrAlone", nrAccess, "001,01,0000,1,7", {}}, Place{"onNoNetwork", 0, "001,01,0000,1,7", {}},
        Place{"withoutCell", gsmAccess, "001,01,1000", {}}, Place{"empty", gsmAccess, "", {}},
        Place{"tooManyParts", gsmAccess, "001,01,1000,1,1,1", {}},
        Place{"cellTooLarge", gsmAccess, "001,01,1000,10000000,1", {}},
        Place{"noHexadecimal", gsmAccess, "001,01,1000,xyz,1", {}}),
    [](const auto& test) { return std::string(test.param.name); });

} // namespace
} // namespace velmora
