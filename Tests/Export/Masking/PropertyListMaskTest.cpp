// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/PropertyLists/PropertyListMask.h"

#include "LogMessages/LiveModem.h"
#include "Platform/TelephonyService.h"
#include "Tests/Export/Masking/ExampleKey.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <memory>

namespace velmora {
namespace {

using Entries = std::initializer_list<Dictionary::Entry>;

Value dictionary(Entries entries) {
    return Value(std::make_shared<Dictionary>(entries));
}

Value array(std::initializer_list<Value> values) {
    return Value(std::make_shared<Array>(values));
}

class PropertyListMaskTest : public testing::Test {
protected:
    /// What the list becomes.
    Value masked(Value list, PropertyListKind kind, MaskOptions options = exampleOptions()) {
        Pseudonyms pseudonyms(options);
        _report = {};
        PropertyListMask mask(options, pseudonyms, _report);
        _changed = mask.mask(list, kind, std::chrono::hours(24));
        return list;
    }
    Value masked(Entries entries, PropertyListKind kind, MaskLevel level = MaskLevel::Identity) {
        return masked(dictionary(entries), kind, exampleOptions(level));
    }

    MaskReport _report;
    bool _changed = false;
};

TEST_F(PropertyListMaskTest, SIMFilesAreMaskedByTheirKeys) {
    EXPECT_EQ(masked({{"kSimFile_ICCID", "8900101000000000017"},
                      {"kSimFile_MSISDN", "+1 555 0100"},
                      {"kSimFile_HPPLMN", "60 min"},
                      {"kSimFile_LOCI", "001-01, LAC 4101, updated"},
                      {"kSimFile_AD", "00 00 00 02"},
                      {"kSimFile_PNN", "Test Network"}},
                     PropertyListKind::SIMFiles),
              dictionary({{"kSimFile_ICCID", "8912596966232995399"},
                          {"kSimFile_MSISDN", "+2 409 2455"},
                          {"kSimFile_HPPLMN", "60 min"},
                          {"kSimFile_LOCI", "001-01, LAC 4101, updated"},
                          {"kSimFile_AD", "00 00 00 02"},
                          {"kSimFile_PNN", "Test Network"}}));
    EXPECT_EQ(_report.of(Masked::Subscriber), 2U);
}

TEST_F(PropertyListMaskTest, SIMFilesAsBytesGetTheSamePseudonyms) {
    // 8900101000000000017 becomes 8912596966232995399, both as swapped BCD with a filler.
    EXPECT_EQ(masked({{"kSimFile_ICCID", hex("98 00 01 01 00 00 00 00 10 F7")}}, PropertyListKind::SIMFiles),
              dictionary({{"kSimFile_ICCID", hex("98 21 95 96 66 32 92 59 93 F9")}}));
}

TEST_F(PropertyListMaskTest, LocationFileKeepsWhatItsLevelKeeps) {
    //                            TMSI        PLMN     LAC   time status
    const Data file = hex("8E C7 E8 11 00 F1 10 10 05 FF 00");
    const Value atIdentity = masked({{"kSimFile_LOCI", file}}, PropertyListKind::SIMFiles);
    const Bytes identity = (*atIdentity.asDictionary())["kSimFile_LOCI"].asData()->bytes();
    ASSERT_EQ(identity.size(), 11U);
    EXPECT_NE(Data::copyOf(identity.first(4)), hex("8E C7 E8 11"));
    EXPECT_EQ(Data::copyOf(identity.subspan(4)), hex("00 F1 10 10 05 FF 00"));
    const Value atLocation =
        masked({{"kSimFile_LOCI", file}}, PropertyListKind::SIMFiles, MaskLevel::Location);
    const Bytes location = (*atLocation.asDictionary())["kSimFile_LOCI"].asData()->bytes();
    // 001-01 becomes 078-07, and 4101 becomes 44394, which is 0xAD6A.
    EXPECT_EQ(Data::copyOf(location.subspan(4)), hex("70 F8 70 AD 6A FF 00"));
}

TEST_F(PropertyListMaskTest, UnknownKeysAreRemovedAndCounted) {
    EXPECT_EQ(masked({{"kSimFile_ICCID", "8900101000000000017"}, {"kSimFile_IMSI", "001010000000017"}},
                     PropertyListKind::SIMFiles),
              dictionary({{"kSimFile_ICCID", "8912596966232995399"}}));
    EXPECT_EQ(_report.of(Masked::UnknownKey), 1U);
}

TEST_F(PropertyListMaskTest, UnknownKeysMayBeKept) {
    MaskOptions options = exampleOptions();
    options.keepsUnknown = true;
    EXPECT_EQ(masked(dictionary({{"kSimFile_Other", "1"}}), PropertyListKind::SIMFiles, options),
              dictionary({{"kSimFile_Other", "1"}}));
    EXPECT_FALSE(_changed);
}

TEST_F(PropertyListMaskTest, CellsKeepTheirMeasurements) {
    const Entries cell = {
        {std::string(kVoxCellMonitorCellRadioAccessTechnology), kVoxCellMonitorRadioAccessTechnologyLTE},
        {std::string(kVoxCellMonitorMCC), 1},
        {std::string(kVoxCellMonitorMNC), 1},
        {std::string(kVoxCellMonitorTAC), 7101},
        {std::string(kVoxCellMonitorCellId), 0x1234503},
        {std::string(kVoxCellMonitorRSCP), -93}};
    EXPECT_EQ(masked(array({dictionary(cell)}), PropertyListKind::Cells), array({dictionary(cell)}));
    EXPECT_FALSE(_changed);
    EXPECT_EQ(masked(array({dictionary(cell)}), PropertyListKind::Cells, exampleOptions(MaskLevel::Location)),
              array({dictionary({{std::string(kVoxCellMonitorCellRadioAccessTechnology),
                                  kVoxCellMonitorRadioAccessTechnologyLTE},
                                 {std::string(kVoxCellMonitorMCC), 78},
                                 {std::string(kVoxCellMonitorMNC), 7},
                                 {std::string(kVoxCellMonitorTAC), 17202},
                                 {std::string(kVoxCellMonitorCellId), 0xA88EA96},
                                 {std::string(kVoxCellMonitorRSCP), -93}})}));
}

TEST_F(PropertyListMaskTest, TextWhereANumberBelongsIsRemoved) {
    EXPECT_EQ(masked(array({dictionary({{std::string(kVoxCellMonitorRSSI), "001010000000017"}})}),
                     PropertyListKind::Cells),
              array({dictionary({})}));
}

TEST_F(PropertyListMaskTest, ContextsGetAddressesForDocuments) {
    EXPECT_EQ(masked(array({dictionary({{"Context ID", "1"},
                                        {"APN", "internet.test"},
                                        {"PDP Address", "10.64.3.7"},
                                        {"Primary DNS", "somewhere"}})}),
                     PropertyListKind::Contexts)
                  .asArray()
                  ->slot(0)
                  .asDictionary()
                  ->find("PDP Address")
                  ->asString()[0],
              "198.19.0.157");
    EXPECT_EQ(_report.of(Masked::Address), 2U);
}

TEST_F(PropertyListMaskTest, RootOfAnotherKindIsNothingThatIsKnown) {
    EXPECT_TRUE(masked(Value("8900101000000000017"), PropertyListKind::SIMFiles).isNone());
    EXPECT_TRUE(masked(dictionary({}), PropertyListKind::Cells).isNone());
}

TEST_F(PropertyListMaskTest, DisplayKeepsItsShape) {
    EXPECT_EQ(masked({{"SIM", dictionary({{"ICCID", "8900101000000000017"}})},
                      {"Registration", dictionary({{"State", "Idle"}, {"Secret", "8900101000000000017"}})},
                      {"Nickname", "Erika"}},
                     PropertyListKind::Display),
              dictionary({{"SIM", dictionary({{"ICCID", "8912596966232995399"}})},
                          {"Registration", dictionary({{"State", "Idle"}, {"(removed)", "(removed)"}})},
                          {"(removed)", "(removed)"}}));
    EXPECT_EQ(_report.of(Masked::UnknownKey), 2U);
}

TEST_F(PropertyListMaskTest, WhatAnIdentityContainsIsPartOfIt) {
    const Value list = masked({{"SIM", dictionary({{"State", "4711"}})}}, PropertyListKind::Display);
    EXPECT_NE(*(*(*list.asDictionary())["SIM"].asDictionary())["State"].asString(), "4711");
}

TEST_F(PropertyListMaskTest, DisplayIsMaskedTwiceWithoutAnotherChange) {
    Value list = masked({{"Nickname", "Erika"}, {"Other", "x"}}, PropertyListKind::Display);
    MaskOptions again = exampleOptions();
    again.done = MaskLevel::Identity;
    EXPECT_EQ(masked(list.copy(), PropertyListKind::Display, again), list);
    EXPECT_FALSE(_changed);
}

TEST_F(PropertyListMaskTest, ModemsIdentitiesAreMaskedWhereverTheyAre) {
    EXPECT_EQ(masked({{std::string(kVoxSIMIMSI), "001010000000017"},
                      {std::string(kSimFile_MSISDN), array({"+15550100"})},
                      {std::string(kVoxSIMSlots),
                       array({dictionary({{std::string(kSimFile_ICCID), "8900101000000000017"},
                                          {std::string(kVoxSIMSlotNumber), 1}})})},
                      {std::string(kVoxSIMGroup1), hex("A0 01")},
                      {std::string(kVoxModemEquipment), "001010999999990"}},
                     PropertyListKind::Modem),
              dictionary({{std::string(kVoxSIMIMSI), "001011950118174"},
                          {std::string(kSimFile_MSISDN), array({"+24092455"})},
                          {std::string(kVoxSIMSlots),
                           array({dictionary({{std::string(kSimFile_ICCID), "8912596966232995399"},
                                              {std::string(kVoxSIMSlotNumber), 1}})})},
                          {std::string(kVoxSIMGroup1), hex("A0 01")},
                          {std::string(kVoxModemEquipment), "414682044152432"}}));
}

TEST_F(PropertyListMaskTest, PositionsAndDatesChangeAtTheLastLevelAlone) {
    const Entries position = {{std::string(kVoxPositionLatitude), 47.5},
                              {std::string(kVoxPositionTime), "080000.00"},
                              {std::string(kVoxContextStart), Value(Date(std::chrono::hours(48)))}};
    EXPECT_EQ(masked(position, PropertyListKind::Modem, MaskLevel::Location), dictionary(position));
    EXPECT_EQ(masked(position, PropertyListKind::Modem, MaskLevel::All),
              dictionary({{std::string(kVoxContextStart), Value(Date(std::chrono::hours(24)))}}));
    EXPECT_EQ(_report.of(Masked::Position), 1U);
    EXPECT_EQ(_report.of(Masked::Times), 2U);
}

TEST_F(PropertyListMaskTest, IdentityOfDigitsMayBeANumber) {
    const Value list = masked({{"kSimFile_MSISDN", 15550100}}, PropertyListKind::SIMFiles);
    EXPECT_EQ(list, dictionary({{"kSimFile_MSISDN", 24092455}}));
}

TEST_F(PropertyListMaskTest, LevelMayBeRaisedLater) {
    MaskOptions raised = exampleOptions(MaskLevel::Location);
    raised.done = MaskLevel::Identity;
    EXPECT_EQ(masked(dictionary({{std::string(kVoxSIMIMSI), "001011950118174"},
                                 {std::string(kSimFile_ICCID), "8912596966232995399"},
                                 {std::string(kVoxSIMOperatorCode), "00101"}}),
                     PropertyListKind::Modem, raised),
              dictionary({{std::string(kVoxSIMIMSI), "078071950118174"},
                          {std::string(kSimFile_ICCID), "8912596966232995399"},
                          {std::string(kVoxSIMOperatorCode), "07807"}}));
}

} // namespace
} // namespace velmora
