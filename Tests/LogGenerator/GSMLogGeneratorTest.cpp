// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/GSM/GSMLogGenerator.h"

#include "LogGenerator/GSM/AssertionFailure.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/RecordedEffects.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

DictionaryRef dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

ArrayRef array(std::initializer_list<Value> values) {
    return std::make_shared<Array>(values);
}

struct Folding {
    const char* odd;
    Value object;
    Value display;
};

class ProcessObjectTest : public testing::TestWithParam<Folding> {};

TEST_P(ProcessObjectTest, FoldsOneEntryDictionariesBelowTheRoot) {
    EXPECT_EQ(GSMLogGenerator::processObject(GetParam().object), GetParam().display);
}

INSTANTIATE_TEST_SUITE_P(
    , ProcessObjectTest,
    testing::Values(
        Folding{"String", "text", "text"},
        Folding{"Child", dictionary({{"Cell", dictionary({{"ARFCN", "12"}})}}), dictionary({{"Cell", "12"}})},
        Folding{"RootStays", dictionary({{"A", "1"}}), dictionary({{"A", "1"}})},
        Folding{"TwoEntriesStay", dictionary({{"A", "1"}, {"B", "2"}}), dictionary({{"A", "1"}, {"B", "2"}})},
        Folding{"TwoEntriesBelowStay", dictionary({{"X", dictionary({{"A", "1"}, {"B", "2"}})}}),
                dictionary({{"X", dictionary({{"A", "1"}, {"B", "2"}})}})},
        Folding{"ChainFoldsWhole",
                dictionary({{"W", dictionary({{"X", dictionary({{"Y", dictionary({{"Z", "1"}})}})}})}}),
                dictionary({{"W", "1"}})},
        Folding{"ChainEndingInTwoEntries",
                dictionary({{"W", dictionary({{"X", dictionary({{"A", "1"}, {"B", "2"}})}})}}),
                dictionary({{"W", dictionary({{"A", "1"}, {"B", "2"}})}})},
        Folding{"ArrayElement", array({dictionary({{"A", "1"}}), "2"}), array({"1", "2"})},
        Folding{"ArrayBelowADictionary", dictionary({{"X", dictionary({{"Cells", array({"1"})}})}}),
                dictionary({{"X", array({"1"})}})},
        Folding{"ArrayOfOneElementStays", dictionary({{"X", array({"1"})}, {"Y", "2"}}),
                dictionary({{"X", array({"1"})}, {"Y", "2"}})},
        Folding{"ChainInAnArray",
                array({dictionary({{"X", dictionary({{"Y", dictionary({{"A", "1"}, {"B", "2"}})}})}})}),
                array({dictionary({{"A", "1"}, {"B", "2"}})})},
        Folding{"ArrayInAnArray", array({array({dictionary({{"A", "1"}})})}), array({array({"1"})})},
        // What is left of the one-entry dictionary at the root is not folded again.
        Folding{"RootOfOneFoldedEntry", dictionary({{"X", dictionary({{"A", dictionary({{"B", "1"}})}})}}),
                dictionary({{"X", "1"}})},
        Folding{"EmptyRoot", makeDictionary(), makeDictionary()}, Folding{"EmptyArray", array({}), array({})},
        Folding{"EmptyDictionary", dictionary({{"X", makeDictionary()}}),
                dictionary({{"X", makeDictionary()}})}),
    [](const auto& test) { return std::string(test.param.odd); });

TEST(ProcessObject, GivesACopyInTheSameOrder) {
    const DictionaryRef inner = dictionary({{"B", "1"}, {"A", "2"}});
    const Value object = dictionary({{"Z", inner}, {"Y", "3"}, {"X", array({"4", "5"})}});
    const Value display = GSMLogGenerator::processObject(object);
    std::vector<std::string> keys;
    for (const auto& [key, value] : *display.asDictionary())
        keys.push_back(key);
    EXPECT_THAT(keys, testing::ElementsAre("Z", "Y", "X"));
    inner->set("B", "changed");
    EXPECT_EQ((*(*display.asDictionary())["Z"].asDictionary())["B"], Value("1"));
    EXPECT_EQ((*object.asDictionary())["X"].asArray()->size(), 2u);
}

struct Foreign {
    const char* kind;
    Value value;
};

class ForeignKindTest : public testing::TestWithParam<Foreign> {};

TEST_P(ForeignKindTest, IsAnAssertionFailureAtAnyDepth) {
    const Value& value = GetParam().value;
    const std::string wanted = std::string("Unknown object of type ") + GetParam().kind +
                               " encountered (LogGenerator/GSM/GSMLogGenerator:78)";
    for (const Value& object :
         {value, Value(array({"1", value})), Value(dictionary({{"A", "1"}, {"B", value}})),
          Value(dictionary({{"A", dictionary({{"B", array({dictionary({{"C", value}})})}})}}))}) {
        try {
            static_cast<void>(GSMLogGenerator::processObject(object));
            FAIL() << "nothing was raised";
        } catch (const AssertionFailure& failure) {
            EXPECT_EQ(failure.what(), wanted);
        }
    }
}

INSTANTIATE_TEST_SUITE_P(, ForeignKindTest,
                         testing::Values(Foreign{"none", Value()}, Foreign{"integer", 0},
                                         Foreign{"real", 1.5}, Foreign{"boolean", true},
                                         Foreign{"date", Date{}}, Foreign{"data", Data()}),
                         [](const auto& test) { return std::string(test.param.kind); });

class GSMLogGeneratorTest : public testing::Test {
protected:
    void update(const Value& value) {
        const auto text = writeXMLPropertyList(value);
        ASSERT_TRUE(text) << text.reason();
        generator.updateState(state, Data(std::vector<std::uint8_t>(text->begin(), text->end())));
    }

    FakeClock clock;
    GSMLogGenerator generator{clock};
    Dictionary state;
};

TEST_F(GSMLogGeneratorTest, EachMessageReplacesTheWholeDisplay) {
    update(dictionary({{"Old", "1"}, {"Older", "2"}}));
    update(dictionary({{"Cell", dictionary({{"ARFCN", "12"}})}}));
    EXPECT_EQ(state["DisplayState"], Value(dictionary({{"Cell", dictionary({{"ARFCN", "12"}})}})));
    EXPECT_EQ(state["Display"], Value(dictionary({{"Cell", "12"}})));
    EXPECT_EQ(state["ExtraInfo"], Value(makeDictionary()));
}

TEST_F(GSMLogGeneratorTest, MessageConcernsTheWholeDisplay) {
    RecordedEffects effects;
    generator.updateStateReporting(state, Data(*writeBinaryPropertyList(dictionary({{"Band", "900"}}))),
                                   effects);
    EXPECT_EQ(effects.kind, RecordedEffects::Kind::Display);
    EXPECT_EQ(effects.messages, 1);
    ASSERT_EQ(effects.members.size(), 1U);
    EXPECT_EQ(effects.members[0].second.asDictionary(), state["Display"].asDictionary());
    EXPECT_EQ(state["Display"], Value(dictionary({{"Band", "900"}})));
}

TEST_F(GSMLogGeneratorTest, ReadsTheBinaryForm) {
    const auto binary = writeBinaryPropertyList(dictionary({{"A", "1"}}));
    ASSERT_TRUE(binary);
    generator.updateState(state, Data::copyOf(*binary));
    EXPECT_EQ(state["Display"], Value(dictionary({{"A", "1"}})));
}

TEST_F(GSMLogGeneratorTest, ARootThatIsNoDictionaryIsTheDisplayAllTheSame) {
    update(array({dictionary({{"A", "1"}}), "2"}));
    EXPECT_EQ(state["Display"], Value(array({"1", "2"})));
    update("text");
    EXPECT_EQ(state["Display"], Value("text"));
}

TEST_F(GSMLogGeneratorTest, EveryMessageReplacesExtraInfo) {
    update(dictionary({{"A", "1"}}));
    state["ExtraInfo"].asDictionary()->set("Rate", "1");
    update(dictionary({{"A", "1"}}));
    EXPECT_EQ(state["ExtraInfo"], Value(makeDictionary()));
}

TEST_F(GSMLogGeneratorTest, SaveContentsWithoutHistoryAreEmpty) {
    EXPECT_TRUE(generator.getSaveContentsFromState(state)->empty());
}

TEST_F(GSMLogGeneratorTest, SaveContentsAreAListOfTheirOwn) {
    update(dictionary({{"A", "1"}}));
    static_cast<void>(generator.generateLogUsingState(state));
    generator.getSaveContentsFromState(state)->clear();
    EXPECT_EQ(state["History"].asArray()->size(), 1u);
    EXPECT_EQ(generator.getSaveContentsFromState(state)->size(), 1u);
}

TEST_F(GSMLogGeneratorTest, AMessageThatRaisesLeavesTheStateAsItWas) {
    update(dictionary({{"A", "1"}}));
    EXPECT_THROW(update(dictionary({{"A", 2}})), AssertionFailure);
    EXPECT_THROW(generator.updateState(state, Data(std::vector<std::uint8_t>{1, 2, 3})), AssertionFailure);
    EXPECT_EQ(state["DisplayState"], Value(dictionary({{"A", "1"}})));
    EXPECT_EQ(state["Display"], Value(dictionary({{"A", "1"}})));
}

TEST_F(GSMLogGeneratorTest, RefreshReturnsTheDisplayAndKeepsHistory) {
    update(dictionary({{"A", "1"}}));
    EXPECT_EQ(generator.generateLogUsingState(state), Value(dictionary({{"A", "1"}})));
    ASSERT_EQ(state["History"].asArray()->size(), 1u);
    const ArrayRef contents = generator.getSaveContentsFromState(state);
    EXPECT_EQ(contents->size(), 1u); // no DLF log
    EXPECT_NE(contents.get(), state["History"].asArray());
}

TEST_F(GSMLogGeneratorTest, RefreshBeforeAnyMessageShowsNothing) {
    EXPECT_TRUE(generator.generateLogUsingState(state).isNone());
    EXPECT_TRUE((*state["History"].asArray())[0].asDictionary()->empty());
}

TEST_F(GSMLogGeneratorTest, StartCommandIsOneEntry) {
    EXPECT_EQ(Value(generator.getStartCommand()), Value(dictionary({{"SetState", "Streaming"}})));
}

TEST_F(GSMLogGeneratorTest, CollapsesAloneTheOneEntryDictionary) {
    EXPECT_EQ(generator.canCollapse(dictionary({{"A", "1"}})), Value("1"));
    EXPECT_TRUE(generator.canCollapse(dictionary({{"A", "1"}, {"B", "2"}})).isNone());
    EXPECT_TRUE(generator.canCollapse(makeDictionary()).isNone());
    EXPECT_TRUE(generator.canCollapse(array({"1"})).isNone());
    EXPECT_TRUE(generator.canCollapse("1").isNone());
}

TEST_F(GSMLogGeneratorTest, ForeignKindIsAnAssertionFailure) {
    try {
        update(dictionary({{"Cells", array({dictionary({{"ARFCN", 12}, {"B", "2"}})})}}));
        FAIL() << "nothing was raised";
    } catch (const AssertionFailure& failure) {
        EXPECT_STREQ(failure.what(),
                     "Unknown object of type integer encountered (LogGenerator/GSM/GSMLogGenerator:78)");
    }
}

TEST_F(GSMLogGeneratorTest, UnreadableMessageIsAnAssertionFailure) {
    try {
        generator.updateState(state, Data());
        FAIL() << "nothing was raised";
    } catch (const AssertionFailure& failure) {
        EXPECT_STREQ(failure.what(),
                     "Could not deserialize the object (LogGenerator/GSM/GSMLogGenerator:90)");
    }
    EXPECT_TRUE(state.empty());
}

TEST_F(GSMLogGeneratorTest, MessageThatMakesTooManyValuesIsUnreadableAndSaysWhy) {
    // An array of 200 references to an array of 500 references to an empty text: 1 + 200 + 100,000 values.
    const auto reference = [](std::size_t count, std::uint8_t to) {
        std::vector<std::uint8_t> array = {0xAF, 0x11, static_cast<std::uint8_t>(count >> 8),
                                           static_cast<std::uint8_t>(count)};
        array.resize(array.size() + count, to);
        return Data(std::move(array));
    };
    const Data outer = reference(200, 1);
    const Data inner = reference(500, 2);
    // The objects' offsets: 8, 8 + 204, and 504 after that; the table is one after the text.
    const Data list =
        joined({hex("62 70 6C 69 73 74 30 30"), outer, inner, hex("50"), hex("0008 00D4 02CC"),
                hex("000000000000 02 01 0000000000000003"), hex("0000000000000000 00000000000002CD")});
    const CapturedLog log;
    EXPECT_THROW(generator.updateState(state, list), AssertionFailure);
    EXPECT_TRUE(state.empty());
    EXPECT_EQ(log.textsAt(LogPriority::Error),
              std::vector<std::string>{
                  "Malformed message: the list has more than 100000 objects, repeated ones counted"});
}

TEST_F(GSMLogGeneratorTest, BothAssertionFailuresEndTheProgramWithTheirMessage) {
    EXPECT_DEATH([this]() noexcept { generator.updateState(state, Data()); }(),
                 "Could not deserialize the object \\(LogGenerator/GSM/GSMLogGenerator:90\\)");
    EXPECT_DEATH([]() noexcept { static_cast<void>(GSMLogGenerator::processObject(7)); }(),
                 "Unknown object of type integer encountered \\(LogGenerator/GSM/GSMLogGenerator:78\\)");
}

} // namespace
} // namespace velmora
