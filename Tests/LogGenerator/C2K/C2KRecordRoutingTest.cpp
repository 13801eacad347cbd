// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/C2KGeneratorFixture.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/RecordedEffects.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using C2KRecordRoutingTest = C2KGeneratorFixture;

struct Message {
    const char* odd;
    Data bytes;
    bool decoded;
    std::optional<std::size_t> keptFrom; ///< the first byte kept for the log
    LogLines lines;
};

TEST_F(C2KRecordRoutingTest, Framing) {
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

TEST_F(C2KRecordRoutingTest, PublishedValuesAreReported) {
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

TEST_F(C2KRecordRoutingTest, EveryCodeReachesItsParser) {
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

} // namespace
} // namespace velmora
