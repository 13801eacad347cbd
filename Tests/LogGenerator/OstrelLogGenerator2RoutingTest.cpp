// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/OstrelLogGenerator2Fixture.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/RecordedEffects.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::IsEmpty;
using OstrelLogGenerator2RoutingTest = OstrelLogGenerator2Fixture;

struct Message {
    const char* odd;
    const char* bytes;
    std::vector<std::uint32_t> basebandCodes;
    std::vector<std::uint32_t> extraCodes;
    std::vector<std::string> errors;
};

class FramingTest : public OstrelLogGenerator2Fixture, public testing::WithParamInterface<Message> {};

std::vector<std::uint32_t> codesOf(const Listener& section) {
    std::vector<std::uint32_t> codes;
    for (const auto& call : section.calls)
        codes.push_back(call.code);
    return codes;
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

INSTANTIATE_TEST_SUITE_P(
    , FramingTest,
    testing::Values(
        Message{"Empty", "", {}, {}, {}},
        Message{"OneByteShort", "01 0B 00 34 12 00 00 00 00 00 00 00", {}, {}, {}},
        Message{"JustTheHeader", "01 0C 00 34 12 00 00 00 00 00 00 00 00", {0x1234}, {}, {}},
        Message{"CodeWithoutSubscribers", "01 0C 00 35 12 00 00 00 00 00 00 00 00", {}, {}, {}},
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

TEST_F(OstrelLogGenerator2RoutingTest, SectionsGetTheRecordWithoutItsPrefix) {
    update(hex("81 7F 01 0C 00 34 12 00 00 00 00 00 00"));
    ASSERT_EQ(index->baseband.calls.size(), 1u);
    EXPECT_EQ(index->baseband.calls[0].data, hex("01 0C 00 34 12 00 00 00 00 00 00")); // eleven bytes
}

TEST_F(OstrelLogGenerator2RoutingTest, SharedCodeReachesEverySubscriber) {
    update(record(0x1234, ""));
    EXPECT_EQ(index->baseband.calls.size(), 1u);
    EXPECT_EQ(index->list.calls.size(), 1u);
    update(record(0xD0E0, ""));
    EXPECT_EQ(index->baseband.calls.size(), 2u);
    EXPECT_EQ(index->list.calls.size(), 1u);
}

TEST_F(OstrelLogGenerator2RoutingTest, SectionsOfACodeAreReportedWithTheirUpdatedNodes) {
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

TEST_F(OstrelLogGenerator2RoutingTest, SectionOfADuplicateCodeIsReportedOnceAndOneWithoutANodeIsNot) {
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

} // namespace
} // namespace velmora
