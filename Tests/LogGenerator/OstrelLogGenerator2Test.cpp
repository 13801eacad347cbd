// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelLogGenerator2.h"

#include "Tests/Support/CapturedLog.h"
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
using testing::MatchesRegex;
using testing::UnorderedElementsAre;

/// A section that notes what it is given, and shows the record's length.
class Listener : public Base {
public:
    struct Call {
        Data data;
        std::uint32_t code;
    };

    Listener(std::string name, const std::vector<std::uint32_t>& codes) : _name(std::move(name)) {
        for (const std::uint32_t code : codes)
            _views.push_back({code, std::size_t{0}});
    }
    std::string_view getSectionName() const override { return _name; }
    std::span<const View> views() const override { return _views; }
    void updateWithData(const Data& data, std::uint32_t code) override {
        calls.push_back({data, code});
        Base::updateWithData(data, code);
    }
    void decode(const View&, const Record& record, FieldVisitor& visitor) const override {
        static constexpr Field length{"Length", computed, integer("%d")};
        visitor.number(length, static_cast<std::int64_t>(record.size()));
    }

    std::vector<Call> calls;

private:
    void trace() const override {}

    std::string _name;
    std::vector<View> _views;
};

class ListenerIndex final : public ClassIndex {
public:
    ListenerIndex() {
        for (Listener* section : {&baseband, &extra, &list})
            section->initWithDict(classDict, codeDictionary);
    }
    Listener baseband{"RRC Info", {0xD0E0, 0x1234}};
    Listener extra{"SIM Info", {0xFF0000, 0xFF0002}};
    Listener list{"Rows", {0x1234}};
};

class TemplateTest : public testing::Test {
protected:
    TemplateTest() {
        resources.put("Probe", "plist",
                      Value(std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
                          {"Maker", "none"},
                          {"Radio", std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
                                        {"RRC Info", makeDictionary()}, {"Rows", makeArray()}})},
                          {"SIM Info", std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
                                           {"Length", "not yet"}})}})));
    }

    void update(const Data& message) { generator.updateState(state, message); }
    [[nodiscard]] Data raw() { // what the next refresh hands over
        static_cast<void>(generator.generateLogUsingState(state));
        return *state["DisplayState"].asData();
    }
    [[nodiscard]] const Dictionary& display() { return *generator.display(state).asDictionary(); }

    CapturedLog log;
    FakeClock clock;
    FakeResources resources;
    std::shared_ptr<ListenerIndex> index = std::make_shared<ListenerIndex>();
    OstrelLogGenerator2 generator{"Probe", index, clock};
    Dictionary state;
};

TEST_F(TemplateTest, AnnouncesItsIndexThenItselfThenTheReferences) {
    log.clear();
    const auto other = std::make_shared<ListenerIndex>();
    log.clear();
    { const OstrelLogGenerator2 made("Probe", other, clock); }
    ASSERT_EQ(log.lines().size(), 4u);
    EXPECT_EQ(log.lines()[0].priority, LogPriority::Error);
    EXPECT_THAT(log.lines()[0].text, MatchesRegex("Creating OstrelLogGenerator2 object with 0x[0-9a-f]+"));
    EXPECT_EQ(log.lines()[1].priority, LogPriority::Warning);
    EXPECT_THAT(log.lines()[1].text, MatchesRegex("Creating Log object: 0x[0-9a-f]+"));
    EXPECT_EQ(log.lines()[2],
              (CapturedLog::Line{LogPriority::Error, "Class Index: 2"})); // the test holds one
    EXPECT_EQ(log.lines()[3].priority, LogPriority::Warning);
    EXPECT_THAT(log.lines()[3].text, MatchesRegex("Ostrel_GSMLogGenerator is destructed 0x[0-9a-f]+"));
}

struct Message {
    const char* odd;
    const char* bytes;
    std::vector<std::uint32_t> basebandCodes;
    std::vector<std::uint32_t> extraCodes;
    std::vector<std::string> errors;
};

class FramingTest : public TemplateTest, public testing::WithParamInterface<Message> {};

std::vector<std::uint32_t> codesOf(const Listener& section) {
    std::vector<std::uint32_t> codes;
    for (const auto& call : section.calls)
        codes.push_back(call.code);
    return codes;
}

TEST_P(FramingTest, ReportingDoesTheSame) {
    log.clear();
    const Data message = hex(GetParam().bytes);
    RecordedEffects effects;
    generator.updateStateReporting(state, message, effects);
    EXPECT_EQ(codesOf(index->baseband), GetParam().basebandCodes);
    EXPECT_EQ(codesOf(index->extra), GetParam().extraCodes);
    EXPECT_EQ(log.textsAt(LogPriority::Error), GetParam().errors);
    EXPECT_EQ(raw(), message);
    EXPECT_EQ(effects.kind, RecordedEffects::Kind::Sections);
    EXPECT_EQ(effects.messages, 1);
    for (const std::vector<std::uint32_t>& codes : {GetParam().basebandCodes, GetParam().extraCodes})
        if (!codes.empty()) {
            EXPECT_EQ(effects.code, codes[0]);
        }
    if (!GetParam().errors.empty()) {
        EXPECT_EQ(effects.code, std::nullopt);
    }
}

TEST_F(TemplateTest, SectionsOfACodeAreReportedWithTheirUpdatedNodes) {
    RecordedEffects effects;
    generator.updateStateReporting(state, record(0x1234, "00 00"), effects);
    EXPECT_EQ(effects.code, 0x1234U);
    ASSERT_EQ(effects.members.size(), 2U);
    EXPECT_EQ(effects.members[0].first, "RRC Info");
    const Dictionary* radio = display()["Radio"].asDictionary();
    EXPECT_EQ(effects.members[0].second.asDictionary(), (*radio)["RRC Info"].asDictionary());
    EXPECT_EQ((*effects.members[0].second.asDictionary())["Length"], Value("15"));
    EXPECT_EQ(effects.members[1].first, "Rows");
    EXPECT_EQ(effects.members[1].second.asArray(), (*radio)["Rows"].asArray());

    generator.updateStateReporting(state, record(2, "", 0xFF), effects);
    EXPECT_EQ(effects.code, 0xFF0002U);
    ASSERT_EQ(effects.members.size(), 1U);
    EXPECT_EQ(effects.members[0].first, "SIM Info");

    generator.updateStateReporting(state, record(0x1235, ""), effects); // it has no subscriber
    EXPECT_EQ(effects.code, 0x1235U);
    EXPECT_THAT(effects.members, IsEmpty());
    generator.updateStateReporting(state, hex("01 02"), effects);
    EXPECT_EQ(effects.code, std::nullopt);
    EXPECT_THAT(effects.members, IsEmpty());
}

TEST_F(TemplateTest, SectionOfADuplicateCodeIsReportedOnceAndOneWithoutANodeIsNot) {
    class OddIndex final : public ClassIndex {
    public:
        OddIndex() {
            for (Listener* section : {&twice, &nowhere})
                section->initWithDict(classDict, codeDictionary);
        }
        Listener twice{"RRC Info", {0x1234, 0x1234}};
        Listener nowhere{"Elsewhere", {0x1234}};
    };
    const auto odd = std::make_shared<OddIndex>();
    OstrelLogGenerator2 other("Probe", odd, clock);
    RecordedEffects effects;
    Dictionary fresh;
    other.updateStateReporting(fresh, record(0x1234, ""), effects);
    EXPECT_EQ(odd->twice.calls.size(), 2U);
    EXPECT_EQ(odd->nowhere.calls.size(), 1U);
    ASSERT_EQ(effects.members.size(), 1U);
    EXPECT_EQ(effects.members[0].first, "RRC Info");
}

TEST_P(FramingTest, RoutesByTypeAndCodeAndKeepsEveryMessage) {
    log.clear();
    const Data message = hex(GetParam().bytes);
    update(message);
    EXPECT_EQ(codesOf(index->baseband), GetParam().basebandCodes);
    EXPECT_EQ(codesOf(index->extra), GetParam().extraCodes);
    EXPECT_EQ(log.textsAt(LogPriority::Error), GetParam().errors);
    EXPECT_EQ(raw(), message);
}

INSTANTIATE_TEST_SUITE_P(
    , FramingTest,
    testing::Values(
        Message{"Empty", "", {}, {}, {}},
        Message{"OneByteShort", "01 0B 00 34 12 00 00 00 00 00 00 00", {}, {}, {}},
        Message{"JustTheHeader", "01 0C 00 34 12 00 00 00 00 00 00 00 00", {0x1234}, {}, {}},
        Message{"CodeNobodyWants", "01 0C 00 35 12 00 00 00 00 00 00 00 00", {}, {}, {}},
        Message{"Prefixed", "81 7F 01 0C 00 34 12 00 00 00 00 00 00 00 00", {0x1234}, {}, {}},
        Message{"PrefixedOfThirteenBytes", "81 7F 01 0C 00 34 12 00 00 00 00 00 00", {0x1234}, {}, {}},
        Message{"PrefixedOfTwelveBytes", "81 7F 01 0C 00 34 12 00 00 00 00 00", {}, {}, {}},
        Message{"PrefixWithinThePrefix",
                "81 7F 81 0C 00 34 12 00 00 00 00 00 00 00 00",
                {},
                {},
                {"Invalid log type: 81. Dropping."}},
        Message{"ExtraStream", "FF 0C 00 02 00 00 00 00 00 00 00 00 00", {}, {0xFF0002}, {}},
        Message{
            "ExtraStreamDoesNotReachTheBasebandsCode", "FF 0C 00 34 12 00 00 00 00 00 00 00 00", {}, {}, {}},
        Message{"WrongType",
                "02 0C 00 34 12 00 00 00 00 00 00 00 00",
                {},
                {},
                {"Invalid log type: 2. Dropping."}},
        Message{"WrongTypeIsShownInHexadecimal",
                "FE 0C 00 34 12 00 00 00 00 00 00 00 00",
                {},
                {},
                {"Invalid log type: fe. Dropping."}},
        Message{"LengthFieldIsNotRead", "01 FF FF 34 12 00 00 00 00 00 00 00 00", {0x1234}, {}, {}}),
    [](const auto& test) { return std::string(test.param.odd); });

TEST_F(TemplateTest, SectionsGetTheRecordWithoutItsPrefix) {
    update(hex("81 7F 01 0C 00 34 12 00 00 00 00 00 00"));
    ASSERT_EQ(index->baseband.calls.size(), 1u);
    EXPECT_EQ(index->baseband.calls[0].data, hex("01 0C 00 34 12 00 00 00 00 00 00")); // eleven bytes
}

TEST_F(TemplateTest, SharedCodeReachesEverySubscriber) {
    update(record(0x1234, ""));
    EXPECT_EQ(index->baseband.calls.size(), 1u);
    EXPECT_EQ(index->list.calls.size(), 1u);
    update(record(0xD0E0, ""));
    EXPECT_EQ(index->baseband.calls.size(), 2u);
    EXPECT_EQ(index->list.calls.size(), 1u);
}

TEST_F(TemplateTest, FirstCallBuildsTheDisplayAndReturnsNoneTheSecondReturnsIt) {
    EXPECT_TRUE(generator.getDisplayFromState(state).isNone());
    ASSERT_NE(state["Display"].asDictionary(), nullptr);
    EXPECT_NE(state["Template"].asDictionary(), nullptr);
    EXPECT_NE(state["Template"].asDictionary(), state["Display"].asDictionary());
    EXPECT_TRUE(state["ExtraInfo"].asDictionary()->empty());
    EXPECT_EQ(generator.getDisplayFromState(state).asDictionary(), state["Display"].asDictionary());
}

TEST_F(TemplateTest, BuildingSaysWhichIndexAndWhatKindItIs) {
    log.clear();
    static_cast<void>(generator.getDisplayFromState(state));
    const auto lines = log.textsAt(LogPriority::Warning);
    ASSERT_EQ(lines.size(), 6u);
    EXPECT_THAT(lines[0], MatchesRegex("Initialized class index: 0x[0-9a-f]+, Self: 0x[0-9a-f]+"));
    EXPECT_EQ(lines[1], "Dictionary = 1");
    EXPECT_EQ(lines[2], "String = 0");
    EXPECT_THAT(std::vector(lines.begin() + 3, lines.end()),
                UnorderedElementsAre("RRC Info", "Rows", "SIM Info"));
}

TEST_F(TemplateTest, SectionsWriteIntoTheirNodesAtAnyDepth) {
    update(record(0xD0E0, "01 02"));
    update(record(0x0002, "", 0xFF));
    const Dictionary& radio = *display()["Radio"].asDictionary();
    EXPECT_EQ((*radio["RRC Info"].asDictionary())["Length"], Value("15"));
    EXPECT_EQ((*display()["SIM Info"].asDictionary())["Length"], Value("13")); // in place of the placeholder
    EXPECT_EQ(display()["Maker"], Value("none"));
    // The template is not what is shown.
    EXPECT_EQ((*(*state["Template"].asDictionary())["SIM Info"].asDictionary())["Length"], Value("not yet"));
}

TEST_F(TemplateTest, TemplateIsLoadedOnce) {
    static_cast<void>(generator.getDisplayFromState(state));
    resources.put("Probe", "plist", Value(makeDictionary()));
    state.remove("Display");
    static_cast<void>(generator.getDisplayFromState(state));
    EXPECT_TRUE(display().contains("Radio"));
}

struct BadTemplate {
    const char* odd;
    std::optional<const char*> content;
    std::string reason;
};

class MissingTemplateTest : public testing::TestWithParam<BadTemplate> {};

TEST_P(MissingTemplateTest, IsReportedOnEachCallAndNothingIsShown) {
    const FakeClock clock;
    FakeResources resources;
    if (GetParam().content) {
        const std::string_view text = *GetParam().content;
        resources.put("Probe", "plist", Data(std::vector<std::uint8_t>(text.begin(), text.end())));
    }
    const auto index = std::make_shared<ListenerIndex>();
    OstrelLogGenerator2 generator("Probe", index, clock);
    Dictionary state;
    CapturedLog log;
    EXPECT_TRUE(generator.getDisplayFromState(state).isNone());
    ASSERT_EQ(log.lines().size(), 2u);
    EXPECT_THAT(log.lines()[0].text, testing::StartsWith(GetParam().reason));
    EXPECT_EQ(log.lines()[1], (CapturedLog::Line{LogPriority::Error, "Cannot load template for display"}));
    generator.updateState(state, record(0xD0E0, ""));
    EXPECT_EQ(index->baseband.calls.size(), 1u); // routed, into no node
    EXPECT_FALSE(state.contains("Display"));

    // It is asked for again, and the messages since then are there.
    resources.put("Probe", "plist", Value(makeDictionary()));
    EXPECT_TRUE(generator.generateLogUsingState(state).isNone());
    EXPECT_TRUE(state.contains("Display"));
    EXPECT_EQ(state["DisplayState"].asData()->size(), 13u);
}

INSTANTIATE_TEST_SUITE_P(, MissingTemplateTest,
                         testing::Values(BadTemplate{"Absent", std::nullopt, "no resource Probe.plist"},
                                         BadTemplate{"Rubbish", "rubbish", "Probe.plist: "},
                                         BadTemplate{
                                             "NoDictionary", "<plist><array/></plist>",
                                             "Probe.plist: the root is of kind array, wanted a dictionary"}),
                         [](const auto& test) { return std::string(test.param.odd); });

TEST_F(TemplateTest, ForeignKindInTheTemplateIsReportedAndLeftOut) {
    log.clear();
    const Value processed = generator.processTemplate(
        std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{{"Number", 7}, {"Text", "x"}}));
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Error, "Received an object of unknown type"},
                            CapturedLog::Line{LogPriority::Warning, "Processing the template"}));
    EXPECT_EQ(processed.asDictionary()->size(), 1u);
    EXPECT_EQ((*processed.asDictionary())["Text"], Value("x"));
}

TEST_F(TemplateTest, ForeignElementOfAnArrayIsLeftOut) {
    const Value processed =
        generator.processTemplate(std::make_shared<Array>(std::initializer_list<Value>{"a", 7, "b"}));
    EXPECT_EQ(*processed.asArray()->begin(), Value("a"));
    EXPECT_EQ(processed.asArray()->size(), 2u);
}

TEST_F(TemplateTest, WalkReportsForeignKindsAtAnyDepthAndNothingElse) {
    log.clear();
    generator.printDict(std::make_shared<Array>(std::initializer_list<Value>{
        "text", std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{{"A", true}}),
        Data()}));
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Error, "Received an object of unknown type"},
                            CapturedLog::Line{LogPriority::Error, "Received an object of unknown type"}));
}

TEST_F(TemplateTest, RefreshMovesTheRawMessagesOut) {
    update(hex("AA"));
    update(hex("BB CC"));
    const Value shown = generator.generateLogUsingState(state);
    EXPECT_EQ(shown.asDictionary(), &display());
    EXPECT_EQ(*state["DisplayState"].asData(), hex("AA BB CC"));
    update(hex("DD"));
    EXPECT_EQ(raw(), hex("DD"));
    EXPECT_EQ(raw(), hex(""));
    const Array& history = *state["History"].asArray();
    ASSERT_EQ(history.size(), 3u);
    EXPECT_EQ(*(*history[0].asDictionary())["DisplayState"].asData(), hex("AA BB CC"));
}

TEST_F(TemplateTest, RefreshBeforeAnyMessageBuildsAndReturnsNone) {
    EXPECT_TRUE(generator.generateLogUsingState(state).isNone());
    EXPECT_EQ(state["History"].asArray()->size(), 1u);
}

TEST_F(TemplateTest, StartCommandSplitsTheCodes) {
    const DictionaryRef command = generator.getStartCommand();
    std::vector<std::string> keys;
    for (const auto& [key, value] : *command)
        keys.push_back(key);
    EXPECT_THAT(keys, ElementsAre("SetState", "SetOstrelLogCodes", "SetVoxExtraCodes"));
    EXPECT_EQ((*command)["SetState"], Value("Streaming"));
    const auto numbers = [&command](const char* key) {
        std::vector<std::int64_t> result;
        for (const Value& code : *(*command)[key].asArray())
            result.push_back(*code.asInteger());
        return result;
    };
    EXPECT_THAT(numbers("SetOstrelLogCodes"), UnorderedElementsAre(0x1234, 53472));
    EXPECT_THAT(numbers("SetVoxExtraCodes"), UnorderedElementsAre(0, 2));
}

TEST_F(TemplateTest, NewDecoderContinuesWithTheDisplay) {
    update(record(0xD0E0, "01 02"));
    const Dictionary* shown = &display();
    const auto nextIndex = std::make_shared<ListenerIndex>();
    OstrelLogGenerator2 next("Probe", nextIndex, clock);
    EXPECT_EQ(next.getDisplayFromState(state).asDictionary(), shown);
    next.updateState(state, record(0xD0E0, ""));
    EXPECT_EQ(&display(), shown);
    static_cast<void>(next.display(state));
    EXPECT_EQ((*(*display()["Radio"].asDictionary())["RRC Info"].asDictionary())["Length"], Value("13"));
}

TEST_F(TemplateTest, NewDecoderFindsItsNodesWithinAnArrayToo) {
    const DictionaryRef node = makeDictionary();
    state.set("Display", std::make_shared<Dictionary>(
                             Dictionary{{"Radios", std::make_shared<Array>(Array{std::make_shared<Dictionary>(
                                                       Dictionary{{"RRC Info", node}})})}}));
    update(record(0xD0E0, "01 02"));
    static_cast<void>(display());
    EXPECT_EQ((*node)["Length"], Value("15")); // a header of 13 bytes and 2
}

} // namespace
} // namespace velmora
