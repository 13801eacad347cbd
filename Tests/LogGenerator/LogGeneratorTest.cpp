// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "LogGenerator/GSM/GSMLogGenerator.h"
#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/Modem/ModemLogGenerator.h"
#include "LogGenerator/OstrelGSM/Ostrel_GSMLogGenerator.h"
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"
#include "Platform/TelephonyService.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;

template <class Decoder>
bool selects(std::string_view technology) {
    const FakeClock clock;
    const auto generator = LogGenerator::generatorFromTechnology(technology, clock);
    return dynamic_cast<Decoder*>(generator.get()) != nullptr;
}

TEST(TechnologyTest, ConstantSelectsItsDecoderByValue) {
    EXPECT_TRUE(selects<GSMLogGenerator>(std::string("kVoxLogChannelTechnology_IFX")));
    EXPECT_TRUE(selects<Ostrel_GSMLogGenerator>(std::string("kVoxLogChannelTechnology_Ostrel_GSM")));
    EXPECT_TRUE(selects<C2KLogGenerator>(std::string("kVoxLogChannelTechnology_Ostrel_CDMA")));
    EXPECT_TRUE(selects<LTELogGenerator>(std::string("kVoxLogChannelTechnology_Ostrel_LTE")));
    FakeResources resources;
    resources.put("Ostrel_UTRAN", "plist", Value(makeDictionary())); // chosen by what there is
    EXPECT_TRUE(selects<UTRANLogGenerator>(std::string("kVoxLogChannelTechnology_Ostrel_UTRAN2")));
    EXPECT_TRUE(selects<ModemLogGenerator>(std::string("kVoxLogChannelTechnology_Modem")));
}

TEST(TechnologyTest, AnyOtherNameSelectsNoneAndSaysNothing) {
    const FakeClock clock;
    const CapturedLog log;
    for (const char* name : {"", "IFX", "Ostrel_GSM", "kVoxLogChannelTechnology_Ostrel_UTRAN",
                             "kVoxLogChannelTechnology_Ostrel_GSM "})
        EXPECT_EQ(LogGenerator::generatorFromTechnology(name, clock), nullptr) << name;
    EXPECT_THAT(log.lines(), IsEmpty());
}

TEST(LogGeneratorTest, SaysThatItIsCreated) {
    const FakeClock clock;
    const CapturedLog log;
    const GSMLogGenerator generator(clock);
    EXPECT_THAT(log.textsAt(LogPriority::Warning),
                ElementsAre(MatchesRegex("Creating Log object: 0x[0-9a-f]+")));
}

class HistoryTest : public testing::Test {
protected:
    void append(const char* display) {
        state.set("Display", display);
        LogGenerator::updateHistoryInState(state, clock);
    }
    [[nodiscard]] const Array& history() const { return *state["History"].asArray(); }
    [[nodiscard]] std::vector<std::string> displays() const {
        std::vector<std::string> texts;
        for (const Value& entry : history())
            texts.push_back(*(*entry.asDictionary())["Display"].asString());
        return texts;
    }
    [[nodiscard]] static std::vector<std::string> keys(const Value& entry) {
        std::vector<std::string> result;
        for (const auto& [key, value] : *entry.asDictionary())
            result.push_back(key);
        return result;
    }

    FakeClock clock;
    Dictionary state = {{"DisplayState", "raw"}, {"ExtraInfo", makeDictionary()}};
};

TEST_F(HistoryTest, EntryHoldsCopiesAndDates) {
    const DictionaryRef display = makeDictionary();
    display->set("A", "1");
    state.set("Display", display);
    LogGenerator::updateHistoryInState(state, clock);
    display->set("A", "2"); // the entry is not the display
    const Dictionary& entry = *history()[0].asDictionary();
    EXPECT_THAT(keys(history()[0]),
                ElementsAre("DisplayState", "Display", "ExtraInfo", "Date", "Description"));
    EXPECT_EQ((*entry["Display"].asDictionary())["A"], Value("1"));
    EXPECT_TRUE(entry["Display"].asDictionary()->isFrozen());
    EXPECT_EQ(entry["Date"], Value("2026-11-16 05:00:00 +0000"));
    EXPECT_EQ(entry["Description"], Value("Snapshot (2026-11-16 05:00:00 +0000)"));
}

TEST_F(HistoryTest, SixthCallLeavesFiveTheFirstBeingTheSecond) {
    for (const char* display : {"1", "2", "3", "4", "5"})
        append(display);
    EXPECT_THAT(displays(), ElementsAre("1", "2", "3", "4", "5"));
    append("6");
    EXPECT_THAT(displays(), ElementsAre("2", "3", "4", "5", "6"));
}

TEST_F(HistoryTest, LongHistoryFromElsewhereIsCutToTheFourNewest) {
    const ArrayRef twelve = makeArray();
    for (int i = 1; i <= 12; ++i) {
        const DictionaryRef entry = makeDictionary();
        entry->set("Display", std::to_string(i));
        twelve->append(entry);
    }
    state.set("History", twelve);
    append("new");
    EXPECT_THAT(displays(), ElementsAre("9", "10", "11", "12", "new"));
    EXPECT_EQ(state["History"].asArray(), twelve.get()); // the same array object
}

TEST_F(HistoryTest, EntryEndsBeforeTheFirstMissingValue) {
    Dictionary noRaw = {{"Display", "d"}, {"ExtraInfo", makeDictionary()}};
    LogGenerator::updateHistoryInState(noRaw, clock);
    EXPECT_THAT(keys((*noRaw["History"].asArray())[0]), IsEmpty());

    Dictionary noDisplay = {{"DisplayState", "raw"}, {"ExtraInfo", makeDictionary()}};
    LogGenerator::updateHistoryInState(noDisplay, clock);
    EXPECT_THAT(keys((*noDisplay["History"].asArray())[0]), ElementsAre("DisplayState"));

    Dictionary noExtra = {{"DisplayState", "raw"}, {"Display", "d"}};
    LogGenerator::updateHistoryInState(noExtra, clock);
    EXPECT_THAT(keys((*noExtra["History"].asArray())[0]), ElementsAre("DisplayState", "Display"));
}

} // namespace
} // namespace velmora
