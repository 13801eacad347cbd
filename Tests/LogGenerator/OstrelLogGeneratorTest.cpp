// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelLogGenerator.h"

#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

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

TEST_F(DLFTest, EmptyOrMissingHistoryIsTheVersionReportAlone) {
    const Data report = dlf();
    ASSERT_EQ(report.size(), 161u);
    EXPECT_EQ(Data::copyOf(report.bytes().first(4)), hex("A1 00 FD 1F")); // its length and log code
    EXPECT_EQ(std::string(report.bytes().begin() + 16, report.bytes().begin() + 22), "Velmor");
    state.remove("History");
    EXPECT_EQ(dlf(), report);
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

} // namespace
} // namespace velmora
