// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/C2KLogGenerator.h"

#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/RecordedEffects.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

/// A finger record without fingers: 23 bytes that are accepted.
Data noFingers() {
    return recordWith(0x108A, 23);
}

class C2KLogGeneratorTest : public testing::Test {
protected:
    C2KLogGeneratorTest() {
        resources.put("C2KTemplate", "plist",
                      dictionary({{"Fingers", "kFingerC2I"},
                                  {"Maker", "kUnusedKey"},
                                  {"EV-DO", dictionary({{"_sorted", "_sorted"},
                                                        {"2;Channel", "kChannel"},
                                                        {"1;PN Offset", "kServingPNOffset"},
                                                        {"3;Fingers", "kFingerC2I"}})}}));
    }

    LogLines update(const Data& message) {
        CapturedLog log;
        generator->updateState(state, message);
        return log.lines();
    }
    /// What the next refresh hands over.
    Data raw() {
        static_cast<void>(generator->generateLogUsingState(state));
        return *state["DisplayState"].asData();
    }
    [[nodiscard]] std::string display() { return shown(generator->display(state)); }
    /// Builds the display, so that later lines are the records'.
    void build() { static_cast<void>(C2KLogGenerator::getDisplayFromState(state)); }

    FakeClock clock;
    FakeResources resources;
    std::unique_ptr<C2KLogGenerator> generator = C2KLogGenerator::generator(clock);
    Dictionary state;
};

constexpr const char* emptyDisplay = "{Fingers '', Maker '', EV-DO {_sorted '_sorted', 2;Channel '', "
                                     "1;PN Offset '', 3;Fingers ''}}";
constexpr const char* fingersShown = "{Fingers '(none)', Maker '', EV-DO {_sorted '_sorted', 2;Channel '', "
                                     "1;PN Offset '', 3;Fingers '(none)'}}";

TEST_F(C2KLogGeneratorTest, IsTheDecoderOfItsTechnology) {
    const auto made = LogGenerator::generatorFromTechnology(kVoxLogChannelTechnology_Ostrel_CDMA, clock);
    EXPECT_NE(dynamic_cast<C2KLogGenerator*>(made.get()), nullptr);
}

TEST_F(C2KLogGeneratorTest, StartCommandNamesTheEightCodesInOrder) {
    EXPECT_EQ(shown(generator->getStartCommand()),
              "{SetState 'Streaming', SetOstrelLogCodes [4234, 4483, 4498, 4790, 4508, 4509, 4734, 4943]}");
}

TEST_F(C2KLogGeneratorTest, FirstCallBuildsTheDisplayAndReturnsIt) {
    const CapturedLog log;
    const Value built = C2KLogGenerator::getDisplayFromState(state);
    ASSERT_NE(built.asDictionary(), nullptr);
    EXPECT_EQ(built.asDictionary(), state["Display"].asDictionary());
    EXPECT_EQ(display(), emptyDisplay);
    EXPECT_EQ(shown(state["ExtraInfo"]), "{}");
    EXPECT_EQ(log.lines(), (LogLines(2, {LogPriority::Warning, "Processing the template"})));
    // The template is not what is shown.
    EXPECT_EQ((*state["Template"].asDictionary())["Fingers"], Value("kFingerC2I"));
}

TEST_F(C2KLogGeneratorTest, ADisplayThatIsThereIsReturnedAsItIs) {
    state.set("Display", "text");
    const CapturedLog log;
    EXPECT_EQ(C2KLogGenerator::getDisplayFromState(state), Value("text"));
    EXPECT_THAT(log.lines(), IsEmpty());
    EXPECT_FALSE(state.contains("Lookup"));
    EXPECT_FALSE(state.contains("Template"));
}

TEST_F(C2KLogGeneratorTest, LookupNamesLabelAndScreenOfEveryValueKey) {
    build();
    const Dictionary& lookup = *state["Lookup"].asDictionary();
    std::vector<std::string> keys;
    for (const auto& [key, targets] : lookup)
        keys.push_back(key);
    EXPECT_THAT(keys, ElementsAre("kFingerC2I", "kUnusedKey", "kChannel", "kServingPNOffset"));
    const Array& targets = *lookup["kFingerC2I"].asArray();
    ASSERT_EQ(targets.size(), 2u);
    const Dictionary& root = *state["Display"].asDictionary();
    EXPECT_EQ((*targets[0].asDictionary())["key"], Value("Fingers"));
    EXPECT_EQ((*targets[0].asDictionary())["dict"].asDictionary(), &root);
    EXPECT_EQ((*targets[1].asDictionary())["key"], Value("3;Fingers"));
    EXPECT_EQ((*targets[1].asDictionary())["dict"].asDictionary(), root["EV-DO"].asDictionary());
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

struct Message {
    const char* odd;
    Data bytes;
    bool decoded;
    std::optional<std::size_t> keptFrom; ///< the first byte kept for the log
    LogLines lines;
};

TEST_F(C2KLogGeneratorTest, Framing) {
    const Data good = noFingers();
    const Message messages[] = {
        {"Empty", Data(), false, {}, {}},
        {"TwelveBytes", prefixOf(good, 12), false, {}, {}},
        {"Good", good, true, 0, {}},
        {"Prefixed", joined(hex("81 7F"), good), true, 2, {}},
        {"RejectedIsKept", hex("01 0C 00 83 11 00 00 00 00 00 00 00 00"), false, 0,
         error("Log code 0x1183 is 13 bytes long but should be 50 bytes.")},
        {"PrefixedOfThirteenBytesIsARecordOfEleven", hex("81 7F 01 0C 00 83 11 00 00 00 00 00 00"), false, 2,
         error("Log code 0x1183 is 11 bytes long but should be 50 bytes.")},
        {"PrefixedOfTwelveBytes", hex("81 7F 01 0C 00 83 11 00 00 00 00 00"), false, {}, {}},
        {"OnlyOnePrefixIsRemoved",
         joined(hex("81 7F 81 7F"), good),
         false,
         {},
         error("Invalid log type: 81. Dropping.")},
        {"WrongTypeIsDecoded", withByte(good, 0, 2), true, 0, error("Invalid log type: 2. Dropping.")},
        {"TypeIsShownInHexadecimal", withByte(good, 0, 0xFE), true, 0,
         error("Invalid log type: fe. Dropping.")},
        {"ExtraStreamMatchesNoCode",
         withByte(good, 0, 0xFF),
         false,
         {},
         error("Invalid log type: ff. Dropping.")},
        {"OtherCode", recordWith(0x108B, 23), false, {}, {}},
        {"CodeIsLittleEndian", recordWith(0x8A10, 23), false, {}, {}},
        {"LengthFieldIsNotRead", withFields(good, {{1, 2, 0xFFFF}}), true, 0, {}},
    };
    for (const Message& message : messages) {
        SCOPED_TRACE(message.odd);
        state = Dictionary();
        build();
        EXPECT_EQ(update(message.bytes), message.lines);
        EXPECT_EQ(display(), message.decoded ? fingersShown : emptyDisplay);
        EXPECT_EQ(raw(), message.keptFrom ? message.bytes.from(*message.keptFrom) : Data());
    }
}

TEST_F(C2KLogGeneratorTest, PublishedValuesAreReported) {
    build();
    const CapturedLog log;
    RecordedEffects effects;
    generator->updateStateReporting(state, noFingers(), effects);
    EXPECT_EQ(effects.kind, RecordedEffects::Kind::Values);
    EXPECT_EQ(effects.code, 0x108AU);
    EXPECT_THAT(effects.members, ElementsAre(std::pair<std::string, Value>("kFingerC2I", "(none)")));
    EXPECT_EQ(display(), fingersShown);

    // The system identification, in publishing order; the template has labels for none of it.
    Data identification = recordWith(0x134F, 186);
    std::vector<std::uint8_t> bytes(identification.bytes().begin(), identification.bytes().end());
    bytes[13] = 2;  // version
    bytes[46] = 2;  // system type
    bytes[50] = 7;  // SID
    bytes[131] = 9; // packet zone
    generator->updateStateReporting(state, Data(std::move(bytes)), effects);
    EXPECT_EQ(effects.code, 0x134FU);
    std::vector<std::string> values;
    for (const auto& [key, value] : effects.members)
        values.push_back(key + "=" + *value.asString());
    EXPECT_THAT(values, ElementsAre("k1xRoamingHome=OFF [0]", "kSystemId=7", "kNetworkId=0",
                                    "kPacketZoneId=9", "kBaseId=0", "kProtocolRevision=0"));

    struct Dropped {
        Data message;
        std::optional<std::uint32_t> code;
    };
    const Dropped dropped[] = {
        {recordWith(0x1183, 13), 0x1183U}, // too short for its parser
        {record(0x1234, ""), 0x1234U},     // no parser
        {record(0x108A, "", 0xFF), 0xFF108AU},
        {hex("01 02 03"), std::nullopt},
    };
    int told = 2;
    for (const Dropped& row : dropped) {
        generator->updateStateReporting(state, row.message, effects);
        EXPECT_EQ(effects.messages, ++told);
        EXPECT_EQ(effects.code, row.code);
        EXPECT_THAT(effects.members, IsEmpty());
    }
}

TEST_F(C2KLogGeneratorTest, EveryCodeReachesItsParser) {
    build();
    const char* firstWords[] = {"Log code 0x108a is 13 ", "Log code 0x1183 is 13 ", "Log code 0x1192 is 13 ",
                                "Log code 0x12b6 is 13 ", "Log code 0x119c is 13 ", "Log code 0x119d is 13 ",
                                "Log code 0x127e is 13 ", "Log code 0x134f is 13 "};
    const std::uint16_t codes[] = {0x108A, 0x1183, 0x1192, 0x12B6, 0x119C, 0x119D, 0x127E, 0x134F};
    for (std::size_t i = 0; i < 8; ++i) {
        const LogLines lines = update(recordWith(codes[i], 13));
        ASSERT_EQ(lines.size(), 1u);
        EXPECT_EQ(lines[0].priority, LogPriority::Error);
        EXPECT_THAT(lines[0].text, testing::StartsWith(firstWords[i]));
    }
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

TEST_F(C2KLogGeneratorTest, TemplateIsLoadedOnce) {
    build();
    resources.put("C2KTemplate", "plist", dictionary({}));
    state.remove("Display");
    build();
    EXPECT_EQ(display(), emptyDisplay);
    update(noFingers()); // the lookup is the new display's
    EXPECT_EQ(display(), fingersShown);
}

TEST_F(C2KLogGeneratorTest, BadTemplateIsReportedOnEveryAttemptAndTriedAgain) {
    const Data rubbish = hex("72 75 62");
    const auto xml = writeXMLPropertyList(Value(makeArray()));
    ASSERT_TRUE(xml);
    const Data noDictionary(std::vector<std::uint8_t>(xml->begin(), xml->end()));
    resources.put("Elsewhere", "plist", dictionary({}));
    for (const Data& content : {rubbish, noDictionary}) {
        state = Dictionary();
        resources.put("C2KTemplate", "plist", content);
        CapturedLog log;
        EXPECT_TRUE(C2KLogGenerator::getDisplayFromState(state).isNone());
        EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("Cannot load C2K template for display"));
        EXPECT_TRUE(state.empty());

        log.clear();
        generator->updateState(state, recordWith(0x1192, 241, {{13, 4, 3}}));
        generator->updateState(state, recordWith(0x1183, 50));
        EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("Cannot load C2K template for display",
                                                                 "Cannot load C2K template for display"));
        // Decoded into nothing, but for the running values.
        EXPECT_EQ(shown(std::make_shared<Dictionary>(state)), "{FLDataSeqNum 3, FLDataSent 0}");
        EXPECT_TRUE(generator->generateLogUsingState(state).isNone());
        EXPECT_EQ(state["DisplayState"].asData()->size(), 291u);
    }
    resources.put("C2KTemplate", "plist", dictionary({{"Fingers", "kFingerC2I"}}));
    update(noFingers());
    EXPECT_EQ(display(), "{Fingers '(none)'}");
}

TEST(C2KTemplateLoadingTest, MissingTemplateIsReported) {
    const FakeResources resources;
    Dictionary state;
    const CapturedLog log;
    EXPECT_TRUE(C2KLogGenerator::getDisplayFromState(state).isNone());
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Notice, "no resource C2KTemplate.plist in memory"},
                            CapturedLog::Line{LogPriority::Error, "Cannot load C2K template for display"}));
}

TEST(C2KProcessTemplateTest, CopiesMarkersSkipsForeignValuesAndNests) {
    const Value source = dictionary({
        {"Number", 7},
        {"List", makeArray()},
        {"Flag", true},
        {"_sorted", "_sorted"},
        {"Other", "_sorted"},
        {"Empty", ""},
        {"Inner", dictionary({{"Innermost", dictionary({{"C", "kC"}})}, {"C", "kC"}})},
        {"Hollow", dictionary({})},
    });
    const DictionaryRef display = makeDictionary();
    Dictionary lookup;
    const CapturedLog log;
    C2KLogGenerator::processTemplate(*source.asDictionary(), display, lookup);
    EXPECT_EQ(shown(display), "{_sorted '_sorted', Other '_sorted', Empty '', "
                              "Inner {Innermost {C ''}, C ''}, Hollow {}}");
    std::vector<std::string> keys;
    for (const auto& [key, targets] : lookup)
        keys.push_back(key);
    EXPECT_THAT(keys, ElementsAre("", "kC")); // an empty text is a key that no parser publishes
    EXPECT_EQ(lookup["kC"].asArray()->size(), 2u);
    // One a level, and the levels are four: Innermost, Inner, Hollow, the root.
    EXPECT_EQ(log.lines(), LogLines(4, {LogPriority::Warning, "Processing the template"}));
}

TEST(C2KProcessTemplateTest, AnEmptyTemplateIsReportedToo) {
    const DictionaryRef display = makeDictionary();
    Dictionary lookup;
    const CapturedLog log;
    C2KLogGenerator::processTemplate(Dictionary(), display, lookup);
    EXPECT_EQ(log.lines(), (LogLines{{LogPriority::Warning, "Processing the template"}}));
    EXPECT_TRUE(display->empty());
    EXPECT_TRUE(lookup.empty());
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

TEST_F(C2KLogGeneratorTest, LabelsOfAnyLengthShowTheirFields) {
    for (const std::size_t length : {255u, 256u, 2000u}) {
        const std::string label(length, 'L');
        resources.put("C2KTemplate", "plist", dictionary({{label, "kColorCode"}, {"Channel", "kChannel"}}));
        Dictionary itsState;
        // EV-DO status: 50 bytes, all zero after the header.
        generator->updateState(itsState, recordWith(0x1183, 50));
        generator->updateState(itsState, recordWith(0x1183, 50));
        EXPECT_EQ(shown(generator->display(itsState)), "{" + label + " '0', Channel '0'}") << length;
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
