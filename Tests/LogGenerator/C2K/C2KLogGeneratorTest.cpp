// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/C2KLogGenerator.h"

#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/LogGenerator/C2K/C2KGeneratorFixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using C2KLogGeneratorTest = C2KGeneratorFixture;

TEST_F(C2KLogGeneratorTest, IsTheDecoderOfItsTechnology) {
    const auto made = LogGenerator::generatorFromTechnology(kVoxLogChannelTechnology_Ostrel_CDMA, clock);
    EXPECT_NE(dynamic_cast<C2KLogGenerator*>(made.get()), nullptr);
}

TEST_F(C2KLogGeneratorTest, StartCommandNamesTheEightCodesInOrder) {
    EXPECT_EQ(shown(generator->getStartCommand()),
              "{SetState 'Streaming', SetOstrelLogCodes [4234, 4483, 4498, 4790, 4508, 4509, 4734, 4943]}");
}

TEST_F(C2KLogGeneratorTest, ValuesAreShownUnderAllTheirLabelsAndPersist) {
    EXPECT_THAT(update(noFingers()),
                ElementsAre(CapturedLog::Line{LogPriority::Warning, "Processing the template"},
                            CapturedLog::Line{LogPriority::Warning, "Processing the template"}));
    EXPECT_EQ(display(), fingersShown);
    EXPECT_THAT(update(recordWith(0x1183, 50, {{13, 2, 283}, {18, 2, 100}})), IsEmpty());
    EXPECT_EQ(display(), "{Fingers '(none)', Maker '', EV-DO {_sorted '_sorted', 2;Channel '283', "
                         "1;PN Offset '100 \u00D7 64chips', 3;Fingers '(none)'}}");
}

TEST_F(C2KLogGeneratorTest, MultiplicationSignSurvivesASnapshot) {
    update(recordWith(0x1183, 50, {{18, 2, 100}}));
    static_cast<void>(generator->generateLogUsingState(state));
    const auto xml = writeXMLPropertyList(generator->getSaveContentsFromState(state));
    ASSERT_TRUE(xml);
    EXPECT_NE(xml->find("<string>100 \xC3\x97 64chips</string>"), std::string::npos);
    const auto read =
        readPropertyList(Bytes(reinterpret_cast<const std::uint8_t*>(xml->data()), xml->size()));
    ASSERT_TRUE(read);
    const Dictionary& entry = *(*read->asArray())[0].asDictionary();
    const Dictionary& evdo = *(*entry["Display"].asDictionary())["EV-DO"].asDictionary();
    EXPECT_EQ(evdo["1;PN Offset"], Value("100 \u00D7 64chips"));
}

TEST_F(C2KLogGeneratorTest, RefreshHandsOverTheRecordsSinceTheLast) {
    const Data first = noFingers();
    const Data second = recordWith(0x1183, 13);
    update(joined(hex("81 00"), first));
    update(recordWith(0x1234, 20)); // of no parser
    update(second);
    const Value shownNow = generator->generateLogUsingState(state);
    EXPECT_EQ(shownNow.asDictionary(), state["Display"].asDictionary());
    EXPECT_EQ(*state["DisplayState"].asData(), joined(first, second));
    update(second);
    EXPECT_EQ(raw(), second);
    EXPECT_EQ(raw(), Data());
    const Array& history = *state["History"].asArray();
    ASSERT_EQ(history.size(), 3u);
    const Dictionary& entry = *history[0].asDictionary();
    EXPECT_EQ(*entry["DisplayState"].asData(), joined(first, second));
    EXPECT_EQ(shown(entry["Display"]), fingersShown);
    EXPECT_EQ(entry["Date"], Value("2026-11-16 05:00:00 +0000"));
}

TEST_F(C2KLogGeneratorTest, RefreshBeforeAnyRecordReturnsTheEmptyDisplay) {
    EXPECT_EQ(shown(generator->generateLogUsingState(state)), emptyDisplay);
    EXPECT_EQ(*state["DisplayState"].asData(), Data());
    EXPECT_EQ(state["History"].asArray()->size(), 1u);
}

TEST_F(C2KLogGeneratorTest, HistoryEntriesDoNotChangeWithTheDisplay) {
    static_cast<void>(raw());
    update(noFingers());
    EXPECT_EQ(shown((*(*state["History"].asArray())[0].asDictionary())["Display"]), emptyDisplay);
}

TEST_F(C2KLogGeneratorTest, SaveContentsEndInTheLog) {
    update(noFingers()); // 23 bytes, of which the log leaves the first out
    static_cast<void>(raw());
    const ArrayRef contents = generator->getSaveContentsFromState(state);
    ASSERT_EQ(contents->size(), 2u);
    const Dictionary& dlf = *(*contents)[1].asDictionary();
    EXPECT_EQ(dlf["Description"], Value("DLF binary (183 bytes)")); // 161 + 22
    EXPECT_EQ(dlf["DLF"].asData()->from(161), noFingers().from(1));
}

TEST_F(C2KLogGeneratorTest, NewDecoderContinuesWithTheState) {
    const auto rateRecord = [](std::uint32_t sequence, std::uint32_t packets) {
        return recordWith(0x1192, 241, {{13, 4, sequence}, {17, 4, packets}});
    };
    resources.put("C2KTemplate", "plist", dictionary({{"Rate", "kFLDataRate"}, {"Fingers", "kFingerC2I"}}));
    update(noFingers());
    update(rateRecord(1, 0));
    const Dictionary* shownBefore = state["Display"].asDictionary();

    C2KLogGenerator next(clock);
    CapturedLog log;
    next.updateState(state, rateRecord(2, 8)); // 8 * 128 / 1024
    EXPECT_THAT(log.lines(), IsEmpty());
    EXPECT_EQ(state["Display"].asDictionary(), shownBefore);
    EXPECT_EQ(shown(next.display(state)), "{Rate '1.00 kbps', Fingers '(none)'}");
}

TEST_F(C2KLogGeneratorTest, DisplayOfAnotherTechnologyIsLeftAlone) {
    // It has no lookup: the records go nowhere but into the log.
    state.set("Display", dictionary({{"Fingers", "other"}}));
    EXPECT_THAT(update(noFingers()), IsEmpty());
    EXPECT_EQ(display(), "{Fingers 'other'}");
    EXPECT_EQ(raw(), noFingers());
}

TEST_F(C2KLogGeneratorTest, ShowsEachStateOnItsOwnDisplay) {
    // One after the other in the same place in memory, with other labels each time.
    for (int i = 0; i < 20; ++i) {
        const std::string label = "Fingers " + std::to_string(i);
        resources.put("C2KTemplate", "plist", dictionary({{label, "kFingerC2I"}}));
        Dictionary first;
        Dictionary second;
        generator->updateState(first, noFingers());
        generator->updateState(second, noFingers());
        generator->updateState(first, noFingers());
        EXPECT_EQ(shown(generator->display(first)), "{" + label + " '(none)'}");
        EXPECT_EQ(shown(generator->display(second)), "{" + label + " '(none)'}");
    }
}

TEST_F(C2KLogGeneratorTest, WithoutAHistoryOnlyTheDisplayIsKept) {
    generator->setKeepsHistory(false);
    update(noFingers());
    EXPECT_EQ(shown(generator->generateLogUsingState(state)), fingersShown);
    EXPECT_FALSE(state.contains("History"));
    EXPECT_FALSE(state.contains("DisplayState"));
}

} // namespace
} // namespace velmora
