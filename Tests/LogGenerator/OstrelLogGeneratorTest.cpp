// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelLogGenerator.h"

#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::Each;
using testing::ElementsAre;

/// The base with nothing to decode.
class BinaryGenerator final : public OstrelLogGenerator {
public:
    using OstrelLogGenerator::OstrelLogGenerator;
    void updateState(Dictionary&, const Data&) override {}
    Value generateLogUsingState(Dictionary&) override { return {}; }
    DictionaryRef getStartCommand() const override { return makeDictionary(); }
};

class DLFTest : public testing::Test {
protected:
    DLFTest() { resources.version = "0.1.0"; }

    void addToHistory(const Value& displayState) {
        const DictionaryRef entry = makeDictionary();
        entry->set("DisplayState", displayState);
        history->append(entry);
    }
    [[nodiscard]] Data dlf() const { return *BinaryGenerator(clock).generateDlfFromState(state); }

    FakeClock clock;
    FakeResources resources;
    ArrayRef history = makeArray();
    Dictionary state = {{"History", history}};
};

TEST_F(DLFTest, EmptyRawMessagesAddNothing) {
    const Data empty = dlf();
    addToHistory(Data());
    EXPECT_EQ(dlf(), empty);
    addToHistory(hex("01")); // a type byte alone
    EXPECT_EQ(dlf(), empty);
    addToHistory(hex("01 0C"));
    EXPECT_EQ(dlf(), joined(empty, hex("0C")));
}

TEST_F(DLFTest, EmptyHistoryIsTheVersionReportAlone) {
    clock.setZone({-5h - 30min, false});
    const Data expected =
        joined(hex("A1 00                   // record length: 161\n"
                   "FD 1F                   // log code\n"
                   "00 00 00 00 00 00 00 00 // time stamp\n"
                   "01 00                   // first report number\n"
                   "01 00                   // second report number\n"
                   "56 65 6C 6D 6F 72 00    // version: \"Velmora 0.1.0\" cut to six characters\n"
                   "45 58 45 43 55 54 41 42 4C 45 5F 4E 41 4D 45 // \"EXECUTABLE_NAME\"\n"),
               Data(std::vector<std::uint8_t>(25)), // the rest of 40
               hex("53 65 70 20 31 31 20 32 30 31 39 20 31 38 3A 35 34 // \"Sep 11 2019 18:54\": seventeen "
                   "characters\n"
                   "00\n"
                   "D0 8D FA 6A // 2026-11-16 05:00:00: 20,773 days and 5 hours are 1,794,805,200 seconds\n"
                   "B6 FE       // -330 minutes\n"
                   "00 00       // no daylight-saving time\n"),
               Data(std::vector<std::uint8_t>(72)));
    ASSERT_EQ(expected.size(), 161u);
    const Data written = dlf();
    EXPECT_THAT(std::vector<std::uint8_t>(written.bytes().begin(), written.bytes().end()),
                testing::ElementsAreArray(expected.bytes()));
}

TEST_F(DLFTest, MissingHistoryIsTheSame) {
    state.remove("History");
    EXPECT_EQ(dlf().size(), 161u);
}

TEST_F(DLFTest, UnknownVersionIsNamedAsSuch) {
    resources.version = std::nullopt;
    const Data log = dlf();
    EXPECT_EQ(std::string(log.bytes().begin() + 16, log.bytes().begin() + 23), std::string("(none)\0", 7));
}

TEST_F(DLFTest, ZoneAndDaylightSavingAreTheMoments) {
    clock.setZone({2h, true});
    const Data log = dlf();
    EXPECT_EQ(log.bytes()[85], 120);
    EXPECT_EQ(log.bytes()[86], 0);
    EXPECT_EQ(log.bytes()[87], 1);
    EXPECT_EQ(log.bytes()[88], 0);
}

TEST_F(DLFTest, ZoneMinutesAreCutTowardZero) {
    clock.setZone({-90s, false});
    EXPECT_EQ(dlf().bytes()[85], 0xFF); // -1, not -2
    EXPECT_EQ(dlf().bytes()[86], 0xFF);
}

TEST_F(DLFTest, OnlyTheFirstByteOfEachBufferIsRemoved) {
    addToHistory(hex("01 AA BB 01 CC")); // two messages: the second keeps its type byte
    addToHistory(hex("01"));             // too short to hold anything
    addToHistory(hex("01 DD"));
    history->append(makeDictionary()); // without raw messages
    EXPECT_EQ(dlf().from(161), hex("AA BB 01 CC DD"));
}

TEST_F(DLFTest, RawMessagesOfAnotherKindAbortTheLog) {
    addToHistory(hex("01 AA"));
    addToHistory("text");
    const CapturedLog log;
    const BinaryGenerator generator(clock);
    EXPECT_FALSE(generator.generateDlfFromState(state).has_value());
    EXPECT_THAT(log.textsAt(16),
                ElementsAre("Got wrong class writing history to DLF; aborting writing the DLF file"));
    const ArrayRef contents = generator.getSaveContentsFromState(state);
    ASSERT_EQ(contents->size(), 2u); // the history alone
    EXPECT_EQ((*contents)[0], (*history)[0]);
}

TEST_F(DLFTest, SaveContentsAreACopyOfTheHistoryAndTheLog) {
    addToHistory(hex("01 AA BB"));
    const ArrayRef contents = BinaryGenerator(clock).getSaveContentsFromState(state);
    ASSERT_EQ(contents->size(), 2u);
    const Dictionary& entry = *(*contents)[1].asDictionary();
    EXPECT_EQ(entry["Description"], Value("DLF binary (163 bytes)"));
    EXPECT_EQ(entry["DLF"].asData()->size(), 163u);
    EXPECT_EQ(history->size(), 1u);
}

TEST_F(DLFTest, EntriesThatAreNoDictionariesAreSavedAndGiveTheLogNothing) {
    history->append("text");
    addToHistory(Value());
    const ArrayRef contents = BinaryGenerator(clock).getSaveContentsFromState(state);
    ASSERT_EQ(contents->size(), 3u);
    EXPECT_EQ((*contents)[0], Value("text"));
    EXPECT_EQ((*(*contents)[2].asDictionary())["Description"], Value("DLF binary (161 bytes)"));
}

TEST_F(DLFTest, SaveContentsWithoutAHistoryAreTheLog) {
    state.remove("History");
    const ArrayRef contents = BinaryGenerator(clock).getSaveContentsFromState(state);
    ASSERT_EQ(contents->size(), 1u);
    EXPECT_EQ((*(*contents)[0].asDictionary())["Description"], Value("DLF binary (161 bytes)"));
}

TEST(DLFAddVersionReportTest, ShortBufferGetsNothing) {
    std::array<std::uint8_t, 160> buffer{};
    std::size_t written = 7;
    EXPECT_EQ(DLFAddVersionReport(buffer, written, 1, 1, "v", "e", "b", ~std::uint64_t{0}), 3);
    EXPECT_EQ(written, 0u);
    EXPECT_THAT(buffer, Each(0));
}

TEST(DLFAddVersionReportTest, ALongerBufferIsUnchangedAfterTheReport) {
    std::array<std::uint8_t, 162> buffer{};
    buffer[160] = buffer[161] = 0xEE;
    std::size_t written = 0;
    EXPECT_EQ(DLFAddVersionReport(buffer, written, 0x0102, 0x0304, "v", "e", "b", 0), 0);
    EXPECT_EQ(written, 161u);
    EXPECT_EQ(buffer[12], 2);
    EXPECT_EQ(buffer[13], 1);
    EXPECT_EQ(buffer[14], 4);
    EXPECT_EQ(buffer[15], 3);
    EXPECT_EQ(buffer[160], 0);
    EXPECT_EQ(buffer[161], 0xEE);
}

} // namespace
} // namespace velmora
