// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellInfoArray.h"
#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/Extra/PDPContextList.h"
#include "LogGenerator/Extra/SimInfo.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using Line = CapturedLog::Line;

DictionaryRef dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

ArrayRef array(std::initializer_list<Value> values) {
    return std::make_shared<Array>(values);
}

class SimInfoTest : public testing::Test {
protected:
    SimInfoTest() {
        section.updateSectionRef(node);
        log.clear();
    }

    CapturedLog log;
    DictionaryRef node = makeDictionary();
    SimInfo section;
};

TEST_F(SimInfoTest, NamesItself) {
    EXPECT_EQ(section.getSectionName(), "SIM Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(0xFF0000u));
}

TEST_F(SimInfoTest, ShowsEveryFileUnderItsLabelInOrder) {
    section.updateWithData(extraRecord(0, dictionary({{"kSimFile_OPLMNAcT", "14"},
                                                      {"kSimFile_ICCID", "1"},
                                                      {"kSimFile_MSISDN", "2"},
                                                      {"kSimFile_MBDN", "3"},
                                                      {"kSimFile_HPPLMN", "4"},
                                                      {"kSimFile_LOCI", "5"},
                                                      {"kSimFile_PSLOCI", "6"},
                                                      {"kSimFile_ACC", "7"},
                                                      {"kSimFile_AD", "8"},
                                                      {"kSimFile_FPLMN", "9"},
                                                      {"kSimFile_AHPLMN", "10"},
                                                      {"kSimFile_RATMODE", "11"},
                                                      {"kSimFile_PNN", "12"},
                                                      {"kSimFile_OPL", "13"},
                                                      {"kSimFile_Other", "x"}})),
                           0xFF0000);
    const std::pair<const char*, const char*> expected[] = {
        {"EF-ICCID", "1"},
        {"EF-MSISDN", "2"},
        {"EF-3GPP MAIL BOX DIALING NUMBER", "3"},
        {"EF-HPPLMN SEARCH PERIOD", "4"},
        {"EF-LOCI", "5"},
        {"EF-GPRS/PS-LOCI", "6"},
        {"EF-ACCESS CONTROL CLASS", "7"},
        {"EF-ADMINISTRATIVE DATA", "8"},
        {"EF-FPLMN", "9"},
        {"EF-ACTING HPLMN", "10"},
        {"EF-RAT MODE", "11"},
        {"EF-PLMN NETWORK NAME", "12"},
        {"EF-OPERATOR PLMN LIST", "13"},
        {"EF-OPLMNAcT", "14"},
    };
    ASSERT_EQ(node->size(), std::size(expected));
    auto shown = node->begin();
    for (const auto& [label, text] : expected) {
        EXPECT_EQ(shown->key, label);
        EXPECT_EQ(shown->value, Value(text));
        ++shown;
    }
    EXPECT_THAT(log.lines(), ElementsAre(Line{LogPriority::Warning, "SimInfo"}));
}

TEST_F(SimInfoTest, AbsentFilesLeaveTheirEarlierValues) {
    node->set("EF-LOCI", "earlier");
    section.updateWithData(extraRecord(0, dictionary({{"kSimFile_ICCID", "8988"}})), 0xFF0000);
    EXPECT_EQ(Value(node), Value(dictionary({{"EF-LOCI", "earlier"}, {"EF-ICCID", "8988"}})));
}

TEST_F(SimInfoTest, ValuesAreUnchanged) {
    section.updateWithData(extraRecord(0, dictionary({{"kSimFile_FPLMN", array({"00101", 7})}})), 0xFF0000);
    EXPECT_EQ((*node)["EF-FPLMN"], Value(array({"00101", 7})));
}

TEST_F(SimInfoTest, AnyOtherCodeOnlyTraces) {
    section.updateWithData(extraRecord(0, "no dictionary"), 0xFF0001);
    section.updateWithData(hex("01"), 0xFF0002);
    EXPECT_TRUE(node->empty());
    EXPECT_THAT(log.lines(),
                ElementsAre(Line{LogPriority::Warning, "SimInfo"}, Line{LogPriority::Warning, "SimInfo"}));
}

TEST_F(SimInfoTest, ReadablePayloadThatIsNoDictionaryHoldsNoFiles) {
    section.updateWithData(extraRecord(0, array({"kSimFile_ICCID"})), 0xFF0000);
    EXPECT_TRUE(node->empty());
}

TEST_F(SimInfoTest, WithoutANodeItShowsNothingAndStillRaisesWhatItCannotRead) {
    SimInfo homeless;
    homeless.updateWithData(extraRecord(0, dictionary({{"kSimFile_ICCID", "8988"}})), 0xFF0000);
    EXPECT_TRUE(node->empty());
    EXPECT_THAT(log.lines(), ElementsAre(Line{LogPriority::Warning, "SimInfo"}));
    EXPECT_THROW(homeless.updateWithData(hex("01"), 0xFF0000), LogCode_0xFF0000::UnknownDataException);
}

struct Unreadable {
    const char* odd;
    const char* record;
};

class UnreadableSimTest : public SimInfoTest, public testing::WithParamInterface<Unreadable> {};

TEST_P(UnreadableSimTest, ReportsAndThrowsAnUncaughtException) {
    EXPECT_THROW(section.updateWithData(hex(GetParam().record), 0xFF0000),
                 LogCode_0xFF0000::UnknownDataException);
    EXPECT_THAT(log.lines(),
                ElementsAre(Line{LogPriority::Warning, "SimInfo"},
                            Line{LogPriority::Error, "SIM File dictionary data could not be constructed"}));
    EXPECT_TRUE(node->empty());
}

INSTANTIATE_TEST_SUITE_P(
    , UnreadableSimTest,
    testing::Values(Unreadable{"JustTheHeader", "FF 0C 00 00 00 00 00 00 00 00 00 00 00"},
                    Unreadable{"ElevenBytesOfAPrefixedMessage", "FF 0C 00 00 00 00 00 00 00 00 00"},
                    Unreadable{"Rubbish", "FF 0E 00 00 00 00 00 00 00 00 00 00 00 41 42"}),
    [](const auto& test) { return std::string(test.param.odd); });

TEST(UnknownDataExceptionTest, EndsTheProgramWithItsOwnMessage) {
    EXPECT_DEATH(
        {
            SimInfo section;
            [&]() noexcept { section.updateWithData(Data(), 0xFF0000); }();
        },
        "SIM File dictionary data could not be constructed");
}

class PDPContextListTest : public testing::Test {
protected:
    PDPContextListTest() {
        section.updateSectionRef(node);
        log.clear();
    }

    CapturedLog log;
    ArrayRef node = array({"earlier"});
    PDPContextList section;
};

TEST_F(PDPContextListTest, ShowsTheContextsUnchanged) {
    const Value contexts = array({dictionary({{"APN", "internet"}}), "second"});
    section.updateWithData(extraRecord(2, contexts), 0xFF0002);
    EXPECT_EQ(Value(node), contexts);
    EXPECT_THAT(log.lines(), ElementsAre(Line{LogPriority::Warning, "PDPContextList"}));
    EXPECT_EQ(section.getSectionName(), "PDP Context Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(0xFF0002u));
}

TEST_F(PDPContextListTest, ReadsTheBinaryFormToo) {
    const auto binary = writeBinaryPropertyList(array({"one"}));
    ASSERT_TRUE(binary);
    section.updateWithData(recordOf(2, *binary, 0xFF), 0xFF0002);
    EXPECT_EQ(Value(node), Value(array({"one"})));
}

TEST_F(PDPContextListTest, EmptyArrayEmptiesTheList) {
    section.updateWithData(extraRecord(2, makeArray()), 0xFF0002);
    EXPECT_TRUE(node->empty());
}

TEST_F(PDPContextListTest, CodeIsNotLookedAt) {
    section.updateWithData(extraRecord(2, makeArray()), 0x1234);
    EXPECT_TRUE(node->empty());
}

TEST_F(PDPContextListTest, AnythingElseChangesNothingAndSaysNothing) {
    section.updateWithData(extraRecord(2, dictionary({{"APN", "internet"}})), 0xFF0002);
    section.updateWithData(record(2, "", 0xFF), 0xFF0002);
    section.updateWithData(record(2, "41 42", 0xFF), 0xFF0002);
    section.updateWithData(hex("FF"), 0xFF0002);
    EXPECT_EQ(Value(node), Value(array({"earlier"})));
    EXPECT_THAT(log.textsAt(LogPriority::Error), IsEmpty());
}

TEST(CellInfoArrayReaderTest, HoldsParsedValuesOfAnyKind) {
    const CapturedLog log;
    EXPECT_EQ(CellInfoArrayReader(extraRecord(1, "text")).parsed(), Value("text"));
    EXPECT_EQ(CellInfoArrayReader(extraRecord(1, array({"cell"}))).cells()->size(), 1u);
    EXPECT_THAT(log.lines(), IsEmpty());
}

TEST(CellInfoArrayReaderTest, UnreadableOrAnotherKindHasNoCells) {
    const CapturedLog log;
    EXPECT_EQ(CellInfoArrayReader(record(1, "41", 0xFF)).cells(), nullptr);
    EXPECT_EQ(CellInfoArrayReader(extraRecord(1, makeDictionary())).cells(), nullptr);
    EXPECT_THAT(log.lines(),
                ElementsAre(Line{LogPriority::Error, "Cell Info Array data could not be constructed"},
                            Line{LogPriority::Error, "Failed to get Cell Array\n"},
                            Line{LogPriority::Error, "Failed to get Cell Array\n"}));
}

/// Lists nested a million deep, in either form.
Data nestedXML() {
    std::string text = "<plist>";
    for (int i = 0; i < 1'000'000; ++i)
        text += "<array>";
    return Data(std::vector<std::uint8_t>(text.begin(), text.end()));
}

TEST(CellInfoArrayReaderTest, MillionNestedArraysAreALineInTheLog) {
    const CapturedLog log;
    const Data message = joined(hex("FF 00 00 01 00 00 00 00 00 00 00 00 00"), nestedXML());
    EXPECT_EQ(CellInfoArrayReader(message).cells(), nullptr);
    EXPECT_THAT(
        log.lines(),
        ElementsAre(Line{LogPriority::Error, "Malformed message: the list has more tags and attributes "
                                             "than 100000 objects need"},
                    Line{LogPriority::Error, "Cell Info Array data could not be constructed"},
                    Line{LogPriority::Error, "Failed to get Cell Array\n"}));
}

struct Number {
    const char* odd;
    Value value;
    std::optional<std::int32_t> read;
};

class CellNumberTest : public testing::TestWithParam<Number> {};

TEST_P(CellNumberTest, ReadsSigned32BitIntegers) {
    const DictionaryRef cell = dictionary({{"kVoxCellMonitorMCC", GetParam().value}});
    EXPECT_EQ(cellNumber(*cell, kVoxCellMonitorMCC), GetParam().read);
    EXPECT_EQ(cellNumber(*cell, kVoxCellMonitorMNC), std::nullopt);
}

INSTANTIATE_TEST_SUITE_P(
    , CellNumberTest,
    testing::Values(Number{"Integer", 260, 260}, Number{"Negative", -40, -40},
                    Number{"Largest", 2147483647, 2147483647},
                    Number{"Smallest", -2147483648LL, -2147483647 - 1},
                    Number{"AboveTheLargest", 2147483648LL, std::nullopt},
                    Number{"BelowTheSmallest", -2147483649LL, std::nullopt}, Number{"WholeReal", 260.0, 260},
                    Number{"RealWithAFraction", 260.5, std::nullopt}, Number{"HugeReal", 1e300, std::nullopt},
                    Number{"NotANumber", std::numeric_limits<double>::quiet_NaN(), std::nullopt},
                    Number{"Text", "260", std::nullopt},
                    Number{"Data", Data(std::vector<std::uint8_t>{1}), std::nullopt},
                    Number{"Boolean", true, std::nullopt}, Number{"Array", makeArray(), std::nullopt}),
    [](const auto& test) { return std::string(test.param.odd); });

TEST(CellTest, IsOfATechnologyAndTypeByBothKeys) {
    const DictionaryRef gsm = dictionary(
        {{kVoxCellMonitorCellRadioAccessTechnology.data(), kVoxCellMonitorRadioAccessTechnologyGSM},
         {kVoxCellMonitorCellType.data(), kVoxCellMonitorCellTypeServing}});
    EXPECT_TRUE(isCell(gsm, kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeServing));
    EXPECT_FALSE(isCell(gsm, kVoxCellMonitorRadioAccessTechnologyUMTS, kVoxCellMonitorCellTypeServing));
    EXPECT_FALSE(isCell(gsm, kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeNeighbor));
    EXPECT_FALSE(isCell("text", kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeServing));
    gsm->remove(kVoxCellMonitorCellType);
    EXPECT_FALSE(isCell(gsm, kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeServing));
}

} // namespace
} // namespace velmora
