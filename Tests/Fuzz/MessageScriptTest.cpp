// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/Decoders/MessageScript.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

using Kind = MessageScript::Kind;

struct StepCase {
    const char* name;
    const char* script;
    const char* message; ///< null: none, so the step is of another kind
    Kind kind = Kind::Message;
};

class MessageScriptStepTest : public testing::TestWithParam<StepCase> {};

TEST_P(MessageScriptStepTest, GivesItsStep) {
    const Data bytes = hex(GetParam().script);
    MessageScript script(bytes.bytes());
    const auto step = script.next();
    ASSERT_TRUE(step);
    EXPECT_EQ(step->kind, GetParam().kind);
    EXPECT_EQ(step->message, hex(GetParam().message ? GetParam().message : ""));
    EXPECT_FALSE(script.next());
}

// The length field counts all bytes after the type: 12 and the payload.
constexpr StepCase steps[] = {
    {"Baseband", "00 3412 0200 AABB", "01 0E00 3412 0000000000000000 AABB"},
    {"Extra", "01 0100 0100 AA", "FF 0D00 0100 0000000000000000 AA"},
    {"Prefixed", "02 3412 0000", "8100 01 0C00 3412 0000000000000000"},
    {"Raw", "03 0300 010203", "010203"},
    {"Redraw", "04", nullptr, Kind::Redraw},
    {"Reconnect", "05", nullptr, Kind::Reconnect},
    {"KindByItsRemainder", "0A", nullptr, Kind::Redraw},
    {"LengthBeyondTheEnd", "00 3412 FFFF AA", "01 0D00 3412 0000000000000000 AA"},
    {"EndInTheLength", "00 3412 05", "01 0C00 3412 0000000000000000"},
    {"EndInTheCode", "00 34", "01 0C00 3400 0000000000000000"},
    {"KindAlone", "03", ""},
};
INSTANTIATE_TEST_SUITE_P(Cases, MessageScriptStepTest, testing::ValuesIn(steps),
                         [](const auto& tested) { return tested.param.name; });

TEST(MessageScriptTest, IsAtItsEndWhenEmpty) {
    EXPECT_FALSE(MessageScript({}).next());
}

TEST(MessageScriptTest, ContinuesAfterAStep) {
    const Data bytes = hex("03 0100 AA  04  03 0100 BB");
    MessageScript script(bytes.bytes());
    EXPECT_EQ(script.next()->message, hex("AA"));
    EXPECT_EQ(script.next()->kind, Kind::Redraw);
    EXPECT_EQ(script.next()->message, hex("BB"));
    EXPECT_FALSE(script.next());
}

struct EncodeCase {
    const char* name;
    const char* message;
    const char* script;
};

class MessageScriptEncodeTest : public testing::TestWithParam<EncodeCase> {};

TEST_P(MessageScriptEncodeTest, GivesTheStepOfAMessage) {
    const std::vector<std::uint8_t> script = MessageScript::encode({Kind::Message, hex(GetParam().message)});
    EXPECT_EQ(Data::copyOf(script), hex(GetParam().script));
}

constexpr EncodeCase encoded[] = {
    {"BasebandWithItsStamp", "01 0E00 3412 1122334455667788 AABB", "00 3412 0200 AABB"},
    {"BasebandWithAWrongLength", "01 FFFF 3412 0000000000000000 AABB", "00 3412 0200 AABB"},
    {"Extra", "FF 0D00 0100 0000000000000000 AA", "01 0100 0100 AA"},
    {"Prefixed", "81EE 01 0D00 3412 0000000000000000 AA", "02 3412 0100 AA"},
    {"PrefixedExtra", "8100 FF 0C00 0100 0000000000000000", "03 0F00 8100 FF 0C00 0100 0000000000000000"},
    {"PrefixedAndTooShort", "8100 01 0C00 3412 000000000000", "03 0D00 8100 01 0C00 3412 000000000000"},
    {"OfAnotherType", "02 0C00 3412 0000000000000000", "03 0D00 02 0C00 3412 0000000000000000"},
    {"TooShort", "01 0C00", "03 0300 01 0C00"},
    {"Empty", "", "03 0000"},
};
INSTANTIATE_TEST_SUITE_P(Cases, MessageScriptEncodeTest, testing::ValuesIn(encoded),
                         [](const auto& tested) { return tested.param.name; });

TEST(MessageScriptTest, EncodesTheStepsWithoutAMessage) {
    EXPECT_EQ(MessageScript::encode({Kind::Redraw, {}}), std::vector<std::uint8_t>{4});
    EXPECT_EQ(MessageScript::encode({Kind::Reconnect, {}}), std::vector<std::uint8_t>{5});
}

} // namespace
} // namespace velmora
